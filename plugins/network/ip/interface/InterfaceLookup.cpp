#include "ip/interface/InterfaceLookup.h"

#include <utility>

namespace OrvixCli {
namespace NetworkNamespace {

std::unique_ptr<HostCtl::Network::PldNic> FindInterface(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                                        const std::string& name, MissingInterface how,
                                                        CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::PldNic> found = interfaces.GetPalladNicByInterface(name, false);
    if (!found) {
        output.SetError(how == MissingInterface::Pldnic ? "Unable to find pldnic with name " + name
                                                        : "Unable to find a Pallad interface with the name " + name);
    }
    return found;
}

std::unique_ptr<HostCtl::Network::PldNic> FindListedInterface(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                                              const std::string& name, CallSpec::Output& output) {
    for (auto& candidate : interfaces.GetPalladNics()) {
        if (candidate->GetName() == name) return std::move(candidate);
    }
    output.SetError("Unable to find an interface with name " + name);
    return nullptr;
}

std::optional<PldNicList> SelectInterfaces(PldCtl::Network::PalladNicInfoImpl& interfaces,
                                           const CallSpec::Input& input, const std::string& nameParameter,
                                           const std::string& netstackParameter, CallSpec::Output& output) {
    const std::string name = input.GetString(nameParameter);
    if (!name.empty()) {
        std::unique_ptr<HostCtl::Network::PldNic> one =
            FindInterface(interfaces, name, MissingInterface::PalladInterface, output);
        if (!one) return std::nullopt;
        PldNicList list;
        list.push_back(std::move(one));
        return list;
    }
    const std::string netstack = netstackParameter.empty() ? std::string() : input.GetString(netstackParameter);
    return netstack.empty() ? interfaces.GetPalladNics() : interfaces.GetPalladNicsByInstanceKey(netstack);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
