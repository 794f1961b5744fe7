// How an addressing change reaches an interface held in memory: what is
// written back, the DNS-from-DHCP flag in force above all, which the
// interface's configuration does not carry. Then the commands in-process
// against a fresh copy of the default host, for how a run ends, which the
// transcripts cannot see. (The rows the getters show are pinned by the
// transcripts.)
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "framework/Runner.h"
#include "hostctl/HostSession.h"
#include "hostctl/Lib.h"
#include "hostctl/Values.h"
#include "ip/interface/InterfaceRecords.h"
#include "ip/interface/IpInterfaceIpv4Get.h"
#include "ip/interface/IpInterfaceIpv4Set.h"
#include "ip/interface/IpInterfaceIpv6AddressAdd.h"
#include "ip/interface/IpInterfaceIpv6Set.h"
#include "support/test_util.h"

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

// The host stores only the named types and states, so a listing never
// reaches the fallbacks; the words must still not invent a type.
TEST(Ipv6AddressWords, ATypeWithoutAWordShowsNothingAndAnyOtherStatusIsPreferred) {
    for (int type : {-1, 1, 4, 8, 10}) EXPECT_EQ(Ipv6AddressTypeWord(type), "") << type;
    EXPECT_EQ(Ipv6AddressTypeWord(Ipv6Network::TYPE_DHCP), "DHCP");
    for (int status : {-1, Ipv6Network::STATUS_PREFERRED, 1, 4, 6}) {
        EXPECT_EQ(Ipv6AddressStatusWord(status), "PREFERRED") << status;
    }
    EXPECT_EQ(Ipv6AddressStatusWord(Ipv6Network::STATUS_DUPLICATED), "DUPLICATED");
}

// Parsed by the framework's parser from the command's own declaration.
boost::shared_ptr<CallSpec::Output> RunCommand(AutoCli::Command& command, const std::vector<std::string>& args) {
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    command.Execute(AutoCli::ParseArguments(*command.GetInputSpec(), args), output);
    return output;
}

class AddressingRuns : public ::testing::Test {
protected:
    AddressingRuns() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Lib::ReopenHost();
    }
    ~AddressingRuns() override { PldCtl::Lib::ReopenHost(); }

    static std::unique_ptr<HostCtl::Network::PldNic> Interface(const std::string& name) {
        PldCtl::Network::PalladNicInfoImpl interfaces;
        auto nic = interfaces.GetPalladNicByInterface(name, false);
        if (!nic) throw std::logic_error("no interface " + name);
        return nic;
    }

    OrvixTest::TempDir dir_;
    OrvixTest::ScopedEnv db_;
    OrvixTest::ScopedEnv profile_;
};

TEST_F(AddressingRuns, ARefusedRunEndsWithItsMessagesAloneAndADoneOneWithOneComplete) {
    auto ipv4Set = IpInterfaceIpv4Set::New();
    auto unchecked = RunCommand(*ipv4Set, {"-i", "pld0", "-t", "static", "-I", "192.0.2.99"});
    EXPECT_EQ(
        unchecked->GetErrors(),
        (std::vector<std::string>{"The --type=static requires the --ipv4 and --netmask options.",
                                  "Invalid --netmask option provided. This address is not a valid IPv4 address"}));
    EXPECT_FALSE(unchecked->GetResult());
    EXPECT_EQ(unchecked->CompleteCalls(), 0);
    EXPECT_EQ(Interface("pld0")->GetIpConfig().GetIpv4Address().GetStringAddress(), "192.0.2.21");

    auto add = IpInterfaceIpv6AddressAdd::New();
    auto badText = RunCommand(*add, {"-i", "pld9", "-I", "2001:db8::1"});
    EXPECT_EQ(badText->GetErrors().size(), 1u);
    EXPECT_EQ(badText->GetErrors()[0].rfind("Invalid format for IPv6 address.", 0), 0u);
    EXPECT_FALSE(badText->GetResult());
    EXPECT_EQ(badText->CompleteCalls(), 0);

    auto ipv4Get = IpInterfaceIpv4Get::New();
    auto missing = RunCommand(*ipv4Get, {"-i", "pld9", "-N", "migrix"});
    EXPECT_EQ(missing->GetErrors(), std::vector<std::string>{"Unable to find a Pallad interface with the name pld9"});
    EXPECT_FALSE(missing->GetResult());
    EXPECT_EQ(missing->CompleteCalls(), 0);

    // pld1 uses DNS from DHCP; turning DHCPv6 off keeps that.
    auto ipv6Set = IpInterfaceIpv6Set::New();
    auto done = RunCommand(*ipv6Set, {"-i", "pld1", "-d", "false"});
    EXPECT_TRUE(done->GetErrors().empty());
    auto result = boost::dynamic_pointer_cast<MetaObj::MetaBool>(done->GetResult());
    ASSERT_TRUE(result);
    EXPECT_TRUE(result->GetValue());
    EXPECT_EQ(done->CompleteCalls(), 1);
    EXPECT_FALSE(Interface("pld1")->GetIpConfig().GetUseIpv6Dhcp());
    EXPECT_TRUE(Interface("pld1")->GetDnsConfig().GetDhcpDns());
}

}  // namespace
