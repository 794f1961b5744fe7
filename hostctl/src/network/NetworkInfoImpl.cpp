#include "hostctl/network/NetworkInfoImpl.h"

#include "../Operation.h"

namespace PldCtl {
namespace Network {

using Store::Json;

NetworkInfoImpl::NetworkInfoImpl() = default;
NetworkInfoImpl::~NetworkInfoImpl() = default;

bool NetworkInfoImpl::IsPldIpv6Enabled() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::IsPldIpv6Enabled");
    return store.GetSingleton("system").value("ipv6Enabled", true);
}

void NetworkInfoImpl::SetPldIpv6Enabled(bool enabled) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::SetPldIpv6Enabled");
    store.Change([enabled](Store::Transaction& t) {
        Json system = t.GetSingleton("system");
        system["ipv6Enabled"] = enabled;
        t.PutSingleton("system", system);
    });
}

}  // namespace Network
}  // namespace PldCtl
