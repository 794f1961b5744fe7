#include "framework/AutoCli.h"

#include <stdexcept>
#include <utility>

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

void NamespaceNode::SetValueCompleter(const std::string& parameterName, ValueCompleter completer) {
    if (parameterName.empty()) throw std::invalid_argument("SetValueCompleter: empty parameter name");
    if (!completer) throw std::invalid_argument("SetValueCompleter: no completer for '" + parameterName + "'");
    valueCompleters_[parameterName] = std::move(completer);
}

const NamespaceNode::ValueCompleter* NamespaceNode::FindValueCompleter(const std::string& parameterName) const {
    auto it = valueCompleters_.find(parameterName);
    return it == valueCompleters_.end() ? nullptr : &it->second;
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
