#include "framework/AutoCli.h"

#include <stdexcept>

namespace AutoCli {

NamespaceNode::~NamespaceNode() = default;

void NamespaceNode::RegisterNamespaceNode(const boost::shared_ptr<NamespaceNode>& node, const std::string& name) {
    if (!node) throw std::invalid_argument("RegisterNamespaceNode: null node for '" + name + "'");
    if (name.empty()) throw std::invalid_argument("RegisterNamespaceNode: empty name");
    if (FindChild(name)) throw std::invalid_argument("RegisterNamespaceNode: '" + name + "' is attached already");
    children_.emplace_back(name, node);
}

boost::shared_ptr<NamespaceNode> NamespaceNode::FindChild(const std::string& name) const {
    for (const auto& child : children_) {
        if (child.first == name) return child.second;
    }
    return boost::shared_ptr<NamespaceNode>();
}

boost::shared_ptr<Namespace> Namespace::New() {
    return boost::shared_ptr<Namespace>(new Namespace());
}

Command::~Command() = default;

std::string Command::GetMetaDataField(const std::string& key) const {
    auto it = metaData_.find(key);
    return it == metaData_.end() ? std::string() : it->second;
}

}  // namespace AutoCli
