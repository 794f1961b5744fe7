// The vswitch room's shared options at their edges, where the transcripts'
// few command lines do not reach: how uplink lists rebuild a teaming order
// from every shape of reference policy, and which settings a port group's
// own policy overrides. Options are parsed by the framework's real parser;
// NIC names are checked against the default host.
#include <gtest/gtest.h>

#include "framework/Runner.h"
#include "hostctl/HostSession.h"
#include "support/test_util.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace {

using HostCtl::Network::NicTeamingPolicy;
using OrvixCli::NetworkNamespace::SplitUplinks;
using Names = std::vector<std::string>;

// A teaming policy as a switch holds it: every field set.
NicTeamingPolicy Teaming(const Names& order, int maxActive) {
    NicTeamingPolicy policy = NicTeamingPolicy::GetDefaultPolicy();
    policy.SetUplinkOrder(order);
    policy.SetMaxActiveUplinks(maxActive);
    return policy;
}

// NIC names are checked against a fresh default host, whose NICs are hwnic0
// to hwnic5; the switch's uplinks are hwnic0 to hwnic3.
class PolicyOptions : public ::testing::Test {
protected:
    PolicyOptions() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Lib::ReopenHost();
    }
    ~PolicyOptions() override { PldCtl::Lib::ReopenHost(); }

    // Applies failover options to `edited`, with `reference` as the policy
    // shown to the user; returns the errors reported.
    Names Failover(const Names& args, NicTeamingPolicy& edited, NicTeamingPolicy& reference) {
        Names uplinks = {"hwnic0", "hwnic1", "hwnic2", "hwnic3"};
        boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
        boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
        OrvixCli::NetworkNamespace::AddFailoverParameters(declared);
        OrvixCli::NetworkNamespace::SetFailoverPolicy(AutoCli::ParseArguments(*declared, args), output, edited,
                                                      reference, uplinks);
        return output->GetErrors();
    }

    OrvixTest::TempDir dir_;
    OrvixTest::ScopedEnv db_;
    OrvixTest::ScopedEnv profile_;
};

TEST(SplitUplinks, KeepsEveryPieceBeforeACommaAndANonEmptyLastPiece) {
    EXPECT_EQ(SplitUplinks("hwnic0,hwnic1"), (Names{"hwnic0", "hwnic1"}));
    EXPECT_EQ(SplitUplinks("hwnic0,,hwnic1"), (Names{"hwnic0", "", "hwnic1"}));
    EXPECT_EQ(SplitUplinks("hwnic0,"), (Names{"hwnic0"}));
    EXPECT_EQ(SplitUplinks(",hwnic0"), (Names{"", "hwnic0"}));
    EXPECT_EQ(SplitUplinks("hwnic0"), (Names{"hwnic0"}));
    EXPECT_EQ(SplitUplinks(""), Names{});
    EXPECT_EQ(SplitUplinks(","), (Names{""}));
    EXPECT_EQ(SplitUplinks(",,"), (Names{"", ""}));
    EXPECT_EQ(SplitUplinks("hwnic0,,"), (Names{"hwnic0", ""}));
    // Blanks are part of the names; nothing is trimmed.
    EXPECT_EQ(SplitUplinks(" hwnic0, hwnic1 "), (Names{" hwnic0", " hwnic1 "}));
}

// The order and active count that uplink lists make from a reference policy.
// The reference keeps its count unless active uplinks are named.
TEST_F(PolicyOptions, UplinkListsMakeTheOrderFromTheReference) {
    struct Case {
        const char* why;
        Names args;
        Names referenceOrder;
        int referenceActive;
        Names order;
        int active;
        int referenceActiveAfter;
    };
    // One row a case: why, the arguments, the reference's order and count,
    // then the order and count made and the reference's count afterwards.
    // clang-format off
    const Case cases[] = {
        {"active only: the old standby adapters stay",
         {"--active-uplinks=hwnic1"}, {"hwnic0", "hwnic1", "hwnic2"}, 1, {"hwnic1", "hwnic2"}, 1, 1},
        {"active only: an old standby named active is not listed twice",
         {"--active-uplinks=hwnic2,hwnic3"}, {"hwnic0", "hwnic1", "hwnic2"}, 1, {"hwnic2", "hwnic3", "hwnic1"}, 2, 2},
        {"active only: every old adapter active, none standby to keep",
         {"-a", "hwnic3"}, {"hwnic0", "hwnic1"}, 5, {"hwnic3"}, 1, 1},
        {"active only: a trailing comma names nothing more",
         {"--active-uplinks=hwnic1,"}, {"hwnic0"}, 1, {"hwnic1"}, 1, 1},
        {"standby only: the old standby adapters go",
         {"--standby-uplinks=hwnic0"}, {"hwnic0", "hwnic1", "hwnic2"}, 1, {"hwnic0"}, 0, 1},
        {"standby only: the old active adapters not named stay in front",
         {"--standby-uplinks=hwnic1,hwnic3"}, {"hwnic0", "hwnic1", "hwnic2"}, 2, {"hwnic0", "hwnic1", "hwnic3"}, 1, 2},
        // A count beyond the order makes every ordered adapter active; the
        // named standby adapters must still end up behind the active part.
        {"standby only: a count beyond the order",
         {"--standby-uplinks=hwnic1"}, {"hwnic0", "hwnic1"}, 4, {"hwnic0", "hwnic1"}, 1, 4},
        {"standby only: a count beyond a short order",
         {"--standby-uplinks=hwnic2,hwnic3"}, {"hwnic0"}, 3, {"hwnic0", "hwnic2", "hwnic3"}, 1, 3},
        {"standby only: an empty order",
         {"--standby-uplinks=hwnic1"}, {}, 2, {"hwnic1"}, 0, 2},
        {"both lists make the whole order",
         {"--active-uplinks=hwnic2", "--standby-uplinks=hwnic3,hwnic0"}, {"hwnic0", "hwnic1", "hwnic2"}, 2,
         {"hwnic2", "hwnic3", "hwnic0"}, 1, 1},
    };
    // clang-format on
    for (const Case& c : cases) {
        SCOPED_TRACE(c.why);
        // A switch edits a copy of its policy, a port group its own empty one.
        for (bool ownPolicy : {false, true}) {
            NicTeamingPolicy reference = Teaming(c.referenceOrder, c.referenceActive);
            NicTeamingPolicy edited = ownPolicy ? NicTeamingPolicy() : reference;
            EXPECT_EQ(Failover(c.args, edited, reference), Names{});
            EXPECT_EQ(edited.GetUplinkOrder(), c.order);
            EXPECT_EQ(edited.GetMaxActiveUplinks(), c.active);
            EXPECT_EQ(reference.GetMaxActiveUplinks(), c.referenceActiveAfter);
        }
    }
}

std::string Shown(const boost::shared_ptr<MetaObj::MetaStruct>& record, const std::string& field) {
    MetaObj::MetaObjectPtr value = record->GetField(field);
    if (!value) return "(unset)";
    if (auto text = boost::dynamic_pointer_cast<MetaObj::MetaString>(value)) return text->GetValue();
    if (auto number = boost::dynamic_pointer_cast<MetaObj::MetaInt>(value)) return number->ToString();
    if (auto flag = boost::dynamic_pointer_cast<MetaObj::MetaBool>(value)) return flag->GetValue() ? "true" : "false";
    std::string joined;
    for (const auto& element : boost::dynamic_pointer_cast<MetaObj::MetaList>(value)->GetElements()) {
        joined += (joined.empty() ? "" : ",") + boost::dynamic_pointer_cast<MetaObj::MetaString>(element)->GetValue();
    }
    return "[" + joined + "]";
}

TEST(PolicyRecords, EitherSideOfTheAdaptersIsOneUplinksOverride) {
    auto record = MetaObj::MetaStruct::New("PortGroupFailoverPolicy");
    NicTeamingPolicy countOnly;
    countOnly.SetMaxActiveUplinks(1);
    OrvixCli::NetworkNamespace::FillOverrideFields(*record, countOnly);
    EXPECT_EQ(Shown(record, "Override Vswitch Uplinks"), "true");
    EXPECT_EQ(Shown(record, "Override Vswitch Load Balancing"), "false");

    NicTeamingPolicy orderOnly;
    orderOnly.SetUplinkOrder({"hwnic0"});
    OrvixCli::NetworkNamespace::FillOverrideFields(*record, orderOnly);
    EXPECT_EQ(Shown(record, "Override Vswitch Uplinks"), "true");

    OrvixCli::NetworkNamespace::FillOverrideFields(*record, NicTeamingPolicy());
    EXPECT_EQ(Shown(record, "Override Vswitch Uplinks"), "false");
}

}  // namespace
