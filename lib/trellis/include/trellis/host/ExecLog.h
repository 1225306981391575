#pragma once

// The log of the command lines that Trellis_Exec was asked to run. The
// simulated host runs none of them; it keeps them, in order, with the status
// that Trellis_Exec returned.

#include <array>
#include <string>
#include <vector>

namespace Trellis {
namespace Host {

struct ExecEntry {
    std::string commandLine;
    std::array<bool, 3> options{};  // Trellis_Exec's three flags, as passed
    int status = 0;

    bool operator==(const ExecEntry& other) const {
        return commandLine == other.commandLine && options == other.options && status == other.status;
    }
};

// The exec log of the open host, oldest first.
std::vector<ExecEntry> ReadExecLog();

}  // namespace Host
}  // namespace Trellis
