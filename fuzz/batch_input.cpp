// Batch input: any line is split into words as a shell would, or refused
// with BatchLineError; a file of any bytes is read line by line or refused
// with BatchInputError.

#include <unistd.h>

#include <cstddef>
#include <cstdint>
#include <fstream>
#include <string>

#include "plinth/cli/BatchLine.h"
#include "plinth/cli/BatchReader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    static const std::string path = "/tmp/halden-fuzz-batch." + std::to_string(::getpid());
    std::ofstream(path, std::ios::binary | std::ios::trunc) << text;
    try {
        Plinth::Cli::BatchReader reader(path);
        std::string line;
        while (reader.Next(line) != Plinth::Cli::BatchReader::Read::End) {
            try {
                Plinth::Cli::SplitBatchLine(line);
            } catch (Plinth::Cli::BatchLineError const&) {
            }
        }
    } catch (Plinth::Cli::BatchInputError const&) {
    }
    return 0;
}
