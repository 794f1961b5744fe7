#include "firewall/FirewallRulesetRuleList.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"
#include "firewall/FirewallRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRulesetRuleList::FirewallRulesetRuleList() {
    SetDescription("List the rules of each ruleset in firewall.");
    SetMetaDataField("type", "fetcher");
    // The listing is declared simple first and then table: the second
    // choice is the one that holds.
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallPortRule", "Ruleset,Direction,Protocol,Port Type,Port Begin,Port End");
}

ORVIX_COMMAND_NEW(FirewallRulesetRuleList)

boost::shared_ptr<CallSpec::InputSpec> FirewallRulesetRuleList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareRulesetIdParameter(declared, "List rules for specfic ruleset", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRulesetRuleList::GetOutputSpecInternal() {
    return RulesetListingOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> FirewallRulesetRuleList::GetOutputStructure() {
    return PortRuleTemplate();
}

void FirewallRulesetRuleList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                              boost::shared_ptr<CallSpec::Output> output) {
    RunRulesetListing(
        *input, output, [this] { return GetOutputStructure(); }, PortRuleRecords);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
