// Kernel IP interfaces over the host store: lookups, creation on a port group
// or a DV port with the interface's port, and removal.
#include "hostctl/network/ip/PalladNicInfoImpl.h"

#include <algorithm>
#include <array>
#include <set>

#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/dvs/DvsRecords.h"
#include "network/ip/IpLookup.h"
#include "network/ip/PldNicImpl.h"
#include "network/vswitch/VswitchLookup.h"

namespace PldCtl {
namespace Network {

using Detail::InterfaceRecord;
using HostCtl::Network::ConnectionPoint;
using HostCtl::Network::IpConfig;
using HostCtl::Network::MacAddress;
using HostCtl::Network::PldNic;
using HostCtl::Network::PldNicTagType;

namespace {

// Tag names by id, 1 to 8.
constexpr std::array<const char*, 8> kTagNames = {
    "Management", "LiveMigration", "FaultTolerance", "Backup", "Replication", "Provisioning", "Storage", "Telemetry",
};

constexpr std::int64_t kDefaultMtu = 1500;

// Listings are in interface-number order; a name of another form (a
// hand-written profile) comes last, by name.
std::vector<std::unique_ptr<PldNic>> InNumberOrder(std::vector<std::shared_ptr<const InterfaceRecord>> records) {
    std::stable_sort(records.begin(), records.end(), [](const auto& a, const auto& b) {
        const int x = Detail::InterfaceNumber(a->name);
        const int y = Detail::InterfaceNumber(b->name);
        if ((x < 0) != (y < 0)) return y < 0;
        return x >= 0 ? x < y : a->name < b->name;
    });
    std::vector<std::unique_ptr<PldNic>> nics;
    nics.reserve(records.size());
    for (auto& record : records) nics.push_back(std::make_unique<PldNicImpl>(std::move(record)));
    return nics;
}

std::vector<std::shared_ptr<const InterfaceRecord>> ListInterfaces(Store::HostStore& store) {
    return Detail::DecodeShared<InterfaceRecord>(store.ListText(InterfaceRecord::kSection));
}

// What a connection point names, read before a change: a DV port object
// reads the host for its stored connection id, which it may not do inside
// another read or change.
struct PointParts {
    int type = 0;
    std::string portGroup;
    HostCtl::Network::DVPortParam dvPort;
};

PointParts PartsOf(const ConnectionPoint& point) {
    PointParts parts;
    parts.type = point.GetType();
    if (parts.type == ConnectionPoint::TYPE_PORT_GROUP) parts.portGroup = point.GetPortGroupName();
    if (parts.type == ConnectionPoint::TYPE_DV_PORT) parts.dvPort = point.GetDVPortParam();
    return parts;
}

// Where a new interface's port goes, and what the interface records of it.
struct Attachment {
    std::string portset;
    int numPorts = 0;
    std::string portgroup;
    std::string dvswitch;
    std::string dvPortId;
};

[[noreturn]] void PointInUse(const std::string& name) {
    throw HostCtlException("The connection point is already used by interface " + name);
}

// The stored DV port of a point, read to be changed; throws for one the host
// does not have.
Detail::StoredObject<Detail::DvPortRecord> RequireDvPort(Transaction& t, const HostCtl::Network::DVPortParam& param,
                                                         Detail::DvSwitchRecord& dvswitch) {
    auto missing = [&]() -> HostCtlException {
        return HostCtlException("DV port " + param.portId + " does not exist on the distributed switch with UUID " +
                                param.switchUuid);
    };
    const std::vector<Detail::DvSwitchRecord> switches = Detail::List<Detail::DvSwitchRecord>(t);
    const auto owner = std::find_if(switches.begin(), switches.end(), [&](const Detail::DvSwitchRecord& s) {
        return !param.switchUuid.empty() && s.uuid == param.switchUuid;
    });
    if (owner == switches.end() || !Detail::FitsJoinedKey(param.portId)) throw missing();
    auto port = Detail::Find<Detail::DvPortRecord>(t, Detail::DvPortKey(owner->name, param.portId));
    if (!port) throw missing();
    dvswitch = *owner;
    return std::move(*port);
}

// Checks the connection point for a new interface and says where its port
// goes; a DV port takes the point's connection id.
Attachment Attach(Transaction& t, const PointParts& point,
                  const std::vector<std::shared_ptr<const InterfaceRecord>>& interfaces) {
    Attachment attachment;
    switch (point.type) {
        case ConnectionPoint::TYPE_PORT_GROUP: {
            const std::string& name = point.portGroup;
            std::optional<PortGroupRecord> portGroup = Detail::Get<PortGroupRecord>(t, name);
            if (!portGroup) throw HostCtlException("Port group " + name + " does not exist");
            for (const auto& nic : interfaces) {
                if (nic->portgroup == name) PointInUse(nic->name);
            }
            std::optional<VswitchRecord> vswitch = Detail::Get<VswitchRecord>(t, portGroup->vswitch);
            if (!vswitch) throw HostCtlException(HostCtl::Network::UnknownVirtualSwitchMessage(portGroup->vswitch));
            attachment.portset = vswitch->name;
            attachment.numPorts = vswitch->numPorts;
            attachment.portgroup = name;
            return attachment;
        }
        case ConnectionPoint::TYPE_DV_PORT: {
            const HostCtl::Network::DVPortParam& param = point.dvPort;
            Detail::DvSwitchRecord dvswitch;
            Detail::StoredObject<Detail::DvPortRecord> port = RequireDvPort(t, param, dvswitch);
            for (const auto& nic : interfaces) {
                if (nic->dvswitch == dvswitch.name && nic->dvPortId == param.portId) PointInUse(nic->name);
            }
            if (param.connectionId != 0 && param.connectionId != port.record.connectionId) {
                Detail::DvPortRecord connected = port.record;
                connected.connectionId = param.connectionId;
                Detail::Write(t, port, connected);
            }
            attachment.portset = dvswitch.name;
            attachment.numPorts = dvswitch.numPorts;
            attachment.dvswitch = dvswitch.name;
            attachment.dvPortId = param.portId;
            return attachment;
        }
        default:
            throw HostCtlException("An interface can be created only on a port group or a DV port");
    }
}

std::string PickName(const std::string& name, const std::vector<std::shared_ptr<const InterfaceRecord>>& interfaces) {
    if (!name.empty()) {
        if (Detail::InterfaceNumber(name) < 0) {
            throw HostCtlException("Invalid interface name " + name + ": use pld0 to pld255");
        }
        for (const auto& nic : interfaces) {
            if (nic->name == name) throw HostCtlException("Interface " + name + " already exists");
        }
        return name;
    }
    std::set<int> used;
    for (const auto& nic : interfaces) used.insert(Detail::InterfaceNumber(nic->name));
    for (int number = 0; number <= Detail::kMaxInterfaceNumber; ++number) {
        if (!used.count(number)) return "pld" + std::to_string(number);
    }
    throw HostCtlException("No free interface name: pld0 to pld255 are all in use");
}

// The MAC address given, checked, or the lowest free locally administered
// address of the host's own range 02:a1:01:xx:xx:xx.
MacAddress PickMac(const MacAddress& mac, const std::vector<std::shared_ptr<const InterfaceRecord>>& interfaces) {
    std::set<std::string> used;
    for (const auto& nic : interfaces) used.insert(MacAddress(nic->mac).GetStringAddress());
    if (mac.IsSet()) {
        const std::string text = mac.GetStringAddress();
        if (mac.GetBytes()[0] & 0x01) throw HostCtlException("MAC address " + text + " is not a unicast address");
        for (const auto& nic : interfaces) {
            if (MacAddress(nic->mac) == mac) {
                throw HostCtlException("MAC address " + text + " is already used by interface " + nic->name);
            }
        }
        return mac;
    }
    // More interfaces than pld0 to pld255 cannot exist, so a free address is
    // found among the first 257.
    for (std::uint32_t serial = 1;; ++serial) {
        const MacAddress candidate(MacAddress::Bytes{0x02, 0xa1, 0x01, static_cast<std::uint8_t>(serial >> 16),
                                                     static_cast<std::uint8_t>(serial >> 8),
                                                     static_cast<std::uint8_t>(serial)});
        if (!used.count(candidate.GetStringAddress())) return candidate;
    }
}

// The interface connected at `point` on `netstack`, or null.
std::shared_ptr<const InterfaceRecord> ConnectedAt(Store::Transaction& t, const PointParts& point,
                                                   const std::string& netstack) {
    std::string dvswitch;
    if (point.type == ConnectionPoint::TYPE_DV_PORT) {
        for (const Detail::DvSwitchRecord& s : Detail::List<Detail::DvSwitchRecord>(t)) {
            if (!point.dvPort.switchUuid.empty() && s.uuid == point.dvPort.switchUuid) dvswitch = s.name;
        }
        if (dvswitch.empty()) return nullptr;
    }
    for (auto& nic : Detail::DecodeShared<InterfaceRecord>(t.ListChildrenText(InterfaceRecord::kSection, netstack))) {
        const bool here = point.type == ConnectionPoint::TYPE_PORT_GROUP
                              ? !nic->portgroup.empty() && nic->portgroup == point.portGroup
                              : point.type == ConnectionPoint::TYPE_DV_PORT && nic->dvswitch == dvswitch &&
                                    nic->dvPortId == point.dvPort.portId;
        if (here) return nic;
    }
    return nullptr;
}

}  // namespace

std::string PldNicTagIdToName(int tag) {
    if (tag < 1 || tag > static_cast<int>(kTagNames.size())) return std::string();
    return kTagNames[static_cast<std::size_t>(tag - 1)];
}

PldNicTagType PldNicTagNameToId(const std::string& name) {
    for (std::size_t i = 0; i < kTagNames.size(); ++i) {
        if (name == kTagNames[i]) return static_cast<PldNicTagType>(i + 1);
    }
    return HostCtl::Network::PLDNIC_TAG_INVALID;
}

PalladNicInfoImpl::PalladNicInfoImpl() = default;
PalladNicInfoImpl::~PalladNicInfoImpl() = default;

std::unique_ptr<PldNic> PalladNicInfoImpl::AddPalladNic(ConnectionPoint* point, const std::string& netstack,
                                                        const IpConfig& config, const MacAddress& mac, unsigned,
                                                        std::int64_t mtu, const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::AddPalladNic", name);
    if (!point) throw HostCtlException("An interface needs a connection point");
    const PointParts parts = PartsOf(*point);
    std::shared_ptr<const InterfaceRecord> created;
    store.Change([&](Transaction& t) {
        const auto interfaces = Detail::DecodeShared<InterfaceRecord>(t.ListText(InterfaceRecord::kSection));
        const Attachment attachment = Attach(t, parts, interfaces);
        if (!t.Exists(Detail::NetstackRecord::kSection, netstack)) {
            throw HostCtlException(Detail::MissingNetstackMessage(netstack));
        }
        InterfaceRecord nic;
        nic.name = PickName(name, interfaces);
        nic.mac = PickMac(mac, interfaces).GetStringAddress();
        if (mtu != 0) Detail::CheckMtu(mtu, name);
        nic.mtu = static_cast<int>(mtu != 0 ? mtu : kDefaultMtu);

        const std::vector<PortRecord> ports = Detail::ListChildren<PortRecord>(t, attachment.portset);
        if (static_cast<std::int64_t>(ports.size()) >= attachment.numPorts) {
            throw HostCtlException("The port set " + attachment.portset + " has no free port");
        }
        PortRecord port;
        port.id = Detail::NextPortId(t, ports);
        port.portset = attachment.portset;
        port.type = "kernel";
        port.client = nic.name;
        port.portgroup = attachment.portgroup;
        port.dvPortId = attachment.dvPortId;
        // A new port stores only what sets it apart from a free one.
        Store::Json portObject = Store::Json::object();
        Detail::Merge(portObject, PortRecord(), port);
        t.Put(PortRecord::kSection, portObject);

        nic.netstack = netstack;
        nic.portgroup = attachment.portgroup;
        nic.dvswitch = attachment.dvswitch;
        nic.dvPortId = attachment.dvPortId;
        nic.portId = port.id;
        Detail::IpConfigAccess::ToRecord(config, nic);
        Detail::Create(t, nic);
        created = std::make_shared<const InterfaceRecord>(std::move(nic));
    });
    return std::make_unique<PldNicImpl>(std::move(created));
}

void PalladNicInfoImpl::RemovePalladNic(ConnectionPoint* point, const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::RemovePalladNic", netstack);
    const std::optional<PointParts> parts = point ? std::optional<PointParts>(PartsOf(*point)) : std::nullopt;
    store.Change([&](Transaction& t) {
        std::shared_ptr<const InterfaceRecord> nic = parts ? ConnectedAt(t, *parts, netstack) : nullptr;
        if (!nic) {
            throw HostCtlException("No interface is connected to that connection point on netstack " + netstack);
        }
        Detail::RemoveInterface(t, *nic);
    });
}

std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNics() {
    return InNumberOrder(ListInterfaces(Detail::EnterOperation("PalladNicInfoImpl::GetPalladNics")));
}

std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNicsByInstanceKey(const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::GetPalladNicsByInstanceKey", netstack);
    return InNumberOrder(
        Detail::DecodeShared<InterfaceRecord>(store.ListChildrenText(InterfaceRecord::kSection, netstack)));
}

std::vector<std::unique_ptr<PldNic>> PalladNicInfoImpl::GetPalladNicsByTag(PldNicTagType tag) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::GetPalladNicsByTag");
    const std::string name = PldNicTagIdToName(tag);
    std::vector<std::shared_ptr<const InterfaceRecord>> tagged;
    for (auto& nic : ListInterfaces(store)) {
        if (!name.empty() && std::find(nic->tags.begin(), nic->tags.end(), name) != nic->tags.end()) {
            tagged.push_back(std::move(nic));
        }
    }
    return InNumberOrder(std::move(tagged));
}

std::unique_ptr<PldNic> PalladNicInfoImpl::GetPalladNicByInterface(const std::string& name, bool) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::GetPalladNicByInterface", name);
    std::optional<InterfaceRecord> nic = Detail::Get<InterfaceRecord>(store, name);
    if (!nic) return nullptr;
    return std::make_unique<PldNicImpl>(std::make_shared<const InterfaceRecord>(std::move(*nic)));
}

void PalladNicInfoImpl::GetPalladNicNamesByInstanceKey(std::vector<std::string>& names, const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation("PalladNicInfoImpl::GetPalladNicNamesByInstanceKey", netstack);
    names.clear();
    for (const auto& nic : InNumberOrder(
             Detail::DecodeShared<InterfaceRecord>(store.ListChildrenText(InterfaceRecord::kSection, netstack)))) {
        names.push_back(nic->GetName());
    }
}

}  // namespace Network
}  // namespace PldCtl
