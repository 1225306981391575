#include "gantry/system/FirewallRuleset.h"

namespace Gantry {
namespace System {

FirewallRuleset::~FirewallRuleset() = default;

}  // namespace System
}  // namespace Gantry
