#pragma once

#include <cstdint>
#include <string>

namespace Trellis {
namespace Resource {

// A handle on a world of the host (a running VM, or one of the host's own),
// made without host I/O.
class WorldImpl {
public:
    // GetWorldName puts this marker and a separator ahead of a VM's name.
    static constexpr const char* VM_NAME_MARKER = "hvmm:";

    explicit WorldImpl(std::uint64_t worldId);
    ~WorldImpl();

    // The marker and the VM's name ("hvmm:web01"); throws GantryException when
    // no world has the id.
    std::string GetWorldName();

private:
    std::uint64_t worldId_;
};

}  // namespace Resource
}  // namespace Trellis
