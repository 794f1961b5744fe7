#include "vm/VmRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const std::string::size_type kWorldPrefixLength = 5;

}  // namespace

std::string VmDisplayName(const std::string& worldName) {
    if (worldName.size() < kWorldPrefixLength) return worldName;
    return worldName.substr(kWorldPrefixLength);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
