// The shared policy options: how a command line edits a failover, security
// or shaping policy, which mistakes are reported and in what order, and the
// records the get commands build from a policy. Options are parsed by the
// framework's real parser; NIC names are checked against the default host.
#include <gtest/gtest.h>

#include <limits>

#include "support/store_test_util.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"
#include "vswitch/VirtualSwitchPortGroupPolicyShapingSet.h"
#include "framework/Runner.h"
#include "hostctl/HostSession.h"

namespace {

using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;
using OrvixCli::NetworkNamespace::SplitUplinks;
using Names = std::vector<std::string>;

using AddParameters = void (*)(boost::shared_ptr<CallSpec::InputSpec>);

boost::shared_ptr<CallSpec::Input> Parse(AddParameters add, const Names& args) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    add(declared);
    return AutoCli::ParseArguments(*declared, args);
}

// A teaming policy as a switch holds it: every field set.
NicTeamingPolicy Teaming(const Names& order, int maxActive) {
    NicTeamingPolicy policy = NicTeamingPolicy::GetDefaultPolicy();
    policy.SetUplinkOrder(order);
    policy.SetMaxActiveUplinks(maxActive);
    return policy;
}

// NIC names are checked against a fresh default host, whose NICs are hwnic0
// to hwnic5. The tests pass their own switch uplinks, so hwnic4 (a NIC of
// the host) can be one that is not on the switch.
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
        OrvixCli::NetworkNamespace::SetFailoverPolicy(Parse(OrvixCli::NetworkNamespace::AddFailoverParameters, args),
                                                      output, edited, reference, uplinks);
        return output->GetErrors();
    }

    // Applies failover options to a copy of `reference`, as a switch does.
    Names FailoverOnSwitch(const Names& args, NicTeamingPolicy& edited, const NicTeamingPolicy& reference) {
        NicTeamingPolicy shown = reference;
        edited = reference;
        return Failover(args, edited, shown);
    }

    Names Shaping(const Names& args, ShapingPolicy& policy, bool requireAll = false) {
        boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
        OrvixCli::NetworkNamespace::SetShapingPolicy(Parse(OrvixCli::NetworkNamespace::AddShapingParameters, args),
                                                     output, policy, requireAll);
        return output->GetErrors();
    }

    StoreTest::TempDir dir_;
    StoreTest::ScopedEnv db_;
    StoreTest::ScopedEnv profile_;
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

TEST_F(PolicyOptions, ActiveUplinksOnlyKeepTheOldStandbyAdapters) {
    NicTeamingPolicy edited;
    NicTeamingPolicy reference = Teaming({"hwnic0", "hwnic1", "hwnic2"}, 1);
    EXPECT_EQ(Failover({"--active-uplinks=hwnic1"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic1", "hwnic2"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);
    // The reference policy takes the new count as well.
    EXPECT_EQ(reference.GetMaxActiveUplinks(), 1);

    // An old standby adapter named active is not listed twice.
    edited = NicTeamingPolicy();
    reference = Teaming({"hwnic0", "hwnic1", "hwnic2"}, 1);
    EXPECT_EQ(Failover({"--active-uplinks=hwnic2,hwnic3"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic2", "hwnic3", "hwnic1"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 2);
    EXPECT_EQ(reference.GetMaxActiveUplinks(), 2);

    // With every old adapter active there is no standby adapter to keep.
    edited = NicTeamingPolicy();
    reference = Teaming({"hwnic0", "hwnic1"}, 5);
    EXPECT_EQ(Failover({"-a", "hwnic3"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), Names{"hwnic3"});
}

TEST_F(PolicyOptions, StandbyUplinksOnlyKeepTheOldActiveAdaptersAndDropTheOldStandbyOnes) {
    NicTeamingPolicy edited;
    EXPECT_EQ(FailoverOnSwitch({"--standby-uplinks=hwnic0"}, edited, Teaming({"hwnic0", "hwnic1", "hwnic2"}, 1)),
              Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), Names{"hwnic0"});
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 0);

    EXPECT_EQ(FailoverOnSwitch({"--standby-uplinks=hwnic1,hwnic3"}, edited, Teaming({"hwnic0", "hwnic1", "hwnic2"}, 2)),
              Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic0", "hwnic1", "hwnic3"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);

    // Only the edited policy's count changes.
    NicTeamingPolicy reference = Teaming({"hwnic0", "hwnic1"}, 2);
    edited = reference;
    EXPECT_EQ(Failover({"-s", "hwnic0"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);
    EXPECT_EQ(reference.GetMaxActiveUplinks(), 2);
}

TEST_F(PolicyOptions, StandbyUplinksOnlyCountFromTheActiveAdaptersTheOrderReallyHas) {
    // A count beyond the order makes every ordered adapter active; the
    // named standby adapters must still end up behind the active part.
    NicTeamingPolicy edited;
    EXPECT_EQ(FailoverOnSwitch({"--standby-uplinks=hwnic1"}, edited, Teaming({"hwnic0", "hwnic1"}, 4)), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic0", "hwnic1"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);

    EXPECT_EQ(FailoverOnSwitch({"--standby-uplinks=hwnic2,hwnic3"}, edited, Teaming({"hwnic0"}, 3)), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic0", "hwnic2", "hwnic3"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);

    EXPECT_EQ(FailoverOnSwitch({"--standby-uplinks=hwnic1"}, edited, Teaming({}, 2)), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), Names{"hwnic1"});
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 0);
}

TEST_F(PolicyOptions, BothListsMakeTheWholeOrder) {
    NicTeamingPolicy edited;
    NicTeamingPolicy reference = Teaming({"hwnic0", "hwnic1", "hwnic2"}, 2);
    EXPECT_EQ(Failover({"--active-uplinks=hwnic2", "--standby-uplinks=hwnic3,hwnic0"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic2", "hwnic3", "hwnic0"}));
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);
    EXPECT_EQ(reference.GetMaxActiveUplinks(), 1);
}

TEST_F(PolicyOptions, ANameTwiceRefusesTheOrderButKeepsTheCounts) {
    NicTeamingPolicy edited;  // a port group's own policy: nothing set
    NicTeamingPolicy reference = Teaming({"hwnic0", "hwnic1"}, 1);
    EXPECT_EQ(Failover({"--active-uplinks=hwnic0,hwnic0"}, edited, reference),
              Names{"some NICs appear in the input for more than once."});
    EXPECT_FALSE(edited.IsUplinkOrderSet());
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 2);

    edited = NicTeamingPolicy();
    EXPECT_EQ(Failover({"-a", "hwnic1", "-s", "hwnic2,hwnic1"}, edited, reference),
              Names{"some NICs appear in the input for more than once."});
    EXPECT_FALSE(edited.IsUplinkOrderSet());
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);
}

TEST_F(PolicyOptions, BadNamesAreReportedOneByOneAndTheGoodOnesKept) {
    NicTeamingPolicy edited;
    NicTeamingPolicy reference = Teaming({"hwnic0"}, 1);
    EXPECT_EQ(Failover({"--active-uplinks=hwnic9,hwnic4,,hwnic1"}, edited, reference),
              (Names{"Unknown NIC name in active uplinks : hwnic9", "NIC is not connected to the vswitch : hwnic4",
                     "Unknown NIC name in active uplinks : "}));
    EXPECT_EQ(edited.GetUplinkOrder(), Names{"hwnic1"});
    EXPECT_EQ(edited.GetMaxActiveUplinks(), 1);

    edited = NicTeamingPolicy();
    EXPECT_EQ(Failover({"--standby-uplinks=,hwnic2,hwnic5"}, edited, reference),
              (Names{"Unknown NIC name in standby uplinks : ", "NIC is not connected to the vswitch : hwnic5"}));
    EXPECT_EQ(edited.GetUplinkOrder(), (Names{"hwnic0", "hwnic2"}));

    // A trailing comma names nothing more.
    edited = NicTeamingPolicy();
    EXPECT_EQ(Failover({"--active-uplinks=hwnic1,"}, edited, reference), Names{});
    EXPECT_EQ(edited.GetUplinkOrder(), Names{"hwnic1"});
}

TEST_F(PolicyOptions, FailoverSettingsMapToThePolicy) {
    const std::pair<const char*, HostCtl::Network::TeamPolicyType> words[] = {
        {"portid", HostCtl::Network::TEAM_PORT_ID},
        {"iphash", HostCtl::Network::TEAM_IP_HASH},
        {"mac", HostCtl::Network::TEAM_SRC_MAC},
        {"explicit", HostCtl::Network::TEAM_EXPLICIT},
    };
    for (const auto& word : words) {
        NicTeamingPolicy edited;
        NicTeamingPolicy reference = Teaming({"hwnic0"}, 1);
        EXPECT_EQ(Failover({std::string("--load-balancing=") + word.first}, edited, reference), Names{});
        EXPECT_EQ(edited.GetTeamingPolicy(), word.second) << word.first;
        // Options not given leave their fields unset, the uplinks included.
        EXPECT_FALSE(edited.IsLinkCriteriaSet());
        EXPECT_FALSE(edited.IsUplinkOrderSet());
        EXPECT_FALSE(edited.IsMaxActiveUplinksSet());
    }

    NicTeamingPolicy edited;
    NicTeamingPolicy reference = Teaming({"hwnic0"}, 1);
    EXPECT_EQ(Failover({"-f", "beacon", "--failback=true", "--notify-switches=false"}, edited, reference), Names{});
    EXPECT_TRUE(edited.GetLinkCriteria().IsBeaconChecking());
    EXPECT_FALSE(edited.GetRollingRestoration());
    EXPECT_TRUE(edited.IsRollingRestorationSet());
    EXPECT_FALSE(edited.GetNotifySwitchOnFailure());
    EXPECT_EQ(Failover({"-f", "link", "--failback=false"}, edited, reference), Names{});
    EXPECT_FALSE(edited.GetLinkCriteria().IsBeaconChecking());
    EXPECT_TRUE(edited.GetRollingRestoration());
}

TEST_F(PolicyOptions, WordsTheParserWouldRefuseAreStillGuarded) {
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    input->SetString("load-balancing", "roundrobin");
    input->SetString("failure-detection", "probe");
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    NicTeamingPolicy edited;
    NicTeamingPolicy reference = Teaming({"hwnic0"}, 1);
    Names uplinks = {"hwnic0"};
    OrvixCli::NetworkNamespace::SetFailoverPolicy(input, output, edited, reference, uplinks);
    EXPECT_EQ(output->GetErrors(),
              (Names{"Unknown Load Balancing policy: roundrobin", "Unknown failure detection type probe"}));
    EXPECT_FALSE(edited.IsTeamingPolicySet());
    EXPECT_FALSE(edited.IsLinkCriteriaSet());
}

TEST_F(PolicyOptions, ShapingOnDemandsAllThreeValuesInOrder) {
    ShapingPolicy policy;
    EXPECT_EQ(Shaping({"--enabled=true"}, policy),
              (Names{"Missing required parameter --avg-bandwidth", "Missing required parameter --peak-bandwidth",
                     "Missing required parameter --burst-size"}));
    EXPECT_EQ(Shaping({"--enabled=true", "--avg-bandwidth=1000"}, policy),
              (Names{"Missing required parameter --peak-bandwidth", "Missing required parameter --burst-size"}));
    EXPECT_EQ(Shaping({"-e", "true", "-b", "1", "-k", "2", "-t", "3"}, policy), Names{});
    EXPECT_TRUE(policy.GetEnabled());
    EXPECT_EQ(policy.GetAverageBps(), 1000u);
    EXPECT_EQ(policy.GetPeakBps(), 2000u);
    EXPECT_EQ(policy.GetBurstSize(), 384u);

    // An already enabled policy takes one value alone, unless all are required.
    ShapingPolicy enabled = ShapingPolicy::GetDefaultPolicy();
    enabled.SetEnabled(true);
    EXPECT_EQ(Shaping({"--avg-bandwidth=1000"}, enabled), Names{});
    EXPECT_EQ(enabled.GetAverageBps(), 1000000u);
    EXPECT_EQ(Shaping({"--burst-size=1"}, enabled), Names{});
    EXPECT_EQ(enabled.GetBurstSize(), 128u);
    EXPECT_EQ(Shaping({"--peak-bandwidth=7"}, enabled, true),
              (Names{"Missing required parameter --avg-bandwidth", "Missing required parameter --burst-size"}));
    EXPECT_EQ(enabled.GetPeakBps(), 7000u);
}

TEST_F(PolicyOptions, ShapingOffIgnoresTheValues) {
    ShapingPolicy policy = ShapingPolicy::GetDefaultPolicy();
    const ShapingPolicy before = policy;
    EXPECT_EQ(Shaping({"--avg-bandwidth=1000"}, policy, true), Names{});
    EXPECT_EQ(policy, before);

    ShapingPolicy enabled = ShapingPolicy::GetDefaultPolicy();
    enabled.SetEnabled(true);
    EXPECT_EQ(Shaping({"--enabled=false", "--avg-bandwidth=1000"}, enabled), Names{});
    EXPECT_FALSE(enabled.GetEnabled());
    EXPECT_EQ(enabled.GetAverageBps(), before.GetAverageBps());

    // A port group's own policy that does not set enabled does not shape.
    ShapingPolicy own;
    EXPECT_EQ(Shaping({"--peak-bandwidth=5"}, own), Names{});
    EXPECT_FALSE(own.IsPeakBpsSet());
}

TEST_F(PolicyOptions, ShapingValuesTooLargeToConvertAreRefused) {
    const unsigned long long max = std::numeric_limits<unsigned long long>::max();
    ShapingPolicy policy;
    EXPECT_EQ(Shaping({"-e", "true", "-b", std::to_string(max / 1000), "-k", std::to_string(max / 1000), "-t",
                       std::to_string(max / 128)},
                      policy),
              Names{});
    EXPECT_EQ(policy.GetAverageBps(), max / 1000 * 1000);
    EXPECT_EQ(policy.GetPeakBps(), max / 1000 * 1000);
    EXPECT_EQ(policy.GetBurstSize(), max / 128 * 128);

    ShapingPolicy untouched;
    EXPECT_EQ(Shaping({"-e", "true", "-b", std::to_string(max / 1000 + 1), "-k", "9223372036854775807", "-t",
                       std::to_string(max / 128 + 1)},
                      untouched),
              (Names{"Value of --avg-bandwidth is too large", "Value of --peak-bandwidth is too large",
                     "Value of --burst-size is too large"}));
    EXPECT_FALSE(untouched.IsAverageBpsSet());
    EXPECT_FALSE(untouched.IsPeakBpsSet());
    EXPECT_FALSE(untouched.IsBurstSizeSet());
}

TEST_F(PolicyOptions, SecuritySetsOnlyTheFlagsGiven) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    OrvixCli::NetworkNamespace::AddSecurityParameters(declared);
    PortSecurityPolicy own;
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    OrvixCli::NetworkNamespace::SetSecurityPolicy(AutoCli::ParseArguments(*declared, {"-o", "true", "-f", "false"}), output,
                                                  own);
    EXPECT_FALSE(output->HasError());
    EXPECT_TRUE(own.IsAllowPromiscuousSet());
    EXPECT_TRUE(own.GetAllowPromiscuous());
    EXPECT_FALSE(own.IsAllowMacAddressChangeSet());
    EXPECT_TRUE(own.IsAllowForgedTransmitsSet());
    EXPECT_FALSE(own.GetAllowForgedTransmits());
}

TEST(PortGroupShaping, ReportsEachValueSetNowhereInOrderPeakAverageBurst) {
    ShapingPolicy own;
    own.SetEnabled(true);
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    OrvixCli::NetworkNamespace::ReportUnsetShapingValues(*output, own, ShapingPolicy());
    EXPECT_EQ(output->GetErrors(),
              (Names{"Unable to set shaping policy. A Peak BPS value must be set on either this port group or on the "
                     "parent virtual switch.",
                     "Unable to set shaping policy. An Average BPS value must be set on either this port group or on "
                     "the parent virtual switch.",
                     "Unable to set shaping policy. A Burst Size value must be set on either this port group or on "
                     "the parent virtual switch."}));

    // A value set on either side is enough.
    ShapingPolicy inForce;
    inForce.SetPeakBps(1);
    own.SetBurstSize(1);
    output = CallSpec::Output::New();
    OrvixCli::NetworkNamespace::ReportUnsetShapingValues(*output, own, inForce);
    EXPECT_EQ(output->GetErrors(),
              Names{"Unable to set shaping policy. An Average BPS value must be set on either this port group or on "
                    "the parent virtual switch."});
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

TEST(PolicyRecords, AdaptersFollowTheOrderTheCountAndTheSwitchUplinks) {
    auto record = MetaObj::MetaStruct::New("VirtualSwitchFailoverPolicy");
    OrvixCli::NetworkNamespace::FillPolicyFields(*record, Teaming({"hwnic2", "hwnic0", "hwnic1"}, 2),
                                                 {"hwnic0", "hwnic1", "hwnic2", "hwnic3", "hwnic4"});
    EXPECT_EQ(Shown(record, "Active Adapters"), "[hwnic2,hwnic0]");
    EXPECT_EQ(Shown(record, "Standby Adapters"), "[hwnic1]");
    EXPECT_EQ(Shown(record, "Unused Adapters"), "[hwnic3,hwnic4]");

    NicTeamingPolicy beyond = Teaming({"hwnic1", "hwnic0"}, 5);
    beyond.SetTeamingPolicy(HostCtl::Network::TEAM_SRC_MAC);
    beyond.SetRollingRestoration(true);
    HostCtl::Network::LinkCriteriaSelectionPolicy beacon;
    beacon.SetBeacon(false);
    beyond.SetLinkCriteria(beacon);
    OrvixCli::NetworkNamespace::FillPolicyFields(*record, beyond, {"hwnic0", "hwnic1"});
    EXPECT_EQ(Shown(record, "Active Adapters"), "[hwnic1,hwnic0]");
    EXPECT_EQ(Shown(record, "Standby Adapters"), "[]");
    EXPECT_EQ(Shown(record, "Unused Adapters"), "[]");
    EXPECT_EQ(Shown(record, "Load Balancing"), "srcmac");
    EXPECT_EQ(Shown(record, "Network Failure Detection"), "beacon");
    EXPECT_EQ(Shown(record, "Failback"), "false");

    NicTeamingPolicy own;
    own.SetMaxActiveUplinks(1);
    OrvixCli::NetworkNamespace::FillOverrideFields(*record, own);
    EXPECT_EQ(Shown(record, "Override Vswitch Uplinks"), "true");
    EXPECT_EQ(Shown(record, "Override Vswitch Load Balancing"), "false");
}

TEST(PolicyRecords, ShapingValuesAreShownInKbpsAndKibOrMinusOneWhenOff) {
    ShapingPolicy policy = ShapingPolicy::GetDefaultPolicy();
    policy.SetAverageBps(1999);
    policy.SetPeakBps(std::numeric_limits<unsigned long long>::max());
    policy.SetBurstSize(255);
    auto record = MetaObj::MetaStruct::New("VirtualSwitchTrafficShapingPolicy");
    OrvixCli::NetworkNamespace::FillPolicyFields(*record, policy);
    EXPECT_EQ(Shown(record, "Enabled"), "false");
    EXPECT_EQ(Shown(record, "Average Bandwidth"), "-1");
    EXPECT_EQ(Shown(record, "Burst Size"), "-1");

    policy.SetEnabled(true);
    OrvixCli::NetworkNamespace::FillPolicyFields(*record, policy);
    EXPECT_EQ(Shown(record, "Average Bandwidth"), "1");
    EXPECT_EQ(Shown(record, "Peak Bandwidth"), "18446744073709551");
    EXPECT_EQ(Shown(record, "Burst Size"), "1");
}

}  // namespace
