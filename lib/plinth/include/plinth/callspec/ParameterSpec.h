#pragma once

#include <string>

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterType.h"

namespace Plinth {
namespace CallSpec {

// One parameter of a command: the long name (used as --name), its type, an
// optional one-letter short name (used as -x), the help text, whether it is
// required, and an optional constraint.
class ParameterSpec {
public:
    static boost::shared_ptr<ParameterSpec> New(std::string const& name, ParameterType type);
    // The same with the type as a number (0 string, 1 int, 2 bool, 3 flag).
    static boost::shared_ptr<ParameterSpec> New(std::string const& name, int type);

    virtual ~ParameterSpec();

    virtual void SetShortName(std::string const& shortName);
    // Help text; "%ENUM%" and "%FULLENUM%" are expanded by the tool from an
    // enum constraint.
    virtual void SetDescription(std::string const& description);
    virtual void SetConstraint(boost::shared_ptr<ParameterConstraint> constraint);
    virtual void SetRequired(bool required);
    // Beyond the commands' operations: the width of an int parameter's value
    // (Int32 unless set).
    void SetIntWidth(IntWidth width);

    // Read access for the tool.
    std::string const& GetName() const;
    ParameterType GetType() const;
    std::string const& GetShortName() const;
    std::string const& GetDescription() const;
    boost::shared_ptr<ParameterConstraint> GetConstraint() const;
    bool IsRequired() const;
    IntWidth GetIntWidth() const;

private:
    ParameterSpec(std::string const& name, ParameterType type);

    std::string name_;
    ParameterType type_;
    std::string shortName_;
    std::string description_;
    boost::shared_ptr<ParameterConstraint> constraint_;
    bool required_ = false;
    IntWidth intWidth_ = IntWidth::Int32;
};

}  // namespace CallSpec
}  // namespace Plinth
