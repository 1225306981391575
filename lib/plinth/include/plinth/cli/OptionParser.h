#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"

namespace Plinth {
namespace Cli {

// Turns the words that follow a command's path into the command's Input,
// checking each against the InputSpec: known option, value present (or absent
// for a flag), value of the parameter's type and inside its constraint, each
// option at most once, every required option given. Accepted forms:
// --name value, --name=value, -x value, -x=value; a flag is --name or -x.
// A word after an option that starts with '-' is taken as its value only when
// it is a negative number; a string value that starts with '-' is given as
// --name=-value. Throws UsageError with the first problem found.
boost::shared_ptr<CallSpec::Input> ParseCommandOptions(CallSpec::InputSpec const& inputSpec,
                                                       std::vector<std::string> const& words);

}  // namespace Cli
}  // namespace Plinth
