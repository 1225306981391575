#include "NamespaceTreeBuilder.h"

#include <stdexcept>
#include <string>

#include "plinth/autocli/Namespace.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

struct OpenNamespace {
    std::string path;
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> node;
};

std::string LastWord(const std::string& path) {
    std::string::size_type blank = path.rfind(' ');
    return blank == std::string::npos ? path : path.substr(blank + 1);
}

bool IsBelow(const std::string& path, const std::string& ancestor) {
    return path.size() > ancestor.size() && path.compare(0, ancestor.size(), ancestor) == 0 &&
           path[ancestor.size()] == ' ';
}

// Closes the innermost open namespace: its subtree is complete, so it is
// hung under its parent (or under the tool's root, for the subtree's root).
void CloseInnermost(std::vector<OpenNamespace>& open,
                    const boost::shared_ptr<Plinth::AutoCli::NamespaceNode>& root) {
    OpenNamespace done = open.back();
    open.pop_back();
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> parent = open.empty() ? root : open.back().node;
    parent->RegisterNamespaceNode(done.node, LastWord(done.path));
}

}  // namespace

void BuildNamespaceTree(const std::vector<TreeRow>& rows,
                        boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root) {
    std::vector<OpenNamespace> open;
    for (const TreeRow& row : rows) {
        const std::string path = row.path;
        while (!open.empty() && !IsBelow(path, open.back().path)) {
            if (open.size() == 1)
                throw std::logic_error("Tree row outside the plug-in's subtree: " + path);
            CloseInnermost(open, root);
        }
        if (row.create) {
            if (open.empty())
                throw std::logic_error("Command outside any namespace: " + path);
            open.back().node->RegisterNamespaceNode(row.create(), LastWord(path));
        } else {
            boost::shared_ptr<Plinth::AutoCli::NamespaceNode> node = Plinth::AutoCli::Namespace::New();
            node->SetDescription(row.description);
            open.push_back(OpenNamespace{path, node});
        }
    }
    while (!open.empty()) CloseInnermost(open, root);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
