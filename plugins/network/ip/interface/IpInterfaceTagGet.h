#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface tag get
class IpInterfaceTagGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceTagGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
