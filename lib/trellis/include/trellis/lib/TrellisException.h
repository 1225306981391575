#pragma once

#include <string>

#include "gantry/lib/GantryException.h"

namespace Trellis {
namespace Lib {

// A failure raised inside the implementation library (or by a command that
// leaves a deep place with one message), with the source position it came
// from. Caught as GantryException.
class TrellisException : public Gantry::Lib::GantryException {
public:
    TrellisException(std::string message, std::string sourceFile, unsigned int line,
                     Gantry::Lib::VobMessage vob = Gantry::Lib::VobMessage())
        : GantryException(std::move(message), vob),
          sourceFile_(std::move(sourceFile)),
          line_(line) {}

    const std::string& GetSourceFile() const { return sourceFile_; }
    unsigned int GetLine() const { return line_; }

private:
    std::string sourceFile_;
    unsigned int line_;
};

}  // namespace Lib
}  // namespace Trellis
