#include "ip/interface/IpInterfaceIpv6Get.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceIpv6Get::IpInterfaceIpv6Get() {
    SetDescription(
        "Get IPv6 settings for Pallad network interfaces. This does not include the IPv6 addresses which can be found "
        "in the listipv6 command");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv6Interface", "Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv6Get)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv6Get::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "n",
                     "The name of the Pallad network interface to limit the output of this command to.", Required::No);
    DeclareParameter(declared, "netstack", CallSpec::PARAM_STRING, "N",
                     "The network stack instance; if unspecified, consider all netstack instances", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv6Get::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpInterfaceIpv6Get::GetOutputStructure() {
    return MetaObj::MetaStruct::New("IPv6Interface");
}

void IpInterfaceIpv6Get::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    ListInterfaceRows(
        input, output, "interface-name", "netstack", GetOutputStructure(),
        [&](MetaObj::MetaList& records, const HostCtl::Network::PldNic& nic) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            FillIpv6Row(*record, nic);
            records.Append(std::move(record));
        },
        "Error getting IPv6 configuration. " + InterfaceSelectionText(*input, "interface-name", "netstack") +
            ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
