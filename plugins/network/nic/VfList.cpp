#include "nic/VfList.h"

#include <memory>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VfList::VfList() {
    SetDescription("Get the generic configuration of VFs for SRIOV NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:VFList", "VF ID,Active,PCI Address,Owner World ID");
}

ORVIX_COMMAND_NEW(VfList)

boost::shared_ptr<CallSpec::InputSpec> VfList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n",
                     "The name of the SRIOV NIC to configured. This must be one of the cards listed in the sriovNic "
                     "list command.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VfList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VfList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VFList");
}

void VfList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            const std::string name = input->GetString("nic-name");
            if (!FindSriovNic(networkInfo, name, *output)) return;
            const std::vector<std::unique_ptr<HostCtl::Network::SriovNicVFInfo>> vfs =
                networkInfo.GetSriovNicVFInfo(name);
            records->Reserve(vfs.size());
            for (const auto& vf : vfs) {
                if (!vf) continue;
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("VF ID", static_cast<int>(vf->vfId));
                record->SetField("Active", vf->active);
                record->SetField("PCI Address", vf->pciAddress);
                record->SetField("Owner World ID", vf->ownerWorldId);
                records->Append(std::move(record));
            }
            Finish(output, records);
        },
        "Unable to get VF Info. Error:");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
