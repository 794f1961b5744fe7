#include "vswitch/VswitchLookup.h"

#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

boost::shared_ptr<CallSpec::InputSpec> NameInput(const std::string& name, const std::string& shortName,
                                                 const std::string& description) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, name, CallSpec::PARAM_STRING, shortName, description, true);
    return declared;
}

}  // namespace

boost::shared_ptr<CallSpec::InputSpec> VswitchNameInput(const std::string& description) {
    return NameInput("vswitch-name", "v", description);
}

boost::shared_ptr<CallSpec::InputSpec> PortGroupNameInput(const std::string& description) {
    return NameInput("portgroup-name", "p", description);
}

boost::shared_ptr<CallSpec::InputSpec> PortGroupPolicySetInput(const std::string& description,
                                                               int blanksBetweenSentences) {
    boost::shared_ptr<CallSpec::InputSpec> declared = PortGroupNameInput(description);
    DeclareParameter(declared, "use-vswitch", CallSpec::PARAM_FLAG, "u",
                     "Reset all values for this policy to use parent virtual switch's settings instead of overriding "
                     "the settings for the port group." +
                         std::string(static_cast<std::size_t>(blanksBetweenSentences), ' ') +
                         "Using this in conjunction with other settings will first reset all of the fields to use the "
                         "virtual switch setting and then apply the other options after the reset.",
                     false);
    return declared;
}

std::unique_ptr<HostCtl::Network::VirtualSwitch> FindLegacySwitch(const std::string& name, CallSpec::Output& output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    std::unique_ptr<HostCtl::Network::VirtualSwitch> vswitch;
    // A name the host does not know is not looked up at all.
    if (PldCtl::Network::PortsetImpl::IsValidVirtualSwitch(name)) vswitch = switchInfo.GetVirtualSwitchByName(name);
    if (!vswitch) output.SetError("Unable to find a legacy virtual switch with the name " + name);
    return vswitch;
}

std::unique_ptr<HostCtl::Network::PortGroup> FindPortGroup(const std::string& name, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::PortGroup> portGroup = HostCtl::Network::NetworkFactory::GetPortGroupByName(name);
    if (!portGroup) output.SetError(HostCtl::Network::UnknownPortGroupMessage(name));
    return portGroup;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
