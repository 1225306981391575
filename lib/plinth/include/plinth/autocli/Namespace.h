#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/NamespaceNode.h"

namespace Plinth {
namespace AutoCli {

// A node that only holds children.
class Namespace : public NamespaceNode {
public:
    static boost::shared_ptr<Namespace> New();

    ~Namespace() override;

private:
    Namespace() = default;
};

}  // namespace AutoCli
}  // namespace Plinth
