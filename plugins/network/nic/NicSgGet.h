#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic sg get
class NicSgGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSgGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
