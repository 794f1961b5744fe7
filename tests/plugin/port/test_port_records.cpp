// The port room's logic that transcripts reach only in part: the order of
// filter entries (direction first, then key, receive ascending and transmit
// descending, byte-wise), the swapped direction words of uplink ports, the
// unicast arithmetic, and the reading of ids with their full range.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "port/PortLookup.h"
#include "port/PortRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::FilterStats;

std::unique_ptr<FilterStats> Entry(const std::string& name, const std::string& key, bool transmit) {
    auto entry = std::make_unique<FilterStats>();
    entry->name = name;
    entry->orderingKey = key;
    entry->transmit = transmit;
    return entry;
}

std::vector<std::string> SortedNames(std::vector<std::unique_ptr<FilterStats>> entries) {
    SortFilterEntries(entries);
    std::vector<std::string> names;
    for (const auto& entry : entries) names.push_back(entry->name);
    return names;
}

TEST(SortFilterStats, ReceiveByAscendingKeyThenTransmitByDescendingKeyWhateverTheNames) {
    std::vector<std::unique_ptr<FilterStats>> entries;
    entries.push_back(Entry("tx-c", "c", true));
    entries.push_back(Entry("rx-b", "b", false));
    entries.push_back(Entry("tx-d", "d", true));
    entries.push_back(Entry("rx-a", "a", false));
    EXPECT_EQ(SortedNames(std::move(entries)), (std::vector<std::string>{"rx-a", "rx-b", "tx-d", "tx-c"}));
}

TEST(SortFilterStats, AShorterKeyComesFirstAmongReceiveFiltersAndLastAmongTransmitFilters) {
    std::vector<std::unique_ptr<FilterStats>> entries;
    entries.push_back(Entry("rx-ab", "ab", false));
    entries.push_back(Entry("rx-a", "a", false));
    entries.push_back(Entry("tx-a", "a", true));
    entries.push_back(Entry("tx-ab", "ab", true));
    EXPECT_EQ(SortedNames(std::move(entries)), (std::vector<std::string>{"rx-a", "rx-ab", "tx-ab", "tx-a"}));
}

TEST(SortFilterStats, KeysCompareAsUnsignedBytes) {
    // A byte of 0x80 or more is greater than any ASCII byte, as it would not
    // be if the keys were compared as signed characters.
    const auto high = Entry("high", "\xc3\xa9", false);
    const auto low = Entry("low", "z", false);
    EXPECT_TRUE(sortFilterStats(*low, *high));
    EXPECT_FALSE(sortFilterStats(*high, *low));
}

TEST(SortFilterStats, IsAStrictOrder) {
    const auto a = Entry("a", "k", false);
    const auto b = Entry("b", "k", false);
    const auto t = Entry("t", "k", true);
    EXPECT_FALSE(sortFilterStats(*a, *a));
    EXPECT_FALSE(sortFilterStats(*a, *b));
    EXPECT_FALSE(sortFilterStats(*b, *a));
    EXPECT_TRUE(sortFilterStats(*a, *t));
    EXPECT_FALSE(sortFilterStats(*t, *a));
    EXPECT_FALSE(sortFilterStats(*t, *t));
}

TEST(FilterDirectionText, UplinkPortsSwapTheWords) {
    const int uplink = HostCtl::Network::Port::TYPE_UPLINK;
    for (int type : {HostCtl::Network::Port::TYPE_VM, HostCtl::Network::Port::TYPE_KERNEL,
                     HostCtl::Network::Port::TYPE_INTERNAL}) {
        EXPECT_EQ(FilterDirectionText(true, type), "Transmit") << type;
        EXPECT_EQ(FilterDirectionText(false, type), "Receive") << type;
    }
    EXPECT_EQ(FilterDirectionText(true, uplink), "Receive");
    EXPECT_EQ(FilterDirectionText(false, uplink), "Transmit");
}

TEST(FilterStatsRecord, ExtendedCountersOnlyWhenTheFilterKeepsThem) {
    auto entry = Entry("f", "k", false);
    entry->packetsFiltered = 5;
    EXPECT_FALSE(FilterStatsRecord(*entry, 1)->GetField("Packets filtered"));
    EXPECT_TRUE(FilterStatsRecord(*entry, 1)->GetField("Packets dropped"));
    entry->extended = true;
    for (const char* field :
         {"Packets filtered", "Packets faulted", "Packets queued", "Packets injected", "Packet errors"}) {
        EXPECT_TRUE(FilterStatsRecord(*entry, 1)->GetField(field)) << field;
    }
}

TEST(UnicastPackets, SubtractsWithoutClamping) {
    EXPECT_EQ(UnicastPackets(10, 3, 2), 5);
    EXPECT_EQ(UnicastPackets(4, 3, 5), -4);
    EXPECT_EQ(UnicastPackets(0, 0, 0), 0);
    // Counters beyond the signed range still subtract exactly.
    EXPECT_EQ(UnicastPackets(UINT64_MAX, UINT64_MAX - 7, 3), 4);
}

TEST(IdFromText, ReadsTheWholeSignedRangeLikeStrtol) {
    EXPECT_EQ(IdFromText("33554438"), 33554438);
    EXPECT_EQ(IdFromText("4294967396"), INT64_C(4294967396));
    EXPECT_EQ(IdFromText("-5"), -5);
    EXPECT_EQ(IdFromText("  42"), 42);
    EXPECT_EQ(IdFromText("12abc"), 12);
    EXPECT_EQ(IdFromText("abc"), 0);
    EXPECT_EQ(IdFromText(""), 0);
    EXPECT_EQ(IdFromText("99999999999999999999"), INT64_MAX);
}

TEST(PortIdFrom, NoIdOutsideThe32BitRangeNamesAPort) {
    EXPECT_EQ(PortIdFrom(0), std::optional<std::uint32_t>(0));
    EXPECT_EQ(PortIdFrom(4294967295), std::optional<std::uint32_t>(4294967295u));
    // 2^32 + 100 and -(2^32) + 100 would both read as port 100 if cut to 32 bits.
    EXPECT_EQ(PortIdFrom(INT64_C(4294967396)), std::nullopt);
    EXPECT_EQ(PortIdFrom(INT64_C(-4294967196)), std::nullopt);
    EXPECT_EQ(PortIdFrom(-1), std::nullopt);
    EXPECT_EQ(PortIdFrom(INT64_MAX), std::nullopt);
}

}  // namespace
