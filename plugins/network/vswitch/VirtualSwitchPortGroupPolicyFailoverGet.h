#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy failover get
class VirtualSwitchPortGroupPolicyFailoverGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchPortGroupPolicyFailoverGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
