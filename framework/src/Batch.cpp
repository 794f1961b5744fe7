// Batch mode: splitting lines into words, recognising the invocation, and
// running the lines one after the other.
#include "framework/Batch.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <memory>
#include <streambuf>
#include <system_error>

#include "format/Common.h"

namespace AutoCli {

namespace {

using Formatting::EscapeControls;

const char kBatchOption[] = "--batch";
const char kForceOption[] = "--force";

bool IsBlank(char c) {
    return c == ' ' || c == '\t';
}

// A read-only stream buffer over a file descriptor. A failed read throws,
// which the stream turns into badbit (and rethrows when asked to), so a read
// error is never taken for the end of the input.
class FdBuffer : public std::streambuf {
public:
    explicit FdBuffer(int fd) : fd_(fd) {}

protected:
    int_type underflow() override {
        if (gptr() < egptr()) return traits_type::to_int_type(*gptr());
        ssize_t count;
        do {
            count = read(fd_, buffer_, sizeof buffer_);
        } while (count < 0 && errno == EINTR);
        if (count < 0) throw std::system_error(errno, std::generic_category());
        if (count == 0) return traits_type::eof();
        setg(buffer_, buffer_, buffer_ + count);
        return traits_type::to_int_type(*gptr());
    }

private:
    int fd_;
    char buffer_[64 * 1024];
};

// Closes a descriptor this file opened.
struct FdCloser {
    int fd;
    ~FdCloser() {
        if (fd >= 0) close(fd);
    }
};

}  // namespace

std::vector<std::string> SplitBatchLine(const std::string& line) {
    // No argument of a real command line can hold one.
    if (line.find('\0') != std::string::npos) throw UsageError("the line holds a NUL character");
    std::vector<std::string> words;
    std::string word;
    bool inWord = false;
    for (std::size_t i = 0; i < line.size(); ++i) {
        const char c = line[i];
        if (IsBlank(c)) {
            if (inWord) words.push_back(word);
            word.clear();
            inWord = false;
        } else if (c == '#' && !inWord) {
            break;
        } else if (c == '\'') {
            const std::size_t end = line.find('\'', i + 1);
            if (end == std::string::npos) throw UsageError("unterminated single quote");
            word.append(line, i + 1, end - i - 1);
            i = end;
            inWord = true;
        } else if (c == '"') {
            for (++i;; ++i) {
                if (i >= line.size()) throw UsageError("unterminated double quote");
                if (line[i] == '"') break;
                if (line[i] == '\\' && i + 1 < line.size() && std::strchr("\"\\$`", line[i + 1])) ++i;
                word += line[i];
            }
            inWord = true;
        } else if (c == '\\') {
            if (i + 1 == line.size()) throw UsageError("the line ends with a backslash (lines do not continue)");
            word += line[++i];
            inWord = true;
        } else {
            word += c;
            inWord = true;
        }
    }
    if (inWord) words.push_back(word);
    return words;
}

bool ParseBatchInvocation(const std::vector<std::string>& args, BatchInvocation& invocation) {
    // Only the leading options count: after a command word, --batch is that
    // command's business (and an unknown option there).
    const auto leading =
        std::find_if(args.begin(), args.end(), [](const std::string& a) { return a.empty() || a[0] != '-'; });
    const bool asked = std::any_of(args.begin(), leading, [](const std::string& a) {
        return a == kBatchOption || a.rfind(std::string(kBatchOption) + "=", 0) == 0;
    });
    if (!asked) return false;

    BatchInvocation parsed;
    bool fileGiven = false;
    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& arg = args[i];
        if (arg == kForceOption) {
            if (parsed.force) throw UsageError("Option --force is given more than once");
            parsed.force = true;
        } else if (arg == kBatchOption || arg.rfind(std::string(kBatchOption) + "=", 0) == 0) {
            if (fileGiven) throw UsageError("Option --batch is given more than once");
            fileGiven = true;
            if (arg.size() > sizeof kBatchOption - 1) {
                parsed.file = arg.substr(sizeof kBatchOption);
            } else if (i + 1 < args.size()) {
                parsed.file = args[++i];
            }
            if (parsed.file.empty()) throw UsageError("Option --batch needs a file (- for standard input)");
        } else {
            throw UsageError("Unexpected argument '" + EscapeControls(arg) +
                             "' beside --batch: the commands go in the file, one a line; only --force may be added");
        }
    }
    invocation = parsed;
    return true;
}

int RunBatch(const boost::shared_ptr<NamespaceNode>& root, std::istream& lines, std::ostream& out, std::ostream& err,
             const BatchOptions& options) {
    RunOptions run = options.run;
    run.exitsAfterRun = false;
    const std::string source = EscapeControls(options.source);
    // A read error reaches us as the buffer's own exception.
    lines.exceptions(std::ios::badbit);

    int worst = kExitOk;
    std::string text;
    for (long number = 1;; ++number) {
        try {
            if (!std::getline(lines, text)) break;
        } catch (const std::exception& e) {
            err << run.program << ": " << source << ":" << number << ": cannot be read: " << e.what() << "\n";
            return std::max<int>(worst, kExitFailure);
        }
        // A file written on another system ends its lines with CR LF.
        if (!text.empty() && text.back() == '\r') text.pop_back();

        int status = kExitOk;
        try {
            const std::vector<std::string> words = SplitBatchLine(text);
            if (words.empty()) continue;
            status = Run(root, words, out, err, run);
        } catch (const UsageError& e) {
            err << run.program << ": " << EscapeControls(e.what()) << "\n";
            status = kExitUsage;
        }
        out.flush();
        worst = std::max(worst, status);
        if (!out) return std::max<int>(worst, kExitFailure);
        if (status != kExitOk) {
            err << run.program << ": " << source << ":" << number << ": failed with exit status " << status
                << (options.force ? "" : "; the lines after it were not run") << "\n";
            if (!options.force) break;
        }
        err.flush();
    }
    err.flush();
    return worst;
}

int RunBatchFile(const boost::shared_ptr<NamespaceNode>& root, const BatchInvocation& invocation, std::ostream& out,
                 std::ostream& err, const RunOptions& options) {
    const bool standardInput = invocation.file == "-";
    FdCloser opened{standardInput ? -1 : open(invocation.file.c_str(), O_RDONLY | O_CLOEXEC)};
    const int fd = standardInput ? STDIN_FILENO : opened.fd;
    auto refuse = [&](const std::string& why) {
        err << options.program << ": cannot read the batch file '" << EscapeControls(invocation.file) << "': " << why
            << "\n";
        return kExitUsage;
    };
    if (fd < 0) return refuse(std::strerror(errno));
    struct stat st {};
    if (fstat(fd, &st) != 0) return refuse(std::strerror(errno));
    if (S_ISDIR(st.st_mode)) return refuse("it is a directory");

    FdBuffer buffer(fd);
    std::istream lines(&buffer);
    BatchOptions batch;
    batch.source = standardInput ? "<stdin>" : invocation.file;
    batch.force = invocation.force;
    batch.run = options;
    return RunBatch(root, lines, out, err, batch);
}

}  // namespace AutoCli
