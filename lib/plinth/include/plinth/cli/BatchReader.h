#pragma once

#include <cstddef>
#include <stdexcept>
#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// The batch input cannot be read. The text names it and says why:
// "Cannot read the batch file jobs: it is a directory, not a regular file".
class BatchInputError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

std::size_t const kMaxBatchBytes = std::size_t{64} << 20;
std::size_t const kMaxBatchLineBytes = std::size_t{1} << 20;

// Reads a batch line by line as it arrives, holding one line and one block
// of input at a time: a regular file by name, or standard input for "-".
class BatchReader {
public:
    enum class Read { Line, TooLong, End };

    // Opens the file read-only. Refuses at once a directory, a device, a FIFO
    // (without waiting for a writer) or a socket, and a file larger than
    // kMaxBatchBytes.
    explicit BatchReader(std::string const& file);
    ~BatchReader();
    BatchReader(BatchReader const&) = delete;
    BatchReader& operator=(BatchReader const&) = delete;

    // The next line, without its line feed or a carriage return before it.
    // TooLong: a line of more than kMaxBatchLineBytes, skipped to its end.
    // Throws BatchInputError when reading fails or the input grows past
    // kMaxBatchBytes.
    Read Next(std::string& line);

private:
    // Reads the next block; false at the end of the input.
    bool Fill();
    // Refuses what is not a regular file (or, on standard input, a
    // directory) and a file larger than kMaxBatchBytes.
    void CheckKind() const;
    [[noreturn]] void Refuse(std::string const& problem) const;

    std::string shownName_;
    int fd_ = -1;
    bool ownsFd_ = false;
    std::vector<char> block_;
    std::size_t begin_ = 0;
    std::size_t end_ = 0;
    std::size_t bytesRead_ = 0;
};

}  // namespace Cli
}  // namespace Plinth
