#include "trellis/host/records/NetstackRecord.h"

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

namespace {
constexpr int kMaxConnections = 1000000;
}  // namespace

Json NetstackRecord::ToJson() const {
    return Json{{"key", name},
                {"name", displayName},
                {"inKernel", inKernel},
                {"maxConnections", maxConnections},
                {"currentMaxConnections", currentMaxConnections},
                {"congestionControl", congestionControl},
                {"ipv6Enabled", ipv6Enabled},
                {"currentIpv6Enabled", currentIpv6Enabled}};
}

// The values in force may be left out: they are then those configured.
NetstackRecord NetstackRecord::FromJson(const JsonReader& in) {
    NetstackRecord record;
    record.name = in.String("key");
    if (record.name.empty()) in.Member("key").Fail("expected the netstack's key");
    record.displayName = in.String("name", record.name);
    record.inKernel = in.Bool("inKernel");
    record.maxConnections = static_cast<int>(in.Int("maxConnections", 1, kMaxConnections));
    record.currentMaxConnections = in.Member("currentMaxConnections").IsPresent()
                                       ? static_cast<int>(in.Int("currentMaxConnections", 1, kMaxConnections))
                                       : record.maxConnections;
    record.congestionControl = in.String("congestionControl");
    if (record.congestionControl.empty()) in.Member("congestionControl").Fail("expected an algorithm's name");
    record.ipv6Enabled = in.Bool("ipv6Enabled");
    record.currentIpv6Enabled =
        in.Member("currentIpv6Enabled").IsPresent() ? in.Bool("currentIpv6Enabled") : record.ipv6Enabled;
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
