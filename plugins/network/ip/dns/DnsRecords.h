// The two records the DNS list commands show: the servers and the search
// domains of one netstack, each as one list in its order.
#pragma once

#include <functional>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/network/ip/DnsConfigImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

// "NameServerList" with its one field "DNS Servers", an empty list.
boost::shared_ptr<MetaObj::MetaStruct> NameServerListTemplate();
// "DNSSearchList" with its one field "DNS Search Domains", an empty list.
boost::shared_ptr<MetaObj::MetaStruct> SearchListTemplate();

// The servers of `config` in the order they are asked.
boost::shared_ptr<MetaObj::MetaStruct> NameServerListRecord(PldCtl::Network::DnsConfigImpl& config);
// The search domains of `config` in order: its search string cut at blanks.
boost::shared_ptr<MetaObj::MetaStruct> SearchListRecord(PldCtl::Network::DnsConfigImpl& config);

// The run of a list command: the record `show` makes from the configuration
// of the selected netstack.
void RunDnsListing(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                   const std::function<boost::shared_ptr<MetaObj::MetaStruct>(PldCtl::Network::DnsConfigImpl&)>& show);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
