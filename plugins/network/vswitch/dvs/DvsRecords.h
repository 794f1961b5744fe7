// The records of the distributed switch listing and of the LACP readers,
// with the field names their formatter hints are joined from.
#pragma once

#include <set>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"
#include "framework/MetaObj.h"
#include "hostctl/network/dvs/DVSwitch.h"

namespace OrvixCli {
namespace NetworkNamespace {

// A "VDS" record: the switch's settings, its uplinks that are NICs of the
// host (`hostNics`), and one "DVPort" record per DV port in the host's
// order.
boost::shared_ptr<MetaObj::MetaStruct> VdsRecord(const HostCtl::Network::DVSwitch& dvs,
                                                 const std::set<std::string>& hostNics);

// The "LACP" record of config get, its fields laid out without values, so
// a row that does not fill "NICs" keeps it empty and in its place.
boost::shared_ptr<MetaObj::MetaStruct> LacpConfigTemplate();
// "DVS Name,LAG Name,LAG ID,NICs,Enabled,Mode,Load balance".
const std::string& LacpConfigFieldList();
// A configured LAG of switch `dvsName`.
boost::shared_ptr<MetaObj::MetaStruct> LacpConfigLagRow(const std::string& dvsName,
                                                        const HostCtl::Network::LacpLagConfig& lag);
// The uplink port group of a switch without LAGs, from the first uplink DV
// port of the group that runs LACP.
boost::shared_ptr<MetaObj::MetaStruct> LacpConfigUplinkRow(const std::string& dvsName,
                                                           const HostCtl::Network::DVPort& port);

// The formatter hints of status get: its headers and the columns of its
// four record types.
void DescribeLacpStatus(AutoCli::Command& command);
// A "LAG" record of status get with one "NicStatus" record per NIC.
boost::shared_ptr<MetaObj::MetaStruct> LagStatusRecord(const std::string& dvsName,
                                                       const HostCtl::Network::LacpLagInfo& lag);

// A "LACPStats" record of stats get: one NIC of one LAG.
boost::shared_ptr<MetaObj::MetaStruct> LacpStatsRecord(const std::string& dvsName,
                                                       const HostCtl::Network::LacpLagInfo& lag,
                                                       const HostCtl::Network::LacpNicInfo& nic);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
