#include "ip/netstack/NetstackLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

std::unique_ptr<HostCtl::Network::NetstackInstance> FindNetstack(PldCtl::Network::NetworkInfoImpl& networkInfo,
                                                                 const std::string& key, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::NetstackInstance> found = networkInfo.LookupNetstackInstanceByKey(key);
    if (!found) output.SetError("Unable to find a Netstack instance " + key);
    return found;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
