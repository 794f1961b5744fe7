// Netstack instances over the host store: snapshots whose setters change the
// configured values (one transaction each); Enable and Disable create and
// destroy the kernel instance, which takes the configured values then.
#include "hostctl/network/ip/NetstackInstanceImpl.h"

#include <algorithm>

#include "network/NetworkRecords.h"
#include "network/ip/IpLookup.h"
#include "network/ip/NetstackRules.h"

HostCtl::Network::NetstackInstance::~NetstackInstance() = default;

namespace PldCtl {
namespace Network {

using Detail::NetstackRecord;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::NetstackInstance;

namespace {

// Applies `edit(t, record)` to the stored instance inside one change and
// returns the record as written.
template <typename Edit>
std::shared_ptr<const NetstackRecord> ChangeNetstack(const char* operation, const std::string& key, Edit edit) {
    Store::HostStore& store = Detail::EnterOperation(operation, key);
    std::shared_ptr<const NetstackRecord> written;
    store.Change([&](Store::Transaction& t) {
        Detail::StoredObject<NetstackRecord> stored = Detail::RequireNetstack(t, key);
        NetstackRecord edited = stored.record;
        edit(t, edited);
        Detail::Write(t, stored, edited);
        written = std::make_shared<const NetstackRecord>(std::move(edited));
    });
    return written;
}

}  // namespace

NetstackInstanceImpl::NetstackInstanceImpl(const std::string& key, std::int64_t maxConnections,
                                           const std::string& algorithm, bool ipv6Enabled, int state) {
    NetstackRecord record;
    record.key = key;
    record.maxConnections = maxConnections;
    record.ccAlgorithm = algorithm;
    record.ipv6Enabled = ipv6Enabled;
    record.state = state;
    record_ = std::make_shared<const NetstackRecord>(std::move(record));
}

NetstackInstanceImpl::NetstackInstanceImpl(std::shared_ptr<const NetstackRecord> record) : record_(std::move(record)) {}
NetstackInstanceImpl::~NetstackInstanceImpl() = default;

std::vector<std::string> NetstackInstanceImpl::GetCongestionControlAlgorithmList() {
    // Commands ask for the list while they declare their parameters, before
    // anything can report an error: a host that cannot be read offers the
    // library's own list.
    try {
        return Detail::CongestionControlAlgorithms(Store::HostStore::Default());
    } catch (const std::exception&) {
        return Detail::DefaultCongestionControlAlgorithms();
    }
}

std::string NetstackInstanceImpl::GetKey() const {
    return record_->key;
}
std::string NetstackInstanceImpl::GetName() const {
    return record_->DisplayName();
}
int NetstackInstanceImpl::GetState() const {
    return record_->state;
}
std::int64_t NetstackInstanceImpl::GetMaxConnections() const {
    return record_->maxConnections;
}
std::int64_t NetstackInstanceImpl::GetCurrentMaxConnections() const {
    return record_->CurrentMaxConnections();
}
std::string NetstackInstanceImpl::GetCongestionControlAlgorithm() const {
    return record_->ccAlgorithm;
}
bool NetstackInstanceImpl::GetIpv6Enabled() const {
    return record_->ipv6Enabled;
}
bool NetstackInstanceImpl::GetCurrentIpv6Enabled() const {
    return record_->CurrentIpv6Enabled();
}

void NetstackInstanceImpl::SetName(const std::string& name, bool) {
    record_ = ChangeNetstack("NetstackInstanceImpl::SetName", record_->key,
                             [&](Store::Transaction&, NetstackRecord& n) { n.name = name; });
}

void NetstackInstanceImpl::SetMaxConnections(std::int64_t maxConnections, bool) {
    Detail::CheckMaxConnections(maxConnections, record_->key);
    record_ = ChangeNetstack("NetstackInstanceImpl::SetMaxConnections", record_->key,
                             [&](Store::Transaction&, NetstackRecord& n) { n.maxConnections = maxConnections; });
}

void NetstackInstanceImpl::SetCongestionControlAlgorithm(const std::string& algorithm, bool) {
    record_ = ChangeNetstack("NetstackInstanceImpl::SetCongestionControlAlgorithm", record_->key,
                             [&](Store::Transaction& t, NetstackRecord& n) {
                                 Detail::CheckCongestionControlAlgorithm(t, algorithm);
                                 n.ccAlgorithm = algorithm;
                             });
}

void NetstackInstanceImpl::SetIpv6Enabled(bool enabled, bool) {
    record_ = ChangeNetstack("NetstackInstanceImpl::SetIpv6Enabled", record_->key,
                             [&](Store::Transaction&, NetstackRecord& n) { n.ipv6Enabled = enabled; });
}

void NetstackInstanceImpl::Enable() {
    record_ = ChangeNetstack("NetstackInstanceImpl::Enable", record_->key, [](Store::Transaction&, NetstackRecord& n) {
        if (!n.InKernel()) Detail::CreateInKernel(n);
    });
}

void NetstackInstanceImpl::Disable() {
    if (record_->key == NetstackInstance::DEFAULT_KEY) {
        Detail::EnterOperation("NetstackInstanceImpl::Disable", record_->key);
        throw HostCtlException("The default netstack instance cannot be disabled");
    }
    record_ = ChangeNetstack("NetstackInstanceImpl::Disable", record_->key,
                             [](Store::Transaction&, NetstackRecord& n) { Detail::KeepInConfigurationOnly(n); });
}

const NetstackRecord& NetstackInstanceImpl::Record() const {
    return *record_;
}

}  // namespace Network
}  // namespace PldCtl
