#include "plinth/callspec/Input.h"

namespace Plinth {
namespace CallSpec {

boost::shared_ptr<Input> Input::New() { return boost::shared_ptr<Input>(new Input()); }
Input::~Input() = default;

Input::Value const* Input::Find(std::string const& name) const {
    auto found = values_.find(name);
    return found == values_.end() ? nullptr : &found->second;
}

std::string Input::GetString(std::string const& name) const {
    Value const* value = Find(name);
    return value ? value->text : std::string();
}
int Input::GetInt(std::string const& name) const { return static_cast<int>(GetLongLong(name)); }
long long Input::GetLongLong(std::string const& name) const {
    Value const* value = Find(name);
    return value ? value->number : 0;
}
bool Input::GetBool(std::string const& name) const {
    Value const* value = Find(name);
    return value && value->truth;
}
bool Input::GetFlag(std::string const& name) const { return HasParameter(name); }
bool Input::HasParameter(std::string const& name) const { return Find(name) != nullptr; }

void Input::SetString(std::string const& name, std::string const& text) {
    Value value;
    value.text = text;
    values_[name] = value;
}
void Input::SetInt(std::string const& name, long long number) {
    Value value;
    value.text = std::to_string(number);
    value.number = number;
    values_[name] = value;
}
void Input::SetBool(std::string const& name, bool truth) {
    Value value;
    value.text = truth ? "true" : "false";
    value.truth = truth;
    values_[name] = value;
}
void Input::SetFlag(std::string const& name) {
    Value value;
    value.truth = true;
    values_[name] = value;
}

}  // namespace CallSpec
}  // namespace Plinth
