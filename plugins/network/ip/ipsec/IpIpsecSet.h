#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec set
class IpIpsecSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
