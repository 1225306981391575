#pragma once

#include <stdexcept>
#include <string>

namespace Trellis {
namespace Host {

// The host could not be opened: the file is not a host store, was written by
// a newer version, or cannot be read or created. The text names the file and
// the problem.
class HostOpenError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Where the host lives: hostOption (the --host option) when it is not empty,
// else $HALDEN_HOST, else $XDG_STATE_HOME/halden/host.db when that is an
// absolute path, else ~/.local/state/halden/host.db. Throws HostOpenError
// when none of these is set.
std::string ResolveHostPath(const std::string& hostOption);

// Opens the host at path for this process; a host that does not exist yet is
// created with the default inventory. Every facade and host object made
// afterwards works on this host. Opening another host closes the previous one.
// Throws HostOpenError, also for a path that names a directory ("dir/",
// "dir/.") before anything is created.
void OpenHost(const std::string& path);

// Closes the open host, if any.
void CloseHost();

// Keeps the open host to this process from HoldHost to ReleaseHost, as the
// tool does around each command: the command's operations then run without
// locking the host one by one, and another process that wants the host waits
// until the release (for 10 s at most, then its operation fails). Each
// operation is still its own transaction. Both do nothing without an open
// host; HoldHost throws GantryException when the host stays busy.
void HoldHost();
void ReleaseHost();

}  // namespace Host
}  // namespace Trellis
