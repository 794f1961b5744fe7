#pragma once

#include "common/CommandClass.h"
#include "hostctl/network/vswitch/Policy.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy shaping set
class VirtualSwitchPortGroupPolicyShapingSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupPolicyShapingSet);
};

// Reports each shaping value that neither the port group's own policy nor the
// policy in force for it sets, in the order peak, average, burst.
void ReportUnsetShapingValues(CallSpec::Output& output, const HostCtl::Network::ShapingPolicy& own,
                              const HostCtl::Network::ShapingPolicy& inForce);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
