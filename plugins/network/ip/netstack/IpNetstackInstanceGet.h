#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip netstack get
class IpNetstackInstanceGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNetstackInstanceGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
