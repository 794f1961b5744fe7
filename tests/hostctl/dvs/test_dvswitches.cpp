// Distributed switches as the library keeps them: listings that join ports
// and DV ports, the LACP data and the one LACP change, and the lookups by
// name, UUID and kind.
#include <gtest/gtest.h>

#include "hostctl/HostFixture.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/dvs/DVSwitchImpl.h"

namespace {

using HostCtl::Network::DVPortParam;
using HostCtl::Network::DVSwitch;

// Two distributed switches beside one standard switch; dvB's DV ports are
// stored before dvA's, and port 7 of dvA is used by two host ports.
constexpr const char* kTwoSwitches = R"({"format": "orvix-host-profile", "version": 1,
  "nics": [{"name": "hwnic0"}, {"name": "hwnic1"}, {"name": "hwnic2"}],
  "vswitches": [{"name": "vs0"}],
  "dvswitches": [
    {"name": "dvA", "uuid": "uuid-a", "numPorts": 64, "mtu": 9000, "cdp": "both", "beaconTimeout": 5,
     "orvixBranded": false, "uplinks": ["hwnic0", "hwnic1"],
     "lags": [{"id": 3, "name": "lagA", "mode": "passive", "loadBalance": 7, "members": [
        {"nic": "hwnic0", "state": "Bundled", "local": {"state": 61, "portNumber": 65535},
         "partner": {"deviceId": "02:00:00:00:00:09", "flags": "SA", "age": 3725, "state": 63},
         "stats": {"txLacpdus": 10, "rxLacpdus": 11, "txErrors": 12, "rxErrors": 13}},
        {"nic": "hwnic1", "state": "Independent", "shortTimeout": true, "local": {"state": 70}}]},
      {"id": 4, "name": "lagEmpty", "mode": "none"}]},
    {"name": "dvB", "uuid": "uuid-b"}],
  "dvports": [
    {"dvswitch": "dvB", "id": "1", "portgroupId": "dvpg-b"},
    {"dvswitch": "dvA", "id": "7", "portgroupId": "dvpg-7", "lacpEnabled": true, "lacpMode": "passive"},
    {"dvswitch": "dvA", "id": "2", "portgroupId": "dvpg-2"}],
  "ports": [
    {"id": 30, "portset": "dvA", "dvPortId": "7", "client": "vm1.eth0"},
    {"id": 10, "portset": "dvA", "dvPortId": "7", "client": "vm2.eth0"},
    {"id": 20, "portset": "dvA", "dvPortId": "2"},
    {"id": 40, "portset": "dvB", "dvPortId": "1", "client": "pld1"},
    {"id": 50, "portset": "vs0", "client": "hwnic2", "type": "uplink"}]
})";

class DvSwitches : public FreshHost {
protected:
    void SetUp() override { MakeHost(kTwoSwitches); }

    static std::unique_ptr<DVSwitch> Switch(const std::string& name) {
        auto dvswitch = NetworkFactory::GetDVSwitchByName(name);
        if (!dvswitch) throw std::runtime_error("no distributed switch " + name);
        return dvswitch;
    }

    // The actor state byte of one LAG member as stored.
    int StoredLocalState(std::size_t lag, std::size_t member) const {
        return Stored("dvswitches", "name", "dvA")["lags"][lag]["members"][member]["local"]["state"].get<int>();
    }
};

TEST_F(DvSwitches, ListingCountsPortsAndJoinsDvPortsWithTheirClients) {
    PldCtl::Network::VirtualSwitchInfoImpl info;
    auto switches = info.GetDVSwitches();
    ASSERT_EQ(switches.size(), 2u);
    DVSwitch& dvA = *switches[0];
    ASSERT_NE(dynamic_cast<PldCtl::Network::DVSwitchImpl*>(&dvA), nullptr);
    EXPECT_EQ(dvA.GetName(), "dvA");
    EXPECT_EQ(dvA.GetUUID(), "uuid-a");
    EXPECT_EQ(dvA.GetClassName(), "dvswitch");
    EXPECT_EQ(dvA.GetNumPorts(), 64);
    EXPECT_EQ(dvA.GetNumConfiguredPorts(), 3);
    EXPECT_EQ(dvA.GetNumUsedPorts(), 2);
    EXPECT_EQ(dvA.GetMTU(), 9000);
    EXPECT_EQ(dvA.GetCDPStatus(), "both");
    EXPECT_EQ(dvA.GetBeaconTimeout(), 5);
    EXPECT_FALSE(dvA.IsOrvixBranded());
    EXPECT_TRUE(switches[1]->IsOrvixBranded());
    EXPECT_EQ(switches[1]->GetBeaconTimeout(), -1);

    // The host's order of DV ports, each switch only its own.
    auto ports = dvA.GetDVPorts();
    ASSERT_EQ(ports.size(), 2u);
    EXPECT_EQ(ports[0]->GetPortId(), "7");
    EXPECT_EQ(ports[0]->GetDVPortgroupId(), "dvpg-7");
    std::vector<std::string> clients;
    EXPECT_TRUE(ports[0]->IsInUse(clients));
    EXPECT_EQ(clients, (std::vector<std::string>{"vm1.eth0", "vm2.eth0"}));
    EXPECT_TRUE(ports[0]->IsLacpEnabled());
    EXPECT_EQ(ports[0]->GetLacpMode(), HostCtl::Network::LACP_MODE_PASSIVE);
    clients = {"left over"};
    EXPECT_FALSE(ports[1]->IsInUse(clients));
    EXPECT_TRUE(clients.empty());
    EXPECT_FALSE(ports[1]->IsLacpEnabled());

    auto ofB = switches[1]->GetDVPorts();
    ASSERT_EQ(ofB.size(), 1u);
    EXPECT_TRUE(ofB[0]->IsInUse(clients));
    EXPECT_EQ(clients, std::vector<std::string>{"pld1"});
}

TEST_F(DvSwitches, AllSwitchesListStandardThenDistributedAndKnowTheirKinds) {
    PldCtl::Network::VirtualSwitchInfoImpl info;
    // Asked before any listing, the kinds are read from the host.
    EXPECT_TRUE(info.IsDVSwitch("dvB"));
    EXPECT_FALSE(info.IsLegacySwitch("dvB"));
    EXPECT_TRUE(info.IsLegacySwitch("vs0"));
    EXPECT_FALSE(info.IsDVSwitch("nothing"));
    EXPECT_FALSE(info.IsLegacySwitch("nothing"));
    EXPECT_FALSE(info.IsOpaqueSwitch("vs0"));

    auto all = info.GetAllSwitches();
    ASSERT_EQ(all.size(), 3u);
    EXPECT_EQ(all[0]->GetName(), "vs0");
    EXPECT_EQ(all[1]->GetName(), "dvA");
    EXPECT_EQ(all[2]->GetName(), "dvB");
    EXPECT_EQ(dynamic_cast<PldCtl::Network::PortsetImpl&>(*all[0]).GetSwitchUuid(), "");
    EXPECT_EQ(dynamic_cast<PldCtl::Network::PortsetImpl&>(*all[2]).GetSwitchUuid(), "uuid-b");
    // A listed switch answers from the listing, even once the host lost it.
    RawSql("DELETE FROM object WHERE section = 'dvswitches'");
    EXPECT_TRUE(info.IsDVSwitch("dvA"));
    EXPECT_FALSE(PldCtl::Network::VirtualSwitchInfoImpl().IsDVSwitch("dvA"));
}

TEST_F(DvSwitches, LacpDataComesFromTheLagsWithFlagsFromTheActorState) {
    auto dvA = Switch("dvA");
    auto config = dvA->GetLacpConfig();
    ASSERT_EQ(config->lags.size(), 2u);
    EXPECT_EQ(config->lags[0].id, 3);
    EXPECT_EQ(config->lags[0].mode, HostCtl::Network::LACP_MODE_PASSIVE);
    EXPECT_EQ(config->lags[0].loadBalance, 7);
    EXPECT_EQ(config->lags[0].nics, (std::vector<std::string>{"hwnic0", "hwnic1"}));
    EXPECT_EQ(config->lags[1].mode, HostCtl::Network::LACP_MODE_NONE);
    EXPECT_TRUE(config->lags[1].nics.empty());
    dvA->ReleaseLacpConfig(std::move(config));

    auto info = dvA->GetLacpInfo();
    ASSERT_EQ(info->lags.size(), 2u);
    ASSERT_EQ(info->lags[0].nics.size(), 2u);
    const HostCtl::Network::LacpNicInfo& bundled = info->lags[0].nics[0];
    EXPECT_EQ(bundled.state, "Bundled");
    // 61 is active with a long timeout; 70 passive with a short one.
    EXPECT_EQ(bundled.local.flags, "SA");
    EXPECT_EQ(bundled.local.portNumber, 65535);
    EXPECT_EQ(bundled.partner.age, 3725u);
    EXPECT_EQ(bundled.partner.state, 63);
    EXPECT_EQ(bundled.partner.deviceId, "02:00:00:00:00:09");
    EXPECT_EQ(bundled.txLacpdus, 10u);
    EXPECT_EQ(bundled.rxLacpdus, 11u);
    EXPECT_EQ(bundled.txErrors, 12u);
    EXPECT_EQ(bundled.rxErrors, 13u);
    EXPECT_EQ(info->lags[0].nics[1].local.flags, "FP");
    EXPECT_TRUE(Switch("dvB")->GetLacpInfo()->lags.empty());
    dvA->ReleaseLacpInfo(std::move(info));
}

TEST_F(DvSwitches, LacpTimeoutSetsTheFlagAndTheStateBitTogether) {
    auto dvA = Switch("dvA");
    dvA->SetLacpTimeout(3, true, "hwnic0");
    EXPECT_EQ(StoredLocalState(0, 0), 61 | 0x02);
    EXPECT_EQ(Stored("dvswitches", "name", "dvA")["lags"][0]["members"][0]["shortTimeout"], true);
    // The object shows its own change; a LAG's other member kept its state.
    EXPECT_EQ(dvA->GetLacpInfo()->lags[0].nics[0].local.flags, "FA");
    EXPECT_EQ(StoredLocalState(0, 1), 70);

    // Without a NIC every member changes; clearing the bit keeps the others.
    dvA->SetLacpTimeout(3, false, "");
    EXPECT_EQ(StoredLocalState(0, 0), 61);
    EXPECT_EQ(StoredLocalState(0, 1), 70 & ~0x02);
    EXPECT_EQ(Stored("dvswitches", "name", "dvA")["lags"][0]["members"][1]["shortTimeout"], false);
    // Fields the library does not change stay as stored.
    EXPECT_EQ(Stored("dvswitches", "name", "dvA")["lags"][0]["members"][0]["partner"]["age"], 3725);
}

TEST_F(DvSwitches, LacpTimeoutRefusesUnknownLagsAndNicsAndChangesNothing) {
    auto dvA = Switch("dvA");
    EXPECT_EQ(MessageOf([&] { dvA->SetLacpTimeout(7, true, ""); }), "LAG 7 does not exist on DVSwitch dvA");
    EXPECT_EQ(MessageOf([&] { dvA->SetLacpTimeout(3, true, "hwnic9"); }), "NIC hwnic9 is not in LAG 3 of DVSwitch dvA");
    // hwnic0 is in another LAG than 4.
    EXPECT_EQ(MessageOf([&] { dvA->SetLacpTimeout(4, true, "hwnic0"); }), "NIC hwnic0 is not in LAG 4 of DVSwitch dvA");
    EXPECT_EQ(StoredLocalState(0, 0), 61);
    // An empty LAG takes a timeout for all of its (no) members.
    dvA->SetLacpTimeout(4, true, "");

    RawSql("DELETE FROM object WHERE section = 'dvswitches' AND key = 'dvA'");
    EXPECT_EQ(MessageOf([&] { dvA->SetLacpTimeout(3, true, ""); }), "Unable to find a DVSwitch with the name dvA");
    EXPECT_EQ(HostCtl::Network::DVSwitchNotFoundMessage("x"), "Unable to find a DVSwitch with the name x");
}

TEST_F(DvSwitches, DvPortsAreFoundByUuidAndIdOnly) {
    auto port = NetworkFactory::GetDVPort(DVPortParam{"uuid-a", "2", 0});
    ASSERT_NE(port, nullptr);
    EXPECT_EQ(port->GetDVPortgroupId(), "dvpg-2");
    EXPECT_EQ(NetworkFactory::GetDVPort(DVPortParam{"uuid-b", "2", 0}), nullptr);
    EXPECT_EQ(NetworkFactory::GetDVPort(DVPortParam{"uuid-x", "1", 0}), nullptr);
    EXPECT_EQ(NetworkFactory::GetDVPort(DVPortParam{"uuid-a", "7|x", 0}), nullptr);
    EXPECT_EQ(NetworkFactory::GetDVSwitchByName("vs0"), nullptr);

    // Made from a parameter, the port is read when first asked.
    PldCtl::Network::DVPortImpl byParam(DVPortParam{"uuid-a", "7", 0});
    std::vector<std::string> clients;
    EXPECT_TRUE(byParam.IsInUse(clients));
    EXPECT_EQ(clients.size(), 2u);
    EXPECT_EQ(byParam.GetPortsetName(), "dvA");
    PldCtl::Network::DVPortImpl missing(DVPortParam{"uuid-a", "8", 0});
    EXPECT_FALSE(missing.IsValid());
    EXPECT_EQ(MessageOf([&] { missing.GetDVPortgroupId(); }),
              "DV port 8 does not exist on the DVSwitch with ID uuid-a");
}

TEST_F(DvSwitches, InjectedFaultsFailTheirOperationForTheirSwitchOnly) {
    HostSim({"fault", "add", "DVSwitchImpl::GetLacpInfo", "--key", "dvB", "--message", "lacp down"});
    HostSim({"fault", "add", "NetworkFactory::GetDVPort", "--key", "7", "--message", "port down"});
    HostSim({"fault", "add", "VirtualSwitchInfoImpl::GetDVSwitches", "--message", "list down", "--count", "1"});
    PldCtl::Network::VirtualSwitchInfoImpl info;
    EXPECT_EQ(MessageOf([&] { info.GetDVSwitches(); }), "list down");
    auto switches = info.GetDVSwitches();
    ASSERT_EQ(switches.size(), 2u);
    EXPECT_EQ(switches[0]->GetLacpInfo()->lags.size(), 2u);
    EXPECT_EQ(MessageOf([&] { switches[1]->GetLacpInfo(); }), "lacp down");
    EXPECT_EQ(MessageOf([] { NetworkFactory::GetDVPort(DVPortParam{"uuid-a", "7", 0}); }), "port down");
    EXPECT_NE(NetworkFactory::GetDVPort(DVPortParam{"uuid-a", "2", 0}), nullptr);
}

}  // namespace
