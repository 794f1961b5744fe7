#include "ip/dns/DnsOptions.h"

#include "common/CommandSupport.h"
#include "hostctl/Lib.h"
#include "ip/IpOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

std::unique_ptr<HostCtl::Network::IpAddress> DnsServerAddress(const std::string& text) {
    if (HostCtl::Network::Ipv4Address::IsValidAddress(text)) {
        return std::make_unique<HostCtl::Network::Ipv4Address>(text);
    }
    if (HostCtl::Network::Ipv6Address::IsValidAddress(text)) {
        return std::make_unique<HostCtl::Network::Ipv6Address>(text);
    }
    throw HostCtl::Lib::HostCtlException("The specified address '" + text +
                                         "' is not recognised as a valid IP address");
}

void RemoveDnsServers(PldCtl::Network::DnsConfigImpl& config, bool all, const std::optional<std::string>& server) {
    if (all == server.has_value()) {
        throw HostCtl::Lib::HostCtlException("You must specify exactly one of: --all, --server");
    }
    if (all) {
        config.RemoveNameServers();
    } else {
        config.RemoveNameServer(*DnsServerAddress(*server));
    }
}

void RunDnsChange(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                  const std::function<void(PldCtl::Network::DnsConfigImpl&)>& change) {
    ReportingHostErrors(output, [&] {
        PldCtl::Network::DnsConfigImpl config(SelectedNetstack(input));
        change(config);
        config.SaveConfig();
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
