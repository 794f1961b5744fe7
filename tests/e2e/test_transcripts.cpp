// Runs every transcript below tests/e2e/cases against the real binaries.
#include <stdlib.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "Transcript.h"

namespace OrvixTest {
namespace {

const std::string kE2eDir = std::string(ORVIX_TESTS_DIR) + "/e2e";

// Every transcript below cases/, room folders included, by its path there.
std::vector<std::string> TranscriptNames() {
    std::vector<std::string> names;
    const std::filesystem::path cases = kE2eDir + "/cases";
    for (const auto& entry : std::filesystem::recursive_directory_iterator(cases)) {
        if (entry.is_regular_file() && entry.path().extension() == ".t") {
            names.push_back(entry.path().lexically_relative(cases).string());
        }
    }
    std::sort(names.begin(), names.end());
    return names;
}

std::string Numbered(const std::vector<std::string>& lines, const char* prefix) {
    std::string text;
    for (const auto& l : lines) text += std::string(prefix) + l + "\n";
    return text;
}

std::string Replace(std::string text, const std::string& from, const std::string& to) {
    for (std::size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
    return text;
}

std::vector<std::string> Environment(const Transcript& t, const std::string& dir) {
    std::vector<std::string> env = {
        "PATH=" + std::string(std::getenv("PATH") ? std::getenv("PATH") : "/usr/bin:/bin"),
        "HOME=" + dir,
        "ORVIX_HOST_DB=" + dir + "/host.db",
        "LC_ALL=C",
    };
    for (const auto& setting : SanitizerEnvironment()) env.push_back(setting);
    if (!t.profile.empty()) env.push_back("ORVIX_HOST_PROFILE=" + t.profile);
    for (const auto& kv : t.env) env.push_back(kv.first + "=" + kv.second);
    return env;
}

void Rewrite(const Transcript& t, const std::vector<ProcessResult>& results) {
    std::ofstream out(t.path);
    for (const auto& h : t.header) out << h << "\n";
    for (std::size_t i = 0; i < t.steps.size(); ++i) {
        out << "$ " << t.steps[i].command << "\n";
        for (const auto& l : SplitLines(results[i].out)) out << l << "\n";
        for (const auto& l : SplitLines(results[i].err)) out << (l.empty() ? "!" : "! " + l) << "\n";
        if (results[i].status != 0) out << "[" << results[i].status << "]\n";
        if (i + 1 < t.steps.size()) out << "\n";
    }
}

class TranscriptTest : public ::testing::TestWithParam<std::string> {};

TEST_P(TranscriptTest, RunsAsWritten) {
    const Transcript t = ParseTranscript(kE2eDir + "/cases/" + GetParam(), kE2eDir);
    char dirTemplate[] = "/tmp/orvix-e2e-XXXXXX";
    ASSERT_NE(mkdtemp(dirTemplate), nullptr);
    const std::string dir = dirTemplate;
    const std::vector<std::string> env = Environment(t, dir);

    std::vector<ProcessResult> results;
    for (const auto& step : t.steps) {
        std::vector<std::string> argv = step.argv;
        for (auto& a : argv) a = Replace(a, "$TMP", dir);
        if (argv[0] == "orvixcli" || argv[0] == "orvix-hostsim") argv[0] = std::string(ORVIX_BIN_DIR) + "/" + argv[0];
        ProcessResult r = RunProcess(argv, dir, env);
        r.out = Replace(r.out, dir, "$TMP");
        r.err = Replace(r.err, dir, "$TMP");
        results.push_back(r);
        const auto out = SplitLines(r.out);
        const auto err = SplitLines(r.err);
        if (out != step.expectedOut || err != step.expectedErr || r.status != step.expectedStatus) {
            ADD_FAILURE_AT(t.path.c_str(), step.line)
                << "$ " << step.command << "\n--- expected\n"
                << Numbered(step.expectedOut, "") << Numbered(step.expectedErr, "! ") << "[" << step.expectedStatus
                << "]\n--- actual\n"
                << Numbered(out, "") << Numbered(err, "! ") << "[" << r.status << "]";
        }
    }
    if (const char* update = std::getenv("ORVIX_UPDATE_TRANSCRIPTS"); update && std::string(update) == "1") {
        Rewrite(t, results);
    }
    std::system(("rm -rf '" + dir + "'").c_str());
}

std::string TestName(const ::testing::TestParamInfo<std::string>& info) {
    std::string name = info.param.substr(0, info.param.size() - 2);
    for (char& c : name) {
        if (!isalnum(static_cast<unsigned char>(c))) c = '_';
    }
    return name;
}

INSTANTIATE_TEST_SUITE_P(Cases, TranscriptTest, ::testing::ValuesIn(TranscriptNames()), TestName);

}  // namespace
}  // namespace OrvixTest
