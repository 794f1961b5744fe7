// The IpConfig value's rules, and the host's exec log.
#include "hostctl/ip/IpHost.h"
#include "hostctl/util/Exec.h"

namespace {

using HostCtl::Network::IpConfig;
using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv6Network;

std::string MessageOf(const std::function<void()>& action) {
    try {
        action();
    } catch (const HostCtl::Lib::HostCtlException& e) {
        return e.GetMessage(0);
    }
    return "(no error)";
}

TEST(IpConfigValue, ModesAddressesAndBroadcast) {
    IpConfig config;
    EXPECT_TRUE(config.GetIpv4UseNone());
    EXPECT_EQ(config.GetIpv4Broadcast().GetStringAddress(), "255.255.255.255");

    config.SetIpv4Address(Ipv4Address("203.0.113.77"));
    EXPECT_EQ(config.GetIpv4Mode(), IpConfig::IPV4_STATIC);
    config.SetIpv4Netmask(Ipv4Address("255.255.255.192"));
    EXPECT_EQ(config.GetIpv4Broadcast().GetStringAddress(), "203.0.113.127");

    config.SetUseDhcp(true);
    EXPECT_TRUE(config.GetUseDhcp());
    config.SetUseDhcp(false);
    EXPECT_EQ(config.GetIpv4Mode(), IpConfig::IPV4_STATIC);
    EXPECT_EQ(config.GetIpv4Address().GetStringAddress(), "203.0.113.77");

    config.SetIpv4UseNone();
    EXPECT_TRUE(config.GetIpv4UseNone());
    EXPECT_FALSE(config.GetIpv4Address().IsSet());
    EXPECT_FALSE(config.GetIpv4Netmask().IsSet());
    // A netmask alone makes it static again, with no address.
    config.SetIpv4Netmask(Ipv4Address("255.255.0.0"));
    EXPECT_EQ(config.GetIpv4Mode(), IpConfig::IPV4_STATIC);
    EXPECT_FALSE(config.GetIpv4Address().IsSet());
}

TEST(IpConfigValue, Ipv6AddressesAreUniqueByAddress) {
    IpConfig config;
    Ipv6Network autoconf("2001:db8:1::5/64");
    autoconf.SetIpv6AddressType(Ipv6Network::TYPE_AUTOCONF);
    autoconf.SetIpv6AddressStatus(Ipv6Network::STATUS_DEPRECATED);
    config.AddIpv6Network(autoconf);
    EXPECT_EQ(config.GetIpv6Network()[0].GetIpv6AddressType(), Ipv6Network::TYPE_STATIC);
    EXPECT_EQ(config.GetIpv6Network()[0].GetIpv6AddressStatus(), Ipv6Network::STATUS_PREFERRED);

    EXPECT_EQ(MessageOf([&] { config.AddIpv6Network(Ipv6Network("2001:db8:1:0::5/48")); }),
              "The IPv6 address 2001:db8:1::5/48 is already configured");
    EXPECT_EQ(MessageOf([&] { config.RemoveIpv6Network(Ipv6Network("2001:db8:1::5/48")); }),
              "The IPv6 address 2001:db8:1::5/48 is not configured");
    config.AddIpv6Network(Ipv6Network("2001:db8:1::6/64"));
    // Type and state do not tell addresses apart.
    config.RemoveIpv6Network(autoconf);
    ASSERT_EQ(config.GetIpv6Network().size(), 1u);
    EXPECT_EQ(config.GetIpv6Network()[0].GetStringAddress(), "2001:db8:1::6/64");
}

class ExecLog : public IpHost {};

TEST_F(ExecLog, RunsAreRecordedAndAnInjectedFaultFailsTheRun) {
    using PldCtl::Util::PldCtl_Exec;
    EXPECT_EQ(PldCtl_Exec("/etc/init.d/rfxd restart", false, true, false), 0);
    ArmFault("Util::PldCtl_Exec", "/etc/init.d/iked restart", "no daemon");
    EXPECT_EQ(PldCtl_Exec("/etc/init.d/iked restart", true, false, false), 1);
    EXPECT_EQ(PldCtl_Exec("/etc/init.d/rfxd restart", false, true, false), 0);
    EXPECT_EQ(Dump()["execLog"], (Json::array({{{"command", "/etc/init.d/iked start"}, {"exitStatus", 0}},
                                               {{"command", "/etc/init.d/rfxd restart"}, {"exitStatus", 0}},
                                               {{"command", "/etc/init.d/iked restart"}, {"exitStatus", 1}},
                                               {{"command", "/etc/init.d/rfxd restart"}, {"exitStatus", 0}}})));

    // A host that cannot be used fails the run without throwing.
    OrvixTest::WriteFile(DbPath(), std::string(4096, 'x'));
    PldCtl::Lib::ReopenHost();
    EXPECT_EQ(PldCtl_Exec("/etc/init.d/rfxd restart", false, true, false), 1);
}

}  // namespace
