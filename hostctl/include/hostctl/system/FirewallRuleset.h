// One firewall ruleset: a named set of port rules with the addresses it lets
// through, switched on or off as a whole.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/system/FirewallRule.h"

namespace HostCtl {
namespace System {

// Made by SystemInfoImpl for a label, which need not name a ruleset
// (IsValid tells). The reading operations answer from the ruleset as it was
// read when the object was made; each change is one transaction on the
// ruleset as it is stored then, and the object reads the result afterwards.
// Every operation but IsValid and GetName throws
// HostCtl::Lib::HostCtlException for a label no ruleset has.
class HOSTCTL_EXPORT FirewallRuleset {
public:
    virtual ~FirewallRuleset();

    virtual bool IsValid() = 0;
    // The label the object was made for.
    virtual std::string GetName() = 0;
    virtual bool IsEnabled() = 0;
    virtual void Enable() = 0;
    virtual void Disable() = 0;
    // The port rules in their order.
    virtual std::vector<std::unique_ptr<FirewallRule>> GetRules() = 0;
    virtual std::unique_ptr<FirewallIpList> GetAllowedIpList() = 0;
    // An IPv4 or IPv6 address or network ("address/prefix", no host bits
    // set), kept in canonical text at the end of the list. Throws for other
    // text, for an entry the list has already (add) and for one it has not
    // (remove). The list is kept while every address is allowed.
    virtual void AddAllowedIp(const std::string& address) = 0;
    virtual void RemoveAllowedIp(const std::string& address) = 0;
    // True when every address is allowed and the list is ignored.
    virtual bool IsAllowedAll() = 0;
    virtual void SetAllowedAll(bool allowedAll) = 0;
};

}  // namespace System
}  // namespace HostCtl
