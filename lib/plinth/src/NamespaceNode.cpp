#include "plinth/autocli/NamespaceNode.h"

#include "plinth/autocli/Namespace.h"
#include "plinth/callspec/CallTarget.h"

namespace Plinth {
namespace AutoCli {

NamespaceNode::~NamespaceNode() = default;

boost::shared_ptr<NamespaceNode> NamespaceNode::GetThis() { return shared_from_this(); }
std::string NamespaceNode::GetType() const { return "namespace"; }
std::string NamespaceNode::GetName() const { return name_; }
void NamespaceNode::SetName(std::string const& name) { name_ = name; }
std::string NamespaceNode::GetDescription() const { return description_; }
void NamespaceNode::SetDescription(std::string const& description) { description_ = description; }

std::list<std::string> NamespaceNode::GetPath() const {
    std::list<std::string> path;
    boost::shared_ptr<NamespaceNode const> node = shared_from_this();
    for (boost::shared_ptr<NamespaceNode> parent = node->GetParent(); parent;
         node = parent, parent = parent->GetParent()) {
        path.push_front(node->GetName());
    }
    return path;
}

std::string NamespaceNode::GetPathString(char separator) const {
    std::string joined;
    for (std::string const& name : GetPath()) {
        if (!joined.empty()) joined += separator;
        joined += name;
    }
    return joined;
}

bool NamespaceNode::HasNamespaceNode(std::string const& name) const {
    return static_cast<bool>(GetNamespaceNode(name));
}

std::vector<std::string> NamespaceNode::GetNamespaceNodeNames() const {
    std::vector<std::string> names;
    for (auto const& child : children_) names.push_back(child->GetName());
    return names;
}

std::vector<boost::shared_ptr<NamespaceNode> > NamespaceNode::GetNamespaceNodes() const {
    return children_;
}

// Children are compared by the name they were registered under, read in
// place: asking each for a copy of it made the tree's building quadratic in
// copies.
boost::shared_ptr<NamespaceNode> NamespaceNode::GetNamespaceNode(std::string const& name) const {
    for (auto const& child : children_) {
        if (child->name_ == name) return child;
    }
    return boost::shared_ptr<NamespaceNode>();
}

void NamespaceNode::RegisterNamespaceNode(boost::shared_ptr<NamespaceNode> node, std::string const& name) {
    if (!node) return;
    node->SetName(name);
    node->SetParent(weak_from_this().lock());
    for (auto& child : children_) {
        if (child->name_ == name) {
            child = node;
            return;
        }
    }
    children_.push_back(node);
}

boost::shared_ptr<NamespaceNode> NamespaceNode::ResolveNode(std::list<std::string>& path) {
    if (path.empty()) return GetThis();
    boost::shared_ptr<NamespaceNode> child = GetNamespaceNode(path.front());
    if (!child) return GetThis();
    path.pop_front();
    return child->ResolveNode(path);
}

boost::shared_ptr<NamespaceNode> NamespaceNode::SubNamespace(std::string const& name) {
    boost::shared_ptr<NamespaceNode> child = GetNamespaceNode(name);
    if (!child) {
        child = Namespace::New();
        RegisterNamespaceNode(child, name);
    }
    return child;
}

boost::shared_ptr<CallSpec::CallTarget> NamespaceNode::GetDispatcher() {
    return boost::shared_ptr<CallSpec::CallTarget>();
}

void NamespaceNode::SetParent(boost::shared_ptr<NamespaceNode> parent) { parent_ = parent; }
boost::shared_ptr<NamespaceNode> NamespaceNode::GetParent() const { return parent_.lock(); }

// Namespace
boost::shared_ptr<Namespace> Namespace::New() { return boost::shared_ptr<Namespace>(new Namespace()); }
Namespace::~Namespace() = default;

}  // namespace AutoCli
}  // namespace Plinth
