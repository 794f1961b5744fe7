// The host-control library's interface of one physical NIC and the records
// it hands out and takes back. NIC objects are snapshots of the NIC as it was
// when it was fetched; they and every object they hand out belong to the
// caller.
//
// Numbers a user types reach the setters unnarrowed (64-bit): a setter
// refuses a value that does not fit the field it is stored in (a negative
// value for an unsigned field, one above 2^32-1 for a 32-bit field) with a
// HostCtlException naming the value, and writes nothing.
#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace HostCtl {
namespace Network {

// The PCI device of a NIC.
class HOSTCTL_EXPORT PciDevice {
public:
    virtual ~PciDevice();
    // The device's PCI address, e.g. "0000:02:00.0".
    virtual std::string GetName() const = 0;
    // The two halves of the device's description: its maker, its model.
    virtual std::string GetVendorName() const = 0;
    virtual std::string GetDeviceName() const = 0;
};

// Port codes of PnicInfo::supportedPorts and PnicInfo::port. A NIC may
// report a code none of these names.
enum PortCode : int {
    PORT_TP = 0,
    PORT_AUI = 1,
    PORT_BNC = 2,
    PORT_MII = 3,
    PORT_FIBRE = 4,
    PORT_DA = 5,
};

// Transceiver codes of PnicInfo::transceiver.
enum TransceiverCode : int {
    TRANSCEIVER_INTERNAL = 0,
    TRANSCEIVER_EXTERNAL = 1,
};

// Duplex codes: of a link mode (0 auto, 1 full, 2 half), of GetDuplex (1
// full, any other value half) and of SetLinkSpeedDuplex (1 full, 2 half).
enum DuplexCode : int {
    DUPLEX_AUTO = 0,
    DUPLEX_FULL = 1,
    DUPLEX_HALF = 2,
};

// Wake-on-LAN modes. A NIC may report a value none of these names.
enum WakeOnMode : int {
    WAKE_ON_PHY = 0,
    WAKE_ON_UNICAST = 1,
    WAKE_ON_MULTICAST = 2,
    WAKE_ON_BROADCAST = 3,
    WAKE_ON_ARP = 4,
    WAKE_ON_MAGIC = 5,
    WAKE_ON_SECURE_ON = 6,
    WAKE_ON_UNSUPPORTED = 7,
    WAKE_ON_DISABLED = 8,
};

// One advertised link mode.
struct LinkMode {
    std::int64_t speed = 0;  // Mbps
    int duplex = DUPLEX_AUTO;
};

// A NIC's generic settings. SetPnicInfo applies only the members whose
// change mark is set; the others are what GetPnicInfo read.
struct HOSTCTL_EXPORT PnicInfo {
    std::vector<int> supportedPorts;
    bool supportsAutoNegotiation = false;
    std::vector<LinkMode> advertisedLinkModes;
    bool advertisedAutoNegotiation = false;

    bool portChanged = false;
    bool phyAddressChanged = false;
    bool virtualAddressChanged = false;
    bool transceiverChanged = false;
    int port = PORT_TP;
    // Stored in 32 bits; SetPnicInfo refuses a value outside 0 to 2^31-1.
    std::int64_t phyAddress = 0;
    int transceiver = TRANSCEIVER_INTERNAL;
    bool autoNegotiation = false;

    bool wakeOnChanged = false;
    bool supportsWakeOn = false;
    std::vector<WakeOnMode> wakeOnModes;

    bool messageLevelChanged = false;
    bool supportsMessageLevel = false;
    // Unsigned 32-bit; SetPnicInfo refuses a value outside 0 to 2^32-1.
    std::int64_t messageLevel = 0;

    std::string virtualAddress;
    // "Up" when the NIC is administratively up and has a link, else "Down".
    std::string linkStatus;
};

// Flow control. SetPauseParams applies autoNegotiate, rx and tx.
struct PauseParams {
    bool supported = false;
    bool autoNegotiate = false;
    bool rx = false;
    bool tx = false;
    // 0: no resolution is available; 1: the direction is paused by the
    // negotiated result.
    int rxResolution = 0;
    int txResolution = 0;
};

// Interrupt coalescing. The counts are unsigned 32-bit on the NIC;
// SetCoalesceParams refuses a value outside 0 to 2^32-1.
struct CoalesceParams {
    bool adaptiveRx = false;
    bool adaptiveTx = false;
    std::int64_t sampleInterval = 0;  // seconds
    std::int64_t rxUsecs = 0;
    std::int64_t rxMaxFrames = 0;
    std::int64_t txUsecs = 0;
    std::int64_t txMaxFrames = 0;
};

// Ring sizes in entries. SetRingParams applies the sizes whose mask bit is
// set and refuses a size outside 0 to the NIC's preset (maximum) size.
struct RingParams {
    static constexpr std::uint8_t MASK_RX = 0x1;
    static constexpr std::uint8_t MASK_RX_MINI = 0x2;
    static constexpr std::uint8_t MASK_RX_JUMBO = 0x4;
    static constexpr std::uint8_t MASK_TX = 0x8;

    std::uint8_t mask = 0;
    std::int64_t rx = 0;
    std::int64_t rxMini = 0;
    std::int64_t rxJumbo = 0;
    std::int64_t tx = 0;
};

// Hardware offloads. SetOffloadSettings applies the members whose mask bit
// is set.
struct OffloadSettings {
    static constexpr std::uint8_t MASK_RX_CHECKSUM = 0x01;
    static constexpr std::uint8_t MASK_TX_CHECKSUM = 0x02;
    static constexpr std::uint8_t MASK_SCATTER_GATHER = 0x04;
    static constexpr std::uint8_t MASK_TSO = 0x08;

    std::uint8_t mask = 0;
    bool rxChecksum = false;
    bool txChecksum = false;
    bool scatterGather = false;
    bool tso = false;
};

// Which offloads the host simulates in software for a NIC: one bool per
// feature, at the feature's position; feature n has mask bit 1 << n.
// SetSoftwareSimulation applies the features whose mask bit is set.
struct SoftwareSimulation {
    enum Feature : int {
        IPV4_CSO = 0,
        IPV4_TSO,
        SCATTER_GATHER,
        OFFSET_BASED_OFFLOAD,
        VXLAN_ENCAP,
        IPV6_TSO,
        IPV6_TSO_EXT,
        IPV6_CSO,
        IPV6_CSO_EXT,
        HIGH_DMA,
        SCATTER_GATHER_MULTI_PAGE,
        VLAN_TAGGING,
        VLAN_UNTAGGING,
        GENEVE_OFFLOAD,
        FEATURE_COUNT,
    };
    static constexpr std::uint32_t MaskOf(Feature feature) { return std::uint32_t{1} << feature; }

    std::uint32_t mask = 0;
    std::array<bool, FEATURE_COUNT> enabled{};
};

// The driver's own description of itself.
struct DriverInfo {
    std::string driver;
    std::string version;
    std::string firmwareVersion;
    std::string busInfo;
};

// The outcome of a self test: whether it passed, and the driver's lines of
// information in its order.
struct SelfTestResult {
    bool passed = false;
    std::vector<std::string> info;
};

// A NIC's traffic counters.
struct PnicStats {
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
    std::uint64_t rxBytes = 0;
    std::uint64_t txBytes = 0;
    std::uint64_t rxDropped = 0;
    std::uint64_t txDropped = 0;
    std::uint64_t rxMulticast = 0;
    std::uint64_t rxBroadcast = 0;
    std::uint64_t txMulticast = 0;
    std::uint64_t txBroadcast = 0;
    std::uint64_t rxErrors = 0;
    std::uint64_t rxLengthErrors = 0;
    std::uint64_t rxOverErrors = 0;
    std::uint64_t rxCrcErrors = 0;
    std::uint64_t rxFrameErrors = 0;
    std::uint64_t rxFifoErrors = 0;
    std::uint64_t rxMissedErrors = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t txAbortedErrors = 0;
    std::uint64_t txCarrierErrors = 0;
    std::uint64_t txFifoErrors = 0;
    std::uint64_t txHeartbeatErrors = 0;
    std::uint64_t txWindowErrors = 0;
};

// The packets of one VLAN on an uplink.
struct VlanStats {
    std::uint16_t vlanId = 0;
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
};

// One virtual function of an SR-IOV NIC.
struct SriovNicVFInfo {
    std::uint8_t vfId = 0;
    bool active = false;
    std::string pciAddress;
    // The world that owns the VF, in decimal; "0" for none.
    std::string ownerWorldId;
};

// The traffic counters of one virtual function.
struct SriovNicVFStats {
    std::uint64_t rxUnicastPackets = 0;
    std::uint64_t rxUnicastBytes = 0;
    std::uint64_t rxMulticastPackets = 0;
    std::uint64_t rxMulticastBytes = 0;
    std::uint64_t rxBroadcastPackets = 0;
    std::uint64_t rxBroadcastBytes = 0;
    std::uint64_t rxOutOfBufferDrops = 0;
    std::uint64_t rxErrorDrops = 0;
    std::uint64_t rxLroPackets = 0;
    std::uint64_t rxLroBytes = 0;
    std::uint64_t txUnicastPackets = 0;
    std::uint64_t txUnicastBytes = 0;
    std::uint64_t txMulticastPackets = 0;
    std::uint64_t txMulticastBytes = 0;
    std::uint64_t txBroadcastPackets = 0;
    std::uint64_t txBroadcastBytes = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t txDiscards = 0;
    std::uint64_t txTsoPackets = 0;
    std::uint64_t txTsoBytes = 0;
};

// A physical NIC. The simple getters answer from the snapshot; every
// operation that reads a driver record or changes the NIC is one store read
// or one transaction, may fail with HostCtlException (a NIC that no longer
// exists, a driver that cannot do what is asked, an injected fault), and
// leaves the NIC unchanged when it fails.
class HOSTCTL_EXPORT Pnic {
public:
    virtual ~Pnic();

    virtual std::string GetName() const = 0;
    // Null for a NIC without a PCI device.
    virtual std::unique_ptr<PciDevice> GetPciDevice() const = 0;
    // DUPLEX_FULL, or any other value for half duplex.
    virtual int GetDuplex() const = 0;
    // A link partner is detected.
    virtual bool IsLinkUp() const = 0;
    // The NIC is administratively up and has a link.
    virtual bool IsLinkStatusUp() const = 0;
    virtual bool IsAdminUp() const = 0;
    // Mbps; 0 while the link is down.
    virtual std::uint32_t GetLinkSpeed() const = 0;
    // Fixes speed (Mbps) and duplex (DUPLEX_FULL or DUPLEX_HALF); (0, 0)
    // turns autonegotiation on.
    virtual void SetLinkSpeedDuplex(std::int64_t speed, int duplex) = 0;
    virtual std::string GetDriverName() const = 0;
    virtual MacAddress GetMacAddress() const = 0;
    virtual void SetAdminUp(bool up) = 0;
    virtual std::uint32_t GetMtu() const = 0;
    virtual void GetPnicInfo(PnicInfo& info) = 0;
    virtual void GetPauseParams(PauseParams& params) = 0;
    virtual void GetCoalesceParams(CoalesceParams& params) = 0;
    // The preset (maximum) and the current ring sizes, in one read.
    virtual void GetRingParams(RingParams& preset, RingParams& current) = 0;
    virtual void GetOffloadSettings(OffloadSettings& settings) = 0;
    virtual void GetSoftwareSimulation(SoftwareSimulation& simulation) = 0;
    virtual void GetDriverInfo(DriverInfo& info) = 0;
    virtual void SetPnicInfo(const PnicInfo& info) = 0;
    virtual void SetPauseParams(const PauseParams& params) = 0;
    virtual void SetCoalesceParams(const CoalesceParams& params) = 0;
    virtual void SetRingParams(const RingParams& params) = 0;
    virtual void SetOffloadSettings(const OffloadSettings& settings) = 0;
    virtual void SetSoftwareSimulation(const SoftwareSimulation& simulation) = 0;
    // The device's register dump, in order.
    virtual void GetRegisters(std::vector<std::uint32_t>& registers) = 0;
    // `length` bytes of EEPROM from byte `offset`; length 0 reads to the end.
    virtual void GetEeprom(std::vector<std::uint8_t>& bytes, std::int64_t length, std::int64_t offset) = 0;
    // Writes the 32-bit `value` at byte `offset`, lowest byte first.
    virtual void SetEepromValue(std::int64_t magic, std::int64_t offset, std::int64_t value) = 0;
    // Writes the content of the named regular file from byte 0 on; the file
    // may not be larger than the EEPROM.
    virtual void SetEepromFromFile(std::int64_t magic, const std::string& fileName) = 0;
    virtual void RestartNegotiation() = 0;
    // `online` runs only the tests that do not interrupt normal operation.
    virtual void RunSelfTest(SelfTestResult& result, bool online) = 0;
};

}  // namespace Network
}  // namespace HostCtl
