// Standard switches and port groups over the host store.
//
// Objects are snapshots of stored objects. Every change re-reads the stored
// object inside its own transaction, applies the change, checks the host's
// rules there and writes it back, so concurrent commands never lose each
// other's changes; the snapshot is refreshed from what was written.
#include "hostctl/network/vswitch/SwitchImpl.h"

#include <algorithm>

#include "Operation.h"
#include "network/Document.h"
#include "hostctl/network/ip/PldNic.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "hostctl/Lib.h"

namespace PldCtl {
namespace Network {

using HostCtl::Lib::HostCtlException;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortGroup;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;
using HostCtl::Network::VirtualSwitch;
using Store::FieldTest;
using Store::Json;
using Store::Transaction;

namespace {

constexpr const char* kDefaultSwitchClass = "stdswitch";
constexpr int kDefaultMtu = 1500;
constexpr int kMaxNameLength = 32;
constexpr int kMaxPortGroupNameLength = 64;
// Port ids come in blocks of 2^24, one block a switch.
constexpr std::int64_t kPortBlock = std::int64_t(1) << 24;

Json RequireSwitch(Transaction& t, const std::string& name) {
    std::optional<Json> vswitch = t.Get("vswitches", name);
    if (!vswitch) throw HostCtlException(HostCtl::Network::UnknownVirtualSwitchMessage(name));
    return *vswitch;
}

Json RequirePortGroup(Transaction& t, const std::string& name) {
    std::optional<Json> portGroup = t.Get("portgroups", name);
    if (!portGroup) throw HostCtlException(HostCtl::Network::UnknownPortGroupMessage(name));
    return *portGroup;
}

// Switch names are short words; they name tables' rows and appear in
// other objects, so no blanks or separators.
void CheckSwitchName(const std::string& name) {
    const bool fits = !name.empty() && name.size() <= kMaxNameLength &&
                      std::all_of(name.begin(), name.end(),
                                  [](unsigned char c) { return std::isalnum(c) || c == '-' || c == '_' || c == '.'; });
    if (!fits) {
        throw HostCtlException("Invalid virtual switch name '" + name + "': use 1 to " +
                               std::to_string(kMaxNameLength) + " letters, digits, '.', '-' or '_'");
    }
}

// Port group names may hold blanks ("VM Network") but no control characters.
void CheckPortGroupName(const std::string& name) {
    const bool fits = !name.empty() && name.size() <= kMaxPortGroupNameLength && name.front() != ' ' &&
                      name.back() != ' ' &&
                      std::none_of(name.begin(), name.end(), [](unsigned char c) { return c < 0x20 || c == 0x7f; });
    if (!fits) {
        throw HostCtlException("Invalid port group name '" + name + "': use 1 to " +
                               std::to_string(kMaxPortGroupNameLength) +
                               " printable characters, not beginning or ending with a blank");
    }
}

// The clients of a switch's ports that pass `keep`, for messages.
template <typename Keep>
std::string ClientsOf(Transaction& t, const std::string& vswitch, Keep keep) {
    std::string clients;
    for (const Json& port : t.ListChildren("ports", vswitch)) {
        const std::string client = Detail::FieldOr<std::string>(port, "client", "");
        if (!client.empty() && keep(port)) clients += (clients.empty() ? "" : ", ") + client;
    }
    return clients;
}

// Applies `edit` to the stored switch inside one change and returns what
// was written.
template <typename Edit>
std::shared_ptr<Detail::Document> ChangeSwitch(const char* operation, const std::string& name, Edit edit) {
    Store::HostStore& store = Detail::EnterOperation(operation, name);
    Json written;
    store.Change([&](Transaction& t) {
        Json vswitch = RequireSwitch(t, name);
        edit(t, vswitch);
        t.Put("vswitches", vswitch);
        written = vswitch;
    });
    return Detail::MakeDocument(std::move(written));
}

// The same for a stored port group.
template <typename Edit>
std::shared_ptr<Detail::Document> ChangePortGroup(const char* operation, const std::string& name, Edit edit) {
    Store::HostStore& store = Detail::EnterOperation(operation, name);
    Json written;
    store.Change([&](Transaction& t) {
        Json portGroup = RequirePortGroup(t, name);
        edit(t, portGroup);
        t.Put("portgroups", portGroup);
        written = portGroup;
    });
    return Detail::MakeDocument(std::move(written));
}

std::vector<std::string> Names(const Json& array) {
    return array.is_array() ? array.get<std::vector<std::string>>() : std::vector<std::string>();
}

// Takes `nic` out of a stored teaming policy's uplink order, keeping the
// active count pointing at the same active uplinks.
void DropFromOrder(Json& owner, const std::string& nic) {
    auto teaming = owner.find("teaming");
    if (teaming == owner.end() || !teaming->contains("uplinkOrder")) return;
    std::vector<std::string> order = Names((*teaming)["uplinkOrder"]);
    auto at = std::find(order.begin(), order.end(), nic);
    if (at == order.end()) return;
    const int position = static_cast<int>(at - order.begin());
    order.erase(at);
    (*teaming)["uplinkOrder"] = order;
    if (teaming->contains("maxActive") && position < (*teaming)["maxActive"].get<int>()) {
        (*teaming)["maxActive"] = (*teaming)["maxActive"].get<int>() - 1;
    }
}

// Writes into `stored` the fields in which `edited` differs from `base`, the
// policy the caller started from (a field only `base` has is removed). A
// command reads a policy, edits it and writes it back; merging only its own
// edits into what is stored now keeps the edits of a command that ran in
// between, instead of writing over them with the old values.
void MergeEdits(Json& stored, const Json& base, const Json& edited) {
    if (!stored.is_object()) stored = Json::object();
    for (auto field = edited.begin(); field != edited.end(); ++field) {
        auto before = base.find(field.key());
        if (before == base.end() || *before != field.value()) stored[field.key()] = field.value();
    }
    for (auto field = base.begin(); field != base.end(); ++field) {
        if (!edited.contains(field.key())) stored.erase(field.key());
    }
}

// A change of a stored switch that applies the edits `policy` made to the
// switch's policy of that kind as the snapshot `base` had it.
template <typename Policy>
auto EditSwitchPolicy(const Json& base, const Policy& policy) {
    return [&base, &policy](Transaction&, Json& vswitch) {
        using Stored = Detail::StoredPolicy<Policy>;
        const Policy before = Detail::SwitchPolicy<Policy>(base);
        Json merged = Stored::ToJson(Detail::SwitchPolicy<Policy>(vswitch));
        MergeEdits(merged, Stored::ToJson(before), Stored::ToJson(before.OverlaidWith(policy)));
        vswitch[Stored::kField] = merged;
    };
}

// A port group's policy in force: its switch's with its own fields over it.
// A field the switch does not store stays unset here (its getter still
// answers the default), so a port group can tell a value its switch really
// has from one nobody gave.
template <typename Policy>
Policy InForce(const Json& vswitch, const Json& portGroup) {
    return Detail::OwnPolicy<Policy>(vswitch).OverlaidWith(Detail::OwnPolicy<Policy>(portGroup));
}

// Applies to a port group's own policy of that kind the edits `policy` made
// to it as the snapshot `base` had it.
template <typename Policy>
std::shared_ptr<Detail::Document> WriteOwnPolicy(const char* operation, const Json& base, const Policy& policy) {
    using Stored = Detail::StoredPolicy<Policy>;
    return ChangePortGroup(operation, base.value("name", ""), [&](Transaction&, Json& p) {
        Json merged = Stored::ToJson(Detail::OwnPolicy<Policy>(p));
        MergeEdits(merged, Stored::ToJson(Detail::OwnPolicy<Policy>(base)), Stored::ToJson(policy));
        p[Stored::kField] = merged;
    });
}

}  // namespace

// ---------------------------------------------------------------- PortsetImpl

PortsetImpl::PortsetImpl(std::shared_ptr<Detail::Document> document, std::optional<std::pair<int, int>> portCounts)
    : document_(std::move(document)), portCounts_(portCounts) {}

PortsetImpl::~PortsetImpl() = default;

void PortsetImpl::Refresh(std::shared_ptr<Detail::Document> document) {
    document_ = std::move(document);
    portCounts_.reset();
}

bool PortsetImpl::IsValidVirtualSwitch(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::IsValidVirtualSwitch", name);
    return store.Get("vswitches", name).has_value();
}

std::string PortsetImpl::GetName() const {
    return document_->json.value("name", "");
}

std::string PortsetImpl::GetClassName() const {
    return document_->json.value("class", kDefaultSwitchClass);
}

int PortsetImpl::GetNumPorts() const {
    return document_->json.value("numPorts", static_cast<int>(HostCtl::Network::Portset::DEF_NUM_PORTS));
}

const std::pair<int, int>& PortsetImpl::PortCounts() const {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::GetPortCounts", GetName());
    if (!portCounts_) {
        const int configured = static_cast<int>(store.CountChildren("ports", GetName()));
        const int used = static_cast<int>(store.CountChildren("ports", GetName(), {FieldTest{"client", std::nullopt}}));
        portCounts_ = std::make_pair(configured, used);
    }
    return *portCounts_;
}

int PortsetImpl::GetNumUsedPorts() const {
    return PortCounts().second;
}

int PortsetImpl::GetNumConfiguredPorts() const {
    return PortCounts().first;
}

std::vector<std::string> PortsetImpl::GetUplinks() const {
    return Names(document_->json.value("uplinks", Json::array()));
}

// ---------------------------------------------------------- VirtualSwitchImpl

VirtualSwitchImpl::VirtualSwitchImpl(std::shared_ptr<Detail::Document> document) : PortsetImpl(std::move(document)) {}

VirtualSwitchImpl::VirtualSwitchImpl(const Detail::ListedSwitch& listed)
    : PortsetImpl(listed.document, std::make_pair(listed.configuredPorts, listed.usedPorts)),
      portGroups_(listed.portGroups) {}

VirtualSwitchImpl::~VirtualSwitchImpl() = default;

int VirtualSwitchImpl::GetMTU() const {
    return document_->json.value("mtu", kDefaultMtu);
}

void VirtualSwitchImpl::SetMTU(long long mtu) {
    using HostCtl::Network::PldNic;
    if (mtu < PldNic::MIN_MTU || mtu > PldNic::MAX_MTU) {
        throw HostCtlException("Invalid MTU " + std::to_string(mtu) + " for virtual switch " + GetName() +
                               ": it must be between " + std::to_string(PldNic::MIN_MTU) + " and " +
                               std::to_string(PldNic::MAX_MTU));
    }
    Refresh(ChangeSwitch("VirtualSwitchImpl::SetMTU", GetName(), [&](Transaction&, Json& s) { s["mtu"] = mtu; }));
}

std::string VirtualSwitchImpl::GetCDPStatus() const {
    return document_->json.value("cdp", "listen");
}

void VirtualSwitchImpl::SetCDPStatus(int index) {
    if (index < 0 || index > 3) throw HostCtlException("Invalid CDP status index " + std::to_string(index));
    Refresh(ChangeSwitch("VirtualSwitchImpl::SetCDPStatus", GetName(),
                         [&](Transaction&, Json& s) { s["cdp"] = HostCtl::Network::kCdpStatusWords[static_cast<std::size_t>(index)]; }));
}

bool VirtualSwitchImpl::IsBeaconEnabled() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(document_->json).GetLinkCriteria().IsBeaconChecking();
}

int VirtualSwitchImpl::GetBeaconInterval() const {
    return Detail::FieldOr<int>(document_->json.value("beacon", Json::object()), "interval", 1);
}

int VirtualSwitchImpl::GetBeaconThreshold() const {
    return Detail::FieldOr<int>(document_->json.value("beacon", Json::object()), "threshold", 3);
}

const std::vector<std::shared_ptr<Detail::Document>>& VirtualSwitchImpl::PortGroupDocuments() const {
    if (!portGroups_) {
        Store::HostStore& store = Store::HostStore::Default();
        std::vector<std::shared_ptr<Detail::Document>> documents;
        for (Json& portGroup : store.ListChildren("portgroups", GetName())) {
            documents.push_back(Detail::MakeDocument(std::move(portGroup)));
        }
        portGroups_ = std::move(documents);
    }
    return *portGroups_;
}

std::vector<std::string> VirtualSwitchImpl::GetBeaconRequiredBy() const {
    // Each operation stays a place a fault can be injected, also when a
    // listing already read what it needs.
    Detail::EnterOperation("VirtualSwitchImpl::GetBeaconRequiredBy", GetName());
    const NicTeamingPolicy switchPolicy = Detail::SwitchPolicy<NicTeamingPolicy>(document_->json);
    std::vector<std::string> names;
    for (const auto& portGroup : PortGroupDocuments()) {
        const NicTeamingPolicy own = Detail::OwnPolicy<NicTeamingPolicy>(portGroup->json);
        if (switchPolicy.OverlaidWith(own).GetLinkCriteria().IsBeaconChecking()) {
            names.push_back(portGroup->json.value("name", ""));
        }
    }
    return names;
}

std::vector<std::unique_ptr<PortGroup>> VirtualSwitchImpl::GetPortGroups() const {
    Detail::EnterOperation("VirtualSwitchImpl::GetPortGroups", GetName());
    std::vector<std::unique_ptr<PortGroup>> portGroups;
    for (const auto& portGroup : PortGroupDocuments()) {
        // Each object gets its own copy: callers may change them.
        portGroups.push_back(std::make_unique<PortGroupImpl>(Detail::MakeDocument(portGroup->json)));
    }
    return portGroups;
}

std::unique_ptr<PortGroup> VirtualSwitchImpl::AddPortGroup(const std::string& name) {
    CheckPortGroupName(name);
    Json created = {{"name", name}, {"vswitch", GetName()}, {"vlanId", 0}};
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchImpl::AddPortGroup", GetName());
    store.Change([&](Transaction& t) {
        RequireSwitch(t, GetName());
        if (std::optional<Json> existing = t.Get("portgroups", name)) {
            throw HostCtlException("A port group with the name " + name + " already exists on virtual switch " +
                                   existing->value("vswitch", ""));
        }
        t.Put("portgroups", created);
    });
    portGroups_.reset();
    return std::make_unique<PortGroupImpl>(Detail::MakeDocument(created));
}

void VirtualSwitchImpl::RemovePortGroup(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchImpl::RemovePortGroup", GetName());
    store.Change([&](Transaction& t) {
        RequireSwitch(t, GetName());
        std::optional<Json> portGroup = t.Get("portgroups", name);
        if (!portGroup || portGroup->value("vswitch", "") != GetName()) {
            throw HostCtlException("Unable to find port group " + name + " on virtual switch " + GetName());
        }
        const std::vector<FieldTest> inUse = {FieldTest{"portgroup", name}, FieldTest{"client", std::nullopt}};
        if (t.CountChildren("ports", GetName(), inUse) > 0) {
            throw HostCtlException("Unable to remove port group " + name + ": it is in use by " +
                                   ClientsOf(t, GetName(), [&](const Json& port) {
                                       return Detail::FieldOr<std::string>(port, "portgroup", "") == name;
                                   }));
        }
        t.Remove("portgroups", name);
    });
    portGroups_.reset();
}

void VirtualSwitchImpl::AddUplink(const std::string& nic) {
    Refresh(ChangeSwitch("VirtualSwitchImpl::AddUplink", GetName(), [&](Transaction& t, Json& s) {
        std::optional<Json> pnic = t.Get("nics", nic);
        if (!pnic)
            throw HostCtlException("Unable to add uplink " + nic + ": the host has no physical NIC of that name");
        for (const char* section : {"vswitches", "dvswitches"}) {
            for (const Json& other : t.List(section)) {
                const auto uplinks = Names(other.value("uplinks", Json::array()));
                if (std::find(uplinks.begin(), uplinks.end(), nic) != uplinks.end()) {
                    throw HostCtlException("Unable to add uplink " + nic + ": it is already an uplink of " +
                                           other.value("name", ""));
                }
            }
        }
        const std::string name = GetName();
        const std::int64_t configured = t.CountChildren("ports", name);
        if (configured >= s.value("numPorts", HostCtl::Network::Portset::DEF_NUM_PORTS)) {
            throw HostCtlException("Unable to add uplink " + nic + ": virtual switch " + name + " has no free port");
        }
        // The next id of the switch's own block, or the first of a new block.
        std::int64_t id = 0;
        for (const Json& port : t.ListChildren("ports", name)) id = std::max(id, port.value("id", std::int64_t(0)));
        id = id ? id + 1 : (t.MaxIntegerKey("ports") / kPortBlock + 1) * kPortBlock + 1;
        t.Put("ports", Json{{"id", id}, {"portset", name}, {"type", "uplink"}, {"client", nic}});
        (*pnic)["uplinkPortId"] = id;
        t.Put("nics", *pnic);
        s["uplinks"].push_back(nic);
    }));
}

void VirtualSwitchImpl::RemoveUplink(const std::string& nic, bool removeFromPolicies) {
    Refresh(ChangeSwitch("VirtualSwitchImpl::RemoveUplink", GetName(), [&](Transaction& t, Json& s) {
        std::vector<std::string> uplinks = Names(s.value("uplinks", Json::array()));
        auto at = std::find(uplinks.begin(), uplinks.end(), nic);
        if (at == uplinks.end()) {
            throw HostCtlException("Unable to remove uplink " + nic + ": it is not an uplink of virtual switch " +
                                   GetName());
        }
        uplinks.erase(at);
        s["uplinks"] = uplinks;
        for (const Json& port : t.ListChildren("ports", GetName())) {
            if (port.value("type", "") == "uplink" && port.value("client", "") == nic) {
                t.Remove("ports", std::to_string(port.value("id", std::int64_t(0))));
            }
        }
        if (std::optional<Json> pnic = t.Get("nics", nic)) {
            (*pnic)["uplinkPortId"] = 0;
            t.Put("nics", *pnic);
        }
        if (removeFromPolicies) {
            DropFromOrder(s, nic);
            for (Json portGroup : t.ListChildren("portgroups", GetName())) {
                DropFromOrder(portGroup, nic);
                t.Put("portgroups", portGroup);
            }
        }
    }));
}

NicTeamingPolicy VirtualSwitchImpl::GetTeamingPolicy() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(document_->json);
}

NicTeamingPolicy VirtualSwitchImpl::GetConfiguredTeamingPolicy() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(document_->json);
}

void VirtualSwitchImpl::SetTeamingPolicy(const NicTeamingPolicy& policy) {
    const std::vector<std::string> order = policy.GetUplinkOrder();
    std::vector<std::string> sorted = order;
    std::sort(sorted.begin(), sorted.end());
    if (std::adjacent_find(sorted.begin(), sorted.end()) != sorted.end()) {
        throw HostCtlException("Invalid failover policy for virtual switch " + GetName() +
                               ": an uplink appears more than once in its order");
    }
    Refresh(ChangeSwitch("VirtualSwitchImpl::SetTeamingPolicy", GetName(), EditSwitchPolicy(document_->json, policy)));
}

PortSecurityPolicy VirtualSwitchImpl::GetSecurityPolicy() const {
    return Detail::SwitchPolicy<PortSecurityPolicy>(document_->json);
}

void VirtualSwitchImpl::SetSecurityPolicy(const PortSecurityPolicy& policy) {
    Refresh(ChangeSwitch("VirtualSwitchImpl::SetSecurityPolicy", GetName(), EditSwitchPolicy(document_->json, policy)));
}

ShapingPolicy VirtualSwitchImpl::GetShapingPolicy() const {
    return Detail::SwitchPolicy<ShapingPolicy>(document_->json);
}

void VirtualSwitchImpl::SetShapingPolicy(const ShapingPolicy& policy) {
    Refresh(ChangeSwitch("VirtualSwitchImpl::SetShapingPolicy", GetName(), EditSwitchPolicy(document_->json, policy)));
}

// -------------------------------------------------------------- PortGroupImpl

PortGroupImpl::PortGroupImpl(const std::string& name) : name_(name) {}

PortGroupImpl::PortGroupImpl(std::shared_ptr<Detail::Document> document, std::optional<int> activeClients)
    : name_(document->json.value("name", "")), document_(std::move(document)), activeClients_(activeClients) {}

PortGroupImpl::~PortGroupImpl() = default;

const Detail::Document& PortGroupImpl::Stored() const {
    if (!document_) {
        Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::Get", name_);
        std::optional<Json> portGroup = store.Get("portgroups", name_);
        if (!portGroup) throw HostCtlException(HostCtl::Network::UnknownPortGroupMessage(name_));
        document_ = Detail::MakeDocument(std::move(*portGroup));
    }
    return *document_;
}

std::shared_ptr<Detail::Document> PortGroupImpl::SwitchDocument() const {
    const std::string vswitch = GetVirtualSwitchName();
    Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::GetVirtualSwitch", name_);
    std::optional<Json> stored = store.Get("vswitches", vswitch);
    if (!stored) throw HostCtlException(HostCtl::Network::UnknownVirtualSwitchMessage(vswitch));
    return Detail::MakeDocument(std::move(*stored));
}

int PortGroupImpl::GetActiveClients() const {
    Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::GetActiveClients", name_);
    if (activeClients_) return *activeClients_;
    return static_cast<int>(store.CountChildren("ports", GetVirtualSwitchName(),
                                                {FieldTest{"portgroup", name_}, FieldTest{"client", std::nullopt}}));
}

std::string PortGroupImpl::GetName() const {
    return name_;
}

std::string PortGroupImpl::GetVirtualSwitchName() const {
    return Stored().json.value("vswitch", "");
}

std::unique_ptr<VirtualSwitch> PortGroupImpl::GetVirtualSwitch() const {
    return std::make_unique<VirtualSwitchImpl>(SwitchDocument());
}

int PortGroupImpl::GetVlanId() const {
    return Stored().json.value("vlanId", 0);
}

void PortGroupImpl::SetVlanId(long long vlanId) {
    if (vlanId < MIN_VLAN_ID || vlanId > MAX_VLAN_ID) {
        throw HostCtlException("Invalid VLAN ID " + std::to_string(vlanId) + ": it must be between " +
                               std::to_string(MIN_VLAN_ID) + " and " + std::to_string(MAX_VLAN_ID));
    }
    document_ =
        (ChangePortGroup("PortGroupImpl::SetVlanId", name_, [&](Transaction&, Json& p) { p["vlanId"] = vlanId; }));
}

NicTeamingPolicy PortGroupImpl::GetTeamingPolicy() const {
    return InForce<NicTeamingPolicy>(SwitchDocument()->json, Stored().json);
}
NicTeamingPolicy PortGroupImpl::GetOwnTeamingPolicy() const {
    return Detail::OwnPolicy<NicTeamingPolicy>(Stored().json);
}
void PortGroupImpl::SetOwnTeamingPolicy(const NicTeamingPolicy& policy) {
    document_ = WriteOwnPolicy("PortGroupImpl::SetOwnTeamingPolicy", Stored().json, policy);
}

PortSecurityPolicy PortGroupImpl::GetSecurityPolicy() const {
    return InForce<PortSecurityPolicy>(SwitchDocument()->json, Stored().json);
}
PortSecurityPolicy PortGroupImpl::GetOwnSecurityPolicy() const {
    return Detail::OwnPolicy<PortSecurityPolicy>(Stored().json);
}
void PortGroupImpl::SetOwnSecurityPolicy(const PortSecurityPolicy& policy) {
    document_ = WriteOwnPolicy("PortGroupImpl::SetOwnSecurityPolicy", Stored().json, policy);
}

ShapingPolicy PortGroupImpl::GetShapingPolicy() const {
    return InForce<ShapingPolicy>(SwitchDocument()->json, Stored().json);
}
ShapingPolicy PortGroupImpl::GetOwnShapingPolicy() const {
    return Detail::OwnPolicy<ShapingPolicy>(Stored().json);
}
void PortGroupImpl::SetOwnShapingPolicy(const ShapingPolicy& policy) {
    document_ = WriteOwnPolicy("PortGroupImpl::SetOwnShapingPolicy", Stored().json, policy);
}

// ------------------------------------------------------ VirtualSwitchInfoImpl

VirtualSwitchInfoImpl::VirtualSwitchInfoImpl() = default;

VirtualSwitchInfoImpl::~VirtualSwitchInfoImpl() = default;

std::vector<std::unique_ptr<VirtualSwitch>> VirtualSwitchInfoImpl::GetVirtualSwitches() {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetVirtualSwitches");
    // One pass over each collection for all switches, instead of a few
    // queries per switch: listing a thousand switches stays quick.
    std::vector<Detail::ListedSwitch> listed;
    store.Read([&](Transaction& t) {
        const auto configured = t.CountByParent("ports", {});
        const auto used = t.CountByParent("ports", {FieldTest{"client", std::nullopt}});
        std::map<std::string, std::vector<std::shared_ptr<Detail::Document>>> portGroups;
        for (Json& portGroup : t.ListByParentOrder("portgroups")) {
            const std::string vswitch = portGroup.value("vswitch", "");
            portGroups[vswitch].push_back(Detail::MakeDocument(std::move(portGroup)));
        }
        auto countOf = [](const std::map<std::string, std::int64_t>& counts, const std::string& name) {
            auto it = counts.find(name);
            return it == counts.end() ? 0 : static_cast<int>(it->second);
        };
        for (Json& vswitch : t.List("vswitches")) {
            const std::string name = vswitch.value("name", "");
            listed.push_back(Detail::ListedSwitch{Detail::MakeDocument(std::move(vswitch)), countOf(configured, name),
                                                  countOf(used, name), std::move(portGroups[name])});
        }
    });
    std::vector<std::unique_ptr<VirtualSwitch>> switches;
    for (const auto& entry : listed) switches.push_back(std::make_unique<VirtualSwitchImpl>(entry));
    return switches;
}

std::unique_ptr<VirtualSwitch> VirtualSwitchInfoImpl::GetVirtualSwitchByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetVirtualSwitchByName", name);
    std::optional<Json> vswitch = store.Get("vswitches", name);
    if (!vswitch) return nullptr;
    return std::make_unique<VirtualSwitchImpl>(Detail::MakeDocument(std::move(*vswitch)));
}

std::unique_ptr<VirtualSwitch> VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy(
    const NicTeamingPolicy& teaming, const PortSecurityPolicy& security, const ShapingPolicy& shaping,
    const HostCtl::Network::NicCapabilities& capabilities, const std::string& name, long long numPorts) {
    CheckSwitchName(name);
    if (numPorts < 1 || numPorts > HostCtl::Network::Portset::MAX_NUM_PORTS) {
        throw HostCtlException("Invalid number of ports " + std::to_string(numPorts) + ": a virtual switch has 1 to " +
                               std::to_string(HostCtl::Network::Portset::MAX_NUM_PORTS) + " ports");
    }
    Json created = {
        {"name", name},
        {"class", kDefaultSwitchClass},
        {"numPorts", numPorts},
        {"mtu", kDefaultMtu},
        {"cdp", "listen"},
        {"beacon", {{"interval", 1}, {"threshold", 3}}},
        {"uplinks", Json::array()},
        {"teaming", Detail::TeamingToJson(NicTeamingPolicy::GetDefaultPolicy().OverlaidWith(teaming))},
        {"security", Detail::SecurityToJson(PortSecurityPolicy::GetDefaultPolicy().OverlaidWith(security))},
        {"shaping", Detail::ShapingToJson(ShapingPolicy::GetDefaultPolicy().OverlaidWith(shaping))},
        {"capabilities",
         {{"checksumOffload", capabilities.GetChecksumOffload()},
          {"segmentationOffload", capabilities.GetSegmentationOffload()},
          {"vlanTagging", capabilities.GetVlanTagging()}}},
    };
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy", name);
    store.Change([&](Transaction& t) {
        if (t.Exists("vswitches", name) || t.Exists("dvswitches", name)) {
            throw HostCtlException("A virtual switch with the name " + name + " already exists");
        }
        const std::int64_t limit = t.GetSingleton("system").value("maxPorts", HostCtl::Network::kMaxHostPorts);
        const std::int64_t allocated = t.SumField("vswitches", "numPorts", HostCtl::Network::Portset::DEF_NUM_PORTS) +
                                       t.SumField("dvswitches", "numPorts", HostCtl::Network::Portset::DEF_NUM_PORTS);
        if (allocated + numPorts > limit) {
            throw HostCtlException("Unable to create virtual switch " + name + " with " + std::to_string(numPorts) +
                                   (numPorts == 1 ? " port: " : " ports: ") + std::to_string(allocated) +
                                   " of the host's " + std::to_string(limit) + " ports are allocated already");
        }
        t.Put("vswitches", created);
    });
    return std::make_unique<VirtualSwitchImpl>(Detail::MakeDocument(created));
}

void VirtualSwitchInfoImpl::RemoveVirtualSwitch(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::RemoveVirtualSwitch", name);
    store.Change([&](Transaction& t) {
        const Json vswitch = RequireSwitch(t, name);
        const std::int64_t used = t.CountChildren("ports", name, {FieldTest{"client", std::nullopt}});
        const std::int64_t uplinksUsed =
            t.CountChildren("ports", name, {FieldTest{"client", std::nullopt}, FieldTest{"type", "uplink"}});
        if (used > uplinksUsed) {
            throw HostCtlException(
                "Unable to remove virtual switch " + name + ": its ports are in use by " +
                ClientsOf(t, name, [](const Json& port) { return port.value("type", "") != "uplink"; }));
        }
        for (const std::string& nic : Names(vswitch.value("uplinks", Json::array()))) {
            if (std::optional<Json> pnic = t.Get("nics", nic)) {
                (*pnic)["uplinkPortId"] = 0;
                t.Put("nics", *pnic);
            }
        }
        t.RemoveChildren("ports", name);
        t.RemoveChildren("portgroups", name);
        t.Remove("vswitches", name);
    });
}

}  // namespace Network
}  // namespace PldCtl
