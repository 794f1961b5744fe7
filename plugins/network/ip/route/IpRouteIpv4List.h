#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip route ipv4 list
class IpRouteIpv4List : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpRouteIpv4List);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
