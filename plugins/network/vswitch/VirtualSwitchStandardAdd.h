#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard add
class VirtualSwitchStandardAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
