#include "plinth/cli/Batch.h"

#include <algorithm>

#include "plinth/cli/BatchLine.h"
#include "plinth/cli/Tool.h"
#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

namespace {

// Ties err to out for its lifetime.
class TieGuard {
public:
    TieGuard(std::ostream& err, std::ostream& out) : err_(err), previous_(err.tie(&out)) {}
    ~TieGuard() { err_.tie(previous_); }
    TieGuard(TieGuard const&) = delete;
    TieGuard& operator=(TieGuard const&) = delete;

private:
    std::ostream& err_;
    std::ostream* previous_;
};

std::string const kTooLong = "it is longer than " + std::to_string(kMaxBatchLineBytes >> 20) + " MiB";

// The status of one line: its words are run, or it is refused.
int RunLine(BatchReader::Read read, std::string const& line, size_t number, BatchLineRunner const& runLine,
            std::ostream& err) {
    try {
        if (read == BatchReader::Read::TooLong) throw BatchLineError(kTooLong);
        if (!IsValidUtf8(line)) throw BatchLineError("it is not valid UTF-8");
        std::vector<std::string> const words = SplitBatchLine(line);
        return words.empty() ? EXIT_OK : runLine(words);
    } catch (BatchLineError const& refusal) {
        err << "Error: Batch line " << number << ": " << refusal.what() << ".\n";
        return EXIT_REFUSED;
    }
}

}  // namespace

int RunBatch(BatchReader& reader, bool force, BatchLineRunner const& runLine, std::string const& programName,
             std::ostream& out, std::ostream& err) {
    TieGuard tie(err, out);
    int worst = EXIT_OK;
    std::string line;
    for (size_t number = 1;; ++number) {
        int status = EXIT_OK;
        bool readable = true;
        try {
            BatchReader::Read const read = reader.Next(line);
            if (read == BatchReader::Read::End) break;
            status = RunLine(read, line, number, runLine, err);
        } catch (BatchInputError const& failure) {
            err << "Error: " << failure.what() << ".\n";
            status = EXIT_REFUSED;
            readable = false;
        }
        worst = std::max(worst, status);
        if (!readable || (status != EXIT_OK && !force)) {
            err << programName << ": batch stopped at line " << number << " (status " << status << ").\n";
            break;
        }
    }
    out.flush();
    return worst;
}

}  // namespace Cli
}  // namespace Plinth
