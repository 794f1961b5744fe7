// The command tree: namespaces and commands, held by boost::shared_ptr.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include <boost/enable_shared_from_this.hpp>
#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "framework/Export.h"

namespace AutoCli {

class Command;

// A node of the command tree. A node has no name of its own: its parent
// gives it one when it attaches it. Children keep their order of attachment.
class AUTOCLI_EXPORT NamespaceNode : public boost::enable_shared_from_this<NamespaceNode> {
public:
    using Child = std::pair<std::string, boost::shared_ptr<NamespaceNode>>;

    virtual ~NamespaceNode();

    void SetDescription(const std::string& description) { description_ = description; }
    const std::string& GetDescription() const { return description_; }

    // Attaches a child under a name. Throws std::invalid_argument for a null
    // node, an empty name or a name already taken under this node.
    void RegisterNamespaceNode(const boost::shared_ptr<NamespaceNode>& node, const std::string& name);

    const std::vector<Child>& GetChildren() const { return children_; }
    boost::shared_ptr<NamespaceNode> FindChild(const std::string& name) const;

    // Non-null when this node is a command.
    virtual Command* AsCommand() { return nullptr; }

    // Candidate values of a parameter, offered by shell completion. It may
    // read anything it likes (the host, a file); completion shows nothing of
    // a completer that throws.
    using ValueCompleter = std::function<std::vector<std::string>()>;

    // Offers candidates for the parameter of that long name in every command
    // at or below this node, unless a node nearer the command offers its own
    // for the same name. This lets a plug-in say once, per part of its tree,
    // what a name such as "nic-name" refers to.
    void SetValueCompleter(const std::string& parameterName, ValueCompleter completer);
    // The completer this node itself offers for the name; null when none.
    const ValueCompleter* FindValueCompleter(const std::string& parameterName) const;

protected:
    NamespaceNode() = default;

private:
    std::string description_;
    std::vector<Child> children_;
    std::map<std::string, ValueCompleter> valueCompleters_;
};

class AUTOCLI_EXPORT Namespace : public virtual NamespaceNode {
public:
    static boost::shared_ptr<Namespace> New();

protected:
    Namespace() = default;
};

// Base of every command. A command describes itself in its constructor
// (description, metadata, default formatter and formatter hints) and
// implements the CallTarget hooks.
class AUTOCLI_EXPORT Command : public CallSpec::CallTarget, public virtual NamespaceNode {
public:
    ~Command() override;

    Command* AsCommand() override { return this; }

    void SetMetaDataField(const std::string& key, const std::string& value) { metaData_[key] = value; }
    void SetDefaultOutputFormatter(const std::string& name) { defaultFormatter_ = name; }
    void SetDefaultOutputParameter(const std::string& key, const std::string& value) { outputParameters_[key] = value; }

    // "" when the key was never set.
    std::string GetMetaDataField(const std::string& key) const;
    const std::map<std::string, std::string>& GetMetaData() const { return metaData_; }
    const std::string& GetDefaultOutputFormatter() const { return defaultFormatter_; }
    const std::map<std::string, std::string>& GetDefaultOutputParameters() const { return outputParameters_; }

protected:
    Command() = default;

private:
    std::map<std::string, std::string> metaData_;
    std::string defaultFormatter_;
    std::map<std::string, std::string> outputParameters_;
};

}  // namespace AutoCli
