#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv6 get
class IpInterfaceIpv6Get : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv6Get);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
