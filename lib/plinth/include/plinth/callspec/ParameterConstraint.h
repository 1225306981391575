#pragma once

#include <string>
#include <utility>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/ParameterConstraintType.h"

namespace Plinth {
namespace CallSpec {

// What values a parameter accepts beyond its type. One kind per constraint;
// the operations of the other kinds are accepted and ignored by the tool.
class ParameterConstraint {
public:
    typedef std::pair<std::string, std::string> StringEnumValue;  // value, description

    static boost::shared_ptr<ParameterConstraint> New(ParameterConstraintType type);
    // The same with the kind as a number (1 int range ... 4 string regex).
    static boost::shared_ptr<ParameterConstraint> New(int type);

    virtual ~ParameterConstraint();

    virtual void AddStringEnum(std::string const& value, std::string const& description);
    virtual void AddIntEnum(long long value);
    virtual void SetIntRange(long long low, long long high);
    virtual void SetStringRegex(std::string const& pattern);

    // Read access for the tool.
    ParameterConstraintType GetType() const;
    std::vector<StringEnumValue> const& GetStringEnum() const;
    std::vector<long long> const& GetIntEnum() const;
    long long GetRangeLow() const;
    long long GetRangeHigh() const;
    std::string const& GetStringRegex() const;

private:
    explicit ParameterConstraint(ParameterConstraintType type);

    ParameterConstraintType type_;
    std::vector<StringEnumValue> stringEnum_;
    std::vector<long long> intEnum_;
    long long low_ = 0;
    long long high_ = 0;
    std::string regex_;
};

}  // namespace CallSpec
}  // namespace Plinth
