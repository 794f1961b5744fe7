#include "system/SystemRecords.h"

#include <algorithm>

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<ModuleRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &ModuleRecord::name),
            Field("loaded", &ModuleRecord::loaded),
            Field("options", &ModuleRecord::options));
    }
};

template <>
struct RecordFields<SystemModulesRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("modules", &SystemModulesRecord::modules));
    }
};

template <>
struct RecordFields<FirewallRuleRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("label", &FirewallRuleRecord::label),
            Field("direction", &FirewallRuleRecord::direction),
            Field("protocol", &FirewallRuleRecord::protocol),
            Field("portType", &FirewallRuleRecord::portType),
            Field("portBegin", &FirewallRuleRecord::portBegin),
            Field("portEnd", &FirewallRuleRecord::portEnd));
    }
};

template <>
struct RecordFields<FirewallRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("enabled", &FirewallRecord::enabled),
            Field("defaultAction", &FirewallRecord::defaultAction),
            Field("rulesetsLoaded", &FirewallRecord::rulesetsLoaded),
            Field("dynamicRules", &FirewallRecord::dynamicRules));
    }
};

template <>
struct RecordFields<FirewallRulesetRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &FirewallRulesetRecord::name),
            Field("enabled", &FirewallRulesetRecord::enabled),
            Field("allowedAll", &FirewallRulesetRecord::allowedAll),
            Field("allowedIps", &FirewallRulesetRecord::allowedIps),
            Field("rules", &FirewallRulesetRecord::rules));
    }
};
// clang-format on

const ModuleRecord* SystemModulesRecord::Find(const std::string& name) const {
    const auto found =
        std::find_if(modules.begin(), modules.end(), [&](const ModuleRecord& module) { return module.name == name; });
    return found == modules.end() ? nullptr : &*found;
}

ModuleRecord* SystemModulesRecord::Find(const std::string& name) {
    return const_cast<ModuleRecord*>(static_cast<const SystemModulesRecord&>(*this).Find(name));
}

HostCtl::System::FirewallRule RuleOf(const FirewallRuleRecord& record) {
    using HostCtl::System::FirewallRule;
    FirewallRule rule;
    rule.label = record.label;
    rule.portType = record.portType == "src" ? FirewallRule::PORT_TYPE_SRC : FirewallRule::PORT_TYPE_DST;
    rule.portBegin = record.portBegin;
    rule.portEnd = record.portEnd ? *record.portEnd : record.portBegin;
    rule.direction =
        record.direction == "outbound" ? FirewallRule::DIRECTION_OUTBOUND : FirewallRule::DIRECTION_INBOUND;
    rule.protocol = record.protocol == "udp" ? FirewallRule::PROTOCOL_UDP : FirewallRule::PROTOCOL_TCP;
    return rule;
}

FirewallRuleRecord RecordOf(const HostCtl::System::FirewallRule& rule) {
    using HostCtl::System::FirewallRule;
    FirewallRuleRecord record;
    record.label = rule.label;
    record.portType = rule.portType == FirewallRule::PORT_TYPE_DST ? "dst" : "src";
    record.portBegin = rule.portBegin;
    record.portEnd = rule.portEnd;
    record.direction = rule.direction == FirewallRule::DIRECTION_INBOUND ? "inbound" : "outbound";
    record.protocol = rule.protocol == FirewallRule::PROTOCOL_TCP ? "tcp" : "udp";
    return record;
}

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::SystemModulesRecord);
STORED_RECORD(PldCtl::Detail::FirewallRecord);
STORED_RECORD(PldCtl::Detail::FirewallRulesetRecord);
