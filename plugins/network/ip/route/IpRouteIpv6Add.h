#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv6 add
class IpRouteIpv6Add : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv6Add);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
