#include "vswitch/VswitchLookup.h"

#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using Message = std::string (*)(const std::string& name);

std::string NoLegacySwitch(const std::string& name) {
    return "Unable to find a legacy virtual switch with the name " + name;
}

std::string NotASwitchName(const std::string& name) {
    return name + " is not a valid name for a virtual switch";
}

std::string NoSwitchToSet(const std::string& name) {
    return "Unable to find a virtual switch with name " + name;
}

// One way of finding a switch: whether it asks the factory, and the
// messages for a name the host does not know and for a switch that cannot
// be read (the factory has only the second).
struct Way {
    bool byId;
    Message unknownName;
    Message notFound;
};

Way WayOf(SwitchLookup how) {
    switch (how) {
        case SwitchLookup::Legacy:
            return {false, NoLegacySwitch, NoLegacySwitch};
        case SwitchLookup::ById:
            return {true, nullptr, HostCtl::Network::UnknownVirtualSwitchMessage};
        case SwitchLookup::Settable:
            return {false, NotASwitchName, NoSwitchToSet};
    }
    return {true, nullptr, HostCtl::Network::UnknownVirtualSwitchMessage};
}

}  // namespace

std::unique_ptr<HostCtl::Network::VirtualSwitch> FindSwitch(SwitchLookup how, const std::string& name,
                                                            CallSpec::Output& output) {
    const Way way = WayOf(how);
    std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch;
    if (way.byId) {
        vswitch = HostCtl::Network::NetworkFactory::GetVirtualSwitchById(name);
    } else if (!PldCtl::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
        // A name the host does not know is not read at all.
        output.SetError(way.unknownName(name));
        return vswitch;
    } else {
        vswitch = PldCtl::Network::VirtualSwitchInfoImpl().GetVirtualSwitchByName(name);
    }
    if (!vswitch) output.SetError(way.notFound(name));
    return vswitch;
}

std::unique_ptr<HostCtl::Network::PortGroup> FindPortGroup(const std::string& name, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::PortGroup> portGroup = HostCtl::Network::NetworkFactory::GetPortGroupByName(name);
    if (!portGroup) output.SetError(HostCtl::Network::UnknownPortGroupMessage(name));
    return portGroup;
}

void ChangeStandardSwitch(const boost::shared_ptr<CallSpec::Output>& output, const std::string& vswitchName,
                          const std::function<void(HostCtl::Network::VirtualSwitch&)>& change) {
    ReportingHostErrors(output, [&] {
        if (std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch =
                FindSwitch(SwitchLookup::ById, vswitchName, *output)) {
            change(*vswitch);
            FinishTrue(output);
        }
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
