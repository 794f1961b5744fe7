// Adding the saved dynamic rules again after a reload: every rule is tried
// in order, whatever fails before it, and the first failure is the one
// reported.
#include <gmock/gmock.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "firewall/FirewallOptions.h"
#include "hostctl/Lib.h"

namespace {

using HostCtl::System::FirewallRule;

// A firewall that refuses the rules whose labels it is given and records
// every rule it is asked to add.
class RefusingFirewall : public PldCtl::System::SystemInfoImpl {
public:
    explicit RefusingFirewall(std::vector<std::string> refused) : refused_(std::move(refused)) {}

    void AddFirewallDynamicRule(const FirewallRule& rule) override {
        asked.push_back(rule.label);
        for (const std::string& label : refused_) {
            if (label == rule.label) throw HostCtl::Lib::HostCtlException("refused " + rule.label);
        }
        added.push_back(rule.label);
    }

    std::vector<std::string> asked;
    std::vector<std::string> added;

private:
    std::vector<std::string> refused_;
};

std::vector<std::unique_ptr<FirewallRule>> Rules(std::initializer_list<const char*> labels) {
    std::vector<std::unique_ptr<FirewallRule>> rules;
    for (const char* label : labels) {
        rules.push_back(std::make_unique<FirewallRule>());
        rules.back()->label = label;
    }
    return rules;
}

TEST(ReaddDynamicRules, TriesEveryRuleAndReportsTheFirstFailure) {
    RefusingFirewall firewall({"b", "d"});
    const std::optional<std::string> failure =
        OrvixCli::NetworkNamespace::ReaddDynamicRules(firewall, Rules({"a", "b", "c", "d", "e"}));
    EXPECT_EQ(failure, std::optional<std::string>("refused b"));
    EXPECT_THAT(firewall.asked, ::testing::ElementsAre("a", "b", "c", "d", "e"));
    EXPECT_THAT(firewall.added, ::testing::ElementsAre("a", "c", "e"));
}

TEST(ReaddDynamicRules, AllAddedOrNoneGivenIsNoFailure) {
    RefusingFirewall firewall({"x"});
    EXPECT_EQ(OrvixCli::NetworkNamespace::ReaddDynamicRules(firewall, Rules({"a", "b"})), std::nullopt);
    EXPECT_THAT(firewall.added, ::testing::ElementsAre("a", "b"));
    EXPECT_EQ(OrvixCli::NetworkNamespace::ReaddDynamicRules(firewall, Rules({})), std::nullopt);

    RefusingFirewall refusingAll({"a", "b"});
    EXPECT_EQ(OrvixCli::NetworkNamespace::ReaddDynamicRules(refusingAll, Rules({"a", "b"})),
              std::optional<std::string>("refused a"));
    EXPECT_THAT(refusingAll.asked, ::testing::ElementsAre("a", "b"));
}

}  // namespace
