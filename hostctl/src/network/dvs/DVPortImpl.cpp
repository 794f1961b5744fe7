// A DV port as a connection point. Its switch is named by UUID, so each
// question that needs the switch finds it among the host's distributed
// switches (a host has few).
#include "hostctl/network/dvs/DVPortImpl.h"

#include <optional>

#include "Operation.h"
#include "network/dvs/DvsRecords.h"

HostCtl::Network::ConnectionPoint::~ConnectionPoint() = default;

namespace PldCtl {
namespace Network {

namespace {

// The switch of the port's UUID and the port on it, from one read; nullopt
// when the host has either not.
std::optional<std::pair<Detail::DvSwitchRecord, Detail::DvPortRecord>> FindPort(
    const HostCtl::Network::DVPortParam& param) {
    if (param.switchUuid.empty() || !Detail::FitsJoinedKey(param.portId)) return std::nullopt;
    std::optional<std::pair<Detail::DvSwitchRecord, Detail::DvPortRecord>> found;
    Store::HostStore::Default().Read([&](Store::Transaction& t) {
        for (Detail::DvSwitchRecord& dvswitch : Detail::List<Detail::DvSwitchRecord>(t)) {
            if (dvswitch.uuid != param.switchUuid) continue;
            auto port = Detail::Get<Detail::DvPortRecord>(t, Detail::DvPortKey(dvswitch.name, param.portId));
            if (port) found.emplace(std::move(dvswitch), std::move(*port));
            return;
        }
    });
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
    auto port = FindPort(param_);
    return port ? port->second.connectionId : 0;
}

void DVPortImpl::SetConnectionId(std::uint32_t connectionId) {
    param_.connectionId = connectionId;
}

int DVPortImpl::GetType() const {
    return TYPE_DV_PORT;
}

std::string DVPortImpl::GetPortsetName() const {
    auto port = FindPort(param_);
    return port ? port->first.name : std::string();
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
        return FindPort(param_).has_value();
    } catch (const std::exception&) {
        return false;
    }
}

const DVPortImpl::Snapshot& DVPortImpl::Stored() const {
    if (!snapshot_) throw HostCtl::Lib::HostCtlException("DVPortImpl is not available yet");
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
