// Finding distributed switches and their DV ports in the host store.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "hostctl/network/ConnectionPoint.h"
#include "hoststore/HostStore.h"
#include "network/dvs/DvsRecords.h"

namespace PldCtl {
namespace Detail {

// A DV port with the clients of the host's ports on it.
struct DvPortState {
    std::shared_ptr<const DvPortRecord> record;
    std::vector<std::string> clients;
};

// The DV port a parameter names: its switch (by UUID) and the port with its
// clients; nullopt when the host has either not.
struct DvPortFound {
    std::string dvswitch;
    DvPortState port;
};
std::optional<DvPortFound> FindDvPort(Store::Transaction& t, const HostCtl::Network::DVPortParam& param);

// The DV ports of the switches of one listing, read for all of them in one
// transaction when the first switch asks for its own: listing the DV ports
// of many switches costs one read, not one per switch.
class DvPortListing {
public:
    explicit DvPortListing(std::vector<std::string> switches) : switches_(std::move(switches)) {}

    // The DV ports of `dvswitch`, in the host's order.
    const std::vector<DvPortState>& PortsOf(Store::HostStore& store, const std::string& dvswitch);

private:
    void Load(Store::Transaction& t);
    std::vector<std::string> switches_;
    std::optional<std::unordered_map<std::string, std::vector<DvPortState>>> ports_;
};

}  // namespace Detail
}  // namespace PldCtl
