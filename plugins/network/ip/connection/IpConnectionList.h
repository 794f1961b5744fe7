#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip connection list
class IpConnectionList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpConnectionList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
