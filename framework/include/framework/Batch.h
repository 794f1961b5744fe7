// Batch mode: many command lines run in one process, read from a file or
// from standard input, one command a line.
#pragma once

#include <istream>
#include <ostream>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"
#include "framework/Export.h"
#include "framework/Runner.h"

namespace AutoCli {

// Splits one batch line into words the way a POSIX shell splits a simple
// command: blanks (spaces, tabs) separate words; 'single quotes' keep every
// character as it is; inside "double quotes" a backslash escapes only
// " \ $ and ` and is kept before any other character; outside quotes a
// backslash keeps the next character as it is. A '#' at the start of a word
// begins a comment that runs to the end of the line. Nothing is expanded:
// no variables, globs or tildes. A blank or comment-only line gives no
// words. Throws UsageError for an unterminated quote, a backslash that ends
// the line (lines do not continue) and a NUL character.
AUTOCLI_EXPORT std::vector<std::string> SplitBatchLine(const std::string& line);

// How `orvixcli --batch FILE [--force]` was asked for.
struct BatchInvocation {
    std::string file;  // "-" for standard input
    bool force = false;
};

// Recognises a batch invocation: the arguments hold --batch FILE (or
// --batch=FILE) among their leading options. Returns false for any other
// command line, which then runs as one command. Throws UsageError when
// --batch is given without a file, twice, or beside anything but --force;
// its message is ready to print (control characters escaped).
AUTOCLI_EXPORT bool ParseBatchInvocation(const std::vector<std::string>& args, BatchInvocation& invocation);

struct BatchOptions {
    // The name messages give the input: the file as named, or "<stdin>".
    std::string source;
    // Runs on past failing lines instead of stopping at the first one.
    bool force = false;
    // For every line; exitsAfterRun is ignored (always off), since each
    // line's result must be freed before the next one runs.
    RunOptions run;
};

// Runs every line of `lines` as Run() would run it alone: its output on
// `out`, its errors on `err`, both flushed after the line. Blank and comment
// lines are skipped; a line that cannot be split is a usage error of that
// line. A failing line (any non-zero status) is named on `err` as
// "PROGRAM: SOURCE:LINE: failed with exit status N", followed by "; the lines
// after it were not run" when the batch stops there, which it does unless
// `force`. Returns the highest status of the lines run (0 when none ran).
// When `out` goes bad (a full disk) the batch stops and kExitFailure is
// returned; the caller reports it. A read error of `lines` (an exception
// from its buffer) is reported and gives kExitFailure.
AUTOCLI_EXPORT int RunBatch(const boost::shared_ptr<NamespaceNode>& root, std::istream& lines, std::ostream& out,
                            std::ostream& err, const BatchOptions& options);

// Opens the invocation's file ("-": standard input) and runs it with
// RunBatch; a line arriving through a pipe runs as soon as it is complete. A file that
// cannot be opened, or a directory, is a usage error (kExitUsage).
AUTOCLI_EXPORT int RunBatchFile(const boost::shared_ptr<NamespaceNode>& root, const BatchInvocation& invocation,
                                std::ostream& out, std::ostream& err, const RunOptions& options);

}  // namespace AutoCli
