#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic tso set
class NicTsoSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicTsoSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
