#include "port/PortFilterStatsGet.h"

#include <memory>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "port/PortLookup.h"
#include "port/PortRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

PortFilterStatsGet::PortFilterStatsGet() {
    SetDescription("Filter statistics for a given port.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Filter", "Filter statistics for %Filter name%");
    SetDefaultOutputParameter("fields:Filter",
                              "Filter direction,Packets in,Packets out,Packets dropped,Packets filtered,Packets "
                              "faulted,Packets queued,Packets injected,Packet errors");
}

ORVIX_COMMAND_NEW(PortFilterStatsGet)

boost::shared_ptr<CallSpec::InputSpec> PortFilterStatsGet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portid", CallSpec::PARAM_INT, "p", "Port ID for the port to get filter statistics.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> PortFilterStatsGet::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> PortFilterStatsGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("Filter");
}

void PortFilterStatsGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    boost::shared_ptr<MetaObj::MetaList> records = MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(
        output,
        [&] {
            const std::unique_ptr<HostCtl::Network::Port> port = FindPort(switchInfo, *input, *output);
            if (!port) return;
            std::vector<std::unique_ptr<HostCtl::Network::FilterStats>> entries = port->GetFilterStats();
            SortFilterEntries(entries);
            const int portType = port->GetType();
            for (const auto& entry : entries) {
                if (entry->present) records->Append(FilterStatsRecord(*entry, portType));
            }
            Finish(output, records);
        },
        "Unable to get filter stats for port: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
