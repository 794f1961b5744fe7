#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip remove
class FirewallRulesetAllowedipRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetAllowedipRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
