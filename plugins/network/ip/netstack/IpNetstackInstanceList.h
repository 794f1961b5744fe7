#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip netstack list
class IpNetstackInstanceList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNetstackInstanceList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
