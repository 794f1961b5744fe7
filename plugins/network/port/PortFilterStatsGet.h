#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network port filter stats get
class PortFilterStatsGet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(PortFilterStatsGet);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
