#include "vswitch/StandardSwitch.h"

#include <memory>

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

std::string UnknownSwitchMessage(const std::string& vswitchName) {
    return HostCtl::Network::UnknownVirtualSwitchMessage(vswitchName);
}

void ChangeStandardSwitch(const boost::shared_ptr<CallSpec::Output>& output, const std::string& vswitchName,
                          const std::function<void(HostCtl::Network::VirtualSwitch&)>& change) {
    ReportingHostErrors(output, [&] {
        std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch =
            HostCtl::Network::NetworkFactory::GetVirtualSwitchById(vswitchName);
        if (!vswitch) {
            output->SetError(UnknownSwitchMessage(vswitchName));
            return;
        }
        change(*vswitch);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
