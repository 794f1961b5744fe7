#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch standard list
class VirtualSwitchStandardList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchStandardList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
