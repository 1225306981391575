#pragma once

#include <exception>
#include <string>

#include "gantry/lib/VobMessage.h"

namespace Gantry {
namespace Lib {

// What every host control operation throws. A command shows the text that
// GetMessage(0) returns.
class GantryException : public std::exception {
public:
    explicit GantryException(std::string message, VobMessage vob = VobMessage())
        : message_(std::move(message)), vob_(vob) {}
    ~GantryException() override = default;

    virtual std::string GetMessage(int /*level*/) const { return message_; }
    const char* what() const noexcept override { return message_.c_str(); }

private:
    std::string message_;
    VobMessage vob_;
};

}  // namespace Lib
}  // namespace Gantry
