#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard policy failover set
class VirtualSwitchStandardPolicyFailoverSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardPolicyFailoverSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
