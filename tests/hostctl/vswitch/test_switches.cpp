// Standard switches and port groups as the library keeps them, where the
// transcripts cannot look: what a change leaves in the store, the rules the
// commands check before the library does, and changes from older snapshots.
#include <gtest/gtest.h>

#include "hostctl/HostFixture.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace {

using HostCtl::Lib::HostCtlException;

class Switches : public FreshHost {
protected:
    static std::unique_ptr<HostCtl::Network::VirtualSwitch> Switch(const std::string& name) {
        auto vswitch = NetworkFactory::GetVirtualSwitchById(name);
        if (!vswitch) throw std::runtime_error("no switch " + name);
        return vswitch;
    }
};

TEST_F(Switches, UplinksTakeAPortOfTheSwitchsBlockAndGiveItBack) {
    // The failover policies keep naming a removed uplink.
    auto vSwitch0 = Switch("vSwitch0");
    vSwitch0->RemoveUplink("hwnic1");
    EXPECT_EQ(vSwitch0->GetUplinks(), std::vector<std::string>{"hwnic0"});
    EXPECT_EQ(vSwitch0->GetTeamingPolicy().GetUplinkOrder(), (std::vector<std::string>{"hwnic0", "hwnic1"}));
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("VM Network")->GetTeamingPolicy().GetUplinkOrder(),
              (std::vector<std::string>{"hwnic1", "hwnic0"}));
    EXPECT_EQ(Stored("nics", "name", "hwnic1")["uplinkPortId"], 0);

    auto vswitch = Switch("vSwitch1");
    vswitch->AddUplink("hwnic4");
    EXPECT_EQ(vswitch->GetUplinks(), std::vector<std::string>{"hwnic4"});
    EXPECT_EQ(vswitch->GetNumUsedPorts(), 1);
    // The next id of the switch's own block (one free port there already).
    const long long id = Stored("nics", "name", "hwnic4")["uplinkPortId"].get<long long>();
    EXPECT_EQ(id, 50331650);
    EXPECT_EQ(Stored("ports", "id", id),
              (Json{{"id", id}, {"portset", "vSwitch1"}, {"type", "uplink"}, {"client", "hwnic4"}}));
    vswitch->AddUplink("hwnic1");
    EXPECT_EQ(Stored("nics", "name", "hwnic1")["uplinkPortId"], id + 1);

    vswitch->RemoveUplink("hwnic4");
    EXPECT_EQ(vswitch->GetUplinks(), std::vector<std::string>{"hwnic1"});
    EXPECT_EQ(vswitch->GetNumUsedPorts(), 1);
    EXPECT_TRUE(Stored("ports", "id", id).is_null());
    EXPECT_EQ(Stored("nics", "name", "hwnic4")["uplinkPortId"], 0);
}

TEST_F(Switches, TheLibraryChecksWhatTheCommandsCheckFirst) {
    PldCtl::Network::VirtualSwitchInfoImpl info;
    EXPECT_EQ(MessageOf([&] {
                  info.AddVirtualSwitchWithPolicy(NicTeamingPolicy::GetDefaultPolicy(),
                                                  PortSecurityPolicy::GetDefaultPolicy(),
                                                  ShapingPolicy::GetDefaultPolicy(),
                                                  HostCtl::Network::NicCapabilities::GetDefaultPolicy(), "vSwitch3", 0);
              }),
              "Invalid number of ports 0: a virtual switch has 1 to 4096 ports");
    auto storage = NetworkFactory::GetPortGroupByName("Storage");
    EXPECT_EQ(MessageOf([&] { storage->SetVlanId(4096); }), "Invalid VLAN ID 4096: it must be between 0 and 4095");
    EXPECT_EQ(MessageOf([&] { storage->SetVlanId(-1); }), "Invalid VLAN ID -1: it must be between 0 and 4095");
    auto vswitch = Switch("vSwitch0");
    EXPECT_THROW(vswitch->SetCDPStatus(4), HostCtlException);
    NicTeamingPolicy twice = NicTeamingPolicy::GetDefaultPolicy();
    twice.SetUplinkOrder({"hwnic0", "hwnic0"});
    EXPECT_EQ(MessageOf([&] { vswitch->SetTeamingPolicy(twice); }),
              "Invalid failover policy for virtual switch vSwitch0: an uplink appears more than once in its order");

    // A refused change leaves the snapshot as it was.
    HostSim({"fault", "add", "VirtualSwitchImpl::SetMTU", "--key", "vSwitch1", "--message", "MTU change refused",
             "--count", "1"});
    auto vSwitch1 = Switch("vSwitch1");
    EXPECT_EQ(MessageOf([&] { vSwitch1->SetMTU(1500); }), "MTU change refused");
    EXPECT_EQ(vSwitch1->GetMTU(), 9000);
}

TEST_F(Switches, PortGroupNamesArePrintableUtf8) {
    auto vswitch = Switch("vSwitch1");
    const std::size_t before = Dump()["portgroups"].size();
    const std::vector<std::string> refused = {
        "pg\xc3",            // cut short
        "pg\xc3(",           // a lead byte without its continuation
        "\xc0\xaf",          // overlong '/'
        "\xe0\x80\xaf",      // overlong '/', three bytes
        "\xed\xa0\x80",      // a surrogate
        "\xf4\x90\x80\x80",  // beyond U+10FFFF
        "\xff",
        "tab\there",
        "del\x7f",
        "esc\x1b[31m",
        "pg\xc2\x9b",  // U+009B, the one-byte escape introducer
        std::string(65, 'a'),
    };
    for (const std::string& name : refused) {
        EXPECT_EQ(MessageOf([&] { vswitch->AddPortGroup(name); }),
                  "Invalid port group name '" + name +
                      "': use 1 to 64 printable characters, not beginning or ending with a blank");
    }
    EXPECT_EQ(Dump()["portgroups"].size(), before);

    // The limit counts characters: 64 two-byte letters fit.
    std::string letters;
    for (int i = 0; i < 64; ++i) letters += "\xc3\xa9";
    for (const std::string& name : {letters, std::string("\xe6\x97\xa5 \xf0\x9f\x96\xa7 \xc2\xa0")}) {
        EXPECT_EQ(vswitch->AddPortGroup(name)->GetName(), name);
    }
    EXPECT_EQ(Dump()["portgroups"].size(), before + 2);
}

TEST_F(Switches, PolicyEditsFromOlderSnapshotsKeepEachOther) {
    // Two commands read the same policies, each changes one field and writes
    // back what it read: neither may undo the other.
    auto first = Switch("vSwitch0");
    auto second = Switch("vSwitch0");
    PortSecurityPolicy promiscuous = first->GetSecurityPolicy();
    promiscuous.SetAllowPromiscuous(true);
    first->SetSecurityPolicy(promiscuous);
    PortSecurityPolicy noMacChange = second->GetSecurityPolicy();
    noMacChange.SetAllowMacAddressChange(false);
    second->SetSecurityPolicy(noMacChange);
    PortSecurityPolicy both = Switch("vSwitch0")->GetSecurityPolicy();
    EXPECT_TRUE(both.GetAllowPromiscuous());
    EXPECT_FALSE(both.GetAllowMacAddressChange());

    auto pgFirst = NetworkFactory::GetPortGroupByName("Storage");
    auto pgSecond = NetworkFactory::GetPortGroupByName("Storage");
    NicTeamingPolicy notify = pgFirst->GetOwnTeamingPolicy();
    notify.SetNotifySwitchOnFailure(false);
    pgFirst->SetOwnTeamingPolicy(notify);
    NicTeamingPolicy inherit = pgSecond->GetOwnTeamingPolicy();
    inherit.UnsetAll();  // like --use-vswitch: gives back what it had overridden
    pgSecond->SetOwnTeamingPolicy(inherit);
    NicTeamingPolicy own = NetworkFactory::GetPortGroupByName("Storage")->GetOwnTeamingPolicy();
    EXPECT_TRUE(own.IsNotifySwitchOnFailureSet());
    EXPECT_FALSE(own.GetNotifySwitchOnFailure());
    EXPECT_FALSE(own.IsTeamingPolicySet());
    EXPECT_FALSE(own.IsRollingRestorationSet());
}

}  // namespace

namespace {

TEST_F(Switches, NewPortIdsFitThirtyTwoBitsAndAreFree) {
    // vSwitch0's highest port takes the very last id: the next id of its
    // block and a block after every id would both pass 32 bits, so the
    // uplink port goes to the lowest block no port uses (block 1).
    Switch("vSwitch0");  // the library makes the host on first use
    RawSql(
        "UPDATE object SET key = '4294967295', doc = json_set(doc, '$.id', 4294967295) "
        "WHERE section = 'ports' AND key = '33554441'");
    Switch("vSwitch0")->AddUplink("hwnic4");
    const long long id = Stored("nics", "name", "hwnic4")["uplinkPortId"].get<long long>();
    EXPECT_EQ(id, (1LL << 24) + 1);
    EXPECT_EQ(Stored("ports", "id", id)["portset"], "vSwitch0");
}

}  // namespace
