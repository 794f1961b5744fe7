// Kernel interfaces as the library keeps them: what adding and removing one
// leaves in the store (interface, port, DV port connection), the refusals
// that must write nothing, snapshots against fresh reads, tags and lists.
#include "hostctl/ip/IpHost.h"

namespace {

using ::testing::HasSubstr;

class Interfaces : public IpHost {};

TEST_F(Interfaces, AddOnAPortGroupTakesAPortAndRemoveGivesItBack) {
    PortGroupImpl vmNetwork("VM Network");
    IpConfig config;
    config.SetIpv4Address(Ipv4Address("192.0.2.50"));
    config.SetIpv4Netmask(Ipv4Address("255.255.255.0"));
    config.SetDhcpDns(true);
    config.AddIpv6Network(Ipv6Network("2001:db8:40::5/64"));
    auto nic = info_.AddPalladNic(&vmNetwork, kDefault, config, MacAddress(), 0, 0, "");

    // The lowest free name, the first free address of the host's range, the
    // next port of the switch's block.
    EXPECT_EQ(nic->GetName(), "pld3");
    EXPECT_EQ(nic->GetMacAddress().GetStringAddress(), "02:a1:01:00:00:04");
    EXPECT_EQ(nic->GetMtu(), 1500);
    EXPECT_EQ(nic->GetPortId(), 33554443);
    EXPECT_EQ(Stored("ports", "id", 33554443), (Json{{"id", 33554443},
                                                     {"portset", "vSwitch0"},
                                                     {"type", "kernel"},
                                                     {"client", "pld3"},
                                                     {"portgroup", "VM Network"}}));
    const Json stored = Stored("interfaces", "name", "pld3");
    EXPECT_EQ(stored["netstack"], kDefault);
    EXPECT_EQ(stored["portgroup"], "VM Network");
    EXPECT_EQ(stored["ipv4Mode"], "static");
    EXPECT_EQ(stored["ipv4Address"], "192.0.2.50");
    EXPECT_EQ(stored["dhcpDns"], true);
    EXPECT_EQ(stored["ipv6Addresses"],
              (Json::array({{{"address", "2001:db8:40::5/64"}, {"type", "static"}, {"status", "preferred"}}})));

    auto point = Nic("pld3")->GetConnectionPoint();
    ASSERT_TRUE(point);
    EXPECT_EQ(point->GetType(), ConnectionPoint::TYPE_PORT_GROUP);
    EXPECT_EQ(point->GetPortGroupName(), "VM Network");
    EXPECT_EQ(point->GetPortsetName(), "vSwitch0");
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("VM Network")->GetVirtualSwitch()->GetNumUsedPorts(), 9);

    nic->Remove();
    EXPECT_TRUE(Stored("interfaces", "name", "pld3").is_null());
    EXPECT_TRUE(Stored("ports", "id", 33554443).is_null());
    EXPECT_EQ(MessageOf([&] { nic->Remove(); }), "Interface pld3 does not exist");
}

TEST_F(Interfaces, AddOnADvPortRecordsTheConnectionAndRemoveByPointFreesThePort) {
    DVPortImpl probe = DvPort("11");
    EXPECT_TRUE(probe.IsValid());
    EXPECT_EQ(probe.GetConnectionId(), 0u);
    EXPECT_EQ(probe.GetPortsetName(), "dvSwitch0");
    probe.SetConnectionId(1700000000);
    EXPECT_EQ(probe.GetDVPortParam().connectionId, 1700000000u);

    auto nic = info_.AddPalladNic(&probe, "migrix", IpConfig(), MacAddress("02:a1:0f:00:00:09"), 0, 9000, "pld7");
    EXPECT_EQ(Stored("dvports", "id", "11")["connectionId"], 1700000000);
    const Json port = Stored("ports", "client", "pld7");
    EXPECT_EQ(port["portset"], "dvSwitch0");
    EXPECT_EQ(port["dvPortId"], "11");
    EXPECT_EQ(port["id"], 67108874);
    EXPECT_FALSE(port.contains("portgroup"));
    EXPECT_EQ(Stored("interfaces", "name", "pld7")["mtu"], 9000);

    auto point = Nic("pld7")->GetConnectionPoint();
    ASSERT_TRUE(point);
    EXPECT_EQ(point->GetType(), ConnectionPoint::TYPE_DV_PORT);
    EXPECT_EQ(point->GetPortsetName(), "dvSwitch0");
    const HostCtl::Network::DVPortParam param = point->GetDVPortParam();
    EXPECT_EQ(param.switchUuid, kDvsUuid);
    EXPECT_EQ(param.portId, "11");
    EXPECT_EQ(param.connectionId, 1700000000u);
    // A fresh object without an id of its own reads the stored one.
    EXPECT_EQ(DvPort("11").GetConnectionId(), 1700000000u);

    // The point is found on its own netstack only.
    DVPortImpl again = DvPort("11");
    EXPECT_EQ(MessageOf([&] { info_.RemovePalladNic(&again, kDefault); }),
              "No interface is connected to that connection point on netstack defaultTcpipStack");
    info_.RemovePalladNic(&again, "migrix");
    EXPECT_TRUE(Stored("interfaces", "name", "pld7").is_null());
    EXPECT_TRUE(Stored("ports", "client", "pld7").is_null());
    EXPECT_EQ(MessageOf([&] { info_.RemovePalladNic(&again, "migrix"); }),
              "No interface is connected to that connection point on netstack migrix");
}

TEST_F(Interfaces, EveryRefusalOfAnAddWritesNothing) {
    const Json before = Dump();
    PortGroupImpl vmNetwork("VM Network");
    auto add = [&](ConnectionPoint& point, const std::string& netstack, const MacAddress& mac, std::int64_t mtu,
                   const std::string& name) {
        return MessageOf([&] { info_.AddPalladNic(&point, netstack, IpConfig(), mac, 0, mtu, name); });
    };
    PortGroupImpl missing("Nope");
    EXPECT_EQ(add(missing, kDefault, MacAddress(), 0, ""), "Port group Nope does not exist");
    DVPortImpl noPort = DvPort("99");
    EXPECT_EQ(add(noPort, kDefault, MacAddress(), 0, ""),
              std::string("DV port 99 does not exist on the distributed switch with UUID ") + kDvsUuid);
    PortGroupImpl management("Management Network");
    EXPECT_EQ(add(management, kDefault, MacAddress(), 0, ""), "The connection point is already used by interface pld0");
    // Refused after the point's connection id was taken: that goes too.
    DVPortImpl used = DvPort("10", 42);
    EXPECT_EQ(add(used, kDefault, MacAddress(), 0, ""), "The connection point is already used by interface pld1");
    DVPortImpl free = DvPort("22", 42);
    EXPECT_EQ(add(free, "nope", MacAddress(), 0, ""), "Netstack instance nope does not exist");
    EXPECT_EQ(add(vmNetwork, kDefault, MacAddress(), 0, "pld1"), "Interface pld1 already exists");
    EXPECT_EQ(add(vmNetwork, kDefault, MacAddress("02:A1:01:00:00:02"), 0, ""),
              "MAC address 02:a1:01:00:00:02 is already used by interface pld1");
    EXPECT_EQ(add(vmNetwork, kDefault, MacAddress("03:00:00:00:00:01"), 0, ""),
              "MAC address 03:00:00:00:00:01 is not a unicast address");
    EXPECT_EQ(add(vmNetwork, kDefault, MacAddress(), 1279, "pld9"),
              "Invalid MTU value 1279 for interface pld9: must be between 1280 and 9000");
    // Never narrowed: 2^32 + 1500 is no MTU of 1500.
    EXPECT_EQ(add(vmNetwork, kDefault, MacAddress(), 4294968796LL, ""),
              "Invalid MTU value 4294968796: must be between 1280 and 9000");
    EXPECT_EQ(Dump(), before);
}

TEST_F(Interfaces, NamesAndPortsRunOut) {
    Json profile = Json::parse(R"({"format": "orvix-host-profile", "version": 1,
        "vswitches": [{"name": "vSwitch0", "numPorts": 1}],
        "portgroups": [{"name": "A", "vswitch": "vSwitch0"}, {"name": "B", "vswitch": "vSwitch0"}],
        "netstacks": [{"key": "defaultTcpipStack"}], "interfaces": []})");
    for (int i = 0; i < 256; ++i) {
        if (i == 1) continue;
        profile["interfaces"].push_back({{"name", "pld" + std::to_string(i)}, {"netstack", kDefault}});
    }
    MakeHost(profile.dump());
    PortGroupImpl a("A");
    auto nic = info_.AddPalladNic(&a, kDefault, IpConfig(), MacAddress(), 0, 0, "");
    EXPECT_EQ(nic->GetName(), "pld1");
    // Interfaces without a connection point held pld0 to pld255's addresses
    // 00:00:00:00:00:00; the first address of the range was free.
    EXPECT_EQ(nic->GetMacAddress().GetStringAddress(), "02:a1:01:00:00:01");
    PortGroupImpl b("B");
    EXPECT_EQ(MessageOf([&] { info_.AddPalladNic(&b, kDefault, IpConfig(), MacAddress(), 0, 0, ""); }),
              "No free interface name: pld0 to pld255 are all in use");
    nic->Remove();
    Nic("pld0")->Remove();
    EXPECT_EQ(MessageOf([&] { info_.AddPalladNic(&b, kDefault, IpConfig(), MacAddress(), 0, 0, ""); }), "(no error)");
}

TEST_F(Interfaces, AFullSwitchRefusesANewInterface) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
        "vswitches": [{"name": "vSwitch0", "numPorts": 1}],
        "portgroups": [{"name": "A", "vswitch": "vSwitch0"}],
        "netstacks": [{"key": "defaultTcpipStack"}],
        "ports": [{"id": 33554433, "portset": "vSwitch0"}]})");
    PortGroupImpl a("A");
    EXPECT_EQ(MessageOf([&] { info_.AddPalladNic(&a, kDefault, IpConfig(), MacAddress(), 0, 0, "pld4"); }),
              "The port set vSwitch0 has no free port");
    EXPECT_TRUE(Dump()["interfaces"].empty());
}

TEST_F(Interfaces, SnapshotsKeepWhatTheyReadAndChangesKeepOthersChanges) {
    auto first = Nic("pld0");
    auto second = Nic("pld0");
    first->SetMtu(9000);
    EXPECT_EQ(first->GetMtu(), 9000);
    EXPECT_EQ(second->GetMtu(), 1500);
    // A change from the older snapshot writes only its own field.
    second->Disable();
    EXPECT_FALSE(second->IsEnabled());
    auto fresh = Nic("pld0");
    EXPECT_EQ(fresh->GetMtu(), 9000);
    EXPECT_FALSE(fresh->IsEnabled());
    EXPECT_EQ(MessageOf([&] { fresh->SetMtu(9001); }),
              "Invalid MTU value 9001 for interface pld0: must be between 1280 and 9000");
    EXPECT_EQ(Nic("pld0")->GetMtu(), 9000);

    first->Remove();
    EXPECT_EQ(MessageOf([&] { second->Enable(); }), "Interface pld0 does not exist");
    EXPECT_EQ(MessageOf([&] { second->SetIpConfig(IpConfig()); }), "Interface pld0 does not exist");
    EXPECT_EQ(info_.GetPalladNicByInterface("pld0", false), nullptr);
}

TEST_F(Interfaces, IpConfigRoundTripsAndTheDhcpDnsFlagComesOnlyWithTheDnsConfig) {
    auto pld1 = Nic("pld1");
    const IpConfig read = pld1->GetIpConfig();
    EXPECT_TRUE(read.GetUseDhcp());
    EXPECT_EQ(read.GetIpv4Address().GetStringAddress(), "198.51.100.21");
    EXPECT_EQ(read.GetIpv4Broadcast().GetStringAddress(), "198.51.100.255");
    EXPECT_FALSE(read.GetDhcpDns());
    EXPECT_TRUE(pld1->GetDnsConfig().GetDhcpDns());

    // Written back whole, the flag goes with it; copied from the DNS
    // configuration, it stays.
    IpConfig keep = read;
    keep.SetDhcpDns(pld1->GetDnsConfig().GetDhcpDns());
    pld1->SetIpConfig(keep);
    EXPECT_EQ(Stored("interfaces", "name", "pld1")["dhcpDns"], true);
    pld1->SetIpConfig(read);
    EXPECT_EQ(Stored("interfaces", "name", "pld1")["dhcpDns"], false);
    EXPECT_FALSE(Nic("pld1")->GetDnsConfig().GetDhcpDns());

    // Addresses that stay keep their type and state; a new one is static
    // and preferred.
    auto pld0 = Nic("pld0");
    IpConfig config = pld0->GetIpConfig();
    ASSERT_EQ(config.GetIpv6Network().size(), 4u);
    EXPECT_EQ(config.GetIpv6Network()[2].GetIpv6AddressType(), Ipv6Network::TYPE_AUTOCONF);
    EXPECT_EQ(config.GetIpv6Network()[2].GetIpv6AddressStatus(), Ipv6Network::STATUS_DEPRECATED);
    EXPECT_EQ(config.GetIpv6Network()[3].GetIpv6AddressStatus(), Ipv6Network::STATUS_DUPLICATED);
    config.RemoveIpv6Network(Ipv6Network("2001:db8:10::21/64"));
    config.AddIpv6Network(Ipv6Network("2001:db8:10::99/64"));
    config.SetIpv4UseNone();
    config.SetUseIpv6Dhcp(true);
    pld0->SetIpConfig(config);
    const Json stored = Stored("interfaces", "name", "pld0");
    EXPECT_EQ(stored["ipv4Mode"], "none");
    EXPECT_EQ(stored["ipv4Address"], "0.0.0.0");
    EXPECT_EQ(stored["ipv6Dhcp"], true);
    EXPECT_EQ(
        stored["ipv6Addresses"],
        (Json::array({{{"address", "2001:db8:10:0:a1:1ff:fe00:1/64"}, {"type", "autoconf"}, {"status", "preferred"}},
                      {{"address", "2001:db8:11:0:a1:1ff:fe00:1/64"}, {"type", "autoconf"}, {"status", "deprecated"}},
                      {{"address", "2001:db8:10::22/64"}, {"type", "static"}, {"status", "duplicated"}},
                      {{"address", "2001:db8:10::99/64"}, {"type", "static"}, {"status", "preferred"}}})));
    EXPECT_EQ(pld0->GetIpConfig().GetIpv6Network().size(), 4u);
}

TEST_F(Interfaces, TagsAreStoredByNameInTheOrderAdded) {
    using namespace HostCtl::Network;
    auto pld1 = Nic("pld1");
    EXPECT_EQ(pld1->GetTags(), (std::vector<PldNicTagType>{PLDNIC_TAG_STORAGE, PLDNIC_TAG_BACKUP}));
    pld1->AddTag(PLDNIC_TAG_TELEMETRY, false);
    pld1->AddTag(PLDNIC_TAG_STORAGE, false);
    pld1->RemoveTag(PLDNIC_TAG_BACKUP);
    pld1->RemoveTag(PLDNIC_TAG_MANAGEMENT);
    EXPECT_EQ(Stored("interfaces", "name", "pld1")["tags"], (Json{"Storage", "Telemetry"}));
    EXPECT_EQ(MessageOf([&] { pld1->AddTag(PLDNIC_TAG_INVALID, false); }), "Invalid interface tag 9");

    pld1->AddTag(PLDNIC_TAG_MANAGEMENT, false);
    std::vector<std::string> names;
    for (const auto& nic : info_.GetPalladNicsByTag(PLDNIC_TAG_MANAGEMENT)) names.push_back(nic->GetName());
    EXPECT_EQ(names, (std::vector<std::string>{"pld0", "pld1"}));
    EXPECT_TRUE(info_.GetPalladNicsByTag(PLDNIC_TAG_INVALID).empty());

    EXPECT_EQ(PldCtl::Network::PldNicTagNameToId("FaultTolerance"), PLDNIC_TAG_FAULT_TOLERANCE);
    EXPECT_EQ(PldCtl::Network::PldNicTagNameToId("management"), PLDNIC_TAG_INVALID);
    EXPECT_EQ(PldCtl::Network::PldNicTagIdToName(8), "Telemetry");
    EXPECT_EQ(PldCtl::Network::PldNicTagIdToName(0), "");
    EXPECT_EQ(PldCtl::Network::PldNicTagIdToName(9), "");
}

TEST_F(Interfaces, ListsAreInInterfaceNumberOrder) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
        "netstacks": [{"key": "defaultTcpipStack"}, {"key": "b"}],
        "interfaces": [{"name": "pld10", "netstack": "b"}, {"name": "pld2", "netstack": "defaultTcpipStack"},
                       {"name": "pld9", "netstack": "b"}]})");
    std::vector<std::string> all;
    for (const auto& nic : info_.GetPalladNics()) all.push_back(nic->GetName());
    EXPECT_EQ(all, (std::vector<std::string>{"pld2", "pld9", "pld10"}));
    std::vector<std::string> names = {"stale"};
    info_.GetPalladNicNamesByInstanceKey(names, "b");
    EXPECT_EQ(names, (std::vector<std::string>{"pld9", "pld10"}));
    EXPECT_EQ(info_.GetPalladNicsByInstanceKey("b").size(), 2u);
    // Without a connection point there is none to hand out.
    EXPECT_EQ(Nic("pld2")->GetConnectionPoint(), nullptr);
    EXPECT_EQ(Nic("pld2")->GetPortId(), 0);
}

TEST_F(Interfaces, AnOpaqueNetworkIsReadFromTheInterface) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
        "netstacks": [{"key": "defaultTcpipStack"}],
        "interfaces": [{"name": "pld4", "netstack": "defaultTcpipStack", "opaqueNetworkId": "net-7",
                        "opaqueNetworkType": "overlay", "externalId": "ext-1", "opaqueSwitch": "ovs0"}]})");
    auto point = Nic("pld4")->GetConnectionPoint();
    ASSERT_TRUE(point);
    EXPECT_EQ(point->GetType(), ConnectionPoint::TYPE_OPAQUE_NETWORK);
    EXPECT_EQ(point->GetPortsetName(), "ovs0");
    EXPECT_EQ(point->GetOpaqueNetworkParam().networkType, "overlay");
    EXPECT_EQ(point->GetOpaqueNetworkParam().externalId, "ext-1");
    EXPECT_EQ(MessageOf([&] { info_.AddPalladNic(point.get(), kDefault, IpConfig(), MacAddress(), 0, 0, ""); }),
              "An interface can be created only on a port group or a DV port");
}

TEST_F(Interfaces, DistributedSwitchLookups) {
    auto dvswitch = NetworkFactory::GetDVSwitchByName("dvSwitch0");
    EXPECT_EQ(dvswitch->GetName(), "dvSwitch0");
    EXPECT_EQ(dvswitch->GetUUID(), kDvsUuid);
    EXPECT_EQ(NetworkFactory::GetDVSwitchByName("vSwitch0"), nullptr);
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    EXPECT_EQ(switches.GetDVSwitchByName("dvSwitch9"), nullptr);
    EXPECT_EQ(switches.GetDVSwitchByName("dvSwitch0")->GetUUID(), kDvsUuid);

    EXPECT_FALSE(DVPortImpl(HostCtl::Network::DVPortParam{"no-such-uuid", "10", 0}).IsValid());
    EXPECT_FALSE(DvPort("12").IsValid());
    EXPECT_EQ(DvPort("12").GetPortsetName(), "");
    EXPECT_TRUE(PortGroupImpl("Storage").IsValid());
    EXPECT_FALSE(PortGroupImpl("Nope").IsValid());
    EXPECT_EQ(PortGroupImpl("Lab Isolated").GetPortsetName(), "vSwitch1");
}

TEST_F(Interfaces, AJoinedKeyFieldWithASeparatorIsRefusedWhenAHostIsMade) {
    // A port "b|c" of switch "a" would share its key "a|b|c" with a port
    // "c" of a switch "a|b".
    for (const char* dvport : {R"({"dvswitch": "a", "id": "b|c"})", R"({"dvswitch": "a|b", "id": "c"})"}) {
        try {
            MakeHost(std::string(R"({"format": "orvix-host-profile", "version": 1,
                "dvswitches": [{"name": "a", "uuid": "u1"}, {"name": "a|b", "uuid": "u2"}], "dvports": [)") +
                     dvport + "]}");
            ADD_FAILURE() << "accepted " << dvport;
        } catch (const std::runtime_error& e) {
            EXPECT_THAT(e.what(), HasSubstr("dvports[0]."));
            EXPECT_THAT(e.what(), HasSubstr(": must not contain '|'"));
        }
    }
    // A lookup with a separator in the port id names no port.
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
        "dvswitches": [{"name": "a", "uuid": "u1"}, {"name": "b", "uuid": "u2"}],
        "dvports": [{"dvswitch": "a", "id": "b"}, {"dvswitch": "b", "id": "c"}]})");
    EXPECT_TRUE(DVPortImpl(HostCtl::Network::DVPortParam{"u1", "b", 0}).IsValid());
    EXPECT_FALSE(DVPortImpl(HostCtl::Network::DVPortParam{"u1", "b|", 0}).IsValid());
}

TEST_F(Interfaces, InjectedFaultsFailTheirOperationAndWriteNothing) {
    ArmFault("PalladNicInfoImpl::AddPalladNic", "pld5", "add failed");
    ArmFault("PldNicImpl::SetMtu", "pld0", "mtu failed");
    ArmFault("PldNicImpl::GetConnectionPoint", "pld1", "point failed");
    ArmFault("PalladNicInfoImpl::GetPalladNicsByTag", "", "tags failed");
    ArmFault("NetworkFactory::GetDVSwitchByName", "dvSwitch0", "dvs failed");
    ArmFault("VirtualSwitchInfoImpl::GetDVSwitchByName", "dvSwitch0", "dvs info failed");
    const Json before = Dump();
    PortGroupImpl vmNetwork("VM Network");
    EXPECT_EQ(MessageOf([&] { info_.AddPalladNic(&vmNetwork, kDefault, IpConfig(), MacAddress(), 0, 0, "pld5"); }),
              "add failed");
    EXPECT_EQ(MessageOf([&] { Nic("pld0")->SetMtu(9000); }), "mtu failed");
    EXPECT_EQ(MessageOf([&] { Nic("pld1")->GetConnectionPoint(); }), "point failed");
    EXPECT_EQ(MessageOf([&] { info_.GetPalladNicsByTag(HostCtl::Network::PLDNIC_TAG_STORAGE); }), "tags failed");
    EXPECT_EQ(MessageOf([] { NetworkFactory::GetDVSwitchByName("dvSwitch0"); }), "dvs failed");
    EXPECT_EQ(MessageOf([] { PldCtl::Network::VirtualSwitchInfoImpl().GetDVSwitchByName("dvSwitch0"); }),
              "dvs info failed");
    EXPECT_EQ(Dump(), before);
    // Keyed faults leave other objects alone.
    EXPECT_EQ(MessageOf([&] { Nic("pld2")->SetMtu(9000); }), "(no error)");
}

}  // namespace
