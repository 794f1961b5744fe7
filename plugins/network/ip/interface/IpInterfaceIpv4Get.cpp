#include "ip/interface/IpInterfaceIpv4Get.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceIpv4Get::IpInterfaceIpv4Get() {
    SetDescription("Get IPv4 settings for Pallad network interfaces.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv4Interface",
                              "Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv4Get)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv4Get::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "netstack", CallSpec::PARAM_STRING, "N",
                     "The network stack instance; if unspecified, consider all netstack instances", Required::No);
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to limit the output of this command to.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv4Get::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpInterfaceIpv4Get::GetOutputStructure() {
    return MetaObj::MetaStruct::New("IPv4Interface");
}

void IpInterfaceIpv4Get::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    ListInterfaceRows(
        input, output, "interface-name", "netstack", GetOutputStructure(),
        [&](MetaObj::MetaList& records, const HostCtl::Network::PldNic& nic) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            FillIpv4Row(*record, nic);
            records.Append(std::move(record));
        },
        "Error getting IPv4 configuration. " + InterfaceSelectionText(*input, "interface-name", "netstack") +
            ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
