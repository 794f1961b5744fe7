// The command lines of orvixcli that are not commands of the tree: shell
// completion and the manual pages, both answered from the tree itself.
//
//   orvixcli --completion bash|zsh      prints the completion script
//   orvixcli __complete WORDS...        candidates for the last word, one a line
//   orvixcli __manpages DIR [DATE]      writes the manual pages into DIR
//
// The two hidden ones are called by the scripts and the build; help does not
// show them.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace OrvixCli {

// Runs `args` (the words after the program name) when they are one of the
// lines above and returns the exit status; nullopt, having done nothing,
// otherwise.
std::optional<int> RunSupportEntry(const std::vector<std::string>& args);

}  // namespace OrvixCli
