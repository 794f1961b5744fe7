// The library's implementation of a physical NIC.
#pragma once

#include <memory>
#include <string>

#include "hostctl/Export.h"
#include "hostctl/network/nic/Pnic.h"
#include "hostctl/network/port/Port.h"

namespace PldCtl {
namespace Detail {
// The stored record of a NIC, private to the library.
struct NicRecord;
}  // namespace Detail

namespace Network {

// A physical NIC. Made from a name it never throws: the stored NIC is read
// on first use, and an operation on a name the host does not have throws
// HostCtlException. Made from a stored record (by the lookups) it is a
// snapshot of that record.
class HOSTCTL_EXPORT PnicImpl : public virtual HostCtl::Network::Pnic {
public:
    explicit PnicImpl(const std::string& name);
    explicit PnicImpl(std::shared_ptr<const Detail::NicRecord> record);
    ~PnicImpl() override;

    // Whether the host has a physical NIC of that name.
    static bool IsValidPnic(const std::string& name);

    // The NIC's traffic counters; members the NIC does not count are left
    // as they are.
    void GetPnicStats(HostCtl::Network::PnicStats& stats);
    // The NIC's uplink port on a standard or distributed switch; null when
    // it is no uplink (fault name "PnicImpl::GetUplinkPort", keyed by the
    // NIC's name).
    std::unique_ptr<HostCtl::Network::Port> GetUplinkPort() const;

    std::string GetName() const override;
    std::unique_ptr<HostCtl::Network::PciDevice> GetPciDevice() const override;
    int GetDuplex() const override;
    bool IsLinkUp() const override;
    bool IsLinkStatusUp() const override;
    bool IsAdminUp() const override;
    std::uint32_t GetLinkSpeed() const override;
    void SetLinkSpeedDuplex(std::int64_t speed, int duplex) override;
    std::string GetDriverName() const override;
    HostCtl::Network::MacAddress GetMacAddress() const override;
    void SetAdminUp(bool up) override;
    std::uint32_t GetMtu() const override;
    void GetPnicInfo(HostCtl::Network::PnicInfo& info) override;
    void GetPauseParams(HostCtl::Network::PauseParams& params) override;
    void GetCoalesceParams(HostCtl::Network::CoalesceParams& params) override;
    void GetRingParams(HostCtl::Network::RingParams& preset, HostCtl::Network::RingParams& current) override;
    void GetOffloadSettings(HostCtl::Network::OffloadSettings& settings) override;
    void GetSoftwareSimulation(HostCtl::Network::SoftwareSimulation& simulation) override;
    void GetDriverInfo(HostCtl::Network::DriverInfo& info) override;
    void SetPnicInfo(const HostCtl::Network::PnicInfo& info) override;
    void SetPauseParams(const HostCtl::Network::PauseParams& params) override;
    void SetCoalesceParams(const HostCtl::Network::CoalesceParams& params) override;
    void SetRingParams(const HostCtl::Network::RingParams& params) override;
    void SetOffloadSettings(const HostCtl::Network::OffloadSettings& settings) override;
    void SetSoftwareSimulation(const HostCtl::Network::SoftwareSimulation& simulation) override;
    void GetRegisters(std::vector<std::uint32_t>& registers) override;
    void GetEeprom(std::vector<std::uint8_t>& bytes, std::int64_t length, std::int64_t offset) override;
    void SetEepromValue(std::int64_t magic, std::int64_t offset, std::int64_t value) override;
    void SetEepromFromFile(std::int64_t magic, const std::string& fileName) override;
    void RestartNegotiation() override;
    void RunSelfTest(HostCtl::Network::SelfTestResult& result, bool online) override;

private:
    std::string name_;
    // The stored NIC, read on first use and replaced by every change.
    mutable std::shared_ptr<const Detail::NicRecord> record_;
};

}  // namespace Network
}  // namespace PldCtl
