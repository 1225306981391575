// "netstacks": the netstack instances of the host, by key. A host has them
// once, whatever its size: a scaled host keeps the original's.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/InterfaceSections.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

void NetstacksSection::Parse(const JsonReader& value) {
    std::set<std::string> keys;
    for (const JsonReader& element : value.Elements()) {
        NetstackRecord netstack = NetstackRecord::FromJson(element);
        if (!keys.insert(netstack.name).second) element.Member("key").Fail("duplicate netstack \"" + netstack.name + "\"");
        netstacks_.push_back(netstack);
    }
}

void NetstacksSection::Write(Transaction& t) const {
    for (const NetstackRecord& netstack : netstacks_) t.Put(netstack);
}

Json NetstacksSection::Export(const Transaction& t) const {
    Json netstacks = Json::array();
    for (const NetstackRecord& netstack : t.List<NetstackRecord>()) netstacks.push_back(netstack.ToJson());
    return netstacks;
}

bool NetstacksSection::Contains(const std::string& key) const {
    for (const NetstackRecord& netstack : netstacks_)
        if (netstack.name == key) return true;
    return false;
}

namespace {
const SectionRegistration kNetstacks("netstacks", 65, [] { return std::make_unique<NetstacksSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
