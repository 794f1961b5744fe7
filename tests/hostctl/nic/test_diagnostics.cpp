// EEPROM reads and writes (values and files of every kind), SR-IOV lookups,
// per-VLAN counters of uplinks, and injected faults of each operation family.
#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>

#include "hostctl/HostFixture.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace {

using namespace HostCtl::Network;
using PldCtl::Network::NetworkInfoImpl;
using PldCtl::Network::PnicImpl;

// The default host's EEPROM magic of hwnic0 and the size of its EEPROM.
constexpr std::int64_t kMagic = 1511461115;
constexpr std::int64_t kEepromSize = 64;

class Diagnostics : public FreshHost {
protected:
    std::string StoredEeprom(const std::string& nic) const {
        return Stored("nics", "name", nic)["eeprom"].get<std::string>();
    }
    std::vector<std::uint8_t> Eeprom(const std::string& nic, std::int64_t length = 0, std::int64_t offset = 0) {
        std::vector<std::uint8_t> bytes;
        PnicImpl(nic).GetEeprom(bytes, length, offset);
        return bytes;
    }
    std::string WriteFile(const std::string& name, const std::string& content) {
        const std::string path = files_ / name;
        OrvixTest::WriteFile(path, content);
        return path;
    }
    // Checks that writing `file` is refused with `message` and the EEPROM is
    // unchanged.
    void ExpectFileRefused(const std::string& file, const std::string& message) {
        const std::string before = StoredEeprom("hwnic0");
        EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic0").SetEepromFromFile(kMagic, file); }), message);
        EXPECT_EQ(StoredEeprom("hwnic0"), before);
    }
    OrvixTest::TempDir files_;
};

TEST_F(Diagnostics, EepromReadsARangeOrToTheEnd) {
    const std::vector<std::uint8_t> all = Eeprom("hwnic0");
    ASSERT_EQ(all.size(), static_cast<std::size_t>(kEepromSize));
    EXPECT_EQ(all[0], 0x02);
    EXPECT_EQ(all[1], 0xa1);
    EXPECT_EQ(Eeprom("hwnic0", 2, 1), (std::vector<std::uint8_t>{0xa1, 0x00}));
    EXPECT_EQ(Eeprom("hwnic0", 0, 60), std::vector<std::uint8_t>(all.begin() + 60, all.end()));
    EXPECT_EQ(Eeprom("hwnic0", 1, 63).size(), 1u);
    std::vector<std::uint8_t> bytes;
    PnicImpl nic("hwnic0");
    EXPECT_EQ(MessageOf([&] { nic.GetEeprom(bytes, 0, 64); }),
              "Invalid EEPROM offset value 64 for NIC hwnic0: must be between 0 and 63");
    EXPECT_EQ(MessageOf([&] { nic.GetEeprom(bytes, 0, -1); }),
              "Invalid EEPROM offset value -1 for NIC hwnic0: must be between 0 and 63");
    EXPECT_EQ(MessageOf([&] { nic.GetEeprom(bytes, 5, 60); }),
              "Invalid EEPROM length value 5 for NIC hwnic0: must be between 0 and 4");
    EXPECT_EQ(MessageOf([&] { nic.GetEeprom(bytes, -1, 0); }),
              "Invalid EEPROM length value -1 for NIC hwnic0: must be between 0 and 64");
}

// An EEPROM of no bytes reads as nothing and takes no 32-bit word.
TEST_F(Diagnostics, AnEmptyEepromReadsAsNothing) {
    ASSERT_FALSE(Eeprom("hwnic0").empty());  // creates the host
    RawSql(R"(UPDATE object SET doc = json_set(doc, '$.eeprom', '') WHERE section = 'nics' AND key = 'hwnic0')");
    EXPECT_TRUE(Eeprom("hwnic0").empty());
    std::vector<std::uint8_t> bytes;
    EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic0").GetEeprom(bytes, 1, 0); }),
              "Invalid EEPROM length value 1 for NIC hwnic0: must be between 0 and 0");
    EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic0").SetEepromValue(kMagic, 0, 1); }),
              "The EEPROM of NIC hwnic0 has 0 bytes, too few for a 32-bit value");
    EXPECT_EQ(StoredEeprom("hwnic0"), "");
}

TEST_F(Diagnostics, EepromValueIsStoredLowestByteFirst) {
    PnicImpl nic("hwnic0");
    nic.SetEepromValue(kMagic, 60, 0x11223344);
    EXPECT_EQ(Eeprom("hwnic0", 4, 60), (std::vector<std::uint8_t>{0x44, 0x33, 0x22, 0x11}));
    EXPECT_EQ(StoredEeprom("hwnic0").substr(120), "44332211");
    nic.SetEepromValue(kMagic, 0, 4294967295);
    EXPECT_EQ(StoredEeprom("hwnic0").substr(0, 10), "ffffffff00");

    const std::string before = StoredEeprom("hwnic0");
    EXPECT_EQ(MessageOf([&] { nic.SetEepromValue(kMagic + 1, 0, 0); }),
              "Wrong EEPROM magic key 1511461116 for NIC hwnic0");
    EXPECT_EQ(MessageOf([&] { nic.SetEepromValue(kMagic, 61, 0); }),
              "Invalid EEPROM offset value 61 for NIC hwnic0: must be between 0 and 60");
    EXPECT_EQ(MessageOf([&] { nic.SetEepromValue(kMagic, -4, 0); }),
              "Invalid EEPROM offset value -4 for NIC hwnic0: must be between 0 and 60");
    EXPECT_EQ(MessageOf([&] { nic.SetEepromValue(kMagic, 0, 4294967296); }),
              "Invalid EEPROM word value 4294967296 for NIC hwnic0: must be between 0 and 4294967295");
    EXPECT_EQ(MessageOf([&] { nic.SetEepromValue(kMagic, 0, -1); }),
              "Invalid EEPROM word value -1 for NIC hwnic0: must be between 0 and 4294967295");
    EXPECT_EQ(StoredEeprom("hwnic0"), before);
}

TEST_F(Diagnostics, EepromFileReplacesThePrefix) {
    const std::string before = StoredEeprom("hwnic0");
    const std::string file = WriteFile("image.bin", std::string("\x00\xff\x10", 3));
    PnicImpl("hwnic0").SetEepromFromFile(kMagic, file);
    EXPECT_EQ(StoredEeprom("hwnic0"), "00ff10" + before.substr(6));
    // A link to a regular file is followed; a whole-size image replaces all.
    const std::string full = WriteFile("full.bin", std::string(kEepromSize, '\x5a'));
    const std::string link = files_ / "link.bin";
    ASSERT_EQ(::symlink(full.c_str(), link.c_str()), 0);
    PnicImpl("hwnic0").SetEepromFromFile(kMagic, link);
    std::string image;
    for (int i = 0; i < kEepromSize; ++i) image += "5a";
    EXPECT_EQ(StoredEeprom("hwnic0"), image);
    // An empty file changes nothing and is no error.
    PnicImpl("hwnic0").SetEepromFromFile(kMagic, WriteFile("empty.bin", ""));
    EXPECT_EQ(StoredEeprom("hwnic0").substr(0, 4), "5a5a");
}

TEST_F(Diagnostics, EepromFilesThatCannotBeWrittenWriteNothing) {
    ExpectFileRefused(files_ / "missing.bin",
                      "EEPROM file " + (files_ / "missing.bin") + " cannot be read: No such file or directory");
    ExpectFileRefused(files_.Path(), "EEPROM file " + files_.Path() + " is not a regular file");
    // A FIFO with no writer must be refused at once, never waited on.
    const std::string fifo = files_ / "fifo";
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    ExpectFileRefused(fifo, "EEPROM file " + fifo + " is not a regular file");
    ExpectFileRefused("/dev/null", "EEPROM file /dev/null is not a regular file");
    const std::string oversized = WriteFile("big.bin", std::string(kEepromSize + 1, '\x01'));
    ExpectFileRefused(oversized,
                      "EEPROM file " + oversized + " has 65 bytes, more than the 64 bytes of the EEPROM of NIC hwnic0");
    // The key is checked before the file is even looked at.
    const std::string before = StoredEeprom("hwnic0");
    EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic0").SetEepromFromFile(7, WriteFile("ok.bin", "x")); }),
              "Wrong EEPROM magic key 7 for NIC hwnic0");
    EXPECT_EQ(StoredEeprom("hwnic0"), before);
}

TEST_F(Diagnostics, RegistersAndSelfTests) {
    std::vector<std::uint32_t> registers;
    PnicImpl("hwnic0").GetRegisters(registers);
    const Json stored = Stored("nics", "name", "hwnic0")["registers"];
    ASSERT_EQ(registers.size(), stored.size());
    EXPECT_EQ(registers[4], stored[4].get<std::uint32_t>());
    SelfTestResult result;
    PnicImpl("hwnic5").RunSelfTest(result, false);
    EXPECT_FALSE(result.passed);
    EXPECT_EQ(result.info.size(), 4u);
    PnicImpl("hwnic5").RunSelfTest(result, true);
    EXPECT_EQ(result.info, (std::vector<std::string>{"Link test (on/offline)        1"}));
}

TEST_F(Diagnostics, SriovLookups) {
    NetworkInfoImpl info;
    auto sriov = info.GetSriovNics();
    ASSERT_EQ(sriov.size(), 1u);
    EXPECT_EQ(sriov[0]->GetName(), "hwnic4");
    EXPECT_EQ(info.GetSriovNicByName("hwnic0"), nullptr);
    EXPECT_EQ(info.GetSriovNicByName("hwnic9"), nullptr);
    ASSERT_NE(info.GetSriovNicByName("hwnic4"), nullptr);
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFInfo("hwnic0"); }), "NIC hwnic0 is not SR-IOV capable");
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFInfo("hwnic9"); }), "NIC hwnic9 does not exist");
    auto vfs = info.GetSriovNicVFInfo("hwnic4");
    ASSERT_EQ(vfs.size(), 3u);
    EXPECT_EQ(vfs[0]->ownerWorldId, "1049777");
    EXPECT_TRUE(vfs[0]->active);
    EXPECT_FALSE(vfs[2]->active);
}

TEST_F(Diagnostics, VirtualFunctionsAreFoundByTheirWholeId) {
    // VFs come in id order whatever the stored order; an empty array is
    // still SR-IOV capable.
    MakeHost(R"({"format": "orvix-host-profile", "version": 1, "nics": [
        {"name": "hwnic0", "sriovVfs": [{"id": 3, "ownerWorldId": 4294967295, "active": true,
                                        "stats": {"rxUnicastPackets": 33}},
                                       {"id": 1, "pciAddress": "0000:06:00.3", "stats": {"txTsoBytes": 11}}]},
        {"name": "hwnic1", "sriovVfs": []}, {"name": "hwnic2"}]})");
    NetworkInfoImpl info;
    auto vfs = info.GetSriovNicVFInfo("hwnic0");
    ASSERT_EQ(vfs.size(), 2u);
    EXPECT_EQ(vfs[0]->vfId, 1);
    EXPECT_EQ(vfs[0]->ownerWorldId, "0");
    EXPECT_EQ(vfs[0]->pciAddress, "0000:06:00.3");
    EXPECT_EQ(vfs[1]->vfId, 3);
    EXPECT_EQ(vfs[1]->ownerWorldId, "4294967295");
    EXPECT_TRUE(info.GetSriovNicVFInfo("hwnic1").empty());
    EXPECT_EQ(info.GetSriovNics().size(), 2u);

    SriovNicVFStats stats;
    info.GetSriovNicVFStats(stats, "hwnic0", 3);
    EXPECT_EQ(stats.rxUnicastPackets, 33u);
    info.GetSriovNicVFStats(stats, "hwnic0", 1);
    EXPECT_EQ(stats.txTsoBytes, 11u);
    EXPECT_EQ(stats.rxUnicastPackets, 0u);
    // Ids that would name VF 3 or 1 if they were narrowed.
    stats = SriovNicVFStats();
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFStats(stats, "hwnic0", 4294967299); }),
              "NIC hwnic0 has no VF with ID 4294967299");
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFStats(stats, "hwnic0", 257); }), "NIC hwnic0 has no VF with ID 257");
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFStats(stats, "hwnic0", -255); }), "NIC hwnic0 has no VF with ID -255");
    EXPECT_EQ(stats.rxUnicastPackets, 0u);
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFStats(stats, "hwnic2", 0); }), "NIC hwnic2 is not SR-IOV capable");
}

TEST_F(Diagnostics, UplinkVlanCounters) {
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    auto all = switches.GetAllSwitches();
    ASSERT_EQ(all.size(), 3u);  // vSwitch0, vSwitch1, then the distributed dvSwitch0
    EXPECT_EQ(all[2]->GetName(), "dvSwitch0");
    auto& vSwitch0 = *all[0];
    EXPECT_EQ(vSwitch0.GetName(), "vSwitch0");
    auto counted = vSwitch0.GetUplinkVlanStats("hwnic0");
    ASSERT_EQ(counted.size(), 3u);
    EXPECT_EQ(counted[1]->vlanId, 20);
    EXPECT_EQ(counted[1]->rxPackets, 7734008u);
    // hwnic1 is an uplink that does not count; hwnic2 is another switch's.
    EXPECT_TRUE(vSwitch0.GetUplinkVlanStats("hwnic1").empty());
    EXPECT_EQ(MessageOf([&] { vSwitch0.GetUplinkVlanStats("hwnic2"); }), "hwnic2 is not an uplink of vSwitch0");
    EXPECT_EQ(MessageOf([&] { vSwitch0.SetUplinkVlanStatsEnabled("hwnic4", true); }),
              "hwnic4 is not an uplink of vSwitch0");
    EXPECT_EQ(MessageOf([&] { all[1]->GetUplinkVlanStats("hwnic0"); }), "hwnic0 is not an uplink of vSwitch1");

    // Turning counting off drops the counters; on again starts from none.
    vSwitch0.SetUplinkVlanStatsEnabled("hwnic0", false);
    Json port = Stored("ports", "id", 33554433);
    EXPECT_EQ(port["vlanStatsEnabled"], false);
    EXPECT_EQ(port["vlanStats"], Json::array());
    EXPECT_EQ(port["client"], "hwnic0");
    vSwitch0.SetUplinkVlanStatsEnabled("hwnic0", true);
    EXPECT_EQ(Stored("ports", "id", 33554433)["vlanStatsEnabled"], true);
    EXPECT_TRUE(vSwitch0.GetUplinkVlanStats("hwnic0").empty());
    vSwitch0.SetUplinkVlanStatsEnabled("hwnic1", true);
    EXPECT_EQ(Stored("ports", "id", 33554434)["vlanStatsEnabled"], true);
}

TEST_F(Diagnostics, InjectedFaultsFailTheirOperationOnly) {
    auto fault = [&](const std::string& operation, const std::string& key) {
        std::vector<std::string> arguments = {"fault", "add", operation, "--message", "injected " + operation};
        if (!key.empty()) arguments.insert(arguments.end(), {"--key", key});
        HostSim(arguments);
    };
    fault("PnicImpl::GetCoalesceParams", "hwnic1");
    fault("PnicImpl::SetRingParams", "hwnic0");
    fault("NetworkInfoImpl::GetSriovNicVFStats", "hwnic4");
    fault("NetworkInfoImpl::GetPnicByName", "hwnic2");
    fault("PortsetImpl::SetUplinkVlanStatsEnabled", "vSwitch0");
    fault("VirtualSwitchInfoImpl::GetAllSwitches", "");

    CoalesceParams coalesce;
    EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic1").GetCoalesceParams(coalesce); }),
              "injected PnicImpl::GetCoalesceParams");
    PnicImpl("hwnic0").GetCoalesceParams(coalesce);  // another NIC

    const Json before = Dump();
    RingParams rings;
    rings.mask = RingParams::MASK_RX;
    rings.rx = 16;
    EXPECT_EQ(MessageOf([&] { PnicImpl("hwnic0").SetRingParams(rings); }), "injected PnicImpl::SetRingParams");
    PnicImpl snapshot("hwnic0");
    RingParams preset, current;
    snapshot.GetRingParams(preset, current);
    EXPECT_EQ(current.rx, 1024);

    NetworkInfoImpl info;
    SriovNicVFStats stats;
    EXPECT_EQ(MessageOf([&] { info.GetSriovNicVFStats(stats, "hwnic4", 0); }),
              "injected NetworkInfoImpl::GetSriovNicVFStats");
    EXPECT_EQ(MessageOf([&] { info.GetPnicByName("hwnic2"); }), "injected NetworkInfoImpl::GetPnicByName");
    EXPECT_NE(info.GetPnicByName("hwnic3"), nullptr);

    auto vSwitch0 = PldCtl::Network::VirtualSwitchInfoImpl().GetVirtualSwitchByName("vSwitch0");
    EXPECT_EQ(MessageOf([&] { vSwitch0->SetUplinkVlanStatsEnabled("hwnic0", false); }),
              "injected PortsetImpl::SetUplinkVlanStatsEnabled");
    EXPECT_EQ(vSwitch0->GetUplinkVlanStats("hwnic0").size(), 3u);
    EXPECT_EQ(MessageOf([&] { PldCtl::Network::VirtualSwitchInfoImpl().GetAllSwitches(); }),
              "injected VirtualSwitchInfoImpl::GetAllSwitches");
    Json after = Dump();
    EXPECT_EQ(after["nics"], before["nics"]);
    EXPECT_EQ(after["ports"], before["ports"]);
}

}  // namespace
