#include "vswitch/VswitchOptions.h"

#include <algorithm>
#include <cstdint>
#include <limits>
#include <optional>
#include <regex>

#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::LinkCriteriaSelectionPolicy;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::TeamPolicyType;

namespace {

// The words of load-balancing with the teaming types they select, in the
// order help lists them.
struct LoadBalancingWord {
    const char* word;
    TeamPolicyType type;
    const char* description;
};

const LoadBalancingWord kLoadBalancingWords[] = {
    {"portid", HostCtl::Network::TEAM_PORT_ID, "Route based on the originating virtual port ID."},
    {"iphash", HostCtl::Network::TEAM_IP_HASH, "Route based on hashing the src and destination IP addresses"},
    {"mac", HostCtl::Network::TEAM_SRC_MAC, "Route based on the MAC address of the packet source."},
    {"explicit", HostCtl::Network::TEAM_EXPLICIT,
     "Always use the highest order uplink from the list of active adapters which pass failover criteria."},
};

std::optional<TeamPolicyType> LoadBalancingType(const std::string& word) {
    for (const LoadBalancingWord& entry : kLoadBalancingWords) {
        if (word == entry.word) return entry.type;
    }
    return std::nullopt;
}

bool Contains(const std::vector<std::string>& names, const std::string& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

// Appends to `order` the names of an uplink list that are physical NICs of
// the host and uplinks of the switch; every other name is reported and left
// out, so one mistyped name does not hide the others' mistakes.
void AppendConnectedUplinks(const std::string& list, const std::string& unknownMessage,
                            const std::vector<std::string>& vswitchUplinks, CallSpec::Output& output,
                            std::vector<std::string>& order) {
    for (const std::string& name : SplitUplinks(list)) {
        if (!PldCtl::Network::PnicImpl::IsValidPnic(name)) {
            output.SetError(unknownMessage + name);
        } else if (!Contains(vswitchUplinks, name)) {
            output.SetError("NIC is not connected to the vswitch : " + name);
        } else {
            order.push_back(name);
        }
    }
}

// Only active uplinks were named: the old standby adapters stay standby,
// behind the new active ones, unless they were just named active.
void KeepOldStandby(const NicTeamingPolicy& reference, std::vector<std::string>& order) {
    const std::vector<std::string> old = reference.GetUplinkOrder();
    const std::size_t firstStandby = static_cast<std::size_t>(std::max(reference.GetMaxActiveUplinks(), 0));
    for (std::size_t i = firstStandby; i < old.size(); ++i) {
        if (!Contains(order, old[i])) order.push_back(old[i]);
    }
}

// Only standby uplinks were named: the old active adapters that were not
// named stay active in front of them; the old standby adapters are dropped.
// The count starts from the active adapters the order really has, so a
// reference whose count exceeds its order cannot leave named standby
// adapters inside the active part.
void KeepOldActive(const NicTeamingPolicy& reference, NicTeamingPolicy& policy, std::vector<std::string>& order) {
    std::vector<std::string> kept = reference.GetUplinkOrder();
    std::size_t active = std::min(static_cast<std::size_t>(std::max(reference.GetMaxActiveUplinks(), 0)), kept.size());
    for (std::size_t i = 0; i < active;) {
        if (Contains(order, kept[i])) {
            kept.erase(kept.begin() + static_cast<std::ptrdiff_t>(i));
            --active;
        } else {
            ++i;
        }
    }
    policy.SetMaxActiveUplinks(static_cast<int>(active));
    kept.resize(active);
    kept.insert(kept.end(), order.begin(), order.end());
    order = kept;
}

bool HasDuplicates(std::vector<std::string> names) {
    std::sort(names.begin(), names.end());
    return std::adjacent_find(names.begin(), names.end()) != names.end();
}

// Applies one bandwidth or burst option, given in units of `factor` base
// units. A value whose conversion does not fit in 64 bits is refused rather
// than stored wrapped around.
template <typename Setter>
void ApplyScaled(const CallSpec::Input& input, CallSpec::Output& output, const std::string& option,
                 unsigned long long factor, bool demanded, Setter set) {
    if (input.IsSet(option)) {
        const auto value = static_cast<unsigned long long>(input.GetInt(option));
        if (value > std::numeric_limits<unsigned long long>::max() / factor) {
            output.SetError("Value of --" + option + " is too large");
        } else {
            set(value * factor);
        }
    } else if (demanded) {
        output.SetError("Missing required parameter --" + option);
    }
}

constexpr unsigned long long kBitsPerKbit = 1000;
constexpr unsigned long long kBytesPerKib = 128;

}  // namespace

boost::shared_ptr<CallSpec::InputSpec> VswitchNameInput(const std::string& description) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v", description, Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::InputSpec> PortGroupNameInput(const std::string& description) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portgroup-name", CallSpec::PARAM_STRING, "p", description, Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::InputSpec> PortGroupPolicySetInput(const std::string& description,
                                                               int blanksBetweenSentences) {
    boost::shared_ptr<CallSpec::InputSpec> declared = PortGroupNameInput(description);
    DeclareParameter(declared, "use-vswitch", CallSpec::PARAM_FLAG, "u",
                     "Reset all values for this policy to use parent virtual switch's settings instead of overriding "
                     "the settings for the port group." +
                         std::string(static_cast<std::size_t>(blanksBetweenSentences), ' ') +
                         "Using this in conjunction with other settings will first reset all of the fields to use the "
                         "virtual switch setting and then apply the other options after the reset.",
                     Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::ParameterConstraint> CdpStatusConstraint() {
    std::vector<CallSpec::ParameterConstraint::StringEnumValue> choices;
    for (const std::string word : HostCtl::Network::kCdpStatusWords) {
        choices.push_back({word, "CDP status is '" + word + "'"});
    }
    return StringEnum(choices);
}

int CdpStatusIndex(const std::string& word) {
    const auto& words = HostCtl::Network::kCdpStatusWords;
    const auto found = std::find_if(words.begin(), words.end(), [&](const char* w) { return word == w; });
    // The framework has already refused unknown words, but a caller that
    // bypasses it still gets a value the switch accepts.
    if (found == words.end()) return static_cast<int>(words.size()) - 1;
    return static_cast<int>(found - words.begin());
}

void AddFailoverParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec) {
    std::vector<CallSpec::ParameterConstraint::StringEnumValue> loadBalancing;
    for (const LoadBalancingWord& entry : kLoadBalancingWords) loadBalancing.push_back({entry.word, entry.description});
    DeclareParameter(inputSpec, "load-balancing", CallSpec::PARAM_STRING, "l",
                     "Set the load balancing policy for this policy. This can be one of the following options: "
                     "%FULLENUM%",
                     Required::No, StringEnum(loadBalancing));
    DeclareParameter(inputSpec, "failure-detection", CallSpec::PARAM_STRING, "f",
                     "Set the method of determining how a network outage is detected. %FULLENUM%", Required::No,
                     StringEnum({{"link", "Detect failures based on the NIC link state"},
                                 {"beacon", "Detect failures based on active beaconing to the vswitch"}}));
    DeclareParameter(inputSpec, "notify-switches", CallSpec::PARAM_BOOL, "n",
                     "Indicate whether to send a notification to physical switches on failover", Required::No);
    DeclareParameter(inputSpec, "failback", CallSpec::PARAM_BOOL, "b",
                     "Configure whether a NIC will be used immediately when it comes back in service after a failover",
                     Required::No);
    DeclareParameter(inputSpec, "active-uplinks", CallSpec::PARAM_STRING, "a",
                     "Configure the list of active adapters and their failover order. This list must be a comma "
                     "seperated list of values with the uplink name and no spaces. Example:  "
                     "--active-uplinks=hwnic0,hwnic3,hwnic7,hwnic1",
                     Required::No);
    DeclareParameter(inputSpec, "standby-uplinks", CallSpec::PARAM_STRING, "s",
                     "Configure the list of standby adapters and their failover order. This list must be a comma "
                     "seperated list of values with the uplink name and no spaces. Example:  "
                     "--standby-uplinks=hwnic2,hwnic4,hwnic8,hwnic6,hwnic11",
                     Required::No);
}

void AddSecurityParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec) {
    AddSecurityParameters(inputSpec, "o");
}

void AddSecurityParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec, const std::string& promiscuousShortName) {
    DeclareParameter(inputSpec, "allow-promiscuous", CallSpec::PARAM_BOOL, promiscuousShortName,
                     "Allow ports on the virtual switch to enter promiscuous mode.", Required::No);
    DeclareParameter(inputSpec, "allow-mac-change", CallSpec::PARAM_BOOL, "m",
                     "Allow ports on the virtual switch to change their MAC address.", Required::No);
    DeclareParameter(inputSpec, "allow-forged-transmits", CallSpec::PARAM_BOOL, "f",
                     "Allow ports on the virtual switch to send packets with forged source information.", Required::No);
}

void AddShapingParameters(boost::shared_ptr<CallSpec::InputSpec> inputSpec) {
    const std::int64_t unbounded = std::numeric_limits<std::int64_t>::max();
    DeclareParameter(inputSpec, "enabled", CallSpec::PARAM_BOOL, "e",
                     "Indicate whether to enable traffic shaping on this policy. If this is true then the "
                     "--avg-bandwidth, --peak-bandwidth and --burst-size options are required.",
                     Required::No);
    DeclareParameter(inputSpec, "avg-bandwidth", CallSpec::PARAM_INT, "b",
                     "The averge bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
                     "bits/s)",
                     Required::No, IntRange(1, unbounded));
    DeclareParameter(inputSpec, "peak-bandwidth", CallSpec::PARAM_INT, "k",
                     "The peak bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
                     "bits/s)",
                     Required::No, IntRange(1, unbounded));
    DeclareParameter(inputSpec, "burst-size", CallSpec::PARAM_INT, "t",
                     "The largest burst size allowed for this shaping policy. This value is in Kib (1 Kib = 1024 "
                     "bits)",
                     Required::No, IntRange(1, unbounded));
}

void SetFailoverPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output,
                       NicTeamingPolicy& policy, NicTeamingPolicy& referencePolicy,
                       std::vector<std::string>& vswitchUplinks) {
    if (input->IsSet("load-balancing")) {
        const std::string word = input->GetString("load-balancing");
        if (std::optional<TeamPolicyType> type = LoadBalancingType(word)) {
            policy.SetTeamingPolicy(*type);
        } else {
            output->SetError("Unknown Load Balancing policy: " + word);
        }
    }
    if (input->IsSet("failure-detection")) {
        const std::string word = input->GetString("failure-detection");
        if (word == "link" || word == "beacon") {
            LinkCriteriaSelectionPolicy criteria;
            criteria.SetBeacon(word == "link");
            policy.SetLinkCriteria(criteria);
        } else {
            output->SetError("Unknown failure detection type " + word);
        }
    }
    if (input->IsSet("notify-switches")) policy.SetNotifySwitchOnFailure(input->GetBool("notify-switches"));
    // Failing back at once is the opposite of restoring a recovered NIC gradually.
    if (input->IsSet("failback")) policy.SetRollingRestoration(!input->GetBool("failback"));

    const bool activeGiven = input->IsSet("active-uplinks");
    const bool standbyGiven = input->IsSet("standby-uplinks");
    std::vector<std::string> order;
    if (activeGiven) {
        AppendConnectedUplinks(input->GetString("active-uplinks"),
                               "Unknown NIC name in active uplinks : ", vswitchUplinks, *output, order);
        const int activeCount = static_cast<int>(order.size());
        if (!standbyGiven) KeepOldStandby(referencePolicy, order);
        policy.SetMaxActiveUplinks(activeCount);
        referencePolicy.SetMaxActiveUplinks(activeCount);
    }
    if (standbyGiven) {
        AppendConnectedUplinks(input->GetString("standby-uplinks"),
                               "Unknown NIC name in standby uplinks : ", vswitchUplinks, *output, order);
        if (!activeGiven) KeepOldActive(referencePolicy, policy, order);
    }
    if (!activeGiven && !standbyGiven) return;
    if (HasDuplicates(order)) {
        output->SetError("some NICs appear in the input for more than once.");
        return;
    }
    policy.SetUplinkOrder(order);
}

void SetSecurityPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output>,
                       HostCtl::Network::PortSecurityPolicy& policy) {
    if (input->IsSet("allow-promiscuous")) policy.SetAllowPromiscuous(input->GetBool("allow-promiscuous"));
    if (input->IsSet("allow-mac-change")) policy.SetAllowMacAddressChange(input->GetBool("allow-mac-change"));
    if (input->IsSet("allow-forged-transmits")) {
        policy.SetAllowForgedTransmits(input->GetBool("allow-forged-transmits"));
    }
}

void SetShapingPolicy(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output,
                      HostCtl::Network::ShapingPolicy& policy, bool requireAll) {
    bool enabled = false;
    if (input->IsSet("enabled")) {
        enabled = input->GetBool("enabled");
        policy.SetEnabled(enabled);
    }
    // The values of a policy that does not shape are not looked at, so they
    // are not taken either.
    if (!policy.GetEnabled()) return;
    const bool demanded = requireAll || enabled;
    ApplyScaled(*input, *output, "avg-bandwidth", kBitsPerKbit, demanded,
                [&](unsigned long long bps) { policy.SetAverageBps(bps); });
    ApplyScaled(*input, *output, "peak-bandwidth", kBitsPerKbit, demanded,
                [&](unsigned long long bps) { policy.SetPeakBps(bps); });
    ApplyScaled(*input, *output, "burst-size", kBytesPerKib, demanded,
                [&](unsigned long long bytes) { policy.SetBurstSize(bytes); });
}

std::vector<std::string> SplitUplinks(const std::string& text) {
    static const std::regex comma(",");
    // The standard token iterator turns a text without any comma into one
    // piece even when that text is empty; an empty list names no uplink.
    if (text.empty()) return {};
    return std::vector<std::string>(std::sregex_token_iterator(text.begin(), text.end(), comma, -1),
                                    std::sregex_token_iterator());
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
