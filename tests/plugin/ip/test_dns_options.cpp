// How the DNS commands read a server address and apply the exactly-one rule
// of `server remove`, against a stand-in resolver configuration that
// records what it was asked.
#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/Lib.h"
#include "ip/dns/DnsOptions.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Lib::HostCtlException;

class RecordingDnsConfig : public PldCtl::Network::DnsConfigImpl {
public:
    RecordingDnsConfig() : DnsConfigImpl("defaultTcpipStack") {}

    std::vector<std::string> calls;

    void AddNameServer(const HostCtl::Network::IpAddress& server) override { calls.push_back("add " + Text(server)); }
    void RemoveNameServer(const HostCtl::Network::IpAddress& server) override {
        calls.push_back("remove " + Text(server));
    }
    void RemoveNameServers() override { calls.push_back("remove all"); }
    void SaveConfig() override { calls.push_back("save"); }

private:
    static std::string Text(const HostCtl::Network::IpAddress& server) {
        return (server.IsIpv4() ? "v4 " : "v6 ") + server.GetStringAddress();
    }
};

std::string MessageOf(const std::function<void()>& run) {
    try {
        run();
    } catch (const HostCtlException& e) {
        return e.GetMessage(0);
    }
    return "(nothing thrown)";
}

TEST(DnsServerAddress, TriesIpv4FirstThenIpv6) {
    auto v4 = DnsServerAddress("10.0.0.1");
    EXPECT_TRUE(v4->IsIpv4());
    EXPECT_EQ(v4->GetStringAddress(), "10.0.0.1");
    auto v6 = DnsServerAddress("FE80::0001");
    EXPECT_TRUE(v6->IsIpv6());
    EXPECT_EQ(v6->GetStringAddress(), "fe80::1");
    // An IPv4 tail does not make an IPv6 address an IPv4 one.
    auto mapped = DnsServerAddress("::ffff:192.0.2.53");
    EXPECT_TRUE(mapped->IsIpv6());
}

TEST(DnsServerAddress, RefusesEverythingElseNamingTheTextAsGiven) {
    for (const std::string text : {"", " ", "10.0.0.256", "10.0.0.1 ", "010.0.0.1", "dns.example.test", "fe80::1%pld0",
                                   "10.0.0.0/8", "1:2:3:4:5:6:7:8:9"}) {
        EXPECT_EQ(MessageOf([&] { DnsServerAddress(text); }),
                  "The specified address '" + text + "' is not recognised as a valid IP address");
    }
}

TEST(RemoveDnsServers, ExactlyOneOfAllAndServerElseNothingIsAsked) {
    RecordingDnsConfig config;
    const std::string rule = "You must specify exactly one of: --all, --server";
    EXPECT_EQ(MessageOf([&] { RemoveDnsServers(config, true, std::string("10.0.0.1")); }), rule);
    EXPECT_EQ(MessageOf([&] { RemoveDnsServers(config, false, std::nullopt); }), rule);
    // Given but empty still counts as given; it then fails as an address.
    EXPECT_EQ(MessageOf([&] { RemoveDnsServers(config, true, std::string()); }), rule);
    EXPECT_EQ(MessageOf([&] { RemoveDnsServers(config, false, std::string()); }),
              "The specified address '' is not recognised as a valid IP address");
    EXPECT_TRUE(config.calls.empty());
}

TEST(RemoveDnsServers, AllRemovesEveryServerAndServerTheOneItNames) {
    RecordingDnsConfig config;
    RemoveDnsServers(config, true, std::nullopt);
    RemoveDnsServers(config, false, std::string("192.0.2.53"));
    RemoveDnsServers(config, false, std::string("2001:DB8:10:0::53"));
    // The step leaves saving to the run that called it.
    EXPECT_EQ(config.calls,
              (std::vector<std::string>{"remove all", "remove v4 192.0.2.53", "remove v6 2001:db8:10::53"}));
}

}  // namespace
