// What the firewall commands share: the ruleset label parameter and the
// runs of the commands that change a ruleset.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

// Declares `--ruleset-id` (`-r`), a string.
void DeclareRulesetIdParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec, const std::string& description,
                               CallSpec::Required required);

// The run of `allowedip add` and `remove`: checks the ruleset and the
// address text as both commands do, then lets `change` apply the address.
void RunAllowedIpChange(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                        const std::function<void(HostCtl::System::FirewallRuleset&, const std::string&)>& change);

// Adds the saved dynamic rules again, in order. A rule the firewall refuses
// does not stop the others: every rule is tried, and the message of the
// first refusal is returned (none when all were added).
std::optional<std::string> ReaddDynamicRules(PldCtl::System::SystemInfoImpl& info,
                                             const std::vector<std::unique_ptr<HostCtl::System::FirewallRule>>& rules);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
