#pragma once

#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"
#include "plinth/autocli/NamespaceNode.h"

namespace KorvexCli {
namespace NetworkNamespace {

// One row of the plug-in's tree: a namespace with its description, or a
// command with the function that creates it. Paths are the words the user
// types, separated by single blanks ("network firewall ruleset list").
struct TreeRow {
    const char* path;
    const char* description;                                       // namespaces only
    boost::shared_ptr<Plinth::AutoCli::Command> (*create)();       // commands only
};

inline constexpr TreeRow NamespaceRow(const char* path, const char* description) {
    return TreeRow{path, description, nullptr};
}

template <class CommandClass>
boost::shared_ptr<Plinth::AutoCli::Command> CreateCommand() {
    return CommandClass::New();
}

template <class CommandClass>
constexpr TreeRow CommandRow(const char* path) {
    return TreeRow{path, nullptr, &CreateCommand<CommandClass>};
}

// Builds the tree of rows, which are in depth-first order with the subtree's
// root first, and hangs it under root as the last step. A namespace is
// attached to its parent only once its whole subtree is built, a command as
// soon as it is created; so an exception midway leaves nothing in root.
void BuildNamespaceTree(const std::vector<TreeRow>& rows,
                        boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
