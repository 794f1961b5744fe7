#include "vswitch/dvs/LacpSetTimeout.h"

#include <memory>
#include <string>

#include "common/CommandSupport.h"
#include "vswitch/dvs/DvsLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

LacpSetTimeout::LacpSetTimeout() {
    SetDescription("Set long/short timeout for hwnics in one LACP LAG");
}

ORVIX_COMMAND_NEW(LacpSetTimeout)

boost::shared_ptr<CallSpec::InputSpec> LacpSetTimeout::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "timeout", CallSpec::PARAM_BOOL, "t",
                     "Set long or short timeout: 1 for short timeout and 0 for long timeout.", Required::Yes);
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n",
                     "The nic name. If it is set, then only this hwnic in the lag will be configured.", Required::No);
    DeclareParameter(declared, "lag-id", CallSpec::PARAM_INT, "l", "The ID of LAG to be configured.", Required::Yes);
    DeclareParameter(declared, "vds", CallSpec::PARAM_STRING, "s", "The name of VDS.", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> LacpSetTimeout::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void LacpSetTimeout::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(output, [&] {
        if (!input->IsSet("timeout")) {
            output->SetError("Timeout is empty");
            return;
        }
        const bool shortTimeout = input->GetBool("timeout");
        if (!input->IsSet("vds")) {
            output->SetError("VDS name is empty");
            return;
        }
        const std::unique_ptr<HostCtl::Network::DVSwitch> dvs = FindDVSwitch(input->GetString("vds"), *output);
        if (!dvs) return;
        if (!input->IsSet("lag-id")) {
            output->SetError("LAG ID is empty");
            return;
        }
        const std::int64_t lagId = input->GetInt("lag-id");
        const std::string nic = input->IsSet("nic-name") ? input->GetString("nic-name") : std::string();
        dvs->SetLacpTimeout(lagId, shortTimeout, nic);
        // The result is a boolean made without a value, as the other LACP
        // and NIC setting commands return.
        Finish(output, MetaObj::MetaBool::New());
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
