#pragma once

#include <string>

namespace Trellis {
namespace Network {

// Reads a key exchange configuration file a user names, as a host tool
// should: opened read-only and without waiting (a FIFO or a device is never
// waited on), a regular file only, at most maxSize bytes, and its text
// checked: valid UTF-8, and every line empty, a comment ("#"), a "[section]"
// or a "name = value" setting, with at least one setting. Throws
// GantryException "Unable to use the IKE configuration <path>: <reason>".
std::string ReadIkeConfig(std::string const& path, long maxSize);

}  // namespace Network
}  // namespace Trellis
