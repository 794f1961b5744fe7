#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch dvs orvix lacp config get
class LacpGetConfig : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(LacpGetConfig);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
