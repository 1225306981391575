#pragma once

#include <cstdint>
#include <string>

namespace Trellis {
namespace Resource {

// The host's worlds by id: its VMs and its own processes. A stack object;
// its constructor is a host operation ("ResourceInfoImpl::ResourceInfoImpl").
class ResourceInfoImpl {
public:
    ResourceInfoImpl();
    ~ResourceInfoImpl();

    // The world's name ("web01", "hostd"); throws GantryException for an id
    // no world has.
    std::string GetWorldName(std::uint64_t worldId);
};

}  // namespace Resource
}  // namespace Trellis
