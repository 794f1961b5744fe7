#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard remove
class VirtualSwitchStandardRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
