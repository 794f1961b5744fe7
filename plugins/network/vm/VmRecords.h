// How the VM commands show a world and the ports it uses.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "hostctl/network/port/Port.h"

namespace OrvixCli {
namespace NetworkNamespace {

// A virtual machine's world name carries a five-character prefix that the
// listing leaves out ("orvm:web01" is shown as "web01", "orvm:" as an empty
// name). A name shorter than the prefix is shown unchanged.
std::string VmDisplayName(const std::string& worldName);

// The names of the filters attached to a port (present entries), in the
// entries' order, each name once: a filter seen in both directions is named
// once.
std::vector<std::string> ActiveFilterNames(const std::vector<std::unique_ptr<HostCtl::Network::FilterStats>>& entries);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
