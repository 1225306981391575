#include "host/description/DescriptionIo.h"

#include <cstdint>
#include <cstdio>
#include <memory>
#include <optional>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "host/Store.h"
#include "host/StoredText.h"
#include "trellis/host/Description.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

constexpr const char* kFormatKey = "format";

void EraseHost(Transaction& t) {
    Store& store = t.GetStore();
    GuardedSql(store, [&] { store.Db().Execute("DELETE FROM records; DELETE FROM faults; DELETE FROM exec_log"); });
}

const SectionType& TypeOf(const std::string& key) {
    for (const SectionType& type : SectionTypes())
        if (type.key == key) return type;
    throw std::logic_error("No description section \"" + key + "\"");
}

// From description text to JSON, ParseDescriptionText refuses a syntax
// error, text that is not UTF-8 and a key given twice in one object, before
// any section reads the value.

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
    } catch (const nlohmann::json::out_of_range& e) {
        // A number beyond what a double holds ("1e999").
        std::string message = e.what();
        auto end = message.find("] ");
        throw DescriptionError("not valid JSON: " +
                               (end == std::string::npos ? message : message.substr(end + 2)));
    }
}

const Json& DefaultDescription() {
    static const Json description = ParseDescriptionText(kDefaultHostDescription);
    return description;
}

ParsedDescription ParseDescription(const Json& description) {
    JsonReader root(&description, "");
    root.ExpectObject();
    JsonReader format = root.Member(kFormatKey);
    // Compared as an integer: JSON equality would take 1.0 for 1.
    if (!format.Value().is_number_integer() || format.Value().get<std::int64_t>() != kDescriptionFormat)
        format.Fail("expected " + std::to_string(kDescriptionFormat) + ", the format this version reads");
    std::vector<ParsedDescription::Entry> sections;
    for (const SectionType& type : SectionTypes()) {
        std::unique_ptr<Section> section = type.make();
        section->Parse(root.Member(type.key.c_str()));
        sections.push_back({type.key, std::move(section)});
    }
    root.RejectUnknownMembers();
    ParsedDescription parsed(std::move(sections));
    for (const auto& entry : parsed.Sections()) entry.section->CheckReferences(parsed);
    return parsed;
}

void WriteDescription(Transaction& t, const ParsedDescription& description) {
    EraseHost(t);
    for (const auto& entry : description.Sections()) entry.section->Write(t);
}

void WriteDescription(Transaction& t, const Json& description) {
    WriteDescription(t, ParseDescription(description));
}

Json ExportDescription(const Transaction& t) {
    Json description{{kFormatKey, kDescriptionFormat}};
    for (const SectionType& type : SectionTypes()) description[type.key] = type.make()->Export(t);
    return description;
}

void WriteSectionOfDefault(Transaction& t, const std::string& key) {
    const Json& defaults = DefaultDescription();
    auto value = defaults.find(key);
    std::unique_ptr<Section> section = TypeOf(key).make();
    section->Parse(JsonReader(value == defaults.end() ? nullptr : &*value, key));
    section->Write(t);
}

std::string DescriptionText(const Json& description) {
    try {
        return description.dump(2) + "\n";
    } catch (const nlohmann::json::type_error&) {
        // Only text stored by an older build that checked less can get here.
        throw Gantry::Lib::GantryException("The host store holds text that is not valid UTF-8; it cannot be exported");
    }
}

}  // namespace Host
}  // namespace Trellis
