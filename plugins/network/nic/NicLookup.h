// How the NIC commands find the NIC they name, or every NIC, and what each
// family reports when the host has no NIC of that name.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/CallSpec.h"
#include "hostctl/network/NetworkInfo.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The message a name the host does not know gives; each command family has
// its own.
enum class MissingNic {
    // "There is no pnic with name X": nic get, up, down, set.
    NoPnic,
    // "Pnic with name X not found": offloads, coalescing, diagnostics,
    // negotiate restart.
    PnicNotFound,
    // "NIC with name X not found": pause parameters and rings.
    NicNotFound,
};

// The NIC of that name from `nics`, or null after reporting that there is
// none. Throws HostCtlException as the library does.
std::unique_ptr<HostCtl::Network::Pnic> FindPnic(HostCtl::Network::NetworkInfo& nics, const std::string& name,
                                                 MissingNic how, CallSpec::Output& output);

// Whether the host has an SR-IOV NIC of that name; reports "There is no
// SRIOV Nic with name X" when it has none. Throws HostCtlException as the
// library does.
bool FindSriovNic(PldCtl::Network::NetworkInfoImpl& nics, const std::string& name, CallSpec::Output& output);

// Runs `body` with the NIC named by `parameter`, found through `nics`; the
// library's errors, from the lookup or from `body`, are reported as they are.
template <typename Body>
void OnPnic(HostCtl::Network::NetworkInfo& nics, const boost::shared_ptr<CallSpec::Input>& input,
            const boost::shared_ptr<CallSpec::Output>& output, const std::string& parameter, MissingNic how,
            Body&& body) {
    ReportingHostErrors(output, [&] {
        if (std::unique_ptr<HostCtl::Network::Pnic> pnic = FindPnic(nics, input->GetString(parameter), how, *output)) {
            std::forward<Body>(body)(*pnic);
        }
    });
}

// The NICs a listing covers: the one named by `parameter` when it is given,
// else every NIC of the host in its order. Nothing (after reporting it) when
// the named NIC does not exist. Throws HostCtlException as the library does.
std::optional<std::vector<std::unique_ptr<HostCtl::Network::Pnic>>> SelectPnics(HostCtl::Network::NetworkInfo& nics,
                                                                                const CallSpec::Input& input,
                                                                                const std::string& parameter,
                                                                                MissingNic how,
                                                                                CallSpec::Output& output);

// The first standard switch, in `switches`' order, that has the NIC of
// that name (exactly, case and all) among its uplinks; null after reporting
// "NAME is not a valid NIC connected to any virtual switch." when none has.
HostCtl::Network::Portset* FindUplinkSwitch(const std::vector<std::unique_ptr<HostCtl::Network::Portset>>& switches,
                                            const std::string& nic, CallSpec::Output& output);

// Runs `read` against one NIC of a listing: false when the NIC cannot
// answer (a HostCtlException), so that the row shows its fallback values and
// the listing goes on with the next NIC.
template <typename Read>
bool NicAnswers(Read&& read) {
    try {
        std::forward<Read>(read)();
        return true;
    } catch (const HostCtl::Lib::HostCtlException&) {
        return false;
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
