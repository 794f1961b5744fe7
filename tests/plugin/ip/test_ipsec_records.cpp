// How the IPsec listings show lifetimes, SPIs and codes: each unit alone,
// zero units left out, the blank after the last unit, values far beyond a
// day, and codes on both sides of a display table.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ip/ipsec/IpsecRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

TEST(ConvertToHrsMinsAndSecs, WritesOnlyTheUnitsThatAreNotZero) {
    EXPECT_EQ(ConvertToHrsMinsAndSecs(0), "infinite");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(59), "59s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(60), "1m ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3600), "1h ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3600 + 2 * 60 + 5), "1h 2m 5s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3600 + 5), "1h 5s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3599), "59m 59s ");
}

TEST(ConvertToHrsMinsAndSecs, HoursAreNotFoldedIntoDaysAndDoNotOverflow) {
    EXPECT_EQ(ConvertToHrsMinsAndSecs(86400), "24h ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(18446744073709551615ull), "5124095576030431h 15s ");
}

TEST(DisplayWord, ShowsCodesInsideTheTableAndNothingOutside) {
    const std::vector<std::string> table = {"larval", "mature", "dying"};
    EXPECT_EQ(DisplayWord(table, 0), "larval");
    EXPECT_EQ(DisplayWord(table, 2), "dying");
    EXPECT_EQ(DisplayWord(table, 3), "");
    EXPECT_EQ(DisplayWord(table, -1), "");
    EXPECT_EQ(DisplayWord(table, 2147483647), "");
    EXPECT_EQ(DisplayWord({}, 0), "");
}

TEST(SpiText, LowerCaseHexadecimalWithoutLeadingZeros) {
    EXPECT_EQ(SpiText(255), "0xff");
    EXPECT_EQ(SpiText(0), "0x0");
    EXPECT_EQ(SpiText(0x100), "0x100");
    EXPECT_EQ(SpiText(0xffffffffu), "0xffffffff");
}

}  // namespace
