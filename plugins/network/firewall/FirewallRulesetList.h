#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network firewall ruleset list
class FirewallRulesetList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(FirewallRulesetList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
