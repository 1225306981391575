#include "trellis/system/ModuleImpl.h"

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "system/FirewallHost.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/ModuleRecord.h"

namespace Trellis {
namespace System {

namespace {

using Host::ModuleRecord;
using Host::Operation;
using Host::Transaction;

const Operation kConstruct("ModuleImpl::ModuleImpl");
const Operation kIsLoaded("ModuleImpl::IsLoaded");
const Operation kLoad("ModuleImpl::Load");
const Operation kUnload("ModuleImpl::Unload");

// The packet filter's module is busy while its filters exist.
void CheckNotBusy(const Transaction& t, const std::string& name) {
    if (name == kFirewallModule && FirewallState(t).rulesetsLoaded)
        throw Gantry::Lib::GantryException("Module " + name +
                                           " is busy: the firewall filters must be destroyed before it is unloaded");
}

}  // namespace

ModuleImpl::ModuleImpl(std::string const& name) : name_(name) { kConstruct.Check(); }

ModuleImpl::~ModuleImpl() = default;

bool ModuleImpl::IsLoaded() {
    if (loaded_) {
        kIsLoaded.Check();
        return *loaded_;
    }
    loaded_ = kIsLoaded.Read([&](Transaction& t) {
        std::optional<ModuleRecord> module = t.Find<ModuleRecord>(name_);
        return module && module->loaded;
    });
    return *loaded_;
}

void ModuleImpl::Load(std::string const& options, bool force) {
    kLoad.Write([&](Transaction& t) {
        std::optional<ModuleRecord> module = t.Find<ModuleRecord>(name_);
        if (!module) throw Gantry::Lib::GantryException("Cannot load module " + name_ + ": no such module on the host");
        std::string problem = Host::TextProblem(options);
        if (!problem.empty())
            throw Gantry::Lib::GantryException("Cannot load module " + name_ + ": the option text " + problem);
        if (module->loaded) {
            if (!force) throw Gantry::Lib::GantryException("Module " + name_ + " is already loaded");
            CheckNotBusy(t, name_);
        }
        module->loaded = true;
        module->options = options;
        t.Put(*module);
        // A module starts with nothing in its filters.
        if (name_ == kFirewallModule) ClearFirewallFilters(t);
    });
    loaded_ = true;
}

void ModuleImpl::Unload() {
    kUnload.Write([&](Transaction& t) {
        std::optional<ModuleRecord> module = t.Find<ModuleRecord>(name_);
        if (!module || !module->loaded) throw Gantry::Lib::GantryException("Module " + name_ + " is not loaded");
        CheckNotBusy(t, name_);
        module->loaded = false;
        t.Put(*module);
    });
    loaded_ = false;
}

}  // namespace System
}  // namespace Trellis
