#include "trellis/resource/WorldImpl.h"

#include <limits>
#include <optional>

#include "gantry/lib/GantryException.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/WorldRecord.h"

namespace Trellis {
namespace Resource {

namespace {
const Trellis::Host::Operation kGetWorldName("WorldImpl::GetWorldName");
}  // namespace

WorldImpl::WorldImpl(std::uint64_t worldId) : worldId_(worldId) {}

WorldImpl::~WorldImpl() {}

std::string WorldImpl::GetWorldName() {
    std::optional<Trellis::Host::WorldRecord> world = kGetWorldName.Read([&](Trellis::Host::Transaction& t) {
        if (worldId_ > static_cast<std::uint64_t>(std::numeric_limits<std::int32_t>::max()))
            return std::optional<Trellis::Host::WorldRecord>();
        return t.Find<Trellis::Host::WorldRecord>(std::to_string(worldId_));
    });
    if (!world) throw Gantry::Lib::GantryException("World " + std::to_string(worldId_) + " does not exist");
    return std::string(VM_NAME_MARKER) + world->vmName;
}

}  // namespace Resource
}  // namespace Trellis
