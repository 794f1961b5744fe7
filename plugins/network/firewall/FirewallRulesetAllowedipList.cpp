#include "firewall/FirewallRulesetAllowedipList.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"
#include "firewall/FirewallRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipList::FirewallRulesetAllowedipList() {
    SetDescription("list allowed ip addresses for rulesets.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallRulesetAllowedip", "Ruleset,Allowed IP Addresses");
}

ORVIX_COMMAND_NEW(FirewallRulesetAllowedipList)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetAllowedipList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "The label of the ruleset.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetAllowedipList::GetOutputSpecInternal() {
    return RulesetListingOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> FirewallRulesetAllowedipList::GetOutputStructure() {
    return AllowedIpTemplate();
}

void FirewallRulesetAllowedipList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                   boost::shared_ptr<CallSpec::Output> output) {
    RunRulesetListing(
        *input, output, [this] { return GetOutputStructure(); }, AllowedIpRecord);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
