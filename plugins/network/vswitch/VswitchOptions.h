// The options that the failover, security and shaping set commands of
// switches and port groups share, and the way those options edit a policy.
//
// The Set functions only edit the policy they are given: the calling command
// fetches it, lets them edit it, and writes it back only when the output holds
// no error. A bad option is reported with SetError and the next option is
// still applied, so one run can report several mistakes at once.
#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "hostctl/network/vswitch/Policy.h"

namespace OrvixCli {
namespace NetworkNamespace {

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

}  // namespace NetworkNamespace
}  // namespace OrvixCli
