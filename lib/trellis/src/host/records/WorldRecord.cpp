#include "trellis/host/records/WorldRecord.h"

#include <limits>

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

Json WorldRecord::ToJson() const { return Json{{"id", id}, {"name", vmName}}; }

WorldRecord WorldRecord::FromJson(const JsonReader& in) {
    WorldRecord record;
    record.id = in.Int("id", 1, std::numeric_limits<std::int32_t>::max());
    record.name = std::to_string(record.id);
    record.vmName = in.String("name");
    if (record.vmName.empty()) in.Member("name").Fail("expected the VM's name");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
