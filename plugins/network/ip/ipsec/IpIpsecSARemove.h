#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sa remove
class IpIpsecSARemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSARemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
