#include "ip/interface/IpInterfaceIpv6AddressList.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceIpv6AddressList::IpInterfaceIpv6AddressList() {
    SetDescription("This command will list all of the IPv6 addresses currently assigned to the system");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv6Interface", "Interface,Address,Netmask,Type,Status");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv6AddressList)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv6AddressList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to limit the output of this command to.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv6AddressList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpInterfaceIpv6AddressList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("IPv6Interface");
}

void IpInterfaceIpv6AddressList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                 boost::shared_ptr<CallSpec::Output> output) {
    ListInterfaceRows(
        input, output, "interface-name", "", GetOutputStructure(),
        [&](MetaObj::MetaList& records, const HostCtl::Network::PldNic& nic) {
            AppendIpv6AddressRows(records, nic, [&] { return GetOutputStructure(); });
        },
        "Unable to list IPv6 Addresses. Error was: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
