// Shell completion, answered from the command tree itself: the shell scripts
// only pass the words typed so far to the program and show what it prints,
// so they never fall behind the tree.
#pragma once

#include <string>
#include <vector>

#include "framework/AutoCli.h"
#include "framework/Export.h"

namespace AutoCli {

// The candidates for the last of `words`, the words typed after the program
// name; the last is the word under the cursor, possibly empty. Candidates
// are whole words that start with it:
//   - in a namespace: its children, and the global options for a word that
//     starts with "-";
//   - in a command: its options, long and short, that are not given yet;
//   - for an option's value (after "--name", "-n", or inside "--name=" and
//     "-n=", which keep their prefix): the values of a string or integer
//     enum, true and false for a bool, the formatter names for --formatter,
//     else what the nearest value completer on the path offers.
// A path that leads nowhere gives no candidates. Never throws.
AUTOCLI_EXPORT std::vector<std::string> CompleteWords(const NamespaceNode& root, const std::vector<std::string>& words);

// The shells CompletionScript knows: "bash" and "zsh".
AUTOCLI_EXPORT std::vector<std::string> CompletionShells();

// A script that wires the shell's completion of `program` to
// `program <entry> WORDS...`, the hidden entry point that prints
// CompleteWords one a line. Throws std::invalid_argument for a shell not
// in CompletionShells.
AUTOCLI_EXPORT std::string CompletionScript(const std::string& shell, const std::string& program,
                                            const std::string& entry);

}  // namespace AutoCli
