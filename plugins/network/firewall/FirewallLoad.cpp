#include "firewall/FirewallLoad.h"

#include "common/CommandSupport.h"
#include "hostctl/system/ModuleImpl.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallLoad::FirewallLoad() {
    SetDescription("Load firewall module and rulesets configuration.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallLoad)

boost::shared_ptr<CallSpec::InputSpec> FirewallLoad::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallLoad::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallLoad::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        // A module loaded already is the library's to refuse.
        PldCtl::System::ModuleImpl module(PldCtl::System::kFirewallModule);
        module.Load("", false);
        info.LoadFirewallRulesets();
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
