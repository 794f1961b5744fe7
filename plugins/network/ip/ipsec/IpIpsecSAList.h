#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sa list
class IpIpsecSAList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSAList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
