#include "common/ValueCompleters.h"

#include <memory>
#include <set>
#include <string>
#include <vector>

#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/dvs/DVSwitch.h"
#include "hostctl/network/ip/NetstackInstance.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/ip/PldNic.h"
#include "hostctl/network/nic/Pnic.h"
#include "hostctl/system/FirewallRuleset.h"
#include "hostctl/system/SystemInfoImpl.h"
#include "vm/VmLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The names of what a listing call returns, in the host's order.
template <typename Object, typename NameOf>
std::vector<std::string> NamesOf(const std::vector<std::unique_ptr<Object>>& objects, NameOf&& nameOf) {
    std::vector<std::string> names;
    for (const auto& object : objects) {
        if (object) names.push_back(nameOf(*object));
    }
    return names;
}

std::vector<std::string> StandardSwitchNames() {
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    return NamesOf(switches.GetVirtualSwitches(), [](const HostCtl::Network::VirtualSwitch& s) { return s.GetName(); });
}

std::vector<std::string> DistributedSwitchNames() {
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    return NamesOf(switches.GetDVSwitches(), [](const HostCtl::Network::DVSwitch& s) { return s.GetName(); });
}

std::vector<std::string> PortGroupNames() {
    PldCtl::Network::NetworkInfoImpl network;
    return NamesOf(network.GetAllPortGroups(), [](const HostCtl::Network::PortGroup& p) { return p.GetName(); });
}

std::vector<std::string> NicNames() {
    PldCtl::Network::NetworkInfoImpl network;
    return NamesOf(network.GetPnics(), [](const HostCtl::Network::Pnic& n) { return n.GetName(); });
}

std::vector<std::string> SriovNicNames() {
    PldCtl::Network::NetworkInfoImpl network;
    return NamesOf(network.GetSriovNics(), [](const HostCtl::Network::Pnic& n) { return n.GetName(); });
}

std::vector<std::string> InterfaceNames() {
    PldCtl::Network::PalladNicInfoImpl interfaces;
    return NamesOf(interfaces.GetPalladNics(), [](const HostCtl::Network::PldNic& n) { return n.GetName(); });
}

// Netstack options take an instance's key.
std::vector<std::string> NetstackKeys() {
    PldCtl::Network::NetworkInfoImpl network;
    return NamesOf(network.ListNetstackInstances(),
                   [](const HostCtl::Network::NetstackInstance& n) { return n.GetKey(); });
}

std::vector<std::string> RulesetNames() {
    PldCtl::System::SystemInfoImpl system;
    return NamesOf(system.GetFirewallRulesets(), [](HostCtl::System::FirewallRuleset& r) { return r.GetName(); });
}

// The worlds with a port on a switch, as network vm list shows them.
std::vector<std::string> WorldIds() {
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    std::set<std::uint64_t> ids;
    ForEachWorldPort(switches, [&](const std::string&, SwitchKind, const HostCtl::Network::Port& port) {
        ids.insert(port.GetWorldId());
    });
    std::vector<std::string> names;
    for (std::uint64_t id : ids) names.push_back(std::to_string(id));
    return names;
}

}  // namespace

void AttachValueCompleters(AutoCli::NamespaceNode& network) {
    network.SetValueCompleter("vswitch-name", StandardSwitchNames);
    network.SetValueCompleter("portgroup-name", PortGroupNames);
    network.SetValueCompleter("nic-name", NicNames);
    network.SetValueCompleter("uplink-name", NicNames);
    network.SetValueCompleter("hwnic", NicNames);
    network.SetValueCompleter("interface-name", InterfaceNames);
    network.SetValueCompleter("netstack", NetstackKeys);
    network.SetValueCompleter("ruleset-id", RulesetNames);
    for (const char* name : {"vds-name", "vds", "dvs", "dvs-name"}) {
        network.SetValueCompleter(name, DistributedSwitchNames);
    }
    network.SetValueCompleter("world-id", WorldIds);
    if (boost::shared_ptr<AutoCli::NamespaceNode> sriovnic = network.FindChild("sriovnic")) {
        sriovnic->SetValueCompleter("nic-name", SriovNicNames);
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
