#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip add
class FirewallRulesetAllowedipAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetAllowedipAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
