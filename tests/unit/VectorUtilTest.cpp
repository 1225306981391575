// DeleteVector and CastVector over vectors of host objects.

#include <gtest/gtest.h>

#include <vector>

#include "trellis/lib/TrellisException.h"
#include "util/VectorUtil"

namespace {

// Counts live objects, so a test sees what was deleted.
struct Counted {
    static int alive;
    Counted() { ++alive; }
    virtual ~Counted() { --alive; }
};
int Counted::alive = 0;

struct Impl : Counted {};
struct OtherImpl : Counted {};

}  // namespace

TEST(VectorUtilTest, DeleteVectorDeletesSkipsNullsAndLeavesTheVectorUsable) {
    Counted::alive = 0;
    std::vector<Counted*> objects = {new Impl, nullptr, new OtherImpl, nullptr};
    ASSERT_EQ(2, Counted::alive);

    Trellis::Util::DeleteVector(objects);
    EXPECT_EQ(0, Counted::alive);
    EXPECT_TRUE(objects.empty());

    objects.push_back(new Impl);
    Trellis::Util::DeleteVector(objects);
    EXPECT_EQ(0, Counted::alive);

    Trellis::Util::DeleteVector(objects);  // an empty vector is fine too
    EXPECT_TRUE(objects.empty());
}

TEST(VectorUtilTest, CastVectorAppendsEveryElementCast) {
    Impl first, second;
    Impl earlier;
    std::vector<Counted*> from = {&first, nullptr, &second};
    std::vector<Impl*> to = {&earlier};

    Trellis::Util::CastVector(from, to);

    EXPECT_EQ((std::vector<Impl*>{&earlier, &first, nullptr, &second}), to);
    EXPECT_EQ(3u, from.size());
}

TEST(VectorUtilTest, CastVectorFailureNamesTheHeaderAndLine88) {
    Impl good;
    OtherImpl wrong;
    std::vector<Counted*> from = {&good, &wrong};
    std::vector<Impl*> to;

    try {
        Trellis::Util::CastVector(from, to);
        FAIL() << "a wrong element was cast";
    } catch (Gantry::Lib::GantryException& e) {
        auto* trellis = dynamic_cast<Trellis::Lib::TrellisException*>(&e);
        ASSERT_NE(nullptr, trellis);
        EXPECT_EQ("Invalid cast in CastVector", e.GetMessage(0));
        EXPECT_EQ("lib/trellis/include/util/VectorUtil", trellis->GetSourceFile());
        EXPECT_EQ(88u, trellis->GetLine());
    }
    // What was cast before the failure stays; `from` still owns it all.
    EXPECT_EQ((std::vector<Impl*>{&good}), to);
    EXPECT_EQ(2u, from.size());
}
