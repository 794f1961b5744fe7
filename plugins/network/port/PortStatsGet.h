#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network port stats get
class PortStatsGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(PortStatsGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
