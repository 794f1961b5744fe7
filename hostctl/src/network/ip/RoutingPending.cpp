// Placeholder definitions while the routing, DNS, neighbor, connection and
// IPsec operations are being written; each fails as a library error. This
// file goes away with them.
#include "hostctl/Lib.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/ip/DnsConfigImpl.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"
#include "hostctl/resource/ResourceInfoImpl.h"
#include "hostctl/util/StringUtil.h"

namespace {
[[noreturn]] void Pending() {
    throw HostCtl::Lib::HostCtlException("not available yet");
}
}  // namespace

namespace PldCtl {
namespace Util {
void StringTokenize(const std::string&, std::vector<std::string>&, const std::string&) { Pending(); }
}  // namespace Util
namespace Resource {
ResourceInfoImpl::ResourceInfoImpl() = default;
ResourceInfoImpl::~ResourceInfoImpl() = default;
std::string ResourceInfoImpl::GetWorldName(unsigned long long) { Pending(); }
}  // namespace Resource
namespace Network {
using namespace HostCtl::Network;
const Ipv4Network RoutingInfoImpl::DEFAULT_IPV4_ROUTE;
const Ipv6Network RoutingInfoImpl::DEFAULT_IPV6_ROUTE;
RoutingInfoImpl::RoutingInfoImpl(const std::string& netstack) : netstack_(netstack) {}
RoutingInfoImpl::~RoutingInfoImpl() = default;
void RoutingInfoImpl::SetNetstackInstanceKey(const std::string& netstack) { netstack_ = netstack; }
void RoutingInfoImpl::AddPalladRoute(const Ipv4Network&, const Ipv4Address&) { Pending(); }
void RoutingInfoImpl::RemovePalladRoute(const Ipv4Network&, const Ipv4Address&) { Pending(); }
std::vector<Ipv4Route> RoutingInfoImpl::GetCurrentPalladRoutes() { Pending(); }
Ipv4Address RoutingInfoImpl::GetPalladDefaultGateway() { Pending(); }
Ipv4Address RoutingInfoImpl::GetPalladConfigDefaultGateway() { Pending(); }
void RoutingInfoImpl::SetPalladDefaultGateway(const Ipv4Address&, bool) { Pending(); }
std::string RoutingInfoImpl::GetDefaultGatewaySource(const Ipv4Network&) { Pending(); }
void RoutingInfoImpl::AddIpv6PalladRoute(const Ipv6Network&, const Ipv6Address&) { Pending(); }
void RoutingInfoImpl::RemoveIpv6PalladRoute(const Ipv6Network&, const Ipv6Address&) { Pending(); }
std::vector<Ipv6Route> RoutingInfoImpl::GetCurrentIpv6PalladRoutes() { Pending(); }
Ipv6Address RoutingInfoImpl::GetIpv6PalladDefaultGateway() { Pending(); }
Ipv6Address RoutingInfoImpl::GetIpv6PalladConfigDefaultGateway() { Pending(); }
void RoutingInfoImpl::SetIpv6PalladDefaultGateway(const Ipv6Address&) { Pending(); }
void RoutingInfoImpl::GetCurrentIpv4PalladNeighbors(std::vector<Ipv4Neighbor>&, const std::string&) { Pending(); }
void RoutingInfoImpl::GetCurrentIpv6PalladNeighbors(std::vector<Ipv6Neighbor>&, const std::string&) { Pending(); }
std::string RoutingInfoImpl::GetIpv4NeighborType(const Ipv4Neighbor&) { return ""; }
std::string RoutingInfoImpl::GetIpv6NeighborType(const Ipv6Neighbor&) { return ""; }
std::string RoutingInfoImpl::GetIpv6NeighborState(const Ipv6Neighbor&) { return ""; }
void RoutingInfoImpl::RemoveIpv4Neighbor(const Ipv4Neighbor&) { Pending(); }
void RoutingInfoImpl::RemoveIpv6Neighbor(const Ipv6Neighbor&) { Pending(); }

DnsConfigImpl::DnsConfigImpl(const std::string& netstack) : netstack_(netstack) {}
DnsConfigImpl::~DnsConfigImpl() = default;
void DnsConfigImpl::AddNameServer(const IpAddress&) { Pending(); }
void DnsConfigImpl::RemoveNameServer(const IpAddress&) { Pending(); }
void DnsConfigImpl::RemoveNameServers() { Pending(); }
std::vector<std::string> DnsConfigImpl::GetNameServers() { Pending(); }
void DnsConfigImpl::AddSearchDomain(const std::string&) { Pending(); }
void DnsConfigImpl::RemoveSearchDomain(const std::string&) { Pending(); }
std::string DnsConfigImpl::GetSearchDomainsString() { Pending(); }
void DnsConfigImpl::SaveConfig() { Pending(); }

void NetworkInfoImpl::GetCurrentTcpPalladConnections(std::vector<TcpIpConnection>&, const std::string&) { Pending(); }
void NetworkInfoImpl::GetCurrentUdpPalladConnections(std::vector<TcpIpConnection>&, const std::string&) { Pending(); }
void NetworkInfoImpl::GetCurrentIpPalladConnections(std::vector<TcpIpConnection>&, const std::string&) { Pending(); }

const std::vector<std::string> IpSecConfigImpl::SA_STATE;
const std::vector<std::string> IpSecConfigImpl::SA_MODE;
const std::vector<std::string> IpSecConfigImpl::SA_ENCPT_ALG;
const std::vector<std::string> IpSecConfigImpl::SA_AUTH_ALG;
const std::vector<std::string> IpSecConfigImpl::SP_UL_PROTO_TYPE;
const std::vector<std::string> IpSecConfigImpl::SP_DIRECTION;
const std::vector<std::string> IpSecConfigImpl::SP_ACTION;
int IpSecConfigImpl::StringToIpSecMode(const std::string&) { Pending(); }
int IpSecConfigImpl::StringToIpSecEncyptAlgo(const std::string&) { Pending(); }
int IpSecConfigImpl::StringToIpSecAuthAlgo(const std::string&) { Pending(); }
int IpSecConfigImpl::StringToIpSecULProtoType(const std::string&) { Pending(); }
int IpSecConfigImpl::StringToIpSecDirection(const std::string&) { Pending(); }
int IpSecConfigImpl::StringToIpSecAction(const std::string&) { Pending(); }
IpSecConfigImpl::IpSecConfigImpl() = default;
IpSecConfigImpl::~IpSecConfigImpl() = default;
void IpSecConfigImpl::AddSADConfig(const IpSecSadParam&) { Pending(); }
void IpSecConfigImpl::RemoveSADConfig(const std::string&) { Pending(); }
void IpSecConfigImpl::RemoveAutoSADConfig(const IpSecSadParam&) { Pending(); }
void IpSecConfigImpl::FlushSADConfig() { Pending(); }
void IpSecConfigImpl::GetSADConfigList(std::vector<IpSecSadParam>&) { Pending(); }
void IpSecConfigImpl::AddSPDConfig(const IpSecSpdParam&) { Pending(); }
void IpSecConfigImpl::RemoveSPDConfig(const std::string&) { Pending(); }
void IpSecConfigImpl::FlushSPDConfig() { Pending(); }
void IpSecConfigImpl::GetSPDConfigList(std::vector<IpSecSpdParam>&) { Pending(); }
void IpSecConfigImpl::CheckIKEConfig(const std::string&) { Pending(); }
void IpSecConfigImpl::CopyIKEConfig(const std::string&) { Pending(); }
void IpSecConfigImpl::RestartIKEDaemons() { Pending(); }
}  // namespace Network
}  // namespace PldCtl
