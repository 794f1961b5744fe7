#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch dvs orvix list
class VirtualSwitchDVSOrvixList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VirtualSwitchDVSOrvixList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
