#include "plinth/callspec/Parameter.h"

namespace Plinth {
namespace CallSpec {

boost::shared_ptr<ParameterConstraint> Parameter::NewConstraint() const {
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(constraintType_);
    switch (constraintType_) {
    case CONSTRAINT_INT_RANGE:
        constraint->SetIntRange(low_, high_);
        break;
    case CONSTRAINT_INT_ENUM:
        for (std::size_t i = 0; i < enumCount_; ++i) constraint->AddIntEnum(intEnum_[i]);
        break;
    case CONSTRAINT_STRING_ENUM:
        for (std::size_t i = 0; i < enumCount_; ++i) constraint->AddStringEnum(stringEnum_[i].value, stringEnum_[i].help);
        break;
    default:
        constraint->SetStringRegex(regex_);
        break;
    }
    return constraint;
}

boost::shared_ptr<ParameterSpec> Parameter::NewSpec() const {
    boost::shared_ptr<ParameterSpec> spec = ParameterSpec::New(name_, type_);
    spec->SetRequired(required_);
    if (*shortName_ != '\0') spec->SetShortName(shortName_);
    spec->SetDescription(help_);
    if (constraintType_ != 0) spec->SetConstraint(NewConstraint());
    spec->SetIntWidth(width_);
    return spec;
}

}  // namespace CallSpec
}  // namespace Plinth
