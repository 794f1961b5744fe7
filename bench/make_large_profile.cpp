// Writes a large host profile on stdout, for the benchmark: about 1000
// standard switches with 4096 ports in all, 2000 port groups, 256 kernel
// interfaces and 10000 routes. Deterministic: the same profile every time.
#include <iostream>
#include <string>

#include <nlohmann/json.hpp>

using Json = nlohmann::json;

namespace {

constexpr int kSwitches = 1000;
constexpr int kPorts = 4096;
constexpr int kPortGroupsPerSwitch = 2;
constexpr int kInterfaces = 256;
constexpr int kRoutes = 10000;
constexpr int kNics = 8;
constexpr long long kPortBlock = 1LL << 24;

std::string Mac(int a, int b) {
    char text[18];
    std::snprintf(text, sizeof text, "02:00:5e:%02x:%02x:%02x", a & 0xff, (b >> 8) & 0xff, b & 0xff);
    return text;
}

Json Teaming(const Json& order) {
    return {{"loadBalancing", "srcport"},  {"beacon", false},      {"notifySwitches", true},
            {"rollingRestoration", false}, {"uplinkOrder", order}, {"maxActive", 1}};
}

}  // namespace

int main() {
    Json profile = {{"format", "orvix-host-profile"}, {"version", 1}};
    profile["system"] = {{"hostname", "large.example.test"}, {"ipv6Enabled", true}, {"maxPorts", 4608}};

    Json nics = Json::array();
    for (int n = 0; n < kNics; ++n) {
        nics.push_back({{"name", "hwnic" + std::to_string(n)},
                        {"driver", "ixgben"},
                        {"adminUp", true},
                        {"linkUp", true},
                        {"speed", 10000},
                        {"duplex", "full"},
                        {"mtu", 1500},
                        {"mac", Mac(0xa0, n)},
                        {"uplinkPortId", (n + 2) * kPortBlock + 1}});
    }

    // The ports are spread over the switches: every switch gets kPorts /
    // kSwitches of them and the first ones one more, so there are kPorts in all.
    Json vswitches = Json::array(), portgroups = Json::array(), ports = Json::array();
    int interfaceIndex = 0;
    for (int s = 0; s < kSwitches; ++s) {
        const std::string name = "vSwitch" + std::to_string(s);
        const int numPorts = kPorts / kSwitches + (s < kPorts % kSwitches ? 1 : 0);
        const Json uplinks = s < kNics ? Json::array({"hwnic" + std::to_string(s)}) : Json::array();
        vswitches.push_back(
            {{"name", name},
             {"numPorts", numPorts},
             {"mtu", 1500},
             {"cdp", "listen"},
             {"beacon", {{"interval", 1}, {"threshold", 3}}},
             {"uplinks", uplinks},
             {"teaming", Teaming(uplinks)},
             {"security", {{"allowPromiscuous", false}, {"allowMacChange", true}, {"allowForgedTransmits", true}}},
             {"shaping",
              {{"enabled", false}, {"averageBps", 100000000}, {"peakBps", 100000000}, {"burstBytes", 104857600}}}});
        for (int g = 0; g < kPortGroupsPerSwitch; ++g) {
            Json pg = {{"name", name + "-pg" + std::to_string(g)}, {"vswitch", name}, {"vlanId", (s * 2 + g) % 4095}};
            if (g == 1) pg["security"] = {{"allowPromiscuous", true}};
            portgroups.push_back(pg);
        }
        for (int p = 0; p < numPorts; ++p) {
            Json port = {{"id", (s + 2) * kPortBlock + 1 + p}, {"portset", name}};
            if (p == 0 && s < kNics) {
                port["type"] = "uplink";
                port["client"] = "hwnic" + std::to_string(s);
            } else if (p == 1 && interfaceIndex < kInterfaces) {
                port["type"] = "kernel";
                port["client"] = "pld" + std::to_string(interfaceIndex++);
                port["portgroup"] = name + "-pg0";
            } else if (p % 2 == 0) {
                port["type"] = "vm";
                port["client"] = "vm" + std::to_string(s) + ".eth" + std::to_string(p);
                port["portgroup"] = name + "-pg1";
                port["mac"] = Mac(s, p);
            } else {
                port["client"] = "";
            }
            ports.push_back(port);
        }
    }

    Json interfaces = Json::array();
    for (int i = 0; i < kInterfaces; ++i) {
        const std::string sw = "vSwitch" + std::to_string(i);
        interfaces.push_back({{"name", "pld" + std::to_string(i)},
                              {"netstack", "defaultTcpipStack"},
                              {"mac", Mac(0xb0, i)},
                              {"mtu", 1500},
                              {"enabled", true},
                              {"portId", (i + 2) * kPortBlock + 2},
                              {"portgroup", sw + "-pg0"}});
    }

    // IPv4 host routes through the three documentation ranges, then IPv6
    // /48 routes under 2001:db8::/32 for the rest.
    Json routes = Json::array();
    const char* const v4Ranges[] = {"192.0.2.", "198.51.100.", "203.0.113."};
    for (int r = 0; r < kRoutes; ++r) {
        if (r < 3 * 256) {
            routes.push_back({{"netstack", "defaultTcpipStack"},
                              {"network", std::string(v4Ranges[r / 256]) + std::to_string(r % 256) + "/32"},
                              {"gateway", "192.0.2.1"},
                              {"interface", "pld0"}});
        } else {
            char network[40];
            std::snprintf(network, sizeof network, "2001:db8:%x::/48", r);
            routes.push_back({{"netstack", "defaultTcpipStack"},
                              {"network", network},
                              {"gateway", "2001:db8::1"},
                              {"interface", "pld0"}});
        }
    }

    profile["nics"] = nics;
    profile["vswitches"] = vswitches;
    profile["portgroups"] = portgroups;
    profile["netstacks"] =
        Json::array({{{"key", "defaultTcpipStack"}, {"name", "defaultTcpipStack"}, {"state", 4660}}});
    profile["interfaces"] = interfaces;
    profile["routes"] = routes;
    profile["ports"] = ports;
    std::cout << profile.dump(1) << "\n";
    return 0;
}
