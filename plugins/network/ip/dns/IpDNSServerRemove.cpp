#include "ip/dns/IpDNSServerRemove.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSServerRemove::IpDNSServerRemove() {
    SetDescription("Remove a DNS server from the list of DNS servers to use for this Tovrin host.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpDNSServerRemove)

boost::shared_ptr<CallSpec::InputSpec> IpDNSServerRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "all", CallSpec::PARAM_FLAG, "a", " ", Required::No);
    DeclareParameter(declared, "server", CallSpec::PARAM_STRING, "s", " ", Required::No);
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSServerRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpDNSServerRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    const bool all = input->GetFlag("all");
    const std::optional<std::string> server =
        input->IsSet("server") ? std::optional<std::string>(input->GetString("server")) : std::nullopt;
    RunDnsChange(*input, output,
                 [&](PldCtl::Network::DnsConfigImpl& config) { RemoveDnsServers(config, all, server); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
