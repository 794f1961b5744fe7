// Routes, default gateways and neighbor caches of a netstack instance over
// the host store. Both address families share one collection of routes and
// one of neighbors; the text of a network or address tells the family. A
// netstack's routes are read with one listing of its children, decoded field
// by field, so a table of thousands of routes lists quickly.
#include "hostctl/network/ip/RoutingInfoImpl.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <string_view>
#include <tuple>
#include <type_traits>

#include "network/dvs/DvsRecords.h"
#include "network/ip/IpLookup.h"

namespace PldCtl {
namespace Detail {

// The stored sources of the IPv4 routes of the netstack listed last, for
// the source column a listing asks for route by route. Each entry is a
// network's key (see SourceKey) with the index of its source text; entries
// are sorted by key, and of several routes to one network the first stored
// one counts. The snapshot holds every route of that listing, so a network
// it lacks has no route; any change drops it.
struct RouteSources {
    std::string netstack;
    bool complete = false;
    std::vector<std::pair<std::uint64_t, std::uint32_t>> byNetwork;
    std::vector<std::string> texts;

    void Clear() {
        complete = false;
        byNetwork.clear();
        texts.clear();
    }
};

}  // namespace Detail

namespace Network {

using Detail::InterfaceRecord;
using Detail::NeighborRecord;
using Detail::NetstackRecord;
using Detail::RouteRecord;
using HostCtl::Lib::HostCtlException;
using namespace HostCtl::Network;

const Ipv4Network RoutingInfoImpl::DEFAULT_IPV4_ROUTE(Ipv4Address(), 0);
const Ipv6Network RoutingInfoImpl::DEFAULT_IPV6_ROUTE(Ipv6Address(), 0);

namespace {

// What differs between the families, for the operations written once.
struct V4 {
    using Network = Ipv4Network;
    using Address = Ipv4Address;
    using Route = Ipv4Route;
    static constexpr bool kIpv6 = false;
    static constexpr std::string NetstackRecord::*kGateway = &NetstackRecord::ipv4Gateway;

    // The networks of an interface's IPv4 address.
    static std::vector<Network> NetworksOf(const InterfaceRecord& nic) {
        if (nic.ipv4Mode != "static" && nic.ipv4Mode != "dhcp") return {};
        if (!Ipv4Address::IsValidAddress(nic.ipv4Address) || !Ipv4Address::IsValidAddress(nic.ipv4Netmask)) return {};
        const Ipv4Address address(nic.ipv4Address);
        const Ipv4Address mask(nic.ipv4Netmask);
        if (!address.IsSet() || !Ipv4Network::IsValidNetmask(mask)) return {};
        return {Ipv4Network(address, Ipv4Network::PrefixFromNetmask(mask)).Masked()};
    }
    static bool IsLinkLocal(const Address&) { return false; }
    // Orders a listing: the default route first, then by network address
    // and prefix length.
    static std::uint64_t SortKey(const Network& network) {
        return std::uint64_t{network.GetPrefixLength() != 0} << 40 |
               std::uint64_t{network.GetNetwork().ToUint32()} << 8 |
               static_cast<std::uint64_t>(network.GetPrefixLength());
    }
};

struct V6 {
    using Network = Ipv6Network;
    using Address = Ipv6Address;
    using Route = Ipv6Route;
    static constexpr bool kIpv6 = true;
    static constexpr std::string NetstackRecord::*kGateway = &NetstackRecord::ipv6Gateway;

    // The networks of an interface's usable IPv6 addresses (a duplicated
    // address is not used).
    static std::vector<Network> NetworksOf(const InterfaceRecord& nic) {
        std::vector<Network> networks;
        for (const Detail::Ipv6AddressRecord& stored : nic.ipv6Addresses) {
            if (stored.status == "duplicated" || !Ipv6Network::IsValidAddressAndNetmask(stored.address)) continue;
            networks.push_back(Ipv6Network(stored.address).Masked());
        }
        return networks;
    }
    static bool IsLinkLocal(const Address& gateway) { return gateway.IsLinkLocal(); }
    static std::tuple<bool, Ipv6Address::Bytes, int> SortKey(const Network& network) {
        return {network.GetPrefixLength() != 0, network.GetAddress().GetBytes(), network.GetPrefixLength()};
    }
};

std::string Text(const Ipv4Network& network) {
    return network.Masked().GetStringAddress();
}
std::string Text(const Ipv6Network& network) {
    return network.Masked().GetStringAddress();
}

template <typename Network>
bool IsDefault(const Network& network) {
    return network.GetPrefixLength() == 0;
}

// Whether `outer` holds every address of `inner`.
bool Contains(const Ipv4Network& outer, const Ipv4Network& inner) {
    return inner.GetPrefixLength() >= outer.GetPrefixLength() &&
           Ipv4Network(inner.GetNetwork(), outer.GetPrefixLength()).Masked() == outer.Masked();
}
bool Contains(const Ipv6Network& outer, const Ipv6Network& inner) {
    return inner.GetPrefixLength() >= outer.GetPrefixLength() &&
           Ipv6Network(inner.GetAddress(), outer.GetPrefixLength()).Masked() == outer.Masked();
}

std::string RouteText(const std::string& network, const std::string& gateway) {
    return "Route to " + network + " via " + gateway;
}

std::vector<RouteRecord> RoutesOf(Store::Transaction& t, const std::string& netstack) {
    return Detail::ListChildren<RouteRecord>(t, netstack);
}

// Throws the message for a missing netstack.
void RequireNetstackExists(Store::Transaction& t, const std::string& netstack) {
    if (!t.Exists(NetstackRecord::kSection, netstack)) {
        throw HostCtlException(Detail::MissingNetstackMessage(netstack));
    }
}

// The interface of the netstack a route to `network` via `gateway` leaves
// by: the first (in number order) whose network holds the gateway, or, for
// a network reached directly, the network itself. A link-local IPv6 gateway
// is reached from the first interface with IPv6 addresses.
template <typename F>
std::string PickInterface(Store::Transaction& t, const std::string& netstack, const typename F::Network& network,
                          const typename F::Address& gateway) {
    std::vector<InterfaceRecord> interfaces = Detail::ListChildren<InterfaceRecord>(t, netstack);
    std::stable_sort(interfaces.begin(), interfaces.end(), [](const auto& a, const auto& b) {
        return static_cast<unsigned>(Detail::InterfaceNumber(a.name)) <
               static_cast<unsigned>(Detail::InterfaceNumber(b.name));
    });
    for (const InterfaceRecord& nic : interfaces) {
        for (const typename F::Network& own : F::NetworksOf(nic)) {
            const bool reached = gateway.IsSet() ? F::IsLinkLocal(gateway) ||
                                                       Contains(own, typename F::Network(gateway, F::kIpv6 ? 128 : 32))
                                                 : Contains(own, network);
            if (reached) return nic.name;
        }
    }
    throw HostCtlException("Gateway " + gateway.GetStringAddress() +
                           " is not reachable from any interface of netstack " + netstack);
}

// Replaces the netstack's default routes of the family by one via
// `gateway` (none for the unspecified address) and records the gateway as
// the configured one.
template <typename F>
void SetDefaultGateway(Store::Transaction& t, const std::string& netstack, const typename F::Address& gateway) {
    Detail::StoredObject<NetstackRecord> stored = Detail::RequireNetstack(t, netstack);
    const std::string defaultText = Text(typename F::Network());
    std::string interfaceName;
    if (gateway.IsSet()) interfaceName = PickInterface<F>(t, netstack, typename F::Network(), gateway);
    for (const RouteRecord& route : RoutesOf(t, netstack)) {
        if (route.network == defaultText) {
            t.Remove(RouteRecord::kSection, Detail::JoinedKey({netstack, route.network, route.gateway}));
        }
    }
    NetstackRecord edited = stored.record;
    edited.*F::kGateway = gateway.IsSet() ? gateway.GetStringAddress() : std::string();
    if (gateway.IsSet()) {
        RouteRecord route;
        route.netstack = netstack;
        route.network = defaultText;
        route.gateway = gateway.GetStringAddress();
        route.interfaceName = interfaceName;
        Detail::Create(t, route);
    }
    Detail::Write(t, stored, edited);
}

template <typename F>
void AddRoute(const char* operation, const std::string& netstack, const typename F::Network& network,
              const typename F::Address& gateway) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    const std::string networkText = Text(network);
    const std::string gatewayText = gateway.GetStringAddress();
    store.Change([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack);
        if (t.Exists(RouteRecord::kSection, Detail::JoinedKey({netstack, networkText, gatewayText}))) {
            throw HostCtlException(RouteText(networkText, gatewayText) + " already exists on netstack " + netstack);
        }
        if (IsDefault(network)) {
            // No interface reaches every address directly.
            if (!gateway.IsSet()) PickInterface<F>(t, netstack, network, gateway);
            // One default route per family: another gateway's stands.
            for (const RouteRecord& route : RoutesOf(t, netstack)) {
                if (route.network == networkText) {
                    throw HostCtlException(RouteText(networkText, route.gateway) + " already exists on netstack " +
                                           netstack);
                }
            }
            SetDefaultGateway<F>(t, netstack, gateway);
            return;
        }
        RouteRecord route;
        route.netstack = netstack;
        route.network = networkText;
        route.gateway = gatewayText;
        route.interfaceName = PickInterface<F>(t, netstack, network.Masked(), gateway);
        Detail::Create(t, route);
    });
}

template <typename F>
void RemoveRoute(const char* operation, const std::string& netstack, const typename F::Network& network,
                 const typename F::Address& gateway) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    const std::string networkText = Text(network);
    const std::string gatewayText = gateway.GetStringAddress();
    store.Change([&](Store::Transaction& t) {
        Detail::StoredObject<NetstackRecord> stored = Detail::RequireNetstack(t, netstack);
        if (!t.Remove(RouteRecord::kSection, Detail::JoinedKey({netstack, networkText, gatewayText}))) {
            throw HostCtlException(RouteText(networkText, gatewayText) + " does not exist on netstack " + netstack);
        }
        // Without its route the configured default gateway goes too.
        if (IsDefault(network)) {
            NetstackRecord edited = stored.record;
            edited.*F::kGateway = std::string();
            Detail::Write(t, stored, edited);
        }
    });
}

// The family's routes, the default route first, then by network.
// A listing in its order: the default route first, then by network; routes
// to one network keep their stored order. Each route's key is worked out
// once and the keys are sorted, not the routes themselves; stored routes
// are often in order already.
template <typename F>
std::vector<typename F::Route> InListingOrder(std::vector<typename F::Route> routes) {
    using Key = decltype(F::SortKey(routes.front().network));
    std::vector<std::pair<Key, std::uint32_t>> order;
    order.reserve(routes.size());
    for (std::size_t i = 0; i < routes.size(); ++i) {
        order.emplace_back(F::SortKey(routes[i].network), static_cast<std::uint32_t>(i));
    }
    if (std::is_sorted(order.begin(), order.end())) return routes;
    // The index makes every pair unique, so the order is stable.
    std::sort(order.begin(), order.end());
    std::vector<typename F::Route> sorted;
    sorted.reserve(routes.size());
    for (const auto& entry : order) sorted.push_back(std::move(routes[entry.second]));
    return sorted;
}

// One number per IPv4 network as the store knows it (host bits cleared):
// its address, then its prefix length.
std::uint64_t SourceKey(const Ipv4Network& network) {
    return std::uint64_t{network.Masked().GetNetwork().ToUint32()} << 8 |
           static_cast<std::uint64_t>(network.GetPrefixLength());
}

// Keeps the source of each listed IPv4 route for GetDefaultGatewaySource.
// Sources are few distinct words, kept once each.
template <typename Route>
void RememberSources(Detail::RouteSources& sources, const std::string& netstack, const std::vector<Route>& routes,
                     std::vector<std::string>& sourceOf) {
    sources.Clear();
    sources.netstack = netstack;
    if constexpr (std::is_same_v<Route, Ipv4Route>) {
        sources.byNetwork.reserve(routes.size());
        for (std::size_t i = 0; i < routes.size(); ++i) {
            auto known = std::find(sources.texts.begin(), sources.texts.end(), sourceOf[i]);
            if (known == sources.texts.end()) known = sources.texts.insert(known, std::move(sourceOf[i]));
            sources.byNetwork.emplace_back(SourceKey(routes[i].network),
                                           static_cast<std::uint32_t>(known - sources.texts.begin()));
        }
        // Stable, so the first stored route to a network comes first.
        std::stable_sort(sources.byNetwork.begin(), sources.byNetwork.end(),
                         [](const auto& a, const auto& b) { return a.first < b.first; });
        sources.complete = true;
    }
}

template <typename F>
std::vector<typename F::Route> ListRoutes(const char* operation, const std::string& netstack,
                                          Detail::RouteSources* sources) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    std::vector<typename F::Route> routes;
    std::vector<std::string> sourceOf;
    store.Read([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack);
        // Decoded as SQLite hands each route over, without a copy of every
        // stored text first.
        t.EachChildText(RouteRecord::kSection, netstack, [&](std::string_view text) {
            RouteRecord record = Detail::Decode<RouteRecord>(text);
            if (record.IsIpv6() != F::kIpv6) return;
            routes.push_back(typename F::Route{typename F::Network(record.network), typename F::Address(record.gateway),
                                               std::move(record.interfaceName)});
            if (sources) sourceOf.push_back(std::move(record.source));
        });
    });
    if (sources) RememberSources(*sources, netstack, routes, sourceOf);
    return InListingOrder<F>(std::move(routes));
}

// The gateway of the netstack's default route of the family; unspecified
// for none.
template <typename F>
typename F::Address CurrentDefaultGateway(const char* operation, const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    const std::string defaultText = Text(typename F::Network());
    typename F::Address gateway;
    store.Read([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack);
        for (const RouteRecord& route : RoutesOf(t, netstack)) {
            if (route.network == defaultText) {
                gateway = typename F::Address(route.gateway);
                return;
            }
        }
    });
    return gateway;
}

template <typename F>
typename F::Address ConfiguredDefaultGateway(const char* operation, const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    std::optional<NetstackRecord> record = Detail::Get<NetstackRecord>(store, netstack);
    if (!record) throw HostCtlException(Detail::MissingNetstackMessage(netstack));
    const std::string& text = (*record).*F::kGateway;
    return text.empty() ? typename F::Address() : typename F::Address(text);
}

// Display words of the neighbor codes: code N is the word at N - 1; 0 and
// codes past a table have none.
constexpr std::array<const char*, 3> kIpv4NeighborTypes = {"Dynamic", "Static", "Local"};
constexpr std::array<const char*, 4> kIpv6NeighborTypes = {"Dynamic", "Static", "Local", "Router"};
constexpr std::array<const char*, 5> kIpv6NeighborStates = {"Incomplete", "Reachable", "Stale", "Delay", "Probe"};

template <std::size_t N>
int CodeOf(const std::array<const char*, N>& words, const std::string& word) {
    for (std::size_t i = 0; i < N; ++i) {
        if (word == words[i]) return static_cast<int>(i + 1);
    }
    return 0;
}

template <std::size_t N>
std::string WordOf(const std::array<const char*, N>& words, int code) {
    if (code < 1 || code > static_cast<int>(N)) return std::string();
    return words[static_cast<std::size_t>(code - 1)];
}

// The netstack's neighbors of one family, on one interface or all.
std::vector<NeighborRecord> Neighbors(const char* operation, const std::string& netstack, bool ipv6,
                                      const std::string& interfaceName) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    std::vector<std::string> texts;
    store.Read([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack);
        texts = t.ListChildrenText(NeighborRecord::kSection, netstack);
    });
    std::vector<NeighborRecord> neighbors;
    for (const std::string& text : texts) {
        NeighborRecord record = Detail::Decode<NeighborRecord>(text);
        if (record.IsIpv6() != ipv6) continue;
        if (!interfaceName.empty() && record.interfaceName != interfaceName) continue;
        neighbors.push_back(std::move(record));
    }
    return neighbors;
}

// Removes the entries for the address on the interface, or on every
// interface for "".
void RemoveNeighbors(const char* operation, const std::string& netstack, const std::string& address,
                     const std::string& interfaceName) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    store.Change([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack);
        if (!interfaceName.empty()) {
            if (!Detail::FitsJoinedKey(interfaceName) ||
                !t.Remove(NeighborRecord::kSection, Detail::JoinedKey({netstack, interfaceName, address}))) {
                throw HostCtlException("No neighbor " + address + " on interface " + interfaceName + " of netstack " +
                                       netstack);
            }
            return;
        }
        bool removed = false;
        for (const NeighborRecord& neighbor : Detail::ListChildren<NeighborRecord>(t, netstack)) {
            if (neighbor.address != address) continue;
            removed = t.Remove(NeighborRecord::kSection,
                               Detail::JoinedKey({netstack, neighbor.interfaceName, neighbor.address})) ||
                      removed;
        }
        if (!removed) throw HostCtlException("No neighbor " + address + " on netstack " + netstack);
    });
}

}  // namespace

RoutingInfoImpl::RoutingInfoImpl(const std::string& netstack)
    : netstack_(netstack), sources_(std::make_shared<Detail::RouteSources>()) {}
RoutingInfoImpl::~RoutingInfoImpl() = default;

void RoutingInfoImpl::SetNetstackInstanceKey(const std::string& netstack) {
    netstack_ = netstack;
    sources_->Clear();
}

void RoutingInfoImpl::AddPalladRoute(const Ipv4Network& network, const Ipv4Address& gateway) {
    sources_->Clear();
    AddRoute<V4>("RoutingInfoImpl::AddPalladRoute", netstack_, network, gateway);
}

void RoutingInfoImpl::RemovePalladRoute(const Ipv4Network& network, const Ipv4Address& gateway) {
    sources_->Clear();
    RemoveRoute<V4>("RoutingInfoImpl::RemovePalladRoute", netstack_, network, gateway);
}

std::vector<Ipv4Route> RoutingInfoImpl::GetCurrentPalladRoutes() {
    return ListRoutes<V4>("RoutingInfoImpl::GetCurrentPalladRoutes", netstack_, sources_.get());
}

Ipv4Address RoutingInfoImpl::GetPalladDefaultGateway() {
    return CurrentDefaultGateway<V4>("RoutingInfoImpl::GetPalladDefaultGateway", netstack_);
}

Ipv4Address RoutingInfoImpl::GetPalladConfigDefaultGateway() {
    return ConfiguredDefaultGateway<V4>("RoutingInfoImpl::GetPalladConfigDefaultGateway", netstack_);
}

void RoutingInfoImpl::SetPalladDefaultGateway(const Ipv4Address& gateway, bool) {
    sources_->Clear();
    Store::HostStore& store = Detail::EnterOperation("RoutingInfoImpl::SetPalladDefaultGateway", netstack_);
    store.Change([&](Store::Transaction& t) { SetDefaultGateway<V4>(t, netstack_, gateway); });
}

std::string RoutingInfoImpl::GetDefaultGatewaySource(const Ipv4Network& network) {
    Store::HostStore& store = Detail::EnterOperation("RoutingInfoImpl::GetDefaultGatewaySource", netstack_);
    // Where no route says otherwise, the route's default source.
    static const std::string kDefaultSource = RouteRecord().source;
    std::string source = kDefaultSource;
    if (sources_->complete && sources_->netstack == netstack_) {
        const std::uint64_t key = SourceKey(network);
        const auto known = std::lower_bound(sources_->byNetwork.begin(), sources_->byNetwork.end(), key,
                                            [](const auto& entry, std::uint64_t k) { return entry.first < k; });
        if (known != sources_->byNetwork.end() && known->first == key) source = sources_->texts[known->second];
        return source;
    }
    const std::string networkText = Text(network);
    store.Read([&](Store::Transaction& t) {
        RequireNetstackExists(t, netstack_);
        for (const RouteRecord& route : RoutesOf(t, netstack_)) {
            if (route.network == networkText) {
                source = route.source;
                return;
            }
        }
    });
    return source;
}

void RoutingInfoImpl::AddIpv6PalladRoute(const Ipv6Network& network, const Ipv6Address& gateway) {
    AddRoute<V6>("RoutingInfoImpl::AddIpv6PalladRoute", netstack_, network, gateway);
}

void RoutingInfoImpl::RemoveIpv6PalladRoute(const Ipv6Network& network, const Ipv6Address& gateway) {
    RemoveRoute<V6>("RoutingInfoImpl::RemoveIpv6PalladRoute", netstack_, network, gateway);
}

std::vector<Ipv6Route> RoutingInfoImpl::GetCurrentIpv6PalladRoutes() {
    return ListRoutes<V6>("RoutingInfoImpl::GetCurrentIpv6PalladRoutes", netstack_, nullptr);
}

Ipv6Address RoutingInfoImpl::GetIpv6PalladDefaultGateway() {
    return CurrentDefaultGateway<V6>("RoutingInfoImpl::GetIpv6PalladDefaultGateway", netstack_);
}

Ipv6Address RoutingInfoImpl::GetIpv6PalladConfigDefaultGateway() {
    return ConfiguredDefaultGateway<V6>("RoutingInfoImpl::GetIpv6PalladConfigDefaultGateway", netstack_);
}

void RoutingInfoImpl::SetIpv6PalladDefaultGateway(const Ipv6Address& gateway) {
    Store::HostStore& store = Detail::EnterOperation("RoutingInfoImpl::SetIpv6PalladDefaultGateway", netstack_);
    store.Change([&](Store::Transaction& t) { SetDefaultGateway<V6>(t, netstack_, gateway); });
}

void RoutingInfoImpl::GetCurrentIpv4PalladNeighbors(std::vector<Ipv4Neighbor>& neighbors,
                                                    const std::string& interfaceName) {
    neighbors.clear();
    for (NeighborRecord& record :
         Neighbors("RoutingInfoImpl::GetCurrentIpv4PalladNeighbors", netstack_, false, interfaceName)) {
        Ipv4Neighbor neighbor;
        neighbor.address = Ipv4Address(record.address);
        neighbor.macAddress = std::move(record.mac);
        neighbor.interfaceName = std::move(record.interfaceName);
        neighbor.expiry = static_cast<std::int32_t>(record.expiry);
        neighbor.type = CodeOf(kIpv4NeighborTypes, record.type);
        neighbors.push_back(std::move(neighbor));
    }
}

void RoutingInfoImpl::GetCurrentIpv6PalladNeighbors(std::vector<Ipv6Neighbor>& neighbors,
                                                    const std::string& interfaceName) {
    neighbors.clear();
    for (NeighborRecord& record :
         Neighbors("RoutingInfoImpl::GetCurrentIpv6PalladNeighbors", netstack_, true, interfaceName)) {
        Ipv6Neighbor neighbor;
        neighbor.address = Ipv6Address(record.address);
        neighbor.macAddress = std::move(record.mac);
        neighbor.interfaceName = std::move(record.interfaceName);
        neighbor.expiry = static_cast<std::uint32_t>(record.expiry);
        neighbor.type = CodeOf(kIpv6NeighborTypes, record.type);
        neighbor.state = CodeOf(kIpv6NeighborStates, record.state ? *record.state : "Reachable");
        neighbors.push_back(std::move(neighbor));
    }
}

std::string RoutingInfoImpl::GetIpv4NeighborType(const Ipv4Neighbor& neighbor) {
    return WordOf(kIpv4NeighborTypes, neighbor.type);
}

std::string RoutingInfoImpl::GetIpv6NeighborType(const Ipv6Neighbor& neighbor) {
    return WordOf(kIpv6NeighborTypes, neighbor.type);
}

std::string RoutingInfoImpl::GetIpv6NeighborState(const Ipv6Neighbor& neighbor) {
    return WordOf(kIpv6NeighborStates, neighbor.state);
}

void RoutingInfoImpl::RemoveIpv4Neighbor(const Ipv4Neighbor& neighbor) {
    RemoveNeighbors("RoutingInfoImpl::RemoveIpv4Neighbor", netstack_, neighbor.address.GetStringAddress(),
                    neighbor.interfaceName);
}

void RoutingInfoImpl::RemoveIpv6Neighbor(const Ipv6Neighbor& neighbor) {
    RemoveNeighbors("RoutingInfoImpl::RemoveIpv6Neighbor", netstack_, neighbor.address.GetStringAddress(),
                    neighbor.interfaceName);
}

}  // namespace Network
}  // namespace PldCtl
