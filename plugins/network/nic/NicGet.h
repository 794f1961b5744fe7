#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic get
class NicGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();

private:
    boost::shared_ptr<MetaObj::MetaStruct> GetDriverInfoStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
