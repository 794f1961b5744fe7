// The firewall's value types: one port rule and the allowed addresses of a
// ruleset.
#pragma once

#include <string>
#include <vector>

#include "hostctl/Values.h"

namespace HostCtl {
namespace System {

// One port rule, of a ruleset or added at run time (a dynamic rule). The
// codes are ints; the constants name them.
struct FirewallRule {
    static constexpr int PORT_TYPE_SRC = 0;
    static constexpr int PORT_TYPE_DST = 1;
    static constexpr int DIRECTION_INBOUND = 0;
    static constexpr int DIRECTION_OUTBOUND = 1;
    static constexpr int PROTOCOL_TCP = 0;
    static constexpr int PROTOCOL_UDP = 1;

    // Free text naming the rule; dynamic rules are told apart by it.
    std::string label;
    // PORT_TYPE_DST; any other value means source ports.
    int portType = PORT_TYPE_DST;
    // The port range, both ends included.
    int portBegin = 0;
    int portEnd = 0;
    // DIRECTION_INBOUND; any other value means outbound.
    int direction = DIRECTION_INBOUND;
    // PROTOCOL_TCP; any other value means UDP.
    int protocol = PROTOCOL_TCP;

    bool operator==(const FirewallRule& other) const {
        return label == other.label && portType == other.portType && portBegin == other.portBegin &&
               portEnd == other.portEnd && direction == other.direction && protocol == other.protocol;
    }
    bool operator!=(const FirewallRule& other) const { return !(*this == other); }
};

// The addresses and networks a ruleset allows, by family and kind, each in
// the order they were added.
struct FirewallIpList {
    std::vector<HostCtl::Network::Ipv4Address> ipv4Addresses;
    std::vector<HostCtl::Network::Ipv4Network> ipv4Networks;
    std::vector<HostCtl::Network::Ipv6Address> ipv6Addresses;
    std::vector<HostCtl::Network::Ipv6Network> ipv6Networks;
};

}  // namespace System
}  // namespace HostCtl
