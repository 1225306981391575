#include "trellis/host/records/PortRecord.h"

#include <limits>

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

Json PortRecord::ToJson() const {
    return Json{{"id", id},
                {"portset", portset},
                {"portGroup", portGroup},
                {"clientKind", WordOf(clientKind, kPortClientKindWords)},
                {"clientName", clientName}};
}

PortRecord PortRecord::FromJson(const JsonReader& in) {
    PortRecord record;
    record.id = in.Int("id", 1, std::numeric_limits<std::int32_t>::max());
    record.name = std::to_string(record.id);
    record.portset = in.String("portset");
    if (record.portset.empty()) in.Member("portset").Fail("expected a switch name");
    record.portGroup = in.String("portGroup");
    if (record.portGroup.empty()) in.Member("portGroup").Fail("expected a port group name");
    record.clientKind = in.Word<PortClientKind>("clientKind", kPortClientKindWords);
    record.clientName = in.String("clientName");
    if (record.clientName.empty()) in.Member("clientName").Fail("expected the client's name");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
