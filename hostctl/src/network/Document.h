// What the network classes of the library share and callers never see: the
// stored objects they are snapshots of, and how policies are stored.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "hostctl/network/vswitch/Policy.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

struct Document {
    Store::Json json;
};

inline std::shared_ptr<Document> MakeDocument(Store::Json json) {
    return std::make_shared<Document>(Document{std::move(json)});
}

struct ListedSwitch {
    std::shared_ptr<Document> document;
    int configuredPorts = 0;
    int usedPorts = 0;
    std::vector<std::shared_ptr<Document>> portGroups;
};

// A policy object of a switch or port group: a field present is a field set.
HostCtl::Network::NicTeamingPolicy TeamingFromJson(const Store::Json& json);
Store::Json TeamingToJson(const HostCtl::Network::NicTeamingPolicy& policy);
HostCtl::Network::PortSecurityPolicy SecurityFromJson(const Store::Json& json);
Store::Json SecurityToJson(const HostCtl::Network::PortSecurityPolicy& policy);
HostCtl::Network::ShapingPolicy ShapingFromJson(const Store::Json& json);
Store::Json ShapingToJson(const HostCtl::Network::ShapingPolicy& policy);

// How each kind of policy is stored: the field of a switch or port group
// object that holds it, and its conversions.
template <typename Policy>
struct StoredPolicy;

template <>
struct StoredPolicy<HostCtl::Network::NicTeamingPolicy> {
    static constexpr const char* kField = "teaming";
    static HostCtl::Network::NicTeamingPolicy FromJson(const Store::Json& j) { return TeamingFromJson(j); }
    static Store::Json ToJson(const HostCtl::Network::NicTeamingPolicy& p) { return TeamingToJson(p); }
};

template <>
struct StoredPolicy<HostCtl::Network::PortSecurityPolicy> {
    static constexpr const char* kField = "security";
    static HostCtl::Network::PortSecurityPolicy FromJson(const Store::Json& j) { return SecurityFromJson(j); }
    static Store::Json ToJson(const HostCtl::Network::PortSecurityPolicy& p) { return SecurityToJson(p); }
};

template <>
struct StoredPolicy<HostCtl::Network::ShapingPolicy> {
    static constexpr const char* kField = "shaping";
    static HostCtl::Network::ShapingPolicy FromJson(const Store::Json& j) { return ShapingFromJson(j); }
    static Store::Json ToJson(const HostCtl::Network::ShapingPolicy& p) { return ShapingToJson(p); }
};

// The policy a stored switch or port group holds itself (for a port group,
// only the fields it overrides are set).
template <typename Policy>
Policy OwnPolicy(const Store::Json& owner) {
    auto it = owner.find(StoredPolicy<Policy>::kField);
    return StoredPolicy<Policy>::FromJson(it == owner.end() ? Store::Json::object() : *it);
}

// A switch's policy, over the defaults, so that a field a hand-written
// profile left out reads as its default.
template <typename Policy>
Policy SwitchPolicy(const Store::Json& vswitch) {
    return Policy::GetDefaultPolicy().OverlaidWith(OwnPolicy<Policy>(vswitch));
}

// The object's field, or `fallback` when it is absent.
template <typename T>
T FieldOr(const Store::Json& object, const char* field, T fallback) {
    auto it = object.find(field);
    return it == object.end() || it->is_null() ? fallback : it->get<T>();
}

}  // namespace Detail
}  // namespace PldCtl
