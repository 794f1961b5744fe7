// Fuzzes the command line handling with the whole network command tree
// registered in-process. The input is split into argument words at newlines
// and NUL bytes (a real argv word never holds a NUL). Each line goes through
// the framework's resolution and help rendering, and the words after a
// command path through that command's argument parser. No command is ever
// executed: the host is never touched.
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <string>
#include <vector>

#include "framework/AutoCli.h"
#include "framework/Runner.h"

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<AutoCli::Namespace> parent);

namespace {

// Run() treats a trailing --help as a request for help unless the command
// reached declares an option of that name; then the line would execute. The
// tree is checked once so that this can never happen unnoticed.
void RequireNoOwnHelpOption(const AutoCli::NamespaceNode& node, const std::string& path) {
    for (const auto& child : node.GetChildren()) {
        const std::string childPath = path + " " + child.first;
        if (AutoCli::Command* command = child.second->AsCommand()) {
            const auto inputSpec = command->GetInputSpec();
            if (inputSpec && (inputSpec->FindByName("help") || inputSpec->FindByShortName("h"))) {
                std::fprintf(stderr, "'%s' declares its own --help; the fuzzer would execute it\n", childPath.c_str());
                std::abort();
            }
        }
        RequireNoOwnHelpOption(*child.second, childPath);
    }
}

const boost::shared_ptr<AutoCli::Namespace>& Tree() {
    static const boost::shared_ptr<AutoCli::Namespace> root = [] {
        boost::shared_ptr<AutoCli::Namespace> node = AutoCli::Namespace::New();
        AutoCli_RegisterNamespaces(node);
        RequireNoOwnHelpOption(*node, "");
        return node;
    }();
    return root;
}

std::vector<std::string> SplitWords(const std::uint8_t* data, std::size_t size) {
    std::vector<std::string> words(1);
    for (std::size_t i = 0; i < size; ++i) {
        const char c = static_cast<char>(data[i]);
        if (c == '\n' || c == '\0') {
            words.emplace_back();
        } else {
            words.back().push_back(c);
        }
    }
    if (words.back().empty()) words.pop_back();
    return words;
}

// Parses the words after the longest command path they start with, the way
// a run hands them to the command, so that every command's parameters meet
// arbitrary values (Run() itself would stop at --help before parsing them).
void ParseCommandArguments(const std::vector<std::string>& words) {
    boost::shared_ptr<AutoCli::NamespaceNode> node = Tree();
    std::size_t i = 0;
    while (i < words.size() && !node->AsCommand()) {
        boost::shared_ptr<AutoCli::NamespaceNode> child = node->FindChild(words[i]);
        if (!child) return;
        node = child;
        ++i;
    }
    AutoCli::Command* command = node->AsCommand();
    if (!command || !command->GetInputSpec()) return;
    try {
        AutoCli::ParseArguments(*command->GetInputSpec(),
                                std::vector<std::string>(words.begin() + static_cast<std::ptrdiff_t>(i), words.end()));
    } catch (const AutoCli::UsageError&) {
        // A refused command line is an expected outcome.
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::vector<std::string> words = SplitWords(data, size);
    ParseCommandArguments(words);

    words.push_back("--help");
    std::ostringstream out;
    std::ostringstream err;
    const int status = AutoCli::Run(Tree(), words, out, err);
    // Only resolution and help run here; anything else is a fault of Run().
    if (status != AutoCli::kExitOk && status != AutoCli::kExitUsage) {
        std::fprintf(stderr, "unexpected exit status %d: %s\n", status, err.str().c_str());
        std::abort();
    }
    return 0;
}
