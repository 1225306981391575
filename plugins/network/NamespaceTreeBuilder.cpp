#include "NamespaceTreeBuilder.h"

#include <stdexcept>
#include <string>
#include <string_view>

#include "plinth/autocli/Namespace.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

// Paths are the rows' own texts, which outlive the building: read in
// place, not copied.
struct OpenNamespace {
    std::string_view path;
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> node;
};

std::string LastWord(std::string_view path) {
    std::string_view::size_type blank = path.rfind(' ');
    return std::string(blank == std::string_view::npos ? path : path.substr(blank + 1));
}

bool IsBelow(std::string_view path, std::string_view ancestor) {
    return path.size() > ancestor.size() && path.compare(0, ancestor.size(), ancestor) == 0 &&
           path[ancestor.size()] == ' ';
}

// Closes the innermost open namespace: its subtree is complete, so it is
// hung under its parent (or under the tool's root, for the subtree's root).
void CloseInnermost(std::vector<OpenNamespace>& open,
                    const boost::shared_ptr<Plinth::AutoCli::NamespaceNode>& root) {
    OpenNamespace done = std::move(open.back());
    open.pop_back();
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> parent = open.empty() ? root : open.back().node;
    parent->RegisterNamespaceNode(done.node, LastWord(done.path));
}

}  // namespace

void BuildNamespaceTree(const std::vector<TreeRow>& rows,
                        boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root) {
    std::vector<OpenNamespace> open;
    for (const TreeRow& row : rows) {
        const std::string_view path = row.path;
        while (!open.empty() && !IsBelow(path, open.back().path)) {
            if (open.size() == 1)
                throw std::logic_error("Tree row outside the plug-in's subtree: " + std::string(path));
            CloseInnermost(open, root);
        }
        if (row.create) {
            if (open.empty())
                throw std::logic_error("Command outside any namespace: " + std::string(path));
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
