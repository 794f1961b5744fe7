// The command tree the plug-in builds: every namespace with its description,
// every leaf at its place with its class, children in order of attachment.
#include <cxxabi.h>

#include <algorithm>
#include <cstdlib>
#include <map>
#include <memory>
#include <set>
#include <typeinfo>

#include <gtest/gtest.h>

#include "framework/AutoCli.h"

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<AutoCli::Namespace> parent);

namespace {

// Each namespace: its path, its description, and its children in order, a
// namespace as "word/" and a leaf as "word:Class".
struct ExpectedNamespace {
    const char* path;
    const char* description;
    std::vector<std::string> children;
};

const std::vector<ExpectedNamespace> kTree = {
    {"network",
     "Operations that pertain to the maintenance of networking on an Tovrin host. This includes a wide variety of "
     "commands to manipulate virtual networking components (vswitch, portgroup, etc) as well as local host IP, DNS and "
     "general host networking settings.",
     {"ip/", "nic/", "sriovnic/", "vswitch/", "firewall/", "port/", "vm/"}},
    {"network ip",
     "Operations that can be performed on pldnics",
     {"get:IpGet", "set:IpSet", "neighbor/", "connection/", "dns/", "route/", "ipsec/", "interface/", "netstack/"}},
    {"network ip neighbor",
     "Operations that can be performed on arp tables",
     {"list:IpNeighborList", "remove:IpNeighborRemove"}},
    {"network ip connection", "List active tcpip connections", {"list:IpConnectionList"}},
    {"network ip dns", "Operations pertaining to Domain Name Server configuration.", {"server/", "search/"}},
    {"network ip dns server",
     "Operations pertaining to DNS server configuration.",
     {"list:IpDNSServerList", "add:IpDNSServerAdd", "remove:IpDNSServerRemove"}},
    {"network ip dns search",
     "Operations pertaining to DNS search domain configuration.",
     {"add:IpDNSSearchAdd", "remove:IpDNSSearchRemove", "list:IpDNSSearchList"}},
    {"network ip route", "Operations pertaining to route configuration", {"ipv4/", "ipv6/"}},
    {"network ip route ipv4",
     "IPv4 route operations",
     {"add:IpRouteIpv4Add", "remove:IpRouteIpv4Remove", "list:IpRouteIpv4List"}},
    {"network ip route ipv6",
     "IPv6 route operations",
     {"add:IpRouteIpv6Add", "remove:IpRouteIpv6Remove", "list:IpRouteIpv6List"}},
    {"network ip ipsec", "Operations on Internet Protocol Security", {"set:IpIpsecSet", "sa/", "sp/"}},
    {"network ip ipsec sa",
     "Operations pertaining to Security Association",
     {"add:IpIpsecSAAdd", "remove:IpIpsecSARemove", "list:IpIpsecSAList"}},
    {"network ip ipsec sp",
     "Operations pertaining to Security Policy",
     {"add:IpIpsecSPAdd", "remove:IpIpsecSPRemove", "list:IpIpsecSPList"}},
    {"network ip interface",
     "Operations having to do with the creation, management and deletion of Pallad network interfaces (pldnic).",
     {"add:IpInterfaceAdd", "remove:IpInterfaceRemove", "list:IpInterfaceList", "set:IpInterfaceSet", "ipv4/", "ipv6/",
      "tag/"}},
    {"network ip interface ipv4",
     "Commands to get and set IPv4 settings for pldnic.",
     {"get:IpInterfaceIpv4Get", "set:IpInterfaceIpv4Set"}},
    {"network ip interface ipv6",
     "Commands to get and set IPv6 settings for pldnic.",
     {"set:IpInterfaceIpv6Set", "get:IpInterfaceIpv6Get", "address/"}},
    {"network ip interface ipv6 address",
     "Commands to list and update IPv6 addresses assigned to the system.",
     {"list:IpInterfaceIpv6AddressList", "add:IpInterfaceIpv6AddressAdd", "remove:IpInterfaceIpv6AddressRemove"}},
    {"network ip interface tag",
     "Commands to add and remove tags on pldnics.",
     {"add:IpInterfaceTagAdd", "remove:IpInterfaceTagRemove", "get:IpInterfaceTagGet"}},
    {"network ip netstack",
     "Operations having to do with the creation, management and deletion of Pallad Netstack Instances.",
     {"list:IpNetstackInstanceList", "add:IpNetstackInstanceAdd", "remove:IpNetstackInstanceRemove",
      "get:IpNetstackInstanceGet", "set:IpNetstackInstanceSet"}},
    {"network nic",
     "Operations having to do with the configuration of Network Interface Card and getting and updating the NIC "
     "settings.",
     {"list:NicList", "up:NicUp", "get:NicGet", "set:NicSet", "down:NicDown", "stats/", "vlan/", "coalesce/", "cso/",
      "tso/", "sg/", "pauseParams/", "register/", "eeprom/", "negotiate/", "selftest/", "software/", "ring/"}},
    {"network nic stats", "Get packet statistics for a NIC", {"get:NicStatsGet"}},
    {"network nic vlan", "Get VLAN information for a NIC", {"stats/"}},
    {"network nic vlan stats",
     "Commands to access VLAN statistics for a NIC",
     {"get:NicVlanStatsGet", "set:NicVlanStatsSet"}},
    {"network nic coalesce",
     "Commands to access coalesce paramaters for a NIC",
     {"get:NicCoalesceGet", "set:NicCoalesceSet"}},
    {"network nic cso", "Commands to access checksum offload settings for a NIC", {"get:NicCsoGet", "set:NicCsoSet"}},
    {"network nic tso",
     "Commands to access TCP segmentation offload settings for a NIC",
     {"get:NicTsoGet", "set:NicTsoSet"}},
    {"network nic sg", "Commands to access scatter-gather settings for a NIC", {"get:NicSgGet", "set:NicSgSet"}},
    {"network nic pauseParams",
     "Commands to access pause parameters for a NIC",
     {"list:NicPauseParamsList", "set:NicPauseParamsSet"}},
    {"network nic register", "Commands to access registers for a NIC", {"dump:NicRegisterDump"}},
    {"network nic eeprom", "Commands to access EEPROM for a NIC", {"dump:NicEepromDump", "change:NicEepromChange"}},
    {"network nic negotiate", "Commands to access negotiation feature on a NIC", {"restart:NicNegotiationRestart"}},
    {"network nic selftest", "Commands to access self test feature on a NIC", {"run:NicSelfTestRun"}},
    {"network nic software",
     "Commands to access NIC feature software simulation settings",
     {"list:NicSoftwareList", "set:NicSoftwareSet"}},
    {"network nic ring", "Commands to access NIC RX/TX ring buffer parameters", {"preset/", "current/"}},
    {"network nic ring preset", "Commands to access preset NIC RX/TX ring buffer parameters", {"get:NicRingPresetGet"}},
    {"network nic ring current",
     "Commands to access current NIC RX/TX ring buffer parameters",
     {"get:NicRingCurrentGet", "set:NicRingCurrentSet"}},
    {"network sriovnic",
     "Operations having to do with the configuration of SRIOV enabled Network Interface Card and getting and updating "
     "the NIC settings.",
     {"list:SriovNicList", "vf/"}},
    {"network sriovnic vf", "Operations related to VFs of a SRIOV capable pNIC", {"list:VfList", "stats:VfStats"}},
    {"network vswitch", "Commands to list and manipulate Virtual Switches on an Tovrin host.", {"standard/", "dvs/"}},
    {"network vswitch standard",
     "Commands to list and manipulate Legacy Virtual Switches on an Tovrin host.",
     {"add:VirtualSwitchStandardAdd", "set:VirtualSwitchStandardSet", "list:VirtualSwitchStandardList",
      "remove:VirtualSwitchStandardRemove", "uplink/", "policy/", "portgroup/"}},
    {"network vswitch standard uplink",
     "Commands to add and remove uplink on given virtual switch.",
     {"add:VirtualSwitchStandardUplinkAdd", "remove:VirtualSwitchStandardUplinkRemove"}},
    {"network vswitch standard policy",
     "Commands to manipulate network policy settings governing the given virtual switch.",
     {"shaping/", "security/", "failover/"}},
    {"network vswitch standard policy shaping",
     "Commands to manipulate shaping policy setting for the given virtual switch.",
     {"get:VirtualSwitchStandardPolicyShapingGet", "set:VirtualSwitchStandardPolicyShapingSet"}},
    {"network vswitch standard policy security",
     "Commands to manipulate security policy setting for the given virtual switch.",
     {"get:VirtualSwitchStandardPolicySecurityGet", "set:VirtualSwitchStandardPolicySecuritySet"}},
    {"network vswitch standard policy failover",
     "Commands to manipulate failover policy setting for the given virtual switch.",
     {"get:VirtualSwitchStandardPolicyFailoverGet", "set:VirtualSwitchStandardPolicyFailoverSet"}},
    {"network vswitch standard portgroup",
     "Commands to list and manipulate Port Groups on an Tovrin host.",
     {"list:VirtualSwitchPortGroupList", "add:VirtualSwitchPortGroupAdd", "remove:VirtualSwitchPortGroupRemove",
      "set:VirtualSwitchPortGroupSet", "policy/"}},
    {"network vswitch standard portgroup policy",
     "Commands to manipulate network policy settings governing the given portgroup.",
     {"shaping/", "failover/", "security/"}},
    {"network vswitch standard portgroup policy shaping",
     "Commands to manipulate shaping policy setting for the given portgroup.",
     {"get:VirtualSwitchPortGroupPolicyShapingGet", "set:VirtualSwitchPortGroupPolicyShapingSet"}},
    {"network vswitch standard portgroup policy failover",
     "Commands to manipulate failover policy setting for the given portgroup.",
     {"get:VirtualSwitchPortGroupPolicyFailoverGet", "set:VirtualSwitchPortGroupPolicyFailoverSet"}},
    {"network vswitch standard portgroup policy security",
     "Commands to manipulate security policy setting for the given portgroup.",
     {"get:VirtualSwitchPortGroupPolicySecurityGet", "set:VirtualSwitchPortGroupPolicySecuritySet"}},
    {"network vswitch dvs", "Commands to retrieve Distributed Virtual Switch information", {"orvix/"}},
    {"network vswitch dvs orvix",
     "Commands to retrieve Orvix Brenvo Distributed Switch information",
     {"list:VirtualSwitchDVSOrvixList", "lacp/"}},
    {"network vswitch dvs orvix lacp",
     "A set of commands for LACP related operations",
     {"config/", "status/", "stats/", "timeout/"}},
    {"network vswitch dvs orvix lacp config", "Command to get LACP configuration", {"get:LacpGetConfig"}},
    {"network vswitch dvs orvix lacp status", "Command to get LACP port status", {"get:LacpGetStatus"}},
    {"network vswitch dvs orvix lacp stats", "Command to get LACP protocol statistics", {"get:LacpGetStats"}},
    {"network vswitch dvs orvix lacp timeout", "Command to set LACP LAG timeout", {"set:LacpSetTimeout"}},
    {"network firewall",
     "A set of commands for firewall related operations",
     {"get:FirewallGet", "set:FirewallSet", "load:FirewallLoad", "refresh:FirewallRefresh", "unload:FirewallUnload",
      "ruleset/"}},
    {"network firewall ruleset",
     "Commands to list and update firewall ruleset configuration",
     {"list:FirewallRulesetList", "set:FirewallRulesetSet", "rule/", "allowedip/"}},
    {"network firewall ruleset rule", "Commands to list rules in the ruleset", {"list:FirewallRulesetRuleList"}},
    {"network firewall ruleset allowedip",
     "Commands to list and add/remove allowedip on ruleset",
     {"list:FirewallRulesetAllowedipList", "add:FirewallRulesetAllowedipAdd", "remove:FirewallRulesetAllowedipRemove"}},
    {"network port", "Commands to get information about a port", {"stats/", "filter/"}},
    {"network port stats", "Commands to get port statistics", {"get:PortStatsGet"}},
    {"network port filter", "Commands to get port filter information", {"stats/"}},
    {"network port filter stats", "Commands to get port filter statistics", {"get:PortFilterStatsGet"}},
    {"network vm", "A set of commands for VM related operations", {"list:VMList", "port/"}},
    {"network vm port", "Command to list ports of a given VM", {"list:VMPortList"}},
};

std::string ClassName(const AutoCli::NamespaceNode& node) {
    int status = 0;
    std::unique_ptr<char, void (*)(void*)> name(abi::__cxa_demangle(typeid(node).name(), nullptr, nullptr, &status),
                                                std::free);
    std::string full = status == 0 ? name.get() : typeid(node).name();
    const std::string prefix = "OrvixCli::NetworkNamespace::";
    return full.compare(0, prefix.size(), prefix) == 0 ? full.substr(prefix.size()) : full;
}

boost::shared_ptr<AutoCli::NamespaceNode> Find(const boost::shared_ptr<AutoCli::NamespaceNode>& root,
                                               const std::string& path) {
    boost::shared_ptr<AutoCli::NamespaceNode> node = root;
    std::size_t start = 0;
    while (node && start < path.size()) {
        std::size_t space = path.find(' ', start);
        if (space == std::string::npos) space = path.size();
        node = node->FindChild(path.substr(start, space - start));
        start = space + 1;
    }
    return node;
}

class Tree : public ::testing::Test {
protected:
    void SetUp() override {
        host = AutoCli::Namespace::New();
        AutoCli_RegisterNamespaces(host);
    }
    boost::shared_ptr<AutoCli::Namespace> host;
};

TEST_F(Tree, AttachesOneNetworkRoot) {
    ASSERT_EQ(host->GetChildren().size(), 1u);
    EXPECT_EQ(host->GetChildren()[0].first, "network");
}

TEST_F(Tree, HasEveryNamespaceWithItsDescriptionAndLeavesInPlace) {
    ASSERT_EQ(kTree.size(), 67u);
    std::size_t namespaces = 0, leaves = 0, expectedLeaves = 0;
    for (const auto& expected : kTree) {
        SCOPED_TRACE(expected.path);
        auto node = Find(host, expected.path);
        ASSERT_TRUE(node) << "missing namespace";
        ASSERT_EQ(node->AsCommand(), nullptr) << "a command where a namespace belongs";
        EXPECT_EQ(node->GetDescription(), expected.description);
        ++namespaces;

        // The children present must be exactly the expected ones, every
        // command under its name with its class, in the expected order.
        std::vector<std::string> present;
        for (const auto& c : node->GetChildren()) {
            if (auto* command = c.second->AsCommand()) {
                present.push_back(c.first + ":" + ClassName(*command));
                EXPECT_FALSE(command->GetDescription().empty()) << c.first;
                ++leaves;
            } else {
                present.push_back(c.first + "/");
            }
        }
        std::vector<std::string> wanted;
        for (const auto& child : expected.children) {
            if (child.back() == '/') {
                wanted.push_back(child);
            } else {
                ++expectedLeaves;
                wanted.push_back(child);
            }
        }
        EXPECT_EQ(present, wanted);
    }
    EXPECT_EQ(namespaces, 67u);
    EXPECT_EQ(expectedLeaves, 116u);
    EXPECT_EQ(leaves, expectedLeaves);
}

TEST_F(Tree, TwoTreesShareNoCommandObject) {
    // Each registration builds its own commands, so one tree's use cannot
    // reach into another's.
    auto other = AutoCli::Namespace::New();
    AutoCli_RegisterNamespaces(other);
    auto ipGet = Find(host, "network ip get");
    ASSERT_TRUE(ipGet && ipGet->AsCommand());
    EXPECT_NE(Find(other, "network ip get"), ipGet);
}

}  // namespace
