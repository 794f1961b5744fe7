// The resolver configuration of a netstack instance over the host store: the
// netstack's servers and search domains are read once, changed in this
// object, and written back by SaveConfig in one transaction. Only the lists
// this object changed are written, so a change another program saved
// meanwhile to the other list survives.
#include "hostctl/network/ip/DnsConfigImpl.h"

#include <algorithm>
#include <cctype>

#include "network/ip/IpLookup.h"

namespace PldCtl {
namespace Detail {

struct DnsConfigState {
    // The netstack as read; unset until first use.
    std::optional<NetstackRecord> loaded;
    std::vector<std::string> servers;
    std::vector<std::string> domains;
};

}  // namespace Detail

namespace Network {

using Detail::DnsConfigState;
using Detail::NetstackRecord;
using HostCtl::Lib::HostCtlException;

namespace {

// The state, read from the store on first use.
DnsConfigState& Loaded(const std::string& netstack, DnsConfigState& state) {
    if (state.loaded) return state;
    Store::HostStore& store = Detail::EnterOperation("DnsConfigImpl::Load", netstack);
    std::optional<NetstackRecord> record = Detail::Get<NetstackRecord>(store, netstack);
    if (!record) throw HostCtlException(Detail::MissingNetstackMessage(netstack));
    state.servers = record->dnsServers;
    state.domains = record->searchDomains;
    state.loaded = std::move(record);
    return state;
}

// Domain names compare without regard to case.
bool SameDomain(const std::string& a, const std::string& b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
               return std::tolower(static_cast<unsigned char>(x)) == std::tolower(static_cast<unsigned char>(y));
           });
}

std::vector<std::string>::iterator FindDomain(std::vector<std::string>& domains, const std::string& domain) {
    return std::find_if(domains.begin(), domains.end(), [&](const std::string& d) { return SameDomain(d, domain); });
}

}  // namespace

DnsConfigImpl::DnsConfigImpl(const std::string& netstack)
    : netstack_(netstack), state_(std::make_shared<DnsConfigState>()) {}
DnsConfigImpl::~DnsConfigImpl() = default;

void DnsConfigImpl::AddNameServer(const HostCtl::Network::IpAddress& server) {
    Detail::EnterOperation("DnsConfigImpl::AddNameServer", netstack_);
    DnsConfigState& state = Loaded(netstack_, *state_);
    const std::string text = server.GetStringAddress();
    if (std::find(state.servers.begin(), state.servers.end(), text) != state.servers.end()) {
        throw HostCtlException("DNS server " + text + " is already configured");
    }
    state.servers.push_back(text);
}

void DnsConfigImpl::RemoveNameServer(const HostCtl::Network::IpAddress& server) {
    Detail::EnterOperation("DnsConfigImpl::RemoveNameServer", netstack_);
    DnsConfigState& state = Loaded(netstack_, *state_);
    const std::string text = server.GetStringAddress();
    const auto found = std::find(state.servers.begin(), state.servers.end(), text);
    if (found == state.servers.end()) throw HostCtlException("DNS server " + text + " is not configured");
    state.servers.erase(found);
}

void DnsConfigImpl::RemoveNameServers() {
    Detail::EnterOperation("DnsConfigImpl::RemoveNameServers", netstack_);
    Loaded(netstack_, *state_).servers.clear();
}

std::vector<std::string> DnsConfigImpl::GetNameServers() {
    Detail::EnterOperation("DnsConfigImpl::GetNameServers", netstack_);
    return Loaded(netstack_, *state_).servers;
}

void DnsConfigImpl::AddSearchDomain(const std::string& domain) {
    Detail::EnterOperation("DnsConfigImpl::AddSearchDomain", netstack_);
    DnsConfigState& state = Loaded(netstack_, *state_);
    // The domains are handed out joined by blanks: a blank inside one
    // would split it.
    if (!Detail::IsSingleWord(domain)) {
        throw HostCtlException("Invalid search domain '" + domain +
                               "': use a name without blanks or control characters");
    }
    if (FindDomain(state.domains, domain) != state.domains.end()) {
        throw HostCtlException("Search domain " + domain + " is already configured");
    }
    state.domains.push_back(domain);
}

void DnsConfigImpl::RemoveSearchDomain(const std::string& domain) {
    Detail::EnterOperation("DnsConfigImpl::RemoveSearchDomain", netstack_);
    DnsConfigState& state = Loaded(netstack_, *state_);
    const auto found = FindDomain(state.domains, domain);
    if (found == state.domains.end()) throw HostCtlException("Search domain " + domain + " is not configured");
    state.domains.erase(found);
}

std::string DnsConfigImpl::GetSearchDomainsString() {
    Detail::EnterOperation("DnsConfigImpl::GetSearchDomainsString", netstack_);
    std::string joined;
    for (const std::string& domain : Loaded(netstack_, *state_).domains) {
        joined += (joined.empty() ? "" : " ") + domain;
    }
    return joined;
}

void DnsConfigImpl::SaveConfig() {
    Store::HostStore& store = Detail::EnterOperation("DnsConfigImpl::SaveConfig", netstack_);
    DnsConfigState& state = Loaded(netstack_, *state_);
    const NetstackRecord& base = *state.loaded;
    store.Change([&](Store::Transaction& t) {
        Detail::StoredObject<NetstackRecord> stored = Detail::RequireNetstack(t, netstack_);
        NetstackRecord edited = stored.record;
        if (state.servers != base.dnsServers) edited.dnsServers = state.servers;
        if (state.domains != base.searchDomains) edited.searchDomains = state.domains;
        Detail::Write(t, stored, edited);
    });
    state.loaded->dnsServers = state.servers;
    state.loaded->searchDomains = state.domains;
}

}  // namespace Network
}  // namespace PldCtl
