#include "firewall/FirewallRulesetSet.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallLookup.h"
#include "firewall/FirewallOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Lib::HostCtlException;

FirewallRulesetSet::FirewallRulesetSet() {
    SetDescription("Set firewall ruleset status (allowedAll flag and enabled status).");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallRulesetSet)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "The label of the ruleset.", Required::Yes);
    DeclareParameter(declared, "allowed-all", CallSpec::PARAM_BOOL, "a",
                     "Set to true to allowed all ip, set to false to use allowed ip list.", Required::No);
    DeclareParameter(declared, "enabled", CallSpec::PARAM_BOOL, "e",
                     "Set to true to enable ruleset, set to false to disable it.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallRulesetSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        const std::string label = input->GetString("ruleset-id");
        const bool setEnabled = input->IsSet("enabled");
        const bool setAllowedAll = input->IsSet("allowed-all");
        if (!setEnabled && !setAllowedAll) throw HostCtlException("Need parameter --enabled or --allowed-all");
        std::unique_ptr<HostCtl::System::FirewallRuleset> ruleset = ChangeableRuleset(info, label);
        const bool enabled = ruleset->IsEnabled();
        const bool allowedAll = ruleset->IsAllowedAll();
        // The flag is checked and set before the enabled state: a flag that
        // is already as asked refuses the whole command.
        if (setAllowedAll) {
            if (input->GetBool("allowed-all") == allowedAll) {
                throw HostCtlException(allowedAll ? "Already allowed all ip" : "Already use allowed ip list");
            }
            ruleset->SetAllowedAll(!allowedAll);
        }
        if (setEnabled && input->GetBool("enabled") != enabled) {
            if (enabled) {
                ruleset->Disable();
            } else {
                ruleset->Enable();
            }
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
