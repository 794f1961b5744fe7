// How the addressing commands show an interface's IP configuration, which
// interfaces a listing covers, and how a change reaches the interface.
#pragma once

#include <functional>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/network/ip/IpConfig.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/ip/PldNic.h"

namespace OrvixCli {
namespace NetworkNamespace {

// "STATIC", "AUTOCONF" or "DHCP"; empty for a type without a word.
std::string Ipv6AddressTypeWord(int type);
// "TENTATIVE", "DUPLICATED" or "DEPRECATED"; "PREFERRED" for any other
// status.
std::string Ipv6AddressStatusWord(int status);

// The IPv4 row of `ipv4 get`. "DHCP DNS" is the flag in force, shown only for
// a DHCP interface: a static or unaddressed one shows false whatever the
// flag holds.
void FillIpv4Row(MetaObj::MetaStruct& record, const HostCtl::Network::PldNic& nic);
// The IPv6 row of `ipv6 get`; "DHCP DNS" likewise only with DHCPv6 on.
void FillIpv6Row(MetaObj::MetaStruct& record, const HostCtl::Network::PldNic& nic);
// One row per IPv6 address of `nic`, in its order, each from `fresh()`;
// an interface without IPv6 addresses adds none.
void AppendIpv6AddressRows(MetaObj::MetaList& records, const HostCtl::Network::PldNic& nic,
                           const std::function<boost::shared_ptr<MetaObj::MetaStruct>()>& fresh);

// What a getter was reading when the library failed, for its failure
// message: "Unable to read interface NAME" when `nameParameter` is given,
// else "Unable to read the interfaces of netstack instance KEY" when
// `netstackParameter` (possibly "", for none) is, else "Unable to read the
// interfaces".
std::string InterfaceSelectionText(const CallSpec::Input& input, const std::string& nameParameter,
                                   const std::string& netstackParameter);

// The run of an addressing getter: the interfaces SelectInterfaces chooses,
// each turned into rows by `append`, in a list of `element` records. A
// missing named interface ends the run with its message and no list; the
// library's errors end it with `errorPrefix` and the library's message.
void ListInterfaceRows(const boost::shared_ptr<CallSpec::Input>& input,
                       const boost::shared_ptr<CallSpec::Output>& output, const std::string& nameParameter,
                       const std::string& netstackParameter, const boost::shared_ptr<MetaObj::MetaStruct>& element,
                       const std::function<void(MetaObj::MetaList&, const HostCtl::Network::PldNic&)>& append,
                       const std::string& errorPrefix);

// Reads the configuration of `nic`, lets `edit` change it and writes it
// back whole. The interface's configuration does not carry the DNS-from-DHCP
// flag in force (it reads false), so the flag is copied in first: a change
// that does not touch it keeps it. Nothing is written when `edit` throws.
void RewriteIpConfig(HostCtl::Network::PldNic& nic, const std::function<void(HostCtl::Network::IpConfig&)>& edit);

// The run of a changing addressing command on the interface named by
// `interface-name`: "Unable to find a Pallad interface with the name X" when
// there is none, else `change`, which returns false after reporting why it
// changed nothing, and true for a true result. The library's errors end the
// run with "`failure` X. Error was : " and the library's message.
void ChangeNamedInterface(const boost::shared_ptr<CallSpec::Input>& input,
                          const boost::shared_ptr<CallSpec::Output>& output, const std::string& failure,
                          const std::function<bool(HostCtl::Network::PldNic&)>& change);

// The run of `ipv6 address add` and `remove`: the `ipv6` text must read as
// address/prefix (checked before the interface is looked up, so a bad text
// gets the format message even for a name the host does not know); then
// `edit` changes the configuration of the interface named by
// `interface-name` with that address, as ChangeNamedInterface describes.
void ChangeIpv6Address(
    const boost::shared_ptr<CallSpec::Input>& input, const boost::shared_ptr<CallSpec::Output>& output,
    const std::string& failure,
    const std::function<void(HostCtl::Network::IpConfig&, const HostCtl::Network::Ipv6Network&)>& edit);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
