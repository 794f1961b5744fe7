// The resolver configuration of one netstack instance: DNS servers and
// search domains, each an ordered list.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace PldCtl {
namespace Detail {
struct DnsConfigState;
}  // namespace Detail

namespace Network {

// The configuration is read on first use; the changing operations change
// this object only and SaveConfig writes all of them in one transaction.
// They throw HostCtl::Lib::HostCtlException for what the host refuses (a
// netstack it does not have, a server or domain listed twice or not listed,
// text that cannot be stored as one line), leaving the object unchanged.
class HOSTCTL_EXPORT DnsConfigImpl {
public:
    explicit DnsConfigImpl(const std::string& netstack);
    virtual ~DnsConfigImpl();

    // Appended at the end of the list.
    virtual void AddNameServer(const HostCtl::Network::IpAddress& server);
    virtual void RemoveNameServer(const HostCtl::Network::IpAddress& server);
    virtual void RemoveNameServers();
    // In the order they are asked, as address text.
    virtual std::vector<std::string> GetNameServers();

    // Refuses an empty domain and one containing a blank or a control
    // character.
    virtual void AddSearchDomain(const std::string& domain);
    virtual void RemoveSearchDomain(const std::string& domain);
    // Every search domain in order, separated by one blank.
    virtual std::string GetSearchDomainsString();

    // Makes the changes persistent.
    virtual void SaveConfig();

private:
    std::string netstack_;
    std::shared_ptr<Detail::DnsConfigState> state_;
};

}  // namespace Network
}  // namespace PldCtl
