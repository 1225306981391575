#include "plinth/callspec/CallTarget.h"

namespace Plinth {
namespace CallSpec {

CallTarget::~CallTarget() = default;

}  // namespace CallSpec
}  // namespace Plinth
