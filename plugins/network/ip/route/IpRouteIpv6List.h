#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv6 list
class IpRouteIpv6List : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv6List);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
