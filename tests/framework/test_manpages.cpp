// Manual pages from the tree: which pages there are and what each holds, and
// roff escaping of whatever text a description brings.
#include <algorithm>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "framework/ManPages.h"

namespace {

using ::testing::HasSubstr;
using ::testing::Not;

class Documented : public virtual AutoCli::Command {
public:
    static boost::shared_ptr<Documented> New(const std::string& description) {
        boost::shared_ptr<Documented> command(new Documented());
        command->SetDescription(description);
        return command;
    }
    boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() override {
        auto declared = CallSpec::InputSpec::New();
        auto mode = CallSpec::ParameterSpec::New("load-mode", CallSpec::PARAM_STRING);
        mode->SetShortName("m");
        mode->SetRequired(true);
        mode->SetDescription("How to load. %FULLENUM%");
        mode->SetConstraint(CallSpec::StringEnum({{"fast", "Skip the checks"}, {"safe", ""}}));
        declared->AddParameter(mode);
        auto kind = CallSpec::ParameterSpec::New("kind", CallSpec::PARAM_STRING);
        kind->SetDescription("The kind.");
        kind->SetConstraint(CallSpec::StringEnum({{"plain", ""}, {"fancy", ""}}));
        declared->AddParameter(kind);
        auto count = CallSpec::ParameterSpec::New("count", CallSpec::PARAM_INT);
        count->SetConstraint(CallSpec::IntRange(1, 4094));
        declared->AddParameter(count);
        return declared;
    }
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() override { return CallSpec::OutputSpec::New(); }
    void ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output>) override {}
};

boost::shared_ptr<AutoCli::Namespace> Node(const std::string& description) {
    auto node = AutoCli::Namespace::New();
    node->SetDescription(description);
    return node;
}

const AutoCli::ManPage* Find(const std::vector<AutoCli::ManPage>& pages, const std::string& name) {
    auto it = std::find_if(pages.begin(), pages.end(), [&](const AutoCli::ManPage& p) { return p.name == name; });
    return it == pages.end() ? nullptr : &*it;
}

std::size_t Count(const std::string& text, const std::string& what) {
    std::size_t n = 0;
    for (std::size_t at = text.find(what); at != std::string::npos; at = text.find(what, at + 1)) ++n;
    return n;
}

class ManPagesTest : public ::testing::Test {
protected:
    void SetUp() override {
        root_ = AutoCli::Namespace::New();
        auto net = Node("Networking.");
        auto nic = Node("NICs.");
        auto ring = Node("Rings.");
        auto sw = Node("Switches.");
        root_->RegisterNamespaceNode(net, "net");
        root_->RegisterNamespaceNode(Documented::New("A command at the top."), "status");
        net->RegisterNamespaceNode(nic, "nic");
        net->RegisterNamespaceNode(sw, "switch");
        net->RegisterNamespaceNode(Documented::New("Net-wide reset."), "reset");
        nic->RegisterNamespaceNode(Documented::New("List NICs."), "list");
        nic->RegisterNamespaceNode(ring, "ring");
        ring->RegisterNamespaceNode(Documented::New("Get a ring."), "get");
        sw->RegisterNamespaceNode(Documented::New(".starts with a dot\n'and a quote"), "add");
        info_.program = "tool";
        info_.version = "1.2.3";
        info_.date = "2024-01-02";
        info_.summary = "a tool";
        info_.environment = {{"TOOL_DB", "The store, e.g. C:\\db."}};
        pages_ = AutoCli::RenderManPages(*root_, info_);
    }

    boost::shared_ptr<AutoCli::Namespace> root_;
    AutoCli::ManualInfo info_;
    std::vector<AutoCli::ManPage> pages_;
};

TEST_F(ManPagesTest, EveryCommandIsInExactlyOnePage) {
    ASSERT_EQ(pages_.size(), 4u);
    EXPECT_EQ(pages_[0].name, "tool");
    const auto* net = Find(pages_, "tool-net");
    const auto* nic = Find(pages_, "tool-net-nic");
    const auto* sw = Find(pages_, "tool-net-switch");
    ASSERT_TRUE(net && nic && sw);
    const std::pair<const char*, const AutoCli::ManPage*> homes[] = {
        {".SS \"status\"", &pages_[0]},    {".SS \"net reset\"", net},     {".SS \"net nic list\"", nic},
        {".SS \"net nic ring get\"", nic}, {".SS \"net switch add\"", sw},
    };
    for (const auto& home : homes) {
        std::size_t total = 0;
        for (const auto& page : pages_) total += Count(page.text, home.first);
        EXPECT_EQ(total, 1u) << home.first;
        EXPECT_THAT(home.second->text, HasSubstr(home.first));
    }
    // The program's page points to every area page.
    for (const char* area : {"tool\\-net (8)", "tool\\-net\\-nic (8)", "tool\\-net\\-switch (8)"}) {
        EXPECT_THAT(pages_[0].text, HasSubstr(area));
    }
    EXPECT_THAT(nic->text, HasSubstr(".TH \"TOOL\\-NET\\-NIC\" 8 \"2024\\-01\\-02\" \"tool 1.2.3\""));
}

TEST_F(ManPagesTest, OptionsShowTypeRequirementAndValues) {
    const std::string& text = Find(pages_, "tool-net-nic")->text;
    EXPECT_THAT(text, HasSubstr("\\fB\\-m\\fR, \\fB\\-\\-load\\-mode\\fR=\\fIstring\\fR (required)\n"
                                "How to load.\n.br\nfast: Skip the checks\n.br\nsafe\n"));
    // Values the description does not list are listed after it.
    EXPECT_THAT(text, HasSubstr("\\fB\\-\\-kind\\fR=\\fIstring\\fR (optional)\nThe kind.\n.br\nValues:\n.br\nplain\n"));
    EXPECT_THAT(text, HasSubstr("\\fB\\-\\-count\\fR=\\fIinteger\\fR (optional)\nRange: 1 to 4094.\n"));
}

TEST_F(ManPagesTest, TextFromTheTreeCannotBecomeARequest) {
    const std::string& text = Find(pages_, "tool-net-switch")->text;
    EXPECT_THAT(text, HasSubstr("\n\\&.starts with a dot\n\\&'and a quote\n"));
    EXPECT_THAT(pages_[0].text, HasSubstr("C:\\edb."));
    // No blank line, and no text line starting with a control character.
    for (const auto& page : pages_) {
        EXPECT_THAT(page.text, Not(HasSubstr("\n\n"))) << page.name;
    }
}

TEST(RoffTextTest, EscapesWhatRoffWouldInterpret) {
    EXPECT_EQ(AutoCli::RoffText("a-b \\n c"), "a\\-b \\en c");
    EXPECT_EQ(AutoCli::RoffText(".TH x"), "\\&.TH x");
    EXPECT_EQ(AutoCli::RoffText("'br"), "\\&'br");
    // Leading blanks would break the filled text; blank lines are dropped.
    EXPECT_EQ(AutoCli::RoffText("one \n\n   .two"), "one\n\\&.two");
    EXPECT_EQ(AutoCli::RoffText("say \"hi\""), "say \"hi\"");
}

}  // namespace
