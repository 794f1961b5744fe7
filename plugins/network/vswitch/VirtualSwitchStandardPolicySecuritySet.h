#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard policy security set
class VirtualSwitchStandardPolicySecuritySet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardPolicySecuritySet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
