#include "Transcript.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <regex>
#include <stdexcept>

namespace OrvixTest {

std::vector<std::string> SanitizerEnvironment() {
    std::vector<std::string> env;
    for (const char* name : {"ASAN_OPTIONS", "UBSAN_OPTIONS", "LSAN_OPTIONS"}) {
        if (const char* value = std::getenv(name)) env.push_back(std::string(name) + "=" + value);
    }
    return env;
}

std::vector<std::string> SplitLines(const std::string& text) {
    std::vector<std::string> lines;
    std::size_t start = 0;
    while (start < text.size()) {
        std::size_t end = text.find('\n', start);
        if (end == std::string::npos) end = text.size();
        lines.push_back(text.substr(start, end - start));
        start = end + 1;
    }
    while (!lines.empty() && lines.back().empty()) lines.pop_back();
    return lines;
}

std::vector<std::string> SplitCommandLine(const std::string& text) {
    std::vector<std::string> words;
    std::string word;
    bool inWord = false;
    char quote = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        char c = text[i];
        if (quote) {
            if (c == quote) {
                quote = 0;
            } else if (c == '\\' && quote == '"' && i + 1 < text.size()) {
                word += text[++i];
            } else {
                word += c;
            }
        } else if (c == '\'' || c == '"') {
            quote = c;
            inWord = true;
        } else if (c == '\\' && i + 1 < text.size()) {
            word += text[++i];
            inWord = true;
        } else if (c == ' ' || c == '\t') {
            if (inWord) words.push_back(word);
            word.clear();
            inWord = false;
        } else {
            word += c;
            inWord = true;
        }
    }
    if (quote) throw std::runtime_error("unterminated quote in: " + text);
    if (inWord) words.push_back(word);
    return words;
}

Transcript ParseTranscript(const std::string& path, const std::string& baseDir) {
    std::ifstream in(path);
    if (!in) throw std::runtime_error("cannot read " + path);
    Transcript t;
    t.path = path;
    static const std::regex status(R"(^\[(\d+)\]$)");
    std::string line;
    int number = 0;
    auto fail = [&](const std::string& what) {
        throw std::runtime_error(path + ":" + std::to_string(number) + ": " + what);
    };
    // Empty lines are kept while reading a block and trimmed at its end.
    auto trim = [](std::vector<std::string>& lines) {
        while (!lines.empty() && lines.back().empty()) lines.pop_back();
    };
    bool statusSeen = false;
    while (std::getline(in, line)) {
        ++number;
        if (line.compare(0, 2, "##") == 0) {
            if (t.steps.empty()) t.header.push_back(line);
            continue;
        }
        if (line.compare(0, 2, "$ ") == 0) {
            if (!t.steps.empty()) trim(t.steps.back().expectedOut);
            TranscriptStep step;
            step.line = number;
            step.command = line.substr(2);
            step.argv = SplitCommandLine(step.command);
            if (step.argv.empty()) fail("empty command");
            t.steps.push_back(step);
            statusSeen = false;
            continue;
        }
        if (t.steps.empty()) {
            if (line.compare(0, 9, "@profile ") == 0) {
                t.profile = baseDir + "/" + line.substr(9);
            } else if (line.compare(0, 5, "@env ") == 0) {
                std::string assignment = line.substr(5);
                std::size_t eq = assignment.find('=');
                if (eq == std::string::npos) fail("@env needs NAME=VALUE");
                t.env.emplace_back(assignment.substr(0, eq), assignment.substr(eq + 1));
            } else if (!line.empty()) {
                fail("expected a command (\"$ ...\"), a directive or a comment");
            }
            t.header.push_back(line);
            continue;
        }
        TranscriptStep& step = t.steps.back();
        std::smatch m;
        if (std::regex_match(line, m, status)) {
            step.expectedStatus = std::stoi(m[1]);
            statusSeen = true;
        } else if (statusSeen && !line.empty()) {
            fail("output after the exit status");
        } else if (line == "!" || line.compare(0, 2, "! ") == 0) {
            step.expectedErr.push_back(line.size() > 2 ? line.substr(2) : "");
        } else if (!statusSeen) {
            step.expectedOut.push_back(line);
        }
    }
    if (!t.steps.empty()) trim(t.steps.back().expectedOut);
    return t;
}

namespace {

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
            ssize_t n = read(fds[i].fd, buffer, sizeof buffer);
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

ProcessResult RunProcess(const std::vector<std::string>& argv, const std::string& cwd,
                         const std::vector<std::string>& env) {
    int outPipe[2], errPipe[2];
    if (pipe2(outPipe, O_CLOEXEC) != 0 || pipe2(errPipe, O_CLOEXEC) != 0) throw std::runtime_error("pipe failed");

    std::vector<char*> args, envp;
    for (const auto& a : argv) args.push_back(const_cast<char*>(a.c_str()));
    args.push_back(nullptr);
    for (const auto& e : env) envp.push_back(const_cast<char*>(e.c_str()));
    envp.push_back(nullptr);

    pid_t pid = fork();
    if (pid < 0) throw std::runtime_error("fork failed");
    if (pid == 0) {
        int devnull = open("/dev/null", O_RDONLY);
        dup2(devnull, 0);
        dup2(outPipe[1], 1);
        dup2(errPipe[1], 2);
        if (chdir(cwd.c_str()) != 0) _exit(126);
        execvpe(args[0], args.data(), envp.data());
        _exit(127);
    }
    close(outPipe[1]);
    close(errPipe[1]);
    ProcessResult result;
    Drain(outPipe[0], errPipe[0], result);
    int wstatus = 0;
    while (waitpid(pid, &wstatus, 0) < 0 && errno == EINTR) {
    }
    result.status = WIFEXITED(wstatus) ? WEXITSTATUS(wstatus) : 128 + WTERMSIG(wstatus);
    return result;
}

}  // namespace OrvixTest
