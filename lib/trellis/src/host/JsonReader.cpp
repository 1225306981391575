#include "trellis/host/JsonReader.h"

#include <algorithm>

#include <nlohmann/json.hpp>

#include "host/StoredText.h"

namespace Trellis {
namespace Host {

JsonReader::JsonReader(const Json* value, std::string path) : value_(value), label_(std::move(path)) {}

JsonReader::JsonReader(const Json* value, const char* kind, const std::string& name)
    : value_(value), kind_(kind), name_(&name) {}

JsonReader::JsonReader(const Json* value, const JsonReader* parent, const char* key, std::size_t index)
    : value_(value), parent_(parent), key_(key), index_(index) {}

std::string JsonReader::Path() const {
    std::string path;
    if (parent_)
        path = parent_->Path();
    else if (name_)
        path = std::string(kind_) + " \"" + *name_ + "\"";
    else
        path = label_;
    if (key_) path += (path.empty() ? "" : ".") + std::string(key_);
    if (index_ != kNoIndex) path += "[" + std::to_string(index_) + "]";
    return path;
}

std::string JsonReader::PathOf(const std::string& key) const {
    std::string path = Path();
    return path.empty() ? key : path + "." + key;
}

const Json& JsonReader::Value() const {
    if (!value_) Fail("missing required field");
    return *value_;
}

void JsonReader::Fail(const std::string& problem) const {
    std::string path = Path();
    throw DescriptionError((path.empty() ? std::string("top level") : path) + ": " + problem);
}

void JsonReader::FailAt(const std::string& key, const std::string& problem) const {
    throw DescriptionError(PathOf(key) + ": " + problem);
}

void JsonReader::ExpectObject() const {
    if (!Value().is_object()) Fail("expected an object");
}

std::string JsonReader::AsString() const {
    if (!Value().is_string()) Fail("expected a string");
    std::string text = value_->get<std::string>();
    std::string problem = TextProblem(text);
    if (!problem.empty()) Fail("the text " + problem);
    return text;
}

bool JsonReader::WasAskedFor(std::size_t member) const {
    if (member < kMarkedMembers) return (asked_ >> member) & 1;
    return std::find(askedBeyond_.begin(), askedBeyond_.end(), member) != askedBeyond_.end();
}

const Json* JsonReader::Find(const char* key) const {
    ExpectObject();
    const Json::object_t& members = *value_->get_ptr<const Json::object_t*>();
    const std::size_t member = members.IndexOf(key);
    if (member == members.size()) return nullptr;
    if (member < kMarkedMembers)
        asked_ |= std::uint64_t{1} << member;
    else if (!WasAskedFor(member))
        askedBeyond_.push_back(member);
    return &members.data()[member].second;
}

const Json& JsonReader::Required(const char* key) const {
    const Json* member = Find(key);
    if (!member) FailAt(key, "missing required field");
    return *member;
}

std::string JsonReader::String(const char* key) const {
    const Json& member = Required(key);
    if (!member.is_string()) FailAt(key, "expected a string");
    std::string text = member.get<std::string>();
    std::string problem = TextProblem(text);
    if (!problem.empty()) FailAt(key, "the text " + problem);
    return text;
}

std::string JsonReader::String(const char* key, const std::string& fallback) const {
    return Find(key) ? String(key) : fallback;
}

bool JsonReader::Bool(const char* key) const {
    const Json& member = Required(key);
    if (!member.is_boolean()) FailAt(key, "expected true or false");
    return member.get<bool>();
}

std::int64_t JsonReader::Int(const char* key, std::int64_t min, std::int64_t max) const {
    const Json& member = Required(key);
    bool inRange = false;
    std::int64_t value = 0;
    if (member.is_number_unsigned()) {
        auto unsignedValue = member.get<std::uint64_t>();
        inRange = unsignedValue <= static_cast<std::uint64_t>(INT64_MAX);
        value = static_cast<std::int64_t>(unsignedValue);
    } else if (member.is_number_integer()) {
        value = member.get<std::int64_t>();
        inRange = true;
    }
    if (!inRange || value < min || value > max)
        FailAt(key, "expected an integer from " + std::to_string(min) + " to " + std::to_string(max));
    return value;
}

namespace {

// What Word expects, for its message: "a", "b" or "c".
template <class Words>
std::string Expected(const Words& words, std::size_t count) {
    std::string expected;
    for (std::size_t i = 0; i < count; ++i)
        expected += (i == 0 ? "" : i + 1 == count ? " or " : ", ") + Quoted(words[i]);
    return expected;
}

}  // namespace

std::size_t JsonReader::Word(const char* key, const char* const* words, std::size_t count) const {
    const Json& member = Required(key);
    if (member.is_string()) {
        const std::string& text = member.get_ref<const std::string&>();
        for (std::size_t i = 0; i < count; ++i)
            if (text == words[i]) return i;
    }
    FailAt(key, "expected " + Expected(words, count));
}

std::size_t JsonReader::Word(const char* key, const std::vector<std::string>& words) const {
    const Json& member = Required(key);
    if (member.is_string()) {
        const std::string& text = member.get_ref<const std::string&>();
        for (std::size_t i = 0; i < words.size(); ++i)
            if (text == words[i]) return i;
    }
    FailAt(key, "expected " + Expected(words, words.size()));
}

JsonReader JsonReader::Member(const char* key) const {
    return JsonReader(Find(key), this, key, kNoIndex);
}

JsonReader JsonReader::Object(const char* key) const {
    JsonReader member(&Required(key), this, key, kNoIndex);
    member.ExpectObject();
    return member;
}

std::vector<JsonReader> JsonReader::ElementsOf(const Json* value, const char* key) const {
    std::vector<JsonReader> elements;
    if (!value) return elements;
    if (!value->is_array()) {
        if (key) FailAt(key, "expected an array");
        Fail("expected an array");
    }
    const Json::array_t& array = *value->get_ptr<const Json::array_t*>();
    elements.reserve(array.size());
    for (std::size_t i = 0; i < array.size(); ++i) elements.push_back(JsonReader(&array[i], this, key, i));
    return elements;
}

std::vector<JsonReader> JsonReader::Elements() const {
    return ElementsOf(value_, nullptr);
}

std::vector<JsonReader> JsonReader::Array(const char* key) const {
    return ElementsOf(Find(key), key);
}

std::vector<std::string> JsonReader::StringArray(const char* key) const {
    std::vector<std::string> strings;
    for (const JsonReader& element : Array(key)) strings.push_back(element.AsString());
    return strings;
}

void JsonReader::RejectUnknownMembers() const {
    ExpectObject();
    const Json::object_t& members = *value_->get_ptr<const Json::object_t*>();
    for (std::size_t member = 0; member < members.size(); ++member)
        if (!WasAskedFor(member)) FailAt(Printable(members.data()[member].first), "unknown field");
}

}  // namespace Host
}  // namespace Trellis
