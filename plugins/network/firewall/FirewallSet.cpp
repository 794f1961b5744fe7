#include "firewall/FirewallSet.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallRecords.h"
#include "hostctl/system/ModuleImpl.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Lib::HostCtlException;

FirewallSet::FirewallSet() {
    SetDescription("Set firewall enabled status and default action.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallSet)

boost::shared_ptr<CallSpec::InputSpec> FirewallSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "enabled", CallSpec::PARAM_BOOL, "e",
                     "Set to true to enable the firewall, set to false to disable the firewall.", Required::No);
    DeclareParameter(declared, "default-action", CallSpec::PARAM_BOOL, "d",
                     "Set to true to set defaultaction PASS, set to false to DROP.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                  boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        const bool setEnabled = input->IsSet("enabled");
        const bool setAction = input->IsSet("default-action");
        if (!setEnabled && !setAction) throw HostCtlException("Need parameter --enabled or --default-action");
        PldCtl::System::ModuleImpl module(PldCtl::System::kFirewallModule);
        if (!module.IsLoaded()) throw HostCtlException("Firewall module is not loaded");
        const bool enabled = info.IsFirewallEnabled();
        const bool pass = info.GetFirewallDefaultAction();
        if (setEnabled && input->GetBool("enabled") != enabled) info.SetFirewallEnabled(!enabled);
        // A change of the enabled state made above stays when the default
        // action is refused.
        if (setAction) {
            if (input->GetBool("default-action") == pass) {
                throw HostCtlException(std::string("Default action already ") + DefaultActionWord(pass));
            }
            info.SetFirewallDefaultAction(!pass);
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
