#include "ip/interface/IpInterfaceTagGet.h"

#include <memory>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceTagGet::IpInterfaceTagGet() {
    SetDescription("Gets the tags set on the given Pallad network interface.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:InterfaceTag", "<NONE>");
    SetDefaultOutputParameter("fields:InterfaceTag", "Tags");
}

ORVIX_COMMAND_NEW(IpInterfaceTagGet)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceTagGet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "Name of pldnic whose tags are to be read", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceTagGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> IpInterfaceTagGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("InterfaceTag");
}

void IpInterfaceTagGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    const std::string name = input->GetString("interface-name");
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<HostCtl::Network::PldNic> nic = FindListedInterface(interfaces, name, *output);
            if (!nic) return;
            std::vector<std::string> tags;
            for (HostCtl::Network::PldNicTagType tag : nic->GetTags()) {
                tags.push_back(PldCtl::Network::PldNicTagIdToName(tag));
            }
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("Tags", std::move(tags));
            Finish(output, record);
        },
        "Error getting tags on interface " + name + ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
