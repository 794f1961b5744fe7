#include "vm/VmRecords.h"

#include <algorithm>

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const std::string::size_type kWorldPrefixLength = 5;

}  // namespace

std::string VmDisplayName(const std::string& worldName) {
    if (worldName.size() < kWorldPrefixLength) return worldName;
    return worldName.substr(kWorldPrefixLength);
}

std::vector<std::string> ActiveFilterNames(const std::vector<std::unique_ptr<HostCtl::Network::FilterStats>>& entries) {
    std::vector<std::string> names;
    for (const auto& entry : entries) {
        // A port has a handful of filters: a linear search keeps their order
        // without a second container.
        if (entry->present && std::find(names.begin(), names.end(), entry->name) == names.end()) {
            names.push_back(entry->name);
        }
    }
    return names;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
