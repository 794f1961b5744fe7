#include "ip/netstack/IpNetstackInstanceSet.h"

#include <memory>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "ip/netstack/NetstackLookup.h"
#include "ip/netstack/NetstackOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNetstackInstanceSet::IpNetstackInstanceSet() {
    SetDescription("Configure settings for a given Netstack Instance.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpNetstackInstanceSet)

boost::shared_ptr<CallSpec::InputSpec> IpNetstackInstanceSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = NetstackKeyInput(
        "The network stack instance. This name must be an interface listed in the netstack list command.");
    DeclareParameter(declared, "enable", CallSpec::PARAM_BOOL, "e", "Enable the netstack instance (create in kernel)",
                     Required::No);
    DeclareParameter(declared, "name", CallSpec::PARAM_STRING, "n", "The name for this netstack instance.",
                     Required::No);
    DeclareParameter(declared, "maxconn", CallSpec::PARAM_INT, "m",
                     "The maximum number of connections for this netstack instance (applied only during netstack "
                     "creation).",
                     Required::No);
    DeclareParameter(declared, "ccalgo", CallSpec::PARAM_STRING, "c",
                     "The TCP Congestion Contol Algorithm for this netstack instance (not applied to existing "
                     "connections).: %FULLENUM%",
                     Required::No, StringEnum(CongestionControlChoices()));
    DeclareParameter(declared, "ipv6enabled", CallSpec::PARAM_BOOL, "i",
                     "To enable IPv6 for this netstack instance (aplied only during netstack creation).", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpNetstackInstanceSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpNetstackInstanceSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                            boost::shared_ptr<CallSpec::Output> output) {
    const std::string key = input->GetString("netstack");
    PldCtl::Network::NetworkInfoImpl networkInfo;
    // Each setting is its own change on the host, made in this order: when
    // one is refused, those before it stay made.
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<HostCtl::Network::NetstackInstance> instance = FindNetstack(networkInfo, key, *output);
            if (!instance) return;
            const std::string name = input->GetString("name");
            if (!name.empty()) instance->SetName(name, true);
            if (input->IsSet("enable")) {
                if (input->GetBool("enable")) {
                    instance->Enable();
                } else {
                    instance->Disable();
                }
            }
            // The limit goes to the host as given: the host refuses one that
            // does not fit rather than storing a wrapped value.
            if (input->IsSet("maxconn")) instance->SetMaxConnections(input->GetInt("maxconn"), true);
            const std::string algorithm = input->GetString("ccalgo");
            if (!algorithm.empty()) instance->SetCongestionControlAlgorithm(algorithm, true);
            if (input->IsSet("ipv6enabled")) instance->SetIpv6Enabled(input->GetBool("ipv6enabled"), true);
            FinishTrue(output);
        },
        "Error setting configuration for the netstack instance " + key + ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
