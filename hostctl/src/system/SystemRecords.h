// The stored records of the firewall room: the kernel modules of `system`,
// the `firewall` singleton and the `firewallRulesets` collection, with the
// translation between a stored rule and the library's FirewallRule.
// Defaults are the member initialisers; docs/host-profile.md describes the
// same fields for profile writers.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "hostctl/system/FirewallRule.h"
#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct ModuleRecord {
    std::string name;
    bool loaded = false;
    std::string options;
};

// Only the `modules` field of the `system` singleton: its other fields are
// the network room's (SystemRecord) and a write of this record leaves them
// as they are.
struct SystemModulesRecord {
    static constexpr const char* kSingleton = Store::Section::kSystem;

    std::vector<ModuleRecord> modules;

    // The module of that name, or nullptr when the host does not know it.
    const ModuleRecord* Find(const std::string& name) const;
    ModuleRecord* Find(const std::string& name);
    bool IsLoaded(const std::string& name) const {
        const ModuleRecord* module = Find(name);
        return module && module->loaded;
    }
};

// A port rule as stored: the codes are words ("dst"/"src",
// "inbound"/"outbound", "tcp"/"udp"); an unset end is the first port.
struct FirewallRuleRecord {
    std::string label;
    std::string direction = "inbound";
    std::string protocol = "tcp";
    std::string portType = "dst";
    int portBegin = 0;
    std::optional<int> portEnd;
};

struct FirewallRecord {
    static constexpr const char* kSingleton = Store::Section::kFirewall;

    bool enabled = true;
    std::string defaultAction = "DROP";  // "PASS" or "DROP"
    bool rulesetsLoaded = true;
    std::vector<FirewallRuleRecord> dynamicRules;
};

struct FirewallRulesetRecord {
    static constexpr const char* kSection = Store::Section::kFirewallRulesets;

    std::string name;
    bool enabled = false;
    bool allowedAll = true;
    // Canonical address or network text, in the order added.
    std::vector<std::string> allowedIps;
    std::vector<FirewallRuleRecord> rules;
};

HostCtl::System::FirewallRule RuleOf(const FirewallRuleRecord& record);
FirewallRuleRecord RecordOf(const HostCtl::System::FirewallRule& rule);

}  // namespace Detail
}  // namespace PldCtl
