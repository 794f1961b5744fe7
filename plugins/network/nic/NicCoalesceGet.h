#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic coalesce get
class NicCoalesceGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicCoalesceGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
