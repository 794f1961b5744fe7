// Physical NICs over the host store.
//
// A NIC made from a name reads its stored object on first use; one made by
// a lookup is a snapshot of the object the lookup read. Every change re-reads
// the stored NIC inside its own transaction, checks the change against it,
// writes only what changed and refreshes the snapshot from what was written.
#include "hostctl/network/nic/PnicImpl.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <limits>

#include "Operation.h"
#include "Refusals.h"
#include "network/nic/NicRecords.h"

HostCtl::Network::Pnic::~Pnic() = default;
HostCtl::Network::PciDevice::~PciDevice() = default;

namespace PldCtl {
namespace Network {

using Detail::NicRecord;
using HostCtl::Lib::HostCtlException;
using namespace HostCtl::Network;

namespace {

constexpr std::int64_t kUint32Max = std::numeric_limits<std::uint32_t>::max();
constexpr std::int64_t kInt32Max = std::numeric_limits<std::int32_t>::max();

class PciDeviceImpl : public PciDevice {
public:
    PciDeviceImpl(std::string name, std::string vendor, std::string device)
        : name_(std::move(name)), vendor_(std::move(vendor)), device_(std::move(device)) {}
    std::string GetName() const override { return name_; }
    std::string GetVendorName() const override { return vendor_; }
    std::string GetDeviceName() const override { return device_; }

private:
    std::string name_;
    std::string vendor_;
    std::string device_;
};

// Refuses `value` outside lo..hi for the NIC's field `what`.
void CheckRange(const std::string& nic, const char* what, std::int64_t value, std::int64_t lo, std::int64_t hi) {
    Detail::CheckRange(what, value, "NIC " + nic, lo, hi);
}

[[noreturn]] void Unsupported(const std::string& nic, const char* what) {
    throw HostCtlException("The driver of NIC " + nic + " does not support " + what);
}

// The driver record `record` of the NIC, or the failure of a driver that
// cannot report it.
template <typename T>
T& Supported(std::optional<T>& record, const std::string& nic, const char* what) {
    if (!record) Unsupported(nic, what);
    return *record;
}
template <typename T>
const T& Supported(const std::optional<T>& record, const std::string& nic, const char* what) {
    if (!record) Unsupported(nic, what);
    return *record;
}

constexpr const char* kCoalesce = "coalesce parameters";
constexpr const char* kRings = "ring parameters";
constexpr const char* kOffloads = "offload settings";
constexpr const char* kRegisters = "register dumps";
constexpr const char* kEeprom = "EEPROM access";
constexpr const char* kSelfTest = "self tests";
constexpr const char* kPause = "pause parameters";
constexpr const char* kWakeOn = "wake-on-LAN";
constexpr const char* kMessageLevel = "a message level";

int DuplexCodeOf(const std::string& word) {
    if (word == "full") return DUPLEX_FULL;
    if (word == "half") return DUPLEX_HALF;
    return DUPLEX_AUTO;
}

// The best mode the NIC advertises: the fastest, full duplex before half.
const Detail::LinkModeRecord* BestAdvertisedMode(const NicRecord& nic) {
    const Detail::LinkModeRecord* best = nullptr;
    auto rank = [](const Detail::LinkModeRecord& mode) {
        return std::make_pair(mode.speed, mode.duplex == "half" ? 0 : 1);
    };
    for (const auto& mode : nic.advertisedLinkModes) {
        if (!best || rank(mode) > rank(*best)) best = &mode;
    }
    return best;
}

// Negotiation as a NIC with a link does it: it settles on the best mode
// both sides advertise, here the best the NIC advertises. Without a link
// (or without modes) speed and duplex stay as they are.
void Negotiate(NicRecord& nic) {
    nic.autoNegotiation = true;
    const Detail::LinkModeRecord* best = BestAdvertisedMode(nic);
    if (!nic.linkUp || !best) return;
    nic.speed = best->speed;
    nic.duplex = best->duplex == "half" ? "half" : "full";
}

// The EEPROM image as bytes; a digit pair that is no hex number reads as 0.
std::vector<std::uint8_t> EepromBytes(const std::string& hex) {
    std::vector<std::uint8_t> bytes(hex.size() / 2);
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        bytes[i] = static_cast<std::uint8_t>(std::strtoul(hex.substr(2 * i, 2).c_str(), nullptr, 16));
    }
    return bytes;
}

std::string EepromHex(const std::vector<std::uint8_t>& bytes) {
    static const char digits[] = "0123456789abcdef";
    std::string hex;
    hex.reserve(bytes.size() * 2);
    for (std::uint8_t byte : bytes) {
        hex += digits[byte >> 4];
        hex += digits[byte & 0xf];
    }
    return hex;
}

void CheckMagic(const NicRecord& nic, std::int64_t magic) {
    if (magic != static_cast<std::int64_t>(nic.eepromMagic)) {
        throw HostCtlException("Wrong EEPROM magic key " + std::to_string(magic) + " for NIC " + nic.name);
    }
}

// The content of a regular file of at most `limit` bytes, the EEPROM's size.
std::vector<std::uint8_t> ReadEepromFile(const std::string& fileName, const NicRecord& nic, std::size_t limit) {
    const std::string content = Detail::ReadRegularFile("EEPROM file", fileName, limit, [&](std::uint64_t size) {
        return "EEPROM file " + fileName + " has " + std::to_string(size) + " bytes, more than the " +
               std::to_string(limit) + " bytes of the EEPROM of NIC " + nic.name;
    });
    return std::vector<std::uint8_t>(content.begin(), content.end());
}

// The members of the software-simulation record by feature.
using SimulationMember = bool Detail::SoftwareSimulationRecord::*;
constexpr SimulationMember kSimulationMembers[SoftwareSimulation::FEATURE_COUNT] = {
    &Detail::SoftwareSimulationRecord::ipv4Cso,
    &Detail::SoftwareSimulationRecord::ipv4Tso,
    &Detail::SoftwareSimulationRecord::scatterGather,
    &Detail::SoftwareSimulationRecord::offsetBasedOffload,
    &Detail::SoftwareSimulationRecord::vxlanEncap,
    &Detail::SoftwareSimulationRecord::ipv6Tso,
    &Detail::SoftwareSimulationRecord::ipv6TsoExt,
    &Detail::SoftwareSimulationRecord::ipv6Cso,
    &Detail::SoftwareSimulationRecord::ipv6CsoExt,
    &Detail::SoftwareSimulationRecord::highDma,
    &Detail::SoftwareSimulationRecord::scatterGatherMultiPage,
    &Detail::SoftwareSimulationRecord::vlanTagging,
    &Detail::SoftwareSimulationRecord::vlanUntagging,
    &Detail::SoftwareSimulationRecord::geneveOffload,
};

// The NIC's record: the snapshot, read on first use.
const NicRecord& Stored(const std::string& name, std::shared_ptr<const NicRecord>& record) {
    if (!record) record = std::make_shared<const NicRecord>(Detail::RequireNic(Store::HostStore::Default(), name));
    return *record;
}

// What a reading operation does first: give an injected fault its chance,
// then take the snapshot (reading the stored NIC if it has none yet).
const NicRecord& Enter(const char* operation, const std::string& name, std::shared_ptr<const NicRecord>& record) {
    Detail::EnterOperation(operation, name);
    return Stored(name, record);
}

// One transaction that applies `edit` to the stored NIC and makes what it
// wrote the snapshot. `edit` throws to refuse the change; nothing is
// written then.
template <typename Edit>
void ChangeNic(Store::HostStore& store, const std::string& name, std::shared_ptr<const NicRecord>& record, Edit edit) {
    std::shared_ptr<const NicRecord> written;
    store.Change([&](Store::Transaction& t) {
        std::optional<Detail::StoredObject<NicRecord>> stored = Detail::Find<NicRecord>(t, name);
        if (!stored) Detail::NoSuchNic(name);
        NicRecord edited = stored->record;
        edit(edited);
        Detail::Write(t, *stored, edited);
        written = std::make_shared<const NicRecord>(std::move(edited));
    });
    record = std::move(written);
}

}  // namespace

PnicImpl::PnicImpl(const std::string& name) : name_(name) {}

PnicImpl::PnicImpl(std::shared_ptr<const NicRecord> record) : name_(record->name), record_(std::move(record)) {}

PnicImpl::~PnicImpl() = default;

bool PnicImpl::IsValidPnic(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::IsValidPnic", name);
    return store.GetText(NicRecord::kSection, name).has_value();
}

std::string PnicImpl::GetName() const {
    return name_;
}

std::unique_ptr<PciDevice> PnicImpl::GetPciDevice() const {
    const NicRecord& nic = Stored(name_, record_);
    if (!nic.pciDevice) return nullptr;
    return std::make_unique<PciDeviceImpl>(*nic.pciDevice, nic.vendorName, nic.deviceName);
}

int PnicImpl::GetDuplex() const {
    return Stored(name_, record_).duplex == "full" ? DUPLEX_FULL : DUPLEX_HALF;
}

// A NIC that is administratively down has no link, whatever the wire says;
// the stored linkUp is what it finds when it is brought up again.
bool PnicImpl::IsLinkUp() const {
    return Stored(name_, record_).adminUp && Stored(name_, record_).linkUp;
}

bool PnicImpl::IsLinkStatusUp() const {
    return IsLinkUp();
}

bool PnicImpl::IsAdminUp() const {
    return Stored(name_, record_).adminUp;
}

std::uint32_t PnicImpl::GetLinkSpeed() const {
    if (!IsLinkUp()) return 0;
    return static_cast<std::uint32_t>(std::clamp<std::int64_t>(Stored(name_, record_).speed, 0, kUint32Max));
}

void PnicImpl::SetLinkSpeedDuplex(std::int64_t speed, int duplex) {
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::SetLinkSpeedDuplex", name_);
    if (speed == 0 && duplex == DUPLEX_AUTO) {
        ChangeNic(store, name_, record_, [](NicRecord& nic) { Negotiate(nic); });
        return;
    }
    CheckRange(name_, "speed", speed, 0, kUint32Max);
    CheckRange(name_, "duplex", duplex, DUPLEX_FULL, DUPLEX_HALF);
    ChangeNic(store, name_, record_, [&](NicRecord& nic) {
        nic.speed = speed;
        nic.duplex = duplex == DUPLEX_FULL ? "full" : "half";
        nic.autoNegotiation = false;
    });
}

std::string PnicImpl::GetDriverName() const {
    return Stored(name_, record_).driver;
}

MacAddress PnicImpl::GetMacAddress() const {
    return MacAddress(Stored(name_, record_).mac);
}

void PnicImpl::SetAdminUp(bool up) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetAdminUp", name_), name_, record_,
              [up](NicRecord& nic) { nic.adminUp = up; });
}

std::uint32_t PnicImpl::GetMtu() const {
    return static_cast<std::uint32_t>(std::clamp<std::int64_t>(Stored(name_, record_).mtu, 0, kUint32Max));
}

void PnicImpl::GetPnicInfo(PnicInfo& info) {
    const NicRecord& nic = Enter("PnicImpl::GetPnicInfo", name_, record_);
    info = PnicInfo();
    for (std::int64_t port : nic.supportedPorts) info.supportedPorts.push_back(static_cast<int>(port));
    info.supportsAutoNegotiation = nic.supportsAutoNegotiation;
    for (const auto& mode : nic.advertisedLinkModes) {
        info.advertisedLinkModes.push_back(LinkMode{mode.speed, DuplexCodeOf(mode.duplex)});
    }
    info.advertisedAutoNegotiation = nic.advertisedAutoNegotiation;
    info.port = static_cast<int>(nic.port);
    info.phyAddress = nic.phyAddress;
    info.transceiver = nic.transceiver == "external" ? TRANSCEIVER_EXTERNAL : TRANSCEIVER_INTERNAL;
    info.autoNegotiation = nic.autoNegotiation;
    info.supportsWakeOn = nic.supportsWakeOn;
    for (std::int64_t mode : nic.wakeOn) info.wakeOnModes.push_back(static_cast<WakeOnMode>(mode));
    info.supportsMessageLevel = nic.supportsMessageLevel;
    info.messageLevel = nic.messageLevel;
    info.virtualAddress = nic.virtualAddress;
    info.linkStatus = IsLinkStatusUp() ? "Up" : "Down";
}

void PnicImpl::SetPnicInfo(const PnicInfo& info) {
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::SetPnicInfo", name_);
    // What does not depend on the NIC is checked before the store is touched.
    if (info.phyAddressChanged) CheckRange(name_, "PHY address", info.phyAddress, 0, kInt32Max);
    if (info.transceiverChanged) {
        CheckRange(name_, "transceiver", info.transceiver, TRANSCEIVER_INTERNAL, TRANSCEIVER_EXTERNAL);
    }
    if (info.messageLevelChanged) CheckRange(name_, "message level", info.messageLevel, 0, kUint32Max);
    if (info.wakeOnChanged) {
        for (WakeOnMode mode : info.wakeOnModes)
            CheckRange(name_, "wake-on-LAN mode", mode, WAKE_ON_PHY, WAKE_ON_SECURE_ON);
    }
    ChangeNic(store, name_, record_, [&](NicRecord& nic) {
        if (info.portChanged) {
            if (std::find(nic.supportedPorts.begin(), nic.supportedPorts.end(), info.port) ==
                nic.supportedPorts.end()) {
                throw HostCtlException("NIC " + name_ + " does not offer port " + std::to_string(info.port));
            }
            nic.port = info.port;
        }
        if (info.phyAddressChanged) nic.phyAddress = info.phyAddress;
        if (info.virtualAddressChanged) nic.virtualAddress = info.virtualAddress;
        if (info.transceiverChanged)
            nic.transceiver = info.transceiver == TRANSCEIVER_EXTERNAL ? "external" : "internal";
        if (info.wakeOnChanged) {
            if (!nic.supportsWakeOn) Unsupported(name_, kWakeOn);
            nic.wakeOn.assign(info.wakeOnModes.begin(), info.wakeOnModes.end());
        }
        if (info.messageLevelChanged) {
            if (!nic.supportsMessageLevel) Unsupported(name_, kMessageLevel);
            nic.messageLevel = static_cast<std::uint32_t>(info.messageLevel);
        }
    });
}

void PnicImpl::GetPauseParams(PauseParams& params) {
    params = Enter("PnicImpl::GetPauseParams", name_, record_).pause;
}

void PnicImpl::SetPauseParams(const PauseParams& params) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetPauseParams", name_), name_, record_, [&](NicRecord& nic) {
        if (!nic.pause.supported) Unsupported(name_, kPause);
        nic.pause.autoNegotiate = params.autoNegotiate;
        nic.pause.rx = params.rx;
        nic.pause.tx = params.tx;
    });
}

void PnicImpl::GetCoalesceParams(CoalesceParams& params) {
    const auto& coalesce = Supported(Enter("PnicImpl::GetCoalesceParams", name_, record_).coalesce, name_, kCoalesce);
    params = CoalesceParams{coalesce.adaptiveRx,  coalesce.adaptiveTx, coalesce.sampleInterval, coalesce.rxUsecs,
                            coalesce.rxMaxFrames, coalesce.txUsecs,    coalesce.txMaxFrames};
}

void PnicImpl::SetCoalesceParams(const CoalesceParams& params) {
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::SetCoalesceParams", name_);
    CheckRange(name_, "sample interval", params.sampleInterval, 0, kUint32Max);
    CheckRange(name_, "RX microseconds", params.rxUsecs, 0, kUint32Max);
    CheckRange(name_, "RX maximum frames", params.rxMaxFrames, 0, kUint32Max);
    CheckRange(name_, "TX microseconds", params.txUsecs, 0, kUint32Max);
    CheckRange(name_, "TX maximum frames", params.txMaxFrames, 0, kUint32Max);
    ChangeNic(store, name_, record_, [&](NicRecord& nic) {
        auto& coalesce = Supported(nic.coalesce, name_, kCoalesce);
        coalesce.adaptiveRx = params.adaptiveRx;
        coalesce.adaptiveTx = params.adaptiveTx;
        coalesce.sampleInterval = static_cast<std::uint32_t>(params.sampleInterval);
        coalesce.rxUsecs = static_cast<std::uint32_t>(params.rxUsecs);
        coalesce.rxMaxFrames = static_cast<std::uint32_t>(params.rxMaxFrames);
        coalesce.txUsecs = static_cast<std::uint32_t>(params.txUsecs);
        coalesce.txMaxFrames = static_cast<std::uint32_t>(params.txMaxFrames);
    });
}

void PnicImpl::GetRingParams(RingParams& preset, RingParams& current) {
    const auto& rings = Supported(Enter("PnicImpl::GetRingParams", name_, record_).rings, name_, kRings);
    auto fill = [](RingParams& out, const Detail::RingSizesRecord& sizes) {
        out = RingParams();
        out.mask = RingParams::MASK_RX | RingParams::MASK_RX_MINI | RingParams::MASK_RX_JUMBO | RingParams::MASK_TX;
        out.rx = sizes.rx;
        out.rxMini = sizes.rxMini;
        out.rxJumbo = sizes.rxJumbo;
        out.tx = sizes.tx;
    };
    fill(preset, rings.preset);
    fill(current, rings.current);
}

void PnicImpl::SetRingParams(const RingParams& params) {
    struct Ring {
        std::uint8_t bit;
        const char* what;
        std::int64_t RingParams::*requested;
        std::uint32_t Detail::RingSizesRecord::*stored;
    };
    static constexpr Ring kRingsByMask[] = {
        {RingParams::MASK_RX, "RX ring size", &RingParams::rx, &Detail::RingSizesRecord::rx},
        {RingParams::MASK_RX_MINI, "RX mini ring size", &RingParams::rxMini, &Detail::RingSizesRecord::rxMini},
        {RingParams::MASK_RX_JUMBO, "RX jumbo ring size", &RingParams::rxJumbo, &Detail::RingSizesRecord::rxJumbo},
        {RingParams::MASK_TX, "TX ring size", &RingParams::tx, &Detail::RingSizesRecord::tx},
    };
    ChangeNic(Detail::EnterOperation("PnicImpl::SetRingParams", name_), name_, record_, [&](NicRecord& nic) {
        auto& rings = Supported(nic.rings, name_, kRings);
        for (const Ring& ring : kRingsByMask) {
            if (!(params.mask & ring.bit)) continue;
            const std::int64_t size = params.*(ring.requested);
            CheckRange(name_, ring.what, size, 0, rings.preset.*(ring.stored));
            rings.current.*(ring.stored) = static_cast<std::uint32_t>(size);
        }
    });
}

void PnicImpl::GetOffloadSettings(OffloadSettings& settings) {
    const auto& offloads = Supported(Enter("PnicImpl::GetOffloadSettings", name_, record_).offloads, name_, kOffloads);
    settings = OffloadSettings();
    settings.mask = OffloadSettings::MASK_RX_CHECKSUM | OffloadSettings::MASK_TX_CHECKSUM |
                    OffloadSettings::MASK_SCATTER_GATHER | OffloadSettings::MASK_TSO;
    settings.rxChecksum = offloads.rxChecksum;
    settings.txChecksum = offloads.txChecksum;
    settings.scatterGather = offloads.scatterGather;
    settings.tso = offloads.tso;
}

void PnicImpl::SetOffloadSettings(const OffloadSettings& settings) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetOffloadSettings", name_), name_, record_, [&](NicRecord& nic) {
        auto& offloads = Supported(nic.offloads, name_, kOffloads);
        if (settings.mask & OffloadSettings::MASK_RX_CHECKSUM) offloads.rxChecksum = settings.rxChecksum;
        if (settings.mask & OffloadSettings::MASK_TX_CHECKSUM) offloads.txChecksum = settings.txChecksum;
        if (settings.mask & OffloadSettings::MASK_SCATTER_GATHER) offloads.scatterGather = settings.scatterGather;
        if (settings.mask & OffloadSettings::MASK_TSO) offloads.tso = settings.tso;
    });
}

void PnicImpl::GetSoftwareSimulation(SoftwareSimulation& simulation) {
    const auto& stored = Enter("PnicImpl::GetSoftwareSimulation", name_, record_).softwareSimulation;
    simulation = SoftwareSimulation();
    for (std::size_t feature = 0; feature < SoftwareSimulation::FEATURE_COUNT; ++feature) {
        simulation.mask |= SoftwareSimulation::MaskOf(static_cast<SoftwareSimulation::Feature>(feature));
        simulation.enabled[feature] = stored.*kSimulationMembers[feature];
    }
}

void PnicImpl::SetSoftwareSimulation(const SoftwareSimulation& simulation) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetSoftwareSimulation", name_), name_, record_, [&](NicRecord& nic) {
        for (std::size_t feature = 0; feature < SoftwareSimulation::FEATURE_COUNT; ++feature) {
            if (simulation.mask & SoftwareSimulation::MaskOf(static_cast<SoftwareSimulation::Feature>(feature))) {
                nic.softwareSimulation.*kSimulationMembers[feature] = simulation.enabled[feature];
            }
        }
    });
}

void PnicImpl::GetDriverInfo(DriverInfo& info) {
    const NicRecord& nic = Enter("PnicImpl::GetDriverInfo", name_, record_);
    info = DriverInfo{nic.driver, nic.driverVersion, nic.firmwareVersion, nic.pciDevice.value_or("")};
}

void PnicImpl::GetPnicStats(PnicStats& stats) {
    stats = Enter("PnicImpl::GetPnicStats", name_, record_).stats;
}

void PnicImpl::GetRegisters(std::vector<std::uint32_t>& registers) {
    registers = Supported(Enter("PnicImpl::GetRegisters", name_, record_).registers, name_, kRegisters);
}

void PnicImpl::GetEeprom(std::vector<std::uint8_t>& bytes, std::int64_t length, std::int64_t offset) {
    const std::vector<std::uint8_t> image =
        EepromBytes(Supported(Enter("PnicImpl::GetEeprom", name_, record_).eeprom, name_, kEeprom));
    const std::int64_t size = static_cast<std::int64_t>(image.size());
    // An empty EEPROM reads as nothing from offset 0.
    CheckRange(name_, "EEPROM offset", offset, 0, std::max<std::int64_t>(size - 1, 0));
    CheckRange(name_, "EEPROM length", length, 0, size - offset);
    const std::int64_t end = length == 0 ? size : offset + length;
    bytes.assign(image.begin() + offset, image.begin() + end);
}

void PnicImpl::SetEepromValue(std::int64_t magic, std::int64_t offset, std::int64_t value) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetEepromValue", name_), name_, record_, [&](NicRecord& nic) {
        std::vector<std::uint8_t> image = EepromBytes(Supported(nic.eeprom, name_, kEeprom));
        CheckMagic(nic, magic);
        if (image.size() < 4) {
            throw HostCtlException("The EEPROM of NIC " + name_ + " has " + std::to_string(image.size()) +
                                   " bytes, too few for a 32-bit value");
        }
        CheckRange(name_, "EEPROM offset", offset, 0, static_cast<std::int64_t>(image.size()) - 4);
        CheckRange(name_, "EEPROM word", value, 0, kUint32Max);
        for (int i = 0; i < 4; ++i) {
            image[static_cast<std::size_t>(offset + i)] = static_cast<std::uint8_t>((value >> (8 * i)) & 0xff);
        }
        nic.eeprom = EepromHex(image);
    });
}

void PnicImpl::SetEepromFromFile(std::int64_t magic, const std::string& fileName) {
    ChangeNic(Detail::EnterOperation("PnicImpl::SetEepromFromFile", name_), name_, record_, [&](NicRecord& nic) {
        std::vector<std::uint8_t> image = EepromBytes(Supported(nic.eeprom, name_, kEeprom));
        CheckMagic(nic, magic);
        const std::vector<std::uint8_t> content = ReadEepromFile(fileName, nic, image.size());
        std::copy(content.begin(), content.end(), image.begin());
        nic.eeprom = EepromHex(image);
    });
}

void PnicImpl::RestartNegotiation() {
    ChangeNic(Detail::EnterOperation("PnicImpl::RestartNegotiation", name_), name_, record_, [&](NicRecord& nic) {
        if (!nic.autoNegotiation) {
            throw HostCtlException("Unable to restart negotiation on NIC " + name_ + ": autonegotiation is off");
        }
        Negotiate(nic);
    });
}

void PnicImpl::RunSelfTest(SelfTestResult& result, bool online) {
    const auto& selfTest = Supported(Enter("PnicImpl::RunSelfTest", name_, record_).selfTest, name_, kSelfTest);
    result.passed = selfTest.passed;
    result.info = online ? selfTest.online : selfTest.offline;
}

}  // namespace Network
}  // namespace PldCtl
