#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic negotiate restart
class NicNegotiationRestart : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicNegotiationRestart);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
