#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch dvs orvix lacp status get
class LacpGetStatus : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(LacpGetStatus);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
