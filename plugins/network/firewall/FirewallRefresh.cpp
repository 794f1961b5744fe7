#include "firewall/FirewallRefresh.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "firewall/FirewallOptions.h"
#include "hostctl/system/SystemInfoImpl.h"
#include "hostctl/util/DeleteVector.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallRefresh::FirewallRefresh() {
    SetDescription("Load ruleset configuration for firewall.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(FirewallRefresh)

boost::shared_ptr<CallSpec::InputSpec> FirewallRefresh::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallRefresh::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void FirewallRefresh::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    ReportingHostErrors(output, [&] {
        // Loading the rulesets drops the dynamic rules: they are saved first
        // and added again afterwards.
        std::vector<std::unique_ptr<HostCtl::System::FirewallRule>> saved = info.GetFirewallDynamicRules();
        std::optional<std::string> failure;
        try {
            info.LoadFirewallRulesets();
            failure = ReaddDynamicRules(info, saved);
        } catch (...) {
            PldCtl::Util::DeleteVector(saved);
            throw;
        }
        PldCtl::Util::DeleteVector(saved);
        if (failure) throw HostCtl::Lib::HostCtlException(*failure);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
