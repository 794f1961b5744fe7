// Standard switches, port groups and their policies as the library keeps
// them: the host's rules and their messages, and what every change leaves
// in the store.
#include <gtest/gtest.h>

#include "hostctl/Lib.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "support/store_test_util.h"

namespace {

using HostCtl::Lib::HostCtlException;
using HostCtl::Network::NetworkFactory;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;
using PldCtl::Network::VirtualSwitchInfoImpl;
using PldCtl::Store::HostStore;

// Each test works on a fresh copy of the default host.
class Switches : public ::testing::Test {
protected:
    Switches() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        HostStore::ResetDefault();
    }
    ~Switches() override { HostStore::ResetDefault(); }

    std::unique_ptr<HostCtl::Network::VirtualSwitch> Switch(const std::string& name) {
        auto vswitch = NetworkFactory::GetVirtualSwitchById(name);
        if (!vswitch) throw std::runtime_error("no switch " + name);
        return vswitch;
    }

    static std::string MessageOf(const std::function<void()>& action) {
        try {
            action();
        } catch (const HostCtlException& e) {
            return e.GetMessage(0);
        }
        return "(no error)";
    }

    StoreTest::TempDir dir_;
    StoreTest::ScopedEnv db_;
    StoreTest::ScopedEnv profile_;
    VirtualSwitchInfoImpl info_;
};

TEST_F(Switches, ReadTheDefaultHost) {
    auto switches = info_.GetVirtualSwitches();
    ASSERT_EQ(switches.size(), 2u);
    const auto& vSwitch0 = *switches[0];
    EXPECT_EQ(vSwitch0.GetName(), "vSwitch0");
    EXPECT_EQ(vSwitch0.GetClassName(), "stdswitch");
    EXPECT_EQ(vSwitch0.GetNumPorts(), 128);
    EXPECT_EQ(vSwitch0.GetNumConfiguredPorts(), 8);
    EXPECT_EQ(vSwitch0.GetNumUsedPorts(), 7);
    EXPECT_EQ(vSwitch0.GetMTU(), 1500);
    EXPECT_EQ(vSwitch0.GetCDPStatus(), "listen");
    EXPECT_EQ(vSwitch0.GetUplinks(), (std::vector<std::string>{"hwnic0", "hwnic1"}));
    EXPECT_FALSE(vSwitch0.IsBeaconEnabled());
    // Only "Migration" detects failures by beacon probing, overriding its switch.
    EXPECT_EQ(vSwitch0.GetBeaconRequiredBy(), std::vector<std::string>{"Migration"});
    std::vector<std::string> portGroups;
    for (const auto& pg : vSwitch0.GetPortGroups()) portGroups.push_back(pg->GetName());
    EXPECT_EQ(portGroups, (std::vector<std::string>{"Management Network", "VM Network", "Storage", "Migration"}));

    EXPECT_EQ(info_.GetVirtualSwitchByName("vSwitch9"), nullptr);
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Nothing"), nullptr);
    EXPECT_TRUE(PldCtl::Network::PortsetImpl::IsValidVirtualSwitch("vSwitch1"));
    EXPECT_FALSE(PldCtl::Network::PortsetImpl::IsValidVirtualSwitch("dvSwitch0"));
    EXPECT_TRUE(PldCtl::Network::PnicImpl::IsValidPnic("hwnic4"));
    EXPECT_FALSE(PldCtl::Network::PnicImpl::IsValidPnic("hwnic9"));

    PldCtl::Network::PortGroupImpl management("Management Network");
    EXPECT_EQ(management.GetActiveClients(), 1);
    EXPECT_EQ(management.GetVirtualSwitchName(), "vSwitch0");
    EXPECT_EQ(MessageOf([] { PldCtl::Network::PortGroupImpl("Nothing").GetVlanId(); }),
              "Unable to find a port group with the name Nothing");
}

TEST_F(Switches, AddAndRemoveSwitchesWithinTheHostsRules) {
    auto added = info_.AddVirtualSwitchWithPolicy(NicTeamingPolicy::GetDefaultPolicy(),
                                                  PortSecurityPolicy::GetDefaultPolicy(),
                                                  ShapingPolicy::GetDefaultPolicy(),
                                                  HostCtl::Network::NicCapabilities::GetDefaultPolicy(), "vSwitch2", 128);
    EXPECT_EQ(added->GetNumPorts(), 128);
    EXPECT_EQ(Switch("vSwitch2")->GetMTU(), 1500);
    EXPECT_EQ(info_.GetVirtualSwitches().back()->GetName(), "vSwitch2");

    auto add = [&](const std::string& name, long long ports) {
        return MessageOf([&] {
            info_.AddVirtualSwitchWithPolicy(NicTeamingPolicy::GetDefaultPolicy(),
                                             PortSecurityPolicy::GetDefaultPolicy(), ShapingPolicy::GetDefaultPolicy(),
                                             HostCtl::Network::NicCapabilities::GetDefaultPolicy(), name, ports);
        });
    };
    EXPECT_EQ(add("vSwitch2", 8), "A virtual switch with the name vSwitch2 already exists");
    EXPECT_EQ(add("dvSwitch0", 8), "A virtual switch with the name dvSwitch0 already exists");
    EXPECT_EQ(add("bad name", 8), "Invalid virtual switch name 'bad name': use 1 to 32 letters, digits, '.', '-' or '_'");
    EXPECT_EQ(add("vSwitch3", 0), "Invalid number of ports 0: a virtual switch has 1 to 4096 ports");
    // The default host allocates 128 + 64 + the distributed switch's ports, plus vSwitch2's 128.
    const std::string full = add("vSwitch3", 4096);
    EXPECT_EQ(full.rfind("Unable to create virtual switch vSwitch3 with 4096 ports: ", 0), 0u) << full;
    EXPECT_NE(full.find(" of the host's 4608 ports are allocated already"), std::string::npos) << full;

    // Only the switch's uplinks may use its ports for it to go.
    EXPECT_EQ(MessageOf([&] { info_.RemoveVirtualSwitch("vSwitch0"); }),
              "Unable to remove virtual switch vSwitch0: its ports are in use by pld0, pld2, web01.eth0, db01.eth0, "
              "db01.eth1");
    info_.RemoveVirtualSwitch("vSwitch1");
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Lab Isolated"), nullptr);
    EXPECT_EQ(HostStore::Default().CountChildren("ports", "vSwitch1"), 0);
    EXPECT_EQ(MessageOf([&] { info_.RemoveVirtualSwitch("vSwitch1"); }),
              "Unable to find virtual switch with the name vSwitch1");
}

TEST_F(Switches, SettersCheckTheirValues) {
    auto vswitch = Switch("vSwitch1");
    EXPECT_EQ(MessageOf([&] { vswitch->SetMTU(0); }),
              "Invalid MTU 0 for virtual switch vSwitch1: it must be between 1280 and 9000");
    EXPECT_EQ(MessageOf([&] { vswitch->SetMTU(4294968796LL); }),
              "Invalid MTU 4294968796 for virtual switch vSwitch1: it must be between 1280 and 9000");
    vswitch->SetMTU(1280);
    vswitch->SetCDPStatus(2);
    EXPECT_EQ(vswitch->GetMTU(), 1280);
    EXPECT_EQ(Switch("vSwitch1")->GetMTU(), 1280);
    EXPECT_EQ(Switch("vSwitch1")->GetCDPStatus(), "advertise");
    EXPECT_THROW(vswitch->SetCDPStatus(4), HostCtlException);

    auto storage = NetworkFactory::GetPortGroupByName("Storage");
    EXPECT_EQ(MessageOf([&] { storage->SetVlanId(4096); }), "Invalid VLAN ID 4096: it must be between 0 and 4095");
    EXPECT_EQ(MessageOf([&] { storage->SetVlanId(-1); }), "Invalid VLAN ID -1: it must be between 0 and 4095");
    storage->SetVlanId(4095);
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Storage")->GetVlanId(), 4095);
}

TEST_F(Switches, UplinksTakeAPortAndComeBackFree) {
    auto vswitch = Switch("vSwitch1");
    vswitch->AddUplink("hwnic4");
    EXPECT_EQ(vswitch->GetUplinks(), std::vector<std::string>{"hwnic4"});
    EXPECT_EQ(vswitch->GetNumUsedPorts(), 1);
    const auto nic = HostStore::Default().Get("nics", "hwnic4");
    ASSERT_TRUE(nic);
    const auto port = HostStore::Default().Get("ports", std::to_string((*nic)["uplinkPortId"].get<long long>()));
    ASSERT_TRUE(port);
    EXPECT_EQ((*port)["client"], "hwnic4");
    EXPECT_EQ((*port)["portset"], "vSwitch1");

    EXPECT_EQ(MessageOf([&] { Switch("vSwitch0")->AddUplink("hwnic4"); }),
              "Unable to add uplink hwnic4: it is already an uplink of vSwitch1");
    EXPECT_EQ(MessageOf([&] { vswitch->AddUplink("hwnic2"); }),
              "Unable to add uplink hwnic2: it is already an uplink of dvSwitch0");
    EXPECT_EQ(MessageOf([&] { vswitch->AddUplink("hwnic9"); }),
              "Unable to add uplink hwnic9: the host has no physical NIC of that name");
    EXPECT_EQ(MessageOf([&] { vswitch->RemoveUplink("hwnic0"); }),
              "Unable to remove uplink hwnic0: it is not an uplink of virtual switch vSwitch1");

    vswitch->RemoveUplink("hwnic4");
    EXPECT_TRUE(vswitch->GetUplinks().empty());
    EXPECT_EQ(vswitch->GetNumUsedPorts(), 0);
    EXPECT_EQ((*HostStore::Default().Get("nics", "hwnic4"))["uplinkPortId"], 0);

    // Removing an uplink leaves the failover policies alone.
    auto vSwitch0 = Switch("vSwitch0");
    vSwitch0->RemoveUplink("hwnic1");
    EXPECT_EQ(vSwitch0->GetTeamingPolicy().GetUplinkOrder(), (std::vector<std::string>{"hwnic0", "hwnic1"}));
}

TEST_F(Switches, PortGroupsComeAndGoUnlessInUse) {
    auto vswitch = Switch("vSwitch1");
    auto created = vswitch->AddPortGroup("Lab Two");
    EXPECT_EQ(created->GetName(), "Lab Two");
    EXPECT_EQ(created->GetVlanId(), 0);
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Lab Two")->GetVirtualSwitchName(), "vSwitch1");
    EXPECT_EQ(MessageOf([&] { Switch("vSwitch0")->AddPortGroup("Lab Two"); }),
              "A port group with the name Lab Two already exists on virtual switch vSwitch1");
    EXPECT_EQ(MessageOf([&] { vswitch->AddPortGroup(" Lead"); }),
              "Invalid port group name ' Lead': use 1 to 64 printable characters, not beginning or ending with a "
              "blank");
    EXPECT_EQ(MessageOf([&] { vswitch->RemovePortGroup("Storage"); }),
              "Unable to find port group Storage on virtual switch vSwitch1");
    EXPECT_EQ(MessageOf([&] { Switch("vSwitch0")->RemovePortGroup("VM Network"); }),
              "Unable to remove port group VM Network: it is in use by web01.eth0, db01.eth0");
    vswitch->RemovePortGroup("Lab Two");
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Lab Two"), nullptr);

    std::vector<std::string> all;
    for (const auto& pg : PldCtl::Network::NetworkInfoImpl().GetAllPortGroups()) all.push_back(pg->GetName());
    EXPECT_EQ(all, (std::vector<std::string>{"Management Network", "VM Network", "Storage", "Migration",
                                             "Lab Isolated"}));
}

TEST_F(Switches, PortGroupPoliciesOverlayTheirSwitch) {
    auto vmNetwork = NetworkFactory::GetPortGroupByName("VM Network");
    // It overrides promiscuous mode only and inherits the other two.
    PortSecurityPolicy own = vmNetwork->GetOwnSecurityPolicy();
    EXPECT_TRUE(own.IsAllowPromiscuousSet());
    EXPECT_FALSE(own.IsAllowMacAddressChangeSet());
    PortSecurityPolicy inForce = vmNetwork->GetSecurityPolicy();
    EXPECT_TRUE(inForce.GetAllowPromiscuous());
    EXPECT_TRUE(inForce.GetAllowMacAddressChange());

    // A change of the switch shows through every field the port group inherits.
    auto vSwitch0 = Switch("vSwitch0");
    PortSecurityPolicy switchPolicy = vSwitch0->GetSecurityPolicy();
    switchPolicy.SetAllowMacAddressChange(false);
    switchPolicy.SetAllowPromiscuous(false);
    vSwitch0->SetSecurityPolicy(switchPolicy);
    inForce = NetworkFactory::GetPortGroupByName("VM Network")->GetSecurityPolicy();
    EXPECT_TRUE(inForce.GetAllowPromiscuous());
    EXPECT_FALSE(inForce.GetAllowMacAddressChange());

    // Unsetting everything makes it inherit everything.
    own.UnsetAll();
    vmNetwork->SetOwnSecurityPolicy(own);
    auto reread = NetworkFactory::GetPortGroupByName("VM Network");
    EXPECT_FALSE(reread->GetOwnSecurityPolicy().IsAllowPromiscuousSet());
    EXPECT_FALSE(reread->GetSecurityPolicy().GetAllowPromiscuous());

    NicTeamingPolicy teaming = reread->GetTeamingPolicy();
    EXPECT_EQ(teaming.GetUplinkOrder(), (std::vector<std::string>{"hwnic1", "hwnic0"}));
    ShapingPolicy shaping;
    shaping.SetEnabled(true);
    shaping.SetPeakBps(2000);
    reread->SetOwnShapingPolicy(shaping);
    ShapingPolicy shapingInForce = NetworkFactory::GetPortGroupByName("VM Network")->GetShapingPolicy();
    EXPECT_TRUE(shapingInForce.GetEnabled());
    EXPECT_EQ(shapingInForce.GetPeakBps(), 2000u);
    EXPECT_EQ(shapingInForce.GetAverageBps(), vSwitch0->GetShapingPolicy().GetAverageBps());

    NicTeamingPolicy twice = NicTeamingPolicy::GetDefaultPolicy();
    twice.SetUplinkOrder({"hwnic0", "hwnic0"});
    EXPECT_EQ(MessageOf([&] { vSwitch0->SetTeamingPolicy(twice); }),
              "Invalid failover policy for virtual switch vSwitch0: an uplink appears more than once in its order");
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

TEST_F(Switches, InjectedFaultsReachTheirOperation) {
    HostStore::Default().AddFault({0, "VirtualSwitchImpl::SetMTU", "vSwitch1", "MTU change refused by the driver", 1});
    EXPECT_EQ(Switch("vSwitch0")->GetMTU(), 1500);
    auto vswitch = Switch("vSwitch1");
    EXPECT_EQ(MessageOf([&] { vswitch->SetMTU(9000); }), "MTU change refused by the driver");
    EXPECT_EQ(vswitch->GetMTU(), 9000);  // the profile's value, untouched
    vswitch->SetMTU(1500);
    EXPECT_EQ(Switch("vSwitch1")->GetMTU(), 1500);
}

}  // namespace
