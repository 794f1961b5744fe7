// What the IP room's library tests share: the default host's facts they
// build on, and short ways to reach its interfaces and arm faults.
#pragma once

#include <gmock/gmock.h>

#include <memory>
#include <string>

#include "hostctl/HostFixture.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "hostctl/network/ip/NetstackInstanceImpl.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

class IpHost : public FreshHost {
protected:
    using ConnectionPoint = HostCtl::Network::ConnectionPoint;
    using DVPortImpl = PldCtl::Network::DVPortImpl;
    using IpConfig = HostCtl::Network::IpConfig;
    using Ipv4Address = HostCtl::Network::Ipv4Address;
    using Ipv6Network = HostCtl::Network::Ipv6Network;
    using MacAddress = HostCtl::Network::MacAddress;
    using PldNic = HostCtl::Network::PldNic;
    using PortGroupImpl = PldCtl::Network::PortGroupImpl;

    static constexpr const char* kDvsUuid = "6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4";
    static constexpr const char* kDefault = "defaultTcpipStack";

    PldCtl::Network::PalladNicInfoImpl info_;

    std::unique_ptr<PldNic> Nic(const std::string& name) {
        auto nic = info_.GetPalladNicByInterface(name, false);
        if (!nic) throw std::runtime_error("no interface " + name);
        return nic;
    }

    static DVPortImpl DvPort(const std::string& id, std::uint32_t connectionId = 0) {
        return DVPortImpl(HostCtl::Network::DVPortParam{kDvsUuid, id, connectionId});
    }

    void ArmFault(const std::string& operation, const std::string& key, const std::string& message) {
        std::vector<std::string> arguments = {"fault", "add", operation, "--message", message};
        if (!key.empty()) arguments.insert(arguments.end(), {"--key", key});
        HostSim(arguments);
    }
};
