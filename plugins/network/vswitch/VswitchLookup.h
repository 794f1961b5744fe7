// What the commands that work on one switch or port group by name share
// (the policy commands and portgroup set): the parameter naming it, its
// lookup with the message for an unknown name, and the end of a set command.
#pragma once

#include <memory>
#include <string>
#include <utility>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/CallSpec.h"
#include "hostctl/network/NetworkFactory.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The parameters of a command whose only option is the required vswitch-name (short v).
boost::shared_ptr<CallSpec::InputSpec> VswitchNameInput(const std::string& description);
// The parameters of a command whose only option is the required portgroup-name (short p).
boost::shared_ptr<CallSpec::InputSpec> PortGroupNameInput(const std::string& description);
// portgroup-name, then the use-vswitch flag (short u), whose help has
// `blanksBetweenSentences` blanks after its first sentence.
boost::shared_ptr<CallSpec::InputSpec> PortGroupPolicySetInput(const std::string& description,
                                                               int blanksBetweenSentences);

// The standard switch of that name, or null after reporting that there is
// none. Throws HostCtlException as the library does.
std::unique_ptr<HostCtl::Network::VirtualSwitch> FindLegacySwitch(const std::string& name, CallSpec::Output& output);
// The port group of that name, or null after reporting that there is none.
std::unique_ptr<HostCtl::Network::PortGroup> FindPortGroup(const std::string& name, CallSpec::Output& output);

// Runs `body` with the switch named by vswitch-name; the library's errors,
// from the lookup or from `body`, are reported as they are.
template <typename Body>
void OnLegacySwitch(const boost::shared_ptr<CallSpec::Input>& input, const boost::shared_ptr<CallSpec::Output>& output,
                    Body&& body) {
    ReportingHostErrors(output, [&] {
        if (std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch =
                FindLegacySwitch(input->GetString("vswitch-name"), *output)) {
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

// The end of every set command: the edited policy is written only when no
// option was refused, and the result is true either way, so the refusals
// are reported beside it.
template <typename Write>
void WriteUnlessRefused(const boost::shared_ptr<CallSpec::Output>& output, Write&& write) {
    if (!output->HasError()) std::forward<Write>(write)();
    FinishTrue(output);
}

// A port group set command's own policy, reset first to inherit everything
// from the switch when use-vswitch is given.
template <typename Policy>
Policy OwnPolicyToEdit(const CallSpec::Input& input, Policy own) {
    if (input.GetFlag("use-vswitch")) own.UnsetAll();
    return own;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
