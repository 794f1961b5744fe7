#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup set
class VirtualSwitchPortGroupSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
