#include "ip/netstack/NetstackOptions.h"

#include "common/CommandSupport.h"
#include "hostctl/network/ip/NetstackInstanceImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

boost::shared_ptr<CallSpec::InputSpec> NetstackKeyInput(const std::string& description) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "netstack", CallSpec::PARAM_STRING, "N", description, Required::Yes);
    return declared;
}

std::vector<CallSpec::ParameterConstraint::StringEnumValue> CongestionControlChoices() {
    std::vector<CallSpec::ParameterConstraint::StringEnumValue> choices;
    for (const std::string& name : PldCtl::Network::NetstackInstanceImpl::GetCongestionControlAlgorithmList()) {
        choices.push_back({name, "Set " + name + " as the algorithm"});
    }
    return choices;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
