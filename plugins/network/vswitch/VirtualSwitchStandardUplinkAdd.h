#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard uplink add
class VirtualSwitchStandardUplinkAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardUplinkAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
