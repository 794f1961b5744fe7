// The firewall as the library keeps it: the module's state, the firewall's
// own state while the module is loaded, the dynamic rules, and the rulesets
// with their allowed addresses, over hosts made from small profiles.
#include <gmock/gmock.h>

#include <memory>
#include <string>
#include <vector>

#include "hostctl/HostFixture.h"
#include "hostctl/system/ModuleImpl.h"
#include "hostctl/system/SystemInfoImpl.h"
#include "hostctl/util/DeleteVector.h"

namespace {

using HostCtl::System::FirewallIpList;
using HostCtl::System::FirewallRule;
using HostCtl::System::FirewallRuleset;
using PldCtl::System::ModuleImpl;
using PldCtl::System::SystemInfoImpl;
using ::testing::ElementsAre;

// A loaded, enabled firewall dropping by default, with one dynamic rule and
// three rulesets: one with a mixed allowed list, one allowing all, one
// disabled with an empty list. The system keeps another module and fields
// of its own, which firewall changes must leave alone.
const char kProfile[] = R"({
  "format": "orvix-host-profile", "version": 1,
  "system": {"ipv6Enabled": false, "maxPorts": 512,
             "modules": [{"name": "vmkdummy", "loaded": true, "options": "debug=1"},
                         {"name": "tovrinfw", "loaded": true, "options": ""}]},
  "firewall": {"enabled": true, "defaultAction": "DROP", "rulesetsLoaded": true, "sensor": "kept",
               "dynamicRules": [{"label": "session-1", "direction": "outbound", "protocol": "udp",
                                 "portType": "src", "portBegin": 902}]},
  "firewallRulesets": [
    {"name": "sshServer", "enabled": true, "allowedAll": false,
     "allowedIps": ["2001:db8:10::/64", "192.0.2.0/24", "198.51.100.77", "2001:db8::5"],
     "rules": [{"direction": "inbound", "protocol": "tcp", "portType": "dst", "portBegin": 22, "portEnd": 22},
               {"label": "r2", "direction": "outbound", "protocol": "udp", "portType": "src", "portBegin": 1000,
                "portEnd": 1010}]},
    {"name": "webAccess", "enabled": true},
    {"name": "syslog", "enabled": false, "allowedAll": false, "owner": "ops"}
  ]
})";

class Firewall : public FreshHost {
protected:
    Firewall() { MakeHost(kProfile); }

    Json StoredModule(const std::string& name) const {
        for (const Json& module : Dump()["system"].value("modules", Json::array())) {
            if (module.value("name", "") == name) return module;
        }
        return Json();
    }

    void ArmFault(const std::string& operation, const std::string& key, const std::string& message) {
        std::vector<std::string> arguments = {"fault", "add", operation, "--message", message};
        if (!key.empty()) arguments.insert(arguments.end(), {"--key", key});
        HostSim(arguments);
    }

    static FirewallRule Rule(const std::string& label, int begin, int end) {
        FirewallRule rule;
        rule.label = label;
        rule.portBegin = begin;
        rule.portEnd = end;
        return rule;
    }
};

// Counts live objects, to see what DeleteVector frees.
struct Counted {
    static int alive;
    Counted() { ++alive; }
    ~Counted() { --alive; }
};
int Counted::alive = 0;

TEST(DeleteVector, FreesEveryObjectOnceAndEmptiesTheVector) {
    std::vector<Counted*> raw = {new Counted, nullptr, new Counted, nullptr, new Counted};
    ASSERT_EQ(Counted::alive, 3);
    PldCtl::Util::DeleteVector(raw);
    EXPECT_EQ(Counted::alive, 0);
    EXPECT_TRUE(raw.empty());
    // Nothing is left to be freed twice.
    PldCtl::Util::DeleteVector(raw);
    EXPECT_EQ(Counted::alive, 0);

    std::vector<std::unique_ptr<Counted>> owned;
    owned.push_back(std::make_unique<Counted>());
    owned.push_back(nullptr);
    owned.push_back(std::make_unique<Counted>());
    PldCtl::Util::DeleteVector(owned);
    EXPECT_EQ(Counted::alive, 0);
    EXPECT_TRUE(owned.empty());
}

TEST_F(Firewall, ModuleLoadsAndUnloadsOnceEach) {
    ModuleImpl module("tovrinfw");
    EXPECT_TRUE(module.IsLoaded());
    EXPECT_EQ(MessageOf([&] { module.Load("", false); }), "Module tovrinfw is already loaded");
    module.Unload();
    EXPECT_FALSE(module.IsLoaded());
    EXPECT_EQ(StoredModule("tovrinfw"), (Json{{"name", "tovrinfw"}, {"loaded", false}, {"options", ""}}));
    EXPECT_EQ(MessageOf([&] { module.Unload(); }), "Module tovrinfw is not loaded");

    module.Load("heap=64", false);
    EXPECT_TRUE(module.IsLoaded());
    EXPECT_EQ(module.GetOptions(), "heap=64");
    // Reloading takes the new options.
    module.Load("heap=128", true);
    EXPECT_EQ(ModuleImpl("tovrinfw").GetOptions(), "heap=128");

    // The other module and the system's other fields are untouched.
    EXPECT_EQ(StoredModule("vmkdummy"), (Json{{"name", "vmkdummy"}, {"loaded", true}, {"options", "debug=1"}}));
    const Json system = Dump()["system"];
    EXPECT_EQ(system["ipv6Enabled"], false);
    EXPECT_EQ(system["maxPorts"], 512);
}

TEST_F(Firewall, ModuleUnknownToTheHostIsNotLoadedUntilLoaded) {
    ModuleImpl module("newmod");
    EXPECT_FALSE(module.IsLoaded());
    EXPECT_EQ(module.GetOptions(), "");
    EXPECT_EQ(MessageOf([&] { module.Unload(); }), "Module newmod is not loaded");
    EXPECT_TRUE(StoredModule("newmod").is_null());
    module.Load("", false);
    EXPECT_EQ(StoredModule("newmod"), (Json{{"name", "newmod"}, {"loaded", true}, {"options", ""}}));
}

TEST_F(Firewall, ModuleDataIsReadAgainOnlyWhenStale) {
    ModuleImpl patient("tovrinfw", std::chrono::hours(1));
    ModuleImpl eager("tovrinfw", std::chrono::milliseconds(0));
    ASSERT_TRUE(patient.IsLoaded());
    ASSERT_TRUE(eager.IsLoaded());

    ModuleImpl("tovrinfw").Unload();
    // Within its age the cached answer stands; a zero age reads every time.
    EXPECT_TRUE(patient.IsLoaded());
    EXPECT_FALSE(eager.IsLoaded());

    // A change the object makes itself makes its data stale at once, and
    // the change is decided on the stored state, not on the cache.
    EXPECT_EQ(MessageOf([&] { patient.Unload(); }), "Module tovrinfw is not loaded");
    EXPECT_FALSE(patient.IsLoaded());
    patient.Load("", false);
    EXPECT_TRUE(patient.IsLoaded());
}

TEST_F(Firewall, StateIsReadAndChangedWhileTheModuleIsLoaded) {
    SystemInfoImpl info;
    EXPECT_TRUE(info.IsFirewallEnabled());
    EXPECT_FALSE(info.GetFirewallDefaultAction());
    info.SetFirewallEnabled(false);
    info.SetFirewallDefaultAction(true);
    EXPECT_FALSE(SystemInfoImpl().IsFirewallEnabled());
    EXPECT_TRUE(SystemInfoImpl().GetFirewallDefaultAction());
    const Json firewall = Dump()["firewall"];
    EXPECT_EQ(firewall["enabled"], false);
    EXPECT_EQ(firewall["defaultAction"], "PASS");
    // A field the library does not know stays.
    EXPECT_EQ(firewall["sensor"], "kept");
    info.SetFirewallDefaultAction(false);
    EXPECT_EQ(Dump()["firewall"]["defaultAction"], "DROP");
}

TEST_F(Firewall, StateIsRefusedWhileTheModuleIsNotLoaded) {
    ModuleImpl("tovrinfw").Unload();
    SystemInfoImpl info;
    const std::string refusal = "The firewall module tovrinfw is not loaded";
    EXPECT_EQ(MessageOf([&] { info.IsFirewallEnabled(); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.GetFirewallDefaultAction(); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.SetFirewallEnabled(false); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.SetFirewallDefaultAction(true); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.LoadFirewallRulesets(); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.GetFirewallDynamicRules(); }), refusal);
    EXPECT_EQ(MessageOf([&] { info.AddFirewallDynamicRule(Rule("x", 1, 2)); }), refusal);
    const Json before = Dump()["firewall"];
    // Nothing to destroy: the module is not there.
    EXPECT_EQ(MessageOf([&] { info.DestroyFirewallFilters(); }), "(no error)");
    EXPECT_EQ(Dump()["firewall"], before);
    // The rulesets are configuration and stay reachable.
    EXPECT_EQ(info.GetFirewallRulesets().size(), 3u);
}

TEST_F(Firewall, DynamicRulesAreDroppedByLoadingAndByDestroying) {
    SystemInfoImpl info;
    std::vector<std::unique_ptr<FirewallRule>> rules = info.GetFirewallDynamicRules();
    ASSERT_EQ(rules.size(), 1u);
    // Stored words become the codes; an end left out is the first port.
    EXPECT_EQ(rules[0]->label, "session-1");
    EXPECT_EQ(rules[0]->portType, FirewallRule::PORT_TYPE_SRC);
    EXPECT_EQ(rules[0]->direction, FirewallRule::DIRECTION_OUTBOUND);
    EXPECT_EQ(rules[0]->protocol, FirewallRule::PROTOCOL_UDP);
    EXPECT_EQ(rules[0]->portBegin, 902);
    EXPECT_EQ(rules[0]->portEnd, 902);

    FirewallRule added = Rule("session-2", 8100, 8103);
    added.protocol = 7;  // any code but TCP's is UDP
    info.AddFirewallDynamicRule(added);
    rules = info.GetFirewallDynamicRules();
    ASSERT_EQ(rules.size(), 2u);
    EXPECT_EQ(*rules[0], *info.GetFirewallDynamicRules()[0]);
    EXPECT_EQ(rules[1]->label, "session-2");
    EXPECT_EQ(rules[1]->protocol, FirewallRule::PROTOCOL_UDP);
    EXPECT_EQ(Dump()["firewall"]["dynamicRules"][1], (Json{{"label", "session-2"},
                                                           {"direction", "inbound"},
                                                           {"protocol", "udp"},
                                                           {"portType", "dst"},
                                                           {"portBegin", 8100},
                                                           {"portEnd", 8103}}));

    info.DestroyFirewallFilters();
    EXPECT_TRUE(info.GetFirewallDynamicRules().empty());
    EXPECT_EQ(Dump()["firewall"]["rulesetsLoaded"], false);
    info.AddFirewallDynamicRule(Rule("session-3", 1, 1));
    info.LoadFirewallRulesets();
    EXPECT_TRUE(info.GetFirewallDynamicRules().empty());
    EXPECT_EQ(Dump()["firewall"]["rulesetsLoaded"], true);
}

TEST_F(Firewall, DynamicRulesOutsideThePortRangeAreRefused) {
    SystemInfoImpl info;
    EXPECT_EQ(MessageOf([&] { info.AddFirewallDynamicRule(Rule("a", -1, 5)); }),
              "Invalid firewall rule: first port -1 is not a port from 0 to 65535");
    EXPECT_EQ(MessageOf([&] { info.AddFirewallDynamicRule(Rule("a", 1, 65536)); }),
              "Invalid firewall rule: last port 65536 is not a port from 0 to 65535");
    EXPECT_EQ(MessageOf([&] { info.AddFirewallDynamicRule(Rule("a", 10, 9)); }),
              "Invalid firewall rule: the last port 9 is below the first port 10");
    EXPECT_EQ(info.GetFirewallDynamicRules().size(), 1u);
    info.AddFirewallDynamicRule(Rule("a", 0, 65535));
    EXPECT_EQ(info.GetFirewallDynamicRules().size(), 2u);
}

TEST_F(Firewall, RulesetsAreListedInOrderWithTheirRulesAndDefaults) {
    SystemInfoImpl info;
    std::vector<std::unique_ptr<FirewallRuleset>> rulesets = info.GetFirewallRulesets();
    std::vector<std::string> names;
    for (const auto& ruleset : rulesets) names.push_back(ruleset->GetName());
    EXPECT_THAT(names, ElementsAre("sshServer", "webAccess", "syslog"));
    // Defaults: allowing all, no list, no rules.
    EXPECT_TRUE(rulesets[1]->IsAllowedAll());
    EXPECT_TRUE(rulesets[1]->GetRules().empty());
    EXPECT_FALSE(rulesets[2]->IsEnabled());
    EXPECT_FALSE(rulesets[2]->IsAllowedAll());
    const std::unique_ptr<FirewallIpList> empty = rulesets[2]->GetAllowedIpList();
    EXPECT_TRUE(empty->ipv4Addresses.empty() && empty->ipv4Networks.empty() && empty->ipv6Addresses.empty() &&
                empty->ipv6Networks.empty());

    std::vector<std::unique_ptr<FirewallRule>> rules = rulesets[0]->GetRules();
    ASSERT_EQ(rules.size(), 2u);
    EXPECT_EQ(rules[0]->portType, FirewallRule::PORT_TYPE_DST);
    EXPECT_EQ(rules[0]->direction, FirewallRule::DIRECTION_INBOUND);
    EXPECT_EQ(rules[0]->protocol, FirewallRule::PROTOCOL_TCP);
    EXPECT_EQ(rules[1]->label, "r2");
    EXPECT_EQ(rules[1]->portType, FirewallRule::PORT_TYPE_SRC);
    EXPECT_EQ(rules[1]->portBegin, 1000);
    EXPECT_EQ(rules[1]->portEnd, 1010);

    // The list is split by family and kind, each part in stored order.
    const std::unique_ptr<FirewallIpList> list = rulesets[0]->GetAllowedIpList();
    ASSERT_EQ(list->ipv4Addresses.size(), 1u);
    EXPECT_EQ(list->ipv4Addresses[0].GetStringAddress(), "198.51.100.77");
    ASSERT_EQ(list->ipv4Networks.size(), 1u);
    EXPECT_EQ(list->ipv4Networks[0].GetStringAddress(), "192.0.2.0/24");
    ASSERT_EQ(list->ipv6Addresses.size(), 1u);
    EXPECT_EQ(list->ipv6Addresses[0].GetStringAddress(), "2001:db8::5");
    ASSERT_EQ(list->ipv6Networks.size(), 1u);
    EXPECT_EQ(list->ipv6Networks[0].GetStringAddress(), "2001:db8:10::/64");
}

TEST_F(Firewall, AnUnknownLabelGivesAnInvalidRulesetThatRefusesEverything) {
    std::unique_ptr<FirewallRuleset> ruleset = SystemInfoImpl().GetFirewallRulesetById("nosuch");
    EXPECT_FALSE(ruleset->IsValid());
    EXPECT_EQ(ruleset->GetName(), "nosuch");
    const std::string refusal = "Ruleset nosuch does not exist";
    EXPECT_EQ(MessageOf([&] { ruleset->IsEnabled(); }), refusal);
    EXPECT_EQ(MessageOf([&] { ruleset->Enable(); }), refusal);
    EXPECT_EQ(MessageOf([&] { ruleset->GetRules(); }), refusal);
    EXPECT_EQ(MessageOf([&] { ruleset->AddAllowedIp("192.0.2.1"); }), refusal);
    EXPECT_EQ(MessageOf([&] { ruleset->SetAllowedAll(true); }), refusal);
    EXPECT_TRUE(Stored("firewallRulesets", "name", "nosuch").is_null());
    // Labels are exact.
    EXPECT_FALSE(SystemInfoImpl().GetFirewallRulesetById("SSHSERVER")->IsValid());
}

TEST_F(Firewall, RulesetChangesAreStoredAndSeenByTheObject) {
    std::unique_ptr<FirewallRuleset> ruleset = SystemInfoImpl().GetFirewallRulesetById("syslog");
    ruleset->Enable();
    ruleset->SetAllowedAll(true);
    EXPECT_TRUE(ruleset->IsEnabled());
    EXPECT_TRUE(ruleset->IsAllowedAll());
    Json stored = Stored("firewallRulesets", "name", "syslog");
    EXPECT_EQ(stored["enabled"], true);
    EXPECT_EQ(stored["allowedAll"], true);
    EXPECT_EQ(stored["owner"], "ops");
    ruleset->Disable();
    EXPECT_FALSE(SystemInfoImpl().GetFirewallRulesetById("syslog")->IsEnabled());
}

TEST_F(Firewall, AllowedAddressesAreKeptCanonicalAndOnce) {
    std::unique_ptr<FirewallRuleset> ruleset = SystemInfoImpl().GetFirewallRulesetById("syslog");
    ruleset->AddAllowedIp("2001:DB8:0:0::0:99");
    ruleset->AddAllowedIp("203.0.113.0/255.255.255.0");
    ruleset->AddAllowedIp("2001:db8:30:0::/48");
    ruleset->AddAllowedIp("192.0.2.9");
    EXPECT_EQ(Stored("firewallRulesets", "name", "syslog")["allowedIps"],
              (Json{"2001:db8::99", "203.0.113.0/24", "2001:db8:30::/48", "192.0.2.9"}));

    // The same entry in another spelling is the same entry.
    EXPECT_EQ(MessageOf([&] { ruleset->AddAllowedIp("2001:db8::0099"); }),
              "Allowed IP 2001:db8::99 is already in ruleset syslog");
    EXPECT_EQ(MessageOf([&] { ruleset->RemoveAllowedIp("192.0.2.10"); }),
              "Allowed IP 192.0.2.10 is not in ruleset syslog");
    EXPECT_EQ(MessageOf([&] { ruleset->AddAllowedIp("203.0.113.7/24"); }),
              "Invalid allowed IP network '203.0.113.7/24': host bits are set, use 203.0.113.0/24");
    EXPECT_EQ(MessageOf([&] { ruleset->AddAllowedIp("2001:db8::1/32"); }),
              "Invalid allowed IP network '2001:db8::1/32': host bits are set, use 2001:db8::/32");
    for (const std::string bad : {"", "192.0.2.256", "192.0.2.0/33", "host.example.test", "192.0.2.1-192.0.2.9",
                                  "2001:db8::/129", " 192.0.2.1"}) {
        EXPECT_EQ(MessageOf([&] { ruleset->AddAllowedIp(bad); }),
                  "Invalid allowed IP '" + bad + "': use an IPv4 or IPv6 address, or a network written address/prefix");
    }
    ruleset->RemoveAllowedIp("2001:db8:0::99");
    ruleset->RemoveAllowedIp("203.0.113.0/24");
    EXPECT_EQ(Stored("firewallRulesets", "name", "syslog")["allowedIps"], (Json{"2001:db8:30::/48", "192.0.2.9"}));
    const std::unique_ptr<FirewallIpList> list = ruleset->GetAllowedIpList();
    EXPECT_EQ(list->ipv4Addresses.size() + list->ipv6Networks.size(), 2u);
}

TEST_F(Firewall, ChangesFromTwoObjectsAreBothKept) {
    std::unique_ptr<FirewallRuleset> first = SystemInfoImpl().GetFirewallRulesetById("sshServer");
    std::unique_ptr<FirewallRuleset> second = SystemInfoImpl().GetFirewallRulesetById("sshServer");
    first->AddAllowedIp("203.0.113.1");
    second->AddAllowedIp("203.0.113.2");
    second->Disable();
    EXPECT_THAT(
        Stored("firewallRulesets", "name", "sshServer")["allowedIps"].get<std::vector<std::string>>(),
        ElementsAre("2001:db8:10::/64", "192.0.2.0/24", "198.51.100.77", "2001:db8::5", "203.0.113.1", "203.0.113.2"));
    // The second saw the first's entry when it changed the ruleset.
    EXPECT_EQ(second->GetAllowedIpList()->ipv4Addresses.size(), 3u);
    EXPECT_EQ(MessageOf([&] { first->AddAllowedIp("203.0.113.2"); }),
              "Allowed IP 203.0.113.2 is already in ruleset sshServer");
}

TEST_F(Firewall, ARulesetRemovedMeanwhileRefusesChanges) {
    std::unique_ptr<FirewallRuleset> ruleset = SystemInfoImpl().GetFirewallRulesetById("webAccess");
    ASSERT_TRUE(ruleset->IsValid());
    RawSql("DELETE FROM object WHERE section = 'firewallRulesets' AND key = 'webAccess'");
    EXPECT_EQ(MessageOf([&] { ruleset->Disable(); }), "Ruleset webAccess does not exist");
    EXPECT_TRUE(Stored("firewallRulesets", "name", "webAccess").is_null());
}

TEST_F(Firewall, FaultsFireForTheirOperationAndKey) {
    ArmFault("FirewallRulesetImpl::AddAllowedIp", "sshServer", "Unable to update ruleset sshServer");
    ArmFault("ModuleImpl::IsLoaded", "tovrinfw", "Unable to query module tovrinfw");
    ArmFault("SystemInfoImpl::GetFirewallRulesetById", "syslog", "Unable to read ruleset syslog");
    SystemInfoImpl info;
    EXPECT_EQ(MessageOf([&] { info.GetFirewallRulesetById("sshServer")->AddAllowedIp("203.0.113.1"); }),
              "Unable to update ruleset sshServer");
    EXPECT_EQ(MessageOf([&] { info.GetFirewallRulesetById("webAccess")->SetAllowedAll(false); }), "(no error)");
    EXPECT_EQ(MessageOf([&] { info.GetFirewallRulesetById("syslog"); }), "Unable to read ruleset syslog");
    EXPECT_EQ(MessageOf([&] { ModuleImpl("tovrinfw").IsLoaded(); }), "Unable to query module tovrinfw");
    EXPECT_FALSE(ModuleImpl("vmkdummy2").IsLoaded());
    EXPECT_EQ(Stored("firewallRulesets", "name", "sshServer")["allowedIps"].size(), 4u);
}

// Profiles with firewall fields of the wrong kind are refused where they
// are wrong.
TEST_F(FreshHost, FirewallProfileFieldsAreChecked) {
    const auto refusal = [&](const std::string& sections) {
        try {
            MakeHost(R"({"format": "orvix-host-profile", "version": 1, )" + sections + "}");
        } catch (const std::runtime_error& e) {
            return std::string(e.what());
        }
        return std::string("(accepted)");
    };
    EXPECT_THAT(refusal(R"("firewall": {"defaultAction": "ALLOW"})"), ::testing::HasSubstr("firewall.defaultAction"));
    EXPECT_THAT(refusal(R"("system": {"modules": [{"name": "tovrinfw", "loaded": "yes"}]})"),
                ::testing::HasSubstr("system.modules[0].loaded"));
    EXPECT_THAT(refusal(R"("firewall": {"dynamicRules": [{"portBegin": 70000}]})"),
                ::testing::HasSubstr("firewall.dynamicRules[0].portBegin"));
    EXPECT_THAT(refusal(R"("firewallRulesets": [{"name": "a", "rules": [{"portBegin": 1, "direction": "in"}]}])"),
                ::testing::HasSubstr("firewallRulesets[0].rules[0].direction"));
    EXPECT_THAT(refusal(R"("firewallRulesets": [{"name": "a", "allowedIps": ["192.0.2.0/24", "192.0.2.1/24"]}])"),
                ::testing::HasSubstr("firewallRulesets[0].allowedIps: item 1"));
    EXPECT_THAT(refusal(R"("firewallRulesets": [{"name": "a", "allowedIps": ["2001:DB8::1"]}])"),
                ::testing::HasSubstr("firewallRulesets[0].allowedIps: item 0"));
    EXPECT_EQ(refusal(R"("firewallRulesets": [{"name": "a", "allowedIps": ["2001:db8::1", "2001:db8::/32",
              "192.0.2.0/24", "192.0.2.1"]}], "firewall": {"defaultAction": "PASS"})"),
              "(accepted)");
}

}  // namespace
