// The options the standard switch and port group commands share: the
// parameters naming the switch or port group, the CDP status words, and the
// failover, security and shaping options with the way they edit a policy.
//
// The Set functions only edit the policy they are given: the calling command
// fetches it, lets them edit it, and writes it back with WriteUnlessRefused.
// A bad option is reported with SetError and the next option is still
// applied, so one run can report several mistakes at once.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/CallSpec.h"
#include "hostctl/network/vswitch/Policy.h"

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

// The string enum of the cdp-status option: every CDP status word, in the
// order of the library's table, each with its own description.
boost::shared_ptr<CallSpec::ParameterConstraint> CdpStatusConstraint();
// The index VirtualSwitch::SetCDPStatus takes for a CDP status word. Any
// text that is not one of the first three words means "both", the last.
int CdpStatusIndex(const std::string& word);

// load-balancing, failure-detection, notify-switches, failback,
// active-uplinks, standby-uplinks.
void AddFailoverParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec);
// allow-promiscuous (short name o), allow-mac-change, allow-forged-transmits.
void AddSecurityParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec);
// The same options with another short name for allow-promiscuous: the switch
// command, which has no port group option, calls it p.
void AddSecurityParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec, const std::string& promiscuousShortName);
// enabled, avg-bandwidth, peak-bandwidth, burst-size.
void AddShapingParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec);

// Applies the failover options to `policy`. `referencePolicy` is the other
// teaming policy of the switch or port group (the one shown to the user): the
// adapters a command does not name are kept from it. `vswitchUplinks` are the
// uplinks of the switch concerned; a named NIC must be one of them.
void SetFailoverPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output,
                       HostCtl::Network::NicTeamingPolicy& policy, HostCtl::Network::NicTeamingPolicy& referencePolicy,
                       std::vector<std::string>& vswitchUplinks);

// Applies the three security flags that were given.
void SetSecurityPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output,
                       HostCtl::Network::PortSecurityPolicy& policy);

// Applies the shaping options, converting Kbps to bits per second and Kib to
// bytes. An enabled policy needs all three values when `requireAll` is true or
// the options switch shaping on.
void SetShapingPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output,
                      HostCtl::Network::ShapingPolicy& policy, bool requireAll);

// Splits a comma-separated uplink list: every piece before a comma, empty or
// not, and the piece after the last comma when it is not empty. No blanks are
// trimmed; an empty text gives no names.
std::vector<std::string> SplitUplinks(const std::string& text);

// A port group set command's own policy, reset first to inherit everything
// from the switch when use-vswitch is given.
template <typename Policy>
Policy OwnPolicyToEdit(const CallSpec::Input& input, Policy own) {
    if (input.GetFlag("use-vswitch")) own.UnsetAll();
    return own;
}

// The end of every set command: the edited policy is written only when no
// option was refused, and the result is true either way, so the refusals
// are reported beside it.
template <typename Write>
void WriteUnlessRefused(const boost::shared_ptr<CallSpec::Output>& output, Write&& write) {
    if (!output->HasError()) std::forward<Write>(write)();
    FinishTrue(output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
