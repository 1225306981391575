#pragma once

#include <optional>
#include <string>

namespace Trellis {
namespace System {

// One kernel module of the host, by name ("haldenfw"). A module the host
// does not have reads as not loaded and cannot be loaded.
class ModuleImpl {
public:
    explicit ModuleImpl(std::string const& name);
    ~ModuleImpl();
    ModuleImpl(const ModuleImpl&) = delete;
    ModuleImpl& operator=(const ModuleImpl&) = delete;

    // Whether the module is in the kernel. Asked of the host on the first
    // call and kept in the object, which Load and Unload update.
    bool IsLoaded();
    // Loads the module with the given options. A module that is loaded
    // already is refused ("Module haldenfw is already loaded") unless force
    // is true, which reloads it with the new options (as Unload would, a
    // busy module is refused). "haldenfw" starts with empty filters: the
    // firewall has no rulesets until SystemInfoImpl::LoadFirewallRulesets.
    void Load(std::string const& options, bool force);
    // Unloads it. Refused for a module that is not loaded, and for
    // "haldenfw" while its filters exist (see
    // SystemInfoImpl::DestroyFirewallFilters).
    void Unload();

private:
    std::string name_;
    std::optional<bool> loaded_;
};

}  // namespace System
}  // namespace Trellis
