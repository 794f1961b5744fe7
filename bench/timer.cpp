// Times whole processes. Usage:
//   orvix-bench-timer RUNS NAME 'COMMAND ARGS' [NAME 'COMMAND ARGS' ...]
// Runs every command RUNS times, interleaved (one run of each in turn, so
// drift of the machine touches all alike), after a warm-up run each, and
// prints per command the median and 90th percentile wall time and the
// median's ratio to the first command's.
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <string>
#include <vector>

namespace {

struct Subject {
    std::string name;
    std::vector<std::string> argv;
    std::vector<double> millis;
};

double RunOnce(const std::vector<std::string>& argv) {
    std::vector<char*> args;
    for (const auto& a : argv) args.push_back(const_cast<char*>(a.c_str()));
    args.push_back(nullptr);
    auto start = std::chrono::steady_clock::now();
    pid_t pid = fork();
    if (pid == 0) {
        if (!freopen("/dev/null", "w", stdout)) _exit(126);
        execvp(args[0], args.data());
        _exit(127);
    }
    int status = 0;
    waitpid(pid, &status, 0);
    auto end = std::chrono::steady_clock::now();
    if (!WIFEXITED(status) || WEXITSTATUS(status) != 0) {
        std::fprintf(stderr, "orvix-bench-timer: '%s' failed (status %d)\n", argv[0].c_str(), status);
        std::exit(1);
    }
    return std::chrono::duration<double, std::milli>(end - start).count();
}

double Percentile(std::vector<double> v, double p) {
    std::sort(v.begin(), v.end());
    return v[static_cast<std::size_t>(p * static_cast<double>(v.size() - 1) + 0.5)];
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 4 || argc % 2 != 0) {
        std::fprintf(stderr, "usage: orvix-bench-timer RUNS NAME 'COMMAND ARGS' [NAME 'COMMAND ARGS' ...]\n");
        return 2;
    }
    const int runs = std::atoi(argv[1]);
    std::vector<Subject> subjects;
    for (int i = 2; i + 1 < argc; i += 2) {
        Subject s;
        s.name = argv[i];
        std::istringstream words(argv[i + 1]);
        for (std::string w; words >> w;) s.argv.push_back(w);
        subjects.push_back(s);
    }
    for (auto& s : subjects) RunOnce(s.argv);
    for (int r = 0; r < runs; ++r) {
        for (auto& s : subjects) s.millis.push_back(RunOnce(s.argv));
    }
    const double base = Percentile(subjects[0].millis, 0.5);
    std::printf("%-48s %10s %10s %8s\n", "command", "median ms", "p90 ms", "ratio");
    for (const auto& s : subjects) {
        const double median = Percentile(s.millis, 0.5);
        std::printf("%-48s %10.3f %10.3f %7.2fx\n", s.name.c_str(), median, Percentile(s.millis, 0.9), median / base);
    }
    return 0;
}
