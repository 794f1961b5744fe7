// Finding the host's ports: one by id, or all of one switch, each with the
// port group of its DV port when it is on a distributed switch.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/network/port/PortImpl.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

// The port of that id whose switch the host has, or null.
std::unique_ptr<Network::PortImpl> FindPort(Store::Transaction& t, std::int64_t id);

// The ports of the switch `portset`, by ascending id; `distributed` says
// whether their DV ports are to be joined.
std::vector<std::unique_ptr<HostCtl::Network::Port>> ListPorts(Store::Transaction& t, const std::string& portset,
                                                               bool distributed);

}  // namespace Detail
}  // namespace PldCtl
