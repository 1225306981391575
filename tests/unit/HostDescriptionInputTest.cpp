// How haldensim reads a description: regular files and standard input, each
// up to a limit (small here, 256 MiB in the tool). The tool's own refusals
// of a directory, a FIFO and an oversized file are in
// tests/cli/haldensim.test.sh.

#include <sys/stat.h>

#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "TempHost.h"
#include "sim/DescriptionInput.h"

using Trellis::Sim::ReadDescriptionInput;
using Trellis::Sim::UnreadableInput;

namespace {

std::string RefusalOf(const std::string& file, const std::string& standardInput, std::size_t limit) {
    std::istringstream in(standardInput);
    try {
        ReadDescriptionInput(file, in, limit);
    } catch (const UnreadableInput& e) {
        return e.what();
    }
    return "";
}

}  // namespace

TEST(HostDescriptionInput, ReadsUpToTheLimitAndRefusesAnythingButARegularFile) {
    TempHost scratch;
    const std::string file = scratch.Dir() + "/host.json";
    std::ofstream(file) << "{\"format\": 1}";  // 13 bytes
    std::istringstream unused;
    EXPECT_EQ(ReadDescriptionInput(file, unused, 13), "{\"format\": 1}");
    EXPECT_EQ(RefusalOf(file, "", 12), "cannot read " + file + ": it is larger than 12 bytes");

    std::istringstream in("{\"format\": 1}");
    EXPECT_EQ(ReadDescriptionInput("-", in, 13), "{\"format\": 1}");
    EXPECT_EQ(RefusalOf("-", std::string(100000, ' '), 65536),
              "cannot read standard input: it is larger than 65536 bytes");
    EXPECT_EQ(RefusalOf("-", std::string((1 << 20) + 1, ' '), 1 << 20),
              "cannot read standard input: it is larger than 1 MiB");

    const std::string fifo = scratch.Dir() + "/fifo";
    ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);
    EXPECT_EQ(RefusalOf(fifo, "", 100), "cannot read " + fifo + ": it is a FIFO, not a regular file");
    EXPECT_EQ(RefusalOf(scratch.Dir(), "", 100), "cannot read " + scratch.Dir() + ": it is a directory");
    EXPECT_EQ(RefusalOf("/dev/null", "", 100), "cannot read /dev/null: it is a device, not a regular file");
    EXPECT_EQ(RefusalOf(scratch.Dir() + "/none\x1b", "", 100),
              "cannot read \"" + scratch.Dir() + "/none\\u001b\": No such file or directory");
}
