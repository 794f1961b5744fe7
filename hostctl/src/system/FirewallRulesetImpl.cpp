// Ruleset objects over the host store: each holds its ruleset as read when it
// was made, so a listing of many rulesets reads the store once; a change is
// one transaction on the ruleset as stored at that moment, whose result the
// object keeps.
#include "system/FirewallRulesetImpl.h"

#include <algorithm>
#include <functional>
#include <utility>

#include "Operation.h"

namespace HostCtl {
namespace System {

FirewallRuleset::~FirewallRuleset() = default;

}  // namespace System
}  // namespace HostCtl

namespace PldCtl {
namespace System {

using Detail::FirewallRulesetRecord;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv4Network;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Network;
using HostCtl::System::FirewallIpList;
using HostCtl::System::FirewallRule;

namespace {

template <typename Network>
std::string CanonicalNetwork(const std::string& text) {
    const Network network(text);
    if (!network.IsNetworkAddress()) {
        throw HostCtlException("Invalid allowed IP network '" + text + "': host bits are set, use " +
                               network.Masked().GetStringAddress());
    }
    return network.GetStringAddress();
}

class FirewallRulesetImpl : public HostCtl::System::FirewallRuleset {
public:
    FirewallRulesetImpl(const std::string& label, std::optional<FirewallRulesetRecord> record)
        : label_(label), record_(std::move(record)) {}

    bool IsValid() override {
        Detail::EnterOperation("FirewallRulesetImpl::IsValid", label_);
        return record_.has_value();
    }

    std::string GetName() override {
        Detail::EnterOperation("FirewallRulesetImpl::GetName", label_);
        return label_;
    }

    bool IsEnabled() override { return Read("FirewallRulesetImpl::IsEnabled").enabled; }

    void Enable() override {
        Change("FirewallRulesetImpl::Enable", [](FirewallRulesetRecord& ruleset) { ruleset.enabled = true; });
    }

    void Disable() override {
        Change("FirewallRulesetImpl::Disable", [](FirewallRulesetRecord& ruleset) { ruleset.enabled = false; });
    }

    std::vector<std::unique_ptr<FirewallRule>> GetRules() override {
        std::vector<std::unique_ptr<FirewallRule>> rules;
        for (const Detail::FirewallRuleRecord& rule : Read("FirewallRulesetImpl::GetRules").rules) {
            rules.push_back(std::make_unique<FirewallRule>(Detail::RuleOf(rule)));
        }
        return rules;
    }

    std::unique_ptr<FirewallIpList> GetAllowedIpList() override {
        auto list = std::make_unique<FirewallIpList>();
        for (const std::string& text : Read("FirewallRulesetImpl::GetAllowedIpList").allowedIps) {
            if (Ipv4Address::IsValidAddress(text)) {
                list->ipv4Addresses.emplace_back(text);
            } else if (Ipv6Address::IsValidAddress(text)) {
                list->ipv6Addresses.emplace_back(text);
            } else if (Ipv4Network::IsValidAddressAndNetmask(text)) {
                list->ipv4Networks.emplace_back(text);
            } else if (Ipv6Network::IsValidAddressAndNetmask(text)) {
                list->ipv6Networks.emplace_back(text);
            } else {
                throw HostCtlException("Ruleset " + label_ + " has an invalid allowed IP '" + text + "'");
            }
        }
        return list;
    }

    void AddAllowedIp(const std::string& address) override {
        Change("FirewallRulesetImpl::AddAllowedIp", [&](FirewallRulesetRecord& ruleset) {
            const std::string text = CanonicalAllowedIp(address);
            std::vector<std::string>& list = ruleset.allowedIps;
            if (std::find(list.begin(), list.end(), text) != list.end()) {
                throw HostCtlException("Allowed IP " + text + " is already in ruleset " + label_);
            }
            list.push_back(text);
        });
    }

    void RemoveAllowedIp(const std::string& address) override {
        Change("FirewallRulesetImpl::RemoveAllowedIp", [&](FirewallRulesetRecord& ruleset) {
            const std::string text = CanonicalAllowedIp(address);
            std::vector<std::string>& list = ruleset.allowedIps;
            const auto found = std::find(list.begin(), list.end(), text);
            if (found == list.end()) throw HostCtlException("Allowed IP " + text + " is not in ruleset " + label_);
            list.erase(found);
        });
    }

    bool IsAllowedAll() override { return Read("FirewallRulesetImpl::IsAllowedAll").allowedAll; }

    void SetAllowedAll(bool allowedAll) override {
        Change("FirewallRulesetImpl::SetAllowedAll",
               [&](FirewallRulesetRecord& ruleset) { ruleset.allowedAll = allowedAll; });
    }

private:
    std::string MissingMessage() const { return "Ruleset " + label_ + " does not exist"; }

    const FirewallRulesetRecord& Read(const char* operation) {
        Detail::EnterOperation(operation, label_);
        if (!record_) throw HostCtlException(MissingMessage());
        return *record_;
    }

    void Change(const char* operation, const std::function<void(FirewallRulesetRecord&)>& edit) {
        Store::HostStore& store = Detail::EnterOperation(operation, label_);
        if (!record_) throw HostCtlException(MissingMessage());
        FirewallRulesetRecord written;
        store.Change([&](Store::Transaction& t) {
            std::optional<Detail::StoredObject<FirewallRulesetRecord>> stored =
                Detail::Find<FirewallRulesetRecord>(t, label_);
            if (!stored) throw HostCtlException(MissingMessage());
            FirewallRulesetRecord edited = stored->record;
            edit(edited);
            Detail::Write(t, *stored, edited);
            written = std::move(edited);
        });
        record_ = std::move(written);
    }

    std::string label_;
    std::optional<FirewallRulesetRecord> record_;
};

}  // namespace

std::string CanonicalAllowedIp(const std::string& text) {
    if (Ipv4Address::IsValidAddress(text)) return Ipv4Address(text).GetStringAddress();
    if (Ipv6Address::IsValidAddress(text)) return Ipv6Address(text).GetStringAddress();
    if (Ipv4Network::IsValidAddressAndNetmask(text)) return CanonicalNetwork<Ipv4Network>(text);
    if (Ipv6Network::IsValidAddressAndNetmask(text)) return CanonicalNetwork<Ipv6Network>(text);
    throw HostCtlException("Invalid allowed IP '" + text +
                           "': use an IPv4 or IPv6 address, or a network written address/prefix");
}

std::unique_ptr<HostCtl::System::FirewallRuleset> MakeFirewallRuleset(const std::string& label,
                                                                      std::optional<FirewallRulesetRecord> record) {
    return std::make_unique<FirewallRulesetImpl>(label, std::move(record));
}

}  // namespace System
}  // namespace PldCtl
