#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic cso get
class NicCsoGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicCsoGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
