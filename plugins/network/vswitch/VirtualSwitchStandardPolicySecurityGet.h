#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard policy security get
class VirtualSwitchStandardPolicySecurityGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardPolicySecurityGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
