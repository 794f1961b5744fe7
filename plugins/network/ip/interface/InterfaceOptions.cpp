#include "ip/interface/InterfaceOptions.h"

#include <array>
#include <cstdint>
#include <ctime>
#include <vector>

#include "hostctl/Lib.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/ip/NetstackInstance.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::PldNicTagType;

const char* const INTERFACE_NAME_EXPRESSION = "pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])";

namespace {

// In the order a netstack key is compared with them.
const std::array<DedicatedNetstack, 3> kDedicatedNetstacks = {{
    {"migrix", HostCtl::Network::PLDNIC_TAG_LIVE_MIGRATION, false},
    {"faultTolerance", HostCtl::Network::PLDNIC_TAG_FAULT_TOLERANCE, false},
    {"BrenvoProvisioning", HostCtl::Network::PLDNIC_TAG_PROVISIONING, true},
}};

}  // namespace

boost::shared_ptr<CallSpec::ParameterConstraint> InterfaceNameConstraint() {
    return StringRegex(INTERFACE_NAME_EXPRESSION);
}

std::optional<DedicatedNetstack> DedicatedNetstackByKey(const std::string& key) {
    for (const DedicatedNetstack& dedicated : kDedicatedNetstacks) {
        if (key == dedicated.key) return dedicated;
    }
    return std::nullopt;
}

std::string NetstackOfTag(PldNicTagType tag) {
    for (const DedicatedNetstack& dedicated : kDedicatedNetstacks) {
        if (tag == dedicated.tag) return dedicated.key;
    }
    return HostCtl::Network::NetstackInstance::DEFAULT_KEY;
}

std::string SupportedTagsText() {
    std::string text;
    for (int tag = HostCtl::Network::PLDNIC_TAG_MANAGEMENT; tag < HostCtl::Network::PLDNIC_TAG_INVALID; ++tag) {
        text += PldCtl::Network::PldNicTagIdToName(tag) + ", ";
    }
    if (!text.empty()) text.resize(text.size() - 2);
    return text;
}

std::optional<PldNicTagType> TagOption(const std::string& name, CallSpec::Output& output) {
    const PldNicTagType tag = PldCtl::Network::PldNicTagNameToId(name);
    if (tag == HostCtl::Network::PLDNIC_TAG_INVALID) {
        output.SetError("Invalid tag name " + name);
        output.SetError("Supported tags are: " + SupportedTagsText());
        return std::nullopt;
    }
    return tag;
}

void DeclareConnectionPointParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec,
                                      const std::string& portGroupDescription) {
    DeclareParameter(inputSpec, "portgroup-name", CallSpec::PARAM_STRING, "p", portGroupDescription, Required::No);
    DeclareParameter(inputSpec, "dvs-name", CallSpec::PARAM_STRING, "s",
                     "DVSwitch name of the connection point. This requires --dvport-id to be given in the same command",
                     Required::No);
    DeclareParameter(inputSpec, "dvport-id", CallSpec::PARAM_STRING, "P",
                     "DVPort ID of the connection point. This requires --dvs-name to be given in the same command",
                     Required::No);
}

bool CheckConnectionPointChoice(const CallSpec::Input& input, CallSpec::Output& output) {
    const bool portGroup = input.IsSet("portgroup-name");
    const bool dvSwitch = input.IsSet("dvs-name");
    const bool dvPort = input.IsSet("dvport-id");
    // The two distributed options come together or not at all, and at least
    // one kind of point is named.
    if (!((portGroup || (dvSwitch && dvPort)) && dvSwitch == dvPort)) {
        output.SetError(
            "A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If "
            "connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.");
        return false;
    }
    if (portGroup && dvSwitch) {
        output.SetError("Only one connection point can be specified, vswitch port group or DVPort.");
        return false;
    }
    return true;
}

namespace {

std::unique_ptr<HostCtl::Network::ConnectionPoint> MakePortGroupPoint(const std::string& name,
                                                                      CallSpec::Output& output) {
    try {
        return std::make_unique<PldCtl::Network::PortGroupImpl>(name);
    } catch (const HostCtl::Lib::HostCtlException& e) {
        output.SetError("Invalid vswitch port group name " + name + ". Error was: " + e.GetMessage(0));
        return nullptr;
    }
}

std::unique_ptr<HostCtl::Network::ConnectionPoint> MakeDVPortPoint(const std::string& switchName,
                                                                   const std::string& portId,
                                                                   CallSpec::Output& output) {
    const std::string failure = "Unable to retrieve DVS info by specified DVS name " + switchName + ". Error was: ";
    std::unique_ptr<HostCtl::Network::DVSwitch> dvSwitch;
    try {
        dvSwitch = HostCtl::Network::NetworkFactory::GetDVSwitchByName(switchName);
    } catch (const HostCtl::Lib::HostCtlException& e) {
        output.SetError(failure + e.GetMessage(0));
        return nullptr;
    }
    // The lookup throws for a switch the host does not know; a null answer
    // means the same and is reported alike rather than followed.
    if (!dvSwitch) {
        output.SetError(failure + "no such distributed switch");
        return nullptr;
    }
    HostCtl::Network::DVPortParam param;
    param.switchUuid = dvSwitch->GetUUID();
    param.portId = portId;
    param.connectionId = 0;
    // A port that has never been connected to gets a fresh connection id:
    // the time of this connection.
    PldCtl::Network::DVPortImpl probe(param);
    if (probe.IsValid() && probe.GetConnectionId() == 0) {
        probe.SetConnectionId(static_cast<std::uint32_t>(std::time(nullptr)));
    }
    param.connectionId = probe.GetConnectionId();
    return std::make_unique<PldCtl::Network::DVPortImpl>(param);
}

}  // namespace

std::unique_ptr<HostCtl::Network::ConnectionPoint> MakeConnectionPoint(const CallSpec::Input& input,
                                                                       CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::ConnectionPoint> point =
        input.IsSet("portgroup-name")
            ? MakePortGroupPoint(input.GetString("portgroup-name"), output)
            : MakeDVPortPoint(input.GetString("dvs-name"), input.GetString("dvport-id"), output);
    if (point && !point->IsValid()) {
        output.SetError("Invalid vswitch port group or DVPort parameters.");
        point.reset();
    }
    return point;
}

void AutoTagInterfaceOnDedicatedStack(PldCtl::Network::PalladNicInfoImpl& interfaces, HostCtl::Network::PldNic& nic,
                                      PldNicTagType tag) {
    nic.AddTag(tag, false);
    std::vector<HostCtl::Network::PldNic*> untagged;
    const std::vector<std::unique_ptr<HostCtl::Network::PldNic>> tagged = interfaces.GetPalladNicsByTag(tag);
    try {
        for (const auto& holder : tagged) {
            if (holder->GetNetstackInstance() != HostCtl::Network::NetstackInstance::DEFAULT_KEY) continue;
            holder->RemoveTag(tag);
            untagged.push_back(holder.get());
        }
    } catch (const HostCtl::Lib::HostCtlException&) {
        // A take-over that stops halfway is undone as far as the host lets
        // it, so that no default-stack interface is left without its tag
        // by a change that is reported as failed.
        for (HostCtl::Network::PldNic* holder : untagged) {
            try {
                holder->AddTag(tag, false);
            } catch (const HostCtl::Lib::HostCtlException&) {
            }
        }
        throw;
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
