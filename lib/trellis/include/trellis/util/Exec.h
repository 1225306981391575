#pragma once

#include <string>

namespace Trellis {
namespace Util {

// Runs a shell command line on the host; 0 on success, any other value is
// failure. The simulated host starts no process: it appends the command line,
// the three flags as given and the returned status to the host's exec log,
// and returns 0 unless a fault armed for "Trellis_Exec" gives a status. A
// command line that the log cannot keep (not valid UTF-8, or with a control
// character) is refused with GantryException, as a failure of the host is.
int Trellis_Exec(std::string const& commandLine, bool option1, bool option2, bool option3);

}  // namespace Util
}  // namespace Trellis
