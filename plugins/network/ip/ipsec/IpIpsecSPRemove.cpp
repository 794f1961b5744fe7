#include "ip/ipsec/IpIpsecSPRemove.h"

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpIpsecSPRemove::IpIpsecSPRemove() {
    SetDescription("Operation to remove Security Policy");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpIpsecSPRemove)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSPRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "sp-name", CallSpec::PARAM_STRING, "n", "Name for the Security Policy to be removed.",
                     Required::No);
    DeclareParameter(inputSpec, "remove-all", CallSpec::PARAM_FLAG, "a", "Set to remove all Security Policys",
                     Required::No);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSPRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpIpsecSPRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    const bool named = input->IsSet("sp-name");
    const bool removeAll = input->GetFlag("remove-all");
    ReportingHostErrors(output, [&] {
        PldCtl::Network::IpSecConfigImpl config;
        if (named && !removeAll) {
            config.RemoveSPDConfig(input->GetString("sp-name"));
        } else if (removeAll && !named) {
            config.FlushSPDConfig();
        } else {
            // Removes nothing, and still answers true.
            output->SetError("You should specify exactly one of : --remove-all, --sp-name");
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
