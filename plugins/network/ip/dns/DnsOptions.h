// What the DNS commands share: how a server address is read, the rule of
// `server remove`, and the run of a changing command.
//
// The steps work on a resolver configuration the caller made for the chosen
// netstack, so that they run the same against the host and against a
// stand-in. Refusals, the commands' own and the library's, are thrown as
// HostCtlException and reported with their message alone.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "hostctl/Values.h"
#include "hostctl/network/ip/DnsConfigImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The address of a DNS server: IPv4 when the text is one, else IPv6. Throws
// "The specified address 'TEXT' is not recognised as a valid IP address"
// for text that is neither.
std::unique_ptr<HostCtl::Network::IpAddress> DnsServerAddress(const std::string& text);

// Removes every server (`all`) or the one `server` names. Exactly one of the
// two must be given, else it throws "You must specify exactly one of: --all,
// --server" and changes nothing.
void RemoveDnsServers(PldCtl::Network::DnsConfigImpl& config, bool all, const std::optional<std::string>& server);

// The run of a changing command: makes the configuration of the selected
// netstack, lets `change` edit it, saves it and ends with the result true.
// Nothing is saved when `change` throws.
void RunDnsChange(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                  const std::function<void(PldCtl::Network::DnsConfigImpl&)>& change);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
