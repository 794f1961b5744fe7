#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy security set
class VirtualSwitchPortGroupPolicySecuritySet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupPolicySecuritySet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
