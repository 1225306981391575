#pragma once

#include <map>
#include <string>

#include <boost/shared_ptr.hpp>

namespace Plinth {
namespace CallSpec {

// The validated arguments of one call, by long parameter name. The tool fills
// it after checking the values against the command's InputSpec, so a command
// reads its required parameters without asking HasParameter.
class Input {
public:
    static boost::shared_ptr<Input> New();

    virtual ~Input();

    // The value of a string parameter; "" when it was not given.
    virtual std::string GetString(std::string const& name) const;
    // The value of an int parameter; 0 when it was not given.
    virtual int GetInt(std::string const& name) const;
    // The value of a bool parameter; false when it was not given.
    virtual bool GetBool(std::string const& name) const;
    // Whether a flag parameter was given.
    virtual bool GetFlag(std::string const& name) const;
    // Whether the parameter was given on the command line at all.
    virtual bool HasParameter(std::string const& name) const;

    // Filling, for the tool and for tests that drive a command directly. A
    // second call for the same name replaces the value.
    void SetString(std::string const& name, std::string const& value);
    void SetInt(std::string const& name, long long value);
    void SetBool(std::string const& name, bool value);
    void SetFlag(std::string const& name);
    // The full 64-bit value of an int parameter; 0 when it was not given.
    long long GetLongLong(std::string const& name) const;

private:
    Input() = default;

    struct Value {
        std::string text;
        long long number = 0;
        bool truth = false;
    };
    Value const* Find(std::string const& name) const;

    std::map<std::string, Value> values_;
};

}  // namespace CallSpec
}  // namespace Plinth
