// The library's distributed switches: snapshots of stored switches, which
// are port sets like the standard switches.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/dvs/DVSwitch.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace PldCtl {
namespace Detail {
struct DvSwitchRecord;
// The DV ports of all switches of one listing, read once for all of them.
class DvPortListing;
}  // namespace Detail

namespace Network {

// Fault names: "DVSwitchImpl::GetDVPorts", "DVSwitchImpl::GetLacpConfig",
// "DVSwitchImpl::GetLacpInfo", "DVSwitchImpl::SetLacpTimeout" and
// "DVSwitchImpl::GetPorts", keyed by the switch's name.
class HOSTCTL_EXPORT DVSwitchImpl : public PortsetImpl, public virtual HostCtl::Network::DVSwitch {
public:
    // A snapshot of a stored switch; a listing hands along the port counts
    // (configured, used) it read and the DV ports it shares among its
    // switches.
    explicit DVSwitchImpl(std::shared_ptr<const Detail::DvSwitchRecord> record,
                          std::optional<std::pair<int, int>> portCounts = std::nullopt,
                          std::shared_ptr<Detail::DvPortListing> listing = nullptr);
    ~DVSwitchImpl() override;

    std::string GetSwitchUuid() const override;
    std::vector<std::unique_ptr<HostCtl::Network::Port>> GetPorts() const override;

    std::string GetUUID() const override;
    int GetMTU() const override;
    std::string GetCDPStatus() const override;
    int GetBeaconTimeout() const override;
    bool IsOrvixBranded() const override;
    std::vector<std::unique_ptr<HostCtl::Network::DVPort>> GetDVPorts() const override;
    std::unique_ptr<HostCtl::Network::LacpConfig> GetLacpConfig() const override;
    void ReleaseLacpConfig(std::unique_ptr<HostCtl::Network::LacpConfig> config) const override;
    std::unique_ptr<HostCtl::Network::LacpInfo> GetLacpInfo() const override;
    void ReleaseLacpInfo(std::unique_ptr<HostCtl::Network::LacpInfo> info) const override;
    void SetLacpTimeout(std::int64_t lagId, bool shortTimeout, const std::string& nic) override;

private:
    std::shared_ptr<const Detail::DvSwitchRecord> dvRecord_;
    std::shared_ptr<Detail::DvPortListing> listing_;
};

}  // namespace Network
}  // namespace PldCtl
