#pragma once

#include <list>
#include <string>
#include <vector>

#include <boost/enable_shared_from_this.hpp>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

namespace Plinth {
namespace CallSpec {
class CallTarget;
}

namespace AutoCli {

// One node of the command tree: a namespace that holds children, or a command
// (a leaf). Nodes are always held by boost::shared_ptr; a child knows its
// parent weakly, so the tree is owned from the root down.
class NamespaceNode : public boost::enable_shared_from_this<NamespaceNode> {
public:
    virtual ~NamespaceNode();

    virtual boost::shared_ptr<NamespaceNode> GetThis();
    // "namespace" or "command".
    virtual std::string GetType() const;
    virtual std::string GetName() const;
    virtual void SetName(std::string const& name);
    virtual std::string GetDescription() const;
    virtual void SetDescription(std::string const& description);
    // The names from the root's child down to this node; empty for the root.
    virtual std::list<std::string> GetPath() const;
    // GetPath joined by the separator, e.g. "network firewall get".
    virtual std::string GetPathString(char separator) const;
    virtual bool HasNamespaceNode(std::string const& name) const;
    // Children in registration order.
    virtual std::vector<std::string> GetNamespaceNodeNames() const;
    virtual std::vector<boost::shared_ptr<NamespaceNode> > GetNamespaceNodes() const;
    // Null when there is no child of this name.
    virtual boost::shared_ptr<NamespaceNode> GetNamespaceNode(std::string const& name) const;
    // Hangs node under this one as name: sets its name and parent. A second
    // registration under the same name replaces the first in its place.
    virtual void RegisterNamespaceNode(boost::shared_ptr<NamespaceNode> node, std::string const& name);
    // Walks down the tree along path, removing each name it follows from the
    // front of the list. Returns the deepest node reached (this node when the
    // first name is unknown); the names left in path are those not resolved.
    virtual boost::shared_ptr<NamespaceNode> ResolveNode(std::list<std::string>& path);
    // The child namespace of this name, created and registered if missing.
    virtual boost::shared_ptr<NamespaceNode> SubNamespace(std::string const& name);
    // What runs when this node is called: the command itself, null for a
    // namespace.
    virtual boost::shared_ptr<CallSpec::CallTarget> GetDispatcher();
    virtual void SetParent(boost::shared_ptr<NamespaceNode> parent);
    // Null for the root.
    virtual boost::shared_ptr<NamespaceNode> GetParent() const;

protected:
    NamespaceNode() = default;

private:
    std::string name_;
    std::string description_;
    boost::weak_ptr<NamespaceNode> parent_;
    std::vector<boost::shared_ptr<NamespaceNode> > children_;
};

}  // namespace AutoCli
}  // namespace Plinth
