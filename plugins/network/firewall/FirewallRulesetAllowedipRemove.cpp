#include "firewall/FirewallRulesetAllowedipRemove.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipRemove::FirewallRulesetAllowedipRemove() {
    SetDescription("Remove allowed ip address/range from the ruleset.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallRulesetAllowedipRemove)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetAllowedipRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "The label of the ruleset.", Required::Yes);
    DeclareParameter(declared, "ip-address", CallSpec::PARAM_STRING, "i", "Allowed ip address/range for the ruleset.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetAllowedipRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallRulesetAllowedipRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                     boost::shared_ptr<CallSpec::Output> output) {
    RunAllowedIpChange(*input, output, [](HostCtl::System::FirewallRuleset& ruleset, const std::string& address) {
        ruleset.RemoveAllowedIp(address);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
