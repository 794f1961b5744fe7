// Transcript tests: a .t file is a session at the shell, run against a fresh
// host store, that must come out exactly the same again.
//
//   ## a comment line (in the header or between steps)
//   @profile fixtures/vswitch/x.json       the profile the host is created from
//                                          (relative to tests/e2e; default: the
//                                          embedded default host)
//   @env NAME=VALUE                        an extra environment variable
//   $ orvixcli network ip get              a command (shell-like quoting)
//      IPv6 Enabled: true                  its stdout, line by line
//   ! an error message                     a line of its stderr ("!" alone: empty line)
//   [1]                                    its exit status (omitted: 0)
//
// Commands run in a new temporary folder that holds the store (host.db),
// written $TMP in commands and in expected output; orvixcli and orvix-hostsim
// are the binaries of this build, other programs (sh, cat, ...) come from
// PATH. Trailing empty lines of a block are not significant; a comment ends
// a step's block. With ORVIX_UPDATE_TRANSCRIPTS=1 the files are rewritten
// with what the commands printed, every other line kept as written, for
// reviewing as a diff.
#pragma once

#include <string>
#include <vector>

#include "support/process.h"

namespace OrvixTest {

struct TranscriptStep {
    int line = 0;                      // of the "$" line, for messages
    std::vector<std::string> preface;  // comment and blank lines between the previous step and this one
    std::string command;
    std::vector<std::string> argv;
    std::vector<std::string> expectedOut;
    std::vector<std::string> expectedErr;
    int expectedStatus = 0;
};

struct Transcript {
    std::string path;
    std::string profile;  // absolute path, or "" for the default host
    std::vector<std::pair<std::string, std::string>> env;
    std::vector<std::string> header;  // every line before the first step
    std::vector<TranscriptStep> steps;
    std::vector<std::string> trailer;  // comment and blank lines after the last step
};

// Throw std::runtime_error on a malformed transcript.
Transcript ParseTranscript(const std::string& path, const std::string& baseDir);
Transcript ParseTranscriptText(const std::string& text, const std::string& path, const std::string& baseDir);

// The transcript's text with each step's expected block replaced by what
// the step printed (one result a step), every other line as written. Throws
// std::runtime_error for output a transcript cannot hold (a stdout line that
// would read back as a command, a comment, stderr or a status).
std::string RenderTranscript(const Transcript& t, const std::vector<ProcessResult>& results);

std::vector<std::string> SplitCommandLine(const std::string& text);
// Lines without their "\n"; trailing empty lines dropped.
std::vector<std::string> SplitLines(const std::string& text);

}  // namespace OrvixTest
