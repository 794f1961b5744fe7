#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic pauseParams set
class NicPauseParamsSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicPauseParamsSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
