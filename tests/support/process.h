// Running the programs of this build as separate processes: to completion
// with their output captured, or in the background with their output in
// files (for tests that start many at once or kill them half-way).
#pragma once

#include <sys/types.h>
#include <sys/wait.h>

#include <string>
#include <vector>

namespace OrvixTest {

// A program this build made: orvixcli, orvix-hostsim, store-stress.
std::string Bin(const std::string& program);

// The sanitizer settings of this test run ("ASAN_OPTIONS=..."), for the
// environment of the programs it starts.
std::vector<std::string> SanitizerEnvironment();

struct ProcessResult {
    std::string out;
    std::string err;
    int status = -1;  // exit status, or 128 + signal
};

// Runs argv[0] (found in PATH unless it contains a slash) in `cwd` with
// `env` as its whole environment, feeding it no input, and waits for it.
// Throws std::runtime_error when the program cannot be started.
ProcessResult RunProcess(const std::vector<std::string>& argv, const std::string& cwd,
                         const std::vector<std::string>& env);

// The names of the dynamic symbols a shared library defines (nm -D),
// demangled on request.
// Throws std::runtime_error when nm fails.
std::vector<std::string> ExportedSymbols(const std::string& library, bool demangled = false);

// A program started in the background with this process's environment; its
// standard output and error go to files.
class Process {
public:
    Process(const std::string& program, const std::vector<std::string>& args, const std::string& outFile,
            const std::string& errFile);
    // A process the test did not wait for is not left running.
    ~Process();
    Process(const Process&) = delete;
    Process& operator=(const Process&) = delete;

    void Kill();
    // The raw wait status (WIFEXITED and friends apply).
    int Wait();
    std::string Out() const;
    std::string Err() const;

private:
    std::string out_;
    std::string err_;
    pid_t pid_ = -1;
};

}  // namespace OrvixTest
