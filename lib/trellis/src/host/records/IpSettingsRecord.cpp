#include "trellis/host/records/IpSettingsRecord.h"

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

Json IpSettingsRecord::ToJson() const { return Json{{"ipv6Enabled", ipv6Enabled}}; }

IpSettingsRecord IpSettingsRecord::FromJson(const JsonReader& in) {
    IpSettingsRecord record;
    record.ipv6Enabled = in.Bool("ipv6Enabled");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
