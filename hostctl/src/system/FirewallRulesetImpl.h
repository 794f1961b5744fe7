// The library's ruleset objects, made by SystemInfoImpl.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "hostctl/system/FirewallRuleset.h"
#include "system/SystemRecords.h"

namespace PldCtl {
namespace System {

// A ruleset object for `label`, from the record read for it (unset: no
// ruleset has that label).
std::unique_ptr<HostCtl::System::FirewallRuleset> MakeFirewallRuleset(
    const std::string& label, std::optional<Detail::FirewallRulesetRecord> record);

// The canonical text of an allowed address or network; throws
// HostCtl::Lib::HostCtlException for any other text.
std::string CanonicalAllowedIp(const std::string& text);

}  // namespace System
}  // namespace PldCtl
