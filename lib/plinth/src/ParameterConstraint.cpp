#include "plinth/callspec/ParameterConstraint.h"

namespace Plinth {
namespace CallSpec {

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

}  // namespace CallSpec
}  // namespace Plinth
