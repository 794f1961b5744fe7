// How the library reads and writes stored objects: hand-written profiles that
// leave fields out, give them another type or add fields of their own, and
// stored text that is damaged.
#include <gtest/gtest.h>

#include "hostctl/HostFixture.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace {

class Records : public FreshHost {
protected:
    void MakeHost(const std::string& sections) {
        FreshHost::MakeHost(R"({"format": "orvix-host-profile", "version": 1, )" + sections + "}");
    }

    // Adding a switch of `ports` ports, refused: tells what the host thinks
    // is allocated and its limit.
    static std::string AddSwitch(long long ports) {
        return MessageOf([&] {
            PldCtl::Network::VirtualSwitchInfoImpl().AddVirtualSwitchWithPolicy(
                NicTeamingPolicy::GetDefaultPolicy(), PortSecurityPolicy::GetDefaultPolicy(),
                ShapingPolicy::GetDefaultPolicy(), HostCtl::Network::NicCapabilities::GetDefaultPolicy(), "added",
                ports);
        });
    }
};

TEST_F(Records, FieldsLeftOutReadAsTheirDefaults) {
    MakeHost(R"("vswitches": [{"name": "bare"}, {"name": "other", "numPorts": 400}],
                "portgroups": [{"name": "pg", "vswitch": "bare"}])");
    auto vswitch = NetworkFactory::GetVirtualSwitchById("bare");
    EXPECT_EQ(vswitch->GetClassName(), "stdswitch");
    EXPECT_EQ(vswitch->GetNumPorts(), 128);
    EXPECT_EQ(vswitch->GetMTU(), 1500);
    EXPECT_EQ(vswitch->GetCDPStatus(), "listen");
    EXPECT_EQ(vswitch->GetBeaconInterval(), 1);
    EXPECT_EQ(vswitch->GetBeaconThreshold(), 3);
    EXPECT_TRUE(vswitch->GetUplinks().empty());
    EXPECT_TRUE(vswitch->GetTeamingPolicy() == NicTeamingPolicy::GetDefaultPolicy());
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("pg")->GetVlanId(), 0);
    // No system settings: IPv6 on, and the host-wide limit of ports.
    EXPECT_TRUE(PldCtl::Network::NetworkInfoImpl().IsPldIpv6Enabled());
    EXPECT_EQ(AddSwitch(4096),
              "Unable to create virtual switch added with 4096 ports: 528 of the host's 4608 ports "
              "are allocated already");
}

TEST_F(Records, ChangesKeepWhatTheLibraryDoesNotKnow) {
    MakeHost(R"("system": {"rackUnit": 7},
                "nics": [{"name": "hwnic0", "firmware": {"blob": "x"}}],
                "vswitches": [{"name": "vSwitch0", "owner": "lab", "teaming": {"futureKnob": 3}}],
                "portgroups": [{"name": "pg", "vswitch": "vSwitch0", "colour": "blue"}])");
    auto vswitch = NetworkFactory::GetVirtualSwitchById("vSwitch0");
    vswitch->SetMTU(9000);
    vswitch->AddUplink("hwnic0");
    NicTeamingPolicy teaming = vswitch->GetTeamingPolicy();
    teaming.SetUplinkOrder({"hwnic0"});
    vswitch->SetTeamingPolicy(teaming);
    auto portGroup = NetworkFactory::GetPortGroupByName("pg");
    portGroup->SetVlanId(7);
    PldCtl::Network::NetworkInfoImpl().SetPldIpv6Enabled(false);

    const Json host = Dump();
    const Json& stored = host["vswitches"][0];
    EXPECT_EQ(stored["owner"], "lab");
    EXPECT_EQ(stored["mtu"], 9000);
    EXPECT_EQ(stored["uplinks"], Json::array({"hwnic0"}));
    EXPECT_EQ(stored["teaming"]["futureKnob"], 3);
    EXPECT_EQ(stored["teaming"]["uplinkOrder"], Json::array({"hwnic0"}));
    // A field no change touched stays absent, its default unwritten.
    EXPECT_FALSE(stored.contains("cdp"));
    EXPECT_EQ(host["portgroups"][0],
              (Json{{"name", "pg"}, {"vswitch", "vSwitch0"}, {"colour", "blue"}, {"vlanId", 7}}));
    EXPECT_EQ(host["nics"][0]["firmware"]["blob"], "x");
    EXPECT_NE(host["nics"][0]["uplinkPortId"], 0);
    EXPECT_EQ(host["system"], (Json{{"rackUnit", 7}, {"ipv6Enabled", false}}));
}

// Loading a profile refuses such fields; a store changed by other means may
// still hold them.
TEST_F(Records, FieldsOfAnotherTypeReadAsTheirDefaultsAndStayAsWritten) {
    MakeHost(R"("vswitches": [{"name": "odd"}],
                "portgroups": [{"name": "pg", "vswitch": "odd"}, {"name": "big", "vswitch": "odd"}])");
    RawSql(R"(INSERT OR REPLACE INTO singleton(name, doc) VALUES ('system', '{"ipv6Enabled": "no", "maxPorts": 1e3}');
              UPDATE object SET doc = '{"name": "odd", "class": null, "numPorts": "many", "mtu": 9000.0, "cdp": 7,
                  "beacon": {"interval": "x", "threshold": 2}, "uplinks": "hwnic0",
                  "teaming": {"beacon": "yes", "uplinkOrder": ["hwnic0", 3], "maxActive": 2},
                  "security": [true]}' WHERE section = 'vswitches';
              UPDATE object SET doc = '{"name": "pg", "vswitch": "odd", "vlanId": 4.5}' WHERE key = 'pg';
              UPDATE object SET doc = '{"name": "big", "vswitch": "odd", "vlanId": 18446744073709551616}'
                  WHERE key = 'big';)");
    auto vswitch = NetworkFactory::GetVirtualSwitchById("odd");
    EXPECT_EQ(vswitch->GetClassName(), "stdswitch");
    EXPECT_EQ(vswitch->GetNumPorts(), 128);
    EXPECT_EQ(vswitch->GetMTU(), 9000);  // a whole number, however written
    EXPECT_EQ(vswitch->GetCDPStatus(), "listen");
    EXPECT_EQ(vswitch->GetBeaconInterval(), 1);
    EXPECT_EQ(vswitch->GetBeaconThreshold(), 2);
    EXPECT_TRUE(vswitch->GetUplinks().empty());
    EXPECT_FALSE(vswitch->IsBeaconEnabled());
    EXPECT_TRUE(vswitch->GetTeamingPolicy().GetUplinkOrder().empty());
    EXPECT_EQ(vswitch->GetTeamingPolicy().GetMaxActiveUplinks(), 2);
    EXPECT_TRUE(vswitch->GetSecurityPolicy() == PortSecurityPolicy::GetDefaultPolicy());
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("pg")->GetVlanId(), 0);
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("big")->GetVlanId(), 0);
    EXPECT_TRUE(PldCtl::Network::NetworkInfoImpl().IsPldIpv6Enabled());
    const std::string refused = AddSwitch(1001);
    EXPECT_NE(refused.find(" of the host's 1000 ports "), std::string::npos) << refused;

    vswitch->SetCDPStatus(3);
    const Json stored = Dump()["vswitches"][0];
    EXPECT_EQ(stored["cdp"], "both");
    EXPECT_EQ(stored["numPorts"], "many");
    EXPECT_EQ(stored["uplinks"], "hwnic0");
    EXPECT_EQ(stored["teaming"]["beacon"], "yes");
}

TEST_F(Records, PortCountsBeyondEveryRangeStillRefuseNewSwitches) {
    MakeHost(R"("vswitches": [{"name": "huge"}])");
    RawSql(R"(UPDATE object SET doc = '{"name": "huge", "numPorts": 18446744073709551615}' WHERE key = 'huge')");
    EXPECT_EQ(AddSwitch(1),
              "Unable to create virtual switch added with 1 port: 9223372036854775807 of the host's 4608 ports "
              "are allocated already");
}

TEST_F(Records, TextIsReadExactlyAndDamagedTextFailsCleanly) {
    MakeHost(R"("vswitches": [{"name": "vSwitch0"}],
                "portgroups": [{"name": "Quoted \"pg\" \\ /", "vswitch": "vSwitch0"},
                               {"name": "R\u00e9seau", "vswitch": "vSwitch0", "vlanId": 1.2e1},
                               {"name": "raw", "vswitch": "vSwitch0"}])");
    EXPECT_EQ(PldCtl::Network::NetworkInfoImpl().GetAllPortGroups().front()->GetName(), "Quoted \"pg\" \\ /");
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("R\xc3\xa9seau")->GetVlanId(), 12);

    // Text as the store itself never writes it: escapes where none are
    // needed, and a field nested deeper than a recursive reader's stack
    // would like (the store's own check stops at a depth of 2000).
    auto store = [&](const std::string& doc) {
        try {
            RawSql("UPDATE object SET doc = '" + doc + "' WHERE section = 'portgroups' AND key = 'raw'");
            return true;
        } catch (const std::runtime_error&) {
            return false;  // text SQLite itself refuses never reaches a reader
        }
    };
    const std::string deep = std::string(1900, '[') + std::string(1900, ']');
    ASSERT_TRUE(
        store(R"({"junk": )" + deep + R"(, "name": "r\u0061w \ud83d\ude80", "vswitch": "vSwitch0", "vlanId": 5})"));
    auto raw = NetworkFactory::GetPortGroupByName("raw");
    EXPECT_EQ(raw->GetName(), "raw \xf0\x9f\x9a\x80");
    EXPECT_EQ(raw->GetVlanId(), 5);

    int stored = 0;
    for (const char* damaged : {R"({"name": "raw", "vlanId": )", R"({"name": "raw"} x)", R"(["raw"])",
                                R"({"name": "raw", "vlanId": 01})", R"({"name": "\ud83d"})"}) {
        if (!store(damaged)) continue;
        ++stored;
        try {
            NetworkFactory::GetPortGroupByName("raw")->GetVlanId();
            ADD_FAILURE() << "read " << damaged;
        } catch (const std::exception& e) {
            EXPECT_NE(std::string(e.what()).find("holds an object that is not JSON"), std::string::npos) << e.what();
        }
    }
    EXPECT_GE(stored, 2);
}

}  // namespace
