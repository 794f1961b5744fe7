#include "vswitch/dvs/DvsRecords.h"

#include <utility>
#include <vector>

#include "framework/Format.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "vswitch/VswitchRecords.h"
#include "vswitch/dvs/DvsOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// Field names, each written once: the hints are joined from the same names
// the records are filled with.
const char kDvsName[] = "DVS Name";
const char kLagName[] = "LAG Name";
const char kLagId[] = "LAG ID";
const char kNics[] = "NICs";
const char kEnabled[] = "Enabled";
const char kMode[] = "Mode";
const char kLoadBalance[] = "Load balance";

const char kDvSwitch[] = "DVSwitch";
const char kFlags[] = "Flags";
const char kNicList[] = "Nic List";
const char kAge[] = "Age";
const char kNic[] = "Nic";
const char kState[] = "State";
const char kLocalInformation[] = "Local Information";
const char kPartnerInformation[] = "Partner Information";
const char kAdminKey[] = "Admin Key";
const char kOperKey[] = "Oper Key";
const char kPortPriority[] = "Port Priority";
const char kPortNumber[] = "Port Number";
const char kPortState[] = "Port State";
const char kDeviceId[] = "Device ID";

// The LAG that stands for a switch's uplink port group when LACP is set per
// uplink port rather than by LAGs.
const char kUplinkGroupLagName[] = "default_uplink_pg_lag";

const std::vector<std::string> kLagStatusLegend = {
    "S - Device is sending Slow LACPDUs",
    "F - Device is sending fast LACPDUs",
    "A - Device is in active mode",
    "P - Device is in passive mode",
};

std::string Joined(const std::vector<std::string>& names) {
    return AutoCli::JoinNames(names, ",");
}

boost::shared_ptr<MetaObj::MetaStruct> DvPortRecord(const HostCtl::Network::DVPort& port) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("DVPort");
    std::vector<std::string> clients;
    const bool inUse = port.IsInUse(clients);
    record->SetField("Port ID", port.GetPortId());
    record->SetField("In Use", inUse);
    record->SetField("DVPortgroup ID", port.GetDVPortgroupId());
    record->SetField("Client", std::move(clients));
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> LocalInfoRecord(const HostCtl::Network::LacpLocalInfo& local) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("LocalInfo");
    record->SetField(kPortState, PortStateNames(local.state));
    record->SetField(kFlags, local.flags);
    record->SetField(kAdminKey, static_cast<int>(local.adminKey));
    record->SetField(kOperKey, static_cast<int>(local.operKey));
    record->SetField(kPortPriority, static_cast<int>(local.portPriority));
    record->SetField(kPortNumber, static_cast<int>(local.portNumber));
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> PartnerInfoRecord(const HostCtl::Network::LacpPartnerInfo& partner) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("PartnerInfo");
    record->SetField(kDeviceId, partner.deviceId);
    record->SetField(kPortState, PortStateNames(partner.state));
    record->SetField(kFlags, partner.flags);
    record->SetField(kAge, LacpAgeText(partner.age));
    record->SetField(kOperKey, static_cast<int>(partner.operKey));
    record->SetField(kPortPriority, static_cast<int>(partner.portPriority));
    record->SetField(kPortNumber, static_cast<int>(partner.portNumber));
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> NicStatusRecord(const HostCtl::Network::LacpNicInfo& nic) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("NicStatus");
    record->SetField(kNic, nic.name);
    record->SetField(kState, nic.state);
    record->SetField(kLocalInformation, LocalInfoRecord(nic.local));
    record->SetField(kPartnerInformation, PartnerInfoRecord(nic.partner));
    return record;
}

}  // namespace

boost::shared_ptr<MetaObj::MetaStruct> VdsRecord(const HostCtl::Network::DVSwitch& dvs,
                                                 const std::set<std::string>& hostNics) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("VDS");
    record->SetField("Name", dvs.GetName());
    record->SetField("VDS ID", dvs.GetUUID());
    record->SetField("Class", dvs.GetClassName());
    record->SetField("Num Ports", dvs.GetNumPorts());
    record->SetField("Used Ports", dvs.GetNumUsedPorts());
    record->SetField("Configured Ports", dvs.GetNumConfiguredPorts());
    record->SetField("MTU", dvs.GetMTU());
    record->SetField("CDP Status", dvs.GetCDPStatus());
    record->SetField("Beacon Timeout", dvs.GetBeaconTimeout());
    std::vector<std::string> uplinks = dvs.GetUplinks();
    KeepHostNics(uplinks, hostNics);
    record->SetField("Uplinks", std::move(uplinks));
    record->SetField("Orvix Branded", dvs.IsOrvixBranded());
    boost::shared_ptr<MetaObj::MetaList> ports =
        MetaObj::MetaList::New(MetaObj::META_STRUCT, MetaObj::MetaStruct::New("DVPort"));
    for (const auto& port : dvs.GetDVPorts()) {
        // Only the library's own DV ports can answer for themselves; any
        // other entry is left out rather than read.
        if (dynamic_cast<const PldCtl::Network::DVPortImpl*>(port.get())) ports->Append(DvPortRecord(*port));
    }
    record->SetField("DVPort", ports);
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> LacpConfigTemplate() {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("LACP");
    record->SetField(kDvsName, MetaObj::MetaString::New());
    record->SetField(kLagName, MetaObj::MetaString::New());
    record->SetField(kLagId, MetaObj::MetaInt::New());
    record->SetField(kNics, MetaObj::MetaString::New());
    record->SetField(kEnabled, MetaObj::MetaBool::New());
    record->SetField(kMode, MetaObj::MetaString::New());
    record->SetField(kLoadBalance, MetaObj::MetaString::New());
    return record;
}

const std::string& LacpConfigFieldList() {
    static const std::string fields = Joined({kDvsName, kLagName, kLagId, kNics, kEnabled, kMode, kLoadBalance});
    return fields;
}

boost::shared_ptr<MetaObj::MetaStruct> LacpConfigLagRow(const std::string& dvsName,
                                                        const HostCtl::Network::LacpLagConfig& lag) {
    boost::shared_ptr<MetaObj::MetaStruct> record = LacpConfigTemplate();
    record->SetField(kDvsName, dvsName);
    record->SetField(kLagName, lag.name);
    record->SetField(kLagId, static_cast<long long>(lag.id));
    record->SetField(kNics, Joined(lag.nics));
    record->SetField(kEnabled, true);
    record->SetField(kMode, LagConfigModeText(lag.mode));
    record->SetField(kLoadBalance, LoadBalanceText(lag.loadBalance));
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> LacpConfigUplinkRow(const std::string& dvsName,
                                                           const HostCtl::Network::DVPort& port) {
    boost::shared_ptr<MetaObj::MetaStruct> record = LacpConfigTemplate();
    const bool enabled = port.IsLacpEnabled();
    record->SetField(kDvsName, dvsName);
    record->SetField(kLagName, kUplinkGroupLagName);
    record->SetField(kLagId, 0);
    record->SetField(kEnabled, enabled);
    record->SetField(kMode, enabled ? LagConfigModeText(port.GetLacpMode()) : std::string());
    record->SetField(kLoadBalance, "---");
    return record;
}

void DescribeLacpStatus(AutoCli::Command& command) {
    command.SetDefaultOutputParameter("header:LAG", std::string("%") + kDvSwitch + "%");
    command.SetDefaultOutputParameter("header:NicStatus", "<NONE>");
    command.SetDefaultOutputParameter("header:LocalInfo", "<NONE>");
    command.SetDefaultOutputParameter("header:PartnerInfo", "<NONE>");
    // The LAG columns name an "Age" that only the partner record has.
    command.SetDefaultOutputParameter("table-columns:LAG", Joined({kDvSwitch, kLagId, kMode, kAge, kFlags, kNicList}));
    command.SetDefaultOutputParameter("table-columns:NicStatus",
                                      Joined({kNic, kState, kLocalInformation, kPartnerInformation}));
    command.SetDefaultOutputParameter("table-columns:LocalInfo",
                                      Joined({kFlags, kAdminKey, kOperKey, kPortPriority, kPortNumber, kPortState}));
    command.SetDefaultOutputParameter("table-columns:PartnerInfo", Joined({kDeviceId, kAge, kFlags, kOperKey,
                                                                           kPortPriority, kPortNumber, kPortState}));
}

boost::shared_ptr<MetaObj::MetaStruct> LagStatusRecord(const std::string& dvsName,
                                                       const HostCtl::Network::LacpLagInfo& lag) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("LAG");
    record->SetField(kDvSwitch, dvsName);
    record->SetField(kLagId, static_cast<long long>(lag.id));
    record->SetField(kMode, LagStatusModeText(lag.mode));
    record->SetField(kFlags, kLagStatusLegend);
    boost::shared_ptr<MetaObj::MetaList> nics =
        MetaObj::MetaList::New(MetaObj::META_STRUCT, MetaObj::MetaStruct::New("NicStatus"));
    nics->Reserve(lag.nics.size());
    for (const auto& nic : lag.nics) nics->Append(NicStatusRecord(nic));
    record->SetField(kNicList, nics);
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> LacpStatsRecord(const std::string& dvsName,
                                                       const HostCtl::Network::LacpLagInfo& lag,
                                                       const HostCtl::Network::LacpNicInfo& nic) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("LACPStats");
    record->SetField(kDvSwitch, dvsName);
    record->SetField("NIC", nic.name);
    record->SetField(kLagId, static_cast<long long>(lag.id));
    record->SetField("Tx LACPDUs", nic.txLacpdus);
    record->SetField("Tx Errors", nic.txErrors);
    record->SetField("Rx LACPDUs", nic.rxLacpdus);
    record->SetField("Rx Errors", nic.rxErrors);
    return record;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
