// The network tree as the user sees it: every namespace with its description,
// every built command under its path, all in the order of the help.

#include <cxxabi.h>

#include <cstdlib>
#include <fstream>
#include <set>
#include <stdexcept>
#include <string>
#include <typeinfo>
#include <vector>

#include <gtest/gtest.h>

#include "NamespaceTreeBuilder.h"
#include "plinth/autocli/Command.h"
#include "plinth/autocli/Namespace.h"
#include "plinth/autocli/PluginEntry.h"

namespace {

using Plinth::AutoCli::NamespaceNode;

std::string ClassName(const NamespaceNode& node) {
    int status = 0;
    char* demangled = abi::__cxa_demangle(typeid(node).name(), nullptr, nullptr, &status);
    std::string name = demangled ? demangled : typeid(node).name();
    std::free(demangled);
    const std::string prefix = "KorvexCli::NetworkNamespace::";
    return name.compare(0, prefix.size(), prefix) == 0 ? name.substr(prefix.size()) : name;
}

// One line per node, depth first in registration order, in the format of
// data/network-tree.txt: "path<TAB>namespace<TAB>description" or "path<TAB>Class".
void Describe(const boost::shared_ptr<NamespaceNode>& node, std::vector<std::string>& lines) {
    const std::string path = node->GetPathString(' ');
    if (node->GetType() == "command") {
        lines.push_back(path + "\t" + ClassName(*node));
        return;
    }
    lines.push_back(path + "\tnamespace\t" + node->GetDescription());
    for (const auto& child : node->GetNamespaceNodes()) Describe(child, lines);
}

std::vector<std::string> ReadExpectedTree() {
    const std::string file = std::string(__FILE__).substr(0, std::string(__FILE__).rfind('/')) +
                             "/data/network-tree.txt";
    std::ifstream in(file);
    std::vector<std::string> lines;
    for (std::string line; std::getline(in, line);)
        if (!line.empty()) lines.push_back(line);
    return lines;
}

std::string PathOf(const std::string& line) { return line.substr(0, line.find('\t')); }

}  // namespace

TEST(NamespaceTree, HoldsEveryNamespaceAndEachBuiltCommandInItsPlace) {
    boost::shared_ptr<NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    AutoCli_RegisterNamespaces(root);
    ASSERT_EQ(root->GetNamespaceNodeNames(), std::vector<std::string>{"network"});

    std::vector<std::string> actual;
    Describe(root->GetNamespaceNode("network"), actual);
    std::set<std::string> actualPaths;
    for (const auto& line : actual) actualPaths.insert(PathOf(line));

    // Commands not built yet are left out of the expectation; namespaces never.
    std::vector<std::string> expected;
    size_t commandsExpected = 0;
    for (const auto& line : ReadExpectedTree()) {
        const bool isNamespace = line.find("\tnamespace\t") != std::string::npos;
        if (!isNamespace) ++commandsExpected;
        if (isNamespace || actualPaths.count(PathOf(line))) expected.push_back(line);
    }
    ASSERT_EQ(commandsExpected, 116u);
    EXPECT_EQ(actual, expected);
}

TEST(NamespaceTree, AttachesNothingWhenACommandFailsMidway) {
    using namespace KorvexCli::NetworkNamespace;
    struct Failing {
        static boost::shared_ptr<Plinth::AutoCli::Command> New() { throw std::runtime_error("no memory"); }
    };
    const std::vector<TreeRow> rows = {
        NamespaceRow("network", "top"),
        NamespaceRow("network a", "first"),
        NamespaceRow("network b", "second"),
        TreeRow{"network b run", nullptr, &Failing::New},
    };
    boost::shared_ptr<NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    EXPECT_THROW(BuildNamespaceTree(rows, root), std::runtime_error);
    EXPECT_TRUE(root->GetNamespaceNodeNames().empty());
}
