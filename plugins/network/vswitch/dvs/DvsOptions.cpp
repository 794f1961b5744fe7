#include "vswitch/dvs/DvsOptions.h"

#include <array>
#include <cstdio>

#include "common/CommandSupport.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// Indexed by a LAG's load-balance value.
const std::array<const char*, 21> kLoadBalanceWords = {
    "None",
    "Dst mac",
    "Src mac",
    "Src and dst mac",
    "Dst ip",
    "Src ip",
    "Src and dst ip",
    "Vlan",
    "Dst ip and vlan",
    "Src ip and vlan",
    "Src and dst ip, vlan",
    "Dst port",
    "Src port",
    "Src and dst port",
    "Dst ip and dst port",
    "Src ip and src port",
    "Src and dst ip, port",
    "Dst ip and dst port, vlan",
    "Src ip and src port, vlan",
    "Src and dst ip, port, vlan",
    "Src portID",
};

// Indexed by bit number, bit 0 first.
const std::array<const char*, 8> kStateBitNames = {"ACT", "FTO", "AGG", "SYN", "COL", "DIST", "DEF", "EXP"};

const int kActiveMode = 1;
const int kPassiveMode = 2;

}  // namespace

boost::shared_ptr<CallSpec::InputSpec> LacpReaderInput() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "dvs", CallSpec::PARAM_STRING, "s", "The name of DVS to get configuration on",
                     Required::No);
    return declared;
}

std::string LoadBalanceText(std::int64_t value) {
    if (value < 0 || static_cast<std::uint64_t>(value) >= kLoadBalanceWords.size()) return std::to_string(value);
    return kLoadBalanceWords[static_cast<std::size_t>(value)];
}

std::string LagConfigModeText(int mode) {
    if (mode == kActiveMode) return "Active";
    if (mode == kPassiveMode) return "Passive";
    return "None";
}

std::string LagStatusModeText(int mode) {
    return mode == kPassiveMode ? "Passive" : "Active";
}

std::string PortStateNames(std::uint8_t state) {
    std::string names;
    for (std::size_t bit = 0; bit < kStateBitNames.size(); ++bit) {
        if (state & (1u << bit)) {
            names += kStateBitNames[bit];
            names += ',';
        }
    }
    return names;
}

std::string LacpAgeText(std::uint64_t seconds) {
    char text[32];
    std::snprintf(text, sizeof text, "%02llu:%02llu:%02llu", static_cast<unsigned long long>(seconds / 3600),
                  static_cast<unsigned long long>(seconds % 3600 / 60), static_cast<unsigned long long>(seconds % 60));
    return text;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
