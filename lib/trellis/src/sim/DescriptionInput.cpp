#include "sim/DescriptionInput.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <istream>
#include <vector>

#include "host/StoredText.h"

namespace Trellis {
namespace Sim {

namespace {

constexpr std::size_t kChunkBytes = 64 * 1024;

[[noreturn]] void Refuse(const std::string& what, const std::string& problem) {
    throw UnreadableInput("cannot read " + what + ": " + problem);
}

std::string TooLarge(std::size_t limit) {
    constexpr std::size_t kMiB = std::size_t{1} << 20;
    return "it is larger than " +
           (limit % kMiB == 0 ? std::to_string(limit / kMiB) + " MiB" : std::to_string(limit) + " bytes");
}

std::string NotRegular(mode_t mode) {
    if (S_ISDIR(mode)) return "it is a directory";
    if (S_ISFIFO(mode)) return "it is a FIFO, not a regular file";
    if (S_ISCHR(mode) || S_ISBLK(mode)) return "it is a device, not a regular file";
    return "it is not a regular file";
}

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

std::string ReadFile(const std::string& file, std::size_t limit) {
    const std::string shown = Host::Printable(file);
    // O_NONBLOCK: opening a FIFO must not wait for a writer; fstat then refuses it.
    Descriptor fd(::open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    if (fd.Get() < 0) Refuse(shown, std::strerror(errno));
    struct stat info {};
    if (::fstat(fd.Get(), &info) != 0) Refuse(shown, std::strerror(errno));
    if (!S_ISREG(info.st_mode)) Refuse(shown, NotRegular(info.st_mode));
    if (static_cast<std::uintmax_t>(info.st_size) > limit) Refuse(shown, TooLarge(limit));

    std::string text;
    text.reserve(static_cast<std::size_t>(info.st_size));
    std::vector<char> chunk(kChunkBytes);
    // One byte past the limit tells a file that grew after fstat.
    for (;;) {
        ssize_t got = ::read(fd.Get(), chunk.data(), std::min(chunk.size(), limit + 1 - text.size()));
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) Refuse(shown, std::strerror(errno));
        if (got == 0) return text;
        text.append(chunk.data(), static_cast<std::size_t>(got));
        if (text.size() > limit) Refuse(shown, TooLarge(limit));
    }
}

std::string ReadStream(std::istream& in, std::size_t limit) {
    std::string text;
    std::vector<char> chunk(kChunkBytes);
    while (in) {
        in.read(chunk.data(), static_cast<std::streamsize>(std::min(chunk.size(), limit + 1 - text.size())));
        text.append(chunk.data(), static_cast<std::size_t>(in.gcount()));
        if (text.size() > limit) Refuse("standard input", TooLarge(limit));
    }
    if (in.bad()) Refuse("standard input", "reading it failed");
    return text;
}

}  // namespace

std::string ReadDescriptionInput(const std::string& file, std::istream& in, std::size_t limit) {
    return file == "-" ? ReadStream(in, limit) : ReadFile(file, limit);
}

}  // namespace Sim
}  // namespace Trellis
