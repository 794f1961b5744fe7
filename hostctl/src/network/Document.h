// What the network classes of the library share and callers never see: the
// stored objects they are snapshots of, and how policies are stored.
#pragma once

#include <memory>
#include <string>

#include "hostctl/network/Policy.h"
#include "hostctl/store/HostStore.h"

namespace PldCtl {
namespace Detail {

struct Document {
    Store::Json json;
};

inline std::shared_ptr<Document> MakeDocument(Store::Json json) {
    return std::make_shared<Document>(Document{std::move(json)});
}

// A policy object of a switch or port group: a field present is a field set.
HostCtl::Network::NicTeamingPolicy TeamingFromJson(const Store::Json& json);
Store::Json TeamingToJson(const HostCtl::Network::NicTeamingPolicy& policy);
HostCtl::Network::PortSecurityPolicy SecurityFromJson(const Store::Json& json);
Store::Json SecurityToJson(const HostCtl::Network::PortSecurityPolicy& policy);
HostCtl::Network::ShapingPolicy ShapingFromJson(const Store::Json& json);
Store::Json ShapingToJson(const HostCtl::Network::ShapingPolicy& policy);

// The policies a switch's stored object holds, each over the defaults, so a
// field a hand-written profile left out reads as its default.
HostCtl::Network::NicTeamingPolicy SwitchTeaming(const Store::Json& vswitch);
HostCtl::Network::PortSecurityPolicy SwitchSecurity(const Store::Json& vswitch);
HostCtl::Network::ShapingPolicy SwitchShaping(const Store::Json& vswitch);

// The object's field, or `fallback` when it is absent.
template <typename T>
T FieldOr(const Store::Json& object, const char* field, T fallback) {
    auto it = object.find(field);
    return it == object.end() || it->is_null() ? fallback : it->get<T>();
}

}  // namespace Detail
}  // namespace PldCtl
