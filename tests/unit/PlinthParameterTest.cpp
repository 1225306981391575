// Parameter declarations: constants the compiler lays out, and the
// specifications they build.
#include <gtest/gtest.h>

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "plinth/callspec/Parameter.h"

using namespace Plinth::CallSpec;

namespace {

constexpr Parameter::Word kModeWords[] = {{"static", "A fixed address"}, {"dhcp", "An address from a server"}};
constexpr long long kSpeedValues[] = {100, 10, 1000};

// Declared constexpr, so a builder that stops being one fails to compile here.
constexpr Parameter kMode = Parameter::String("mode", "m", "The mode: %FULLENUM%").Required().StringEnum(kModeWords);
constexpr Parameter kSpeed = Parameter::Int("speed", "", "The speed").IntEnum(kSpeedValues);
constexpr Parameter kCount = Parameter::Int64("count", "c", "The count").Range(-1, 1LL << 40).Required();
constexpr Parameter kName = Parameter::String("name", "n", "The name").Regex("tsl[0-9]+");

// A braced list would leave the parameter pointing into a temporary array.
template <class T, class = void>
struct TakesBracedWords : std::false_type {};
template <class T>
struct TakesBracedWords<T, std::void_t<decltype(std::declval<T const&>().StringEnum({{"a", ""}}))>>
    : std::true_type {};
template <class T, class = void>
struct TakesBracedValues : std::false_type {};
template <class T>
struct TakesBracedValues<T, std::void_t<decltype(std::declval<T const&>().IntEnum({1, 2}))>> : std::true_type {};
static_assert(!TakesBracedWords<Parameter>::value, "enum words are a named array");
static_assert(!TakesBracedValues<Parameter>::value, "enum values are a named array");

}  // namespace

TEST(PlinthParameter, EachBuilderKeepsWhatTheOthersSet) {
    boost::shared_ptr<InputSpec> spec = InputSpecOf(kMode, kSpeed, kCount, kName);
    boost::shared_ptr<ParameterSpec> mode = spec->FindByShortName("m");
    ASSERT_TRUE(mode);
    EXPECT_EQ(mode->GetName(), "mode");
    EXPECT_EQ(mode->GetDescription(), "The mode: %FULLENUM%");
    EXPECT_TRUE(mode->IsRequired());
    EXPECT_EQ(mode->GetConstraint()->GetType(), CONSTRAINT_STRING_ENUM);
    EXPECT_EQ(mode->GetConstraint()->GetStringEnum(),
              (std::vector<ParameterConstraint::StringEnumValue>{{"static", "A fixed address"},
                                                                  {"dhcp", "An address from a server"}}));

    boost::shared_ptr<ParameterSpec> speed = spec->FindByName("speed");
    EXPECT_EQ(speed->GetShortName(), "");
    EXPECT_FALSE(speed->IsRequired());
    EXPECT_EQ(speed->GetIntWidth(), IntWidth::Int32);
    EXPECT_EQ(speed->GetConstraint()->GetIntEnum(), (std::vector<long long>{100, 10, 1000}));

    boost::shared_ptr<ParameterSpec> count = spec->FindByName("count");
    EXPECT_TRUE(count->IsRequired());
    EXPECT_EQ(count->GetIntWidth(), IntWidth::Int64);
    EXPECT_EQ(count->GetConstraint()->GetRangeLow(), -1);
    EXPECT_EQ(count->GetConstraint()->GetRangeHigh(), 1LL << 40);

    EXPECT_EQ(spec->FindByName("name")->GetConstraint()->GetStringRegex(), "tsl[0-9]+");
}

TEST(PlinthParameter, AParameterWithoutConstraintHasNoneAndIsReadByItsName) {
    constexpr Parameter plain = Parameter::Flag("verbose", "v", "Say more");
    EXPECT_FALSE(plain.NewSpec()->GetConstraint());
    EXPECT_EQ(plain.NewSpec()->GetType(), PARAMETER_FLAG);
    EXPECT_EQ(std::string(plain), "verbose");
}
