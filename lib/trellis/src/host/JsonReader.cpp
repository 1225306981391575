#include "trellis/host/JsonReader.h"

#include <nlohmann/json.hpp>

#include "host/StoredText.h"

namespace Trellis {
namespace Host {

JsonReader::JsonReader(const Json* value, std::string path) : value_(value), path_(std::move(path)) {}

const Json& JsonReader::Value() const {
    if (!value_) Fail("missing required field");
    return *value_;
}

void JsonReader::Fail(const std::string& problem) const {
    throw DescriptionError((path_.empty() ? std::string("top level") : path_) + ": " + problem);
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

std::string JsonReader::PathOf(const std::string& key) const {
    return path_.empty() ? key : path_ + "." + key;
}

const Json* JsonReader::Find(const char* key) const {
    ExpectObject();
    used_.insert(key);
    auto it = value_->find(key);
    return it == value_->end() ? nullptr : &*it;
}

const Json& JsonReader::Required(const char* key) const {
    const Json* member = Find(key);
    if (!member) JsonReader(nullptr, PathOf(key)).Fail("missing required field");
    return *member;
}

std::string JsonReader::String(const char* key) const {
    return JsonReader(&Required(key), PathOf(key)).AsString();
}

std::string JsonReader::String(const char* key, const std::string& fallback) const {
    const Json* member = Find(key);
    return member ? JsonReader(member, PathOf(key)).AsString() : fallback;
}

bool JsonReader::Bool(const char* key) const {
    const Json& member = Required(key);
    if (!member.is_boolean()) JsonReader(&member, PathOf(key)).Fail("expected true or false");
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
        JsonReader(&member, PathOf(key))
            .Fail("expected an integer from " + std::to_string(min) + " to " + std::to_string(max));
    return value;
}

std::size_t JsonReader::Word(const char* key, const std::vector<std::string>& words) const {
    const Json& member = Required(key);
    if (member.is_string()) {
        for (std::size_t i = 0; i < words.size(); ++i)
            if (member.get<std::string>() == words[i]) return i;
    }
    std::string expected;
    for (std::size_t i = 0; i < words.size(); ++i)
        expected += (i == 0 ? "" : i + 1 == words.size() ? " or " : ", ") + Quoted(words[i]);
    JsonReader(&member, PathOf(key)).Fail("expected " + expected);
}

JsonReader JsonReader::Member(const char* key) const {
    return JsonReader(Find(key), PathOf(key));
}

JsonReader JsonReader::Object(const char* key) const {
    JsonReader member(&Required(key), PathOf(key));
    member.ExpectObject();
    return member;
}

std::vector<JsonReader> JsonReader::Elements() const {
    std::vector<JsonReader> elements;
    if (!value_) return elements;
    if (!value_->is_array()) Fail("expected an array");
    for (std::size_t i = 0; i < value_->size(); ++i)
        elements.emplace_back(&(*value_)[i], path_ + "[" + std::to_string(i) + "]");
    return elements;
}

std::vector<JsonReader> JsonReader::Array(const char* key) const {
    return Member(key).Elements();
}

std::vector<std::string> JsonReader::StringArray(const char* key) const {
    std::vector<std::string> strings;
    for (const JsonReader& element : Array(key)) strings.push_back(element.AsString());
    return strings;
}

void JsonReader::RejectUnknownMembers() const {
    ExpectObject();
    for (auto it = value_->begin(); it != value_->end(); ++it)
        if (!used_.count(it.key())) JsonReader(&it.value(), PathOf(Printable(it.key()))).Fail("unknown field");
}

}  // namespace Host
}  // namespace Trellis
