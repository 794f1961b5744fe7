#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip neighbor list
class IpNeighborList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNeighborList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
