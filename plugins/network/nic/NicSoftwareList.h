#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic software list
class NicSoftwareList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSoftwareList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
