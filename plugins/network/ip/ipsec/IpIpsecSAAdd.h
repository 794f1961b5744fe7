#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sa add
class IpIpsecSAAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSAAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
