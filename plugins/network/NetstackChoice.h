#pragma once

#include <string>

#include "CommandSupport.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The --netstack option of the commands that work on one netstack instance,
// the default one unless the user names another.
extern const Parameter kNetstackOrDefault;

// The key of the instance to work on: the value of --netstack, or
// "defaultTcpipStack" when it is absent or empty. Whether the key names an
// instance is for the host to say.
std::string ChosenNetstack(Input const& input);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
