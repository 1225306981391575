#pragma once

// Reading a host description for haldensim: from a regular file, or from
// standard input for "-", never more than a limit.

#include <cstddef>
#include <iosfwd>
#include <stdexcept>
#include <string>

namespace Trellis {
namespace Sim {

// A description file that cannot be read; the text names it and the reason.
class UnreadableInput : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

constexpr std::size_t kMaxDescriptionBytes = std::size_t{256} << 20;

// The text of file, or of in when file is "-". Refuses (UnreadableInput)
// anything but a regular file (a directory, a device, a FIFO: found out
// without waiting for a writer) and input larger than limit. The file is
// only read.
std::string ReadDescriptionInput(const std::string& file, std::istream& in,
                                 std::size_t limit = kMaxDescriptionBytes);

}  // namespace Sim
}  // namespace Trellis
