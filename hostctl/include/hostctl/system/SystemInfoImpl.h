// The host firewall as a whole: its state while its kernel module is loaded,
// the run-time (dynamic) rules, and the rulesets.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/system/FirewallRule.h"
#include "hostctl/system/FirewallRuleset.h"

namespace PldCtl {
namespace System {

// The firewall's own module (ModuleImpl for it loads and unloads it).
inline constexpr const char* kFirewallModule = "tovrinfw";

// The firewall state lives in the module: the operations that read or change
// it (the first seven below) throw HostCtl::Lib::HostCtlException ("The
// firewall module tovrinfw is not loaded") while it is not loaded.
// DestroyFirewallFilters has nothing to destroy then and does nothing. The
// rulesets are the saved configuration and are reached whatever the
// module's state. Each operation is one store read or one transaction.
class HOSTCTL_EXPORT SystemInfoImpl {
public:
    SystemInfoImpl();
    virtual ~SystemInfoImpl();

    virtual bool IsFirewallEnabled();
    // True for PASS, false for DROP: what happens to traffic no rule allows.
    virtual bool GetFirewallDefaultAction();
    virtual void SetFirewallEnabled(bool enabled);
    virtual void SetFirewallDefaultAction(bool pass);
    // Applies the saved ruleset configuration to the module. The dynamic
    // rules do not survive it.
    virtual void LoadFirewallRulesets();
    // In the order they were added.
    virtual std::vector<std::unique_ptr<HostCtl::System::FirewallRule>> GetFirewallDynamicRules();
    // Appends a rule; refuses a port outside 0-65535 or a range that ends
    // before it begins.
    virtual void AddFirewallDynamicRule(const HostCtl::System::FirewallRule& rule);
    // Drops the dynamic rules and the loaded rulesets, before the module is
    // unloaded.
    virtual void DestroyFirewallFilters();

    // A ruleset object for the label, valid or not (FirewallRuleset::IsValid).
    virtual std::unique_ptr<HostCtl::System::FirewallRuleset> GetFirewallRulesetById(const std::string& label);
    // Every ruleset, in the host's order, from one read.
    virtual std::vector<std::unique_ptr<HostCtl::System::FirewallRuleset>> GetFirewallRulesets();
};

}  // namespace System
}  // namespace PldCtl
