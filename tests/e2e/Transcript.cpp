#include "Transcript.h"

#include <fstream>
#include <regex>
#include <sstream>
#include <stdexcept>

#include "support/test_util.h"

namespace OrvixTest {

namespace {

const std::regex& StatusLine() {
    static const std::regex status(R"(^\[(\d+)\]$)");
    return status;
}

bool StartsWith(const std::string& line, const char* prefix) {
    return line.rfind(prefix, 0) == 0;
}

bool IsComment(const std::string& line) {
    return StartsWith(line, "##");
}

bool IsErrLine(const std::string& line) {
    return line == "!" || StartsWith(line, "! ");
}

}  // namespace

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
    if (!std::ifstream(path)) throw std::runtime_error("cannot read " + path);
    return ParseTranscriptText(ReadFile(path), path, baseDir);
}

Transcript ParseTranscriptText(const std::string& text, const std::string& path, const std::string& baseDir) {
    Transcript t;
    t.path = path;
    std::istringstream in(text);
    std::string line;
    int number = 0;
    auto fail = [&](const std::string& what) {
        throw std::runtime_error(path + ":" + std::to_string(number) + ": " + what);
    };
    // Blank and comment lines since the last line of the current step's
    // block: the blanks may still turn out to be inside its output; with a
    // comment among them they are the next step's preface.
    std::vector<std::string> pending;
    bool pendingComment = false;
    bool statusSeen = false;
    while (std::getline(in, line)) {
        ++number;
        if (StartsWith(line, "$ ")) {
            TranscriptStep step;
            step.line = number;
            step.command = line.substr(2);
            step.argv = SplitCommandLine(step.command);
            if (step.argv.empty()) fail("empty command");
            if (!t.steps.empty()) step.preface.swap(pending);
            pendingComment = statusSeen = false;
            t.steps.push_back(step);
            continue;
        }
        if (t.steps.empty()) {
            if (StartsWith(line, "@profile ")) {
                t.profile = baseDir + "/" + line.substr(9);
            } else if (StartsWith(line, "@env ")) {
                const std::string assignment = line.substr(5);
                const std::size_t eq = assignment.find('=');
                if (eq == std::string::npos) fail("@env needs NAME=VALUE");
                t.env.emplace_back(assignment.substr(0, eq), assignment.substr(eq + 1));
            } else if (!line.empty() && !IsComment(line)) {
                fail("expected a command (\"$ ...\"), a directive or a comment");
            }
            t.header.push_back(line);
            continue;
        }
        if (line.empty() || IsComment(line)) {
            pending.push_back(line);
            pendingComment = pendingComment || IsComment(line);
            continue;
        }
        if (pendingComment) fail("a comment ends a step's block; move it before the next \"$\" line");
        if (statusSeen) fail("output after the exit status");
        TranscriptStep& step = t.steps.back();
        std::smatch m;
        if (std::regex_match(line, m, StatusLine())) {
            step.expectedStatus = std::stoi(m[1]);
            statusSeen = true;
        } else if (IsErrLine(line)) {
            step.expectedErr.push_back(line.size() > 2 ? line.substr(2) : "");
        } else {
            step.expectedOut.insert(step.expectedOut.end(), pending.begin(), pending.end());
            step.expectedOut.push_back(line);
        }
        pending.clear();
    }
    t.trailer = pending;
    return t;
}

std::string RenderTranscript(const Transcript& t, const std::vector<ProcessResult>& results) {
    if (results.size() != t.steps.size()) throw std::invalid_argument("one result a step is needed");
    std::ostringstream out;
    auto lines = [&](const std::vector<std::string>& block) {
        for (const auto& l : block) out << l << "\n";
    };
    lines(t.header);
    for (std::size_t i = 0; i < t.steps.size(); ++i) {
        const TranscriptStep& step = t.steps[i];
        lines(step.preface);
        out << "$ " << step.command << "\n";
        for (const auto& l : SplitLines(results[i].out)) {
            if (StartsWith(l, "$ ") || IsComment(l) || IsErrLine(l) || std::regex_match(l, StatusLine())) {
                throw std::runtime_error(t.path + ":" + std::to_string(step.line) + ": the output line '" + l +
                                         "' would not read back as output");
            }
            out << l << "\n";
        }
        for (const auto& l : SplitLines(results[i].err)) out << (l.empty() ? "!" : "! " + l) << "\n";
        if (results[i].status != 0) out << "[" << results[i].status << "]\n";
    }
    lines(t.trailer);
    return out.str();
}

}  // namespace OrvixTest
