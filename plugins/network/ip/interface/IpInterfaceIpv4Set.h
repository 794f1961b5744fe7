#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv4 set
class IpInterfaceIpv4Set : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv4Set);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
