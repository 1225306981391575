// Standard input for haldensim's descriptions is read up to a limit (small
// here, 256 MiB in the tool) and no further. Files, and what is refused of
// them, are proven through haldensim in tests/cli/haldensim.test.sh.

#include <sstream>

#include <gtest/gtest.h>

#include "sim/DescriptionInput.h"

TEST(HostDescriptionInput, StandardInputIsReadUpToTheLimitAndNoFurther) {
    std::istringstream small("{\"format\": 1}");
    EXPECT_EQ(Trellis::Sim::ReadDescriptionInput("-", small, 13), "{\"format\": 1}");
    std::istringstream endless(std::string(3 << 20, ' '));
    try {
        Trellis::Sim::ReadDescriptionInput("-", endless, 1 << 20);
        ADD_FAILURE() << "read";
    } catch (const Trellis::Sim::UnreadableInput& e) {
        EXPECT_STREQ(e.what(), "cannot read standard input: it is larger than 1 MiB");
        EXPECT_EQ(endless.tellg(), (1 << 20) + 1);
    }
}
