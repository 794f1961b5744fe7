// Placeholder definitions while the IP interface and netstack operations
// are being written; each fails as a library error. This file goes away
// with them.
#include "hostctl/Lib.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/ip/NetstackInstanceImpl.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/util/Exec.h"

namespace {
[[noreturn]] void Pending() {
    throw HostCtl::Lib::HostCtlException("not available yet");
}
}  // namespace

namespace HostCtl {
namespace Network {
ConnectionPoint::~ConnectionPoint() = default;
DVSwitch::~DVSwitch() = default;
NetstackInstance::~NetstackInstance() = default;
IpConfig::IpConfig() = default;
Ipv4Address IpConfig::GetIpv4Broadcast() const {
    Pending();
}
void IpConfig::SetIpv4Address(const Ipv4Address&) {
    Pending();
}
void IpConfig::SetIpv4Netmask(const Ipv4Address&) {
    Pending();
}
void IpConfig::SetUseDhcp(bool) {
    Pending();
}
void IpConfig::SetIpv4UseNone() {
    Pending();
}
void IpConfig::AddIpv6Network(const Ipv6Network&) {
    Pending();
}
void IpConfig::RemoveIpv6Network(const Ipv6Network&) {
    Pending();
}
std::unique_ptr<DVSwitch> NetworkFactory::GetDVSwitchByName(const std::string&) {
    Pending();
}
}  // namespace Network
}  // namespace HostCtl

namespace PldCtl {
namespace Util {
int PldCtl_Exec(const std::string&, bool, bool, bool) {
    return 1;
}
}  // namespace Util
namespace Network {
using namespace HostCtl::Network;
DVPortImpl::DVPortImpl(const DVPortParam& param) : param_(param) {}
DVPortImpl::~DVPortImpl() = default;
std::uint32_t DVPortImpl::GetConnectionId() const {
    Pending();
}
void DVPortImpl::SetConnectionId(std::uint32_t) {
    Pending();
}
int DVPortImpl::GetType() const {
    Pending();
}
std::string DVPortImpl::GetPortsetName() const {
    Pending();
}
std::string DVPortImpl::GetPortGroupName() const {
    Pending();
}
DVPortParam DVPortImpl::GetDVPortParam() const {
    Pending();
}
OpaqueNetworkParam DVPortImpl::GetOpaqueNetworkParam() const {
    Pending();
}
bool DVPortImpl::IsValid() const {
    Pending();
}

int PortGroupImpl::GetType() const {
    Pending();
}
std::string PortGroupImpl::GetPortsetName() const {
    Pending();
}
std::string PortGroupImpl::GetPortGroupName() const {
    Pending();
}
DVPortParam PortGroupImpl::GetDVPortParam() const {
    Pending();
}
OpaqueNetworkParam PortGroupImpl::GetOpaqueNetworkParam() const {
    Pending();
}
bool PortGroupImpl::IsValid() const {
    Pending();
}
std::unique_ptr<DVSwitch> VirtualSwitchInfoImpl::GetDVSwitchByName(const std::string&) {
    Pending();
}

std::string PldNicTagIdToName(int) {
    Pending();
}
PldNicTagType PldNicTagNameToId(const std::string&) {
    Pending();
}
PalladNicInfoImpl::PalladNicInfoImpl() = default;
PalladNicInfoImpl::~PalladNicInfoImpl() = default;
std::unique_ptr<PldNic> PalladNicInfoImpl::AddPalladNic(ConnectionPoint*, const std::string&, const IpConfig&,
                                                        const MacAddress&, unsigned, std::int64_t, const std::string&) {
    Pending();
}
void PalladNicInfoImpl::RemovePalladNic(ConnectionPoint*, const std::string&) {
    Pending();
}
std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNics() {
    Pending();
}
std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNicsByInstanceKey(const std::string&) {
    Pending();
}
std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNicsByTag(PldNicTagType) {
    Pending();
}
std::unique_ptr<PldNic> PalladNicInfoImpl::GetPalladNicByInterface(const std::string&, bool) {
    Pending();
}
void PalladNicInfoImpl::GetPalladNicNamesByInstanceKey(std::vector<std::string>&, const std::string&) {
    Pending();
}

NetstackInstanceImpl::NetstackInstanceImpl(const std::string&, std::int64_t, const std::string&, bool, int) {}
NetstackInstanceImpl::NetstackInstanceImpl(std::shared_ptr<const Detail::NetstackRecord>) {
    Pending();
}
NetstackInstanceImpl::~NetstackInstanceImpl() = default;
std::vector<std::string> NetstackInstanceImpl::GetCongestionControlAlgorithmList() {
    return {};
}
std::string NetstackInstanceImpl::GetKey() const {
    Pending();
}
std::string NetstackInstanceImpl::GetName() const {
    Pending();
}
int NetstackInstanceImpl::GetState() const {
    Pending();
}
std::int64_t NetstackInstanceImpl::GetMaxConnections() const {
    Pending();
}
std::int64_t NetstackInstanceImpl::GetCurrentMaxConnections() const {
    Pending();
}
std::string NetstackInstanceImpl::GetCongestionControlAlgorithm() const {
    Pending();
}
bool NetstackInstanceImpl::GetIpv6Enabled() const {
    Pending();
}
bool NetstackInstanceImpl::GetCurrentIpv6Enabled() const {
    Pending();
}
void NetstackInstanceImpl::SetName(const std::string&, bool) {
    Pending();
}
void NetstackInstanceImpl::SetMaxConnections(std::int64_t, bool) {
    Pending();
}
void NetstackInstanceImpl::SetCongestionControlAlgorithm(const std::string&, bool) {
    Pending();
}
void NetstackInstanceImpl::SetIpv6Enabled(bool, bool) {
    Pending();
}
void NetstackInstanceImpl::Enable() {
    Pending();
}
void NetstackInstanceImpl::Disable() {
    Pending();
}
const Detail::NetstackRecord& NetstackInstanceImpl::Record() const {
    Pending();
}

int NetworkInfoImpl::GetNetstackInstanceState(const std::string&) {
    Pending();
}
void NetworkInfoImpl::AddNetstackInstance(NetstackInstance*, bool) {
    Pending();
}
void NetworkInfoImpl::RemoveNetstackInstance(const std::string&, bool) {
    Pending();
}
std::unique_ptr<NetstackInstance> NetworkInfoImpl::LookupNetstackInstanceByKey(const std::string&) {
    Pending();
}
std::vector<std::unique_ptr<NetstackInstance>> NetworkInfoImpl::ListNetstackInstances() {
    Pending();
}
}  // namespace Network
}  // namespace PldCtl
