#include "plinth/callspec/Parameter.h"

namespace Plinth {
namespace CallSpec {

Parameter::Parameter(std::string name, ParameterType type, IntWidth width, std::string shortName, std::string help)
    : name_(std::move(name)), type_(type), width_(width), shortName_(std::move(shortName)), help_(std::move(help)) {}

Parameter Parameter::String(std::string name, std::string shortName, std::string help) {
    return Parameter(std::move(name), PARAMETER_STRING, IntWidth::Int32, std::move(shortName), std::move(help));
}
Parameter Parameter::Int(std::string name, std::string shortName, std::string help) {
    return Parameter(std::move(name), PARAMETER_INT, IntWidth::Int32, std::move(shortName), std::move(help));
}
Parameter Parameter::Int64(std::string name, std::string shortName, std::string help) {
    return Parameter(std::move(name), PARAMETER_INT, IntWidth::Int64, std::move(shortName), std::move(help));
}
Parameter Parameter::Bool(std::string name, std::string shortName, std::string help) {
    return Parameter(std::move(name), PARAMETER_BOOL, IntWidth::Int32, std::move(shortName), std::move(help));
}
Parameter Parameter::Flag(std::string name, std::string shortName, std::string help) {
    return Parameter(std::move(name), PARAMETER_FLAG, IntWidth::Int32, std::move(shortName), std::move(help));
}

Parameter Parameter::Required() const {
    Parameter changed = *this;
    changed.required_ = true;
    return changed;
}

Parameter Parameter::Range(long long low, long long high) const {
    Parameter changed = *this;
    changed.constraintType_ = CONSTRAINT_INT_RANGE;
    changed.low_ = low;
    changed.high_ = high;
    return changed;
}

Parameter Parameter::IntEnum(std::vector<long long> values) const {
    Parameter changed = *this;
    changed.constraintType_ = CONSTRAINT_INT_ENUM;
    changed.intEnum_ = std::move(values);
    return changed;
}

Parameter Parameter::StringEnum(std::vector<Word> words) const {
    Parameter changed = *this;
    changed.constraintType_ = CONSTRAINT_STRING_ENUM;
    changed.stringEnum_ = std::move(words);
    return changed;
}

Parameter Parameter::Regex(std::string pattern) const {
    Parameter changed = *this;
    changed.constraintType_ = CONSTRAINT_STRING_REGEX;
    changed.regex_ = std::move(pattern);
    return changed;
}

boost::shared_ptr<ParameterConstraint> Parameter::NewConstraint() const {
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(constraintType_);
    switch (constraintType_) {
    case CONSTRAINT_INT_RANGE:
        constraint->SetIntRange(low_, high_);
        break;
    case CONSTRAINT_INT_ENUM:
        for (long long value : intEnum_) constraint->AddIntEnum(value);
        break;
    case CONSTRAINT_STRING_ENUM:
        for (Word const& word : stringEnum_) constraint->AddStringEnum(word.first, word.second);
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
    if (!shortName_.empty()) spec->SetShortName(shortName_);
    spec->SetDescription(help_);
    if (constraintType_ != 0) spec->SetConstraint(NewConstraint());
    spec->SetIntWidth(width_);
    return spec;
}

}  // namespace CallSpec
}  // namespace Plinth
