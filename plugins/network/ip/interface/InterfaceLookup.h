// How the IP interface commands find the interface they name, or the
// interfaces a listing covers, and what each family reports when the host
// has no interface of that name.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "framework/CallSpec.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

using PldNicList = std::vector<std::unique_ptr<HostCtl::Network::PldNic>>;

// The message a name the host does not know gives; each family has its own.
enum class MissingInterface {
    // "Unable to find a Pallad interface with the name X": addressing.
    PalladInterface,
    // "Unable to find pldnic with name X": tag add and remove.
    Pldnic,
};

// The interface of that name (GetPalladNicByInterface), or null after
// reporting that there is none. Throws HostCtlException as the library does.
std::unique_ptr<HostCtl::Network::PldNic> FindInterface(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                                        const std::string& name, MissingInterface how,
                                                        CallSpec::Output& output);

// The first of all interfaces (GetPalladNics) whose name is exactly `name`,
// or null after reporting "Unable to find an interface with name X":
// interface set and tag get.
std::unique_ptr<HostCtl::Network::PldNic> FindListedInterface(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                                              const std::string& name, CallSpec::Output& output);

// The interfaces a listing covers: the one named by `nameParameter` when its
// value is not empty (nothing, after reporting it, when there is none); else
// those of the netstack named by `netstackParameter` when that is given and
// not empty; else all. `netstackParameter` may be "" for a listing without
// one. Throws HostCtlException as the library does.
std::optional<PldNicList> SelectInterfaces(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                           const CallSpec::Input& input, const std::string& nameParameter,
                                           const std::string& netstackParameter, CallSpec::Output& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
