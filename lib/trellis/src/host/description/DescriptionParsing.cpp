// From description text to JSON: a syntax error, text that is not UTF-8 and
// a key given twice in one object are refused here, before any section
// reads the value.

#include <cstdio>
#include <set>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "host/StoredText.h"
#include "host/description/DescriptionIo.h"

namespace Trellis {
namespace Host {

namespace {

// Follows the parser through the nested objects and arrays and refuses an
// object that holds a key twice: the parser alone keeps the last value and
// drops the others without a word.
class DuplicateKeyCheck {
public:
    bool operator()(int /*depth*/, Json::parse_event_t event, Json& parsed) {
        switch (event) {
            case Json::parse_event_t::object_start: levels_.emplace_back(false); break;
            case Json::parse_event_t::array_start: levels_.emplace_back(true); break;
            case Json::parse_event_t::key: OnKey(parsed.get<std::string>()); break;
            case Json::parse_event_t::object_end:
            case Json::parse_event_t::array_end:
                levels_.pop_back();
                OnElementRead();
                break;
            case Json::parse_event_t::value: OnElementRead(); break;
        }
        return true;
    }

private:
    struct Level {
        explicit Level(bool array) : isArray(array) {}
        bool isArray;
        std::size_t index = 0;  // in an array: the element being read
        std::string key;        // in an object: the member being read
        std::set<std::string> keys;
    };

    void OnKey(std::string key) {
        Level& object = levels_.back();
        if (!object.keys.insert(key).second) JsonReader(nullptr, InnermostPath()).Fail("duplicate key " + Quoted(key));
        object.key = std::move(key);
    }

    void OnElementRead() {
        if (!levels_.empty() && levels_.back().isArray) ++levels_.back().index;
    }

    std::string InnermostPath() const {
        std::string path;
        for (std::size_t i = 0; i + 1 < levels_.size(); ++i) {
            const Level& parent = levels_[i];
            if (parent.isArray)
                path += "[" + std::to_string(parent.index) + "]";
            else
                path += (path.empty() ? "" : ".") + Printable(parent.key);
        }
        return path;
    }

    std::vector<Level> levels_;
};

[[noreturn]] void RefuseInvalidUtf8(const std::string& text, std::size_t offset) {
    std::size_t line = 1;
    std::size_t lineStart = 0;
    for (std::size_t i = 0; i < offset; ++i) {
        if (text[i] == '\n') {
            ++line;
            lineStart = i + 1;
        }
    }
    char byte[8];
    std::snprintf(byte, sizeof byte, "0x%02X", static_cast<unsigned char>(text[offset]));
    throw DescriptionError("not valid UTF-8: the byte " + std::string(byte) + " at line " + std::to_string(line) +
                           ", column " + std::to_string(offset - lineStart + 1));
}

}  // namespace

Json ParseDescriptionText(const std::string& text) {
    DuplicateKeyCheck duplicateKeys;
    try {
        return Json::parse(text, [&](int depth, Json::parse_event_t event, Json& parsed) {
            return duplicateKeys(depth, event, parsed);
        });
    } catch (const nlohmann::json::parse_error& e) {
        // The parser stops at the first byte that is not UTF-8, and would
        // show it raw in its message.
        std::optional<std::size_t> offset = InvalidUtf8Offset(text);
        if (offset && *offset < e.byte) RefuseInvalidUtf8(text, *offset);
        std::string message = e.what();
        auto end = message.find("] ");  // drop the library's "[json.exception.parse_error.101] "
        throw DescriptionError("not valid JSON: " +
                               (end == std::string::npos ? message : message.substr(end + 2)));
    }
}

}  // namespace Host
}  // namespace Trellis
