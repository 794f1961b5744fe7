#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

std::string MissingMessage(MissingNic how, const std::string& name) {
    switch (how) {
        case MissingNic::NoPnic:
            return "There is no pnic with name " + name;
        case MissingNic::PnicNotFound:
            return "Pnic with name " + name + " not found";
        case MissingNic::NicNotFound:
            return "NIC with name " + name + " not found";
    }
    return "There is no pnic with name " + name;
}

}  // namespace

std::unique_ptr<HostCtl::Network::Pnic> FindPnic(HostCtl::Network::NetworkInfo& nics, const std::string& name,
                                                 MissingNic how, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::Pnic> pnic = nics.GetPnicByName(name);
    if (!pnic) output.SetError(MissingMessage(how, name));
    return pnic;
}

bool FindSriovNic(PldCtl::Network::NetworkInfoImpl& nics, const std::string& name, CallSpec::Output& output) {
    if (nics.GetSriovNicByName(name)) return true;
    output.SetError("There is no SRIOV Nic with name " + name);
    return false;
}

std::optional<std::vector<std::unique_ptr<HostCtl::Network::Pnic>>> SelectPnics(HostCtl::Network::NetworkInfo& nics,
                                                                                const CallSpec::Input& input,
                                                                                const std::string& parameter,
                                                                                MissingNic how,
                                                                                CallSpec::Output& output) {
    if (!input.IsSet(parameter)) return nics.GetPnics();
    std::unique_ptr<HostCtl::Network::Pnic> pnic = FindPnic(nics, input.GetString(parameter), how, output);
    if (!pnic) return std::nullopt;
    std::vector<std::unique_ptr<HostCtl::Network::Pnic>> one;
    one.push_back(std::move(pnic));
    return one;
}

HostCtl::Network::Portset* FindUplinkSwitch(const std::vector<std::unique_ptr<HostCtl::Network::Portset>>& switches,
                                            const std::string& nic, CallSpec::Output& output) {
    for (const auto& vswitch : switches) {
        if (!dynamic_cast<const HostCtl::Network::VirtualSwitch*>(vswitch.get())) continue;
        for (const std::string& uplink : vswitch->GetUplinks()) {
            if (uplink == nic) return vswitch.get();
        }
    }
    output.SetError(nic + " is not a valid NIC connected to any virtual switch.");
    return nullptr;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
