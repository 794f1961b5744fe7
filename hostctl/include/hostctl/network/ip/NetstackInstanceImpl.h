// The library's netstack instances.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/ip/NetstackInstance.h"

namespace PldCtl {
namespace Detail {
struct NetstackRecord;
}  // namespace Detail

namespace Network {

class HOSTCTL_EXPORT NetstackInstanceImpl : public virtual HostCtl::Network::NetstackInstance {
public:
    // An instance not yet on the host, for NetworkInfoImpl::AddNetstackInstance.
    NetstackInstanceImpl(const std::string& key, std::int64_t maxConnections, const std::string& algorithm,
                         bool ipv6Enabled, int state);
    // A snapshot of a stored instance.
    explicit NetstackInstanceImpl(std::shared_ptr<const Detail::NetstackRecord> record);
    ~NetstackInstanceImpl() override;

    // The congestion-control algorithms the host offers, in its order.
    static std::vector<std::string> GetCongestionControlAlgorithmList();

    std::string GetKey() const override;
    std::string GetName() const override;
    int GetState() const override;
    std::int64_t GetMaxConnections() const override;
    std::int64_t GetCurrentMaxConnections() const override;
    std::string GetCongestionControlAlgorithm() const override;
    bool GetIpv6Enabled() const override;
    bool GetCurrentIpv6Enabled() const override;
    void SetName(const std::string& name, bool persist) override;
    void SetMaxConnections(std::int64_t maxConnections, bool persist) override;
    void SetCongestionControlAlgorithm(const std::string& algorithm, bool persist) override;
    void SetIpv6Enabled(bool enabled, bool persist) override;
    void Enable() override;
    void Disable() override;

    // The stored form, for AddNetstackInstance.
    const Detail::NetstackRecord& Record() const;

private:
    std::shared_ptr<const Detail::NetstackRecord> record_;
};

}  // namespace Network
}  // namespace PldCtl
