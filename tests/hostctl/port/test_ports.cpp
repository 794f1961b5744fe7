// Ports as the library hands them out: per switch by id, one by id, the
// uplink port of a NIC, and their counters and filters mapped field by
// field (every stored counter has a value of its own, so a swap shows).
#include <gtest/gtest.h>

#include "hostctl/HostFixture.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/port/PortImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace {

using HostCtl::Network::Port;

constexpr const char* kPorts = R"({"format": "orvix-host-profile", "version": 1,
  "nics": [{"name": "hwnic0", "uplinkPortId": 9}, {"name": "hwnic1"}, {"name": "hwnic2", "uplinkPortId": 77}],
  "vswitches": [{"name": "vs0", "uplinks": ["hwnic0"]}],
  "dvswitches": [{"name": "dv0", "uuid": "u0"}],
  "dvports": [{"dvswitch": "dv0", "id": "5", "portgroupId": "dvpg-5"}],
  "worlds": [{"id": 4001, "name": "orvm:web", "kind": "vm"}],
  "ports": [
    {"id": 12, "portset": "vs0", "type": "vm", "client": "web.eth0", "portgroup": "VM Network", "worldId": 4001,
     "mac": "02:00:00:00:00:0C", "ip": "192.0.2.12", "teamUplink": "hwnic0",
     "stats": {"rxPackets": 1, "txPackets": 2, "rxBytes": 3, "txBytes": 4, "rxBroadcast": 5, "txBroadcast": 6,
               "rxMulticast": 7, "txMulticast": 8, "rxDropped": 9, "txDropped": 10},
     "filters": [
       {"name": "fw", "key": "k1", "direction": "transmit", "extended": true, "packetsIn": 11, "packetsOut": 12,
        "packetsDropped": 13, "packetsFiltered": 14, "packetsFaulted": 15, "packetsQueued": 16,
        "packetsInjected": 17, "packetErrors": 18},
       {"name": "cap", "present": false}]},
    {"id": 9, "portset": "vs0", "type": "uplink", "client": "hwnic0"},
    {"id": 11, "portset": "vs0", "type": "kernel", "client": "pld0"},
    {"id": 30, "portset": "dv0", "type": "internal", "dvPortId": "5"},
    {"id": 31, "portset": "dv0", "dvPortId": "6"},
    {"id": 77, "portset": "gone"}]
})";

class Ports : public FreshHost {
protected:
    void SetUp() override { MakeHost(kPorts); }

    static std::vector<std::uint32_t> IdsOf(const std::vector<std::unique_ptr<Port>>& ports) {
        std::vector<std::uint32_t> ids;
        for (const auto& port : ports) ids.push_back(port->GetPortId());
        return ids;
    }
};

TEST_F(Ports, SwitchesListTheirOwnPortsByIdWithDvPortGroups) {
    PldCtl::Network::VirtualSwitchInfoImpl info;
    auto switches = info.GetAllSwitches();
    ASSERT_EQ(switches.size(), 2u);
    auto standard = switches[0]->GetPorts();
    EXPECT_EQ(IdsOf(standard), (std::vector<std::uint32_t>{9, 11, 12}));
    EXPECT_EQ(standard[0]->GetType(), Port::TYPE_UPLINK);
    EXPECT_EQ(standard[1]->GetType(), Port::TYPE_KERNEL);
    EXPECT_EQ(standard[2]->GetType(), Port::TYPE_VM);
    EXPECT_EQ(standard[2]->GetDVPortgroupId(), "");

    auto distributed = switches[1]->GetPorts();
    EXPECT_EQ(IdsOf(distributed), (std::vector<std::uint32_t>{30, 31}));
    EXPECT_EQ(distributed[0]->GetType(), Port::TYPE_INTERNAL);
    EXPECT_EQ(distributed[0]->GetDVPortId(), "5");
    EXPECT_EQ(distributed[0]->GetDVPortgroupId(), "dvpg-5");
    // A port naming a DV port the switch does not have has no port group.
    EXPECT_EQ(distributed[1]->GetDVPortgroupId(), "");
}

TEST_F(Ports, OnePortIsFoundByIdOnlyOnASwitchTheHostHas) {
    PldCtl::Network::VirtualSwitchInfoImpl info;
    auto port = info.GetPortById(30);
    ASSERT_NE(port, nullptr);
    EXPECT_EQ(port->GetPortsetName(), "dv0");
    EXPECT_EQ(port->GetDVPortgroupId(), "dvpg-5");
    EXPECT_EQ(info.GetPortById(13), nullptr);
    // Port 77 exists, but its switch does not: no walk of the switches finds it.
    EXPECT_EQ(info.GetPortById(77), nullptr);
}

TEST_F(Ports, CountersAndFiltersKeepEveryFieldInItsPlace) {
    auto port = PldCtl::Network::VirtualSwitchInfoImpl().GetPortById(12);
    ASSERT_NE(port, nullptr);
    const HostCtl::Network::PortStats stats = port->GetPortStats();
    EXPECT_EQ(stats.packetsReceived, 1u);
    EXPECT_EQ(stats.packetsSent, 2u);
    EXPECT_EQ(stats.bytesReceived, 3u);
    EXPECT_EQ(stats.bytesSent, 4u);
    EXPECT_EQ(stats.broadcastReceived, 5u);
    EXPECT_EQ(stats.broadcastSent, 6u);
    EXPECT_EQ(stats.multicastReceived, 7u);
    EXPECT_EQ(stats.multicastSent, 8u);
    EXPECT_EQ(stats.droppedReceived, 9u);
    EXPECT_EQ(stats.droppedSent, 10u);

    HostCtl::Network::PacketCounters counters;
    port->GetPacketCounters(counters);
    EXPECT_EQ(counters.packetsSent, 2u);
    EXPECT_EQ(counters.multicastSent, 8u);
    EXPECT_EQ(counters.broadcastSent, 6u);
    EXPECT_EQ(counters.packetsReceived, 1u);
    EXPECT_EQ(counters.multicastReceived, 7u);
    EXPECT_EQ(counters.broadcastReceived, 5u);
    EXPECT_EQ(counters.droppedSent, 10u);
    EXPECT_EQ(counters.droppedReceived, 9u);

    auto filters = port->GetFilterStats();
    ASSERT_EQ(filters.size(), 2u);
    const HostCtl::Network::FilterStats& fw = *filters[0];
    EXPECT_EQ(fw.orderingKey, "k1");
    EXPECT_TRUE(fw.transmit);
    EXPECT_TRUE(fw.extended);
    EXPECT_TRUE(fw.present);
    const std::vector<std::uint64_t> counted = {fw.packetsIn,       fw.packetsOut,     fw.packetsDropped,
                                                fw.packetsFiltered, fw.packetsFaulted, fw.packetsQueued,
                                                fw.packetsInjected, fw.packetErrors};
    EXPECT_EQ(counted, (std::vector<std::uint64_t>{11, 12, 13, 14, 15, 16, 17, 18}));
    // Defaults: receive, not extended, and an absent filter is still listed.
    EXPECT_FALSE(filters[1]->present);
    EXPECT_FALSE(filters[1]->transmit);
    EXPECT_FALSE(filters[1]->extended);

    EXPECT_EQ(port->GetWorldId(), 4001u);
    EXPECT_EQ(port->GetPortgroupName(), "VM Network");
    EXPECT_EQ(port->GetMacAddress().GetStringAddress(), "02:00:00:00:00:0c");
    EXPECT_EQ(port->GetIpAddress().GetStringAddress(), "192.0.2.12");
    EXPECT_EQ(port->GetTeamUplink(), "hwnic0");
    EXPECT_EQ(PldCtl::Network::VirtualSwitchInfoImpl().GetPortById(11)->GetIpAddress().IsSet(), false);
}

TEST_F(Ports, NicsFindTheirUplinkPort) {
    auto uplink = PldCtl::Network::PnicImpl("hwnic0").GetUplinkPort();
    ASSERT_NE(uplink, nullptr);
    EXPECT_EQ(uplink->GetPortId(), 9u);
    EXPECT_EQ(PldCtl::Network::PnicImpl("hwnic1").GetUplinkPort(), nullptr);
    // A NIC whose uplink port lies on a switch the host does not have.
    EXPECT_EQ(PldCtl::Network::PnicImpl("hwnic2").GetUplinkPort(), nullptr);
    EXPECT_EQ(MessageOf([] { PldCtl::Network::PnicImpl("hwnic9").GetUplinkPort(); }), "NIC hwnic9 does not exist");
}

TEST_F(Ports, InjectedFaultsFailTheCountersOfTheirPortOnly) {
    HostSim({"fault", "add", "PortImpl::GetFilterStats", "--key", "12", "--message", "filters down"});
    HostSim({"fault", "add", "VirtualSwitchInfoImpl::GetPortById", "--key", "9", "--message", "lookup down"});
    PldCtl::Network::VirtualSwitchInfoImpl info;
    auto port = info.GetPortById(12);
    EXPECT_EQ(MessageOf([&] { port->GetFilterStats(); }), "filters down");
    EXPECT_EQ(port->GetPortStats().packetsSent, 2u);
    EXPECT_TRUE(info.GetPortById(11)->GetFilterStats().empty());
    EXPECT_EQ(MessageOf([&] { info.GetPortById(9); }), "lookup down");
}

}  // namespace
