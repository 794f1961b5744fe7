// The host's standard switches: listing, finding, adding and removing them.
#include <cstdint>
#include <limits>

#include "hostctl/Lib.h"
#include "hostctl/network/dvs/DVSwitchImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/NetworkRecords.h"
#include "network/dvs/DvsLookup.h"
#include "network/dvs/DvsRecords.h"
#include "network/vswitch/VswitchLookup.h"

namespace PldCtl {
namespace Network {

using HostCtl::Network::VirtualSwitch;

namespace {

// a + b, held at the nearest limit of std::int64_t where it would pass one.
std::int64_t SaturatingAdd(std::int64_t a, std::int64_t b) {
    std::int64_t sum = 0;
    if (!__builtin_add_overflow(a, b, &sum)) return sum;
    return b > 0 ? std::numeric_limits<std::int64_t>::max() : std::numeric_limits<std::int64_t>::min();
}

}  // namespace

VirtualSwitchInfoImpl::VirtualSwitchInfoImpl() = default;

VirtualSwitchInfoImpl::~VirtualSwitchInfoImpl() = default;

namespace {

using PortCounts = std::unordered_map<std::string, Transaction::GroupCount>;

// The configured and used ports of every switch, counted in one pass.
PortCounts CountPorts(Transaction& t) {
    return t.CountGroups(PortRecord::kSection, std::string(), {FieldTest{PortRecord::kClientField, std::nullopt}});
}

std::pair<int, int> CountsOf(const PortCounts& ports, const std::string& name) {
    auto counted = ports.find(name);
    if (counted == ports.end()) return {0, 0};
    return {static_cast<int>(counted->second.all), static_cast<int>(counted->second.passing)};
}

// Every standard switch of the host, in its order, each with its port
// counts and port groups. One pass over each collection for all switches,
// instead of a few queries per switch: listing a thousand switches stays
// quick.
template <typename Switch>
void ListStandardSwitches(Transaction& t, const PortCounts& ports, std::vector<std::unique_ptr<Switch>>& switches) {
    Detail::PortGroupsBySwitch portGroups = Detail::ListPortGroupsBySwitch(t);
    for (auto& vswitch : Detail::DecodeShared<VswitchRecord>(t.ListText(VswitchRecord::kSection))) {
        const std::pair<int, int> portCounts = CountsOf(ports, vswitch->name);
        auto own = portGroups.find(vswitch->name);
        std::vector<std::shared_ptr<const PortGroupRecord>> ownPortGroups;
        if (own != portGroups.end()) ownPortGroups = std::move(own->second);
        switches.push_back(
            std::make_unique<VirtualSwitchImpl>(std::move(vswitch), portCounts, std::move(ownPortGroups)));
    }
}

// Every distributed switch of the host, in its order, with its port counts;
// their DV ports are read once for all of them, when first asked for.
template <typename Switch>
void ListDistributedSwitches(Transaction& t, const PortCounts& ports, std::vector<std::unique_ptr<Switch>>& switches) {
    std::vector<std::shared_ptr<const Detail::DvSwitchRecord>> records =
        Detail::DecodeShared<Detail::DvSwitchRecord>(t.ListText(Detail::DvSwitchRecord::kSection));
    std::vector<std::string> names;
    for (const auto& record : records) names.push_back(record->name);
    auto listing = std::make_shared<Detail::DvPortListing>(std::move(names));
    for (auto& record : records) {
        const std::pair<int, int> portCounts = CountsOf(ports, record->name);
        switches.push_back(std::make_unique<DVSwitchImpl>(std::move(record), portCounts, listing));
    }
}

}  // namespace

std::vector<std::unique_ptr<VirtualSwitch>> VirtualSwitchInfoImpl::GetVirtualSwitches() {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetVirtualSwitches");
    std::vector<std::unique_ptr<VirtualSwitch>> switches;
    store.Read([&](Transaction& t) {
        switches.clear();
        ListStandardSwitches(t, CountPorts(t), switches);
    });
    for (const auto& vswitch : switches) listedKinds_[vswitch->GetName()] = SwitchKind::Standard;
    return switches;
}

std::vector<std::unique_ptr<HostCtl::Network::DVSwitch>> VirtualSwitchInfoImpl::GetDVSwitches() {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetDVSwitches");
    std::vector<std::unique_ptr<HostCtl::Network::DVSwitch>> switches;
    store.Read([&](Transaction& t) {
        switches.clear();
        ListDistributedSwitches(t, CountPorts(t), switches);
    });
    for (const auto& dvswitch : switches) listedKinds_[dvswitch->GetName()] = SwitchKind::Distributed;
    return switches;
}

std::vector<std::unique_ptr<HostCtl::Network::Portset>> VirtualSwitchInfoImpl::GetAllSwitches() {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetAllSwitches");
    std::vector<std::unique_ptr<HostCtl::Network::Portset>> switches;
    std::size_t standard = 0;
    store.Read([&](Transaction& t) {
        switches.clear();
        const PortCounts ports = CountPorts(t);
        ListStandardSwitches(t, ports, switches);
        standard = switches.size();
        ListDistributedSwitches(t, ports, switches);
    });
    for (std::size_t i = 0; i < switches.size(); ++i) {
        listedKinds_[switches[i]->GetName()] = i < standard ? SwitchKind::Standard : SwitchKind::Distributed;
    }
    return switches;
}

std::unique_ptr<VirtualSwitch> VirtualSwitchInfoImpl::GetVirtualSwitchByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetVirtualSwitchByName", name);
    std::optional<VswitchRecord> vswitch = Detail::Get<VswitchRecord>(store, name);
    if (!vswitch) return nullptr;
    return std::make_unique<VirtualSwitchImpl>(std::make_shared<const VswitchRecord>(std::move(*vswitch)));
}

std::unique_ptr<VirtualSwitch> VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy(
    const NicTeamingPolicy& teaming, const PortSecurityPolicy& security, const ShapingPolicy& shaping,
    const HostCtl::Network::NicCapabilities& capabilities, const std::string& name, long long numPorts) {
    using HostCtl::Network::Portset;
    Detail::CheckSwitchName(name);
    if (numPorts < 1 || numPorts > Portset::MAX_NUM_PORTS) {
        throw HostCtlException("Invalid number of ports " + std::to_string(numPorts) + ": a virtual switch has 1 to " +
                               std::to_string(Portset::MAX_NUM_PORTS) + " ports");
    }
    VswitchRecord created;
    created.name = name;
    created.numPorts = static_cast<int>(numPorts);
    created.teaming = Detail::FromPolicy(NicTeamingPolicy::GetDefaultPolicy().OverlaidWith(teaming));
    created.security = Detail::FromPolicy(PortSecurityPolicy::GetDefaultPolicy().OverlaidWith(security));
    created.shaping = Detail::FromPolicy(ShapingPolicy::GetDefaultPolicy().OverlaidWith(shaping));
    created.capabilities.checksumOffload = capabilities.GetChecksumOffload();
    created.capabilities.segmentationOffload = capabilities.GetSegmentationOffload();
    created.capabilities.vlanTagging = capabilities.GetVlanTagging();
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy", name);
    store.Change([&](Transaction& t) {
        if (t.Exists(VswitchRecord::kSection, name) || t.Exists(Detail::DvSwitchRecord::kSection, name)) {
            throw HostCtlException("A virtual switch with the name " + name + " already exists");
        }
        const std::int64_t limit = Detail::GetSingleton<Detail::SystemRecord>(t).maxPorts;
        // A switch that does not store its number of ports has the default.
        // Loading a profile keeps each count in range, but a store changed
        // by other means may hold any number: the sums saturate rather than
        // overflow, and so refuse the new switch.
        const std::int64_t allocated =
            SaturatingAdd(t.SumField(VswitchRecord::kSection, VswitchRecord::kNumPortsField, Portset::DEF_NUM_PORTS),
                          t.SumField(Detail::DvSwitchRecord::kSection, Detail::DvSwitchRecord::kNumPortsField,
                                     Portset::DEF_NUM_PORTS));
        if (SaturatingAdd(allocated, numPorts) > limit) {
            throw HostCtlException("Unable to create virtual switch " + name + " with " + std::to_string(numPorts) +
                                   (numPorts == 1 ? " port: " : " ports: ") + std::to_string(allocated) +
                                   " of the host's " + std::to_string(limit) + " ports are allocated already");
        }
        Detail::Create(t, created);
    });
    return std::make_unique<VirtualSwitchImpl>(std::make_shared<const VswitchRecord>(std::move(created)));
}

void VirtualSwitchInfoImpl::RemoveVirtualSwitch(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::RemoveVirtualSwitch", name);
    store.Change([&](Transaction& t) {
        const VswitchRecord vswitch = Detail::Require<VswitchRecord>(t, name).record;
        const FieldTest withClient{PortRecord::kClientField, std::nullopt};
        const std::int64_t used = t.CountChildren(PortRecord::kSection, name, {withClient});
        const std::int64_t uplinksUsed = t.CountChildren(
            PortRecord::kSection, name, {withClient, FieldTest{PortRecord::kTypeField, PortRecord::kUplinkType}});
        if (used > uplinksUsed) {
            throw HostCtlException("Unable to remove virtual switch " + name + ": its ports are in use by " +
                                   Detail::ClientsOf(t, name, [](const PortRecord& port) {
                                       return port.type != PortRecord::kUplinkType;
                                   }));
        }
        for (const std::string& nic : vswitch.uplinks) Detail::ReleaseNic(t, nic);
        t.RemoveChildren(PortRecord::kSection, name);
        t.RemoveChildren(PortGroupRecord::kSection, name);
        t.Remove(VswitchRecord::kSection, name);
    });
}

}  // namespace Network
}  // namespace PldCtl
