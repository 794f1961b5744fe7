// Runs every transcript below tests/e2e/cases against the real binaries, and
// checks the format's own reading and rewriting.
#include <algorithm>
#include <cstdlib>
#include <filesystem>

#include <gtest/gtest.h>

#include "Transcript.h"
#include "support/test_util.h"

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

std::string Joined(const std::vector<std::string>& lines) {
    return Numbered(lines, "");
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

class TranscriptTest : public ::testing::TestWithParam<std::string> {};

TEST_P(TranscriptTest, RunsAsWritten) {
    const Transcript t = ParseTranscript(kE2eDir + "/cases/" + GetParam(), kE2eDir);
    const TempDir dir;
    const std::vector<std::string> env = Environment(t, dir.Path());

    std::vector<ProcessResult> results;
    for (const auto& step : t.steps) {
        std::vector<std::string> argv = step.argv;
        for (auto& a : argv) a = Replace(a, "$TMP", dir.Path());
        if (argv[0] == "orvixcli" || argv[0] == "orvix-hostsim") argv[0] = Bin(argv[0]);
        ProcessResult r = RunProcess(argv, dir.Path(), env);
        r.out = Replace(r.out, dir.Path(), "$TMP");
        r.err = Replace(r.err, dir.Path(), "$TMP");
        results.push_back(r);
        const auto out = SplitLines(r.out);
        const auto err = SplitLines(r.err);
        if (out != step.expectedOut || err != step.expectedErr || r.status != step.expectedStatus) {
            ADD_FAILURE_AT(t.path.c_str(), step.line) << "$ " << step.command << "\n--- expected\n"
                                                      << Joined(step.expectedOut) << Numbered(step.expectedErr, "! ")
                                                      << "[" << step.expectedStatus << "]\n--- actual\n"
                                                      << Joined(out) << Numbered(err, "! ") << "[" << r.status << "]";
        }
    }
    if (const char* update = std::getenv("ORVIX_UPDATE_TRANSCRIPTS"); update && std::string(update) == "1") {
        WriteFile(t.path, RenderTranscript(t, results));
    }
}

std::string TestName(const ::testing::TestParamInfo<std::string>& info) {
    std::string name = info.param.substr(0, info.param.size() - 2);
    for (char& c : name) {
        if (!isalnum(static_cast<unsigned char>(c))) c = '_';
    }
    return name;
}

INSTANTIATE_TEST_SUITE_P(Cases, TranscriptTest, ::testing::ValuesIn(TranscriptNames()), TestName);

// What a step printed, when it printed exactly what its transcript expects.
std::vector<ProcessResult> ExpectedResults(const Transcript& t) {
    std::vector<ProcessResult> results;
    for (const auto& step : t.steps) {
        results.push_back({Joined(step.expectedOut), Joined(step.expectedErr), step.expectedStatus});
    }
    return results;
}

TEST(TranscriptFormat, RewriteReplacesOnlyTheOutputBlocks) {
    const std::string text =
        "## header comment\n"
        "@env A=b c\n"
        "\n"
        "$ first 'a b'\n"
        "old\n"
        "\n"
        "two\n"
        "! old error\n"
        "[1]\n"
        "\n"
        "## between steps\n"
        "\n"
        "## and another, after a blank line\n"
        "$ second\n"
        "## straight after a block without a blank\n"
        "$ third\n"
        "\n"
        "\n"
        "## trailing comment\n";
    const Transcript t = ParseTranscriptText(text, "x.t", "/base");
    ASSERT_EQ(t.steps.size(), 3u);
    EXPECT_EQ(t.env, (std::vector<std::pair<std::string, std::string>>{{"A", "b c"}}));
    EXPECT_EQ(t.steps[0].argv, (std::vector<std::string>{"first", "a b"}));
    EXPECT_EQ(t.steps[0].expectedOut, (std::vector<std::string>{"old", "", "two"}));
    EXPECT_EQ(t.steps[0].expectedErr, std::vector<std::string>{"old error"});
    EXPECT_EQ(t.steps[0].expectedStatus, 1);
    EXPECT_EQ(t.steps[1].line, 14);

    EXPECT_EQ(RenderTranscript(t, ExpectedResults(t)), text);
    EXPECT_EQ(RenderTranscript(t, {{"new\n\n", "", 0}, {"", "\nsecond line\n", 2}, {"x\n", "", 0}}),
              "## header comment\n"
              "@env A=b c\n"
              "\n"
              "$ first 'a b'\n"
              "new\n"
              "\n"
              "## between steps\n"
              "\n"
              "## and another, after a blank line\n"
              "$ second\n"
              "!\n"
              "! second line\n"
              "[2]\n"
              "## straight after a block without a blank\n"
              "$ third\n"
              "x\n"
              "\n"
              "\n"
              "## trailing comment\n");
    // Output that would read back as something else is not written.
    EXPECT_THROW(RenderTranscript(t, {{"## not a comment\n", "", 0}, {}, {}}), std::runtime_error);
    EXPECT_THROW(RenderTranscript(t, {{"[3]\n", "", 0}, {}, {}}), std::runtime_error);
}

TEST(TranscriptFormat, RefusesWhatItCannotReadBack) {
    for (const char* text :
         {"$ a\nout\n## comment\nmore output\n", "$ a\n[1]\nout\n", "stray\n$ a\n", "$ 'a\n", "@env NOVALUE\n$ a\n"}) {
        EXPECT_THROW(ParseTranscriptText(text, "x.t", "/base"), std::runtime_error) << text;
    }
}

// Rewriting a transcript with the output it expects gives back its text
// byte for byte, so the update mode loses no line of any case.
TEST(TranscriptFormat, EveryCaseRewritesToItself) {
    for (const auto& name : TranscriptNames()) {
        const std::string path = kE2eDir + "/cases/" + name;
        const Transcript t = ParseTranscript(path, kE2eDir);
        EXPECT_EQ(RenderTranscript(t, ExpectedResults(t)), ReadFile(path)) << name;
    }
}

}  // namespace
}  // namespace OrvixTest
