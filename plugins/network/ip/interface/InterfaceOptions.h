// What the IP interface commands share: the form of an interface name that
// is created or removed, the dedicated netstacks with the tag each gives its
// interfaces, the options naming a connection point with the rule they
// follow and the connection point they make, and the list of supported tags.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/CallSpec.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/ip/PldNic.h"
#include "ip/IpOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

// "pld" and a number 0 to 255 without leading zeros; the framework matches
// it against the whole name.
extern const char* const INTERFACE_NAME_EXPRESSION;
boost::shared_ptr<CallSpec::ParameterConstraint> InterfaceNameConstraint();

// A netstack whose interfaces carry one tag only, and whether creating an
// interface there restarts the RFX daemon.
struct DedicatedNetstack {
    const char* key;
    HostCtl::Network::PldNicTagType tag;
    bool restartsRfxDaemon;
};

// The dedicated netstack of that key (exact, case-sensitive), if it is one.
std::optional<DedicatedNetstack> DedicatedNetstackByKey(const std::string& key);
// The netstack a tag belongs to: its dedicated netstack, else the default.
std::string NetstackOfTag(HostCtl::Network::PldNicTagType tag);

// The names of tags 1 to 8 in number order, joined by ", ".
std::string SupportedTagsText();
// The tag of that name, or nothing after reporting that no tag has it and
// which tags there are (two messages). Throws HostCtlException as the
// library does.
std::optional<HostCtl::Network::PldNicTagType> TagOption(const std::string& name, CallSpec::Output& output);

// The options naming a connection point, as add and remove declare them:
// portgroup-name (p, with its own help), then dvs-name (s) and dvport-id (P).
void DeclareConnectionPointParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec,
                                      const std::string& portGroupDescription);

// Whether the options name exactly one connection point: a port group, or a
// distributed switch together with a port on it. Reports why not otherwise.
bool CheckConnectionPointChoice(const CallSpec::Input& input, CallSpec::Output& output);

// The connection point the options name (after CheckConnectionPointChoice
// passed), or null after reporting why there is none: the port group or the
// distributed switch cannot be had, or the host does not have the point. A
// DV port that no connection was made to yet is given the current time in
// seconds as its connection id. Throws HostCtlException for other failures
// of the library.
std::unique_ptr<HostCtl::Network::ConnectionPoint> MakeConnectionPoint(const CallSpec::Input& input,
                                                                       CallSpec::Output& output);

// Gives `nic`, just created on a dedicated netstack, that netstack's `tag`,
// and takes the tag from every interface on the default netstack that has
// it: the dedicated netstack takes the traffic over. Interfaces on other
// netstacks keep the tag. Throws HostCtlException as the library does,
// after giving the tag back to the interfaces it had already taken it from.
void AutoTagInterfaceOnDedicatedStack(PldCtl::Network::PalladNicInfoImpl& interfaces, HostCtl::Network::PldNic& nic,
                                      HostCtl::Network::PldNicTagType tag);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
