// One table of the fields the host-control library reads from a profile, each
// with its type and documented range. The library's typed records read a
// field of another type as its default, and its arithmetic on stored counts
// relies on their ranges; checking here, when a profile is loaded, keeps such
// values out of the store, so a host never behaves differently from what its
// profile says. The store cannot see the library's records (it sits below
// the library, and orvix-hostsim and the store's tests use it without the
// library), which is why the table lives here rather than beside them.
#include "ProfileChecks.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <algorithm>
#include <cctype>
#include <cmath>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <vector>

#include "hoststore/CollectionNames.h"

namespace PldCtl {
namespace Store {

namespace {

constexpr std::int64_t kInt32Max = std::numeric_limits<std::int32_t>::max();
constexpr std::uint64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
constexpr std::uint64_t kUint64Max = std::numeric_limits<std::uint64_t>::max();
constexpr std::uint64_t kUint32Max = std::numeric_limits<std::uint32_t>::max();
constexpr std::uint64_t kUint16Max = std::numeric_limits<std::uint16_t>::max();

struct FieldCheck;
using FieldChecks = std::vector<FieldCheck>;

// What one field must hold. Integer ranges are inclusive; a whole number
// written with a fraction or an exponent counts as that integer, as the
// library reads it so.
struct FieldCheck {
    enum class Kind {
        String,
        Bool,
        Integer,
        Word,
        StringList,
        WordList,
        IntegerList,
        Object,
        ObjectList,
        HexBytes,
        Address,
        Network,
        AddressList,
        SingleWordList,
        AddressOrNetworkList,
    };

    const char* name;
    Kind kind;
    std::int64_t min = 0;
    std::uint64_t max = 0;
    std::vector<const char*> words = {};
    const FieldChecks* fields = nullptr;
    // Addresses and networks: 4 or 6, or 0 for either family; whether ""
    // stands for none.
    int family = 0;
    bool emptyAllowed = false;
};

FieldCheck Text(const char* name) {
    return {name, FieldCheck::Kind::String};
}
FieldCheck Flag(const char* name) {
    return {name, FieldCheck::Kind::Bool};
}
FieldCheck Names(const char* name) {
    return {name, FieldCheck::Kind::StringList};
}
FieldCheck Integer(const char* name, std::int64_t min, std::uint64_t max) {
    return {name, FieldCheck::Kind::Integer, min, max};
}
FieldCheck Word(const char* name, std::initializer_list<const char*> words) {
    return {name, FieldCheck::Kind::Word, 0, 0, words};
}
FieldCheck Words(const char* name, std::initializer_list<const char*> words) {
    return {name, FieldCheck::Kind::WordList, 0, 0, words};
}
FieldCheck Nested(const char* name, const FieldChecks& fields) {
    return {name, FieldCheck::Kind::Object, 0, 0, {}, &fields};
}
FieldCheck Integers(const char* name, std::int64_t min, std::uint64_t max) {
    return {name, FieldCheck::Kind::IntegerList, min, max};
}
FieldCheck NestedList(const char* name, const FieldChecks& fields) {
    return {name, FieldCheck::Kind::ObjectList, 0, 0, {}, &fields};
}
// A string of hex digit pairs, one pair a byte.
FieldCheck Bytes(const char* name) {
    return {name, FieldCheck::Kind::HexBytes};
}

// Canonical address text (as the library writes it and compares keys).
FieldCheck Address(const char* name, int family, bool emptyAllowed = false) {
    return {name, FieldCheck::Kind::Address, 0, 0, {}, nullptr, family, emptyAllowed};
}
// address/prefix in canonical text, no host bits set.
FieldCheck Network(const char* name, int family) {
    return {name, FieldCheck::Kind::Network, 0, 0, {}, nullptr, family};
}
FieldCheck Addresses(const char* name) {
    return {name, FieldCheck::Kind::AddressList};
}
// Canonical addresses or networks of either family, mixed.
FieldCheck AddressesOrNetworks(const char* name) {
    return {name, FieldCheck::Kind::AddressOrNetworkList};
}
// Names shown joined by blanks: no blank or control character inside.
FieldCheck SingleWords(const char* name) {
    return {name, FieldCheck::Kind::SingleWordList};
}

// The policies a switch holds whole and a port group in part.
const FieldChecks kTeaming = {
    Word("loadBalancing", {"iphash", "srcmac", "srcport", "explicit"}),
    Flag("beacon"),
    Flag("notifySwitches"),
    Flag("rollingRestoration"),
    Names("uplinkOrder"),
    Integer("maxActive", 0, kInt32Max),
};
const FieldChecks kSecurity = {Flag("allowPromiscuous"), Flag("allowMacChange"), Flag("allowForgedTransmits")};
const FieldChecks kShaping = {
    Flag("enabled"),
    Integer("averageBps", 0, kUint64Max),
    Integer("peakBps", 0, kUint64Max),
    Integer("burstBytes", 0, kUint64Max),
};
const FieldChecks kBeacon = {Integer("interval", 0, kInt32Max), Integer("threshold", 0, kInt32Max)};
const FieldChecks kCapabilities = {Flag("checksumOffload"), Flag("segmentationOffload"), Flag("vlanTagging")};

// The ports a switch of either kind may have.
constexpr std::int64_t kMinSwitchPorts = 1;
constexpr std::uint64_t kMaxSwitchPorts = 4096;

const FieldChecks kVswitch = {
    Text("name"),
    Text("class"),
    Integer("numPorts", kMinSwitchPorts, kMaxSwitchPorts),
    Integer("mtu", 1280, 9000),
    Word("cdp", {"down", "listen", "advertise", "both"}),
    Nested("beacon", kBeacon),
    Names("uplinks"),
    Nested("teaming", kTeaming),
    Nested("security", kSecurity),
    Nested("shaping", kShaping),
    Nested("capabilities", kCapabilities),
};
const FieldChecks kPortGroup = {
    Text("name"),
    Text("vswitch"),
    Integer("vlanId", 0, 4095),
    Nested("teaming", kTeaming),
    Nested("security", kSecurity),
    Nested("shaping", kShaping),
};
// LACP: the keys, priorities and port numbers of a session are 16-bit, its
// state bytes 8-bit; the load-balancing index points into a table of 21.
const FieldChecks kLacpLocal = {Integer("adminKey", 0, kUint16Max), Integer("operKey", 0, kUint16Max),
                                Integer("portPriority", 0, kUint16Max), Integer("portNumber", 0, kUint16Max),
                                Integer("state", 0, 255)};
const FieldChecks kLacpPartner = {Text("deviceId"),
                                  Text("flags"),
                                  Integer("age", 0, kUint64Max),
                                  Integer("operKey", 0, kUint16Max),
                                  Integer("portPriority", 0, kUint16Max),
                                  Integer("portNumber", 0, kUint16Max),
                                  Integer("state", 0, 255)};
const FieldChecks kLacpStats = {Integer("txLacpdus", 0, kUint64Max), Integer("rxLacpdus", 0, kUint64Max),
                                Integer("txErrors", 0, kUint64Max), Integer("rxErrors", 0, kUint64Max)};
const FieldChecks kLagMember = {Text("nic"),
                                Text("state"),
                                Flag("shortTimeout"),
                                Nested("local", kLacpLocal),
                                Nested("partner", kLacpPartner),
                                Nested("stats", kLacpStats)};
const FieldChecks kLag = {Integer("id", 0, kInt64Max), Text("name"), Word("mode", {"active", "passive", "none"}),
                          Integer("loadBalance", 0, 20), NestedList("members", kLagMember)};
const FieldChecks kDvSwitch = {
    Text("name"),
    Text("uuid"),
    Text("class"),
    Integer("numPorts", kMinSwitchPorts, kMaxSwitchPorts),
    Integer("mtu", 1280, 9000),
    Word("cdp", {"down", "listen", "advertise", "both"}),
    Integer("beaconTimeout", -1, kInt32Max),
    Flag("orvixBranded"),
    Names("uplinks"),
    NestedList("lags", kLag),
};
const FieldChecks kVlanStats = {Integer("vlanId", 0, 4095), Integer("rxPackets", 0, kUint64Max),
                                Integer("txPackets", 0, kUint64Max)};
const FieldChecks kPortStats = {
    Integer("rxPackets", 0, kUint64Max),   Integer("txPackets", 0, kUint64Max),   Integer("rxBytes", 0, kUint64Max),
    Integer("txBytes", 0, kUint64Max),     Integer("rxBroadcast", 0, kUint64Max), Integer("txBroadcast", 0, kUint64Max),
    Integer("rxMulticast", 0, kUint64Max), Integer("txMulticast", 0, kUint64Max), Integer("rxDropped", 0, kUint64Max),
    Integer("txDropped", 0, kUint64Max),
};
const FieldChecks kFilter = {
    Text("name"),
    Text("key"),
    Flag("present"),
    Word("direction", {"receive", "transmit"}),
    Flag("extended"),
    Integer("packetsIn", 0, kUint64Max),
    Integer("packetsOut", 0, kUint64Max),
    Integer("packetsDropped", 0, kUint64Max),
    Integer("packetsFiltered", 0, kUint64Max),
    Integer("packetsFaulted", 0, kUint64Max),
    Integer("packetsQueued", 0, kUint64Max),
    Integer("packetsInjected", 0, kUint64Max),
    Integer("packetErrors", 0, kUint64Max),
};
const FieldChecks kPort = {
    // The library hands port ids out as unsigned 32-bit numbers, so a larger
    // id could never be asked for and would read as another port's.
    Integer("id", 0, kUint32Max),
    Text("portset"),
    Word("type", {"vm", "kernel", "uplink", "internal"}),
    Text("client"),
    Text("portgroup"),
    Text("dvPortId"),
    Integer("worldId", 0, kUint32Max),
    Text("mac"),
    Address("ip", 4),
    Text("teamUplink"),
    Nested("stats", kPortStats),
    NestedList("filters", kFilter),
    Flag("vlanStatsEnabled"),
    NestedList("vlanStats", kVlanStats),
};
// Physical NICs and their driver data. Codes that no word names (ports,
// wake-on-LAN modes) are allowed, as a driver may report them.
const FieldChecks kLinkMode = {Integer("speed", 0, kUint32Max), Word("duplex", {"auto", "full", "half"})};
const FieldChecks kPause = {Flag("supported"), Flag("autoNegotiate"),         Flag("rx"),
                            Flag("tx"),        Integer("rxResolution", 0, 1), Integer("txResolution", 0, 1)};
const FieldChecks kCoalesce = {
    Flag("adaptiveRx"),
    Flag("adaptiveTx"),
    Integer("sampleInterval", 0, kUint32Max),
    Integer("rxUsecs", 0, kUint32Max),
    Integer("rxMaxFrames", 0, kUint32Max),
    Integer("txUsecs", 0, kUint32Max),
    Integer("txMaxFrames", 0, kUint32Max),
};
const FieldChecks kRingSizes = {Integer("rx", 0, kUint32Max), Integer("rxMini", 0, kUint32Max),
                                Integer("rxJumbo", 0, kUint32Max), Integer("tx", 0, kUint32Max)};
const FieldChecks kRings = {Nested("preset", kRingSizes), Nested("current", kRingSizes)};
const FieldChecks kOffloads = {Flag("rxChecksum"), Flag("txChecksum"), Flag("scatterGather"), Flag("tso")};
const FieldChecks kSoftwareSimulation = {
    Flag("ipv4Cso"),
    Flag("ipv4Tso"),
    Flag("scatterGather"),
    Flag("offsetBasedOffload"),
    Flag("vxlanEncap"),
    Flag("ipv6Tso"),
    Flag("ipv6TsoExt"),
    Flag("ipv6Cso"),
    Flag("ipv6CsoExt"),
    Flag("highDma"),
    Flag("scatterGatherMultiPage"),
    Flag("vlanTagging"),
    Flag("vlanUntagging"),
    Flag("geneveOffload"),
};
const FieldChecks kNicStats = {
    Integer("rxPackets", 0, kUint64Max),       Integer("txPackets", 0, kUint64Max),
    Integer("rxBytes", 0, kUint64Max),         Integer("txBytes", 0, kUint64Max),
    Integer("rxDropped", 0, kUint64Max),       Integer("txDropped", 0, kUint64Max),
    Integer("rxMulticast", 0, kUint64Max),     Integer("rxBroadcast", 0, kUint64Max),
    Integer("txMulticast", 0, kUint64Max),     Integer("txBroadcast", 0, kUint64Max),
    Integer("rxErrors", 0, kUint64Max),        Integer("rxLengthErrors", 0, kUint64Max),
    Integer("rxOverErrors", 0, kUint64Max),    Integer("rxCrcErrors", 0, kUint64Max),
    Integer("rxFrameErrors", 0, kUint64Max),   Integer("rxFifoErrors", 0, kUint64Max),
    Integer("rxMissedErrors", 0, kUint64Max),  Integer("txErrors", 0, kUint64Max),
    Integer("txAbortedErrors", 0, kUint64Max), Integer("txCarrierErrors", 0, kUint64Max),
    Integer("txFifoErrors", 0, kUint64Max),    Integer("txHeartbeatErrors", 0, kUint64Max),
    Integer("txWindowErrors", 0, kUint64Max),
};
const FieldChecks kSelfTest = {Flag("passed"), Names("online"), Names("offline")};
const FieldChecks kVfStats = {
    Integer("rxUnicastPackets", 0, kUint64Max),   Integer("rxUnicastBytes", 0, kUint64Max),
    Integer("rxMulticastPackets", 0, kUint64Max), Integer("rxMulticastBytes", 0, kUint64Max),
    Integer("rxBroadcastPackets", 0, kUint64Max), Integer("rxBroadcastBytes", 0, kUint64Max),
    Integer("rxOutOfBufferDrops", 0, kUint64Max), Integer("rxErrorDrops", 0, kUint64Max),
    Integer("rxLroPackets", 0, kUint64Max),       Integer("rxLroBytes", 0, kUint64Max),
    Integer("txUnicastPackets", 0, kUint64Max),   Integer("txUnicastBytes", 0, kUint64Max),
    Integer("txMulticastPackets", 0, kUint64Max), Integer("txMulticastBytes", 0, kUint64Max),
    Integer("txBroadcastPackets", 0, kUint64Max), Integer("txBroadcastBytes", 0, kUint64Max),
    Integer("txErrors", 0, kUint64Max),           Integer("txDiscards", 0, kUint64Max),
    Integer("txTsoPackets", 0, kUint64Max),       Integer("txTsoBytes", 0, kUint64Max),
};
const FieldChecks kVf = {Integer("id", 0, 255), Flag("active"), Text("pciAddress"),
                         Integer("ownerWorldId", 0, kUint32Max), Nested("stats", kVfStats)};
const FieldChecks kNic = {
    Text("name"),
    Text("pciDevice"),
    Text("vendorName"),
    Text("deviceName"),
    Text("driver"),
    Text("driverVersion"),
    Text("firmwareVersion"),
    Flag("adminUp"),
    Flag("linkUp"),
    Integer("speed", 0, kUint32Max),
    Word("duplex", {"full", "half"}),
    Flag("autoNegotiation"),
    Integer("mtu", 0, kUint32Max),
    Text("mac"),
    Integers("supportedPorts", 0, kInt32Max),
    Integer("port", 0, kInt32Max),
    Word("transceiver", {"internal", "external"}),
    Integer("phyAddress", 0, kInt32Max),
    Text("virtualAddress"),
    Flag("supportsAutoNegotiation"),
    Flag("advertisedAutoNegotiation"),
    NestedList("advertisedLinkModes", kLinkMode),
    Flag("supportsWakeOn"),
    Integers("wakeOn", 0, kInt32Max),
    Flag("supportsMessageLevel"),
    Integer("messageLevel", 0, kUint32Max),
    Integer("uplinkPortId", 0, kUint32Max),
    Nested("pause", kPause),
    Nested("coalesce", kCoalesce),
    Nested("rings", kRings),
    Nested("offloads", kOffloads),
    Nested("softwareSimulation", kSoftwareSimulation),
    Nested("stats", kNicStats),
    Integers("registers", 0, kUint32Max),
    Bytes("eeprom"),
    Integer("eepromMagic", 0, kUint32Max),
    Nested("selfTest", kSelfTest),
    NestedList("sriovVfs", kVf),
};
const FieldChecks kModule = {Text("name"), Flag("loaded"), Text("options")};
const FieldChecks kSystem = {
    Flag("ipv6Enabled"),
    Integer("maxPorts", 1, kInt64Max),
    Names("congestionControlAlgorithms"),
    NestedList("modules", kModule),
};
// A port rule, of a ruleset or of the firewall's dynamic rules.
const FieldChecks kFirewallRule = {
    Text("label"),
    Word("direction", {"inbound", "outbound"}),
    Word("protocol", {"tcp", "udp"}),
    Word("portType", {"dst", "src"}),
    Integer("portBegin", 0, 65535),
    Integer("portEnd", 0, 65535),
};
const FieldChecks kFirewall = {
    Flag("enabled"),
    Word("defaultAction", {"PASS", "DROP"}),
    Flag("rulesetsLoaded"),
    NestedList("dynamicRules", kFirewallRule),
};
const FieldChecks kFirewallRuleset = {
    Text("name"),
    Flag("enabled"),
    Flag("allowedAll"),
    AddressesOrNetworks("allowedIps"),
    NestedList("rules", kFirewallRule),
};
const FieldChecks kDvPort = {Text("dvswitch"),    Text("id"),
                             Text("portgroupId"), Integer("connectionId", 0, kUint32Max),
                             Flag("lacpEnabled"), Word("lacpMode", {"active", "passive", "none"})};
const FieldChecks kNetstack = {
    Text("key"),
    Text("name"),
    Integer("state", 0, kInt32Max),
    Integer("maxConnections", 1, kInt32Max),
    Integer("currentMaxConnections", 0, kInt32Max),
    Text("ccAlgorithm"),
    Flag("ipv6Enabled"),
    Flag("currentIpv6Enabled"),
    Address("ipv4Gateway", 4, true),
    Address("ipv6Gateway", 6, true),
    Addresses("dnsServers"),
    SingleWords("searchDomains"),
};
const FieldChecks kIpv6Address = {
    Text("address"),
    Word("type", {"static", "autoconf", "dhcp"}),
    Word("status", {"preferred", "tentative", "duplicated", "deprecated"}),
};
const FieldChecks kInterface = {
    Text("name"),
    Text("netstack"),
    Text("portgroup"),
    Text("dvswitch"),
    Text("dvPortId"),
    Text("opaqueNetworkId"),
    Text("opaqueNetworkType"),
    Text("externalId"),
    Text("opaqueSwitch"),
    Integer("portId", 0, kUint32Max),
    Text("mac"),
    Integer("mtu", 1280, 9000),
    Integer("tsoMss", 0, kInt32Max),
    Flag("enabled"),
    Word("ipv4Mode", {"static", "dhcp", "none"}),
    Text("ipv4Address"),
    Text("ipv4Netmask"),
    Flag("dhcpDns"),
    Flag("ipv6Dhcp"),
    Flag("ipv6RouterAdv"),
    NestedList("ipv6Addresses", kIpv6Address),
    Words("tags", {"Management", "LiveMigration", "FaultTolerance", "Backup", "Replication", "Provisioning", "Storage",
                   "Telemetry"}),
};
const FieldChecks kRoute = {
    Text("netstack"), Network("network", 0), Address("gateway", 0), Text("interface"), Text("source"),
};
constexpr std::int64_t kInt32Min = std::numeric_limits<std::int32_t>::min();
const FieldChecks kNeighbor = {
    Text("netstack"),
    Text("interface"),
    Address("address", 0),
    Text("mac"),
    // IPv4 entries count signed, IPv6 entries unsigned 32-bit seconds.
    Integer("expiry", kInt32Min, kUint32Max),
    Word("type", {"Dynamic", "Static", "Local", "Router"}),
    Word("state", {"Incomplete", "Reachable", "Stale", "Delay", "Probe"}),
};
// A TCP state is any text: one the library has no word for shows as empty.
const FieldChecks kConnection = {
    Text("netstack"),
    Word("proto", {"tcp", "udp", "ip"}),
    Address("localAddress", 0),
    Integer("localPort", 0, 65535),
    Address("foreignAddress", 0),
    Integer("foreignPort", 0, 65535),
    Integer("recvQ", 0, kUint32Max),
    Integer("sendQ", 0, kUint32Max),
    Text("state"),
    Integer("worldId", 0, kUint32Max),
    Text("ccAlgorithm"),
};
const FieldChecks kWorld = {Integer("id", 0, kUint32Max), Text("name"), Word("kind", {"vm", "host"})};
const FieldChecks kIpsec = {Text("ikeConfigPath"), Text("ikeConfig"), Text("ikeConfigSource"),
                            Flag("ikeDaemonsRunning")};
const FieldChecks kSa = {
    Text("name"),
    Flag("auto"),
    Address("source", 6),
    Address("destination", 6),
    Integer("spi", 0, kUint32Max),
    Word("mode", {"any", "transport", "tunnel"}),
    Word("encryptionAlgorithm", {"null", "3des-cbc", "aes128-cbc"}),
    Text("encryptionKey"),
    Word("integrityAlgorithm", {"hmac-sha1", "hmac-sha2-256"}),
    Text("integrityKey"),
    Word("state", {"larval", "mature", "dying", "dead"}),
    Integer("lifetime", 0, kUint64Max),
};
const FieldChecks kSp = {
    Text("name"),
    Text("saName"),
    Network("source", 6),
    Network("destination", 6),
    Integer("sourcePort", 0, 65535),
    Integer("destinationPort", 0, 65535),
    Word("protocol", {"any", "tcp", "udp", "icmp6"}),
    Word("direction", {"in", "out"}),
    Word("action", {"none", "discard", "ipsec"}),
    Word("mode", {"any", "transport", "tunnel"}),
};
const FieldChecks kExec = {Text("command"), Integer("exitStatus", 0, 255)};

const FieldChecks* ChecksOf(const std::string& section) {
    static const std::vector<std::pair<const char*, const FieldChecks*>> sections = {
        {Section::kVswitches, &kVswitch},
        {Section::kPortGroups, &kPortGroup},
        {Section::kDvSwitches, &kDvSwitch},
        {Section::kPorts, &kPort},
        {Section::kNics, &kNic},
        {Section::kSystem, &kSystem},
        {Section::kDvPorts, &kDvPort},
        {Section::kNetstacks, &kNetstack},
        {Section::kInterfaces, &kInterface},
        {Section::kExecLog, &kExec},
        {Section::kRoutes, &kRoute},
        {Section::kNeighbors, &kNeighbor},
        {Section::kConnections, &kConnection},
        {Section::kWorlds, &kWorld},
        {Section::kIpsec, &kIpsec},
        {Section::kIpsecSAs, &kSa},
        {Section::kIpsecSPs, &kSp},
        {Section::kFirewall, &kFirewall},
        {Section::kFirewallRulesets, &kFirewallRuleset},
    };
    for (const auto& [name, checks] : sections) {
        if (section == name) return checks;
    }
    return nullptr;
}

// The family (4 or 6) of canonical address text, or 0 for text that is no
// address or not written as the library writes it.
int CanonicalFamily(const std::string& text) {
    for (const int family : {AF_INET, AF_INET6}) {
        unsigned char bytes[sizeof(in6_addr)];
        char back[INET6_ADDRSTRLEN];
        if (inet_pton(family, text.c_str(), bytes) == 1 && inet_ntop(family, bytes, back, sizeof back) &&
            text == back) {
            return family == AF_INET ? 4 : 6;
        }
    }
    return 0;
}

std::string FamilyWords(int family) {
    return family == 4 ? "an IPv4 address" : family == 6 ? "an IPv6 address" : "an IP address";
}

std::string AddressMismatch(const FieldCheck& check, const Json& value) {
    const std::string wanted =
        FamilyWords(check.family) + " in canonical text" + (check.emptyAllowed ? " or \"\"" : "");
    if (!value.is_string()) return "must be " + wanted + ", not " + value.type_name();
    const std::string& text = value.get_ref<const std::string&>();
    if (text.empty() && check.emptyAllowed) return "";
    const int family = CanonicalFamily(text);
    if (family != 0 && (check.family == 0 || check.family == family)) return "";
    return "must be " + wanted + ", not '" + text + "'";
}

// address/prefix with a canonical address, a decimal prefix within the
// family's length and no host bits set.
std::string NetworkMismatch(const FieldCheck& check, const Json& value) {
    const std::string wanted = (check.family == 4   ? "an IPv4"
                                : check.family == 6 ? "an IPv6"
                                                    : "an IP") +
                               std::string(" network address/prefix");
    if (!value.is_string()) return "must be " + wanted + ", not " + value.type_name();
    const std::string& text = value.get_ref<const std::string&>();
    const std::string why = "must be " + wanted + " in canonical text with no host bits set, not '" + text + "'";
    const auto slash = text.find('/');
    if (slash == std::string::npos) return why;
    const std::string address = text.substr(0, slash);
    const std::string prefix = text.substr(slash + 1);
    const int family = CanonicalFamily(address);
    if (family == 0 || (check.family != 0 && check.family != family)) return why;
    if (prefix.empty() || prefix.size() > 3 || (prefix.size() > 1 && prefix[0] == '0') ||
        !std::all_of(prefix.begin(), prefix.end(), [](char c) { return c >= '0' && c <= '9'; })) {
        return why;
    }
    const int length = std::stoi(prefix);
    const int bits = family == 4 ? 32 : 128;
    if (length > bits) return why;
    unsigned char bytes[sizeof(in6_addr)] = {};
    inet_pton(family == 4 ? AF_INET : AF_INET6, address.c_str(), bytes);
    for (int bit = length; bit < bits; ++bit) {
        if (bytes[bit / 8] & (0x80 >> (bit % 8))) return why;
    }
    return "";
}

bool IsWhole(const Json& value, std::int64_t min, std::uint64_t max) {
    if (value.is_number_unsigned()) {
        const std::uint64_t n = value.get<std::uint64_t>();
        return (min <= 0 || n >= static_cast<std::uint64_t>(min)) && n <= max;
    }
    if (value.is_number_integer()) {
        const std::int64_t n = value.get<std::int64_t>();
        return n >= min && (n < 0 || static_cast<std::uint64_t>(n) <= max);
    }
    if (!value.is_number_float()) return false;
    const double real = value.get<double>();
    // Every bound is exact enough as a double for a whole number to be
    // compared with it; 2^64 itself is the first value above kUint64Max.
    return real == std::trunc(real) && real >= static_cast<double>(min) &&
           (max == kUint64Max ? real < 18446744073709551616.0 : real <= static_cast<double>(max));
}

std::string Range(const FieldCheck& check) {
    return "an integer from " + std::to_string(check.min) + " to " + std::to_string(check.max);
}

// Why the value is none of the check's words; empty when it is one.
std::string WordMismatch(const FieldCheck& check, const Json& value, const std::string& found) {
    std::string list;
    for (const char* word : check.words) {
        if (value.is_string() && value.get<std::string>() == word) return "";
        list += (list.empty() ? "" : ", ") + std::string(word);
    }
    return "must be one of " + list + (value.is_string() ? ", not '" + value.get<std::string>() + "'" : found);
}

// The store joins the key fields of some collections with '|' into one key
// (dvports: switch and port id). A '|' inside one of them could make two
// objects' keys the same ("a|b" + "c" and "a" + "b|c"), so it is refused.
void CheckJoinedKey(const std::string& section, const Json& object, const std::string& where) {
    const CollectionInfo* collection = nullptr;
    for (const CollectionInfo& c : Collections()) {
        if (section == c.section) collection = &c;
    }
    if (!collection || collection->keyFields.size() < 2) return;
    for (const char* field : collection->keyFields) {
        const auto value = object.find(field);
        if (value != object.end() && value->is_string() &&
            value->get_ref<const std::string&>().find('|') != std::string::npos) {
            throw ProfileError(where + "." + field + ": must not contain '|', which joins the fields of a key");
        }
    }
}

bool IsSingleWord(const std::string& text) {
    return !text.empty() && std::none_of(text.begin(), text.end(), [](char c) {
        const auto byte = static_cast<unsigned char>(c);
        return byte <= ' ' || byte == 0x7f;
    });
}

// A route's gateway is of its network's family.
void CheckRouteFamilies(const Json& route, const std::string& where) {
    const auto network = route.find("network");
    const auto gateway = route.find("gateway");
    if (network == route.end() || gateway == route.end() || !network->is_string() || !gateway->is_string()) return;
    const bool ipv6Network = network->get_ref<const std::string&>().find(':') != std::string::npos;
    const bool ipv6Gateway = gateway->get_ref<const std::string&>().find(':') != std::string::npos;
    if (ipv6Network != ipv6Gateway) {
        throw ProfileError(where + ".gateway: must be an " + (ipv6Network ? "IPv6" : "IPv4") +
                           " address like its network, not '" + gateway->get<std::string>() + "'");
    }
}

// Why the value does not fit the check; empty when it fits.
std::string Mismatch(const FieldCheck& check, const Json& value, const std::string& where);

void CheckFields(const FieldChecks& checks, const Json& object, const std::string& where) {
    for (const FieldCheck& check : checks) {
        const auto value = object.find(check.name);
        if (value == object.end()) continue;
        const std::string place = where + "." + check.name;
        const std::string why = Mismatch(check, *value, place);
        if (!why.empty()) throw ProfileError(place + ": " + why);
    }
}

std::string Mismatch(const FieldCheck& check, const Json& value, const std::string& where) {
    const std::string found = std::string(", not ") + (value.is_number() ? value.dump() : value.type_name());
    switch (check.kind) {
        case FieldCheck::Kind::String:
            return value.is_string() ? "" : "must be a string" + found;
        case FieldCheck::Kind::Bool:
            return value.is_boolean() ? "" : "must be true or false" + found;
        case FieldCheck::Kind::Integer:
            return IsWhole(value, check.min, check.max) ? "" : "must be " + Range(check) + found;
        case FieldCheck::Kind::Word:
            return WordMismatch(check, value, found);
        case FieldCheck::Kind::WordList:
            if (!value.is_array()) return "must be an array of strings" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                const std::string why = WordMismatch(
                    check, value[i],
                    std::string(", not ") + (value[i].is_number() ? value[i].dump() : value[i].type_name()));
                if (!why.empty()) return "item " + std::to_string(i) + " " + why;
            }
            return "";
        case FieldCheck::Kind::StringList:
            if (!value.is_array()) return "must be an array of strings" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                if (!value[i].is_string()) {
                    return "item " + std::to_string(i) + " must be a string" + std::string(", not ") +
                           (value[i].is_number() ? value[i].dump() : value[i].type_name());
                }
            }
            return "";
        case FieldCheck::Kind::IntegerList:
            if (!value.is_array()) return "must be an array of integers" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                if (!IsWhole(value[i], check.min, check.max)) {
                    return "item " + std::to_string(i) + " must be " + Range(check) + std::string(", not ") +
                           (value[i].is_number() ? value[i].dump() : value[i].type_name());
                }
            }
            return "";
        case FieldCheck::Kind::Object:
            if (!value.is_object()) return "must be a JSON object" + found;
            CheckFields(*check.fields, value, where);
            return "";
        case FieldCheck::Kind::ObjectList:
            if (!value.is_array()) return "must be an array of JSON objects" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                const std::string item = where + "[" + std::to_string(i) + "]";
                if (!value[i].is_object()) {
                    throw ProfileError(item + ": must be a JSON object, not " +
                                       (value[i].is_number() ? value[i].dump() : value[i].type_name()));
                }
                CheckFields(*check.fields, value[i], item);
            }
            return "";
        case FieldCheck::Kind::Address:
            return AddressMismatch(check, value);
        case FieldCheck::Kind::Network:
            return NetworkMismatch(check, value);
        case FieldCheck::Kind::AddressOrNetworkList:
            if (!value.is_array()) return "must be an array of strings" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                if (value[i].is_string() && value[i].get_ref<const std::string&>().find('/') != std::string::npos) {
                    const std::string why = NetworkMismatch(check, value[i]);
                    if (!why.empty()) return "item " + std::to_string(i) + " " + why;
                } else if (!AddressMismatch(check, value[i]).empty()) {
                    return "item " + std::to_string(i) + " must be an IP address or an IP network address/prefix" +
                           " in canonical text, not " +
                           (value[i].is_string() ? "'" + value[i].get<std::string>() + "'" : value[i].type_name());
                }
            }
            return "";
        case FieldCheck::Kind::AddressList:
        case FieldCheck::Kind::SingleWordList:
            if (!value.is_array()) return "must be an array of strings" + found;
            for (std::size_t i = 0; i < value.size(); ++i) {
                std::string why;
                if (check.kind == FieldCheck::Kind::AddressList) {
                    why = AddressMismatch(check, value[i]);
                } else if (!value[i].is_string()) {
                    why = std::string("must be a string, not ") + value[i].type_name();
                } else if (!IsSingleWord(value[i].get_ref<const std::string&>())) {
                    why = "must be a name without blanks or control characters, not '" + value[i].get<std::string>() +
                          "'";
                }
                if (!why.empty()) return "item " + std::to_string(i) + " " + why;
            }
            return "";
        case FieldCheck::Kind::HexBytes: {
            if (!value.is_string()) return "must be a string of hex digit pairs" + found;
            const std::string& text = value.get_ref<const std::string&>();
            if (text.size() % 2 != 0) return "must be a string of hex digit pairs, not an odd number of digits";
            for (std::size_t i = 0; i < text.size(); ++i) {
                if (!std::isxdigit(static_cast<unsigned char>(text[i]))) {
                    return "must be a string of hex digit pairs, not '" + std::string(1, text[i]) + "' at position " +
                           std::to_string(i);
                }
            }
            return "";
        }
    }
    return "";
}

}  // namespace

void CheckSectionFields(const std::string& section, const Json& value) {
    const FieldChecks* checks = ChecksOf(section);
    if (value.is_object()) {
        if (checks) CheckFields(*checks, value, section);
        return;
    }
    for (std::size_t i = 0; i < value.size(); ++i) {
        const std::string where = section + "[" + std::to_string(i) + "]";
        if (!value[i].is_object()) continue;
        CheckJoinedKey(section, value[i], where);
        if (checks) CheckFields(*checks, value[i], where);
        if (section == Section::kRoutes) CheckRouteFamilies(value[i], where);
    }
}

}  // namespace Store
}  // namespace PldCtl
