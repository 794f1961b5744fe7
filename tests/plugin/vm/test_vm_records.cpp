// How the VM commands show a world's name and a port's filters: names
// shorter than the prefix, and filters that repeat or are detached.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "vm/VmRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::FilterStats;

TEST(VmDisplayName, LeavesOutTheFirstFiveCharactersOfLongEnoughNames) {
    EXPECT_EQ(VmDisplayName("orvm:web01"), "web01");
    EXPECT_EQ(VmDisplayName("abcdeweb01"), "web01");
    EXPECT_EQ(VmDisplayName("orvm:"), "");
    EXPECT_EQ(VmDisplayName("abcd"), "abcd");
    EXPECT_EQ(VmDisplayName(""), "");
}

std::vector<std::unique_ptr<FilterStats>> Entries(const std::vector<std::pair<std::string, bool>>& namesPresent) {
    std::vector<std::unique_ptr<FilterStats>> entries;
    for (const auto& namePresent : namesPresent) {
        auto entry = std::make_unique<FilterStats>();
        entry->name = namePresent.first;
        entry->present = namePresent.second;
        entries.push_back(std::move(entry));
    }
    return entries;
}

TEST(ActiveFilterNames, PresentFiltersOnceEachInTheEntriesOrder) {
    EXPECT_EQ(ActiveFilterNames(Entries({{"vm-firewall", true}, {"capture", false}, {"vm-firewall", true}})),
              (std::vector<std::string>{"vm-firewall"}));
    EXPECT_EQ(ActiveFilterNames(Entries({{"zeta", true}, {"alpha", true}, {"zeta", true}, {"mid", true}})),
              (std::vector<std::string>{"zeta", "alpha", "mid"}));
    // A detached entry names nothing, even when a present one of the same
    // name comes after it.
    EXPECT_EQ(ActiveFilterNames(Entries({{"capture", false}, {"ids", true}, {"capture", true}})),
              (std::vector<std::string>{"ids", "capture"}));
    EXPECT_TRUE(ActiveFilterNames(Entries({{"capture", false}})).empty());
    EXPECT_TRUE(ActiveFilterNames({}).empty());
}

}  // namespace
