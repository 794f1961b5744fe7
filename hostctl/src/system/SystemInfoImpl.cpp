// The firewall state over the host store: the `firewall` singleton, read
// together with the module's entry of `system` so that every answer and
// every change sees the module as it is stored at that moment.
#include "hostctl/system/SystemInfoImpl.h"

#include <functional>
#include <utility>

#include "Operation.h"
#include "system/FirewallRulesetImpl.h"
#include "system/SystemRecords.h"

namespace PldCtl {
namespace System {

using Detail::FirewallRecord;
using Detail::FirewallRulesetRecord;
using Detail::StoredObject;
using Detail::SystemModulesRecord;
using HostCtl::Lib::HostCtlException;
using HostCtl::System::FirewallRule;

namespace {

const char kPass[] = "PASS";
const char kDrop[] = "DROP";

void RequireModule(const SystemModulesRecord& system) {
    if (!system.IsLoaded(kFirewallModule)) {
        throw HostCtlException(std::string("The firewall module ") + kFirewallModule + " is not loaded");
    }
}

// The firewall as stored, in one read, once its module is found loaded.
FirewallRecord ReadFirewall(Store::HostStore& store) {
    FirewallRecord firewall;
    store.Read([&](Store::Transaction& t) {
        RequireModule(Detail::GetSingleton<SystemModulesRecord>(t));
        firewall = Detail::GetSingleton<FirewallRecord>(t);
    });
    return firewall;
}

// One change of the firewall; with `needsModule`, refused while the module
// is not loaded, else left undone then.
void ChangeFirewall(Store::HostStore& store, bool needsModule, const std::function<void(FirewallRecord&)>& edit) {
    store.Change([&](Store::Transaction& t) {
        const SystemModulesRecord system = Detail::GetSingleton<SystemModulesRecord>(t);
        if (!system.IsLoaded(kFirewallModule)) {
            if (needsModule) RequireModule(system);
            return;
        }
        StoredObject<FirewallRecord> stored = Detail::FindSingleton<FirewallRecord>(t);
        FirewallRecord edited = stored.record;
        edit(edited);
        Detail::WriteSingleton(t, stored, edited);
    });
}

void CheckPort(const char* which, int port) {
    if (port < 0 || port > 65535) {
        throw HostCtlException(std::string("Invalid firewall rule: ") + which + " " + std::to_string(port) +
                               " is not a port from 0 to 65535");
    }
}

}  // namespace

SystemInfoImpl::SystemInfoImpl() = default;
SystemInfoImpl::~SystemInfoImpl() = default;

bool SystemInfoImpl::IsFirewallEnabled() {
    return ReadFirewall(Detail::EnterOperation("SystemInfoImpl::IsFirewallEnabled")).enabled;
}

bool SystemInfoImpl::GetFirewallDefaultAction() {
    return ReadFirewall(Detail::EnterOperation("SystemInfoImpl::GetFirewallDefaultAction")).defaultAction == kPass;
}

void SystemInfoImpl::SetFirewallEnabled(bool enabled) {
    ChangeFirewall(Detail::EnterOperation("SystemInfoImpl::SetFirewallEnabled"), true,
                   [&](FirewallRecord& firewall) { firewall.enabled = enabled; });
}

void SystemInfoImpl::SetFirewallDefaultAction(bool pass) {
    ChangeFirewall(Detail::EnterOperation("SystemInfoImpl::SetFirewallDefaultAction"), true,
                   [&](FirewallRecord& firewall) { firewall.defaultAction = pass ? kPass : kDrop; });
}

void SystemInfoImpl::LoadFirewallRulesets() {
    ChangeFirewall(Detail::EnterOperation("SystemInfoImpl::LoadFirewallRulesets"), true, [](FirewallRecord& firewall) {
        firewall.rulesetsLoaded = true;
        firewall.dynamicRules.clear();
    });
}

std::vector<std::unique_ptr<FirewallRule>> SystemInfoImpl::GetFirewallDynamicRules() {
    std::vector<std::unique_ptr<FirewallRule>> rules;
    for (const Detail::FirewallRuleRecord& rule :
         ReadFirewall(Detail::EnterOperation("SystemInfoImpl::GetFirewallDynamicRules")).dynamicRules) {
        rules.push_back(std::make_unique<FirewallRule>(Detail::RuleOf(rule)));
    }
    return rules;
}

void SystemInfoImpl::AddFirewallDynamicRule(const FirewallRule& rule) {
    Store::HostStore& store = Detail::EnterOperation("SystemInfoImpl::AddFirewallDynamicRule", rule.label);
    CheckPort("first port", rule.portBegin);
    CheckPort("last port", rule.portEnd);
    if (rule.portEnd < rule.portBegin) {
        throw HostCtlException("Invalid firewall rule: the last port " + std::to_string(rule.portEnd) +
                               " is below the first port " + std::to_string(rule.portBegin));
    }
    ChangeFirewall(store, true,
                   [&](FirewallRecord& firewall) { firewall.dynamicRules.push_back(Detail::RecordOf(rule)); });
}

void SystemInfoImpl::DestroyFirewallFilters() {
    ChangeFirewall(Detail::EnterOperation("SystemInfoImpl::DestroyFirewallFilters"), false,
                   [](FirewallRecord& firewall) {
                       firewall.rulesetsLoaded = false;
                       firewall.dynamicRules.clear();
                   });
}

std::unique_ptr<HostCtl::System::FirewallRuleset> SystemInfoImpl::GetFirewallRulesetById(const std::string& label) {
    Store::HostStore& store = Detail::EnterOperation("SystemInfoImpl::GetFirewallRulesetById", label);
    return MakeFirewallRuleset(label, Detail::Get<FirewallRulesetRecord>(store, label));
}

std::vector<std::unique_ptr<HostCtl::System::FirewallRuleset>> SystemInfoImpl::GetFirewallRulesets() {
    Store::HostStore& store = Detail::EnterOperation("SystemInfoImpl::GetFirewallRulesets");
    std::vector<std::unique_ptr<HostCtl::System::FirewallRuleset>> rulesets;
    for (FirewallRulesetRecord& record : Detail::List<FirewallRulesetRecord>(store)) {
        const std::string label = record.name;
        rulesets.push_back(MakeFirewallRuleset(label, std::move(record)));
    }
    return rulesets;
}

}  // namespace System
}  // namespace PldCtl
