#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup add
class VirtualSwitchPortGroupAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
