#include "ip/ipsec/IpIpsecSet.h"

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpIpsecSet::IpIpsecSet() {
    SetDescription("Set IKE config file path.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpIpsecSet)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "ike-conf", CallSpec::PARAM_STRING, "f",
                     "Pass an IKE config path to IKE daemon, this will copy the config to IKE config and restart IKE "
                     "daemons",
                     Required::Yes);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpIpsecSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    const std::string path = input->GetString("ike-conf");
    ReportingHostErrors(output, [&] {
        PldCtl::Network::IpSecConfigImpl config;
        config.CheckIKEConfig(path);
        config.CopyIKEConfig(path);
        config.RestartIKEDaemons();
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
