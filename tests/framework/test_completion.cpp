// Completion from the tree: what is offered at each point of a command line,
// which completer answers for a value, and that nothing a completer or a
// declaration does reaches the shell.
#include <stdexcept>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "framework/Completion.h"

namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::UnorderedElementsAre;

// A command declaring one parameter of each kind completion tells apart.
class Declared : public virtual AutoCli::Command {
public:
    static boost::shared_ptr<Declared> New(bool throws = false) {
        boost::shared_ptr<Declared> command(new Declared());
        command->throws_ = throws;
        return command;
    }

    boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() override {
        if (throws_) throw std::runtime_error("declaration failed");
        auto declared = CallSpec::InputSpec::New();
        auto add = [&](const char* name, CallSpec::ParameterType type, const char* letter) {
            auto p = CallSpec::ParameterSpec::New(name, type);
            if (*letter) p->SetShortName(letter);
            declared->AddParameter(p);
            return p;
        };
        add("mode", CallSpec::PARAM_STRING, "m")->SetConstraint(CallSpec::StringEnum({{"fast", ""}, {"safe", ""}}));
        add("level", CallSpec::PARAM_INT, "l")->SetConstraint(CallSpec::IntEnum({1, 10}));
        add("enabled", CallSpec::PARAM_BOOL, "e");
        add("force", CallSpec::PARAM_FLAG, "f");
        add("nic-name", CallSpec::PARAM_STRING, "n");
        add("note", CallSpec::PARAM_STRING, "");
        return declared;
    }
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() override { return CallSpec::OutputSpec::New(); }
    void ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output>) override {}

private:
    bool throws_ = false;
};

class CompletionTest : public ::testing::Test {
protected:
    void SetUp() override {
        root_ = AutoCli::Namespace::New();
        net_ = AutoCli::Namespace::New();
        sriov_ = AutoCli::Namespace::New();
        root_->RegisterNamespaceNode(net_, "net");
        net_->RegisterNamespaceNode(sriov_, "sriov");
        net_->RegisterNamespaceNode(AutoCli::Namespace::New(), "switch");
        net_->RegisterNamespaceNode(Declared::New(), "set");
        sriov_->RegisterNamespaceNode(Declared::New(), "set");
        sriov_->RegisterNamespaceNode(Declared::New(true), "broken");
        net_->SetValueCompleter("nic-name", [] { return std::vector<std::string>{"nic0", "nic1", "nic0"}; });
    }

    std::vector<std::string> Complete(const std::vector<std::string>& words) {
        return AutoCli::CompleteWords(*root_, words);
    }

    boost::shared_ptr<AutoCli::Namespace> root_, net_, sriov_;
};

TEST_F(CompletionTest, OffersTheChildrenOfTheNamespaceReached) {
    EXPECT_THAT(Complete({""}), ElementsAre("net"));
    EXPECT_THAT(Complete({"net", "s"}), ElementsAre("sriov", "switch", "set"));
    EXPECT_THAT(Complete({"net", "sw"}), ElementsAre("switch"));
    // Global options may come before the path; their value is skipped.
    EXPECT_THAT(Complete({"--formatter", "json", "net", "sr"}), ElementsAre("sriov"));
    EXPECT_THAT(Complete({"-"}), ElementsAre("--formatter", "--help", "-h", "--version", "--batch", "--force"));
    // Batch options are taken only before the first namespace word.
    EXPECT_THAT(Complete({"net", "--b"}), IsEmpty());
}

TEST_F(CompletionTest, APathThatLeadsNowhereOffersNothing) {
    EXPECT_THAT(Complete({"nope", ""}), IsEmpty());
    EXPECT_THAT(Complete({"net", "set", "stray", ""}), IsEmpty());
    EXPECT_THAT(Complete({"net", "--bogus", ""}), IsEmpty());
    // A command after which nothing positional is allowed.
    EXPECT_THAT(Complete({"net", "set", "x"}), IsEmpty());
}

TEST_F(CompletionTest, OffersTheOptionsNotGivenYet) {
    EXPECT_THAT(Complete({"net", "set", "--"}), ElementsAre("--mode", "--level", "--enabled", "--force", "--nic-name",
                                                            "--note", "--formatter", "--help"));
    // Given by long name, short name, with an inline value, or as a flag:
    // each is gone, and the value after "-l" is not taken for a word.
    EXPECT_THAT(Complete({"net", "set", "--mode=fast", "-l", "10", "-f", "--enabled", "true", "-"}),
                ElementsAre("--nic-name", "-n", "--note", "--formatter", "--help", "-h"));
    EXPECT_THAT(Complete({"net", "set", "-n", "nic0", "--n"}), ElementsAre("--note"));
}

TEST_F(CompletionTest, OffersEnumAndBoolValuesInEveryOptionForm) {
    EXPECT_THAT(Complete({"net", "set", "--mode", ""}), ElementsAre("fast", "safe"));
    EXPECT_THAT(Complete({"net", "set", "-m", "s"}), ElementsAre("safe"));
    EXPECT_THAT(Complete({"net", "set", "--mode=f"}), ElementsAre("--mode=fast"));
    EXPECT_THAT(Complete({"net", "set", "-m="}), ElementsAre("-m=fast", "-m=safe"));
    EXPECT_THAT(Complete({"net", "set", "--level", ""}), ElementsAre("1", "10"));
    EXPECT_THAT(Complete({"net", "set", "--enabled="}), ElementsAre("--enabled=true", "--enabled=false"));
    EXPECT_THAT(Complete({"net", "set", "--formatter=x"}), ElementsAre("--formatter=xml"));
    EXPECT_THAT(Complete({"--formatter", ""}), Contains("json"));
    // A flag takes no value, and a value without a known source has none.
    EXPECT_THAT(Complete({"net", "set", "--force="}), IsEmpty());
    EXPECT_THAT(Complete({"net", "set", "--note", ""}), IsEmpty());
}

TEST_F(CompletionTest, TheNearestCompleterOnThePathAnswersOnce) {
    EXPECT_THAT(Complete({"net", "set", "--nic-name", ""}), ElementsAre("nic0", "nic1"));
    sriov_->SetValueCompleter("nic-name", [] { return std::vector<std::string>{"vf-capable0"}; });
    EXPECT_THAT(Complete({"net", "sriov", "set", "-n", ""}), ElementsAre("vf-capable0"));
    EXPECT_THAT(Complete({"net", "set", "--nic-name=n"}), ElementsAre("--nic-name=nic0", "--nic-name=nic1"));
    // Completers are asked only when a value of theirs is wanted.
    int calls = 0;
    net_->SetValueCompleter("nic-name", [&] {
        ++calls;
        return std::vector<std::string>{"nic9"};
    });
    Complete({"net", "set", "--mode", ""});
    Complete({"net", "set", "--nic-name", "nic9", ""});
    EXPECT_EQ(calls, 0);
}

TEST_F(CompletionTest, FailuresOfferNothingAndNeverThrow) {
    net_->SetValueCompleter("nic-name", []() -> std::vector<std::string> { throw std::runtime_error("no host"); });
    EXPECT_THAT(Complete({"net", "set", "--nic-name", ""}), IsEmpty());
    EXPECT_THAT(Complete({"net", "sriov", "broken", "--"}), IsEmpty());
    EXPECT_THROW(net_->SetValueCompleter("", [] { return std::vector<std::string>(); }), std::invalid_argument);
    EXPECT_THROW(net_->SetValueCompleter("x", nullptr), std::invalid_argument);
}

TEST(CompletionScriptTest, NamesTheProgramAndTheEntryPointForEachShell) {
    for (const std::string& shell : AutoCli::CompletionShells()) {
        const std::string script = AutoCli::CompletionScript(shell, "tool", "__words");
        EXPECT_THAT(script, ::testing::HasSubstr("_tool()")) << shell;
        EXPECT_THAT(script, ::testing::HasSubstr("__words")) << shell;
        EXPECT_THAT(script, ::testing::Not(::testing::ContainsRegex("@[A-Z]+@"))) << shell << ": a placeholder left";
    }
    EXPECT_THAT(AutoCli::CompletionScript("bash", "tool", "__words"), ::testing::HasSubstr("complete -F _tool tool"));
    EXPECT_THAT(AutoCli::CompletionScript("zsh", "tool", "__words"), ::testing::HasSubstr("compdef _tool tool"));
    EXPECT_THROW(AutoCli::CompletionScript("fish", "tool", "__words"), std::invalid_argument);
}

}  // namespace
