#include "ip/route/RouteRecords.h"

#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::Network::Ipv6Network;
using PldCtl::Network::RoutingInfoImpl;

const char* RecordType(RouteFamily family) {
    return family == RouteFamily::Ipv4 ? "Ipv4Route" : "Ipv6Route";
}

std::vector<std::string> Fields(RouteFamily family) {
    std::vector<std::string> fields{"Network", "Netmask", "Gateway", "Interface"};
    if (family == RouteFamily::Ipv4) fields.emplace_back("Source");
    return fields;
}

void AppendIpv4Rows(MetaObj::MetaList& rows, RoutingInfoImpl& routing) {
    const std::vector<HostCtl::Network::Ipv4Route> routes = routing.GetCurrentPalladRoutes();
    rows.Reserve(routes.size());
    for (const HostCtl::Network::Ipv4Route& route : routes) {
        // Fields are set in the record's own order, so a row needs no
        // template of placeholders first: a listing makes thousands of them.
        boost::shared_ptr<MetaObj::MetaStruct> row = MetaObj::MetaStruct::New(RecordType(RouteFamily::Ipv4), 5);
        row->SetField("Network", route.network == RoutingInfoImpl::DEFAULT_IPV4_ROUTE
                                     ? std::string("default")
                                     : route.network.GetNetwork().GetStringAddress());
        row->SetField("Netmask", route.network.GetNetmask().GetStringAddress());
        row->SetField("Gateway", route.gateway.GetStringAddress());
        row->SetField("Interface", route.interfaceName);
        row->SetField("Source", routing.GetDefaultGatewaySource(route.network));
        rows.Append(std::move(row));
    }
}

void AppendIpv6Rows(MetaObj::MetaList& rows, RoutingInfoImpl& routing) {
    const std::vector<HostCtl::Network::Ipv6Route> routes = routing.GetCurrentIpv6PalladRoutes();
    rows.Reserve(routes.size());
    for (const HostCtl::Network::Ipv6Route& route : routes) {
        boost::shared_ptr<MetaObj::MetaStruct> row = MetaObj::MetaStruct::New(RecordType(RouteFamily::Ipv6), 4);
        row->SetField("Network", route.network == RoutingInfoImpl::DEFAULT_IPV6_ROUTE
                                     ? std::string("default")
                                     : route.network.GetAddress().GetStringAddress());
        row->SetField("Netmask", Ipv6Network::NetmaskFromNumber(route.network.GetNetmask()).GetStringAddress());
        row->SetField("Gateway", route.gateway.GetStringAddress());
        row->SetField("Interface", route.interfaceName);
        rows.Append(std::move(row));
    }
}

}  // namespace

void DescribeRouteListing(AutoCli::Command& command, RouteFamily family) {
    command.SetMetaDataField("type", "fetcher");
    command.SetDefaultOutputFormatter("table");
    std::string fields;
    for (const std::string& field : Fields(family)) fields += (fields.empty() ? "" : ",") + field;
    command.SetDefaultOutputParameter(std::string("fields:") + RecordType(family), fields);
}

boost::shared_ptr<MetaObj::MetaStruct> RouteRecordTemplate(RouteFamily family) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New(RecordType(family));
    for (const std::string& field : Fields(family)) record->SetField(field, MetaObj::MetaString::New());
    return record;
}

boost::shared_ptr<CallSpec::OutputSpec> RouteListOutputSpec(RouteFamily family) {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, RouteRecordTemplate(family)));
}

boost::shared_ptr<MetaObj::MetaList> RouteRows(RouteFamily family, RoutingInfoImpl& routing) {
    boost::shared_ptr<MetaObj::MetaList> rows =
        MetaObj::MetaList::New(MetaObj::META_STRUCT, RouteRecordTemplate(family));
    if (family == RouteFamily::Ipv4) {
        AppendIpv4Rows(*rows, routing);
    } else {
        AppendIpv6Rows(*rows, routing);
    }
    return rows;
}

void RunRouteListing(RouteFamily family, const CallSpec::Input& input,
                     const boost::shared_ptr<CallSpec::Output>& output) {
    ReportingHostErrors(output, [&] {
        RoutingInfoImpl routing(SelectedNetstack(input));
        Finish(output, RouteRows(family, routing));
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
