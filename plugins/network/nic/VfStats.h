#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network sriovnic vf stats
class VfStats : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(VfStats);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
