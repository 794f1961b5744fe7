// How the standard switch and port group commands find the switch or port
// group they name, and what each reports when the host has none.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <utility>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/CallSpec.h"
#include "hostctl/network/NetworkFactory.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The ways a command finds the standard switch it names. They differ in the
// library calls they make, and so in the faults that reach them, and in the
// messages a missing switch gives.
enum class SwitchLookup {
    // The policy commands: PortsetImpl::IsValidVirtualSwitch, then
    // VirtualSwitchInfoImpl::GetVirtualSwitchByName. "Unable to find a legacy
    // virtual switch with the name X" when either finds nothing.
    Legacy,
    // The commands that add or remove an uplink or a port group:
    // NetworkFactory::GetVirtualSwitchById. "Unable to find virtual switch
    // with the name X" (the library's UnknownVirtualSwitchMessage).
    ById,
    // standard set: the calls of Legacy, with "X is not a valid name for a
    // virtual switch" for a name the host does not know and "Unable to find
    // a virtual switch with name X" when reading it gives nothing.
    Settable,
};

// The standard switch of that name, or null after reporting that there is
// none. Throws HostCtlException as the library does.
std::unique_ptr<HostCtl::Network::VirtualSwitch> FindSwitch(SwitchLookup how, const std::string& name,
                                                            CallSpec::Output& output);
// The port group of that name, or null after reporting that there is none.
std::unique_ptr<HostCtl::Network::PortGroup> FindPortGroup(const std::string& name, CallSpec::Output& output);

// Runs `body` with the switch named by vswitch-name, found `how`; the
// library's errors, from the lookup or from `body`, are reported as they are.
template <typename Body>
void OnSwitch(SwitchLookup how, const boost::shared_ptr<CallSpec::Input>& input,
              const boost::shared_ptr<CallSpec::Output>& output, Body&& body) {
    ReportingHostErrors(output, [&] {
        if (std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch =
                FindSwitch(how, input->GetString("vswitch-name"), *output)) {
            std::forward<Body>(body)(*vswitch);
        }
    });
}

// The same with the port group named by portgroup-name.
template <typename Body>
void OnPortGroup(const boost::shared_ptr<CallSpec::Input>& input, const boost::shared_ptr<CallSpec::Output>& output,
                 Body&& body) {
    ReportingHostErrors(output, [&] {
        if (std::unique_ptr<HostCtl::Network::PortGroup> portGroup =
                FindPortGroup(input->GetString("portgroup-name"), *output)) {
            std::forward<Body>(body)(*portGroup);
        }
    });
}

// Applies `change` to the switch of that name, found ById, and finishes
// with true; a missing switch or a library error ends the run without a
// result.
void ChangeStandardSwitch(const boost::shared_ptr<CallSpec::Output>& output, const std::string& vswitchName,
                          const std::function<void(HostCtl::Network::VirtualSwitch&)>& change);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
