#pragma once

#include <stdexcept>
#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// A line of a batch that the tool refuses before running it (exit status 2).
// The text says what is wrong, without the line's number.
class BatchLineError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Splits a batch line into words as a POSIX shell would, without any
// expansion. Blanks (space, tab) separate words. Single quotes keep
// everything literally; double quotes keep everything but \" \\ \$ \`,
// which stand for the second character. A backslash outside quotes takes
// the next character literally. A # that starts a word comments out the rest
// of the line. Quoted parts join the word around them, and '' is an empty
// word. Throws BatchLineError for a quote that is not closed or a backslash
// at the end of the line.
std::vector<std::string> SplitBatchLine(std::string const& line);

}  // namespace Cli
}  // namespace Plinth
