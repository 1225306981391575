#include "trellis/host/records/ModuleRecord.h"

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

Json ModuleRecord::ToJson() const {
    return Json{{"name", name}, {"loaded", loaded}, {"options", options}};
}

ModuleRecord ModuleRecord::FromJson(const JsonReader& in) {
    ModuleRecord record;
    record.name = in.String("name");
    if (record.name.empty()) in.Member("name").Fail("expected a module name");
    record.loaded = in.Bool("loaded");
    record.options = in.String("options", "");
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
