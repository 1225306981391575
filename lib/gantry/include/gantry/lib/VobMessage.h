#pragma once

namespace Gantry {
namespace Lib {

// An event record that may accompany an exception. The network commands
// always pass an empty one.
class VobMessage {
public:
    VobMessage() = default;
};

}  // namespace Lib
}  // namespace Gantry
