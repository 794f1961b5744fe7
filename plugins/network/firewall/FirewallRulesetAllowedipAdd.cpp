#include "firewall/FirewallRulesetAllowedipAdd.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipAdd::FirewallRulesetAllowedipAdd() {
    SetDescription("Add allowed ip address/range to the ruleset ruleset.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallRulesetAllowedipAdd)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetAllowedipAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "The label of the ruleset.", Required::Yes);
    DeclareParameter(declared, "ip-address", CallSpec::PARAM_STRING, "i", "Allowed ip address/range for the ruleset.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetAllowedipAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallRulesetAllowedipAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                  boost::shared_ptr<CallSpec::Output> output) {
    RunAllowedIpChange(*input, output, [](HostCtl::System::FirewallRuleset& ruleset, const std::string& address) {
        ruleset.AddAllowedIp(address);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
