#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard set
class VirtualSwitchStandardSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
