#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch dvs orvix lacp stats get
class LacpGetStats : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(LacpGetStats);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
