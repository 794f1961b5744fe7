// Options shared by the commands of the IP stack that work on one netstack
// instance (routes, DNS, neighbors, connections).
#pragma once

#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"

namespace OrvixCli {
namespace NetworkNamespace {

// Declares `netstack` (-N, optional) with the description every such
// command gives it.
void DeclareNetstackParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec);

// The netstack instance the command works on: the `netstack` value when it
// is not empty, else the default instance.
std::string SelectedNetstack(const CallSpec::Input& input);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
