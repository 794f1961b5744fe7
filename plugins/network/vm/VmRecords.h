// How the VM commands show a world and the ports it uses.
#pragma once

#include <string>

namespace OrvixCli {
namespace NetworkNamespace {

// A virtual machine's world name carries a five-character prefix that the
// listing leaves out ("orvm:web01" is shown as "web01", "orvm:" as an empty
// name). A name shorter than the prefix is shown unchanged.
std::string VmDisplayName(const std::string& worldName);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
