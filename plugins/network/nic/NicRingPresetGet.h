#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic ring preset get
class NicRingPresetGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicRingPresetGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
