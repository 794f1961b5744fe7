// Help at every level of the tree, generated from the tree itself: the
// children a namespace really has, the parameters a command really declares.
#include <algorithm>

#include "framework/Format.h"
#include "framework/Runner.h"

namespace AutoCli {

namespace {

// Whether a node is a command or has one somewhere below it. A namespace
// without any would only lead to another empty listing.
bool LeadsToCommand(NamespaceNode& node) {
    if (node.AsCommand()) return true;
    for (const auto& child : node.GetChildren()) {
        if (LeadsToCommand(*child.second)) return true;
    }
    return false;
}

void RenderChildren(const NamespaceNode& node, bool commands, const char* title, std::ostream& out) {
    auto listed = [&](const NamespaceNode::Child& child) {
        return (child.second->AsCommand() != nullptr) == commands && LeadsToCommand(*child.second);
    };
    std::size_t width = 0;
    for (const auto& child : node.GetChildren()) {
        if (listed(child)) width = std::max(width, child.first.size());
    }
    if (width == 0) return;
    out << "\n" << title << ":\n";
    for (const auto& child : node.GetChildren()) {
        if (!listed(child)) continue;
        out << "  " << child.first << std::string(width - child.first.size() + 2, ' ') << child.second->GetDescription()
            << "\n";
    }
}

std::string OptionSynopsis(const CallSpec::ParameterSpec& p) {
    std::string synopsis = "  ";
    if (!p.GetShortName().empty()) synopsis += "-" + p.GetShortName() + "|";
    synopsis += "--" + p.GetName();
    switch (p.GetType()) {
        case CallSpec::PARAM_STRING:
            synopsis += "=<str>";
            break;
        case CallSpec::PARAM_INT:
            synopsis += "=<long>";
            break;
        case CallSpec::PARAM_BOOL:
            synopsis += "=<bool>";
            break;
        case CallSpec::PARAM_FLAG:
            break;
    }
    return synopsis + (p.IsRequired() ? "  (required)" : "");
}

std::string ReplaceAll(std::string text, const std::string& token, const std::string& value) {
    for (std::size_t at = text.find(token); at != std::string::npos; at = text.find(token, at + value.size())) {
        text.replace(at, token.size(), value);
    }
    return text;
}

}  // namespace

const std::vector<GlobalOption>& GlobalOptions() {
    static const std::vector<GlobalOption> kOptions = {
        {"formatter", "", true, "Override the output formatter: " + JoinNames(FormatterNames()) + "."},
        {"help", "h", false, "Show the help of the namespace or command."},
        {"version", "", false, "Print the version of the CLI and exit."},
        {"batch", "", true, "Run the command lines of a file, one a line (- reads standard input).", "file", true},
        {"force", "", false, "With --batch: run on past failing lines.", "str", true},
    };
    return kOptions;
}

std::string GlobalOptionSynopsis(const GlobalOption& option) {
    return (option.shortName.empty() ? "" : "-" + option.shortName + "|") + "--" + option.longName +
           (option.takesValue ? "=<" + option.valueName + ">" : "");
}

std::string ExpandDescription(const CallSpec::ParameterSpec& parameter, const std::string& indent) {
    std::string text = parameter.GetDescription();
    const auto& c = parameter.GetConstraint();
    if (!c) return text;
    std::vector<std::string> values;
    std::string full;
    if (c->GetType() == CallSpec::CONSTRAINT_STRING_ENUM) {
        for (const auto& e : c->GetStringEnum()) {
            values.push_back(e.value);
            full += "\n" + indent + (e.description.empty() ? e.value : e.value + ": " + e.description);
        }
    } else if (c->GetType() == CallSpec::CONSTRAINT_INT_ENUM) {
        for (std::int64_t v : c->GetIntEnum()) {
            values.push_back(std::to_string(v));
            full += "\n" + indent + std::to_string(v);
        }
    }
    text = ReplaceAll(text, "%FULLENUM%", full);
    return ReplaceAll(text, "%ENUM%", JoinNames(values));
}

void RenderNamespaceHelp(const NamespaceNode& node, const std::string& program, const std::string& path,
                         std::ostream& out) {
    out << "Usage: " << program << (path.empty() ? " [options]" : " " + path) << " {namespace|cmd} [cmd options]\n";
    if (!node.GetDescription().empty()) out << "\n" << node.GetDescription() << "\n";
    if (path.empty()) {
        out << "\nOptions:\n";
        for (const auto& option : GlobalOptions()) {
            const std::string synopsis = GlobalOptionSynopsis(option);
            out << "  " << synopsis << std::string(20 - synopsis.size(), ' ') << option.description << "\n";
        }
    }
    RenderChildren(node, false, "Available Namespaces", out);
    RenderChildren(node, true, "Available Commands", out);
    out << "\nFor help on a namespace or command: " << program << (path.empty() ? "" : " " + path)
        << " <name> --help\n";
}

void RenderCommandHelp(Command& command, const std::string& program, const std::string& path, std::ostream& out) {
    boost::shared_ptr<CallSpec::InputSpec> declared = command.GetInputSpec();
    out << "Usage: " << program << " " << path << (declared->GetParameters().empty() ? "" : " [cmd options]") << "\n";
    out << "\nDescription:\n  " << command.GetDescription() << "\n";
    if (declared->GetParameters().empty()) return;
    out << "\nCmd options:\n";
    for (const auto& p : declared->GetParameters()) {
        out << OptionSynopsis(*p) << "\n";
        out << "      " << ExpandDescription(*p, "        ") << "\n";
    }
}

}  // namespace AutoCli
