// How an addressing change reaches an interface held in memory: what is
// written back, the DNS-from-DHCP flag in force above all, which the
// interface's configuration does not carry. (The rows the getters show are
// pinned by the transcripts.)
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "hostctl/Lib.h"
#include "hostctl/Values.h"
#include "ip/interface/InterfaceRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::IpConfig;
using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv6Network;

// An interface whose configuration lives in memory. Like the host's, its
// configuration reads the DNS-from-DHCP flag false and the second
// configuration carries the flag in force; every configuration written is
// kept, so a test sees exactly what was sent.
class MemoryNic : public HostCtl::Network::PldNic {
public:
    IpConfig config;
    bool dhcpDnsInForce = false;
    std::vector<IpConfig> written;

    std::string GetName() const override { return "pld7"; }
    HostCtl::Network::MacAddress GetMacAddress() const override { return {}; }
    int GetMtu() const override { return 1500; }
    void SetMtu(std::int64_t) override { Unexpected(); }
    int GetTsoMss() const override { return 65535; }
    bool IsEnabled() const override { return true; }
    void Enable() override { Unexpected(); }
    void Disable() override { Unexpected(); }
    std::unique_ptr<HostCtl::Network::ConnectionPoint> GetConnectionPoint() const override { return nullptr; }
    std::int64_t GetPortId() const override { return 0; }
    std::string GetNetstackInstance() const override { return "defaultTcpipStack"; }
    IpConfig GetIpConfig() const override {
        IpConfig copy = config;
        copy.SetDhcpDns(false);
        return copy;
    }
    IpConfig GetDnsConfig() const override {
        IpConfig copy = config;
        copy.SetDhcpDns(dhcpDnsInForce);
        return copy;
    }
    void SetIpConfig(const IpConfig& value) override { written.push_back(value); }
    std::vector<HostCtl::Network::PldNicTagType> GetTags() const override { return {}; }
    void AddTag(HostCtl::Network::PldNicTagType, bool) override { Unexpected(); }
    void RemoveTag(HostCtl::Network::PldNicTagType) override { Unexpected(); }
    void Remove() override { Unexpected(); }

private:
    [[noreturn]] static void Unexpected() { throw std::logic_error("the helpers must not call this"); }
};

TEST(RewriteIpConfig, AChangeThatDoesNotTouchTheDnsFlagKeepsTheFlagInForce) {
    MemoryNic nic;
    nic.dhcpDnsInForce = true;
    RewriteIpConfig(nic, [](IpConfig& config) {
        config.SetIpv4Address(Ipv4Address("192.0.2.7"));
        config.SetIpv4Netmask(Ipv4Address("255.255.255.0"));
    });
    ASSERT_EQ(nic.written.size(), 1u);
    EXPECT_TRUE(nic.written[0].GetDhcpDns());
    EXPECT_EQ(nic.written[0].GetIpv4Address().GetStringAddress(), "192.0.2.7");

    nic.dhcpDnsInForce = false;
    RewriteIpConfig(nic, [](IpConfig& config) { config.SetUseIpv6Dhcp(true); });
    ASSERT_EQ(nic.written.size(), 2u);
    EXPECT_FALSE(nic.written[1].GetDhcpDns());
    EXPECT_TRUE(nic.written[1].GetUseIpv6Dhcp());
}

TEST(RewriteIpConfig, TheEditSeesTheFlagInForceAndMayChangeIt) {
    MemoryNic nic;
    nic.dhcpDnsInForce = true;
    bool seen = false;
    RewriteIpConfig(nic, [&](IpConfig& config) {
        seen = config.GetDhcpDns();
        config.SetDhcpDns(false);
    });
    EXPECT_TRUE(seen);
    ASSERT_EQ(nic.written.size(), 1u);
    EXPECT_FALSE(nic.written[0].GetDhcpDns());
}

TEST(RewriteIpConfig, AnEditThatFailsWritesNothing) {
    MemoryNic nic;
    nic.config.AddIpv6Network(Ipv6Network("2001:db8::1/64"));
    EXPECT_THROW(RewriteIpConfig(nic,
                                 [](IpConfig& config) {
                                     config.SetUseIpv6Dhcp(true);
                                     config.AddIpv6Network(Ipv6Network("2001:db8::1/64"));
                                 }),
                 HostCtl::Lib::HostCtlException);
    EXPECT_TRUE(nic.written.empty());
}

}  // namespace
