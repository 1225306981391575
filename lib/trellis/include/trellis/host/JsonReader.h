#pragma once

// Checked reading of JSON values: every host description and every stored
// record is read through a JsonReader, so each bad value is refused with the
// path where it stands, e.g.
//   firewall.rulesets[2].rules[0].portBegin: expected an integer from 0 to 65535

#include <cstddef>
#include <cstdint>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <nlohmann/json_fwd.hpp>

#include "trellis/host/JsonMembers.h"

namespace Trellis {
namespace Host {

// Every JSON value of the host keeps the order of its members.
using Json = nlohmann::basic_json<JsonMembers>;

// A description or record that cannot be read. The text is "path: problem".
class DescriptionError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

class JsonReader {
public:
    // value may be null: the reader then stands for a member that is absent.
    // path names where value stands, for messages ("" for the top level).
    JsonReader(const Json* value, std::string path);
    // A stored record's: its path reads kind "name". kind is a text that
    // lives as long as the program; name outlives the reader.
    JsonReader(const Json* value, const char* kind, const std::string& name);

    bool IsPresent() const { return value_ != nullptr; }
    // Where the value stands, e.g. "firewall.rulesets[2].rules[0]". Built
    // only when asked for: a reader that reads what it expects never spells
    // out its path.
    std::string Path() const;
    const Json& Value() const;  // fails when absent
    [[noreturn]] void Fail(const std::string& problem) const;

    // The reader's own value.
    void ExpectObject() const;
    // Every string of the host is valid UTF-8 without control characters;
    // AsString and the string readers below refuse any other.
    std::string AsString() const;
    // The elements of an array value; an absent value is an empty array.
    std::vector<JsonReader> Elements() const;

    // Members of an object value. The forms without a fallback refuse a
    // missing member; the forms with one return it for a missing member.
    std::string String(const char* key) const;
    std::string String(const char* key, const std::string& fallback) const;
    bool Bool(const char* key) const;
    std::int64_t Int(const char* key, std::int64_t min, std::int64_t max) const;
    // A string that must be one of the count words; returns its index.
    std::size_t Word(const char* key, const char* const* words, std::size_t count) const;
    std::size_t Word(const char* key, const std::vector<std::string>& words) const;
    // Word as an enum whose values are the indexes of words:
    //   Direction d = in.Word<Direction>("direction", kDirectionWords);
    template <class Enum, std::size_t N>
    Enum Word(const char* key, const char* const (&words)[N]) const {
        return static_cast<Enum>(Word(key, words, N));
    }

    // A member that may be absent (then the result is not IsPresent()).
    JsonReader Member(const char* key) const;
    // A required member that must be an object.
    JsonReader Object(const char* key) const;
    // The elements of an array member; an absent member is an empty array.
    std::vector<JsonReader> Array(const char* key) const;
    std::vector<std::string> StringArray(const char* key) const;

    // Refuses every member of this object that no call above asked for, so
    // a misspelt key cannot pass unnoticed. Call it last.
    void RejectUnknownMembers() const;

    // The readers that Member, Object, Elements and Array return refer to
    // the reader they came from, for their path: use them while it lives,
    // as they are used while the JSON they read lives. The keys given to
    // the calls above are the callers' own texts, which live as long as the
    // program (field names): they are kept, not copied.

private:
    static constexpr std::size_t kNoIndex = static_cast<std::size_t>(-1);
    static constexpr std::size_t kMarkedMembers = 64;

    // A member (key) of the parent's value, an element (index) of it, or
    // an element of a member (both).
    JsonReader(const Json* value, const JsonReader* parent, const char* key, std::size_t index);
    std::vector<JsonReader> ElementsOf(const Json* value, const char* key) const;
    std::string PathOf(const std::string& key) const;
    [[noreturn]] void FailAt(const std::string& key, const std::string& problem) const;
    const Json& Required(const char* key) const;
    const Json* Find(const char* key) const;
    bool WasAskedFor(std::size_t member) const;

    const Json* value_;
    // Where the value stands: below the parent's, or the top level, which
    // has a label (or a record's kind and name) of its own.
    const JsonReader* parent_ = nullptr;
    const char* key_ = nullptr;
    std::size_t index_ = kNoIndex;
    std::string label_;
    const char* kind_ = nullptr;
    const std::string* name_ = nullptr;
    // The members asked for, by their place in the object, for
    // RejectUnknownMembers: a bit for each of the first ones, and the
    // places of any beyond.
    mutable std::uint64_t asked_ = 0;
    mutable std::vector<std::size_t> askedBeyond_;
};

// The word of an enum value from its table (see JsonReader::Word).
template <class Enum, std::size_t N>
const char* WordOf(Enum value, const char* const (&words)[N]) {
    return words[static_cast<std::size_t>(value)];
}

}  // namespace Host
}  // namespace Trellis
