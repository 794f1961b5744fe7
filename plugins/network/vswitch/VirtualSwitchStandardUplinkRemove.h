#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard uplink remove
class VirtualSwitchStandardUplinkRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardUplinkRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
