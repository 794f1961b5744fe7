#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic cso set
class NicCsoSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicCsoSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
