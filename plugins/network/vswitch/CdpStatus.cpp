#include "vswitch/CdpStatus.h"

#include <algorithm>

namespace OrvixCli {
namespace NetworkNamespace {

const std::array<std::string, 4> kCdpStatusWords = {"down", "listen", "advertise", "both"};

int CdpStatusIndex(const std::string& word) {
    const auto found = std::find(kCdpStatusWords.begin(), kCdpStatusWords.end(), word);
    // The framework has already refused unknown words, but a caller that
    // bypasses it still gets a value the switch accepts.
    if (found == kCdpStatusWords.end()) return static_cast<int>(kCdpStatusWords.size()) - 1;
    return static_cast<int>(found - kCdpStatusWords.begin());
}

boost::shared_ptr<CallSpec::ParameterConstraint> CdpStatusConstraint() {
    boost::shared_ptr<CallSpec::ParameterConstraint> constraint =
        CallSpec::ParameterConstraint::New(CallSpec::CONSTRAINT_STRING_ENUM);
    for (const std::string& word : kCdpStatusWords) constraint->AddStringEnum(word, "CDP status is '" + word + "'");
    return constraint;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
