#include "plinth/callspec/InputSpec.h"

namespace Plinth {
namespace CallSpec {

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

}  // namespace CallSpec
}  // namespace Plinth
