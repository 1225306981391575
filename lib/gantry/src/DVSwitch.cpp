#include "gantry/network/DVPort.h"
#include "gantry/network/DVSwitch.h"

namespace Gantry {
namespace Network {

DVPort::~DVPort() {}
DVSwitch::~DVSwitch() {}

}  // namespace Network
}  // namespace Gantry
