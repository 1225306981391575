#include "trellis/host/JsonReader.h"

#include <algorithm>
#include <cstring>

#include <nlohmann/json.hpp>

#include "host/StoredText.h"

namespace Trellis {
namespace Host {

JsonReader::JsonReader(const Json* value, std::string path)
    : value_(value), place_(std::make_shared<const Place>(Place{nullptr, std::move(path), 0})) {}

JsonReader::JsonReader(const Json* value, std::shared_ptr<const Place> place)
    : value_(value), place_(std::move(place)) {}

JsonReader JsonReader::Child(const Json* value, const std::string& key) const {
    return JsonReader(value, std::make_shared<const Place>(Place{place_, key, 0}));
}

std::string JsonReader::Path() const {
    // The places from the top level down to this one.
    std::vector<const Place*> chain;
    for (const Place* place = place_.get(); place; place = place->parent.get()) chain.push_back(place);
    std::string path;
    for (auto it = chain.rbegin(); it != chain.rend(); ++it) {
        const Place& place = **it;
        if (!place.parent) {
            path = place.key;
        } else if (place.key.empty()) {
            path += "[" + std::to_string(place.index) + "]";
        } else {
            path += (path.empty() ? "" : ".") + place.key;
        }
    }
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

bool JsonReader::WasAskedFor(const char* key) const {
    for (const char* used : used_)
        if (used == key || std::strcmp(used, key) == 0) return true;
    return false;
}

const Json* JsonReader::Find(const char* key) const {
    ExpectObject();
    if (!WasAskedFor(key)) used_.push_back(key);
    auto it = value_->find(key);
    return it == value_->end() ? nullptr : &*it;
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

std::size_t JsonReader::Word(const char* key, const char* const* words, std::size_t count) const {
    const Json& member = Required(key);
    if (member.is_string()) {
        const std::string& text = member.get_ref<const std::string&>();
        for (std::size_t i = 0; i < count; ++i)
            if (text == words[i]) return i;
    }
    std::string expected;
    for (std::size_t i = 0; i < count; ++i)
        expected += (i == 0 ? "" : i + 1 == count ? " or " : ", ") + Quoted(words[i]);
    FailAt(key, "expected " + expected);
}

std::size_t JsonReader::Word(const char* key, const std::vector<std::string>& words) const {
    std::vector<const char*> pointers;
    for (const std::string& word : words) pointers.push_back(word.c_str());
    return Word(key, pointers.data(), pointers.size());
}

JsonReader JsonReader::Member(const char* key) const {
    return Child(Find(key), key);
}

JsonReader JsonReader::Object(const char* key) const {
    JsonReader member = Child(&Required(key), key);
    member.ExpectObject();
    return member;
}

std::vector<JsonReader> JsonReader::Elements() const {
    std::vector<JsonReader> elements;
    if (!value_) return elements;
    if (!value_->is_array()) Fail("expected an array");
    elements.reserve(value_->size());
    for (std::size_t i = 0; i < value_->size(); ++i)
        elements.push_back(JsonReader(&(*value_)[i], std::make_shared<const Place>(Place{place_, "", i})));
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
        if (!WasAskedFor(it.key().c_str()))
            FailAt(Printable(it.key()), "unknown field");
}

}  // namespace Host
}  // namespace Trellis
