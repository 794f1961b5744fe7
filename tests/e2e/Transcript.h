// Transcript tests: a .t file is a session at the shell, run against a fresh
// host store, that must come out exactly the same again.
//
//   ## a comment line (anywhere)
//   @profile fixtures/two-switches.json    the profile the host is created from
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
// are the binaries of this build, other programs (sh, head, ...) come from
// PATH. Trailing empty lines of a block are not
// significant. With ORVIX_UPDATE_TRANSCRIPTS=1 the files are rewritten with
// what the commands printed, for reviewing as a diff.
#pragma once

#include <string>
#include <vector>

namespace OrvixTest {

struct TranscriptStep {
    int line = 0;  // of the "$" line, for messages
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
    std::vector<std::string> header;  // the lines before the first step, kept when rewriting
    std::vector<TranscriptStep> steps;
};

// Throws std::runtime_error on a malformed file.
Transcript ParseTranscript(const std::string& path, const std::string& baseDir);
std::vector<std::string> SplitCommandLine(const std::string& text);

struct ProcessResult {
    std::string out;
    std::string err;
    int status = -1;  // exit status, or 128 + signal
};

// Runs argv[0] (found in PATH unless it contains a slash) in `cwd` with
// `env` as its whole environment; feeds it no input.
ProcessResult RunProcess(const std::vector<std::string>& argv, const std::string& cwd,
                         const std::vector<std::string>& env);

std::vector<std::string> SplitLines(const std::string& text);

// The sanitizer settings of this test run ("ASAN_OPTIONS=..."), for the
// environment of the programs it starts.
std::vector<std::string> SanitizerEnvironment();

}  // namespace OrvixTest
