#include "trellis/host/records/WorldRecord.h"

#include <limits>

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

Json WorldRecord::ToJson() const {
    Json world{{"id", id}, {"name", vmName}};
    if (system) world["system"] = true;
    return world;
}

WorldRecord WorldRecord::FromJson(const JsonReader& in) {
    WorldRecord record;
    record.id = in.Int("id", 1, std::numeric_limits<std::int32_t>::max());
    record.name = std::to_string(record.id);
    record.vmName = in.String("name");
    if (record.vmName.empty()) in.Member("name").Fail("expected the VM's name");
    record.system = in.Member("system").IsPresent() && in.Bool("system");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
