#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic pauseParams list
class NicPauseParamsList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicPauseParamsList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
