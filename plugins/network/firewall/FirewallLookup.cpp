#include "firewall/FirewallLookup.h"

#include "hostctl/Lib.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Lib::HostCtlException;
using HostCtl::System::FirewallRuleset;

std::unique_ptr<FirewallRuleset> ChangeableRuleset(PldCtl::System::SystemInfoImpl& info, const std::string& label) {
    std::unique_ptr<FirewallRuleset> ruleset = info.GetFirewallRulesetById(label);
    if (!ruleset->IsValid()) throw HostCtlException("Invalid Ruleset Id.");
    return ruleset;
}

std::vector<std::unique_ptr<FirewallRuleset>> ListedRulesets(PldCtl::System::SystemInfoImpl& info,
                                                             const CallSpec::Input& input) {
    if (!input.IsSet("ruleset-id")) return info.GetFirewallRulesets();
    const std::string label = input.GetString("ruleset-id");
    std::unique_ptr<FirewallRuleset> ruleset;
    try {
        ruleset = info.GetFirewallRulesetById(label);
    } catch (const HostCtlException&) {
        // The lookup's own reason is not shown: the label is what the user
        // can act on.
        throw HostCtlException("Failed to check loaded status: " + label);
    }
    if (!ruleset->IsValid()) throw HostCtlException("Ruleset Not Found: " + label);
    std::vector<std::unique_ptr<FirewallRuleset>> selected;
    selected.push_back(std::move(ruleset));
    return selected;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
