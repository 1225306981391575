#pragma once

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "plinth/cli/BatchReader.h"

namespace Plinth {
namespace Cli {

// Runs one command line: its words, as they would follow the program's name.
// Returns the exit status; throws BatchLineError to refuse the line.
typedef std::function<int(std::vector<std::string> const&)> BatchLineRunner;

// Runs the lines of a batch one after the other: splits each into words
// (SplitBatchLine), skips a line without words and hands the others to
// runLine. A line that cannot be read or split is refused with status 2 and
// "Error: Batch line N: ..." on err. At the first line whose status is not 0
// the batch stops, with "<program>: batch stopped at line N (status S)." on
// err, unless force is set; input that cannot be read stops it always.
// While it runs, err flushes out before it writes, so the two stay in order.
// Returns the worst status seen, 0 for a batch without commands.
int RunBatch(BatchReader& reader, bool force, BatchLineRunner const& runLine, std::string const& programName,
             std::ostream& out, std::ostream& err);

}  // namespace Cli
}  // namespace Plinth
