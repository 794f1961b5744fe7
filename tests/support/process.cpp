#include "support/process.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <sstream>
#include <stdexcept>

#include "support/test_util.h"

extern char** environ;

namespace OrvixTest {

namespace {

// Owns a set of spawn file actions for one start.
class FileActions {
public:
    FileActions() { posix_spawn_file_actions_init(&actions_); }
    ~FileActions() { posix_spawn_file_actions_destroy(&actions_); }
    FileActions(const FileActions&) = delete;
    FileActions& operator=(const FileActions&) = delete;
    posix_spawn_file_actions_t* Get() { return &actions_; }

private:
    posix_spawn_file_actions_t actions_;
};

std::vector<char*> Pointers(const std::vector<std::string>& words) {
    std::vector<char*> pointers;
    for (const auto& word : words) pointers.push_back(const_cast<char*>(word.c_str()));
    pointers.push_back(nullptr);
    return pointers;
}

pid_t Spawn(const std::vector<std::string>& argv, FileActions& actions, char* const* envp) {
    if (argv.empty()) throw std::invalid_argument("no program to start");
    pid_t pid = -1;
    const int rc = posix_spawnp(&pid, argv[0].c_str(), actions.Get(), nullptr, Pointers(argv).data(), envp);
    if (rc != 0) throw std::runtime_error("cannot start " + argv[0] + ": " + std::strerror(rc));
    return pid;
}

int WaitFor(pid_t pid) {
    int status = 0;
    while (waitpid(pid, &status, 0) < 0 && errno == EINTR) {
    }
    return status;
}

// Reads both pipes to their end at once, so a child that fills one of them
// never blocks while the other is being read.
void Drain(int outFd, int errFd, ProcessResult& result) {
    pollfd fds[2] = {{outFd, POLLIN, 0}, {errFd, POLLIN, 0}};
    std::string* sinks[2] = {&result.out, &result.err};
    int open = 2;
    char buffer[65536];
    while (open > 0) {
        if (poll(fds, 2, -1) < 0) {
            if (errno == EINTR) continue;
            throw std::runtime_error("poll failed");
        }
        for (int i = 0; i < 2; ++i) {
            if (fds[i].fd < 0 || !(fds[i].revents & (POLLIN | POLLHUP | POLLERR))) continue;
            const ssize_t n = read(fds[i].fd, buffer, sizeof buffer);
            if (n > 0) {
                sinks[i]->append(buffer, static_cast<std::size_t>(n));
            } else if (n == 0 || errno != EINTR) {
                close(fds[i].fd);
                fds[i].fd = -1;
                --open;
            }
        }
    }
}

}  // namespace

std::string Bin(const std::string& program) {
    return std::string(ORVIX_BIN_DIR) + "/" + program;
}

std::vector<std::string> SanitizerEnvironment() {
    std::vector<std::string> env;
    for (const char* name : {"ASAN_OPTIONS", "UBSAN_OPTIONS", "LSAN_OPTIONS"}) {
        if (const char* value = std::getenv(name)) env.push_back(std::string(name) + "=" + value);
    }
    return env;
}

ProcessResult RunProcess(const std::vector<std::string>& argv, const std::string& cwd,
                         const std::vector<std::string>& env) {
    int outPipe[2], errPipe[2];
    if (pipe2(outPipe, O_CLOEXEC) != 0) throw std::runtime_error("pipe failed");
    if (pipe2(errPipe, O_CLOEXEC) != 0) {
        close(outPipe[0]);
        close(outPipe[1]);
        throw std::runtime_error("pipe failed");
    }
    FileActions actions;
    posix_spawn_file_actions_addopen(actions.Get(), 0, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_adddup2(actions.Get(), outPipe[1], 1);
    posix_spawn_file_actions_adddup2(actions.Get(), errPipe[1], 2);
    posix_spawn_file_actions_addchdir_np(actions.Get(), cwd.c_str());
    pid_t pid = -1;
    try {
        pid = Spawn(argv, actions, Pointers(env).data());
    } catch (...) {
        for (int fd : {outPipe[0], outPipe[1], errPipe[0], errPipe[1]}) close(fd);
        throw;
    }
    close(outPipe[1]);
    close(errPipe[1]);
    ProcessResult result;
    Drain(outPipe[0], errPipe[0], result);
    const int status = WaitFor(pid);
    result.status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
    return result;
}

std::vector<std::string> ExportedSymbols(const std::string& library, bool demangled) {
    std::vector<std::string> argv = {"nm", "-D", "--defined-only", library};
    if (demangled) argv.insert(argv.begin() + 1, "-C");
    const ProcessResult nm = RunProcess(argv, ".", {"PATH=/usr/bin:/bin"});
    if (nm.status != 0) throw std::runtime_error("nm " + library + " failed: " + nm.err);
    std::vector<std::string> symbols;
    std::istringstream lines(nm.out);
    for (std::string line; std::getline(lines, line);) {
        // "<address> <kind> <name>"; a demangled C++ name may itself hold blanks.
        const auto kind = line.find(' ');
        const auto name = kind == std::string::npos ? kind : line.find(' ', kind + 1);
        if (name != std::string::npos) symbols.push_back(line.substr(name + 1));
    }
    return symbols;
}

Process::Process(const std::string& program, const std::vector<std::string>& args, const std::string& outFile,
                 const std::string& errFile)
    : out_(outFile), err_(errFile) {
    std::vector<std::string> argv = {program};
    argv.insert(argv.end(), args.begin(), args.end());
    FileActions actions;
    posix_spawn_file_actions_addopen(actions.Get(), 1, out_.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
    posix_spawn_file_actions_addopen(actions.Get(), 2, err_.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
    pid_ = Spawn(argv, actions, environ);
}

Process::~Process() {
    if (pid_ > 0) {
        Kill();
        Wait();
    }
}

void Process::Kill() {
    if (pid_ > 0) kill(pid_, SIGKILL);
}

int Process::Wait() {
    if (pid_ <= 0) throw std::logic_error("the process was waited for already");
    const int status = WaitFor(pid_);
    pid_ = -1;
    return status;
}

std::string Process::Out() const {
    return ReadFile(out_);
}

std::string Process::Err() const {
    return ReadFile(err_);
}

}  // namespace OrvixTest
