#include "util/UserFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <vector>

namespace Trellis {
namespace Util {

namespace {

constexpr std::size_t kChunkBytes = 64 * 1024;

std::string NotRegular(mode_t mode) {
    if (S_ISDIR(mode)) return "it is a directory";
    if (S_ISFIFO(mode)) return "it is a FIFO, not a regular file";
    if (S_ISCHR(mode) || S_ISBLK(mode)) return "it is a device, not a regular file";
    return "it is not a regular file";
}

std::string ErrorReason(int error) { return error == ENOENT ? "it does not exist" : std::strerror(error); }

class Descriptor {
public:
    explicit Descriptor(int fd) : fd_(fd) {}
    ~Descriptor() {
        if (fd_ >= 0) ::close(fd_);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int Get() const { return fd_; }

private:
    int fd_;
};

}  // namespace

std::string TooLargeReason(std::size_t limit) {
    constexpr std::size_t kMiB = std::size_t{1} << 20;
    return "it is larger than " +
           (limit != 0 && limit % kMiB == 0 ? std::to_string(limit / kMiB) + " MiB" : std::to_string(limit) + " bytes");
}

std::string ReadUserFile(const std::string& path, std::size_t limit) {
    // O_NONBLOCK: opening a FIFO must not wait for a writer; fstat then refuses it.
    Descriptor fd(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    if (fd.Get() < 0) throw UnreadableFile(ErrorReason(errno));
    struct stat info {};
    if (::fstat(fd.Get(), &info) != 0) throw UnreadableFile(ErrorReason(errno));
    if (!S_ISREG(info.st_mode)) throw UnreadableFile(NotRegular(info.st_mode));
    if (static_cast<std::uintmax_t>(info.st_size) > limit) throw UnreadableFile(TooLargeReason(limit));

    std::string text;
    text.reserve(static_cast<std::size_t>(info.st_size));
    std::vector<char> chunk(kChunkBytes);
    // One byte past the limit tells a file that grew after fstat.
    for (;;) {
        ssize_t got = ::read(fd.Get(), chunk.data(), std::min(chunk.size(), limit + 1 - text.size()));
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) throw UnreadableFile(ErrorReason(errno));
        if (got == 0) return text;
        text.append(chunk.data(), static_cast<std::size_t>(got));
        if (text.size() > limit) throw UnreadableFile(TooLargeReason(limit));
    }
}

}  // namespace Util
}  // namespace Trellis
