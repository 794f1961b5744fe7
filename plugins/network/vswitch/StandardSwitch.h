// What the commands that change one standard switch by name have in common:
// the message for a name the host does not know, and the lookup through the
// factory that must never hand a missing switch to the change.
#pragma once

#include <functional>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "hostctl/network/NetworkFactory.h"

namespace OrvixCli {
namespace NetworkNamespace {

// "Unable to find virtual switch with the name " followed by the name.
std::string UnknownSwitchMessage(const std::string& vswitchName);

// Looks the switch up with NetworkFactory::GetVirtualSwitchById, applies
// `change` to it and finishes with true. An unknown switch is reported with
// UnknownSwitchMessage, a HostCtlException with its message; either way the
// run ends without a result.
void ChangeStandardSwitch(const boost::shared_ptr<CallSpec::Output>& output, const std::string& vswitchName,
                          const std::function<void(HostCtl::Network::VirtualSwitch&)>& change);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
