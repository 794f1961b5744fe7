#include "vswitch/dvs/DvsLookup.h"

#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

std::unique_ptr<HostCtl::Network::DVSwitch> FindDVSwitch(const std::string& name, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::DVSwitch> dvs = HostCtl::Network::NetworkFactory::GetDVSwitchByName(name);
    if (!dvs) output.SetError(HostCtl::Network::DVSwitchNotFoundMessage(name));
    return dvs;
}

std::optional<DVSwitchList> SelectLacpSwitches(const CallSpec::Input& input, CallSpec::Output& output) {
    DVSwitchList switches;
    if (input.IsSet("dvs")) {
        std::unique_ptr<HostCtl::Network::DVSwitch> dvs = FindDVSwitch(input.GetString("dvs"), output);
        if (!dvs) return std::nullopt;
        switches.push_back(std::move(dvs));
        return switches;
    }
    switches = PldCtl::Network::VirtualSwitchInfoImpl().GetDVSwitches();
    if (switches.empty()) {
        output.SetError("LACP is supported on Orvix DVSwitch only, and there is no DVSwitch configured on host.");
        return std::nullopt;
    }
    return switches;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
