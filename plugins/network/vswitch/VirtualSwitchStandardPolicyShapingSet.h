#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard policy shaping set
class VirtualSwitchStandardPolicyShapingSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardPolicyShapingSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
