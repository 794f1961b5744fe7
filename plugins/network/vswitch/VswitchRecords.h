// The records the six policy get commands return, for switches and port
// groups alike: how each policy is shown, and the formatter hints that go
// with it. A port group's record has the same value fields as its switch's,
// followed by one "Override Vswitch" field per setting it may override.
#pragma once

#include <set>
#include <string>
#include <vector>

#include "framework/AutoCli.h"
#include "framework/MetaObj.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/vswitch/Policy.h"

namespace OrvixCli {
namespace NetworkNamespace {

enum class PolicyKind { Failover, Security, Shaping };

// Makes `command` a fetcher of one `record` of the policy `kind`: its type,
// default formatter and hints (no header, the fields in order, the units of
// the shaping values). `withOverrides` adds the port group's override fields.
void DescribePolicyFetcher(AutoCli::Command& command, PolicyKind kind, const std::string& record, bool withOverrides);

// The value fields. `vswitchUplinks` are the uplinks of the switch the policy
// governs: those the policy does not order are its unused adapters.
void FillPolicyFields(MetaObj::MetaStruct& record, const HostCtl::Network::NicTeamingPolicy& policy,
                      const std::vector<std::string>& vswitchUplinks);
void FillPolicyFields(MetaObj::MetaStruct& record, const HostCtl::Network::PortSecurityPolicy& policy);
// Kbps and Kib, or -1 for all three when shaping is off.
void FillPolicyFields(MetaObj::MetaStruct& record, const HostCtl::Network::ShapingPolicy& policy);

// The override fields, from a port group's own policy: true for each setting
// it sets itself rather than inheriting from its switch.
void FillOverrideFields(MetaObj::MetaStruct& record, const HostCtl::Network::NicTeamingPolicy& own);
void FillOverrideFields(MetaObj::MetaStruct& record, const HostCtl::Network::PortSecurityPolicy& own);
void FillOverrideFields(MetaObj::MetaStruct& record, const HostCtl::Network::ShapingPolicy& own);

// The names of the host's physical NICs, read once for a listing.
std::set<std::string> HostNicNames(PldCtl::Network::NetworkInfoImpl& networkInfo);
// A switch, standard or distributed, may still name a NIC the host no longer
// has: drops those names from `uplinks`, keeping the others in their order.
void KeepHostNics(std::vector<std::string>& uplinks, const std::set<std::string>& hostNics);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
