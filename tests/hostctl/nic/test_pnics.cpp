// Physical NICs as the library keeps them: what a change leaves in the store
// and shows to a new object, what a refused change leaves (nothing), which
// members a mask lets through, and snapshots against fresh reads.
#include <gtest/gtest.h>

#include <sys/stat.h>

#include <fstream>

#include "hostctl/HostFixture.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/nic/PnicImpl.h"

namespace {

using namespace HostCtl::Network;
using PldCtl::Network::NetworkInfoImpl;
using PldCtl::Network::PnicImpl;

class Pnics : public FreshHost {
protected:
    static std::unique_ptr<Pnic> Nic(const std::string& name) {
        auto nic = NetworkInfoImpl().GetPnicByName(name);
        if (!nic) throw std::runtime_error("no NIC " + name);
        return nic;
    }
    Json StoredNic(const std::string& name) const { return Stored("nics", "name", name); }

    // Runs a change that must be refused with `message` and checks that the
    // stored NICs are exactly as before.
    void ExpectRefused(const std::function<void()>& change, const std::string& message) {
        const Json before = Dump()["nics"];
        EXPECT_EQ(MessageOf(change), message);
        EXPECT_EQ(Dump()["nics"], before) << "a refused change wrote: " << message;
    }
};

TEST_F(Pnics, AdminDownHidesTheLinkAndUpRestoresIt) {
    auto nic = Nic("hwnic0");
    nic->SetAdminUp(false);
    EXPECT_FALSE(nic->IsAdminUp());
    EXPECT_FALSE(nic->IsLinkUp());
    EXPECT_FALSE(nic->IsLinkStatusUp());
    EXPECT_EQ(nic->GetLinkSpeed(), 0u);
    // The wire still has a partner: the stored link stays for `up`.
    EXPECT_EQ(StoredNic("hwnic0")["adminUp"], false);
    EXPECT_EQ(StoredNic("hwnic0")["linkUp"], true);
    PnicImpl fresh("hwnic0");
    EXPECT_FALSE(fresh.IsAdminUp());
    PnicInfo info;
    fresh.GetPnicInfo(info);
    EXPECT_EQ(info.linkStatus, "Down");

    PnicImpl("hwnic0").SetAdminUp(true);
    auto again = Nic("hwnic0");
    EXPECT_TRUE(again->IsLinkStatusUp());
    EXPECT_EQ(again->GetLinkSpeed(), 1000u);
}

TEST_F(Pnics, SnapshotsKeepWhatTheyReadAndNamedObjectsReadOnFirstUse) {
    auto listed = NetworkInfoImpl().GetPnics();
    ASSERT_EQ(listed.size(), 8u);
    EXPECT_EQ(listed[7]->GetName(), "hwnic7");
    PnicImpl named("hwnic1");  // nothing read yet
    Nic("hwnic1")->SetLinkSpeedDuplex(100, DUPLEX_HALF);
    // The listing's snapshot is as it was; the named object reads now.
    EXPECT_EQ(listed[1]->GetLinkSpeed(), 1000u);
    EXPECT_EQ(listed[1]->GetDuplex(), DUPLEX_FULL);
    EXPECT_EQ(named.GetLinkSpeed(), 100u);
    EXPECT_EQ(named.GetDuplex(), DUPLEX_HALF);
    // The object that changes a NIC sees its own change.
    listed[1]->SetAdminUp(false);
    EXPECT_EQ(listed[1]->GetLinkSpeed(), 0u);
    EXPECT_FALSE(listed[1]->IsAdminUp());
    EXPECT_EQ(StoredNic("hwnic1")["speed"], 100);
    EXPECT_EQ(StoredNic("hwnic1")["autoNegotiation"], false);
}

TEST_F(Pnics, AChangeFromAnOlderSnapshotKeepsOtherChanges) {
    auto first = Nic("hwnic2");
    auto second = Nic("hwnic2");
    first->SetAdminUp(false);
    OffloadSettings offloads;
    offloads.mask = OffloadSettings::MASK_TSO;
    second->SetOffloadSettings(offloads);
    // The second object's write carried only its own edit.
    const Json stored = StoredNic("hwnic2");
    EXPECT_EQ(stored["adminUp"], false);
    EXPECT_EQ(stored["offloads"]["tso"], false);
    EXPECT_FALSE(second->IsAdminUp());
}

TEST_F(Pnics, NamesTheHostDoesNotHave) {
    EXPECT_EQ(NetworkInfoImpl().GetPnicByName("hwnic9"), nullptr);
    EXPECT_FALSE(PnicImpl::IsValidPnic("hwnic9"));
    PnicImpl missing("hwnic9");
    EXPECT_EQ(missing.GetName(), "hwnic9");
    EXPECT_EQ(MessageOf([&] { missing.IsAdminUp(); }), "NIC hwnic9 does not exist");
    EXPECT_EQ(MessageOf([&] { missing.SetAdminUp(true); }), "NIC hwnic9 does not exist");
    EXPECT_TRUE(Stored("nics", "name", "hwnic9").is_null());
    // A NIC removed behind a snapshot's back is not written back by a change.
    auto nic = Nic("hwnic3");
    RawSql("DELETE FROM object WHERE section = 'nics' AND key = 'hwnic3'");
    EXPECT_EQ(MessageOf([&] { nic->SetAdminUp(false); }), "NIC hwnic3 does not exist");
    EXPECT_TRUE(StoredNic("hwnic3").is_null());
}

TEST_F(Pnics, PseudoNicHasNoPciDeviceAndNoDriverRecords) {
    auto pseudo = Nic("hwnic6");
    EXPECT_EQ(pseudo->GetPciDevice(), nullptr);
    DriverInfo driver;
    pseudo->GetDriverInfo(driver);
    EXPECT_EQ(driver.busInfo, "");
    EXPECT_EQ(driver.driver, "vpseudo");
    CoalesceParams coalesce;
    RingParams preset, current;
    OffloadSettings offloads;
    std::vector<std::uint32_t> registers;
    std::vector<std::uint8_t> bytes;
    SelfTestResult result;
    EXPECT_EQ(MessageOf([&] { pseudo->GetCoalesceParams(coalesce); }),
              "The driver of NIC hwnic6 does not support coalesce parameters");
    EXPECT_EQ(MessageOf([&] { pseudo->GetRingParams(preset, current); }),
              "The driver of NIC hwnic6 does not support ring parameters");
    EXPECT_EQ(MessageOf([&] { pseudo->GetOffloadSettings(offloads); }),
              "The driver of NIC hwnic6 does not support offload settings");
    EXPECT_EQ(MessageOf([&] { pseudo->GetRegisters(registers); }),
              "The driver of NIC hwnic6 does not support register dumps");
    EXPECT_EQ(MessageOf([&] { pseudo->GetEeprom(bytes, 0, 0); }),
              "The driver of NIC hwnic6 does not support EEPROM access");
    EXPECT_EQ(MessageOf([&] { pseudo->RunSelfTest(result, true); }),
              "The driver of NIC hwnic6 does not support self tests");
    // Changing a record the driver lacks never creates it.
    ExpectRefused([&] { pseudo->SetCoalesceParams(coalesce); },
                  "The driver of NIC hwnic6 does not support coalesce parameters");
    ExpectRefused([&] { pseudo->SetRingParams(RingParams()); },
                  "The driver of NIC hwnic6 does not support ring parameters");
    ExpectRefused([&] { pseudo->SetOffloadSettings(offloads); },
                  "The driver of NIC hwnic6 does not support offload settings");
    ExpectRefused([&] { pseudo->SetEepromValue(0, 0, 0); }, "The driver of NIC hwnic6 does not support EEPROM access");
    ExpectRefused([&] { Nic("hwnic5")->SetPauseParams(PauseParams{}); },
                  "The driver of NIC hwnic5 does not support pause parameters");

    auto pci = Nic("hwnic4")->GetPciDevice();
    ASSERT_NE(pci, nullptr);
    EXPECT_EQ(pci->GetName(), StoredNic("hwnic4")["pciDevice"]);
    EXPECT_EQ(pci->GetVendorName() + " " + pci->GetDeviceName(),
              StoredNic("hwnic4")["vendorName"].get<std::string>() + " " +
                  StoredNic("hwnic4")["deviceName"].get<std::string>());
}

TEST_F(Pnics, GenericSettingsApplyMarkedMembersAndRefuseWhatDoesNotFit) {
    auto nic = Nic("hwnic0");
    PnicInfo info;
    nic->GetPnicInfo(info);
    // Unmarked members are not applied, whatever they hold.
    info.phyAddress = 17;
    info.messageLevel = 3;
    info.virtualAddressChanged = true;
    info.virtualAddress = "02:a1:ff:00:00:01";
    nic->SetPnicInfo(info);
    Json stored = StoredNic("hwnic0");
    EXPECT_EQ(stored["virtualAddress"], "02:a1:ff:00:00:01");
    EXPECT_EQ(stored["phyAddress"], 1);
    EXPECT_EQ(stored["messageLevel"], 7);

    PnicInfo change;
    nic->GetPnicInfo(change);
    change.messageLevelChanged = true;
    change.messageLevel = 4294967295;
    change.wakeOnChanged = true;
    change.wakeOnModes = {WAKE_ON_PHY, WAKE_ON_MAGIC};
    change.transceiverChanged = true;
    change.transceiver = TRANSCEIVER_EXTERNAL;
    nic->SetPnicInfo(change);
    PnicInfo read;
    PnicImpl("hwnic0").GetPnicInfo(read);
    EXPECT_EQ(read.messageLevel, 4294967295);
    EXPECT_EQ(read.wakeOnModes, (std::vector<WakeOnMode>{WAKE_ON_PHY, WAKE_ON_MAGIC}));
    EXPECT_EQ(read.transceiver, TRANSCEIVER_EXTERNAL);

    auto refused = [&](auto mark, auto member, auto value) {
        PnicInfo bad = read;
        bad.*mark = true;
        bad.*member = value;
        return [nic = nic.get(), bad] { nic->SetPnicInfo(bad); };
    };
    ExpectRefused(refused(&PnicInfo::phyAddressChanged, &PnicInfo::phyAddress, std::int64_t{2147483648}),
                  "Invalid PHY address value 2147483648 for NIC hwnic0: must be between 0 and 2147483647");
    ExpectRefused(refused(&PnicInfo::messageLevelChanged, &PnicInfo::messageLevel, std::int64_t{-1}),
                  "Invalid message level value -1 for NIC hwnic0: must be between 0 and 4294967295");
    ExpectRefused(refused(&PnicInfo::messageLevelChanged, &PnicInfo::messageLevel, std::int64_t{4294967296}),
                  "Invalid message level value 4294967296 for NIC hwnic0: must be between 0 and 4294967295");
    ExpectRefused(refused(&PnicInfo::transceiverChanged, &PnicInfo::transceiver, 2),
                  "Invalid transceiver value 2 for NIC hwnic0: must be between 0 and 1");
    ExpectRefused(refused(&PnicInfo::wakeOnChanged, &PnicInfo::wakeOnModes, std::vector<WakeOnMode>{WAKE_ON_DISABLED}),
                  "Invalid wake-on-LAN mode value 8 for NIC hwnic0: must be between 0 and 6");
    ExpectRefused(refused(&PnicInfo::portChanged, &PnicInfo::port, PORT_FIBRE), "NIC hwnic0 does not offer port 4");
    // A refusal among several marked members writes none of them.
    PnicInfo mixed = read;
    mixed.virtualAddressChanged = true;
    mixed.virtualAddress = "changed";
    mixed.portChanged = true;
    mixed.port = PORT_DA;
    ExpectRefused([&] { nic->SetPnicInfo(mixed); }, "NIC hwnic0 does not offer port 5");

    auto fibre = Nic("hwnic2");
    PnicInfo wake;
    fibre->GetPnicInfo(wake);
    wake.wakeOnChanged = true;
    wake.wakeOnModes = {WAKE_ON_MAGIC};
    ExpectRefused([&] { fibre->SetPnicInfo(wake); }, "The driver of NIC hwnic2 does not support wake-on-LAN");
    PnicInfo level;
    fibre->GetPnicInfo(level);
    level.messageLevelChanged = true;
    ExpectRefused([&] { fibre->SetPnicInfo(level); }, "The driver of NIC hwnic2 does not support a message level");
}

TEST_F(Pnics, SpeedDuplexAndNegotiation) {
    auto nic = Nic("hwnic0");
    ExpectRefused([&] { nic->SetLinkSpeedDuplex(4294967296, DUPLEX_FULL); },
                  "Invalid speed value 4294967296 for NIC hwnic0: must be between 0 and 4294967295");
    ExpectRefused([&] { nic->SetLinkSpeedDuplex(-10, DUPLEX_FULL); },
                  "Invalid speed value -10 for NIC hwnic0: must be between 0 and 4294967295");
    ExpectRefused([&] { nic->SetLinkSpeedDuplex(100, 3); },
                  "Invalid duplex value 3 for NIC hwnic0: must be between 1 and 2");
    nic->SetLinkSpeedDuplex(10, DUPLEX_HALF);
    EXPECT_EQ(StoredNic("hwnic0")["duplex"], "half");
    EXPECT_EQ(StoredNic("hwnic0")["autoNegotiation"], false);
    EXPECT_EQ(MessageOf([&] { nic->RestartNegotiation(); }),
              "Unable to restart negotiation on NIC hwnic0: autonegotiation is off");
    // Autonegotiation takes the best advertised mode, full before half.
    nic->SetLinkSpeedDuplex(0, DUPLEX_AUTO);
    PnicImpl fresh("hwnic0");
    EXPECT_EQ(fresh.GetLinkSpeed(), 1000u);
    EXPECT_EQ(fresh.GetDuplex(), DUPLEX_FULL);
    EXPECT_EQ(StoredNic("hwnic0")["autoNegotiation"], true);
    // Without a link there is nothing to settle on.
    auto down = Nic("hwnic5");
    down->SetLinkSpeedDuplex(0, DUPLEX_AUTO);
    EXPECT_EQ(StoredNic("hwnic5")["speed"], 0);
    EXPECT_EQ(StoredNic("hwnic5")["duplex"], "half");
}

TEST_F(Pnics, DriverParametersRangesAndMasks) {
    auto nic = Nic("hwnic1");
    CoalesceParams coalesce;
    nic->GetCoalesceParams(coalesce);
    coalesce.rxUsecs = 4294967295;
    coalesce.adaptiveTx = true;
    nic->SetCoalesceParams(coalesce);
    EXPECT_EQ(StoredNic("hwnic1")["coalesce"]["rxUsecs"], 4294967295u);
    EXPECT_EQ(StoredNic("hwnic1")["coalesce"]["adaptiveTx"], true);
    for (auto member : {&CoalesceParams::sampleInterval, &CoalesceParams::rxMaxFrames, &CoalesceParams::txUsecs}) {
        CoalesceParams bad = coalesce;
        bad.*member = -1;
        const std::string message = MessageOf([&] { nic->SetCoalesceParams(bad); });
        EXPECT_NE(message.find("value -1 for NIC hwnic1: must be between 0 and 4294967295"), std::string::npos)
            << message;
    }
    CoalesceParams big = coalesce;
    big.txMaxFrames = 4294967296;
    ExpectRefused([&] { nic->SetCoalesceParams(big); },
                  "Invalid TX maximum frames value 4294967296 for NIC hwnic1: must be between 0 and 4294967295");

    // Rings: only masked sizes are checked and applied, each up to its preset.
    RingParams rings;
    rings.mask = RingParams::MASK_TX;
    rings.tx = 4096;
    rings.rx = 999999;
    nic->SetRingParams(rings);
    RingParams preset, current;
    PnicImpl("hwnic1").GetRingParams(preset, current);
    EXPECT_EQ(current.tx, 4096);
    EXPECT_EQ(current.rx, 1024);
    rings.mask = RingParams::MASK_RX | RingParams::MASK_TX;
    rings.tx = 16;
    ExpectRefused([&] { nic->SetRingParams(rings); },
                  "Invalid RX ring size value 999999 for NIC hwnic1: must be between 0 and 4096");
    rings.mask = RingParams::MASK_RX_MINI;
    rings.rxMini = 1;
    ExpectRefused([&] { nic->SetRingParams(rings); },
                  "Invalid RX mini ring size value 1 for NIC hwnic1: must be between 0 and 0");

    // Offloads and software simulation: only masked members change.
    OffloadSettings offloads;
    offloads.mask = OffloadSettings::MASK_TSO;
    nic->SetOffloadSettings(offloads);
    EXPECT_EQ(StoredNic("hwnic1")["offloads"],
              (Json{{"rxChecksum", true}, {"txChecksum", true}, {"scatterGather", true}, {"tso", false}}));
    SoftwareSimulation simulation;
    simulation.mask = SoftwareSimulation::MaskOf(SoftwareSimulation::VLAN_TAGGING) |
                      SoftwareSimulation::MaskOf(SoftwareSimulation::GENEVE_OFFLOAD);
    simulation.enabled[SoftwareSimulation::VLAN_TAGGING] = true;
    simulation.enabled[SoftwareSimulation::IPV6_TSO_EXT] = false;  // not masked
    nic->SetSoftwareSimulation(simulation);
    SoftwareSimulation read;
    PnicImpl("hwnic1").GetSoftwareSimulation(read);
    EXPECT_TRUE(read.enabled[SoftwareSimulation::VLAN_TAGGING]);
    EXPECT_FALSE(read.enabled[SoftwareSimulation::GENEVE_OFFLOAD]);
    EXPECT_TRUE(read.enabled[SoftwareSimulation::IPV6_TSO_EXT]);

    PauseParams pause;
    nic->GetPauseParams(pause);
    pause.tx = true;
    pause.rxResolution = 0;  // read only
    nic->SetPauseParams(pause);
    EXPECT_EQ(StoredNic("hwnic1")["pause"]["tx"], true);
    EXPECT_EQ(StoredNic("hwnic1")["pause"]["rxResolution"], 1);
}

TEST_F(Pnics, FieldsTheLibraryDoesNotKnowSurviveChanges) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
                 "nics": [{"name": "hwnic0", "vendorTag": "x", "driver": "d",
                           "coalesce": {"rxUsecs": 5, "vendorKnob": 9},
                           "rings": {"preset": {"rx": 64, "tx": 64}, "current": {"rx": 32}}}]})");
    PnicImpl nic("hwnic0");
    CoalesceParams coalesce;
    nic.GetCoalesceParams(coalesce);
    coalesce.rxUsecs = 6;
    nic.SetCoalesceParams(coalesce);
    RingParams rings;
    rings.mask = RingParams::MASK_TX;
    rings.tx = 64;
    nic.SetRingParams(rings);
    const Json stored = StoredNic("hwnic0");
    EXPECT_EQ(stored["vendorTag"], "x");
    EXPECT_EQ(stored["coalesce"]["vendorKnob"], 9);
    EXPECT_EQ(stored["coalesce"]["rxUsecs"], 6);
    EXPECT_EQ(stored["rings"]["current"], (Json{{"rx", 32}, {"tx", 64}}));
    // Fields left out read as their documented defaults.
    EXPECT_TRUE(nic.IsAdminUp());
    EXPECT_FALSE(nic.IsLinkUp());
    EXPECT_EQ(nic.GetMtu(), 1500u);
    EXPECT_EQ(nic.GetDuplex(), DUPLEX_HALF);
    EXPECT_EQ(nic.GetMacAddress().GetStringAddress(), "00:00:00:00:00:00");
}

}  // namespace
