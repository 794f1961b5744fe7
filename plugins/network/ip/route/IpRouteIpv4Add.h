#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv4 add
class IpRouteIpv4Add : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv4Add);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
