// "netstacks": the netstack instances of the host, by key, with their
// routing. "defaultTcpipStack" is always there. A neighbour entry names an
// interface of its netstack. A host has its netstacks once, whatever its
// size: a scaled host keeps the original's, with their routing.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/InterfaceSections.h"
#include "host/description/SwitchingSections.h"
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

void NetstacksSection::CheckReferences(const ParsedDescription& description) const {
    if (!netstacks_.empty() && !Contains(NetstackRecord::kDefaultKey))
        throw DescriptionError(std::string("netstacks: no netstack \"") + NetstackRecord::kDefaultKey + "\"");
    const auto& nics = description.Get<TesselNicsSection>();
    const auto& worlds = description.Get<WorldsSection>();
    for (std::size_t i = 0; i < netstacks_.size(); ++i) {
        const RoutingRecord& routing = netstacks_[i].routing;
        for (const auto* neighbors : {&routing.ipv4Neighbors, &routing.ipv6Neighbors})
            for (const NeighborRecord& neighbor : *neighbors)
                if (nics.NetstackOf(neighbor.interfaceName) != netstacks_[i].name)
                    throw DescriptionError("netstacks[" + std::to_string(i) + "].routing: no interface \"" +
                                           neighbor.interfaceName + "\" in \"" + netstacks_[i].name + "\"");
        for (const SocketRecord& socket : netstacks_[i].connections)
            if (worlds.Find(socket.worldId) == nullptr)
                throw DescriptionError("netstacks[" + std::to_string(i) + "].connections: no world " +
                                       std::to_string(socket.worldId));
    }
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
