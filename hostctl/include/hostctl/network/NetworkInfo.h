// The host's network-info object, as NetworkFactory::GetNetworkInfo() hands
// it out: its physical NICs and the state of its netstack instances.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/nic/Pnic.h"

namespace HostCtl {
namespace Network {

class HOSTCTL_EXPORT NetworkInfo {
public:
    virtual ~NetworkInfo();
    // In the host's order.
    virtual std::vector<std::unique_ptr<Pnic>> GetPnics() = 0;
    // Null when the host has no NIC of that name.
    virtual std::unique_ptr<Pnic> GetPnicByName(const std::string& name) = 0;
    // The state number of a netstack instance (NetstackInstance::STATE_IN_KERNEL
    // when it exists in the kernel); 0 for a key the host does not have.
    virtual int GetNetstackInstanceState(const std::string& key) = 0;
};

}  // namespace Network
}  // namespace HostCtl
