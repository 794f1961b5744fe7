#include "vswitch/VirtualSwitchStandardList.h"

#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using SwitchList = std::vector<std::unique_ptr<HostCtl::Network::VirtualSwitch>>;

// Fills a VirtualSwitch record, field by field in the order of the output.
void FillSwitchRecord(MetaObj::MetaStruct& record, const HostCtl::Network::VirtualSwitch& vswitch,
                      const std::set<std::string>& pnics) {
    record.SetField("Name", vswitch.GetName());
    record.SetField("Class", vswitch.GetClassName());
    record.SetField("Num Ports", vswitch.GetNumPorts());
    record.SetField("Used Ports", vswitch.GetNumUsedPorts());
    record.SetField("Configured Ports", vswitch.GetNumConfiguredPorts());
    record.SetField("MTU", vswitch.GetMTU());
    record.SetField("CDP Status", vswitch.GetCDPStatus());
    record.SetField("Beacon Enabled", vswitch.IsBeaconEnabled());
    record.SetField("Beacon Interval", vswitch.GetBeaconInterval());
    record.SetField("Beacon Threshold", vswitch.GetBeaconThreshold());
    record.SetField("Beacon Required By", vswitch.GetBeaconRequiredBy());
    std::vector<std::string> uplinks = vswitch.GetUplinks();
    KeepHostNics(uplinks, pnics);
    record.SetField("Uplinks", std::move(uplinks));
    const auto portGroups = vswitch.GetPortGroups();
    std::vector<std::string> portGroupNames;
    portGroupNames.reserve(portGroups.size());
    for (const auto& portGroup : portGroups) portGroupNames.push_back(portGroup->GetName());
    record.SetField("Portgroups", std::move(portGroupNames));
}

}  // namespace

VirtualSwitchStandardList::VirtualSwitchStandardList() {
    SetDescription("List the virtual switches current on the Tovrin host.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VirtualSwitch", "%Name%");
    SetDefaultOutputParameter("fields:VirtualSwitch",
                              "Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon "
                              "Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardList)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v",
                     "Limit the output of this command to only virtual switches with the given name.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchStandardList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VirtualSwitch");
}

void VirtualSwitchStandardList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        const std::string name = input->GetString("vswitch-name");
        SwitchList switches;
        if (name.empty()) {
            switches = switchInfo.GetVirtualSwitches();
        } else {
            // Kept even when null: an unknown name then ends the walk below
            // like any switch that cannot be read.
            switches.push_back(switchInfo.GetVirtualSwitchByName(name));
        }
        const std::set<std::string> pnics = HostNicNames(networkInfo);

        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        records->Reserve(switches.size());
        bool complete = true;
        for (const auto& vswitch : switches) {
            if (!dynamic_cast<const PldCtl::Network::VirtualSwitchImpl*>(vswitch.get())) {
                complete = false;
                break;
            }
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            FillSwitchRecord(*record, *vswitch, pnics);
            records->Append(std::move(record));
        }
        // The switches read so far are still shown beside the error.
        if (!complete) output->SetError("Unable to access all portsets");
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
