#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic selftest run
class NicSelfTestRun : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSelfTestRun);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
