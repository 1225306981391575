#pragma once

// Reading a file a user names, as a host tool should: read-only, without
// waiting (a FIFO or a device is found out by its type, never waited on), a
// regular file only, never more than a limit, and never written.

#include <cstddef>
#include <stdexcept>
#include <string>

namespace Trellis {
namespace Util {

// Why a file cannot be read, in words the caller puts behind its path: "it
// does not exist", "it is a directory", "it is larger than 64 KiB".
class UnreadableFile : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The file's bytes; UnreadableFile when it cannot be read, is no regular
// file, or holds more than limit bytes (also when it grows while read).
std::string ReadUserFile(const std::string& path, std::size_t limit);

// "it is larger than 256 MiB" or "... than 65536 bytes".
std::string TooLargeReason(std::size_t limit);

}  // namespace Util
}  // namespace Trellis
