// How the netstack commands find the instance they name.
#pragma once

#include <memory>
#include <string>

#include "framework/CallSpec.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/ip/NetstackInstance.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The instance of that key, or null after reporting "Unable to find a
// Netstack instance KEY". Throws HostCtlException as the library does.
std::unique_ptr<HostCtl::Network::NetstackInstance> FindNetstack(PldCtl::Network::NetworkInfoImpl& networkInfo,
                                                                 const std::string& key, CallSpec::Output& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
