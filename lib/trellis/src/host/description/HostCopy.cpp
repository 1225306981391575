#include "host/description/HostCopy.h"

#include <algorithm>
#include <optional>

namespace Trellis {
namespace Host {

namespace {

// More digits than this make no number a copy could count on: such a name
// takes a suffix like any other.
constexpr std::size_t kMaxDigits = 15;

struct Numbered {
    std::string stem;
    std::string digits;
};

std::optional<Numbered> SplitTrailingNumber(const std::string& name) {
    std::size_t stemEnd = name.find_last_not_of("0123456789") + 1;  // 0 when it is all digits
    std::size_t digits = name.size() - stemEnd;
    if (digits == 0 || digits > kMaxDigits) return std::nullopt;
    return Numbered{name.substr(0, stemEnd), name.substr(stemEnd)};
}

}  // namespace

std::string HostCopy::Name(const std::string& family, const std::string& name) {
    std::optional<Numbered> numbered = SplitTrailingNumber(name);
    if (!numbered) return index_ == 0 ? name : name + "-" + std::to_string(index_);
    const std::int64_t number = std::stoll(numbered->digits);
    const auto key = std::make_pair(family, numbered->stem);
    if (index_ == 0) {
        Span& span = spans_.emplace(key, Span{number, number}).first->second;
        span.min = std::min(span.min, number);
        span.max = std::max(span.max, number);
        return name;
    }
    const Span& span = spans_.at(key);  // every name was met in copy 0
    std::string digits = std::to_string(number + index_ * (span.max - span.min + 1));
    if (digits.size() < numbered->digits.size()) digits.insert(0, numbered->digits.size() - digits.size(), '0');
    return numbered->stem + digits;
}

}  // namespace Host
}  // namespace Trellis
