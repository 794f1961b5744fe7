// Running the project's programs as separate processes, for the reliability
// tests: many writers at once, writers killed half-way, refused files.
#pragma once

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <stdexcept>
#include <string>
#include <vector>

#include "support/store_test_util.h"

extern char** environ;

namespace Reliability {

inline std::string Bin(const std::string& program) {
    return std::string(ORVIX_BIN_DIR) + "/" + program;
}

// A started program whose standard output and error go to files.
class Process {
public:
    Process(const std::string& program, const std::vector<std::string>& args, const std::string& outFile,
            const std::string& errFile)
        : out_(outFile), err_(errFile) {
        std::vector<std::string> all = {program};
        all.insert(all.end(), args.begin(), args.end());
        std::vector<char*> argv;
        for (auto& arg : all) argv.push_back(arg.data());
        argv.push_back(nullptr);
        posix_spawn_file_actions_t actions;
        posix_spawn_file_actions_init(&actions);
        posix_spawn_file_actions_addopen(&actions, 1, out_.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
        posix_spawn_file_actions_addopen(&actions, 2, err_.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
        const int rc = posix_spawn(&pid_, program.c_str(), &actions, nullptr, argv.data(), environ);
        posix_spawn_file_actions_destroy(&actions);
        if (rc != 0) throw std::runtime_error("cannot start " + program);
    }
    // A process the test did not wait for is not left running.
    ~Process() {
        if (pid_ > 0) {
            kill(pid_, SIGKILL);
            Wait();
        }
    }
    Process(const Process&) = delete;
    Process& operator=(const Process&) = delete;

    void Kill() { kill(pid_, SIGKILL); }
    // The raw wait status.
    int Wait() {
        int status = 0;
        while (waitpid(pid_, &status, 0) < 0 && errno == EINTR) {
        }
        pid_ = -1;
        return status;
    }
    std::string Out() const { return StoreTest::ReadFile(out_); }
    std::string Err() const { return StoreTest::ReadFile(err_); }

private:
    std::string out_;
    std::string err_;
    pid_t pid_ = -1;
};

}  // namespace Reliability
