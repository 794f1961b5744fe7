#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv6 address remove
class IpInterfaceIpv6AddressRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv6AddressRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
