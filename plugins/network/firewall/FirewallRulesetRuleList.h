#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset rule list
class FirewallRulesetRuleList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetRuleList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
