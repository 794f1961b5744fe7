#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall unload
class FirewallUnload : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallUnload);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
