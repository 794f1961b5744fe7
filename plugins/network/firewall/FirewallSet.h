#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall set
class FirewallSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
