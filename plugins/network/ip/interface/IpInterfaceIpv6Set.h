#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv6 set
class IpInterfaceIpv6Set : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv6Set);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
