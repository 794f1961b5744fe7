#include "ip/ipsec/IpIpsecSPAdd.h"

#include <optional>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "ip/ipsec/IpsecOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The network an SP covers at one end: "any" leaves the whole address space.
void ReadEnd(const std::string& text, HostCtl::Network::Ipv6Address& address, int& prefixLength) {
    if (text == "any") return;
    const HostCtl::Network::Ipv6Network network(text);
    address = network.GetAddress();
    prefixLength = network.GetPrefixLength();
}

}  // namespace

IpIpsecSPAdd::IpIpsecSPAdd() {
    SetDescription("Add a Security Policy.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpIpsecSPAdd)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSPAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "sp-name", CallSpec::PARAM_STRING, "n", "Name for the Security Policy to be added.",
                     Required::Yes);
    DeclareParameter(inputSpec, "sa-name", CallSpec::PARAM_STRING, "a",
                     "Name for the Security Association. Not being Specified lets pallad automatically choose an "
                     "Security Association. If no applicable Security Association exists, then pallad may request one "
                     "using IKE.",
                     Required::No);
    DeclareParameter(inputSpec, "sp-source", CallSpec::PARAM_STRING, "s",
                     "Ipv6 address and prefix length of Security Policy source. Can be specified as 'any' or a "
                     "correct IPv6 network address.",
                     Required::Yes);
    DeclareParameter(inputSpec, "sp-destination", CallSpec::PARAM_STRING, "d",
                     "Ipv6 address and prefix length of Security Policy destination. Can be specified as 'any' or a "
                     "correct Ipv6 network address.",
                     Required::Yes);
    DeclareParameter(inputSpec, "sp-mode", CallSpec::PARAM_STRING, "m",
                     "Security Policy mode. Should be one in set %ENUM%.", Required::No,
                     StringEnum({{"transport", ""}, {"tunnel", ""}}));
    DeclareParameter(inputSpec, "source-port", CallSpec::PARAM_INT, "p",
                     "Source Port for Security Policy. '0' stands for 'any'", Required::Yes);
    DeclareParameter(inputSpec, "destination-port", CallSpec::PARAM_INT, "P",
                     "Destination Port for Security Policy. '0' stands for 'any'", Required::Yes);
    DeclareParameter(inputSpec, "action", CallSpec::PARAM_STRING, "A",
                     "Action for Security Policy. Should be one in set %ENUM%.", Required::No,
                     StringEnum({{"none", ""}, {"discard", ""}, {"ipsec", ""}}));
    DeclareParameter(inputSpec, "upper-layer-protocol", CallSpec::PARAM_STRING, "u",
                     "Upper layer protocol for Security Policy, Should be one in set %ENUM%.", Required::No,
                     StringEnum({{"any", ""}, {"tcp", ""}, {"udp", ""}, {"icmp6", ""}}));
    DeclareParameter(inputSpec, "flow-direction", CallSpec::PARAM_STRING, "w",
                     "Flow direction for Security Policy. Should be one in set %ENUM%.", Required::No,
                     StringEnum({{"in", ""}, {"out", ""}}));
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSPAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpIpsecSPAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                   boost::shared_ptr<CallSpec::Output> output) {
    using PldCtl::Network::IpSecConfigImpl;
    ReportingHostErrors(output, [&] {
        HostCtl::Network::IpSecSpdParam sp;
        sp.saName = input->GetString("sa-name");
        const std::optional<int> sourcePort = ReadPort(*input, "source-port", *output);
        if (!sourcePort) return;
        const std::optional<int> destinationPort = ReadPort(*input, "destination-port", *output);
        if (!destinationPort) return;
        sp.sourcePort = *sourcePort;
        sp.destinationPort = *destinationPort;
        ReadEnd(input->GetString("sp-source"), sp.sourceAddress, sp.sourcePrefixLength);
        ReadEnd(input->GetString("sp-destination"), sp.destinationAddress, sp.destinationPrefixLength);
        sp.upperLayerProtocol = IpSecConfigImpl::StringToIpSecULProtoType(input->GetString("upper-layer-protocol"));
        sp.direction = IpSecConfigImpl::StringToIpSecDirection(input->GetString("flow-direction"));
        const std::string action = input->GetString("action");
        sp.action = IpSecConfigImpl::StringToIpSecAction(action);
        // A mode means something only to a policy that protects its traffic;
        // for the others it is not even read.
        if (action == "ipsec") sp.mode = IpSecConfigImpl::StringToIpSecMode(input->GetString("sp-mode"));
        sp.name = input->GetString("sp-name");
        IpSecConfigImpl config;
        config.AddSPDConfig(sp);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
