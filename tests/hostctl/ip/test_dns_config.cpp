// The resolver configuration as DnsConfigImpl keeps it: read once, changed
// in memory with its checks, written by SaveConfig only, and only the lists
// this object changed.
#include "hostctl/ip/IpHost.h"
#include "hostctl/network/ip/DnsConfigImpl.h"

namespace {

using HostCtl::Network::Ipv6Address;
using PldCtl::Network::DnsConfigImpl;

class Dns : public IpHost {
protected:
    Json StoredDns(const std::string& key) const {
        const Json netstack = Stored("netstacks", "key", key);
        return Json{netstack.value("dnsServers", Json::array()), netstack.value("searchDomains", Json::array())};
    }
};

TEST_F(Dns, ChangesStayInTheObjectUntilSaved) {
    DnsConfigImpl dns(kDefault);
    const std::vector<std::string> servers = dns.GetNameServers();
    ASSERT_FALSE(servers.empty());
    const Json before = StoredDns(kDefault);
    EXPECT_EQ(Json(servers), before[0]);

    // IPv6 text is kept canonical.
    dns.AddNameServer(Ipv6Address("2001:DB8:0:0::0:99"));
    dns.RemoveNameServer(Ipv4Address(servers.front()));
    dns.AddSearchDomain("corp.example.com");
    dns.RemoveSearchDomain(before[1][0].get<std::string>());
    EXPECT_EQ(dns.GetNameServers().back(), "2001:db8::99");
    EXPECT_EQ(StoredDns(kDefault), before);
    EXPECT_EQ(DnsConfigImpl(kDefault).GetNameServers(), servers);

    dns.SaveConfig();
    std::vector<std::string> expected(servers.begin() + 1, servers.end());
    expected.push_back("2001:db8::99");
    EXPECT_EQ(DnsConfigImpl(kDefault).GetNameServers(), expected);
    const std::string domains = DnsConfigImpl(kDefault).GetSearchDomainsString();
    EXPECT_EQ(domains.substr(domains.rfind(' ') + 1), "corp.example.com");
    EXPECT_EQ(domains.find(before[1][0].get<std::string>() + " "), std::string::npos);

    dns.RemoveNameServers();
    dns.SaveConfig();
    EXPECT_TRUE(DnsConfigImpl(kDefault).GetNameServers().empty());
    // Other netstacks keep theirs.
    EXPECT_FALSE(DnsConfigImpl("migrix").GetNameServers().empty());
}

TEST_F(Dns, RefusalsLeaveTheObjectAsItWas) {
    DnsConfigImpl dns(kDefault);
    const std::vector<std::string> servers = dns.GetNameServers();
    const std::string domains = dns.GetSearchDomainsString();
    const std::string first = servers.front();
    EXPECT_EQ(MessageOf([&] { dns.AddNameServer(Ipv4Address(first)); }),
              "DNS server " + first + " is already configured");
    EXPECT_EQ(MessageOf([&] { dns.RemoveNameServer(Ipv4Address("203.0.113.99")); }),
              "DNS server 203.0.113.99 is not configured");
    for (const std::string& bad : {std::string(), std::string(" "), std::string("a b.example.com"), std::string("a\tb"),
                                   std::string("x.example.com\n"), std::string("x\x7f"), std::string("x\0y", 3)}) {
        EXPECT_EQ(MessageOf([&] { dns.AddSearchDomain(bad); }),
                  "Invalid search domain '" + bad + "': use a name without blanks or control characters");
    }
    // Names compare without case.
    const std::string existing = domains.substr(0, domains.find(' '));
    std::string shouted = existing;
    for (char& c : shouted) c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
    EXPECT_EQ(MessageOf([&] { dns.AddSearchDomain(shouted); }), "Search domain " + shouted + " is already configured");
    EXPECT_EQ(MessageOf([&] { dns.RemoveSearchDomain("nowhere.example.test"); }),
              "Search domain nowhere.example.test is not configured");
    EXPECT_EQ(dns.GetNameServers(), servers);
    EXPECT_EQ(dns.GetSearchDomainsString(), domains);
    dns.RemoveSearchDomain(shouted);
    EXPECT_EQ(dns.GetSearchDomainsString().find(existing), std::string::npos);
}

TEST_F(Dns, SavingWritesOnlyTheListsThisObjectChanged) {
    DnsConfigImpl mine(kDefault);
    mine.AddNameServer(Ipv4Address("198.51.100.99"));
    // Meanwhile another program saves new search domains.
    DnsConfigImpl theirs(kDefault);
    theirs.AddSearchDomain("theirs.example.test");
    theirs.SaveConfig();
    mine.SaveConfig();
    DnsConfigImpl now(kDefault);
    EXPECT_EQ(now.GetNameServers().back(), "198.51.100.99");
    const std::string domains = now.GetSearchDomainsString();
    EXPECT_EQ(domains.substr(domains.rfind(' ') + 1), "theirs.example.test");
}

TEST_F(Dns, AMissingNetstackAndInjectedFaults) {
    DnsConfigImpl missing("nope");
    EXPECT_EQ(MessageOf([&] { missing.GetNameServers(); }), "Netstack instance nope does not exist");
    EXPECT_EQ(MessageOf([&] { missing.SaveConfig(); }), "Netstack instance nope does not exist");

    ArmFault("DnsConfigImpl::Load", "migrix", "resolver unreadable");
    ArmFault("DnsConfigImpl::SaveConfig", kDefault, "resolver read-only");
    EXPECT_EQ(MessageOf([&] { DnsConfigImpl("migrix").GetSearchDomainsString(); }), "resolver unreadable");
    const Json before = StoredDns(kDefault);
    DnsConfigImpl dns(kDefault);
    dns.AddSearchDomain("new.example.test");
    EXPECT_EQ(MessageOf([&] { dns.SaveConfig(); }), "resolver read-only");
    EXPECT_EQ(StoredDns(kDefault), before);
}

}  // namespace
