// The stored record of a physical NIC with its driver data, and the parts of
// it the NIC's operations hand out. Defaults are the member initialisers;
// docs/host-profile.md describes the same fields for profile writers. A
// driver record that is absent (std::nullopt) is one the driver cannot
// report: reading or changing it fails.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/network/nic/Pnic.h"
#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct LinkModeRecord {
    std::int64_t speed = 0;       // Mbps
    std::string duplex = "auto";  // "auto", "full" or "half"
};

using PauseRecord = HostCtl::Network::PauseParams;

struct CoalesceRecord {
    bool adaptiveRx = false;
    bool adaptiveTx = false;
    std::uint32_t sampleInterval = 0;  // seconds
    std::uint32_t rxUsecs = 0;
    std::uint32_t rxMaxFrames = 0;
    std::uint32_t txUsecs = 0;
    std::uint32_t txMaxFrames = 0;
};

// Ring entry counts.
struct RingSizesRecord {
    std::uint32_t rx = 0;
    std::uint32_t rxMini = 0;
    std::uint32_t rxJumbo = 0;
    std::uint32_t tx = 0;
};

struct RingsRecord {
    RingSizesRecord preset;  // the largest sizes the NIC takes
    RingSizesRecord current;
};

struct OffloadsRecord {
    bool rxChecksum = false;
    bool txChecksum = false;
    bool scatterGather = false;
    bool tso = false;
};

// Which offloads the host simulates in software, one member per feature in
// the order of HostCtl::Network::SoftwareSimulation::Feature.
struct SoftwareSimulationRecord {
    bool ipv4Cso = false;
    bool ipv4Tso = false;
    bool scatterGather = false;
    bool offsetBasedOffload = false;
    bool vxlanEncap = false;
    bool ipv6Tso = false;
    bool ipv6TsoExt = false;
    bool ipv6Cso = false;
    bool ipv6CsoExt = false;
    bool highDma = false;
    bool scatterGatherMultiPage = false;
    bool vlanTagging = false;
    bool vlanUntagging = false;
    bool geneveOffload = false;
};

// The counters are stored as the library hands them out.
using NicStatsRecord = HostCtl::Network::PnicStats;

struct SelfTestRecord {
    bool passed = false;
    std::vector<std::string> online;   // result lines of an online test
    std::vector<std::string> offline;  // result lines of an offline test
};

using VfStatsRecord = HostCtl::Network::SriovNicVFStats;

// One virtual function of an SR-IOV NIC.
struct VfRecord {
    std::int64_t id = 0;  // 0 to 255, unique on the NIC
    bool active = false;
    std::string pciAddress;
    std::int64_t ownerWorldId = 0;  // 0 for none
    VfStatsRecord stats;
};

struct NicRecord {
    static constexpr const char* kSection = Store::Section::kNics;

    // Identity and driver.
    std::string name;
    std::optional<std::string> pciDevice;  // absent for a NIC without one
    std::string vendorName;
    std::string deviceName;
    std::string driver;
    std::string driverVersion;
    std::string firmwareVersion;

    // Link.
    bool adminUp = true;
    bool linkUp = false;
    std::int64_t speed = 0;  // Mbps
    std::string duplex = "half";
    bool autoNegotiation = true;
    std::int64_t mtu = 1500;
    std::string mac = "00:00:00:00:00:00";

    // Generic settings.
    std::vector<std::int64_t> supportedPorts;
    std::int64_t port = 0;
    std::string transceiver = "internal";
    std::int64_t phyAddress = 0;
    std::string virtualAddress;
    bool supportsAutoNegotiation = false;
    bool advertisedAutoNegotiation = false;
    std::vector<LinkModeRecord> advertisedLinkModes;
    bool supportsWakeOn = false;
    std::vector<std::int64_t> wakeOn;
    bool supportsMessageLevel = false;
    std::uint32_t messageLevel = 0;
    // The id of the NIC's port on the switch it is an uplink of; 0 for none.
    std::int64_t uplinkPortId = 0;

    // Driver records.
    PauseRecord pause;
    std::optional<CoalesceRecord> coalesce;
    std::optional<RingsRecord> rings;
    std::optional<OffloadsRecord> offloads;
    SoftwareSimulationRecord softwareSimulation;
    NicStatsRecord stats;

    // Diagnostics.
    std::optional<std::vector<std::uint32_t>> registers;
    std::optional<std::string> eeprom;  // hex digit pairs, byte 0 first
    std::uint32_t eepromMagic = 0;
    std::optional<SelfTestRecord> selfTest;

    // SR-IOV: present (even empty) on a capable NIC.
    std::optional<std::vector<VfRecord>> sriovVfs;
};

// Throws HostCtlException "NIC NAME does not exist".
[[noreturn]] void NoSuchNic(const std::string& name);

// The stored NIC of that name, read through a store or a transaction, or
// NoSuchNic.
template <typename Source>
NicRecord RequireNic(Source& source, const std::string& name) {
    std::optional<NicRecord> nic = Get<NicRecord>(source, name);
    if (!nic) NoSuchNic(name);
    return std::move(*nic);
}

}  // namespace Detail
}  // namespace PldCtl
