#include "vswitch/CdpStatus.h"

#include <algorithm>

#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

int CdpStatusIndex(const std::string& word) {
    const auto& words = HostCtl::Network::kCdpStatusWords;
    const auto found = std::find_if(words.begin(), words.end(), [&](const char* w) { return word == w; });
    // The framework has already refused unknown words, but a caller that
    // bypasses it still gets a value the switch accepts.
    if (found == words.end()) return static_cast<int>(words.size()) - 1;
    return static_cast<int>(found - words.begin());
}

boost::shared_ptr<CallSpec::ParameterConstraint> CdpStatusConstraint() {
    boost::shared_ptr<CallSpec::ParameterConstraint> constraint =
        CallSpec::ParameterConstraint::New(CallSpec::CONSTRAINT_STRING_ENUM);
    for (const std::string word : HostCtl::Network::kCdpStatusWords) {
        constraint->AddStringEnum(word, "CDP status is '" + word + "'");
    }
    return constraint;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
