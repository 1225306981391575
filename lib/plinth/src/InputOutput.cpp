// The values that cross one call: Input and Output.
#include "plinth/callspec/Input.h"
#include "plinth/callspec/Output.h"

namespace Plinth {
namespace CallSpec {

// Input
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

// Output
boost::shared_ptr<Output> Output::New() { return boost::shared_ptr<Output>(new Output()); }
Output::~Output() = default;

void Output::SetError(std::string const& text) { errors_.push_back(text); }
bool Output::HasError() const { return !errors_.empty(); }
void Output::SetResult(boost::shared_ptr<MetaObj::MetaObject> result) { result_ = result; }
void Output::Finish() { finished_ = true; }

std::vector<std::string> const& Output::GetErrors() const { return errors_; }
boost::shared_ptr<MetaObj::MetaObject> Output::GetResult() const { return result_; }
bool Output::IsFinished() const { return finished_; }

}  // namespace CallSpec
}  // namespace Plinth
