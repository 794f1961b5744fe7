#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip ipsec sp list
class IpIpsecSPList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpIpsecSPList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
