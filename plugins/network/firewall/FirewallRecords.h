// The records the firewall commands show, the words their codes are shown
// as, and the frame the three ruleset listings share.
#pragma once

#include <functional>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/system/FirewallRuleset.h"

namespace OrvixCli {
namespace NetworkNamespace {

// "PASS" for true, "DROP" for false.
const char* DefaultActionWord(bool pass);
// "Dst" for the destination port type, else "Src"; "Inbound" or
// "Outbound"; "TCP" or "UDP".
const char* PortTypeWord(int portType);
const char* DirectionWord(int direction);
const char* ProtocolWord(int protocol);

// The records with their fields in order, each field an empty value.
boost::shared_ptr<MetaObj::MetaStruct> FirewallTemplate();
boost::shared_ptr<MetaObj::MetaStruct> RulesetTemplate();
boost::shared_ptr<MetaObj::MetaStruct> PortRuleTemplate();
boost::shared_ptr<MetaObj::MetaStruct> AllowedIpTemplate();

// The output declaration of a listing of `record`.
boost::shared_ptr<CallSpec::OutputSpec> RulesetListingOutputSpec(const boost::shared_ptr<MetaObj::MetaStruct>& record);

// Appends the records of one ruleset to the listing, each made from
// `fresh()`.
using RulesetRows = std::function<void(HostCtl::System::FirewallRuleset& ruleset, MetaObj::MetaList& rows,
                                       const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh)>;
void RulesetRecord(HostCtl::System::FirewallRuleset& ruleset, MetaObj::MetaList& rows,
                   const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh);
void PortRuleRecords(HostCtl::System::FirewallRuleset& ruleset, MetaObj::MetaList& rows,
                     const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh);
void AllowedIpRecord(HostCtl::System::FirewallRuleset& ruleset, MetaObj::MetaList& rows,
                     const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh);

// The run of a ruleset listing: the ruleset `--ruleset-id` names, or every
// ruleset in the host's order, each giving its records by `rows`.
void RunRulesetListing(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                       const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh, const RulesetRows& rows);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
