#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv4 get
class IpInterfaceIpv4Get : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv4Get);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
