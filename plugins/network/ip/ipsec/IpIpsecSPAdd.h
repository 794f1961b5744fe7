#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sp add
class IpIpsecSPAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSPAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
