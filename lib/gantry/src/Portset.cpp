#include "gantry/network/Portset.h"

namespace Gantry {
namespace Network {

Portset::~Portset() = default;

}  // namespace Network
}  // namespace Gantry
