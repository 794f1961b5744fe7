// The LACP words and formats at their edges: every state bit on its own and
// together, ages that need more than two digits of hours, and load-balance
// values on both sides of the table.
#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "vswitch/dvs/DvsOptions.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

TEST(PortStateNames, NamesTheSetBitsInBitOrderEachFollowedByAComma) {
    // 0x3D is an active, aggregatable port in sync, collecting and distributing.
    EXPECT_EQ(PortStateNames(0x3D), "ACT,AGG,SYN,COL,DIST,");
    EXPECT_EQ(PortStateNames(0), "");
    EXPECT_EQ(PortStateNames(0xFF), "ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,");
    // Short timeout and defaulted, as on a port whose partner went silent.
    EXPECT_EQ(PortStateNames(0x46), "FTO,AGG,DEF,");
}

TEST(PortStateNames, EachBitAloneGivesOneDistinctName) {
    std::string all;
    for (int bit = 0; bit < 8; ++bit) {
        const std::string one = PortStateNames(static_cast<std::uint8_t>(1u << bit));
        ASSERT_FALSE(one.empty()) << "bit " << bit;
        EXPECT_EQ(one.find(','), one.size() - 1) << "bit " << bit;
        EXPECT_EQ(all.find(one), std::string::npos) << "bit " << bit << " repeats " << one;
        all += one;
    }
    EXPECT_EQ(all, PortStateNames(0xFF));
}

TEST(LacpAgeText, PadsEachPartToTwoDigits) {
    EXPECT_EQ(LacpAgeText(3725), "01:02:05");
    EXPECT_EQ(LacpAgeText(0), "00:00:00");
    EXPECT_EQ(LacpAgeText(59), "00:00:59");
    EXPECT_EQ(LacpAgeText(60), "00:01:00");
    EXPECT_EQ(LacpAgeText(3599), "00:59:59");
}

TEST(LacpAgeText, HoursAreNotFoldedIntoDaysAndMayGrowPastTwoDigits) {
    EXPECT_EQ(LacpAgeText(86400), "24:00:00");
    EXPECT_EQ(LacpAgeText(359999), "99:59:59");
    EXPECT_EQ(LacpAgeText(360000), "100:00:00");
    EXPECT_EQ(LacpAgeText(UINT64_MAX), "5124095576030431:00:15");
}

TEST(LoadBalanceText, TheTableEndsAndValuesOutsideItShowTheirNumber) {
    EXPECT_EQ(LoadBalanceText(0), "None");
    EXPECT_EQ(LoadBalanceText(16), "Src and dst ip, port");
    EXPECT_EQ(LoadBalanceText(20), "Src portID");
    EXPECT_EQ(LoadBalanceText(21), "21");
    EXPECT_EQ(LoadBalanceText(-1), "-1");
    EXPECT_EQ(LoadBalanceText(INT64_MAX), "9223372036854775807");
    EXPECT_EQ(LoadBalanceText(INT64_MIN), "-9223372036854775808");
}

TEST(LagModeText, StatusCallsEveryModeButPassiveActive) {
    EXPECT_EQ(LagConfigModeText(1), "Active");
    EXPECT_EQ(LagConfigModeText(2), "Passive");
    EXPECT_EQ(LagConfigModeText(0), "None");
    EXPECT_EQ(LagConfigModeText(3), "None");
    EXPECT_EQ(LagStatusModeText(2), "Passive");
    EXPECT_EQ(LagStatusModeText(1), "Active");
    EXPECT_EQ(LagStatusModeText(0), "Active");
    EXPECT_EQ(LagStatusModeText(-7), "Active");
}

}  // namespace
