#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall load
class FirewallLoad : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallLoad);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
