// Batch mode in-process: splitting lines, recognising the invocation, and
// running lines one after another with their statuses and messages.
#include <sstream>
#include <streambuf>
#include <system_error>

#include <gtest/gtest.h>
#include <boost/weak_ptr.hpp>

#include "framework/Batch.h"

namespace {

using Words = std::vector<std::string>;

TEST(BatchLine, SplitsLikeAShell) {
    const std::vector<std::pair<std::string, Words>> cases = {
        {"network ip get", {"network", "ip", "get"}},
        {"  \tnetwork\t ip  ", {"network", "ip"}},
        {"", {}},
        {"   ", {}},
        {"# a comment", {}},
        {"  # indented comment", {}},
        {"a #rest is a comment", {"a"}},
        // '#' inside a word is part of it.
        {"a#b c", {"a#b", "c"}},
        {"'#not a comment'", {"#not a comment"}},
        {"-p 'VM Network'", {"-p", "VM Network"}},
        {"-p \"VM Network\"", {"-p", "VM Network"}},
        {"-p VM\\ Network", {"-p", "VM Network"}},
        // Quotes join with what touches them.
        {"--name='a b'c\"d e\"",
         {"--name=a bc"
          "d e"}},
        // Empty quotes make an empty word.
        {"--formatter '' x", {"--formatter", "", "x"}},
        {"\"\"", {""}},
        // Single quotes keep backslashes; double quotes escape only " \ $ `.
        {"'a\\b'", {"a\\b"}},
        {"\"a\\\"b\\\\c\\$d\\`e\\nf\"", {"a\"b\\c$d`e\\nf"}},
        {"\"it's\"", {"it's"}},
        {"'say \"hi\"'", {"say \"hi\""}},
        // Nothing is expanded.
        {"$HOME ~ *", {"$HOME", "~", "*"}},
    };
    for (const auto& c : cases) EXPECT_EQ(AutoCli::SplitBatchLine(c.first), c.second) << c.first;
}

TEST(BatchLine, RefusesWhatAShellWouldNotRun) {
    const std::vector<std::pair<std::string, std::string>> cases = {
        {"network 'ip get", "unterminated single quote"},
        {"network \"ip get", "unterminated double quote"},
        {"\"ends with an escaped quote\\\"", "unterminated double quote"},
        {"network ip \\", "the line ends with a backslash (lines do not continue)"},
        {std::string("ip\0get", 6), "the line holds a NUL character"},
        {std::string("'ip\0get'", 8), "the line holds a NUL character"},
    };
    for (const auto& c : cases) {
        try {
            AutoCli::SplitBatchLine(c.first);
            ADD_FAILURE() << "accepted: " << c.first;
        } catch (const AutoCli::UsageError& e) {
            EXPECT_EQ(std::string(e.what()), c.second);
        }
    }
}

TEST(BatchInvocation, RecognisesOnlyLeadingBatchOptions) {
    AutoCli::BatchInvocation batch;
    ASSERT_TRUE(AutoCli::ParseBatchInvocation({"--batch", "lines.txt"}, batch));
    EXPECT_EQ(batch.file, "lines.txt");
    EXPECT_FALSE(batch.force);
    ASSERT_TRUE(AutoCli::ParseBatchInvocation({"--force", "--batch=-"}, batch));
    EXPECT_EQ(batch.file, "-");
    EXPECT_TRUE(batch.force);
    // The file may look like a command word.
    ASSERT_TRUE(AutoCli::ParseBatchInvocation({"--batch", "network", "--force"}, batch));
    EXPECT_EQ(batch.file, "network");
    EXPECT_TRUE(batch.force);

    // After a command word, --batch belongs to that command line.
    EXPECT_FALSE(AutoCli::ParseBatchInvocation({"network", "ip", "get", "--batch", "x"}, batch));
    EXPECT_FALSE(AutoCli::ParseBatchInvocation({"--force", "network"}, batch));
    EXPECT_FALSE(AutoCli::ParseBatchInvocation({}, batch));
    EXPECT_FALSE(AutoCli::ParseBatchInvocation({"--batchy", "x"}, batch));

    const std::vector<std::pair<Words, std::string>> refused = {
        {{"--batch"}, "Option --batch needs a file (- for standard input)"},
        {{"--batch="}, "Option --batch needs a file (- for standard input)"},
        {{"--batch", "a", "--batch", "b"}, "Option --batch is given more than once"},
        {{"--batch", "a", "--force", "--force"}, "Option --force is given more than once"},
        {{"--formatter=json", "--batch", "a"},
         "Unexpected argument '--formatter=json' beside --batch: the commands go in the file, one a line; only "
         "--force may be added"},
        {{"--batch", "a", "network"},
         "Unexpected argument 'network' beside --batch: the commands go in the file, one a line; only --force may "
         "be added"},
    };
    for (const auto& c : refused) {
        try {
            AutoCli::ParseBatchInvocation(c.first, batch);
            ADD_FAILURE() << "accepted: " << c.second;
        } catch (const AutoCli::UsageError& e) {
            EXPECT_EQ(std::string(e.what()), c.second);
        }
    }
}

// A command that echoes its word, fails when asked to, and counts how many
// results are still alive, to show that a batch frees each line's result.
class EchoCommand : public virtual AutoCli::Command {
public:
    static boost::shared_ptr<EchoCommand> New() { return boost::shared_ptr<EchoCommand>(new EchoCommand()); }

    boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() override {
        auto declared = CallSpec::InputSpec::New();
        auto word = CallSpec::ParameterSpec::New("word", CallSpec::PARAM_STRING);
        word->SetShortName("w");
        word->SetRequired(true);
        declared->AddParameter(word);
        declared->AddParameter(CallSpec::ParameterSpec::New("fail", CallSpec::PARAM_FLAG));
        return declared;
    }
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() override {
        auto declared = CallSpec::OutputSpec::New();
        declared->SetTemplate(MetaObj::MetaStruct::New("Echo"));
        return declared;
    }
    void ExecuteInternal(boost::shared_ptr<CallSpec::Input> in, boost::shared_ptr<CallSpec::Output> out) override {
        ++runs;
        if (in->GetFlag("fail")) {
            out->SetError("Cannot echo " + in->GetString("word"));
            return;
        }
        auto record = MetaObj::MetaStruct::New("Echo");
        record->SetField("Word", in->GetString("word"));
        out->SetResult(record);
        out->Complete();
        lastResult = out;
    }

    static int runs;
    static boost::weak_ptr<CallSpec::Output> lastResult;

private:
    EchoCommand() {
        SetDescription("Echo a word");
        SetDefaultOutputFormatter("simple");
        SetDefaultOutputParameter("header:Echo", "<NONE>");
    }
};

int EchoCommand::runs = 0;
boost::weak_ptr<CallSpec::Output> EchoCommand::lastResult;

boost::shared_ptr<AutoCli::Namespace> EchoTree() {
    auto root = AutoCli::Namespace::New();
    auto ns = AutoCli::Namespace::New();
    ns->RegisterNamespaceNode(EchoCommand::New(), "echo");
    root->RegisterNamespaceNode(ns, "say");
    return root;
}

struct BatchOutcome {
    int status;
    std::string out, err;
};

BatchOutcome RunLines(const std::string& text, bool force = false) {
    std::istringstream lines(text);
    std::ostringstream out, err;
    AutoCli::BatchOptions options;
    options.source = "lines.txt";
    options.force = force;
    options.run.program = "tool";
    // A batch must free each line's result even when asked not to.
    options.run.exitsAfterRun = true;
    EchoCommand::runs = 0;
    const int status = AutoCli::RunBatch(EchoTree(), lines, out, err, options);
    return {status, out.str(), err.str()};
}

TEST(BatchRun, RunsEveryLineAsItWouldRunAlone) {
    const BatchOutcome o = RunLines(
        "# greetings\n"
        "say echo -w one\n"
        "\n"
        "   # indented comment\n"
        "--formatter=json say echo -w 'two words'\r\n"
        "say echo --word=three");
    EXPECT_EQ(o.status, AutoCli::kExitOk);
    EXPECT_EQ(o.out,
              "   Word: one\n"
              "{\n  \"Word\": \"two words\"\n}\n"
              "   Word: three\n");
    EXPECT_EQ(o.err, "");
    EXPECT_EQ(EchoCommand::runs, 3);
    EXPECT_TRUE(EchoCommand::lastResult.expired());
}

TEST(BatchRun, StopsAtTheFirstFailingLineNamingIt) {
    const BatchOutcome o = RunLines(
        "say echo -w one\n"
        "say echo -w two --fail\n"
        "say echo -w three\n");
    EXPECT_EQ(o.status, AutoCli::kExitCommandError);
    EXPECT_EQ(o.out, "   Word: one\n");
    EXPECT_EQ(o.err,
              "Cannot echo two\n"
              "tool: lines.txt:2: failed with exit status 1; the lines after it were not run\n");
    EXPECT_EQ(EchoCommand::runs, 2);
}

TEST(BatchRun, ForceRunsOnAndReturnsTheWorstStatus) {
    const BatchOutcome o = RunLines(
        "say echo -w one --fail\n"
        "say echo 'unterminated\n"
        "say echo -w three\n"
        "say echo -w four --fail\n",
        true);
    EXPECT_EQ(o.status, AutoCli::kExitUsage);
    EXPECT_EQ(o.out, "   Word: three\n");
    EXPECT_EQ(o.err,
              "Cannot echo one\n"
              "tool: lines.txt:1: failed with exit status 1\n"
              "tool: unterminated single quote\n"
              "tool: lines.txt:2: failed with exit status 2\n"
              "Cannot echo four\n"
              "tool: lines.txt:4: failed with exit status 1\n");
    EXPECT_EQ(EchoCommand::runs, 3);
}

TEST(BatchRun, UsageErrorsOfALineAreItsOwn) {
    BatchOutcome o = RunLines("say echo\n");
    EXPECT_EQ(o.status, AutoCli::kExitUsage);
    EXPECT_EQ(o.err,
              "tool: Missing required option --word\n"
              "Run 'tool say echo --help' for its options.\n"
              "tool: lines.txt:1: failed with exit status 2; the lines after it were not run\n");

    // A nested batch is not a command.
    o = RunLines("--batch other.txt\n");
    EXPECT_EQ(o.status, AutoCli::kExitUsage);
    EXPECT_EQ(o.err,
              "tool: Unknown option --batch\n"
              "tool: lines.txt:1: failed with exit status 2; the lines after it were not run\n");

    o = RunLines("# nothing but comments\n\n");
    EXPECT_EQ(o.status, AutoCli::kExitOk);
    EXPECT_EQ(o.out + o.err, "");
}

// A buffer that hands out its text, then fails as a disk would.
class FailingBuffer : public std::streambuf {
public:
    explicit FailingBuffer(std::string text) : text_(std::move(text)) {
        setg(text_.data(), text_.data(), text_.data() + text_.size());
    }

protected:
    int_type underflow() override { throw std::system_error(EIO, std::generic_category()); }

private:
    std::string text_;
};

TEST(BatchRun, AReadErrorIsNotTheEndOfTheInput) {
    FailingBuffer buffer("say echo -w one\nsay echo -w tw");
    std::istream lines(&buffer);
    std::ostringstream out, err;
    AutoCli::BatchOptions options;
    options.source = "lines.txt";
    options.run.program = "tool";
    EXPECT_EQ(AutoCli::RunBatch(EchoTree(), lines, out, err, options), AutoCli::kExitFailure);
    EXPECT_EQ(out.str(), "   Word: one\n");
    EXPECT_EQ(err.str().rfind("tool: lines.txt:2: cannot be read: ", 0), 0u) << err.str();
}

TEST(BatchRun, StopsWhenTheOutputCannotBeWritten) {
    std::istringstream lines("say echo -w one\nsay echo -w two\n");
    std::ostringstream out, err;
    out.setstate(std::ios::badbit);
    AutoCli::BatchOptions options;
    options.source = "lines.txt";
    EchoCommand::runs = 0;
    EXPECT_EQ(AutoCli::RunBatch(EchoTree(), lines, out, err, options), AutoCli::kExitFailure);
    EXPECT_EQ(EchoCommand::runs, 1);
}

}  // namespace
