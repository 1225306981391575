#pragma once

#include <stdexcept>
#include <string>

namespace Plinth {
namespace Cli {

// The tool refuses the command line before running anything (exit status 2).
// The text is the one line shown to the user, without the "Error: " prefix.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

}  // namespace Cli
}  // namespace Plinth
