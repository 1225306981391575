#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/NamespaceNode.h"

// The one function a plug-in exports. The tool loads the plug-in with dlopen,
// looks up this symbol and calls it once with the root of its tree; the
// plug-in registers its own subtree under the root with RegisterNamespaceNode.
#define PLINTH_PLUGIN_ENTRY_SYMBOL "AutoCli_RegisterNamespaces"

extern "C" {
typedef void (*AutoCli_RegisterNamespacesFn)(boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root);

__attribute__((visibility("default"))) void AutoCli_RegisterNamespaces(
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root);
}
