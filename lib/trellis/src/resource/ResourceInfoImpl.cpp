#include "trellis/resource/ResourceInfoImpl.h"

#include <limits>
#include <optional>

#include "gantry/lib/GantryException.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/WorldRecord.h"

namespace Trellis {
namespace Resource {

namespace {
const Trellis::Host::Operation kConstruct("ResourceInfoImpl::ResourceInfoImpl");
const Trellis::Host::Operation kGetWorldName("ResourceInfoImpl::GetWorldName");
}  // namespace

ResourceInfoImpl::ResourceInfoImpl() { kConstruct.Check(); }

ResourceInfoImpl::~ResourceInfoImpl() {}

std::string ResourceInfoImpl::GetWorldName(std::uint64_t worldId) {
    std::optional<Trellis::Host::WorldRecord> world = kGetWorldName.Read([&](Trellis::Host::Transaction& t) {
        if (worldId > static_cast<std::uint64_t>(std::numeric_limits<std::int32_t>::max()))
            return std::optional<Trellis::Host::WorldRecord>();
        return t.Find<Trellis::Host::WorldRecord>(std::to_string(worldId));
    });
    if (!world) throw Gantry::Lib::GantryException("World " + std::to_string(worldId) + " does not exist");
    return world->vmName;
}

}  // namespace Resource
}  // namespace Trellis
