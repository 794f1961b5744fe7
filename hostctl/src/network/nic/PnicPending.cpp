// Placeholder definitions while the NIC operations are being written; each
// fails as a library error. This file goes away with them.
#include "hostctl/Lib.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace {
[[noreturn]] void Pending() {
    throw HostCtl::Lib::HostCtlException("not available yet");
}
}  // namespace

namespace HostCtl {
namespace Network {
PciDevice::~PciDevice() = default;
NetworkInfo::~NetworkInfo() = default;
std::unique_ptr<NetworkInfo> NetworkFactory::GetNetworkInfo() {
    return std::make_unique<PldCtl::Network::NetworkInfoImpl>();
}
}  // namespace Network
}  // namespace HostCtl

namespace PldCtl {
namespace Network {
using namespace HostCtl::Network;
PnicImpl::PnicImpl(std::shared_ptr<const Detail::NicRecord>) {
    Pending();
}
void PnicImpl::GetPnicStats(PnicStats&) {
    Pending();
}
std::unique_ptr<PciDevice> PnicImpl::GetPciDevice() const {
    Pending();
}
int PnicImpl::GetDuplex() const {
    Pending();
}
bool PnicImpl::IsLinkUp() const {
    Pending();
}
bool PnicImpl::IsLinkStatusUp() const {
    Pending();
}
bool PnicImpl::IsAdminUp() const {
    Pending();
}
std::uint32_t PnicImpl::GetLinkSpeed() const {
    Pending();
}
void PnicImpl::SetLinkSpeedDuplex(std::int64_t, int) {
    Pending();
}
std::string PnicImpl::GetDriverName() const {
    Pending();
}
MacAddress PnicImpl::GetMacAddress() const {
    Pending();
}
void PnicImpl::SetAdminUp(bool) {
    Pending();
}
std::uint32_t PnicImpl::GetMtu() const {
    Pending();
}
void PnicImpl::GetPnicInfo(PnicInfo&) {
    Pending();
}
void PnicImpl::GetPauseParams(PauseParams&) {
    Pending();
}
void PnicImpl::GetCoalesceParams(CoalesceParams&) {
    Pending();
}
void PnicImpl::GetRingParams(RingParams&, RingParams&) {
    Pending();
}
void PnicImpl::GetOffloadSettings(OffloadSettings&) {
    Pending();
}
void PnicImpl::GetSoftwareSimulation(SoftwareSimulation&) {
    Pending();
}
void PnicImpl::GetDriverInfo(DriverInfo&) {
    Pending();
}
void PnicImpl::SetPnicInfo(const PnicInfo&) {
    Pending();
}
void PnicImpl::SetPauseParams(const PauseParams&) {
    Pending();
}
void PnicImpl::SetCoalesceParams(const CoalesceParams&) {
    Pending();
}
void PnicImpl::SetRingParams(const RingParams&) {
    Pending();
}
void PnicImpl::SetOffloadSettings(const OffloadSettings&) {
    Pending();
}
void PnicImpl::SetSoftwareSimulation(const SoftwareSimulation&) {
    Pending();
}
void PnicImpl::GetRegisters(std::vector<std::uint32_t>&) {
    Pending();
}
void PnicImpl::GetEeprom(std::vector<std::uint8_t>&, std::int64_t, std::int64_t) {
    Pending();
}
void PnicImpl::SetEepromValue(std::int64_t, std::int64_t, std::int64_t) {
    Pending();
}
void PnicImpl::SetEepromFromFile(std::int64_t, const std::string&) {
    Pending();
}
void PnicImpl::RestartNegotiation() {
    Pending();
}
void PnicImpl::RunSelfTest(SelfTestResult&, bool) {
    Pending();
}

std::unique_ptr<Pnic> NetworkInfoImpl::GetPnicByName(const std::string&) {
    Pending();
}
std::vector<std::unique_ptr<Pnic>> NetworkInfoImpl::GetSriovNics() {
    Pending();
}
std::unique_ptr<Pnic> NetworkInfoImpl::GetSriovNicByName(const std::string&) {
    Pending();
}
std::vector<std::unique_ptr<SriovNicVFInfo>> NetworkInfoImpl::GetSriovNicVFInfo(const std::string&) {
    Pending();
}
void NetworkInfoImpl::GetSriovNicVFStats(SriovNicVFStats&, const std::string&, std::int64_t) {
    Pending();
}

std::vector<std::unique_ptr<VlanStats>> PortsetImpl::GetUplinkVlanStats(const std::string&) const {
    Pending();
}
void PortsetImpl::SetUplinkVlanStatsEnabled(const std::string&, bool) {
    Pending();
}
std::vector<std::unique_ptr<Portset>> VirtualSwitchInfoImpl::GetAllSwitches() {
    Pending();
}
}  // namespace Network
}  // namespace PldCtl
