#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset set
class FirewallRulesetSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
