#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard policy shaping get
class VirtualSwitchStandardPolicyShapingGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardPolicyShapingGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
