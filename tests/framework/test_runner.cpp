// A whole run in-process: path resolution, help at every level, formatter
// choice, exit statuses, and what happens when a command misbehaves.
#include <sstream>

#include <gtest/gtest.h>

#include "framework/Runner.h"

namespace {

// A command whose behaviour the test chooses.
class FakeCommand : public virtual AutoCli::Command {
public:
    enum Behaviour { kRecord, kThrow, kNoComplete, kWrongType, kNothing, kLongList };

    static boost::shared_ptr<FakeCommand> New(Behaviour b) {
        boost::shared_ptr<FakeCommand> c(new FakeCommand());
        c->behaviour_ = b;
        c->SetDescription("Do a fake thing");
        c->SetDefaultOutputFormatter("simple");
        c->SetDefaultOutputParameter("header:Thing", "Thing %Name%");
        return c;
    }

    boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() override {
        auto declared = CallSpec::InputSpec::New();
        auto name = CallSpec::ParameterSpec::New("name", CallSpec::PARAM_STRING);
        name->SetShortName("n");
        name->SetDescription("The name. One of: %ENUM%. In full: %FULLENUM%");
        name->SetRequired(true);
        auto words = CallSpec::ParameterConstraint::New(CallSpec::CONSTRAINT_STRING_ENUM);
        words->AddStringEnum("alpha", "The first one");
        words->AddStringEnum("beta", "");
        name->SetConstraint(words);
        declared->AddParameter(name);
        auto flag = CallSpec::ParameterSpec::New("force", CallSpec::PARAM_FLAG);
        flag->SetShortName("f");
        flag->SetDescription("Force it");
        declared->AddParameter(flag);
        return declared;
    }
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() override {
        auto declared = CallSpec::OutputSpec::New();
        if (behaviour_ == kLongList) {
            declared->SetTemplate(MetaObj::MetaList::New(MetaObj::META_STRUCT, MetaObj::MetaStruct::New("Thing")));
        } else {
            declared->SetTemplate(MetaObj::MetaStruct::New("Thing"));
        }
        return declared;
    }
    void ExecuteInternal(boost::shared_ptr<CallSpec::Input> in, boost::shared_ptr<CallSpec::Output> out) override {
        auto record = MetaObj::MetaStruct::New("Thing");
        record->SetField("Name", in->GetString("name"));
        record->SetField("Forced", in->GetFlag("force"));
        switch (behaviour_) {
            case kRecord:
                out->SetResult(record);
                out->Complete();
                break;
            case kThrow:
                throw std::runtime_error("host store '/x/host.db' is damaged");
            case kNoComplete:
                out->SetResult(record);
                break;
            case kWrongType:
                out->SetResult(MetaObj::MetaString::New("oops"));
                out->Complete();
                break;
            case kNothing:
                break;
            case kLongList: {
                // Far more output than one piece of the runner's buffer.
                auto list = MetaObj::MetaList::New(MetaObj::META_STRUCT, MetaObj::MetaStruct::New("Thing"));
                for (int i = 0; i < kLongListRows; ++i) {
                    auto row = MetaObj::MetaStruct::New("Thing", 1);
                    row->SetField("Name", in->GetString("name") + "-" + std::to_string(i));
                    list->Append(row);
                }
                out->SetResult(list);
                out->Complete();
                break;
            }
        }
    }

    static constexpr int kLongListRows = 40000;

private:
    FakeCommand() = default;
    Behaviour behaviour_ = kRecord;
};

boost::shared_ptr<AutoCli::Namespace> Tree() {
    auto root = AutoCli::Namespace::New();
    auto top = AutoCli::Namespace::New();
    top->SetDescription("Top things");
    auto inner = AutoCli::Namespace::New();
    inner->SetDescription("Inner things");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kRecord), "get");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kThrow), "crash");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kNoComplete), "incomplete");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kWrongType), "wrongtype");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kNothing), "silent");
    inner->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kLongList), "many");
    top->RegisterNamespaceNode(FakeCommand::New(FakeCommand::kRecord), "list");
    top->RegisterNamespaceNode(inner, "inner");
    // Namespaces with no command anywhere below them.
    auto empty = AutoCli::Namespace::New();
    empty->SetDescription("Nothing here");
    auto emptier = AutoCli::Namespace::New();
    emptier->SetDescription("Nothing here either");
    empty->RegisterNamespaceNode(emptier, "deeper");
    top->RegisterNamespaceNode(empty, "hollow");
    root->RegisterNamespaceNode(top, "top");
    return root;
}

struct Outcome {
    int status;
    std::string out, err;
};

Outcome RunLine(const std::vector<std::string>& args) {
    std::ostringstream out, err;
    AutoCli::RunOptions options;
    options.program = "tool";
    options.version = "9.9";
    int status = AutoCli::Run(Tree(), args, out, err, options);
    return {status, out.str(), err.str()};
}

// What the transcripts cannot reach with a real command: a command that
// throws, forgets to complete, returns the wrong kind of value or nothing.
TEST(Runner, MapsMisbehavingCommandsToExitStatuses) {
    // Whatever escapes a command is reported, never a crash.
    Outcome o = RunLine({"top", "inner", "crash", "-n", "alpha"});
    EXPECT_EQ(o.status, AutoCli::kExitFailure);
    EXPECT_EQ(o.err, "tool: host store '/x/host.db' is damaged\n");

    o = RunLine({"top", "inner", "incomplete", "-n", "alpha"});
    EXPECT_EQ(o.status, AutoCli::kExitFailure);
    EXPECT_EQ(o.out, "");
    EXPECT_EQ(o.err, "tool: internal error: 'top inner incomplete' set a result without completing\n");

    o = RunLine({"top", "inner", "wrongtype", "-n", "alpha"});
    EXPECT_EQ(o.status, AutoCli::kExitFailure);
    EXPECT_EQ(o.err, "tool: internal error: 'top inner wrongtype' returned a string but declares a struct\n");

    o = RunLine({"top", "inner", "silent", "-n", "alpha"});
    EXPECT_EQ(o.status, 0);
    EXPECT_EQ(o.out + o.err, "");
}

TEST(Runner, RefusesBadCommandLines) {
    const std::vector<std::pair<std::vector<std::string>, std::string>> cases = {
        {{"tpo"}, "tool: Unknown command or namespace 'tpo'. Did you mean 'top'?\n"},
        {{"top", "--bogus"}, "tool: Unknown option --bogus for 'top'\n"},
        // The options every namespace knows are suggested, long and short.
        {{"top", "--formater=json"}, "tool: Unknown option --formater=json for 'top'. Did you mean --formatter?\n"},
        {{"top", "-H"}, "tool: Unknown option -H for 'top'. Did you mean -h?\n"},
        {{"-x"}, "tool: Unknown option -x\n"},
        // A command's own short options are suggested by case.
        {{"top", "list", "-N", "alpha"},
         "tool: Unknown option -N. Did you mean -n?\nRun 'tool top list --help' for its options.\n"},
        {{"top", "list", "-n", "alpha", "-F"},
         "tool: Unknown option -F. Did you mean -f?\nRun 'tool top list --help' for its options.\n"},
        {{"top", "list", "-q"}, "tool: Unknown option -q\nRun 'tool top list --help' for its options.\n"},
        // What the user typed is echoed with its control characters escaped.
        {{"top", "--bo\x1b]0;x\x07gus"}, "tool: Unknown option --bo\\x1b]0;x\\x07gus for 'top'\n"},
        {{"--formatter=jsno", "top", "list", "-n", "alpha"},
         "tool: Unknown formatter 'jsno'. Did you mean 'json'? Formatters: simple, table, json, xml, csv, keyvalue.\n"},
        {{"--formatter=bogus", "top", "list", "-n", "alpha"},
         "tool: Unknown formatter 'bogus'. Formatters: simple, table, json, xml, csv, keyvalue.\n"},
        // The command word after a bare --formatter is not taken for its value.
        {{"--formatter", "top", "list", "-n", "alpha"},
         "tool: Option --formatter needs a value before the command word 'top': one of simple, table, json, xml, "
         "csv, keyvalue\n"},
        {{"top", "--formatter", "inner", "get", "-n", "alpha"},
         "tool: Option --formatter needs a value before the command word 'inner': one of simple, table, json, xml, "
         "csv, keyvalue\n"},
        {{"top", "list", "-n", "alpha", "--formatter"},
         "tool: Option --formatter needs a value: one of simple, table, json, xml, csv, keyvalue\n"},
        {{"top", "list", "-n", "alpha", "--formatter="},
         "tool: Option --formatter needs a value: one of simple, table, json, xml, csv, keyvalue\n"},
    };
    for (const auto& c : cases) {
        Outcome o = RunLine(c.first);
        EXPECT_EQ(o.status, AutoCli::kExitUsage) << c.second;
        EXPECT_EQ(o.err, c.second);
        EXPECT_EQ(o.out, "");
    }
    // A namespace without a command: its help on stderr, usage status.
    Outcome o = RunLine({"top", "inner"});
    EXPECT_EQ(o.status, AutoCli::kExitUsage);
    EXPECT_EQ(o.err.substr(0, 58), "tool: 'top inner' is a namespace; give one of its commands");
    EXPECT_NE(o.err.find("Available Commands:"), std::string::npos);
}

TEST(Runner, HelpAtEveryLevel) {
    Outcome root = RunLine({"--help"});
    EXPECT_EQ(root.status, 0);
    EXPECT_EQ(root.out,
              "Usage: tool [options] {namespace|cmd} [cmd options]\n"
              "\n"
              "Options:\n"
              "  --formatter=<str>   Override the output formatter: simple, table, json, xml, csv, keyvalue.\n"
              "  -h|--help           Show the help of the namespace or command.\n"
              "  --version           Print the version of the CLI and exit.\n"
              "  --batch=<file>      Run the command lines of a file, one a line (- reads standard input).\n"
              "  --force             With --batch: run on past failing lines.\n"
              "\n"
              "Available Namespaces:\n"
              "  top  Top things\n"
              "\n"
              "For help on a namespace or command: tool <name> --help\n");

    // Children in their order of attachment, namespaces and commands apart;
    // "hollow", with no command anywhere below it, is not listed.
    Outcome ns = RunLine({"top", "--help"});
    EXPECT_EQ(ns.out,
              "Usage: tool top {namespace|cmd} [cmd options]\n"
              "\n"
              "Top things\n"
              "\n"
              "Available Namespaces:\n"
              "  inner  Inner things\n"
              "\n"
              "Available Commands:\n"
              "  list  Do a fake thing\n"
              "\n"
              "For help on a namespace or command: tool top <name> --help\n");

    // Help wins over missing required options.
    Outcome cmd = RunLine({"top", "inner", "get", "-h"});
    EXPECT_EQ(cmd.status, 0);
    EXPECT_EQ(cmd.out,
              "Usage: tool top inner get [cmd options]\n"
              "\n"
              "Description:\n"
              "  Do a fake thing\n"
              "\n"
              "Cmd options:\n"
              "  -n|--name=<str>  (required)\n"
              "      The name. One of: alpha, beta. In full: \n"
              "        alpha: The first one\n"
              "        beta\n"
              "  -f|--force\n"
              "      Force it\n");

    EXPECT_EQ(RunLine({"--version"}).out, "tool 9.9\n");
}

TEST(Runner, LongOutputArrivesWholeAndInOrder) {
    // Hundreds of kilobytes, gathered in pieces before they are written:
    // every row, in order, nothing doubled or lost at a piece's edge.
    for (const std::string formatter : {"csv", "table"}) {
        Outcome run = RunLine({"--formatter=" + formatter, "top", "inner", "many", "-n", "alpha"});
        ASSERT_EQ(run.status, AutoCli::kExitOk) << run.err;
        std::istringstream lines(run.out);
        std::string line;
        std::getline(lines, line);
        if (formatter == "table") std::getline(lines, line);
        int rows = 0;
        while (std::getline(lines, line)) {
            const std::string expected = "alpha-" + std::to_string(rows);
            ASSERT_EQ(line, expected) << formatter << " row " << rows;
            ++rows;
        }
        EXPECT_EQ(rows, FakeCommand::kLongListRows) << formatter;
        EXPECT_GT(run.out.size(), 256u * 1024u);
    }
}

}  // namespace
