// Writes a large host profile on stdout, for the benchmark: 1000 standard and
// 8 distributed switches with 4096 ports in all, 2000 port groups, 256 kernel
// interfaces over 16 netstacks, 10000 IPv4 routes (and 256 IPv6 ones), 2000
// neighbors, 5000 connections of 64 worlds, 500 virtual machines with ports on
// both kinds of switch, 64 NICs with their driver data (the last 32 in the
// LAGs of the distributed switches) and 200 firewall rulesets with 5000 rules
// and 2000 allowed addresses. Deterministic: the same profile every time.
#include <cstdint>
#include <cstdio>
#include <iostream>
#include <string>

#include <nlohmann/json.hpp>

using Json = nlohmann::json;

namespace {

constexpr int kSwitches = 1000;
constexpr int kDvSwitches = 8;
// Each distributed switch has four uplinks in two LAGs, 64 VM ports and 12
// free ones; the standard switches share the rest of the 4096 ports.
constexpr int kDvUplinks = 4;
constexpr int kDvVmPorts = 64;
constexpr int kDvPorts = 80;
constexpr int kPorts = 4096;
constexpr int kStandardPorts = kPorts - kDvSwitches * kDvPorts;
constexpr int kPortGroupsPerSwitch = 2;
constexpr int kInterfaces = 256;
constexpr int kNetstacks = 16;
constexpr int kIpv4Routes = 10000;
constexpr int kIpv6Routes = 256;
constexpr int kNeighbors = 2000;
constexpr int kConnections = 5000;
constexpr int kWorlds = 64;
constexpr int kVms = 500;
constexpr int kNics = 64;
// NICs hwnic0 to hwnic31 are uplinks of the first standard switches, the
// others of the distributed switches.
constexpr int kStandardUplinkNics = kNics - kDvSwitches * kDvUplinks;
// Every switch has a block of port ids; switch n (standard ones first, then
// the distributed ones) starts at (n + 2) * kPortBlock + 1. The blocks are
// small enough for every id of the host to stay within 32 bits, as port ids
// must.
constexpr long long kPortBlock = 1LL << 16;
constexpr int kRulesets = 200;
constexpr int kRulesPerRuleset = 25;       // 5000 rules
constexpr int kAllowedIpsPerRuleset = 10;  // 2000 allowed addresses
// Virtual machine v is the world kVmWorldBase + v, named "orvm:vmNNN".
constexpr long long kVmWorldBase = 3000000;

long long PortId(int switchIndex, int port) {
    return (switchIndex + 2) * kPortBlock + 1 + port;
}

static_assert((kSwitches + kDvSwitches + 2) * kPortBlock <= 0xffffffffLL, "port ids must fit in 32 bits");

std::string Mac(int a, int b) {
    char text[18];
    std::snprintf(text, sizeof text, "02:00:5e:%02x:%02x:%02x", a & 0xff, (b >> 8) & 0xff, b & 0xff);
    return text;
}

// Deterministic pseudo-random numbers for counters and register dumps.
std::uint64_t Mix(int seed) {
    std::uint64_t x = static_cast<std::uint64_t>(seed);
    x ^= x >> 33;
    x *= 0xff51afd7ed558ccdULL;
    x ^= x >> 33;
    return x;
}

// Every eighth NIC has no link.
bool HasLink(int n) {
    return n % 8 != 7;
}

std::string VmName(int v) {
    char name[16];
    std::snprintf(name, sizeof name, "vm%03d", v);
    return name;
}

// A NIC with the driver data of a real one: 10 Gb/s, fibre and copper
// by turns, every sixteenth SR-IOV capable.
Json Nic(int n, long long uplinkPortId) {
    const bool fibre = n % 2 == 0;
    const bool link = HasLink(n);
    Json registers = Json::array();
    for (int r = 0; r < 24; ++r) registers.push_back(Mix(n * 64 + r) & 0xffffffffULL);
    std::string eeprom;
    for (int b = 0; b < 128; ++b) {
        char pair[3];
        std::snprintf(pair, sizeof pair, "%02x", static_cast<unsigned>(Mix(n * 1024 + b) & 0xff));
        eeprom += pair;
    }
    char pciDevice[16];
    std::snprintf(pciDevice, sizeof pciDevice, "0000:%02x:00.%d", 0x10 + n / 2, n % 2);
    const std::uint64_t rx = Mix(n) % 100000000, tx = Mix(n + 1000) % 100000000;
    Json nic = {
        {"name", "hwnic" + std::to_string(n)},
        {"pciDevice", pciDevice},
        {"vendorName", fibre ? "Corvex Systems" : "Larkspur Networks Inc."},
        {"deviceName", fibre ? "CX4 10GbE SFP+ Adapter" : "LN540 10GBASE-T Controller"},
        {"driver", fibre ? "cvx10" : "lrk10g"},
        {"driverVersion", fibre ? "3.1.5" : "5.0.2"},
        {"firmwareVersion", fibre ? "14.22.1002" : "2.40, 0x80001122"},
        {"adminUp", true},
        {"linkUp", link},
        {"speed", link ? 10000 : 0},
        {"duplex", link ? "full" : "half"},
        {"autoNegotiation", !fibre},
        {"mtu", n % 4 == 0 ? 9000 : 1500},
        {"mac", Mac(0xa0, n)},
        {"supportedPorts", fibre ? Json::array({4}) : Json::array({0})},
        {"port", fibre ? 4 : 0},
        {"transceiver", fibre ? "external" : "internal"},
        {"phyAddress", fibre ? 0 : n % 32},
        {"supportsAutoNegotiation", !fibre},
        {"advertisedAutoNegotiation", !fibre},
        {"advertisedLinkModes",
         fibre ? Json::array({{{"speed", 10000}, {"duplex", "full"}}})
               : Json::array({{{"speed", 1000}, {"duplex", "full"}}, {{"speed", 10000}, {"duplex", "full"}}})},
        {"supportsWakeOn", !fibre},
        {"wakeOn", fibre ? Json::array() : Json::array({5})},
        {"supportsMessageLevel", true},
        {"messageLevel", 7},
        {"uplinkPortId", uplinkPortId},
        {"pause",
         {{"supported", true},
          {"autoNegotiate", !fibre},
          {"rx", true},
          {"tx", true},
          {"rxResolution", link ? 1 : 0},
          {"txResolution", link ? 1 : 0}}},
        {"coalesce",
         {{"adaptiveRx", true},
          {"adaptiveTx", fibre},
          {"sampleInterval", 0},
          {"rxUsecs", 50},
          {"rxMaxFrames", 0},
          {"txUsecs", 50},
          {"txMaxFrames", 0}}},
        {"rings",
         {{"preset", {{"rx", 8192}, {"rxMini", 0}, {"rxJumbo", 0}, {"tx", 8192}}},
          {"current", {{"rx", 1024}, {"rxMini", 0}, {"rxJumbo", 0}, {"tx", 1024}}}}},
        {"offloads", {{"rxChecksum", true}, {"txChecksum", true}, {"scatterGather", true}, {"tso", true}}},
        {"softwareSimulation", {{"ipv6TsoExt", true}, {"ipv6CsoExt", true}, {"geneveOffload", fibre}}},
        {"stats",
         {{"rxPackets", rx},
          {"txPackets", tx},
          {"rxBytes", rx * 900},
          {"txBytes", tx * 700},
          {"rxDropped", rx % 97},
          {"rxMulticast", rx / 200},
          {"rxBroadcast", rx / 90},
          {"txMulticast", tx / 800},
          {"txBroadcast", tx / 1500}}},
        {"registers", registers},
        {"eeprom", eeprom},
        {"eepromMagic", fibre ? 0x10de4d2a : 0x5a17c0fb},
        {"selfTest",
         {{"passed", link},
          {"online", {std::string("Link test (on/offline)        ") + (link ? "0" : "1")}},
          {"offline",
           {"Register test (offline)       0", "Eeprom test (offline)         0",
            std::string("Link test (on/offline)        ") + (link ? "0" : "1")}}}},
    };
    if (n % 16 == 0) {
        Json vfs = Json::array();
        for (int vf = 0; vf < 8; ++vf) {
            char address[16];
            std::snprintf(address, sizeof address, "0000:%02x:10.%d", 0x10 + n / 2, vf);
            vfs.push_back({{"id", vf}, {"active", vf < 2}, {"pciAddress", address}, {"ownerWorldId", 0}});
        }
        nic["sriovVfs"] = vfs;
    }
    return nic;
}

// The firewall: its module loaded, two dynamic rules, and rulesets with
// rules of every kind and allowed lists mixing both families, addresses and
// networks. Every fifth ruleset allows every address, every third is off.
void AddFirewall(Json& profile) {
    profile["system"]["modules"] = Json::array({{{"name", "tovrinfw"}, {"loaded", true}, {"options", ""}}});
    const auto rule = [](const char* direction, const char* protocol, const char* portType, int begin, int end) {
        return Json{{"direction", direction},
                    {"protocol", protocol},
                    {"portType", portType},
                    {"portBegin", begin},
                    {"portEnd", end}};
    };
    Json dynamicRules =
        Json::array({rule("inbound", "tcp", "dst", 8100, 8103), rule("outbound", "udp", "src", 902, 902)});
    dynamicRules[0]["label"] = "migration-session-1";
    dynamicRules[1]["label"] = "console-session-2";
    profile["firewall"] = {
        {"enabled", true}, {"defaultAction", "DROP"}, {"rulesetsLoaded", true}, {"dynamicRules", dynamicRules}};
    const char* ipv4Ranges[] = {"192.0.2", "198.51.100", "203.0.113"};
    Json rulesets = Json::array();
    for (int r = 0; r < kRulesets; ++r) {
        Json rules = Json::array();
        for (int j = 0; j < kRulesPerRuleset; ++j) {
            const int port = 1024 + r * kRulesPerRuleset + j;
            rules.push_back(
                rule(j % 2 ? "outbound" : "inbound", j % 3 ? "tcp" : "udp", j % 5 ? "dst" : "src", port, port + j % 4));
        }
        // Canonical text: three IPv4 and three IPv6 addresses, two networks
        // of each family.
        char group[8];
        std::snprintf(group, sizeof group, "%x", r + 1);
        const std::string host = std::to_string(r % 254 + 1);
        Json allowed = Json::array();
        for (int k = 0; k < kAllowedIpsPerRuleset; ++k) {
            if (k < 3) {
                allowed.push_back(std::string(ipv4Ranges[k]) + "." + host);
            } else if (k < 6) {
                allowed.push_back("2001:db8:" + std::string(group) + "::" + std::to_string(k));
            } else if (k < 8) {
                allowed.push_back(std::string(ipv4Ranges[k - 5]) + "." + std::to_string(r % 16 * 16) + "/28");
            } else {
                allowed.push_back("2001:db8:" + std::string(group) + ":" + std::to_string(k) + "::/64");
            }
        }
        rulesets.push_back({{"name", "ruleset" + std::to_string(r)},
                            {"enabled", r % 3 != 0},
                            {"allowedAll", r % 5 == 0},
                            {"allowedIps", allowed},
                            {"rules", rules}});
    }
    profile["firewallRulesets"] = rulesets;
}

Json Teaming(const Json& order) {
    return {{"loadBalancing", "srcport"},  {"beacon", false},      {"notifySwitches", true},
            {"rollingRestoration", false}, {"uplinkOrder", order}, {"maxActive", 1}};
}

// Distributed switch d: its uplinks in two LAGs (active and passive, with
// different load balancing), one DV port per port (uplinks, then VM ports in
// two port groups, then free ones) and the port-set ports. The LAG members
// of a NIC without a link are down with no partner. VM port k of the
// switches, counted over all of them, belongs to virtual machine k modulo
// kVms, so every virtual machine has a port on a distributed switch.
void AddDvSwitch(int d, Json& nics, Json& dvswitches, Json& dvports, Json& ports) {
    const std::string name = "dvSwitch" + std::to_string(d);
    const int switchIndex = kSwitches + d;
    const std::string uplinkGroup = "dvpg-" + std::to_string(1000 + d * 10);
    Json uplinks = Json::array(), lags = Json::array();
    for (int lag = 0; lag < 2; ++lag) {
        const bool active = lag == 0;
        Json members = Json::array();
        for (int k = lag * 2; k < lag * 2 + 2; ++k) {
            const int n = kStandardUplinkNics + d * kDvUplinks + k;
            const bool link = HasLink(n);
            // Aggregatable and either in sync, collecting and distributing
            // (0x3c) or defaulted (0x44); bit 0 marks the active mode.
            const int localState = (active ? 1 : 0) | (link ? 0x3c : 0x44);
            members.push_back(
                {{"nic", "hwnic" + std::to_string(n)},
                 {"state", link ? "Bundled" : "Down"},
                 {"shortTimeout", false},
                 {"local",
                  {{"adminKey", 9 + lag},
                   {"operKey", 9 + lag},
                   {"portPriority", 255},
                   {"portNumber", k + 1},
                   {"state", localState}}},
                 {"partner",
                  {{"deviceId", link ? Mac(0xfe, d) : "00:00:00:00:00:00"},
                   {"flags", link ? "SA" : ""},
                   {"age", link ? 20 + k : 0},
                   {"operKey", link ? 16 + lag : 0},
                   {"portPriority", link ? 32768 : 0},
                   {"portNumber", link ? 17 + k : 0},
                   {"state", link ? 61 : 0}}},
                 {"stats",
                  {{"txLacpdus", 100000 + n}, {"rxLacpdus", link ? 99990 + n : 0}, {"txErrors", 0}, {"rxErrors", 0}}}});
        }
        lags.push_back({{"id", lag + 1},
                        {"name", "lag" + std::to_string(lag + 1)},
                        {"mode", active ? "active" : "passive"},
                        {"loadBalance", (d * 2 + lag) % 21},
                        {"members", members}});
    }
    for (int p = 0; p < kDvPorts; ++p) {
        const std::string dvPortId = std::to_string(p);
        Json dvport = {{"dvswitch", name}, {"id", dvPortId}};
        Json port = {{"id", PortId(switchIndex, p)}, {"portset", name}};
        if (p < kDvUplinks) {
            const int n = kStandardUplinkNics + d * kDvUplinks + p;
            const std::string nic = "hwnic" + std::to_string(n);
            uplinks.push_back(nic);
            nics[static_cast<std::size_t>(n)] = Nic(n, PortId(switchIndex, p));
            dvport.update({{"portgroupId", uplinkGroup},
                           {"connectionId", 1100000000 + switchIndex * 100 + p},
                           {"lacpEnabled", true},
                           {"lacpMode", p < 2 ? "active" : "passive"}});
            port.update({{"type", "uplink"}, {"client", nic}, {"dvPortId", dvPortId}, {"teamUplink", nic}});
        } else if (p < kDvUplinks + kDvVmPorts) {
            const int k = d * kDvVmPorts + p - kDvUplinks;
            const int v = k % kVms;
            dvport.update({{"portgroupId", "dvpg-" + std::to_string(1000 + d * 10 + 1 + p % 2)},
                           {"connectionId", 1200000000 + switchIndex * 100 + p}});
            port.update({{"type", "vm"},
                         {"client", VmName(v) + ".eth" + std::to_string(10 + k / kVms)},
                         {"dvPortId", dvPortId},
                         {"worldId", kVmWorldBase + v},
                         {"mac", Mac(0xe0 + d, 0x8000 + p)},
                         {"teamUplink", uplinks[static_cast<std::size_t>(p % kDvUplinks)]}});
        } else {
            dvport.update({{"portgroupId", "dvpg-" + std::to_string(1000 + d * 10 + 1)}, {"connectionId", 0}});
            port["client"] = "";
        }
        dvports.push_back(dvport);
        ports.push_back(port);
    }
    char uuid[40];
    std::snprintf(uuid, sizeof uuid, "5a0c1d00-8e2f-4b61-a7d3-%012x", d + 1);
    dvswitches.push_back({{"name", name},
                          {"uuid", uuid},
                          {"numPorts", kDvPorts},
                          {"mtu", 9000},
                          {"cdp", "listen"},
                          {"beaconTimeout", -1},
                          {"orvixBranded", true},
                          {"uplinks", uplinks},
                          {"lags", lags}});
}

}  // namespace

int main() {
    Json profile = {{"format", "orvix-host-profile"}, {"version", 1}};
    profile["system"] = {{"hostname", "large.example.test"}, {"ipv6Enabled", true}, {"maxPorts", 4608}};

    // The NICs of the standard switches; the distributed switches make theirs.
    Json nics = Json::array();
    for (int n = 0; n < kNics; ++n) nics.push_back(n < kStandardUplinkNics ? Nic(n, PortId(n, 0)) : Json());

    // The standard switches' ports are spread over them: every switch gets
    // kStandardPorts / kSwitches of them and the first ones one more. Their
    // VM ports are the virtual machines' in turn.
    Json vswitches = Json::array(), portgroups = Json::array(), ports = Json::array();
    int interfaceIndex = 0, vmPortIndex = 0;
    for (int s = 0; s < kSwitches; ++s) {
        const std::string name = "vSwitch" + std::to_string(s);
        const int numPorts = kStandardPorts / kSwitches + (s < kStandardPorts % kSwitches ? 1 : 0);
        const Json uplinks = s < kStandardUplinkNics ? Json::array({"hwnic" + std::to_string(s)}) : Json::array();
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
            Json port = {{"id", PortId(s, p)}, {"portset", name}};
            if (p == 0 && s < kStandardUplinkNics) {
                port["type"] = "uplink";
                port["client"] = "hwnic" + std::to_string(s);
            } else if (p == 1 && interfaceIndex < kInterfaces) {
                port["type"] = "kernel";
                port["client"] = "pld" + std::to_string(interfaceIndex++);
                port["portgroup"] = name + "-pg0";
            } else if (p % 2 == 0) {
                const int v = vmPortIndex % kVms;
                port["type"] = "vm";
                port["client"] = VmName(v) + ".eth" + std::to_string(vmPortIndex++ / kVms);
                port["portgroup"] = name + "-pg1";
                port["worldId"] = kVmWorldBase + v;
                port["mac"] = Mac(s, p);
            } else {
                port["client"] = "";
            }
            ports.push_back(port);
        }
    }

    Json dvswitches = Json::array(), dvports = Json::array();
    for (int d = 0; d < kDvSwitches; ++d) AddDvSwitch(d, nics, dvswitches, dvports, ports);

    // The interfaces take the netstacks in turn, pld0 (which the routes use)
    // the default one, and each has a static address; every fourth netstack
    // is in the configuration only.
    Json netstacks = Json::array({{{"key", "defaultTcpipStack"}, {"name", "defaultTcpipStack"}, {"state", 4660}}});
    for (int n = 1; n < kNetstacks; ++n) {
        netstacks.push_back({{"key", "stack" + std::to_string(n)}, {"state", n % 4 == 0 ? 2 : 4660}});
    }
    Json interfaces = Json::array();
    for (int i = 0; i < kInterfaces; ++i) {
        const std::string sw = "vSwitch" + std::to_string(i);
        interfaces.push_back({{"name", "pld" + std::to_string(i)},
                              {"netstack", netstacks[static_cast<std::size_t>(i % kNetstacks)]["key"]},
                              {"ipv4Mode", "static"},
                              {"ipv4Address", "198.51.100." + std::to_string(i % 254 + 1)},
                              {"ipv4Netmask", "255.255.255.0"},
                              {"mac", Mac(0xb0, i)},
                              {"mtu", 1500},
                              {"enabled", true},
                              {"portId", PortId(i, 1)},
                              {"portgroup", sw + "-pg0"}});
    }

    // The default netstack's table: its default route, then IPv4 host routes
    // through the three documentation ranges, each network via several
    // gateways of pld0's network (as a multipath route is stored), then
    // IPv6 /48 routes under 2001:db8::/32.
    Json routes = Json::array();
    routes.push_back({{"netstack", "defaultTcpipStack"},
                      {"network", "0.0.0.0/0"},
                      {"gateway", "198.51.100.254"},
                      {"interface", "pld0"}});
    const char* const v4Ranges[] = {"192.0.2.", "198.51.100.", "203.0.113."};
    for (int r = 1; r < kIpv4Routes + kIpv6Routes; ++r) {
        if (r < kIpv4Routes) {
            const int host = r % (3 * 256);
            routes.push_back({{"netstack", "defaultTcpipStack"},
                              {"network", std::string(v4Ranges[host / 256]) + std::to_string(host % 256) + "/32"},
                              {"gateway", "198.51.100." + std::to_string(2 + r / (3 * 256))},
                              {"interface", "pld0"},
                              {"source", r % 7 == 0 ? "DHCP" : "MANUAL"}});
        } else {
            char network[40];
            std::snprintf(network, sizeof network, "2001:db8:%x::/48", r);
            routes.push_back({{"netstack", "defaultTcpipStack"},
                              {"network", network},
                              {"gateway", "2001:db8::1"},
                              {"interface", "pld0"}});
        }
    }

    // Neighbors on the default netstack's interfaces (pld0, pld16, ...),
    // half of each family, every type and state in turn.
    const char* const ipv4Types[] = {"Dynamic", "Static", "Local"};
    const char* const ipv6Types[] = {"Dynamic", "Static", "Local", "Router"};
    const char* const ipv6States[] = {"Incomplete", "Reachable", "Stale", "Delay", "Probe"};
    Json neighbors = Json::array();
    for (int n = 0; n < kNeighbors; ++n) {
        const int slot = n / (kInterfaces / kNetstacks);
        Json neighbor = {{"netstack", "defaultTcpipStack"},
                         {"interface", "pld" + std::to_string((n % (kInterfaces / kNetstacks)) * kNetstacks)},
                         {"mac", Mac(0xc0, n)},
                         {"expiry", n % 1200}};
        if (n < kNeighbors / 2) {
            neighbor["address"] = std::string(v4Ranges[slot / 254]) + std::to_string(slot % 254 + 1);
            neighbor["type"] = ipv4Types[n % 3];
        } else {
            char address[40];
            std::snprintf(address, sizeof address, "2001:db8:ff::%x", slot + 1);
            neighbor["address"] = address;
            neighbor["type"] = ipv6Types[n % 4];
            neighbor["state"] = ipv6States[n % 5];
        }
        neighbors.push_back(neighbor);
    }

    // Worlds, and the default netstack's endpoints they own: TCP in every
    // state, UDP and raw IP.
    Json worlds = Json::array();
    for (int w = 0; w < kWorlds; ++w) {
        worlds.push_back({{"id", 2000000 + w}, {"name", "bench-world-" + std::to_string(w)}, {"kind", "host"}});
    }
    const char* const tcpStates[] = {"CLOSED",     "LISTEN",  "SYN_SENT", "RCVD",       "ESTABLISHED", "CLOSE_WAIT",
                                     "FIN_WAIT_1", "CLOSING", "LAST_ACK", "FIN_WAIT_2", "TIME_WAIT"};
    Json connections = Json::array();
    for (int c = 0; c < kConnections; ++c) {
        Json connection = {{"netstack", "defaultTcpipStack"}, {"worldId", 2000000 + c % kWorlds}};
        if (c < kConnections * 3 / 5) {
            connection.update({{"proto", "tcp"},
                               {"localAddress", "198.51.100.1"},
                               {"localPort", 1024 + c},
                               {"foreignAddress", "203.0.113." + std::to_string(c % 254 + 1)},
                               {"foreignPort", 40000 + c % 20000},
                               {"state", tcpStates[c % 11]},
                               {"ccAlgorithm", c % 2 ? "cubic" : "newreno"}});
        } else if (c < kConnections * 9 / 10) {
            connection.update({{"proto", "udp"},
                               {"localAddress", "198.51.100.1"},
                               {"localPort", 10000 + c},
                               {"foreignAddress", "0.0.0.0"},
                               {"foreignPort", 0}});
        } else {
            connection.update({{"proto", "ip"},
                               {"localAddress", "192.0.2." + std::to_string(c % 254 + 1)},
                               {"localPort", 0},
                               {"foreignAddress", "203.0.113." + std::to_string(c / 254 % 254 + 1)},
                               {"foreignPort", 0}});
        }
        connections.push_back(connection);
    }

    for (int v = 0; v < kVms; ++v) {
        worlds.push_back({{"id", kVmWorldBase + v}, {"name", "orvm:" + VmName(v)}, {"kind", "vm"}});
    }

    profile["nics"] = nics;
    profile["vswitches"] = vswitches;
    profile["portgroups"] = portgroups;
    profile["dvswitches"] = dvswitches;
    profile["dvports"] = dvports;
    profile["netstacks"] = netstacks;
    profile["interfaces"] = interfaces;
    profile["routes"] = routes;
    profile["neighbors"] = neighbors;
    profile["connections"] = connections;
    profile["worlds"] = worlds;
    profile["ports"] = ports;
    AddFirewall(profile);
    std::cout << profile.dump(1) << "\n";
    return 0;
}
