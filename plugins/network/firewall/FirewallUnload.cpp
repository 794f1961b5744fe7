#include "firewall/FirewallUnload.h"

#include "common/CommandSupport.h"
#include "hostctl/system/ModuleImpl.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallUnload::FirewallUnload() {
    SetDescription("Allow unload firewall module.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallUnload)

boost::shared_ptr<CallSpec::InputSpec> FirewallUnload::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallUnload::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallUnload::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        // A module that is not loaded is the library's to refuse.
        PldCtl::System::ModuleImpl module(PldCtl::System::kFirewallModule);
        info.DestroyFirewallFilters();
        module.Unload();
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
