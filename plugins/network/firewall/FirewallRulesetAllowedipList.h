#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip list
class FirewallRulesetAllowedipList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetAllowedipList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
