#include "ip/IpOptions.h"

#include "common/CommandSupport.h"
#include "hostctl/network/ip/NetstackInstance.h"

namespace OrvixCli {
namespace NetworkNamespace {

void DeclareNetstackParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec) {
    DeclareParameter(inputSpec, "netstack", CallSpec::PARAM_STRING, "N",
                     "The network stack instance; if unspecified, use the default netstack instance", Required::No);
}

std::string SelectedNetstack(const CallSpec::Input& input) {
    const std::string netstack = input.GetString("netstack");
    return netstack.empty() ? std::string(HostCtl::Network::NetstackInstance::DEFAULT_KEY) : netstack;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
