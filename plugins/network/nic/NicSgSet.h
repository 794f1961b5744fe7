#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic sg set
class NicSgSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSgSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
