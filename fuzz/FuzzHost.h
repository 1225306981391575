// A host of the fuzz targets' own, created once per process with the default
// inventory, in memory-backed storage where there is some.

#include <unistd.h>

#include <string>

#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"

inline void OpenFuzzHost() {
    static bool open = false;
    if (open) return;
    const std::string folder = ::access("/dev/shm", W_OK) == 0 ? "/dev/shm" : "/tmp";
    const std::string path = folder + "/halden-fuzz-host." + std::to_string(::getpid()) + ".db";
    ::unlink(path.c_str());
    Trellis::Host::OpenHost(path);
    open = true;
}
