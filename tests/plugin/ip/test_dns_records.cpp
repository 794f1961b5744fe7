// The list records of the DNS commands against a stand-in configuration:
// servers and search domains keep their order, the search string is cut at
// any run of blanks, and nothing configured gives an empty list, not a
// missing field.
#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "ip/dns/DnsRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

class ListedDnsConfig : public PldCtl::Network::DnsConfigImpl {
public:
    ListedDnsConfig() : DnsConfigImpl("defaultTcpipStack") {}

    std::vector<std::string> servers;
    std::string searchString;

    std::vector<std::string> GetNameServers() override { return servers; }
    std::string GetSearchDomainsString() override { return searchString; }
};

std::vector<std::string> ListField(const MetaObj::MetaStruct& record, const std::string& field) {
    auto list = boost::dynamic_pointer_cast<MetaObj::MetaList>(record.GetField(field));
    if (!list) throw std::runtime_error("no list " + field);
    std::vector<std::string> values;
    for (const auto& element : list->GetElements()) {
        values.push_back(boost::dynamic_pointer_cast<MetaObj::MetaString>(element)->GetValue());
    }
    return values;
}

TEST(NameServerListRecord, ServersInTheOrderTheyAreAsked) {
    ListedDnsConfig config;
    config.servers = {"198.51.100.53", "2001:db8:10::53", "192.0.2.53"};
    auto record = NameServerListRecord(config);
    EXPECT_EQ(record->GetTypeName(), "NameServerList");
    EXPECT_EQ(ListField(*record, "DNS Servers"), config.servers);

    config.servers.clear();
    EXPECT_TRUE(ListField(*NameServerListRecord(config), "DNS Servers").empty());
}

TEST(SearchListRecord, DomainsInOrderCutAtBlanks) {
    ListedDnsConfig config;
    config.searchString = "lab.example.com example.test";
    auto record = SearchListRecord(config);
    EXPECT_EQ(record->GetTypeName(), "DNSSearchList");
    EXPECT_EQ(ListField(*record, "DNS Search Domains"), (std::vector<std::string>{"lab.example.com", "example.test"}));

    config.searchString = "  a.test   b.test ";
    EXPECT_EQ(ListField(*SearchListRecord(config), "DNS Search Domains"),
              (std::vector<std::string>{"a.test", "b.test"}));

    for (const char* nothing : {"", " ", "   "}) {
        config.searchString = nothing;
        EXPECT_TRUE(ListField(*SearchListRecord(config), "DNS Search Domains").empty()) << '"' << nothing << '"';
    }
}

}  // namespace
