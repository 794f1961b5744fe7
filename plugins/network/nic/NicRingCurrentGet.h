#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic ring current get
class NicRingCurrentGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicRingCurrentGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
