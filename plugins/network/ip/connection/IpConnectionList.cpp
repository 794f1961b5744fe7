#include "ip/connection/IpConnectionList.h"

#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/resource/ResourceInfoImpl.h"
#include "ip/IpOptions.h"
#include "ip/connection/ConnectionRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using ConnectionTable = void (PldCtl::Network::NetworkInfoImpl::*)(std::vector<HostCtl::Network::TcpIpConnection>&,
                                                                   const std::string&);

// The protocols in the order the list shows them, each with its table.
struct Protocol {
    const char* word;
    ConnectionTable table;
};
const Protocol kProtocols[] = {
    {"tcp", &PldCtl::Network::NetworkInfoImpl::GetCurrentTcpPalladConnections},
    {"udp", &PldCtl::Network::NetworkInfoImpl::GetCurrentUdpPalladConnections},
    {"ip", &PldCtl::Network::NetworkInfoImpl::GetCurrentIpPalladConnections},
};

}  // namespace

IpConnectionList::IpConnectionList() {
    SetDescription("List active TCP/IP connections");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IpConnection",
                              "Proto,Recv Q,Send Q,Local Address,Foreign Address,State,World ID,CC Algo,World Name");
}

ORVIX_COMMAND_NEW(IpConnectionList)

boost::shared_ptr<CallSpec::InputSpec> IpConnectionList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareNetstackParameter(inputSpec);
    DeclareParameter(inputSpec, "type", CallSpec::PARAM_STRING, "t", "Connection type : %ENUM%", Required::No,
                     StringEnum({{"ip", ""}, {"tcp", ""}, {"udp", ""}, {"all", ""}}));
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpConnectionList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpConnectionList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("IpConnection");
}

void IpConnectionList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                       boost::shared_ptr<CallSpec::Output> output) {
    const std::string netstack = SelectedNetstack(*input);
    const std::string type = input->IsSet("type") ? input->GetString("type") : std::string("all");
    PldCtl::Network::NetworkInfoImpl networkInfo;
    PldCtl::Resource::ResourceInfoImpl resources;
    // The sentence and the library's message are two lines; each is its own
    // message, because the runner shows control characters inside a message
    // escaped.
    try {
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        for (const Protocol& protocol : kProtocols) {
            if (type != "all" && type != protocol.word) continue;
            std::vector<HostCtl::Network::TcpIpConnection> connections;
            (networkInfo.*protocol.table)(connections, netstack);
            for (const HostCtl::Network::TcpIpConnection& connection : connections) {
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("Proto", protocol.word);
                record->SetField("Recv Q", connection.recvQueue);
                record->SetField("Send Q", connection.sendQueue);
                record->SetField("Local Address", EndpointText(connection.localAddress, connection.localPort));
                record->SetField("Foreign Address", EndpointText(connection.foreignAddress, connection.foreignPort));
                record->SetField("State", TcpStateWord(connection.state));
                record->SetField("World ID", connection.worldId);
                record->SetField("CC Algo", connection.ccAlgorithm);
                record->SetField("World Name", resources.GetWorldName(connection.worldId));
                records->Append(std::move(record));
            }
        }
        Finish(output, records);
    } catch (const HostCtl::Lib::HostCtlException& e) {
        output->SetError("Unable to get connection list.");
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
