// The rules netstack instances keep, shared by the instances and by the
// network-info object that adds and removes them.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hoststore/HostStore.h"
#include "network/ip/IpRecords.h"

namespace PldCtl {
namespace Detail {

// The algorithms the library offers when the host names none.
std::vector<std::string> DefaultCongestionControlAlgorithms();
// The host's algorithms (system.congestionControlAlgorithms), in its order.
std::vector<std::string> CongestionControlAlgorithms(Store::HostStore& store);

// Each throws HostCtlException with the message for a value the host
// refuses.
void CheckNetstackKey(const std::string& key);
void CheckMaxConnections(std::int64_t maxConnections, const std::string& key);
void CheckCongestionControlAlgorithm(Store::Transaction& t, const std::string& algorithm);

// The instance as the kernel has it once created: its configured values in
// force. And as it is when recorded in the configuration only.
void CreateInKernel(NetstackRecord& record);
void KeepInConfigurationOnly(NetstackRecord& record);

}  // namespace Detail
}  // namespace PldCtl
