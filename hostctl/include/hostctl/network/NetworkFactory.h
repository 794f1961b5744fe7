// Lookups of the host's networking objects by name; what they hand out is
// new and belongs to the caller.
#pragma once

#include <memory>
#include <string>

#include "hostctl/Export.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/NetworkInfo.h"
#include "hostctl/network/dvs/DVSwitch.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace HostCtl {
namespace Network {

// Lookups of the host's networking objects.
class HOSTCTL_EXPORT NetworkFactory {
public:
    // The standard switch of that name, or null.
    static std::unique_ptr<VirtualSwitch> GetVirtualSwitchById(const std::string& name);
    // The port group of that name, or null.
    static std::unique_ptr<PortGroup> GetPortGroupByName(const std::string& name);
    // The host's network-info object (its NICs). Never throws: the host is
    // reached by the object's operations.
    static std::unique_ptr<NetworkInfo> GetNetworkInfo();
    // The distributed switch of that name, or null.
    static std::unique_ptr<DVSwitch> GetDVSwitchByName(const std::string& name);
    // The DV port `param.portId` of the distributed switch of UUID
    // `param.switchUuid`, or null (fault name "NetworkFactory::GetDVPort",
    // keyed by the port id).
    static std::unique_ptr<DVPort> GetDVPort(const DVPortParam& param);
};

}  // namespace Network
}  // namespace HostCtl
