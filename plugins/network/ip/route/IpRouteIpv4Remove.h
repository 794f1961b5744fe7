#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv4 remove
class IpRouteIpv4Remove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv4Remove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
