#include "trellis/host/records/PnicRecord.h"

#include <nlohmann/json.hpp>

#include "gantry/lib/GantryException.h"
#include "gantry/network/MacAddress.h"

namespace Trellis {
namespace Host {

namespace {

constexpr std::int64_t kMinMtu = 68;
constexpr std::int64_t kMaxMtu = 9000;

std::string ReadMacAddress(const JsonReader& in) {
    std::string text = in.String("macAddress");
    try {
        Gantry::Network::MacAddress mac(text);
        if (mac.GetStringAddress() == text) return text;
    } catch (const Gantry::Lib::GantryException&) {
    }
    in.Member("macAddress").Fail("expected a MAC address in lower case, such as \"00:50:56:a1:b2:c3\"");
}

}  // namespace

Json PnicRecord::ToJson() const {
    return Json{{"name", name},
                {"linkUp", linkUp},
                {"driver", driver},
                {"speed", speed},
                {"duplex", WordOf(duplex, kPnicDuplexWords)},
                {"macAddress", macAddress},
                {"mtu", mtu},
                {"description", description}};
}

PnicRecord PnicRecord::FromJson(const JsonReader& in) {
    PnicRecord record;
    record.name = in.String("name");
    if (record.name.empty()) in.Member("name").Fail("expected a NIC name");
    record.linkUp = in.Bool("linkUp");
    record.driver = in.String("driver");
    record.speed = static_cast<unsigned int>(in.Int("speed", 0, 1000000));
    record.duplex = in.Word<PnicDuplex>("duplex", kPnicDuplexWords);
    record.macAddress = ReadMacAddress(in);
    record.mtu = static_cast<int>(in.Int("mtu", kMinMtu, kMaxMtu));
    record.description = in.String("description", "");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
