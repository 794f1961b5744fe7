#include "firewall/FirewallOptions.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallLookup.h"
#include "hostctl/Lib.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Lib::HostCtlException;

void DeclareRulesetIdParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec, const std::string& description,
                               CallSpec::Required required) {
    DeclareParameter(inputSpec, "ruleset-id", CallSpec::PARAM_STRING, "r", description, required);
}

void RunAllowedIpChange(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                        const std::function<void(HostCtl::System::FirewallRuleset&, const std::string&)>& change) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        const std::string label = input.GetString("ruleset-id");
        const std::string address = input.GetString("ip-address");
        std::unique_ptr<HostCtl::System::FirewallRuleset> ruleset = ChangeableRuleset(info, label);
        if (ruleset->IsAllowedAll()) {
            throw HostCtlException("Couldn't update allowed ip list when allowed-all flag is true.");
        }
        if (address.empty()) throw HostCtlException("Invalid allowedip parameter.");
        change(*ruleset, address);
        FinishTrue(output);
    });
}

std::optional<std::string> ReaddDynamicRules(PldCtl::System::SystemInfoImpl& info,
                                             const std::vector<std::unique_ptr<HostCtl::System::FirewallRule>>& rules) {
    std::optional<std::string> firstFailure;
    for (const std::unique_ptr<HostCtl::System::FirewallRule>& rule : rules) {
        try {
            info.AddFirewallDynamicRule(*rule);
        } catch (const HostCtlException& e) {
            if (!firstFailure) firstFailure = e.GetMessage(0);
        }
    }
    return firstFailure;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
