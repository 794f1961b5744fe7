// One table of the fields the host-control library reads from a profile, each
// with its type and documented range. The library's typed records read a
// field of another type as its default, and its arithmetic on stored counts
// relies on their ranges; checking here, when a profile is loaded, keeps such
// values out of the store, so a host never behaves differently from what its
// profile says. The store cannot see the library's records (it sits below
// the library, and orvix-hostsim and the store's tests use it without the
// library), which is why the table lives here rather than beside them.
#include "ProfileChecks.h"

#include <cmath>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <vector>

#include "hoststore/CollectionNames.h"

namespace PldCtl {
namespace Store {

namespace {

constexpr std::int64_t kInt32Max = std::numeric_limits<std::int32_t>::max();
constexpr std::uint64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
constexpr std::uint64_t kUint64Max = std::numeric_limits<std::uint64_t>::max();

struct FieldCheck;
using FieldChecks = std::vector<FieldCheck>;

// What one field must hold. Integer ranges are inclusive; a whole number
// written with a fraction or an exponent counts as that integer, as the
// library reads it so.
struct FieldCheck {
    enum class Kind { String, Bool, Integer, Word, StringList, Object };

    const char* name;
    Kind kind;
    std::int64_t min = 0;
    std::uint64_t max = 0;
    std::vector<const char*> words = {};
    const FieldChecks* fields = nullptr;
};

FieldCheck Text(const char* name) {
    return {name, FieldCheck::Kind::String};
}
FieldCheck Flag(const char* name) {
    return {name, FieldCheck::Kind::Bool};
}
FieldCheck Names(const char* name) {
    return {name, FieldCheck::Kind::StringList};
}
FieldCheck Integer(const char* name, std::int64_t min, std::uint64_t max) {
    return {name, FieldCheck::Kind::Integer, min, max};
}
FieldCheck Word(const char* name, std::initializer_list<const char*> words) {
    return {name, FieldCheck::Kind::Word, 0, 0, words};
}
FieldCheck Nested(const char* name, const FieldChecks& fields) {
    return {name, FieldCheck::Kind::Object, 0, 0, {}, &fields};
}

// The policies a switch holds whole and a port group in part.
const FieldChecks kTeaming = {
    Word("loadBalancing", {"iphash", "srcmac", "srcport", "explicit"}),
    Flag("beacon"),
    Flag("notifySwitches"),
    Flag("rollingRestoration"),
    Names("uplinkOrder"),
    Integer("maxActive", 0, kInt32Max),
};
const FieldChecks kSecurity = {Flag("allowPromiscuous"), Flag("allowMacChange"), Flag("allowForgedTransmits")};
const FieldChecks kShaping = {
    Flag("enabled"),
    Integer("averageBps", 0, kUint64Max),
    Integer("peakBps", 0, kUint64Max),
    Integer("burstBytes", 0, kUint64Max),
};
const FieldChecks kBeacon = {Integer("interval", 0, kInt32Max), Integer("threshold", 0, kInt32Max)};
const FieldChecks kCapabilities = {Flag("checksumOffload"), Flag("segmentationOffload"), Flag("vlanTagging")};

// The ports a switch of either kind may have.
constexpr std::int64_t kMinSwitchPorts = 1;
constexpr std::uint64_t kMaxSwitchPorts = 4096;

const FieldChecks kVswitch = {
    Text("name"),
    Text("class"),
    Integer("numPorts", kMinSwitchPorts, kMaxSwitchPorts),
    Integer("mtu", 1280, 9000),
    Word("cdp", {"down", "listen", "advertise", "both"}),
    Nested("beacon", kBeacon),
    Names("uplinks"),
    Nested("teaming", kTeaming),
    Nested("security", kSecurity),
    Nested("shaping", kShaping),
    Nested("capabilities", kCapabilities),
};
const FieldChecks kPortGroup = {
    Text("name"),
    Text("vswitch"),
    Integer("vlanId", 0, 4095),
    Nested("teaming", kTeaming),
    Nested("security", kSecurity),
    Nested("shaping", kShaping),
};
const FieldChecks kDvSwitch = {
    Text("name"),
    Integer("numPorts", kMinSwitchPorts, kMaxSwitchPorts),
    Names("uplinks"),
};
const FieldChecks kPort = {
    // Port ids pass 32 bits on a host of many switches, whose id blocks
    // start at (n + 2) * 2^24.
    Integer("id", 0, kInt64Max), Text("portset"), Word("type", {"vm", "kernel", "uplink", "internal"}), Text("client"),
    Text("portgroup"),
};
const FieldChecks kNic = {Text("name"), Integer("uplinkPortId", 0, kInt64Max)};
const FieldChecks kSystem = {
    Flag("ipv6Enabled"),
    Integer("maxPorts", 1, kInt64Max),
};

const FieldChecks* ChecksOf(const std::string& section) {
    static const std::vector<std::pair<const char*, const FieldChecks*>> sections = {
        {Section::kVswitches, &kVswitch},
        {Section::kPortGroups, &kPortGroup},
        {Section::kDvSwitches, &kDvSwitch},
        {Section::kPorts, &kPort},
        {Section::kNics, &kNic},
        {Section::kSystem, &kSystem},
    };
    for (const auto& [name, checks] : sections) {
        if (section == name) return checks;
    }
    return nullptr;
}

bool IsWhole(const Json& value, std::int64_t min, std::uint64_t max) {
    if (value.is_number_unsigned()) {
        const std::uint64_t n = value.get<std::uint64_t>();
        return (min <= 0 || n >= static_cast<std::uint64_t>(min)) && n <= max;
    }
    if (value.is_number_integer()) {
        const std::int64_t n = value.get<std::int64_t>();
        return n >= min && (n < 0 || static_cast<std::uint64_t>(n) <= max);
    }
    if (!value.is_number_float()) return false;
    const double real = value.get<double>();
    // Every bound is exact enough as a double for a whole number to be
    // compared with it; 2^64 itself is the first value above kUint64Max.
    return real == std::trunc(real) && real >= static_cast<double>(min) &&
           (max == kUint64Max ? real < 18446744073709551616.0 : real <= static_cast<double>(max));
}

std::string Range(const FieldCheck& check) {
    return "an integer from " + std::to_string(check.min) + " to " + std::to_string(check.max);
}

// Why the value does not fit the check; empty when it fits.
std::string Mismatch(const FieldCheck& check, const Json& value, const std::string& where);

void CheckFields(const FieldChecks& checks, const Json& object, const std::string& where) {
    for (const FieldCheck& check : checks) {
        const auto value = object.find(check.name);
        if (value == object.end()) continue;
        const std::string place = where + "." + check.name;
        const std::string why = Mismatch(check, *value, place);
        if (!why.empty()) throw ProfileError(place + ": " + why);
    }
}

std::string Mismatch(const FieldCheck& check, const Json& value, const std::string& where) {
    const std::string found = std::string(", not ") + (value.is_number() ? value.dump() : value.type_name());
    switch (check.kind) {
        case FieldCheck::Kind::String:
            return value.is_string() ? "" : "must be a string" + found;
        case FieldCheck::Kind::Bool:
            return value.is_boolean() ? "" : "must be true or false" + found;
        case FieldCheck::Kind::Integer:
            return IsWhole(value, check.min, check.max) ? "" : "must be " + Range(check) + found;
        case FieldCheck::Kind::Word: {
            std::string list;
            for (const char* word : check.words) {
                if (value.is_string() && value.get<std::string>() == word) return "";
                list += (list.empty() ? "" : ", ") + std::string(word);
            }
            return "must be one of " + list + (value.is_string() ? ", not '" + value.get<std::string>() + "'" : found);
        }
        case FieldCheck::Kind::StringList:
            if (!value.is_array()) return "must be an array of strings" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                if (!value[i].is_string()) {
                    return "item " + std::to_string(i) + " must be a string" + std::string(", not ") +
                           (value[i].is_number() ? value[i].dump() : value[i].type_name());
                }
            }
            return "";
        case FieldCheck::Kind::Object:
            if (!value.is_object()) return "must be a JSON object" + found;
            CheckFields(*check.fields, value, where);
            return "";
    }
    return "";
}

}  // namespace

void CheckSectionFields(const std::string& section, const Json& value) {
    const FieldChecks* checks = ChecksOf(section);
    if (!checks) return;
    if (value.is_object()) {
        CheckFields(*checks, value, section);
        return;
    }
    for (std::size_t i = 0; i < value.size(); ++i) {
        CheckFields(*checks, value[i], section + "[" + std::to_string(i) + "]");
    }
}

}  // namespace Store
}  // namespace PldCtl
