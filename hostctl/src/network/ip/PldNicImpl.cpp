#include "network/ip/PldNicImpl.h"

#include <algorithm>

#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/dvs/DvsRecords.h"
#include "network/ip/IpLookup.h"
#include "network/vswitch/VswitchRecords.h"

namespace PldCtl {
namespace Network {

using HostCtl::Network::ConnectionPoint;
using HostCtl::Network::IpConfig;
using HostCtl::Network::PldNicTagType;

namespace {

// An opaque network an interface is connected to; the host only reads it.
class OpaqueNetworkPoint : public ConnectionPoint {
public:
    OpaqueNetworkPoint(HostCtl::Network::OpaqueNetworkParam param, std::string portset)
        : param_(std::move(param)), portset_(std::move(portset)) {}

    int GetType() const override { return TYPE_OPAQUE_NETWORK; }
    std::string GetPortsetName() const override { return portset_; }
    std::string GetPortGroupName() const override { return std::string(); }
    HostCtl::Network::DVPortParam GetDVPortParam() const override { return {}; }
    HostCtl::Network::OpaqueNetworkParam GetOpaqueNetworkParam() const override { return param_; }
    bool IsValid() const override { return true; }

private:
    HostCtl::Network::OpaqueNetworkParam param_;
    std::string portset_;
};

}  // namespace

PldNicImpl::PldNicImpl(std::shared_ptr<const Detail::InterfaceRecord> record) : record_(std::move(record)) {}
PldNicImpl::~PldNicImpl() = default;

std::string PldNicImpl::GetName() const {
    return record_->name;
}

HostCtl::Network::MacAddress PldNicImpl::GetMacAddress() const {
    return HostCtl::Network::MacAddress(record_->mac);
}

int PldNicImpl::GetMtu() const {
    return record_->mtu;
}

void PldNicImpl::SetMtu(std::int64_t mtu) {
    Detail::CheckMtu(mtu, record_->name);
    record_ = Detail::ChangeInterface(
        "PldNicImpl::SetMtu", record_->name,
        [&](Store::Transaction&, Detail::InterfaceRecord& i) { i.mtu = static_cast<int>(mtu); });
}

int PldNicImpl::GetTsoMss() const {
    return record_->tsoMss;
}

bool PldNicImpl::IsEnabled() const {
    return record_->enabled;
}

void PldNicImpl::SetEnabled(const char* operation, bool enabled) {
    record_ = Detail::ChangeInterface(operation, record_->name,
                                      [&](Store::Transaction&, Detail::InterfaceRecord& i) { i.enabled = enabled; });
}

void PldNicImpl::Enable() {
    SetEnabled("PldNicImpl::Enable", true);
}

void PldNicImpl::Disable() {
    SetEnabled("PldNicImpl::Disable", false);
}

std::unique_ptr<ConnectionPoint> PldNicImpl::GetConnectionPoint() const {
    const Detail::InterfaceRecord& nic = *record_;
    Store::HostStore& store = Detail::EnterOperation("PldNicImpl::GetConnectionPoint", nic.name);
    if (!nic.portgroup.empty()) return std::make_unique<PortGroupImpl>(nic.portgroup);
    if (!nic.dvswitch.empty()) {
        HostCtl::Network::DVPortParam param;
        param.portId = nic.dvPortId;
        store.Read([&](Store::Transaction& t) {
            if (auto dvswitch = Detail::Get<Detail::DvSwitchRecord>(t, nic.dvswitch)) param.switchUuid = dvswitch->uuid;
            if (auto port = Detail::Get<Detail::DvPortRecord>(t, Detail::DvPortKey(nic.dvswitch, nic.dvPortId))) {
                param.connectionId = port->connectionId;
            }
        });
        return std::make_unique<DVPortImpl>(param);
    }
    if (!nic.opaqueNetworkId.empty()) {
        return std::make_unique<OpaqueNetworkPoint>(
            HostCtl::Network::OpaqueNetworkParam{nic.opaqueNetworkId, nic.opaqueNetworkType, nic.externalId},
            nic.opaqueSwitch);
    }
    return nullptr;
}

std::int64_t PldNicImpl::GetPortId() const {
    return record_->portId;
}

std::string PldNicImpl::GetNetstackInstance() const {
    return record_->netstack;
}

IpConfig PldNicImpl::GetIpConfig() const {
    return Detail::IpConfigAccess::FromRecord(*record_, false);
}

IpConfig PldNicImpl::GetDnsConfig() const {
    return Detail::IpConfigAccess::FromRecord(*record_, true);
}

void PldNicImpl::SetIpConfig(const IpConfig& config) {
    record_ = Detail::ChangeInterface(
        "PldNicImpl::SetIpConfig", record_->name,
        [&](Store::Transaction&, Detail::InterfaceRecord& i) { Detail::IpConfigAccess::ToRecord(config, i); });
}

std::vector<PldNicTagType> PldNicImpl::GetTags() const {
    std::vector<PldNicTagType> tags;
    for (const std::string& name : record_->tags) tags.push_back(PldNicTagNameToId(name));
    return tags;
}

void PldNicImpl::AddTag(PldNicTagType tag, bool) {
    const std::string name = PldNicTagIdToName(tag);
    if (name.empty()) {
        throw HostCtl::Lib::HostCtlException("Invalid interface tag " + std::to_string(static_cast<int>(tag)));
    }
    record_ = Detail::ChangeInterface("PldNicImpl::AddTag", record_->name,
                                      [&](Store::Transaction&, Detail::InterfaceRecord& i) {
                                          if (std::find(i.tags.begin(), i.tags.end(), name) == i.tags.end()) {
                                              i.tags.push_back(name);
                                          }
                                      });
}

void PldNicImpl::RemoveTag(PldNicTagType tag) {
    const std::string name = PldNicTagIdToName(tag);
    record_ = Detail::ChangeInterface("PldNicImpl::RemoveTag", record_->name,
                                      [&](Store::Transaction&, Detail::InterfaceRecord& i) {
                                          i.tags.erase(std::remove(i.tags.begin(), i.tags.end(), name), i.tags.end());
                                      });
}

void PldNicImpl::Remove() {
    const std::string name = record_->name;
    Store::HostStore& store = Detail::EnterOperation("PldNicImpl::Remove", name);
    store.Change([&](Store::Transaction& t) { Detail::RemoveInterface(t, Detail::RequireInterface(t, name).record); });
}

}  // namespace Network

namespace Detail {

void RemoveInterface(Store::Transaction& t, const InterfaceRecord& record) {
    // Only the interface's own port goes: a port id that another client took
    // meanwhile (a hand-edited host) is left alone.
    if (record.portId != 0) {
        const std::string portKey = std::to_string(record.portId);
        std::optional<PortRecord> port = Get<PortRecord>(t, portKey);
        if (port && port->client == record.name) t.Remove(PortRecord::kSection, portKey);
    }
    // Routes out of the interface and the neighbors seen on it go with it.
    for (const RouteRecord& route : ListChildren<RouteRecord>(t, record.netstack)) {
        if (route.interfaceName == record.name) {
            t.Remove(RouteRecord::kSection, JoinedKey({route.netstack, route.network, route.gateway}));
        }
    }
    for (const NeighborRecord& neighbor : ListChildren<NeighborRecord>(t, record.netstack)) {
        if (neighbor.interfaceName == record.name) {
            t.Remove(NeighborRecord::kSection,
                     JoinedKey({neighbor.netstack, neighbor.interfaceName, neighbor.address}));
        }
    }
    t.Remove(InterfaceRecord::kSection, record.name);
}

}  // namespace Detail
}  // namespace PldCtl
