#include "firewall/FirewallRulesetList.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"
#include "firewall/FirewallRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRulesetList::FirewallRulesetList() {
    SetDescription("List the rulesets in firewall.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Ruleset", "Name,Enabled");
}

ORVIX_COMMAND_NEW(FirewallRulesetList)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "List configuration for specfic ruleset", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetList::GetOutputSpecInternal() {
    return RulesetListingOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> FirewallRulesetList::GetOutputStructure() {
    return RulesetTemplate();
}

void FirewallRulesetList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                          boost::shared_ptr<CallSpec::Output> output) {
    RunRulesetListing(
        *input, output, [this] { return GetOutputStructure(); }, RulesetRecord);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
