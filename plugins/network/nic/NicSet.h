#pragma once

#include "common/CommandClass.h"
#include "hostctl/network/nic/Pnic.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic set
class NicSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSet);

private:
    // Applies the generic options given to `info`; true when any of them
    // changed a setting. Throws HostCtlException for a value the NIC cannot
    // take, before anything is written.
    static bool GetInfoFromParam(const CallSpec::Input& input, HostCtl::Network::PnicInfo& info);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
