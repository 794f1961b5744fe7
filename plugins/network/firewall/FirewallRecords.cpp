#include "firewall/FirewallRecords.h"

#include <memory>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "firewall/FirewallLookup.h"
#include "hostctl/util/DeleteVector.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::System::FirewallRule;
using HostCtl::System::FirewallRuleset;
using Fresh = std::function<boost::shared_ptr<MetaObj::MetaStruct>()>;

boost::shared_ptr<MetaObj::MetaStruct> Record(const char* type,
                                              std::initializer_list<std::pair<const char*, MetaObj::MetaType>> fields) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New(type);
    for (const auto& [name, kind] : fields) {
        switch (kind) {
            case MetaObj::META_BOOL:
                record->SetField(name, MetaObj::MetaBool::New());
                break;
            case MetaObj::META_INT:
                record->SetField(name, MetaObj::MetaInt::New());
                break;
            case MetaObj::META_LIST:
                record->SetField(name, MetaObj::MetaList::New(MetaObj::META_STRING));
                break;
            default:
                record->SetField(name, MetaObj::MetaString::New());
                break;
        }
    }
    return record;
}

template <typename Value>
void AppendTexts(std::vector<std::string>& texts, const std::vector<Value>& values) {
    for (const Value& value : values) texts.push_back(value.GetStringAddress());
}

}  // namespace

const char* DefaultActionWord(bool pass) {
    return pass ? "PASS" : "DROP";
}

const char* PortTypeWord(int portType) {
    return portType == FirewallRule::PORT_TYPE_DST ? "Dst" : "Src";
}

const char* DirectionWord(int direction) {
    return direction == FirewallRule::DIRECTION_INBOUND ? "Inbound" : "Outbound";
}

const char* ProtocolWord(int protocol) {
    return protocol == FirewallRule::PROTOCOL_TCP ? "TCP" : "UDP";
}

boost::shared_ptr<MetaObj::MetaStruct> FirewallTemplate() {
    return Record(
        "Firewall",
        {{"Loaded", MetaObj::META_BOOL}, {"Enabled", MetaObj::META_BOOL}, {"DefaultAction", MetaObj::META_STRING}});
}

boost::shared_ptr<MetaObj::MetaStruct> RulesetTemplate() {
    return Record("Ruleset", {{"Name", MetaObj::META_STRING}, {"Enabled", MetaObj::META_BOOL}});
}

boost::shared_ptr<MetaObj::MetaStruct> PortRuleTemplate() {
    return Record("FirewallPortRule", {{"Ruleset", MetaObj::META_STRING},
                                       {"Port Type", MetaObj::META_STRING},
                                       {"Port Begin", MetaObj::META_INT},
                                       {"Port End", MetaObj::META_INT},
                                       {"Direction", MetaObj::META_STRING},
                                       {"Protocol", MetaObj::META_STRING}});
}

boost::shared_ptr<MetaObj::MetaStruct> AllowedIpTemplate() {
    return Record("FirewallRulesetAllowedip",
                  {{"Ruleset", MetaObj::META_STRING}, {"Allowed IP Addresses", MetaObj::META_LIST}});
}

boost::shared_ptr<CallSpec::OutputSpec> RulesetListingOutputSpec(const boost::shared_ptr<MetaObj::MetaStruct>& record) {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, record));
}

void RulesetRecord(FirewallRuleset& ruleset, MetaObj::MetaList& rows, const Fresh& fresh) {
    boost::shared_ptr<MetaObj::MetaStruct> row = fresh();
    row->SetField("Name", ruleset.GetName());
    row->SetField("Enabled", ruleset.IsEnabled());
    rows.Append(std::move(row));
}

void PortRuleRecords(FirewallRuleset& ruleset, MetaObj::MetaList& rows, const Fresh& fresh) {
    const std::string name = ruleset.GetName();
    std::vector<std::unique_ptr<FirewallRule>> rules = ruleset.GetRules();
    for (const std::unique_ptr<FirewallRule>& rule : rules) {
        boost::shared_ptr<MetaObj::MetaStruct> row = fresh();
        row->SetField("Ruleset", name);
        row->SetField("Port Type", PortTypeWord(rule->portType));
        row->SetField("Port Begin", rule->portBegin);
        row->SetField("Port End", rule->portEnd);
        row->SetField("Direction", DirectionWord(rule->direction));
        row->SetField("Protocol", ProtocolWord(rule->protocol));
        rows.Append(std::move(row));
    }
    PldCtl::Util::DeleteVector(rules);
}

void AllowedIpRecord(FirewallRuleset& ruleset, MetaObj::MetaList& rows, const Fresh& fresh) {
    boost::shared_ptr<MetaObj::MetaStruct> row = fresh();
    row->SetField("Ruleset", ruleset.GetName());
    std::vector<std::string> addresses;
    if (ruleset.IsAllowedAll()) {
        addresses.emplace_back("All");
    } else {
        const std::unique_ptr<HostCtl::System::FirewallIpList> list = ruleset.GetAllowedIpList();
        AppendTexts(addresses, list->ipv4Addresses);
        AppendTexts(addresses, list->ipv6Addresses);
        AppendTexts(addresses, list->ipv4Networks);
        AppendTexts(addresses, list->ipv6Networks);
    }
    row->SetField("Allowed IP Addresses", std::move(addresses));
    rows.Append(std::move(row));
}

void RunRulesetListing(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                       const Fresh& fresh, const RulesetRows& rows) {
    PldCtl::System::SystemInfoImpl info;
    boost::shared_ptr<MetaObj::MetaList> list = MetaObj::MetaList::New(MetaObj::META_STRUCT, fresh());
    ReportingHostErrors(output, [&] {
        for (const std::unique_ptr<FirewallRuleset>& ruleset : ListedRulesets(info, input)) {
            rows(*ruleset, *list, fresh);
        }
        Finish(output, list);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
