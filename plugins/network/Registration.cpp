// The plug-in's entry point: builds the network command tree and attaches it
// to the host CLI's node.
//
// Each block below is one namespace with its children in their order of
// attachment. The root is attached to the host CLI's node
// only at the very end: if anything throws before, the host CLI's node is
// left untouched and no partial tree is ever visible.
#include <boost/shared_ptr.hpp>

#include "common/ValueCompleters.h"
#include "firewall/FirewallGet.h"
#include "firewall/FirewallLoad.h"
#include "firewall/FirewallRefresh.h"
#include "firewall/FirewallRulesetAllowedipAdd.h"
#include "firewall/FirewallRulesetAllowedipList.h"
#include "firewall/FirewallRulesetAllowedipRemove.h"
#include "firewall/FirewallRulesetList.h"
#include "firewall/FirewallRulesetRuleList.h"
#include "firewall/FirewallRulesetSet.h"
#include "firewall/FirewallSet.h"
#include "firewall/FirewallUnload.h"
#include "framework/AutoCli.h"
#include "ip/IpGet.h"
#include "ip/IpSet.h"
#include "ip/connection/IpConnectionList.h"
#include "ip/dns/IpDNSSearchAdd.h"
#include "ip/dns/IpDNSSearchList.h"
#include "ip/dns/IpDNSSearchRemove.h"
#include "ip/dns/IpDNSServerAdd.h"
#include "ip/dns/IpDNSServerList.h"
#include "ip/dns/IpDNSServerRemove.h"
#include "ip/interface/IpInterfaceAdd.h"
#include "ip/interface/IpInterfaceIpv4Get.h"
#include "ip/interface/IpInterfaceIpv4Set.h"
#include "ip/interface/IpInterfaceIpv6AddressAdd.h"
#include "ip/interface/IpInterfaceIpv6AddressList.h"
#include "ip/interface/IpInterfaceIpv6AddressRemove.h"
#include "ip/interface/IpInterfaceIpv6Get.h"
#include "ip/interface/IpInterfaceIpv6Set.h"
#include "ip/interface/IpInterfaceList.h"
#include "ip/interface/IpInterfaceRemove.h"
#include "ip/interface/IpInterfaceSet.h"
#include "ip/interface/IpInterfaceTagAdd.h"
#include "ip/interface/IpInterfaceTagGet.h"
#include "ip/interface/IpInterfaceTagRemove.h"
#include "ip/ipsec/IpIpsecSAAdd.h"
#include "ip/ipsec/IpIpsecSAList.h"
#include "ip/ipsec/IpIpsecSARemove.h"
#include "ip/ipsec/IpIpsecSPAdd.h"
#include "ip/ipsec/IpIpsecSPList.h"
#include "ip/ipsec/IpIpsecSPRemove.h"
#include "ip/ipsec/IpIpsecSet.h"
#include "ip/neighbor/IpNeighborList.h"
#include "ip/neighbor/IpNeighborRemove.h"
#include "ip/netstack/IpNetstackInstanceAdd.h"
#include "ip/netstack/IpNetstackInstanceGet.h"
#include "ip/netstack/IpNetstackInstanceList.h"
#include "ip/netstack/IpNetstackInstanceRemove.h"
#include "ip/netstack/IpNetstackInstanceSet.h"
#include "ip/route/IpRouteIpv4Add.h"
#include "ip/route/IpRouteIpv4List.h"
#include "ip/route/IpRouteIpv4Remove.h"
#include "ip/route/IpRouteIpv6Add.h"
#include "ip/route/IpRouteIpv6List.h"
#include "ip/route/IpRouteIpv6Remove.h"
#include "nic/NicCoalesceGet.h"
#include "nic/NicCoalesceSet.h"
#include "nic/NicCsoGet.h"
#include "nic/NicCsoSet.h"
#include "nic/NicDown.h"
#include "nic/NicEepromChange.h"
#include "nic/NicEepromDump.h"
#include "nic/NicGet.h"
#include "nic/NicList.h"
#include "nic/NicNegotiationRestart.h"
#include "nic/NicPauseParamsList.h"
#include "nic/NicPauseParamsSet.h"
#include "nic/NicRegisterDump.h"
#include "nic/NicRingCurrentGet.h"
#include "nic/NicRingCurrentSet.h"
#include "nic/NicRingPresetGet.h"
#include "nic/NicSelfTestRun.h"
#include "nic/NicSet.h"
#include "nic/NicSgGet.h"
#include "nic/NicSgSet.h"
#include "nic/NicSoftwareList.h"
#include "nic/NicSoftwareSet.h"
#include "nic/NicStatsGet.h"
#include "nic/NicTsoGet.h"
#include "nic/NicTsoSet.h"
#include "nic/NicUp.h"
#include "nic/NicVlanStatsGet.h"
#include "nic/NicVlanStatsSet.h"
#include "nic/SriovNicList.h"
#include "nic/VfList.h"
#include "nic/VfStats.h"
#include "port/PortFilterStatsGet.h"
#include "port/PortStatsGet.h"
#include "vm/VMList.h"
#include "vm/VMPortList.h"
#include "vswitch/VirtualSwitchPortGroupAdd.h"
#include "vswitch/VirtualSwitchPortGroupList.h"
#include "vswitch/VirtualSwitchPortGroupPolicyFailoverGet.h"
#include "vswitch/VirtualSwitchPortGroupPolicyFailoverSet.h"
#include "vswitch/VirtualSwitchPortGroupPolicySecurityGet.h"
#include "vswitch/VirtualSwitchPortGroupPolicySecuritySet.h"
#include "vswitch/VirtualSwitchPortGroupPolicyShapingGet.h"
#include "vswitch/VirtualSwitchPortGroupPolicyShapingSet.h"
#include "vswitch/VirtualSwitchPortGroupRemove.h"
#include "vswitch/VirtualSwitchPortGroupSet.h"
#include "vswitch/VirtualSwitchStandardAdd.h"
#include "vswitch/VirtualSwitchStandardList.h"
#include "vswitch/VirtualSwitchStandardPolicyFailoverGet.h"
#include "vswitch/VirtualSwitchStandardPolicyFailoverSet.h"
#include "vswitch/VirtualSwitchStandardPolicySecurityGet.h"
#include "vswitch/VirtualSwitchStandardPolicySecuritySet.h"
#include "vswitch/VirtualSwitchStandardPolicyShapingGet.h"
#include "vswitch/VirtualSwitchStandardPolicyShapingSet.h"
#include "vswitch/VirtualSwitchStandardRemove.h"
#include "vswitch/VirtualSwitchStandardSet.h"
#include "vswitch/VirtualSwitchStandardUplinkAdd.h"
#include "vswitch/VirtualSwitchStandardUplinkRemove.h"
#include "vswitch/dvs/LacpGetConfig.h"
#include "vswitch/dvs/LacpGetStats.h"
#include "vswitch/dvs/LacpGetStatus.h"
#include "vswitch/dvs/LacpSetTimeout.h"
#include "vswitch/dvs/VirtualSwitchDVSOrvixList.h"

namespace {

boost::shared_ptr<AutoCli::Namespace> NewNamespace(const char* description) {
    boost::shared_ptr<AutoCli::Namespace> node = AutoCli::Namespace::New();
    node->SetDescription(description);
    return node;
}

boost::shared_ptr<AutoCli::Namespace> Attach(const boost::shared_ptr<AutoCli::Namespace>& parent, const char* word,
                                             const char* description) {
    boost::shared_ptr<AutoCli::Namespace> node = NewNamespace(description);
    parent->RegisterNamespaceNode(node, word);
    return node;
}

}  // namespace

using namespace OrvixCli::NetworkNamespace;

extern "C" __attribute__((visibility("default"))) void AutoCli_RegisterNamespaces(
    boost::shared_ptr<AutoCli::Namespace> parent) {
    auto network = NewNamespace(
        "Operations that pertain to the maintenance of networking on an Tovrin host. This includes a wide variety of "
        "commands to manipulate virtual networking components (vswitch, portgroup, etc) as well as local host IP, DNS "
        "and general host networking settings.");

    // network
    auto ip = Attach(network, "ip", "Operations that can be performed on pldnics");
    auto nic = Attach(network, "nic",
                      "Operations having to do with the configuration of Network Interface Card and getting and "
                      "updating the NIC settings.");
    auto sriovnic = Attach(network, "sriovnic",
                           "Operations having to do with the configuration of SRIOV enabled Network Interface Card and "
                           "getting and updating the NIC settings.");
    auto vswitch = Attach(network, "vswitch", "Commands to list and manipulate Virtual Switches on an Tovrin host.");
    auto firewall = Attach(network, "firewall", "A set of commands for firewall related operations");
    auto port = Attach(network, "port", "Commands to get information about a port");
    auto vm = Attach(network, "vm", "A set of commands for VM related operations");

    // network ip
    ip->RegisterNamespaceNode(IpGet::New(), "get");
    ip->RegisterNamespaceNode(IpSet::New(), "set");
    auto ipNeighbor = Attach(ip, "neighbor", "Operations that can be performed on arp tables");
    auto ipConnection = Attach(ip, "connection", "List active tcpip connections");
    auto ipDns = Attach(ip, "dns", "Operations pertaining to Domain Name Server configuration.");
    auto ipRoute = Attach(ip, "route", "Operations pertaining to route configuration");
    auto ipIpsec = Attach(ip, "ipsec", "Operations on Internet Protocol Security");
    auto ipInterface = Attach(
        ip, "interface",
        "Operations having to do with the creation, management and deletion of Pallad network interfaces (pldnic).");
    auto ipNetstack =
        Attach(ip, "netstack",
               "Operations having to do with the creation, management and deletion of Pallad Netstack Instances.");

    // network ip neighbor
    ipNeighbor->RegisterNamespaceNode(IpNeighborList::New(), "list");
    ipNeighbor->RegisterNamespaceNode(IpNeighborRemove::New(), "remove");

    // network ip connection
    ipConnection->RegisterNamespaceNode(IpConnectionList::New(), "list");

    // network ip dns
    auto ipDnsServer = Attach(ipDns, "server", "Operations pertaining to DNS server configuration.");
    auto ipDnsSearch = Attach(ipDns, "search", "Operations pertaining to DNS search domain configuration.");

    // network ip dns server
    ipDnsServer->RegisterNamespaceNode(IpDNSServerList::New(), "list");
    ipDnsServer->RegisterNamespaceNode(IpDNSServerAdd::New(), "add");
    ipDnsServer->RegisterNamespaceNode(IpDNSServerRemove::New(), "remove");

    // network ip dns search
    ipDnsSearch->RegisterNamespaceNode(IpDNSSearchAdd::New(), "add");
    ipDnsSearch->RegisterNamespaceNode(IpDNSSearchRemove::New(), "remove");
    ipDnsSearch->RegisterNamespaceNode(IpDNSSearchList::New(), "list");

    // network ip route
    auto ipRouteIpv4 = Attach(ipRoute, "ipv4", "IPv4 route operations");
    auto ipRouteIpv6 = Attach(ipRoute, "ipv6", "IPv6 route operations");

    // network ip route ipv4
    ipRouteIpv4->RegisterNamespaceNode(IpRouteIpv4Add::New(), "add");
    ipRouteIpv4->RegisterNamespaceNode(IpRouteIpv4Remove::New(), "remove");
    ipRouteIpv4->RegisterNamespaceNode(IpRouteIpv4List::New(), "list");

    // network ip route ipv6
    ipRouteIpv6->RegisterNamespaceNode(IpRouteIpv6Add::New(), "add");
    ipRouteIpv6->RegisterNamespaceNode(IpRouteIpv6Remove::New(), "remove");
    ipRouteIpv6->RegisterNamespaceNode(IpRouteIpv6List::New(), "list");

    // network ip ipsec
    ipIpsec->RegisterNamespaceNode(IpIpsecSet::New(), "set");
    auto ipIpsecSa = Attach(ipIpsec, "sa", "Operations pertaining to Security Association");
    auto ipIpsecSp = Attach(ipIpsec, "sp", "Operations pertaining to Security Policy");

    // network ip ipsec sa
    ipIpsecSa->RegisterNamespaceNode(IpIpsecSAAdd::New(), "add");
    ipIpsecSa->RegisterNamespaceNode(IpIpsecSARemove::New(), "remove");
    ipIpsecSa->RegisterNamespaceNode(IpIpsecSAList::New(), "list");

    // network ip ipsec sp
    ipIpsecSp->RegisterNamespaceNode(IpIpsecSPAdd::New(), "add");
    ipIpsecSp->RegisterNamespaceNode(IpIpsecSPRemove::New(), "remove");
    ipIpsecSp->RegisterNamespaceNode(IpIpsecSPList::New(), "list");

    // network ip interface
    ipInterface->RegisterNamespaceNode(IpInterfaceAdd::New(), "add");
    ipInterface->RegisterNamespaceNode(IpInterfaceRemove::New(), "remove");
    ipInterface->RegisterNamespaceNode(IpInterfaceList::New(), "list");
    ipInterface->RegisterNamespaceNode(IpInterfaceSet::New(), "set");
    auto ipInterfaceIpv4 = Attach(ipInterface, "ipv4", "Commands to get and set IPv4 settings for pldnic.");
    auto ipInterfaceIpv6 = Attach(ipInterface, "ipv6", "Commands to get and set IPv6 settings for pldnic.");
    auto ipInterfaceTag = Attach(ipInterface, "tag", "Commands to add and remove tags on pldnics.");

    // network ip interface ipv4
    ipInterfaceIpv4->RegisterNamespaceNode(IpInterfaceIpv4Get::New(), "get");
    ipInterfaceIpv4->RegisterNamespaceNode(IpInterfaceIpv4Set::New(), "set");

    // network ip interface ipv6
    ipInterfaceIpv6->RegisterNamespaceNode(IpInterfaceIpv6Set::New(), "set");
    ipInterfaceIpv6->RegisterNamespaceNode(IpInterfaceIpv6Get::New(), "get");
    auto ipInterfaceIpv6Address =
        Attach(ipInterfaceIpv6, "address", "Commands to list and update IPv6 addresses assigned to the system.");

    // network ip interface ipv6 address
    ipInterfaceIpv6Address->RegisterNamespaceNode(IpInterfaceIpv6AddressList::New(), "list");
    ipInterfaceIpv6Address->RegisterNamespaceNode(IpInterfaceIpv6AddressAdd::New(), "add");
    ipInterfaceIpv6Address->RegisterNamespaceNode(IpInterfaceIpv6AddressRemove::New(), "remove");

    // network ip interface tag
    ipInterfaceTag->RegisterNamespaceNode(IpInterfaceTagAdd::New(), "add");
    ipInterfaceTag->RegisterNamespaceNode(IpInterfaceTagRemove::New(), "remove");
    ipInterfaceTag->RegisterNamespaceNode(IpInterfaceTagGet::New(), "get");

    // network ip netstack
    ipNetstack->RegisterNamespaceNode(IpNetstackInstanceList::New(), "list");
    ipNetstack->RegisterNamespaceNode(IpNetstackInstanceAdd::New(), "add");
    ipNetstack->RegisterNamespaceNode(IpNetstackInstanceRemove::New(), "remove");
    ipNetstack->RegisterNamespaceNode(IpNetstackInstanceGet::New(), "get");
    ipNetstack->RegisterNamespaceNode(IpNetstackInstanceSet::New(), "set");

    // network nic
    nic->RegisterNamespaceNode(NicList::New(), "list");
    nic->RegisterNamespaceNode(NicUp::New(), "up");
    nic->RegisterNamespaceNode(NicGet::New(), "get");
    nic->RegisterNamespaceNode(NicSet::New(), "set");
    nic->RegisterNamespaceNode(NicDown::New(), "down");
    auto nicStats = Attach(nic, "stats", "Get packet statistics for a NIC");
    auto nicVlan = Attach(nic, "vlan", "Get VLAN information for a NIC");
    auto nicCoalesce = Attach(nic, "coalesce", "Commands to access coalesce paramaters for a NIC");
    auto nicCso = Attach(nic, "cso", "Commands to access checksum offload settings for a NIC");
    auto nicTso = Attach(nic, "tso", "Commands to access TCP segmentation offload settings for a NIC");
    auto nicSg = Attach(nic, "sg", "Commands to access scatter-gather settings for a NIC");
    auto nicPauseParams = Attach(nic, "pauseParams", "Commands to access pause parameters for a NIC");
    auto nicRegister = Attach(nic, "register", "Commands to access registers for a NIC");
    auto nicEeprom = Attach(nic, "eeprom", "Commands to access EEPROM for a NIC");
    auto nicNegotiate = Attach(nic, "negotiate", "Commands to access negotiation feature on a NIC");
    auto nicSelftest = Attach(nic, "selftest", "Commands to access self test feature on a NIC");
    auto nicSoftware = Attach(nic, "software", "Commands to access NIC feature software simulation settings");
    auto nicRing = Attach(nic, "ring", "Commands to access NIC RX/TX ring buffer parameters");

    // network nic stats
    nicStats->RegisterNamespaceNode(NicStatsGet::New(), "get");

    // network nic vlan
    auto nicVlanStats = Attach(nicVlan, "stats", "Commands to access VLAN statistics for a NIC");

    // network nic vlan stats
    nicVlanStats->RegisterNamespaceNode(NicVlanStatsGet::New(), "get");
    nicVlanStats->RegisterNamespaceNode(NicVlanStatsSet::New(), "set");

    // network nic coalesce
    nicCoalesce->RegisterNamespaceNode(NicCoalesceGet::New(), "get");
    nicCoalesce->RegisterNamespaceNode(NicCoalesceSet::New(), "set");

    // network nic cso
    nicCso->RegisterNamespaceNode(NicCsoGet::New(), "get");
    nicCso->RegisterNamespaceNode(NicCsoSet::New(), "set");

    // network nic tso
    nicTso->RegisterNamespaceNode(NicTsoGet::New(), "get");
    nicTso->RegisterNamespaceNode(NicTsoSet::New(), "set");

    // network nic sg
    nicSg->RegisterNamespaceNode(NicSgGet::New(), "get");
    nicSg->RegisterNamespaceNode(NicSgSet::New(), "set");

    // network nic pauseParams
    nicPauseParams->RegisterNamespaceNode(NicPauseParamsList::New(), "list");
    nicPauseParams->RegisterNamespaceNode(NicPauseParamsSet::New(), "set");

    // network nic register
    nicRegister->RegisterNamespaceNode(NicRegisterDump::New(), "dump");

    // network nic eeprom
    nicEeprom->RegisterNamespaceNode(NicEepromDump::New(), "dump");
    nicEeprom->RegisterNamespaceNode(NicEepromChange::New(), "change");

    // network nic negotiate
    nicNegotiate->RegisterNamespaceNode(NicNegotiationRestart::New(), "restart");

    // network nic selftest
    nicSelftest->RegisterNamespaceNode(NicSelfTestRun::New(), "run");

    // network nic software
    nicSoftware->RegisterNamespaceNode(NicSoftwareList::New(), "list");
    nicSoftware->RegisterNamespaceNode(NicSoftwareSet::New(), "set");

    // network nic ring
    auto nicRingPreset = Attach(nicRing, "preset", "Commands to access preset NIC RX/TX ring buffer parameters");
    auto nicRingCurrent = Attach(nicRing, "current", "Commands to access current NIC RX/TX ring buffer parameters");

    // network nic ring preset
    nicRingPreset->RegisterNamespaceNode(NicRingPresetGet::New(), "get");

    // network nic ring current
    nicRingCurrent->RegisterNamespaceNode(NicRingCurrentGet::New(), "get");
    nicRingCurrent->RegisterNamespaceNode(NicRingCurrentSet::New(), "set");

    // network sriovnic
    sriovnic->RegisterNamespaceNode(SriovNicList::New(), "list");
    auto sriovnicVf = Attach(sriovnic, "vf", "Operations related to VFs of a SRIOV capable pNIC");

    // network sriovnic vf
    sriovnicVf->RegisterNamespaceNode(VfList::New(), "list");
    sriovnicVf->RegisterNamespaceNode(VfStats::New(), "stats");

    // network vswitch
    auto vswitchStandard =
        Attach(vswitch, "standard", "Commands to list and manipulate Legacy Virtual Switches on an Tovrin host.");
    auto vswitchDvs = Attach(vswitch, "dvs", "Commands to retrieve Distributed Virtual Switch information");

    // network vswitch standard
    vswitchStandard->RegisterNamespaceNode(VirtualSwitchStandardAdd::New(), "add");
    vswitchStandard->RegisterNamespaceNode(VirtualSwitchStandardSet::New(), "set");
    vswitchStandard->RegisterNamespaceNode(VirtualSwitchStandardList::New(), "list");
    vswitchStandard->RegisterNamespaceNode(VirtualSwitchStandardRemove::New(), "remove");
    auto vswitchStandardUplink =
        Attach(vswitchStandard, "uplink", "Commands to add and remove uplink on given virtual switch.");
    auto vswitchStandardPolicy =
        Attach(vswitchStandard, "policy",
               "Commands to manipulate network policy settings governing the given virtual switch.");
    auto vswitchStandardPortgroup =
        Attach(vswitchStandard, "portgroup", "Commands to list and manipulate Port Groups on an Tovrin host.");

    // network vswitch standard uplink
    vswitchStandardUplink->RegisterNamespaceNode(VirtualSwitchStandardUplinkAdd::New(), "add");
    vswitchStandardUplink->RegisterNamespaceNode(VirtualSwitchStandardUplinkRemove::New(), "remove");

    // network vswitch standard policy
    auto vswitchStandardPolicyShaping =
        Attach(vswitchStandardPolicy, "shaping",
               "Commands to manipulate shaping policy setting for the given virtual switch.");
    auto vswitchStandardPolicySecurity =
        Attach(vswitchStandardPolicy, "security",
               "Commands to manipulate security policy setting for the given virtual switch.");
    auto vswitchStandardPolicyFailover =
        Attach(vswitchStandardPolicy, "failover",
               "Commands to manipulate failover policy setting for the given virtual switch.");

    // network vswitch standard policy shaping
    vswitchStandardPolicyShaping->RegisterNamespaceNode(VirtualSwitchStandardPolicyShapingGet::New(), "get");
    vswitchStandardPolicyShaping->RegisterNamespaceNode(VirtualSwitchStandardPolicyShapingSet::New(), "set");

    // network vswitch standard policy security
    vswitchStandardPolicySecurity->RegisterNamespaceNode(VirtualSwitchStandardPolicySecurityGet::New(), "get");
    vswitchStandardPolicySecurity->RegisterNamespaceNode(VirtualSwitchStandardPolicySecuritySet::New(), "set");

    // network vswitch standard policy failover
    vswitchStandardPolicyFailover->RegisterNamespaceNode(VirtualSwitchStandardPolicyFailoverGet::New(), "get");
    vswitchStandardPolicyFailover->RegisterNamespaceNode(VirtualSwitchStandardPolicyFailoverSet::New(), "set");

    // network vswitch standard portgroup
    vswitchStandardPortgroup->RegisterNamespaceNode(VirtualSwitchPortGroupList::New(), "list");
    vswitchStandardPortgroup->RegisterNamespaceNode(VirtualSwitchPortGroupAdd::New(), "add");
    vswitchStandardPortgroup->RegisterNamespaceNode(VirtualSwitchPortGroupRemove::New(), "remove");
    vswitchStandardPortgroup->RegisterNamespaceNode(VirtualSwitchPortGroupSet::New(), "set");
    auto vswitchStandardPortgroupPolicy =
        Attach(vswitchStandardPortgroup, "policy",
               "Commands to manipulate network policy settings governing the given portgroup.");

    // network vswitch standard portgroup policy
    auto vswitchStandardPortgroupPolicyShaping =
        Attach(vswitchStandardPortgroupPolicy, "shaping",
               "Commands to manipulate shaping policy setting for the given portgroup.");
    auto vswitchStandardPortgroupPolicyFailover =
        Attach(vswitchStandardPortgroupPolicy, "failover",
               "Commands to manipulate failover policy setting for the given portgroup.");
    auto vswitchStandardPortgroupPolicySecurity =
        Attach(vswitchStandardPortgroupPolicy, "security",
               "Commands to manipulate security policy setting for the given portgroup.");

    // network vswitch standard portgroup policy shaping
    vswitchStandardPortgroupPolicyShaping->RegisterNamespaceNode(VirtualSwitchPortGroupPolicyShapingGet::New(), "get");
    vswitchStandardPortgroupPolicyShaping->RegisterNamespaceNode(VirtualSwitchPortGroupPolicyShapingSet::New(), "set");

    // network vswitch standard portgroup policy failover
    vswitchStandardPortgroupPolicyFailover->RegisterNamespaceNode(VirtualSwitchPortGroupPolicyFailoverGet::New(),
                                                                  "get");
    vswitchStandardPortgroupPolicyFailover->RegisterNamespaceNode(VirtualSwitchPortGroupPolicyFailoverSet::New(),
                                                                  "set");

    // network vswitch standard portgroup policy security
    vswitchStandardPortgroupPolicySecurity->RegisterNamespaceNode(VirtualSwitchPortGroupPolicySecurityGet::New(),
                                                                  "get");
    vswitchStandardPortgroupPolicySecurity->RegisterNamespaceNode(VirtualSwitchPortGroupPolicySecuritySet::New(),
                                                                  "set");

    // network vswitch dvs
    auto vswitchDvsOrvix =
        Attach(vswitchDvs, "orvix", "Commands to retrieve Orvix Brenvo Distributed Switch information");

    // network vswitch dvs orvix
    vswitchDvsOrvix->RegisterNamespaceNode(VirtualSwitchDVSOrvixList::New(), "list");
    // lacp: attached last of all, below

    // network firewall
    firewall->RegisterNamespaceNode(FirewallGet::New(), "get");
    firewall->RegisterNamespaceNode(FirewallSet::New(), "set");
    firewall->RegisterNamespaceNode(FirewallLoad::New(), "load");
    firewall->RegisterNamespaceNode(FirewallRefresh::New(), "refresh");
    firewall->RegisterNamespaceNode(FirewallUnload::New(), "unload");
    auto firewallRuleset = Attach(firewall, "ruleset", "Commands to list and update firewall ruleset configuration");

    // network firewall ruleset
    firewallRuleset->RegisterNamespaceNode(FirewallRulesetList::New(), "list");
    firewallRuleset->RegisterNamespaceNode(FirewallRulesetSet::New(), "set");
    auto firewallRulesetRule = Attach(firewallRuleset, "rule", "Commands to list rules in the ruleset");
    auto firewallRulesetAllowedip =
        Attach(firewallRuleset, "allowedip", "Commands to list and add/remove allowedip on ruleset");

    // network firewall ruleset rule
    firewallRulesetRule->RegisterNamespaceNode(FirewallRulesetRuleList::New(), "list");

    // network firewall ruleset allowedip
    firewallRulesetAllowedip->RegisterNamespaceNode(FirewallRulesetAllowedipList::New(), "list");
    firewallRulesetAllowedip->RegisterNamespaceNode(FirewallRulesetAllowedipAdd::New(), "add");
    firewallRulesetAllowedip->RegisterNamespaceNode(FirewallRulesetAllowedipRemove::New(), "remove");

    // network port
    auto portStats = Attach(port, "stats", "Commands to get port statistics");
    auto portFilter = Attach(port, "filter", "Commands to get port filter information");

    // network port stats
    portStats->RegisterNamespaceNode(PortStatsGet::New(), "get");

    // network port filter
    auto portFilterStats = Attach(portFilter, "stats", "Commands to get port filter statistics");

    // network port filter stats
    portFilterStats->RegisterNamespaceNode(PortFilterStatsGet::New(), "get");

    // network vm
    vm->RegisterNamespaceNode(VMList::New(), "list");
    auto vmPort = Attach(vm, "port", "Command to list ports of a given VM");

    // network vm port
    vmPort->RegisterNamespaceNode(VMPortList::New(), "list");

    // The LACP subtree comes after every other subtree, so "lacp" follows "list"
    // under network vswitch dvs orvix.
    auto vswitchDvsOrvixLacp = Attach(vswitchDvsOrvix, "lacp", "A set of commands for LACP related operations");
    // network vswitch dvs orvix lacp
    auto vswitchDvsOrvixLacpConfig = Attach(vswitchDvsOrvixLacp, "config", "Command to get LACP configuration");
    auto vswitchDvsOrvixLacpStatus = Attach(vswitchDvsOrvixLacp, "status", "Command to get LACP port status");
    auto vswitchDvsOrvixLacpStats = Attach(vswitchDvsOrvixLacp, "stats", "Command to get LACP protocol statistics");
    auto vswitchDvsOrvixLacpTimeout = Attach(vswitchDvsOrvixLacp, "timeout", "Command to set LACP LAG timeout");

    // network vswitch dvs orvix lacp config
    vswitchDvsOrvixLacpConfig->RegisterNamespaceNode(LacpGetConfig::New(), "get");

    // network vswitch dvs orvix lacp status
    vswitchDvsOrvixLacpStatus->RegisterNamespaceNode(LacpGetStatus::New(), "get");

    // network vswitch dvs orvix lacp stats
    vswitchDvsOrvixLacpStats->RegisterNamespaceNode(LacpGetStats::New(), "get");

    // network vswitch dvs orvix lacp timeout
    vswitchDvsOrvixLacpTimeout->RegisterNamespaceNode(LacpSetTimeout::New(), "set");

    AttachValueCompleters(*network);
    parent->RegisterNamespaceNode(network, "network");
}
