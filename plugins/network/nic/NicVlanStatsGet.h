#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic vlan stats get
class NicVlanStatsGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicVlanStatsGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
