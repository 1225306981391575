#include "plinth/cli/BatchReader.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

namespace {

std::size_t const kBlockBytes = 64 * 1024;

std::string NotRegular(mode_t mode) {
    if (S_ISDIR(mode)) return "it is a directory, not a regular file";
    if (S_ISFIFO(mode)) return "it is a FIFO, not a regular file";
    if (S_ISCHR(mode) || S_ISBLK(mode)) return "it is a device, not a regular file";
    return "it is not a regular file";
}

std::string TooLarge() { return "it is larger than " + std::to_string(kMaxBatchBytes >> 20) + " MiB"; }

}  // namespace

BatchReader::BatchReader(std::string const& file) : block_(kBlockBytes) {
    if (file == "-") {
        shownName_ = "the batch on standard input";
        fd_ = STDIN_FILENO;
    } else {
        shownName_ = "the batch file " + VisibleText(file);
        // O_NONBLOCK: opening a FIFO must not wait for a writer; fstat then refuses it.
        fd_ = ::open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC);
        if (fd_ < 0) Refuse(std::strerror(errno));
        ownsFd_ = true;
    }
    try {
        CheckKind();
    } catch (BatchInputError const&) {
        if (ownsFd_) ::close(fd_);
        throw;
    }
}

void BatchReader::CheckKind() const {
    struct stat info {};
    if (::fstat(fd_, &info) != 0) Refuse(std::strerror(errno));
    // Standard input may be a pipe or a terminal; a named file must be regular.
    if (ownsFd_ ? !S_ISREG(info.st_mode) : S_ISDIR(info.st_mode)) Refuse(NotRegular(info.st_mode));
    if (S_ISREG(info.st_mode) && static_cast<std::uintmax_t>(info.st_size) > kMaxBatchBytes) Refuse(TooLarge());
}

BatchReader::~BatchReader() {
    if (ownsFd_) ::close(fd_);
}

void BatchReader::Refuse(std::string const& problem) const {
    throw BatchInputError("Cannot read " + shownName_ + ": " + problem);
}

bool BatchReader::Fill() {
    for (;;) {
        ssize_t const got = ::read(fd_, block_.data(), block_.size());
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) Refuse(std::strerror(errno));
        begin_ = 0;
        end_ = static_cast<std::size_t>(got);
        bytesRead_ += end_;
        if (bytesRead_ > kMaxBatchBytes) Refuse(TooLarge());
        return got > 0;
    }
}

BatchReader::Read BatchReader::Next(std::string& line) {
    line.clear();
    bool started = false;
    bool tooLong = false;
    for (;;) {
        if (begin_ == end_ && !Fill()) {
            if (!started) return Read::End;
            break;
        }
        started = true;
        char const* const from = block_.data() + begin_;
        std::size_t const available = end_ - begin_;
        char const* const lineFeed = static_cast<char const*>(std::memchr(from, '\n', available));
        std::size_t const length = lineFeed ? static_cast<std::size_t>(lineFeed - from) : available;
        if (!tooLong && line.size() + length > kMaxBatchLineBytes) {
            tooLong = true;
            line.clear();
        }
        if (!tooLong) line.append(from, length);
        begin_ += length;
        if (lineFeed) {
            ++begin_;
            break;
        }
    }
    if (tooLong) return Read::TooLong;
    if (!line.empty() && line.back() == '\r') line.pop_back();
    return Read::Line;
}

}  // namespace Cli
}  // namespace Plinth
