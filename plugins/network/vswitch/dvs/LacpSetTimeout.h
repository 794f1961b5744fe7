#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network vswitch dvs orvix lacp timeout set
class LacpSetTimeout : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(LacpSetTimeout);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
