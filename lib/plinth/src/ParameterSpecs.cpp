// The call specification objects: ParameterConstraint, ParameterSpec,
// InputSpec and OutputSpec.
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"

namespace Plinth {
namespace CallSpec {

// ParameterConstraint
boost::shared_ptr<ParameterConstraint> ParameterConstraint::New(ParameterConstraintType type) {
    return boost::shared_ptr<ParameterConstraint>(new ParameterConstraint(type));
}
boost::shared_ptr<ParameterConstraint> ParameterConstraint::New(int type) {
    return New(static_cast<ParameterConstraintType>(type));
}
ParameterConstraint::ParameterConstraint(ParameterConstraintType type) : type_(type) {}
ParameterConstraint::~ParameterConstraint() = default;

void ParameterConstraint::AddStringEnum(std::string const& value, std::string const& description) {
    stringEnum_.emplace_back(value, description);
}
void ParameterConstraint::AddIntEnum(long long value) { intEnum_.push_back(value); }
void ParameterConstraint::SetIntRange(long long low, long long high) {
    low_ = low;
    high_ = high;
}
void ParameterConstraint::SetStringRegex(std::string const& pattern) { regex_ = pattern; }

ParameterConstraintType ParameterConstraint::GetType() const { return type_; }
std::vector<ParameterConstraint::StringEnumValue> const& ParameterConstraint::GetStringEnum() const {
    return stringEnum_;
}
std::vector<long long> const& ParameterConstraint::GetIntEnum() const { return intEnum_; }
long long ParameterConstraint::GetRangeLow() const { return low_; }
long long ParameterConstraint::GetRangeHigh() const { return high_; }
std::string const& ParameterConstraint::GetStringRegex() const { return regex_; }

// ParameterSpec
boost::shared_ptr<ParameterSpec> ParameterSpec::New(std::string const& name, ParameterType type) {
    return boost::shared_ptr<ParameterSpec>(new ParameterSpec(name, type));
}
boost::shared_ptr<ParameterSpec> ParameterSpec::New(std::string const& name, int type) {
    return New(name, static_cast<ParameterType>(type));
}
ParameterSpec::ParameterSpec(std::string const& name, ParameterType type) : name_(name), type_(type) {}
ParameterSpec::~ParameterSpec() = default;

void ParameterSpec::SetShortName(std::string const& shortName) { shortName_ = shortName; }
void ParameterSpec::SetDescription(std::string const& description) { description_ = description; }
void ParameterSpec::SetConstraint(boost::shared_ptr<ParameterConstraint> constraint) {
    constraint_ = constraint;
}
void ParameterSpec::SetRequired(bool required) { required_ = required; }

std::string const& ParameterSpec::GetName() const { return name_; }
ParameterType ParameterSpec::GetType() const { return type_; }
std::string const& ParameterSpec::GetShortName() const { return shortName_; }
std::string const& ParameterSpec::GetDescription() const { return description_; }
boost::shared_ptr<ParameterConstraint> ParameterSpec::GetConstraint() const { return constraint_; }
bool ParameterSpec::IsRequired() const { return required_; }

// InputSpec
boost::shared_ptr<InputSpec> InputSpec::New() { return boost::shared_ptr<InputSpec>(new InputSpec()); }
InputSpec::~InputSpec() = default;

void InputSpec::AddParameter(boost::shared_ptr<ParameterSpec> parameter) {
    if (parameter) parameters_.push_back(parameter);
}
std::vector<boost::shared_ptr<ParameterSpec> > const& InputSpec::GetParameters() const {
    return parameters_;
}
boost::shared_ptr<ParameterSpec> InputSpec::FindByName(std::string const& name) const {
    for (auto const& parameter : parameters_) {
        if (parameter->GetName() == name) return parameter;
    }
    return boost::shared_ptr<ParameterSpec>();
}
boost::shared_ptr<ParameterSpec> InputSpec::FindByShortName(std::string const& shortName) const {
    if (shortName.empty()) return boost::shared_ptr<ParameterSpec>();
    for (auto const& parameter : parameters_) {
        if (parameter->GetShortName() == shortName) return parameter;
    }
    return boost::shared_ptr<ParameterSpec>();
}

// OutputSpec
boost::shared_ptr<OutputSpec> OutputSpec::New() { return boost::shared_ptr<OutputSpec>(new OutputSpec()); }
OutputSpec::~OutputSpec() = default;
void OutputSpec::SetResultType(boost::shared_ptr<MetaObj::MetaObject> resultType) {
    resultType_ = resultType;
}
boost::shared_ptr<MetaObj::MetaObject> OutputSpec::GetResultType() const { return resultType_; }

}  // namespace CallSpec
}  // namespace Plinth
