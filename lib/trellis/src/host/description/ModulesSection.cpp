// "modules": the host's kernel modules, as a list of module records.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/Section.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/ModuleRecord.h"

namespace Trellis {
namespace Host {

namespace {

class ModulesSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        std::set<std::string> names;
        for (const JsonReader& element : value.Elements()) {
            ModuleRecord module = ModuleRecord::FromJson(element);
            if (!names.insert(module.name).second) element.Member("name").Fail("duplicate module \"" + module.name + "\"");
            modules_.push_back(module);
        }
    }

    void Write(Transaction& t) const override {
        for (const ModuleRecord& module : modules_) t.Put(module);
    }

    Json Export(const Transaction& t) const override {
        Json modules = Json::array();
        for (const ModuleRecord& module : t.List<ModuleRecord>()) modules.push_back(module.ToJson());
        return modules;
    }

private:
    std::vector<ModuleRecord> modules_;
};

const SectionRegistration kModules("modules", 10, [] { return std::make_unique<ModulesSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis
