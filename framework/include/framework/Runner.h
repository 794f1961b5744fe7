// Running one command line against a command tree: resolve the path, parse
// and check the arguments, execute, render, and choose the exit status.
#pragma once

#include <cstdint>
#include <ostream>
#include <stdexcept>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"
#include "framework/Export.h"

namespace AutoCli {

// Exit statuses, the one table every run maps its outcome to.
enum ExitStatus {
    kExitOk = 0,            // success
    kExitCommandError = 1,  // the command reported an error (its messages on stderr)
    kExitUsage = 2,         // the command line was wrong (unknown command/option, bad value, ...)
    kExitFailure = 3,       // the host or the tool itself failed (e.g. the host store cannot be opened)
};

// A command line the framework refuses before the command runs.
class AUTOCLI_EXPORT UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Parses a command's arguments (everything after the command path) against
// its declared parameters: --long=value, --long value, -s value, -s=value;
// flags take no value; bools take true/false, 1/0, yes/no in any case; ints
// are signed 64-bit decimal. Checks unknown, repeated and missing required
// options, types and constraints. Throws UsageError with a one-line message.
AUTOCLI_EXPORT boost::shared_ptr<CallSpec::Input> ParseArguments(const CallSpec::InputSpec& declared,
                                                                 const std::vector<std::string>& args);

// Parses a bool word; false when the word is not one.
AUTOCLI_EXPORT bool ParseBoolWord(const std::string& text, bool& value);
// Parses a signed 64-bit decimal; false on anything else (blanks, overflow).
AUTOCLI_EXPORT bool ParseInt64(const std::string& text, std::int64_t& value);

// The closest of the candidates to a mistyped word, or "" when none is close.
AUTOCLI_EXPORT std::string SuggestClosest(const std::string& word, const std::vector<std::string>& candidates);
// The option a mistyped one most likely meant, written with its dashes, or
// "" when none is close: for "--name" (or "--name=value") the closest of the
// long names, for "-x" a short name that differs only in case ("-P" for
// "-p"), for "-name" the closest long name.
AUTOCLI_EXPORT std::string SuggestOption(const std::string& option, const std::vector<std::string>& names,
                                         const std::vector<std::string>& letters);

// An option the CLI understands wherever it appears (--version only in a
// namespace): help, completion and the manual pages all list these.
struct GlobalOption {
    std::string longName;
    std::string shortName;  // "" when it has none
    bool takesValue;
    std::string description;
    // What its value is, as help shows it ("--formatter=<str>").
    std::string valueName = "str";
    // Taken only before the first namespace word (--batch, --force).
    bool leadingOnly = false;
};
AUTOCLI_EXPORT const std::vector<GlobalOption>& GlobalOptions();
// "-h|--help", "--formatter=<str>": the option as help shows it.
AUTOCLI_EXPORT std::string GlobalOptionSynopsis(const GlobalOption& option);

// Help texts. `path` is the command path as typed ("network ip set").
AUTOCLI_EXPORT void RenderNamespaceHelp(const NamespaceNode& node, const std::string& program, const std::string& path,
                                        std::ostream& out);
AUTOCLI_EXPORT void RenderCommandHelp(Command& command, const std::string& program, const std::string& path,
                                      std::ostream& out);
// A parameter description with %ENUM% and %FULLENUM% expanded from its
// constraint: %ENUM% by the values joined with ", ", %FULLENUM% by one line
// per value ("value: description", or the value alone without description).
AUTOCLI_EXPORT std::string ExpandDescription(const CallSpec::ParameterSpec& parameter, const std::string& indent);

struct RunOptions {
    std::string program = "orvixcli";
    std::string version;
    // The process ends right after this run. The command's result is then
    // left standing instead of being taken apart object by object: a listing
    // of ten thousand records would spend a tenth of its time on that, and
    // the memory goes back to the system with the process anyway. A caller
    // that runs several command lines in one process leaves this off.
    bool exitsAfterRun = false;
};

// Runs one command line. Never throws: whatever a command lets escape is
// reported on `err` and gives kExitFailure.
AUTOCLI_EXPORT int Run(const boost::shared_ptr<NamespaceNode>& root, const std::vector<std::string>& args,
                       std::ostream& out, std::ostream& err, const RunOptions& options = RunOptions());

}  // namespace AutoCli
