// Manual pages generated from the command tree: one page for the program and
// one per area of the tree (a namespace two levels down, such as
// "network vswitch", with every command below it), so the pages say what the
// tree really has.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "framework/AutoCli.h"
#include "framework/Export.h"
#include "framework/Runner.h"

namespace AutoCli {

// What only the program knows about itself: the framework supplies the rest
// (commands, options, formatters, exit statuses) from the tree and itself.
struct ManualInfo {
    std::string program;
    std::string version;
    std::string date;  // in every page's footer, e.g. "2024-05-01"
    std::string section = "8";
    std::string summary;                                // the program page's NAME line
    std::vector<std::string> description;               // the program page's paragraphs
    std::vector<GlobalOption> programOptions;           // options the program handles before the tree
    std::vector<std::string> extraSynopses;             // e.g. "--completion bash|zsh"
    using Entry = std::pair<std::string, std::string>;  // a term and what it means
    std::vector<Entry> environment;
    std::vector<Entry> files;
};

struct ManPage {
    std::string name;  // "orvixcli-network-vswitch"; the file is name + "." + section
    std::string text;  // roff source for the man macros
};

// The program's page first, then one page per area in the tree's order.
// Commands attached to the root or directly to a first-level namespace are
// documented in the program's page and that namespace's page respectively.
AUTOCLI_EXPORT std::vector<ManPage> RenderManPages(const NamespaceNode& root, const ManualInfo& info);

// Text made safe for a roff text line: backslashes and hyphens escaped, a
// line starting with a control character ("." or "'") or a blank protected.
// Several lines stay several lines.
AUTOCLI_EXPORT std::string RoffText(const std::string& text);

}  // namespace AutoCli
