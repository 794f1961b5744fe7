#include "hostctl/Values.h"

#include <gtest/gtest.h>

#include <arpa/inet.h>

#include <cstdint>

#include <memory>
#include <string>
#include <vector>

#include "hostctl/Lib.h"

namespace HostCtl {
namespace Network {
// Failure messages show the values as text rather than as raw bytes.
void PrintTo(const Ipv4Address& value, std::ostream* out) {
    *out << value.GetStringAddress();
}
void PrintTo(const Ipv6Address& value, std::ostream* out) {
    *out << value.GetStringAddress();
}
void PrintTo(const Ipv4Network& value, std::ostream* out) {
    *out << value.GetStringAddress();
}
void PrintTo(const Ipv6Network& value, std::ostream* out) {
    *out << value.GetStringAddress();
}
void PrintTo(const MacAddress& value, std::ostream* out) {
    *out << value.GetStringAddress();
}
}  // namespace Network
}  // namespace HostCtl

namespace {

using namespace HostCtl::Network;
using HostCtl::Lib::HostCtlException;
using namespace std::string_literals;

// The message of the HostCtlException that making a T from text throws.
template <typename T>
std::string ParseError(const std::string& text) {
    try {
        T value(text);
        return "accepted as " + value.GetStringAddress();
    } catch (const HostCtlException& e) {
        return e.GetMessage(0);
    }
}

// Text that is refused by the IsValid check must also make the constructor
// throw, with a message that quotes the text.
template <typename T>
void ExpectRefused(bool (*isValid)(const std::string&), const std::string& what,
                   const std::vector<std::string>& texts) {
    for (const auto& text : texts) {
        EXPECT_FALSE(isValid(text)) << "'" << text << "'";
        EXPECT_EQ(ParseError<T>(text), "Invalid " + what + ": '" + text + "'");
    }
}

TEST(Ipv4AddressTest, ParsesStrictDottedQuadsOnly) {
    const struct {
        const char* text;
        uint32_t value;
    } valid[] = {
        {"0.0.0.0", 0},
        {"255.255.255.255", 0xffffffff},
        {"192.0.2.1", 0xc0000201},
        {"10.0.0.10", 0x0a00000a},
    };
    for (const auto& c : valid) {
        EXPECT_TRUE(Ipv4Address::IsValidAddress(c.text)) << c.text;
        const Ipv4Address address(c.text);
        EXPECT_EQ(address.ToUint32(), c.value) << c.text;
        EXPECT_EQ(address.GetStringAddress(), c.text);
        EXPECT_EQ(Ipv4Address(c.value), address);
    }
    ExpectRefused<Ipv4Address>(
        Ipv4Address::IsValidAddress, "IPv4 address",
        {"", "1.2.3", "1.2.3.4.5", "256.0.0.1", "1.2.3.300", "01.2.3.4", "1.2.3.04", "1.2.3.00", " 1.2.3.4", "1.2.3.4 ",
         "1. 2.3.4", "0x1.2.3.4", "1.2.3.-4", "1..3.4", "1.2.3.4.", "1.2.3.4/24", "16909060", "::1", "1.2.3.4\0.5"s});
}

// The dotted text is written out digit by digit; it must agree with the C
// library's conversion for every width of every octet.
TEST(Ipv4AddressTest, TextAgreesWithTheCLibrary) {
    std::uint32_t value = 0x01020304;
    for (int i = 0; i < 200000; ++i) {
        value = value * 1664525u + 1013904223u;
        const std::uint32_t network = htonl(value);
        char expected[INET_ADDRSTRLEN] = {};
        ASSERT_NE(inet_ntop(AF_INET, &network, expected, sizeof expected), nullptr);
        ASSERT_EQ(Ipv4Address(value).GetStringAddress(), expected) << value;
    }
    EXPECT_EQ(Ipv4Address(0xFFFFFFFFu).GetStringAddress(), "255.255.255.255");
    EXPECT_EQ(Ipv4Address(0x0A006409u).GetStringAddress(), "10.0.100.9");
}

TEST(Ipv4AddressTest, UnsetOrderAndPolymorphism) {
    EXPECT_FALSE(Ipv4Address().IsSet());
    EXPECT_EQ(Ipv4Address().GetStringAddress(), "0.0.0.0");
    EXPECT_TRUE(Ipv4Address("0.0.0.1").IsSet());
    // Numeric order, not text order.
    EXPECT_LT(Ipv4Address("9.255.255.255"), Ipv4Address("10.0.0.0"));
    EXPECT_FALSE(Ipv4Address("10.0.0.0") < Ipv4Address("10.0.0.0"));
    EXPECT_NE(Ipv4Address("10.0.0.1"), Ipv4Address("10.0.0.2"));

    std::vector<std::unique_ptr<IpAddress>> servers;
    servers.push_back(IpAddress::FromString("192.0.2.53"));
    servers.push_back(IpAddress::FromString("2001:DB8::53"));
    servers.push_back(IpAddress::FromString("::ffff:192.0.2.53"));
    servers.push_back(servers[1]->Clone());
    EXPECT_TRUE(servers[0]->IsIpv4());
    EXPECT_EQ(servers[0]->GetStringAddress(), "192.0.2.53");
    EXPECT_TRUE(servers[1]->IsIpv6());
    EXPECT_EQ(servers[1]->GetStringAddress(), "2001:db8::53");
    EXPECT_TRUE(servers[2]->IsIpv6());
    EXPECT_EQ(servers[3]->GetStringAddress(), "2001:db8::53");
    EXPECT_EQ(ParseError<Ipv4Address>("x"), "Invalid IPv4 address: 'x'");
    try {
        IpAddress::FromString("dns.example");
        ADD_FAILURE() << "a name was taken for an address";
    } catch (const HostCtlException& e) {
        EXPECT_EQ(e.GetMessage(0), "Invalid IP address: 'dns.example'");
    }
}

TEST(Ipv6AddressTest, PrintsTheCanonicalForm) {
    const struct {
        const char* text;
        const char* canonical;
    } cases[] = {
        {"2001:0db8:0000:0000:0000:0000:0000:0001", "2001:db8::1"},  // leading zeros, one long run
        {"2001:DB8::AbCd", "2001:db8::abcd"},                        // lower case
        {"2001:db8:0:0:1:0:0:1", "2001:db8::1:0:0:1"},               // first of two equal runs
        {"2001:0:0:1:0:0:0:1", "2001:0:0:1::1"},                     // the longest run, not the first
        {"2001:db8:0:1:1:1:1:1", "2001:db8:0:1:1:1:1:1"},            // a single zero field stays
        {"1:2:3:4:5:6:7::", "1:2:3:4:5:6:7:0"},
        {"0:0:0:0:0:0:0:0", "::"},
        {"0:0:0:0:0:0:0:1", "::1"},
        {"1:0:0:0:0:0:0:0", "1::"},
        {"::ffff:c000:0201", "::ffff:192.0.2.1"},  // IPv4-mapped: dotted tail
        {"::FFFF:192.0.2.1", "::ffff:192.0.2.1"},
        {"fe80:0:0:0:0200:5eff:fe00:5301", "fe80::200:5eff:fe00:5301"},
    };
    for (const auto& c : cases) {
        EXPECT_TRUE(Ipv6Address::IsValidAddress(c.text)) << c.text;
        const Ipv6Address address(c.text);
        EXPECT_EQ(address.GetStringAddress(), c.canonical) << c.text;
        EXPECT_EQ(Ipv6Address(address.GetStringAddress()), address) << c.text;
    }
    ExpectRefused<Ipv6Address>(
        Ipv6Address::IsValidAddress, "IPv6 address",
        {"", ":", ":::", "1::2::3", "12345::", "1:2:3:4:5:6:7:8:9", "1:2:3:4:5:6:7", "2001:db8::g", "fe80::1%eth0",
         " ::1", "::1 ", "[::1]", "192.0.2.1", "::ffff:01.2.3.4", "::1/128", "::1\0:2"s});
}

TEST(Ipv6AddressTest, BytesAndHelpers) {
    const Ipv6Address address("2001:db8::102:304");
    const Ipv6Address::Bytes expected = {0x20, 0x01, 0x0d, 0xb8, 0, 0, 0, 0, 0, 0, 0, 0, 1, 2, 3, 4};
    EXPECT_EQ(address.GetBytes(), expected);
    EXPECT_EQ(Ipv6Address(expected), address);

    EXPECT_TRUE(Ipv6Address().IsUnspecified());
    EXPECT_FALSE(Ipv6Address().IsSet());
    EXPECT_EQ(Ipv6Address().GetStringAddress(), "::");
    EXPECT_TRUE(Ipv6Address("::1").IsSet());
    EXPECT_TRUE(Ipv6Address("fe80::1").IsLinkLocal());
    EXPECT_TRUE(Ipv6Address("febf:ffff::").IsLinkLocal());
    EXPECT_FALSE(Ipv6Address("fec0::1").IsLinkLocal());
    EXPECT_FALSE(Ipv6Address("2001:db8::1").IsLinkLocal());
    EXPECT_LT(Ipv6Address("::ffff"), Ipv6Address("1::"));
    EXPECT_NE(Ipv6Address("::1"), Ipv6Address("::2"));
}

TEST(Ipv4NetworkTest, ParsesPrefixesAndNetmasks) {
    const struct {
        const char* text;
        const char* address;
        const char* mask;
        int prefix;
        const char* printed;
    } valid[] = {
        {"192.0.2.0/24", "192.0.2.0", "255.255.255.0", 24, "192.0.2.0/24"},
        {"192.0.2.77/32", "192.0.2.77", "255.255.255.255", 32, "192.0.2.77/32"},
        {"0.0.0.0/0", "0.0.0.0", "0.0.0.0", 0, "0.0.0.0/0"},
        {"198.51.100.0/255.255.254.0", "198.51.100.0", "255.255.254.0", 23, "198.51.100.0/23"},
        {"203.0.113.9/255.255.255.255", "203.0.113.9", "255.255.255.255", 32, "203.0.113.9/32"},
        {"10.1.2.3/0.0.0.0", "10.1.2.3", "0.0.0.0", 0, "10.1.2.3/0"},
    };
    for (const auto& c : valid) {
        EXPECT_TRUE(Ipv4Network::IsValidAddressAndNetmask(c.text)) << c.text;
        const Ipv4Network network(c.text);
        EXPECT_EQ(network.GetNetwork().GetStringAddress(), c.address) << c.text;
        EXPECT_EQ(network.GetNetmask().GetStringAddress(), c.mask) << c.text;
        EXPECT_EQ(network.GetPrefixLength(), c.prefix) << c.text;
        EXPECT_EQ(network.GetStringAddress(), c.printed);
        EXPECT_EQ(Ipv4Network(network.GetStringAddress()), network);
    }
    ExpectRefused<Ipv4Network>(
        Ipv4Network::IsValidAddressAndNetmask, "IPv4 network",
        {"", "/", "192.0.2.0", "192.0.2.0/", "/24", "192.0.2.0/33", "192.0.2.0/024", "192.0.2.0/00", "192.0.2.0/+24",
         "192.0.2.0/-1", "192.0.2.0/ 24", "192.0.2.0/24 ", "192.0.2.0 /24", "192.0.2.0/255.0.255.0",
         "192.0.2.0/0.255.255.255", "192.0.2.0/24/1", "192.0.2.256/24", "2001:db8::/32", "192.0.2.0/1000"});
    EXPECT_THROW(Ipv4Network(Ipv4Address("192.0.2.0"), 33), HostCtlException);
    EXPECT_THROW(Ipv4Network(Ipv4Address("192.0.2.0"), -1), HostCtlException);
}

TEST(Ipv4NetworkTest, NetmaskConversionsMaskingAndOrder) {
    for (int prefix = 0; prefix <= 32; ++prefix) {
        const Ipv4Address mask = Ipv4Network::NetmaskFromNumber(prefix);
        EXPECT_TRUE(Ipv4Network::IsValidNetmask(mask)) << prefix;
        EXPECT_EQ(Ipv4Network::PrefixFromNetmask(mask), prefix);
    }
    EXPECT_EQ(Ipv4Network::NetmaskFromNumber(1).GetStringAddress(), "128.0.0.0");
    EXPECT_EQ(Ipv4Network::NetmaskFromNumber(31).GetStringAddress(), "255.255.255.254");
    EXPECT_THROW(Ipv4Network::NetmaskFromNumber(33), HostCtlException);
    EXPECT_THROW(Ipv4Network::NetmaskFromNumber(-1), HostCtlException);
    EXPECT_FALSE(Ipv4Network::IsValidNetmask(Ipv4Address("255.255.255.253")));
    try {
        Ipv4Network::PrefixFromNetmask(Ipv4Address("255.0.255.0"));
        ADD_FAILURE() << "a broken netmask was taken";
    } catch (const HostCtlException& e) {
        EXPECT_EQ(e.GetMessage(0), "Invalid IPv4 netmask: '255.0.255.0'");
    }

    const Ipv4Network host("192.0.2.77/24");
    EXPECT_FALSE(host.IsNetworkAddress());
    EXPECT_EQ(host.Masked().GetStringAddress(), "192.0.2.0/24");
    EXPECT_EQ(host.GetNetwork().GetStringAddress(), "192.0.2.77");
    EXPECT_TRUE(host.Masked().IsNetworkAddress());
    EXPECT_EQ(Ipv4Network("203.0.113.200/25").Masked().GetStringAddress(), "203.0.113.128/25");
    EXPECT_EQ(Ipv4Network("203.0.113.200/0").Masked(), Ipv4Network());
    EXPECT_TRUE(Ipv4Network("203.0.113.200/32").IsNetworkAddress());

    EXPECT_LT(Ipv4Network("10.0.0.0/8"), Ipv4Network("10.0.0.0/16"));
    EXPECT_LT(Ipv4Network("9.0.0.0/16"), Ipv4Network("10.0.0.0/8"));
    EXPECT_NE(Ipv4Network("10.0.0.0/8"), Ipv4Network("10.0.0.0/255.255.0.0"));
    EXPECT_EQ(Ipv4Network("10.0.0.0/16"), Ipv4Network("10.0.0.0/255.255.0.0"));
}

TEST(Ipv6NetworkTest, ParsesAndPrints) {
    const struct {
        const char* text;
        const char* address;
        int prefix;
        const char* printed;
    } valid[] = {
        {"2001:db8::/32", "2001:db8::", 32, "2001:db8::/32"},
        {"2001:DB8:0:0::1/64", "2001:db8::1", 64, "2001:db8::1/64"},
        {"::/0", "::", 0, "::/0"},
        {"fe80::1/128", "fe80::1", 128, "fe80::1/128"},
        {"::ffff:192.0.2.0/120", "::ffff:192.0.2.0", 120, "::ffff:192.0.2.0/120"},
    };
    for (const auto& c : valid) {
        EXPECT_TRUE(Ipv6Network::IsValidAddressAndNetmask(c.text)) << c.text;
        const Ipv6Network network(c.text);
        EXPECT_EQ(network.GetAddress().GetStringAddress(), c.address) << c.text;
        EXPECT_EQ(network.GetNetmask(), c.prefix) << c.text;
        EXPECT_EQ(network.GetStringAddress(), c.printed);
        EXPECT_EQ(Ipv6Network(network.GetStringAddress()), network);
    }
    ExpectRefused<Ipv6Network>(
        Ipv6Network::IsValidAddressAndNetmask, "IPv6 network",
        {"", "2001:db8::", "2001:db8::/", "/64", "2001:db8::/129", "2001:db8::/064",
         "2001:db8::/ffff:ffff::", "fe80::1%eth0/64", "2001:db8::/64 ", "192.0.2.0/24", "2001:db8::/64/1"});
    EXPECT_THROW(Ipv6Network(Ipv6Address("2001:db8::"), 129), HostCtlException);
}

TEST(Ipv6NetworkTest, NetmasksMaskingAndIdentity) {
    const struct {
        int prefix;
        const char* mask;
    } masks[] = {
        {0, "::"},
        {1, "8000::"},
        {10, "ffc0::"},
        {64, "ffff:ffff:ffff:ffff::"},
        {65, "ffff:ffff:ffff:ffff:8000::"},
        {127, "ffff:ffff:ffff:ffff:ffff:ffff:ffff:fffe"},
        {128, "ffff:ffff:ffff:ffff:ffff:ffff:ffff:ffff"},
    };
    for (const auto& c : masks) {
        EXPECT_EQ(Ipv6Network::NetmaskFromNumber(c.prefix).GetStringAddress(), c.mask) << c.prefix;
    }
    EXPECT_THROW(Ipv6Network::NetmaskFromNumber(129), HostCtlException);
    EXPECT_THROW(Ipv6Network::NetmaskFromNumber(-1), HostCtlException);

    Ipv6Network autoconf("2001:db9::5/31");
    autoconf.SetIpv6AddressType(Ipv6Network::TYPE_AUTOCONF);
    autoconf.SetIpv6AddressStatus(Ipv6Network::STATUS_DEPRECATED);
    EXPECT_FALSE(autoconf.IsNetworkAddress());
    const Ipv6Network masked = autoconf.Masked();
    EXPECT_EQ(masked.GetStringAddress(), "2001:db8::/31");
    EXPECT_TRUE(masked.IsNetworkAddress());
    EXPECT_EQ(masked.GetIpv6AddressType(), Ipv6Network::TYPE_AUTOCONF);
    EXPECT_EQ(masked.GetIpv6AddressStatus(), Ipv6Network::STATUS_DEPRECATED);
    EXPECT_EQ(Ipv6Network("2001:db8::1/64").Masked().GetStringAddress(), "2001:db8::/64");
    EXPECT_EQ(Ipv6Network("2001:db8::1/128").Masked().GetStringAddress(), "2001:db8::1/128");

    // Type and status say how an address lives on an interface, not which
    // address it is: removing "2001:db9::5/31" must find the autoconf entry.
    EXPECT_EQ(autoconf, Ipv6Network("2001:db9::5/31"));
    EXPECT_NE(autoconf, Ipv6Network("2001:db9::5/32"));
    EXPECT_LT(Ipv6Network("2001:db8::/32"), Ipv6Network("2001:db8::/48"));
    EXPECT_LT(Ipv6Network("2001:db8::/48"), Ipv6Network("2001:db8::1/32"));
}

TEST(MacAddressTest, FormsBytesAndOrder) {
    for (const char* text : {"00:50:56:aa:0b:1c", "00:50:56:AA:0B:1C", "00-50-56-aA-0b-1C"}) {
        EXPECT_TRUE(MacAddress::IsValid(text)) << text;
        EXPECT_EQ(MacAddress(text).GetStringAddress(), "00:50:56:aa:0b:1c");
    }
    const MacAddress::Bytes bytes = {0x00, 0x50, 0x56, 0xaa, 0x0b, 0x1c};
    EXPECT_EQ(MacAddress("00-50-56-AA-0B-1C").GetBytes(), bytes);
    EXPECT_EQ(MacAddress(bytes), MacAddress("00:50:56:aa:0b:1c"));
    EXPECT_EQ(MacAddress("ff:ff:ff:ff:ff:ff").GetStringAddress(), "ff:ff:ff:ff:ff:ff");

    EXPECT_FALSE(MacAddress().IsSet());
    EXPECT_EQ(MacAddress().GetStringAddress(), "00:00:00:00:00:00");
    EXPECT_TRUE(MacAddress("00:00:00:00:00:01").IsSet());
    EXPECT_LT(MacAddress("00:50:56:aa:0b:1c"), MacAddress("00:50:56:aa:0c:00"));
    EXPECT_NE(MacAddress("00:50:56:aa:0b:1c"), MacAddress("00:50:56:aa:0b:1d"));

    ExpectRefused<MacAddress>(
        MacAddress::IsValid, "MAC address",
        {"", "00:50:56:aa:0b", "00:50:56:aa:0b:1c:00", "0:50:56:aa:0b:1c0", "000:50:56:aa:0b:1", "00:50-56:aa:0b:1c",
         "00:50:56:aa:0b-1c", "00.50.56.aa.0b.1c", "0g:50:56:aa:0b:1c", "00:50:56:aa:0b:1c ", " 0:50:56:aa:0b:1c",
         "00:50:56:aa:0b:+c", "005056aa0b1c", "0050.56aa.0b1c", "00:50:56:aa:0b:\0c"s});
}

}  // namespace
