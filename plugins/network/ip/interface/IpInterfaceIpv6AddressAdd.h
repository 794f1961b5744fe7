#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv6 address add
class IpInterfaceIpv6AddressAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv6AddressAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
