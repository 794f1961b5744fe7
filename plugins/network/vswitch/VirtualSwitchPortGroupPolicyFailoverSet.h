#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy failover set
class VirtualSwitchPortGroupPolicyFailoverSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupPolicyFailoverSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
