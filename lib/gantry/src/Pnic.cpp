#include "gantry/network/Pnic.h"

namespace Gantry {
namespace Network {

Pnic::~Pnic() = default;

}  // namespace Network
}  // namespace Gantry
