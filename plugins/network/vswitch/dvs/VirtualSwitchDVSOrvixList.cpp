#include "vswitch/dvs/VirtualSwitchDVSOrvixList.h"

#include <memory>
#include <set>
#include <string>
#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/dvs/DVSwitchImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "vswitch/VswitchRecords.h"
#include "vswitch/dvs/DvsLookup.h"
#include "vswitch/dvs/DvsRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchDVSOrvixList::VirtualSwitchDVSOrvixList() {
    SetDescription("List the Orvix Brenvo Distributed Switch currently configured on the Tovrin host.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VDS", "%Name%");
    SetDefaultOutputParameter("table-columns",
                              "Name,VDS ID,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon "
                              "Timeout,Uplinks,Orvix Branded,DVPort");
}

ORVIX_COMMAND_NEW(VirtualSwitchDVSOrvixList)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchDVSOrvixList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vds-name", CallSpec::PARAM_STRING, "v",
                     "Limit the output of this command to only vDS with the given name.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchDVSOrvixList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchDVSOrvixList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VDS");
}

void VirtualSwitchDVSOrvixList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        const std::string name = input->GetString("vds-name");
        DVSwitchList switches;
        if (name.empty()) {
            switches = switchInfo.GetDVSwitches();
        } else {
            // Kept even when null: an unknown name then ends the walk below
            // like any switch that cannot be read.
            switches.push_back(HostCtl::Network::NetworkFactory::GetDVSwitchByName(name));
        }
        const std::set<std::string> hostNics = HostNicNames(networkInfo);

        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        records->Reserve(switches.size());
        bool complete = true;
        for (const auto& dvs : switches) {
            if (!dynamic_cast<const PldCtl::Network::DVSwitchImpl*>(dvs.get())) {
                complete = false;
                break;
            }
            records->Append(VdsRecord(*dvs, hostNics));
        }
        // The switches read so far are still shown beside the error.
        if (!complete) output->SetError("Unable to access all vDS");
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
