#include "plinth/callspec/ParameterSpec.h"

namespace Plinth {
namespace CallSpec {

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
void ParameterSpec::SetIntWidth(IntWidth width) { intWidth_ = width; }

std::string const& ParameterSpec::GetName() const { return name_; }
ParameterType ParameterSpec::GetType() const { return type_; }
std::string const& ParameterSpec::GetShortName() const { return shortName_; }
std::string const& ParameterSpec::GetDescription() const { return description_; }
boost::shared_ptr<ParameterConstraint> ParameterSpec::GetConstraint() const { return constraint_; }
bool ParameterSpec::IsRequired() const { return required_; }
IntWidth ParameterSpec::GetIntWidth() const { return intWidth_; }

}  // namespace CallSpec
}  // namespace Plinth
