// Profiles: every way a profile can be wrong, and the message that says where.
#include <gtest/gtest.h>

#include "support/store_test_util.h"

namespace {

using PldCtl::Store::ParseProfile;
using PldCtl::Store::ProfileError;

// The ProfileError message of an action, or "(accepted)".
template <typename Action>
std::string Failure(Action action) {
    try {
        action();
    } catch (const ProfileError& e) {
        return e.what();
    }
    return "(accepted)";
}

std::string ErrorOf(const std::string& text) {
    return Failure([&] { ParseProfile(text, "t.json"); });
}

// A profile with the required header and the given sections.
std::string WithSections(const std::string& sections) {
    return R"({"format": "orvix-host-profile", "version": 1, )" + sections + "}";
}

TEST(ProfileTest, HeaderShapeAndJsonErrors) {
    EXPECT_EQ(ErrorOf("[]"), "profile t.json: the top level must be a JSON object");
    EXPECT_EQ(ErrorOf(R"({"format": "other", "version": 1})"),
              "profile t.json: \"format\" must be \"orvix-host-profile\"");
    EXPECT_EQ(ErrorOf(R"({"format": "orvix-host-profile", "version": 2})"),
              "profile t.json: version 2 is not supported (this build reads version 1)");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitchs": [])")), "profile t.json: unknown section 'vswitchs'");
    EXPECT_EQ(ErrorOf(WithSections(R"("system": [])")), "profile t.json: system: must be a JSON object");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": "a"}, 1])")), "profile t.json: nics[1]: must be a JSON object");
    // Bad JSON is placed by line and column, without the parser's own jargon.
    const std::string message = ErrorOf("{\"format\": \"orvix-host-profile\",\n  \"version\": 1,,\n}");
    EXPECT_EQ(message.rfind("profile t.json: parse error at line 2, column 16: syntax error", 0), 0u) << message;
    EXPECT_EQ(message.find("[json.exception"), std::string::npos) << message;
}

// A value of `levels` nested arrays, as the "x" member of the system section.
std::string Nested(std::size_t levels, const std::string& inner = "") {
    return WithSections(R"("system": {"x": )" + std::string(levels, '[') + inner + std::string(levels, ']') + "}");
}

TEST(ProfileTest, NestingIsBounded) {
    // The top-level object and the system section are two of the 64 levels.
    EXPECT_EQ(ErrorOf(Nested(62)), "(accepted)");
    EXPECT_EQ(ErrorOf(Nested(63)), "profile t.json: nested deeper than 64 levels at line 1, column 126");
    // Far too deep for any recursive walk over the document: refused, not a crash.
    EXPECT_EQ(ErrorOf(Nested(100000)), "profile t.json: nested deeper than 64 levels at line 1, column 126");
    // Brackets in strings, escaped quotes included, are text, not nesting.
    EXPECT_EQ(ErrorOf(Nested(1, R"("\"[[[[" , ")" + std::string(100, '{') + "\"")), "(accepted)");
    // Lines are counted for the position.
    EXPECT_EQ(ErrorOf("\n\n" + Nested(70)), "profile t.json: nested deeper than 64 levels at line 3, column 126");
}

TEST(ProfileTest, KeyAndParentErrors) {
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": true}])")),
              "profile t.json: nics[0]: field 'name' must be a string or an integer, not boolean");
    // Keys of several fields are unique as a whole; positional collections
    // have no key to repeat.
    EXPECT_EQ(ErrorOf(WithSections(R"("dvswitches": [{"name": "a"}, {"name": "b"}],
                                      "dvports": [{"dvswitch": "a", "id": 1}, {"dvswitch": "b", "id": 1},
                                                  {"dvswitch": "a", "id": "1"}])")),
              "profile t.json: dvports[2]: duplicate key 'a|1' (as dvports[0])");
    EXPECT_EQ(ErrorOf(WithSections(R"("execLog": [{"command": "x"}, {"command": "x"}])")), "(accepted)");
    EXPECT_EQ(ErrorOf(WithSections(R"("portgroups": [{"name": "pg", "vswitch": null}])")),
              "profile t.json: portgroups[0]: parent field 'vswitch' is missing");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "vSwitch0"}],
                                      "portgroups": [{"name": "a", "vswitch": "vSwitch0"},
                                                     {"name": "c", "vswitch": "vSwitch9"}])")),
              "profile t.json: portgroups[1]: vswitch 'vSwitch9' does not exist in vswitches");
    // Owners written after their objects are found; a port's owner is not checked.
    EXPECT_EQ(ErrorOf(WithSections(R"("interfaces": [{"name": "pld0", "netstack": "ns"}],
                                      "netstacks": [{"key": "ns"}],
                                      "ports": [{"id": 1, "portset": "anything"}])")),
              "(accepted)");
}

TEST(ProfileTest, FieldsTheLibraryReadsKeepTheirTypeAndRange) {
    // Counts that would overflow the host-wide sum of ports.
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "numPorts": 18446744073709551615}])")),
              "profile t.json: vswitches[0].numPorts: must be an integer from 1 to 4096, not 18446744073709551615");
    EXPECT_EQ(ErrorOf(WithSections(R"("dvswitches": [{"name": "d", "numPorts": 0}])")),
              "profile t.json: dvswitches[0].numPorts: must be an integer from 1 to 4096, not 0");
    EXPECT_EQ(ErrorOf(WithSections(R"("system": {"maxPorts": -1})")),
              "profile t.json: system.maxPorts: must be an integer from 1 to 9223372036854775807, not -1");
    // Values of another type, which the library would read as defaults.
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a"}],
                                      "portgroups": [{"name": "p", "vswitch": "a", "vlanId": 0},
                                                     {"name": "q", "vswitch": "a", "vlanId": "20"}])")),
              "profile t.json: portgroups[1].vlanId: must be an integer from 0 to 4095, not string");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "uplinks": ["hwnic0", 2]}])")),
              "profile t.json: vswitches[0].uplinks: item 1 must be a string, not 2");
    EXPECT_EQ(ErrorOf(WithSections(R"("system": {"ipv6Enabled": "no"})")),
              "profile t.json: system.ipv6Enabled: must be true or false, not string");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "cdp": null}])")),
              "profile t.json: vswitches[0].cdp: must be one of down, listen, advertise, both, not null");
    EXPECT_EQ(ErrorOf(WithSections(R"("ports": [{"id": 1, "portset": "a", "type": "nic"}])")),
              "profile t.json: ports[0].type: must be one of vm, kernel, uplink, internal, not 'nic'");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": "hwnic0", "uplinkPortId": -1}])")),
              "profile t.json: nics[0].uplinkPortId: must be an integer from 0 to 4294967295, not -1");
    // Policies and other nested objects are checked field by field.
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a"}],
                                      "portgroups": [{"name": "p", "vswitch": "a",
                                                      "teaming": {"loadBalancing": "fast"}}])")),
              "profile t.json: portgroups[0].teaming.loadBalancing: must be one of iphash, srcmac, srcport, "
              "explicit, not 'fast'");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "shaping": {"peakBps": 1.5}}])")),
              "profile t.json: vswitches[0].shaping.peakBps: must be an integer from 0 to 18446744073709551615, "
              "not 1.5");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "beacon": {"interval": true}}])")),
              "profile t.json: vswitches[0].beacon.interval: must be an integer from 0 to 2147483647, not boolean");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "security": [true]}])")),
              "profile t.json: vswitches[0].security: must be a JSON object, not array");
    // The edges of each range, whole numbers however written, and fields the
    // library does not read.
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a", "mtu": 1279}])")),
              "profile t.json: vswitches[0].mtu: must be an integer from 1280 to 9000, not 1279");
    EXPECT_EQ(ErrorOf(WithSections(R"("system": {"ipv6Enabled": false, "maxPorts": 4.608e3, "rack": "x"},
                                      "vswitches": [{"name": "a", "numPorts": 4096, "mtu": 9000.0, "owner": 7,
                                                     "shaping": {"averageBps": 18446744073709551615}}],
                                      "portgroups": [{"name": "p", "vswitch": "a", "vlanId": 4095}],
                                      "ports": [{"id": 4294967295, "portset": "a", "type": "uplink"}])")),
              "(accepted)");
}

TEST(ProfileTest, NicDriverDataIsCheckedToItsDepth) {
    const auto nic = [](const std::string& fields) {
        return ErrorOf(WithSections(R"("nics": [{"name": "hwnic0"}, {"name": "hwnic1", )" + fields + "}]"));
    };
    EXPECT_EQ(nic(R"("speed": 4294967296)"),
              "profile t.json: nics[1].speed: must be an integer from 0 to 4294967295, not 4294967296");
    EXPECT_EQ(nic(R"("duplex": "auto")"), "profile t.json: nics[1].duplex: must be one of full, half, not 'auto'");
    EXPECT_EQ(nic(R"("pciDevice": null)"), "profile t.json: nics[1].pciDevice: must be a string, not null");
    EXPECT_EQ(nic(R"("supportedPorts": [0, -1])"),
              "profile t.json: nics[1].supportedPorts: item 1 must be an integer from 0 to 2147483647, not -1");
    EXPECT_EQ(nic(R"("registers": 5)"), "profile t.json: nics[1].registers: must be an array of integers, not 5");
    EXPECT_EQ(nic(R"("registers": [1, 4294967296])"),
              "profile t.json: nics[1].registers: item 1 must be an integer from 0 to 4294967295, not 4294967296");
    EXPECT_EQ(nic(R"("advertisedLinkModes": [{"speed": 10, "duplex": "full"}, {"duplex": "both"}])"),
              "profile t.json: nics[1].advertisedLinkModes[1].duplex: must be one of auto, full, half, not 'both'");
    EXPECT_EQ(nic(R"("advertisedLinkModes": [7])"),
              "profile t.json: nics[1].advertisedLinkModes[0]: must be a JSON object, not 7");
    EXPECT_EQ(nic(R"("rings": {"preset": {"rx": -1}})"),
              "profile t.json: nics[1].rings.preset.rx: must be an integer from 0 to 4294967295, not -1");
    EXPECT_EQ(nic(R"("coalesce": {"rxUsecs": 1.5})"),
              "profile t.json: nics[1].coalesce.rxUsecs: must be an integer from 0 to 4294967295, not 1.5");
    EXPECT_EQ(nic(R"("selfTest": {"online": ["ok", 1]})"),
              "profile t.json: nics[1].selfTest.online: item 1 must be a string, not 1");
    EXPECT_EQ(nic(R"("eeprom": "02a1f")"),
              "profile t.json: nics[1].eeprom: must be a string of hex digit pairs, not an odd number of digits");
    EXPECT_EQ(nic(R"("eeprom": "02g1")"),
              "profile t.json: nics[1].eeprom: must be a string of hex digit pairs, not 'g' at position 2");
    EXPECT_EQ(nic(R"("sriovVfs": [{"id": 0}, {"id": 256}])"),
              "profile t.json: nics[1].sriovVfs[1].id: must be an integer from 0 to 255, not 256");
    EXPECT_EQ(nic(R"("sriovVfs": [{"id": 0, "stats": {"txErrors": -3}}])"),
              "profile t.json: nics[1].sriovVfs[0].stats.txErrors: must be an integer from 0 to "
              "18446744073709551615, not -3");
    EXPECT_EQ(nic(R"("stats": {"rxCrcErrors": "0"})"),
              "profile t.json: nics[1].stats.rxCrcErrors: must be an integer from 0 to 18446744073709551615, not "
              "string");
    EXPECT_EQ(ErrorOf(WithSections(R"("ports": [{"id": 1, "portset": "a", "vlanStats": [{"vlanId": 4096}]}])")),
              "profile t.json: ports[0].vlanStats[0].vlanId: must be an integer from 0 to 4095, not 4096");
    EXPECT_EQ(ErrorOf(WithSections(R"("ports": [{"id": 1, "portset": "a", "vlanStatsEnabled": 1}])")),
              "profile t.json: ports[0].vlanStatsEnabled: must be true or false, not 1");
    // Codes no word names, the edges of each range, and an empty EEPROM.
    EXPECT_EQ(nic(R"("port": 255, "wakeOn": [9, 0], "messageLevel": 4294967295, "eeprom": "", "eepromMagic": 0,
                     "sriovVfs": [], "registers": [4294967295], "mtu": 9000.0, "pause": {"rxResolution": 1})"),
              "(accepted)");
}

TEST(ProfileTest, AddressesRoutesAndIpsecFieldsAreCheckedAsTheLibraryCompares) {
    auto section = [](const std::string& name, const std::string& object) {
        return ErrorOf(WithSections(R"("netstacks": [{"key": "s"}], ")" + name + R"(": [)" + object + "]"));
    };
    auto route = [&](const std::string& network, const std::string& gateway) {
        return section("routes",
                       R"({"netstack": "s", "network": ")" + network + R"(", "gateway": ")" + gateway + R"("})");
    };
    EXPECT_EQ(route("192.0.2.0/24", "0.0.0.0"), "(accepted)");
    EXPECT_EQ(route("2001:db8:10::/64", "fe80::1"), "(accepted)");
    // Keys are compared as text: only the library's canonical text fits.
    EXPECT_EQ(route("2001:DB8:10::/64", "::"),
              "profile t.json: routes[0].network: must be an IP network address/prefix in canonical text with no host "
              "bits set, not '2001:DB8:10::/64'");
    EXPECT_EQ(route("192.0.2.1/24", "0.0.0.0"),
              "profile t.json: routes[0].network: must be an IP network address/prefix in canonical text with no host "
              "bits set, not '192.0.2.1/24'");
    EXPECT_EQ(route("192.0.2.0/033", "0.0.0.0").substr(0, 42), "profile t.json: routes[0].network: must be");
    EXPECT_EQ(route("192.0.2.0/24", "192.0.2.01"),
              "profile t.json: routes[0].gateway: must be an IP address in canonical text, not '192.0.2.01'");
    EXPECT_EQ(route("192.0.2.0/24", "::"),
              "profile t.json: routes[0].gateway: must be an IPv4 address like its network, not '::'");

    auto netstack = [](const std::string& fields) {
        return ErrorOf(WithSections(R"("netstacks": [{"key": "s", )" + fields + "}]"));
    };
    EXPECT_EQ(netstack(R"("ipv4Gateway": "", "ipv6Gateway": "2001:db8::1", "dnsServers": ["192.0.2.53", "::1"],
                          "searchDomains": ["example.test"])"),
              "(accepted)");
    EXPECT_EQ(netstack(R"("ipv4Gateway": "2001:db8::1")"),
              "profile t.json: netstacks[0].ipv4Gateway: must be an IPv4 address in canonical text or \"\", not "
              "'2001:db8::1'");
    EXPECT_EQ(netstack(R"("dnsServers": ["192.0.2.53", "resolver"])"),
              "profile t.json: netstacks[0].dnsServers: item 1 must be an IP address in canonical text, not "
              "'resolver'");
    EXPECT_EQ(netstack(R"("searchDomains": ["a.example.test b.example.test"])"),
              "profile t.json: netstacks[0].searchDomains: item 0 must be a name without blanks or control "
              "characters, not 'a.example.test b.example.test'");

    EXPECT_EQ(
        section("neighbors", R"({"netstack": "s", "interface": "pld0", "address": "192.0.2.1", "type": "Router"})"),
        "(accepted)");
    EXPECT_EQ(
        section("neighbors", R"({"netstack": "s", "interface": "pld0", "address": "192.0.2.1", "state": "Gone"})"),
        "profile t.json: neighbors[0].state: must be one of Incomplete, Reachable, Stale, Delay, Probe, not "
        "'Gone'");
    EXPECT_EQ(section("connections", R"({"netstack": "s", "proto": "tcp", "localAddress": "0.0.0.0", "localPort": 65536,
                                         "foreignAddress": "0.0.0.0", "foreignPort": 0, "state": "SYN_RCVD"})"),
              "profile t.json: connections[0].localPort: must be an integer from 0 to 65535, not 65536");
    EXPECT_EQ(ErrorOf(WithSections(R"("worlds": [{"id": 4294967296}])")),
              "profile t.json: worlds[0].id: must be an integer from 0 to 4294967295, not 4294967296");
    EXPECT_EQ(ErrorOf(WithSections(R"("ipsecSAs": [{"name": "a", "spi": 1, "source": "192.0.2.1"}])")),
              "profile t.json: ipsecSAs[0].source: must be an IPv6 address in canonical text, not '192.0.2.1'");
    EXPECT_EQ(ErrorOf(WithSections(R"("ipsecSPs": [{"name": "a", "direction": "both"}])")),
              "profile t.json: ipsecSPs[0].direction: must be one of in, out, not 'both'");
    EXPECT_EQ(ErrorOf(WithSections(R"("ipsec": {"ikeDaemonsRunning": "yes"})")),
              "profile t.json: ipsec.ikeDaemonsRunning: must be true or false, not string");
}

// Port ids are unsigned 32-bit numbers wherever a profile names one: a port's
// own id, a NIC's uplink port and an interface's port. One past the largest
// would otherwise be stored and later read as a different port's id.
TEST(ProfileTest, PortIdsFitInThirtyTwoBits) {
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "a"}],
                                      "ports": [{"id": 4294967296, "portset": "a", "client": ""}])")),
              "profile t.json: ports[0].id: must be an integer from 0 to 4294967295, not 4294967296");
    EXPECT_EQ(ErrorOf(WithSections(R"("ports": [{"id": 1, "portset": "a"}, {"id": -1, "portset": "a"}])")),
              "profile t.json: ports[1].id: must be an integer from 0 to 4294967295, not -1");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": "hwnic0", "uplinkPortId": 4311744513}])")),
              "profile t.json: nics[0].uplinkPortId: must be an integer from 0 to 4294967295, not 4311744513");
    EXPECT_EQ(ErrorOf(WithSections(R"("netstacks": [{"key": "s"}],
                                      "interfaces": [{"name": "pld0", "netstack": "s", "portId": 4294967296}])")),
              "profile t.json: interfaces[0].portId: must be an integer from 0 to 4294967295, not 4294967296");
    EXPECT_EQ(ErrorOf(WithSections(R"("netstacks": [{"key": "s"}],
                                      "nics": [{"name": "hwnic0", "uplinkPortId": 4294967295}],
                                      "interfaces": [{"name": "pld0", "netstack": "s", "portId": 4294967294}],
                                      "vswitches": [{"name": "a"}],
                                      "ports": [{"id": 4294967295, "portset": "a", "client": "hwnic0"},
                                                {"id": 4294967294, "portset": "a", "client": "pld0"}])")),
              "(accepted)");
}

TEST(ProfileTest, NumbersBeyondTheParserAreRefusedWithTheirPlace) {
    const std::string huge = "1" + std::string(400, '0');
    const std::string message = ErrorOf(WithSections("\n\"system\": {\"x\": \"9e999\", \"maxPorts\": " + huge + "}"));
    EXPECT_EQ(message, "profile t.json: a number is too large at line 2, column 38");
    EXPECT_EQ(ErrorOf(WithSections("\"system\": {\"x\": -" + huge + "}")),
              "profile t.json: a number is too large at line 1, column 64");
}

TEST(ProfileTest, ProfileFiles) {
    OrvixTest::TempDir dir;
    const auto read = [](const std::string& file) { return Failure([&] { PldCtl::Store::ReadProfileFile(file); }); };
    EXPECT_EQ(read(StoreTest::FixturePath("small-host.json")), "(accepted)");
    EXPECT_EQ(read(dir / "missing.json"),
              "cannot read profile '" + (dir / "missing.json") + "': No such file or directory");
    EXPECT_EQ(read(dir.Path()), "cannot read profile '" + dir.Path() + "': not a regular file");
}

}  // namespace

TEST(ProfileTest, LacpPortAndFilterFieldsAreCheckedToTheirDepth) {
    auto lag = [](const std::string& fields) {
        return ErrorOf(WithSections(R"("dvswitches": [{"name": "d", "uuid": "u", "lags": [{"id": 1, "name": "l", )" +
                                    fields + "}]}]"));
    };
    EXPECT_EQ(lag(R"("loadBalance": 21)"),
              "profile t.json: dvswitches[0].lags[0].loadBalance: must be an integer from 0 to 20, not 21");
    EXPECT_EQ(lag(R"("members": [{"nic": "n", "local": {"portNumber": 65536}}])"),
              "profile t.json: dvswitches[0].lags[0].members[0].local.portNumber: must be an integer from 0 to "
              "65535, not 65536");
    EXPECT_EQ(lag(R"("members": [{"nic": "n", "partner": {"state": 256}}])"),
              "profile t.json: dvswitches[0].lags[0].members[0].partner.state: must be an integer from 0 to 255, "
              "not 256");
    EXPECT_NE(lag(R"("mode": "eager")"), "(accepted)");
    EXPECT_NE(ErrorOf(WithSections(R"("dvports": [{"dvswitch": "d", "id": "1", "lacpMode": "fast"}])")), "(accepted)");
    auto port = [](const std::string& fields) {
        return ErrorOf(WithSections(R"("ports": [{"id": 1, "portset": "a", )" + fields + "}]"));
    };
    EXPECT_NE(port(R"("filters": [{"name": "f", "direction": "sideways"}])"), "(accepted)");
    EXPECT_NE(port(R"("ip": "192.0.2.01")"), "(accepted)");
    EXPECT_NE(port(R"("stats": {"rxPackets": -1})"), "(accepted)");
    EXPECT_EQ(port(R"("worldId": 4294967296)"),
              "profile t.json: ports[0].worldId: must be an integer from 0 to 4294967295, not 4294967296");
    // The edges of each range.
    EXPECT_EQ(lag(R"("loadBalance": 20, "mode": "none", "members": [{"nic": "n", "local": {"state": 255,
                      "portNumber": 65535}, "partner": {"age": 18446744073709551615}}])"),
              "(accepted)");
    EXPECT_EQ(port(R"("ip": "0.0.0.0", "worldId": 4294967295, "filters": [{"name": "f", "direction": "transmit"}])"),
              "(accepted)");
}
