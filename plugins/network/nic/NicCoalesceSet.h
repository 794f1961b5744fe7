#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic coalesce set
class NicCoalesceSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicCoalesceSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
