#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall refresh
class FirewallRefresh : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRefresh);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
