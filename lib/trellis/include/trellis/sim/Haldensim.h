#pragma once

#include <iosfwd>
#include <string>
#include <vector>

namespace Trellis {
namespace Sim {

// Exit statuses of haldensim.
constexpr int kExitOk = 0;
constexpr int kExitFailed = 1;   // the host store failed while working
constexpr int kExitRefused = 2;  // bad usage, unknown operation, bad description, unopenable host

// Runs haldensim with args (without the program name); in is read for
// "import -". Returns the exit status.
int RunHaldensim(const std::vector<std::string>& args, std::istream& in, std::ostream& out, std::ostream& err);

}  // namespace Sim
}  // namespace Trellis
