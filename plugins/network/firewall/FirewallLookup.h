// Finding rulesets by label, with the commands' messages for a label no
// ruleset has. Each throws HostCtl::Lib::HostCtlException with the message
// the command reports.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "framework/CallSpec.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The ruleset a changing command works on: "Invalid Ruleset Id." when the
// label names none.
std::unique_ptr<HostCtl::System::FirewallRuleset> ChangeableRuleset(PldCtl::System::SystemInfoImpl& info,
                                                                    const std::string& label);

// What a listing shows: with `--ruleset-id`, that ruleset ("Ruleset Not
// Found: LABEL" when there is none, "Failed to check loaded status: LABEL"
// when it cannot be looked up); without, every ruleset.
std::vector<std::unique_ptr<HostCtl::System::FirewallRuleset>> ListedRulesets(PldCtl::System::SystemInfoImpl& info,
                                                                              const CallSpec::Input& input);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
