#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup remove
class VirtualSwitchPortGroupRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
