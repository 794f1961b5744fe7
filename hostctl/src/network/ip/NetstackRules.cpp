#include "network/ip/NetstackRules.h"

#include <algorithm>
#include <limits>

#include "Refusals.h"
#include "hostctl/Lib.h"
#include "network/NetworkRecords.h"

namespace PldCtl {
namespace Detail {

using HostCtl::Lib::HostCtlException;
using HostCtl::Network::NetstackInstance;

namespace {

constexpr std::size_t kMaxKeyLength = 64;
constexpr std::int64_t kMaxConnectionsLimit = std::numeric_limits<std::int32_t>::max();

template <typename Source>
std::vector<std::string> AlgorithmsOf(Source& source) {
    const SystemRecord system = GetSingleton<SystemRecord>(source);
    return system.congestionControlAlgorithms ? *system.congestionControlAlgorithms
                                              : DefaultCongestionControlAlgorithms();
}

}  // namespace

std::vector<std::string> DefaultCongestionControlAlgorithms() {
    return {"newreno", "cubic"};
}

std::vector<std::string> CongestionControlAlgorithms(Store::HostStore& store) {
    return AlgorithmsOf(store);
}

void CheckNetstackKey(const std::string& key) {
    const bool fits = !key.empty() && key.size() <= kMaxKeyLength && std::all_of(key.begin(), key.end(), [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' || c == '_' ||
               c == '.';
    });
    if (!fits) {
        throw HostCtlException("Invalid netstack instance name " + key +
                               ": use 1 to 64 letters, digits, '-', '_' or '.'");
    }
}

void CheckMaxConnections(std::int64_t maxConnections, const std::string& key) {
    CheckRange("maximum connections", maxConnections, "netstack instance " + key, 1, kMaxConnectionsLimit);
}

void CheckCongestionControlAlgorithm(Store::Transaction& t, const std::string& algorithm) {
    const std::vector<std::string> offered = AlgorithmsOf(t);
    if (std::find(offered.begin(), offered.end(), algorithm) == offered.end()) {
        throw HostCtlException("Unknown congestion control algorithm " + algorithm);
    }
}

void CreateInKernel(NetstackRecord& record) {
    record.state = NetstackInstance::STATE_IN_KERNEL;
    record.currentMaxConnections = record.maxConnections;
    record.currentIpv6Enabled = record.ipv6Enabled;
}

void KeepInConfigurationOnly(NetstackRecord& record) {
    record.state = NetstackInstance::STATE_CONFIGURED;
    record.currentMaxConnections = 0;
    record.currentIpv6Enabled = false;
}

}  // namespace Detail
}  // namespace PldCtl
