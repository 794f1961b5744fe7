// A DV port as a connection point and as a port of its switch. Its switch
// is named by UUID, so each question that needs the switch finds it among
// the host's distributed switches (a host has few).
#include "hostctl/network/dvs/DVPortImpl.h"

#include "Operation.h"
#include "hostctl/network/NetworkFactory.h"
#include "network/dvs/DvsLookup.h"

HostCtl::Network::ConnectionPoint::~ConnectionPoint() = default;

namespace PldCtl {
namespace Network {

namespace {

// The DV port a parameter names, from one read; nullopt when the host has
// no such port.
std::optional<Detail::DvPortFound> ReadPort(const HostCtl::Network::DVPortParam& param) {
    std::optional<Detail::DvPortFound> found;
    Store::HostStore::Default().Read([&](Store::Transaction& t) { found = Detail::FindDvPort(t, param); });
    return found;
}

}  // namespace

DVPortImpl::DVPortImpl(const HostCtl::Network::DVPortParam& param) : param_(param) {}

DVPortImpl::DVPortImpl(const HostCtl::Network::DVPortParam& param, std::shared_ptr<const Detail::DvPortRecord> record,
                       std::vector<std::string> clients)
    : param_(param), snapshot_(Snapshot{std::move(record), std::move(clients)}) {}

DVPortImpl::~DVPortImpl() = default;

std::uint32_t DVPortImpl::GetConnectionId() const {
    if (param_.connectionId != 0) return param_.connectionId;
    auto port = ReadPort(param_);
    return port ? port->port.record->connectionId : 0;
}

void DVPortImpl::SetConnectionId(std::uint32_t connectionId) {
    param_.connectionId = connectionId;
}

int DVPortImpl::GetType() const {
    return TYPE_DV_PORT;
}

std::string DVPortImpl::GetPortsetName() const {
    auto port = ReadPort(param_);
    return port ? port->dvswitch : std::string();
}

std::string DVPortImpl::GetPortGroupName() const {
    return std::string();
}

HostCtl::Network::DVPortParam DVPortImpl::GetDVPortParam() const {
    HostCtl::Network::DVPortParam param = param_;
    param.connectionId = GetConnectionId();
    return param;
}

HostCtl::Network::OpaqueNetworkParam DVPortImpl::GetOpaqueNetworkParam() const {
    return {};
}

bool DVPortImpl::IsValid() const {
    try {
        return ReadPort(param_).has_value();
    } catch (const std::exception&) {
        return false;
    }
}

const DVPortImpl::Snapshot& DVPortImpl::Stored() const {
    if (!snapshot_) {
        std::optional<Detail::DvPortFound> found = ReadPort(param_);
        if (!found) {
            throw HostCtl::Lib::HostCtlException("DV port " + param_.portId +
                                                 " does not exist on the DVSwitch with ID " + param_.switchUuid);
        }
        snapshot_ = Snapshot{std::move(found->port.record), std::move(found->port.clients)};
    }
    return *snapshot_;
}

std::string DVPortImpl::GetPortId() const {
    return param_.portId;
}

std::string DVPortImpl::GetDVPortgroupId() const {
    return Stored().record->portgroupId;
}

bool DVPortImpl::IsInUse(std::vector<std::string>& clients) const {
    clients = Stored().clients;
    return !clients.empty();
}

bool DVPortImpl::IsLacpEnabled() const {
    return Stored().record->lacpEnabled;
}

int DVPortImpl::GetLacpMode() const {
    return Detail::LacpModeNumber(Stored().record->lacpMode);
}

}  // namespace Network
}  // namespace PldCtl

namespace HostCtl {
namespace Network {

std::unique_ptr<DVPort> NetworkFactory::GetDVPort(const DVPortParam& param) {
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetDVPort", param.portId);
    std::optional<PldCtl::Detail::DvPortFound> found;
    store.Read([&](PldCtl::Store::Transaction& t) { found = PldCtl::Detail::FindDvPort(t, param); });
    if (!found) return nullptr;
    DVPortParam stored = param;
    stored.connectionId = found->port.record->connectionId;
    return std::make_unique<PldCtl::Network::DVPortImpl>(stored, std::move(found->port.record),
                                                         std::move(found->port.clients));
}

}  // namespace Network
}  // namespace HostCtl
