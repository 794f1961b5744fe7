#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface ipv6 address list
class IpInterfaceIpv6AddressList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceIpv6AddressList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
