#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic down
class NicDown : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicDown);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
