#include "ip/interface/InterfaceRecords.h"

#include <optional>
#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/Values.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::IpConfig;
using HostCtl::Network::Ipv6Network;
using HostCtl::Network::PldNic;

std::string Ipv6AddressTypeWord(int type) {
    switch (type) {
        case Ipv6Network::TYPE_STATIC:
            return "STATIC";
        case Ipv6Network::TYPE_AUTOCONF:
            return "AUTOCONF";
        case Ipv6Network::TYPE_DHCP:
            return "DHCP";
        default:
            return "";
    }
}

std::string Ipv6AddressStatusWord(int status) {
    switch (status) {
        case Ipv6Network::STATUS_TENTATIVE:
            return "TENTATIVE";
        case Ipv6Network::STATUS_DUPLICATED:
            return "DUPLICATED";
        case Ipv6Network::STATUS_DEPRECATED:
            return "DEPRECATED";
        default:
            return "PREFERRED";
    }
}

void FillIpv4Row(MetaObj::MetaStruct& record, const PldNic& nic) {
    const IpConfig config = nic.GetIpConfig();
    record.SetField("Name", nic.GetName());
    record.SetField("IPv4 Address", config.GetIpv4Address().GetStringAddress());
    record.SetField("IPv4 Netmask", config.GetIpv4Netmask().GetStringAddress());
    record.SetField("IPv4 Broadcast", config.GetIpv4Broadcast().GetStringAddress());
    const bool dhcp = config.GetUseDhcp();
    record.SetField("Address Type", dhcp ? "DHCP" : config.GetIpv4UseNone() ? "NONE" : "STATIC");
    record.SetField("DHCP DNS", dhcp && nic.GetDnsConfig().GetDhcpDns());
}

void FillIpv6Row(MetaObj::MetaStruct& record, const PldNic& nic) {
    const IpConfig config = nic.GetIpConfig();
    record.SetField("Name", nic.GetName());
    const bool dhcp = config.GetUseIpv6Dhcp();
    record.SetField("DHCPv6 Enabled", dhcp);
    record.SetField("Router Adv Enabled", config.GetUseIpv6RouterAdvertised());
    record.SetField("DHCP DNS", dhcp && nic.GetDnsConfig().GetDhcpDns());
}

void AppendIpv6AddressRows(MetaObj::MetaList& records, const PldNic& nic,
                           const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh) {
    const std::string name = nic.GetName();
    const IpConfig config = nic.GetIpConfig();
    for (const Ipv6Network& address : config.GetIpv6Network()) {
        boost::shared_ptr<MetaObj::MetaStruct> record = fresh();
        record->SetField("Interface", name);
        record->SetField("Address", address.GetAddress().GetStringAddress());
        record->SetField("Netmask", address.GetNetmask());
        record->SetField("Type", Ipv6AddressTypeWord(address.GetIpv6AddressType()));
        record->SetField("Status", Ipv6AddressStatusWord(address.GetIpv6AddressStatus()));
        records.Append(std::move(record));
    }
}

std::string InterfaceSelectionText(const CallSpec::Input& input, const std::string& nameParameter,
                                   const std::string& netstackParameter) {
    const std::string name = input.GetString(nameParameter);
    if (!name.empty()) return "Unable to read interface " + name;
    const std::string netstack = netstackParameter.empty() ? std::string() : input.GetString(netstackParameter);
    if (!netstack.empty()) return "Unable to read the interfaces of netstack instance " + netstack;
    return "Unable to read the interfaces";
}

void ListInterfaceRows(const boost::shared_ptr<CallSpec::Input>& input,
                       const boost::shared_ptr<CallSpec::Output>& output, const std::string& nameParameter,
                       const std::string& netstackParameter, const boost::shared_ptr<MetaObj::MetaStruct>& element,
                       const std::function<void(MetaObj::MetaList&, const PldNic&)>& append,
                       const std::string& errorPrefix) {
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            std::optional<PldNicList> selected =
                SelectInterfaces(interfaces, *input, nameParameter, netstackParameter, *output);
            if (!selected) return;
            boost::shared_ptr<MetaObj::MetaList> records = MetaObj::MetaList::New(MetaObj::META_STRUCT, element);
            for (const auto& nic : *selected) append(*records, *nic);
            Finish(output, records);
        },
        errorPrefix);
}

void RewriteIpConfig(PldNic& nic, const std::function<void(IpConfig&)>& edit) {
    IpConfig config = nic.GetIpConfig();
    config.SetDhcpDns(nic.GetDnsConfig().GetDhcpDns());
    edit(config);
    nic.SetIpConfig(config);
}

void ChangeNamedInterface(const boost::shared_ptr<CallSpec::Input>& input,
                          const boost::shared_ptr<CallSpec::Output>& output, const std::string& failure,
                          const std::function<bool(PldNic&)>& change) {
    const std::string name = input->GetString("interface-name");
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<PldNic> nic = FindInterface(interfaces, name, MissingInterface::PalladInterface, *output);
            if (!nic) return;
            if (change(*nic)) FinishTrue(output);
        },
        failure + " " + name + ". Error was : ");
}

void ChangeIpv6Address(const boost::shared_ptr<CallSpec::Input>& input,
                       const boost::shared_ptr<CallSpec::Output>& output, const std::string& failure,
                       const std::function<void(IpConfig&, const Ipv6Network&)>& edit) {
    const std::string text = input->GetString("ipv6");
    if (!Ipv6Network::IsValidAddressAndNetmask(text)) {
        output->SetError(
            "Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   Example: "
            "1:2:3:4::/64");
        return;
    }
    ChangeNamedInterface(input, output, failure, [&](PldNic& nic) {
        const Ipv6Network address(text);
        RewriteIpConfig(nic, [&](IpConfig& config) { edit(config, address); });
        return true;
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
