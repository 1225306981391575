#include "trellis/util/StringTokenize.h"

namespace Trellis {
namespace Util {

void StringTokenize(std::string const& text, std::vector<std::string>& tokens,
                    std::string const& separators) {
    std::string::size_type start = text.find_first_not_of(separators);
    while (start != std::string::npos) {
        std::string::size_type end = text.find_first_of(separators, start);
        tokens.push_back(text.substr(start, end - start));
        start = text.find_first_not_of(separators, end);
    }
}

}  // namespace Util
}  // namespace Trellis
