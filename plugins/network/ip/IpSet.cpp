#include "ip/IpSet.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpSet::IpSet() {
    SetDescription("Update global IP settings");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpSet)

boost::shared_ptr<CallSpec::InputSpec> IpSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "ipv6-enabled", CallSpec::PARAM_BOOL, "e", "Enable or disable IPv6 (Reboot Required)",
                     Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        if (input->IsSet("ipv6-enabled")) networkInfo.SetPldIpv6Enabled(input->GetBool("ipv6-enabled"));
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
