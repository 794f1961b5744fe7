// The library's kernel IP interface: a snapshot of a stored interface, whose
// changes are each one transaction and refresh the snapshot.
#pragma once

#include <memory>

#include "hostctl/network/ip/PldNic.h"
#include "network/ip/IpRecords.h"

namespace PldCtl {
namespace Network {

class PldNicImpl : public HostCtl::Network::PldNic {
public:
    explicit PldNicImpl(std::shared_ptr<const Detail::InterfaceRecord> record);
    ~PldNicImpl() override;

    std::string GetName() const override;
    HostCtl::Network::MacAddress GetMacAddress() const override;
    int GetMtu() const override;
    void SetMtu(std::int64_t mtu) override;
    int GetTsoMss() const override;
    bool IsEnabled() const override;
    void Enable() override;
    void Disable() override;
    std::unique_ptr<HostCtl::Network::ConnectionPoint> GetConnectionPoint() const override;
    std::int64_t GetPortId() const override;
    std::string GetNetstackInstance() const override;
    HostCtl::Network::IpConfig GetIpConfig() const override;
    HostCtl::Network::IpConfig GetDnsConfig() const override;
    void SetIpConfig(const HostCtl::Network::IpConfig& config) override;
    std::vector<HostCtl::Network::PldNicTagType> GetTags() const override;
    void AddTag(HostCtl::Network::PldNicTagType tag, bool persistOnly) override;
    void RemoveTag(HostCtl::Network::PldNicTagType tag) override;
    void Remove() override;

private:
    void SetEnabled(const char* operation, bool enabled);
    std::shared_ptr<const Detail::InterfaceRecord> record_;
};

}  // namespace Network

namespace Detail {

// Removes the stored interface and its port (one part of a change).
void RemoveInterface(Store::Transaction& t, const InterfaceRecord& record);

}  // namespace Detail
}  // namespace PldCtl
