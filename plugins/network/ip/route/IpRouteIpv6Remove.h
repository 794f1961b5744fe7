#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv6 remove
class IpRouteIpv6Remove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv6Remove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
