#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sp remove
class IpIpsecSPRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSPRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
