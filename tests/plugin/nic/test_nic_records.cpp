// The NIC room's hexadecimal dump rows and code tables at their edges: row
// boundaries, alignment of EEPROM rows that start or end inside a row,
// values wider than the minimum width, and codes that no word names.
#include <gtest/gtest.h>

#include <cstdint>
#include <set>
#include <string>
#include <vector>

#include "nic/NicRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

// "offset|value" per row, so that a mismatch shows the whole layout.
std::vector<std::string> Lines(const std::vector<DumpRow>& rows) {
    std::vector<std::string> lines;
    for (const DumpRow& row : rows) lines.push_back(row.offset + "|" + row.value);
    return lines;
}

std::string Blanks(std::size_t groups) {
    return std::string(3 * groups, ' ');
}

TEST(HexText, PadsToTheMinimumWidthAndWritesWiderValuesInFull) {
    EXPECT_EQ(HexText(0, 2), "00");
    EXPECT_EQ(HexText(1, 2), "01");
    EXPECT_EQ(HexText(0xab, 2), "ab");
    EXPECT_EQ(HexText(0x1ab, 2), "1ab");
    EXPECT_EQ(HexText(0xdeadbeef, 2), "deadbeef");
    EXPECT_EQ(HexText(0x10, 4), "0010");
    EXPECT_EQ(HexText(0x12345, 4), "12345");
    EXPECT_EQ(HexText(UINT64_MAX, 4), "ffffffffffffffff");
}

TEST(RegisterRows, SixteenWordsARowWithOffsetsCountedInWords) {
    std::vector<std::uint32_t> words(20);
    for (std::size_t i = 0; i < words.size(); ++i) words[i] = static_cast<std::uint32_t>(i);
    words[17] = 0x1234abcd;
    const std::vector<DumpRow> rows = RegisterRows(words);
    EXPECT_EQ(Lines(rows), (std::vector<std::string>{
                               "0000|00 01 02 03 04 05 06 07 08 09 0a 0b 0c 0d 0e 0f ",
                               "0010|10 1234abcd 12 13 ",
                           }));
}

TEST(RegisterRows, ExactRowsLeaveNoEmptyRowAndNoWordsGiveNoRows) {
    EXPECT_TRUE(RegisterRows({}).empty());
    const std::vector<DumpRow> one = RegisterRows(std::vector<std::uint32_t>(16, 0xff));
    ASSERT_EQ(one.size(), 1u);
    EXPECT_EQ(one[0].value.size(), 16u * 3);
    const std::vector<DumpRow> three = RegisterRows(std::vector<std::uint32_t>(33, 7));
    ASSERT_EQ(three.size(), 3u);
    EXPECT_EQ(three[1].offset, "0010");
    EXPECT_EQ(three[2].offset, "0020");
    EXPECT_EQ(three[2].value, "07 ");
}

TEST(EepromRows, AFirstRowInsideARowStartsWithBlankGroups) {
    EXPECT_EQ(Lines(EepromRows(5, {0x0a, 0x0b, 0xc0, 0xff})),
              (std::vector<std::string>{"0000|" + Blanks(5) + "0a 0b c0 ff "}));
}

TEST(EepromRows, BytesCrossingARowBoundaryGoOnInTheNextAlignedRow) {
    EXPECT_EQ(Lines(EepromRows(30, {1, 2, 3, 4})), (std::vector<std::string>{
                                                       "0010|" + Blanks(14) + "01 02 ",
                                                       "0020|03 04 ",
                                                   }));
}

TEST(EepromRows, AlignedStartsAndFullRows) {
    std::vector<std::uint8_t> bytes(32);
    for (std::size_t i = 0; i < bytes.size(); ++i) bytes[i] = static_cast<std::uint8_t>(0xe0 + i % 16);
    const std::vector<DumpRow> rows = EepromRows(16, bytes);
    ASSERT_EQ(rows.size(), 2u);
    EXPECT_EQ(rows[0].offset, "0010");
    EXPECT_EQ(rows[0].value, "e0 e1 e2 e3 e4 e5 e6 e7 e8 e9 ea eb ec ed ee ef ");
    EXPECT_EQ(rows[1].offset, "0020");
    EXPECT_EQ(rows[1].value, rows[0].value);
    // The last byte of a row ends it; no empty row follows.
    EXPECT_EQ(EepromRows(15, {9}).size(), 1u);
    EXPECT_EQ(Lines(EepromRows(15, {9, 8})), (std::vector<std::string>{"0000|" + Blanks(15) + "09 ", "0010|08 "}));
}

TEST(EepromRows, NoBytesGiveNoRowsAndWideOffsetsAreWrittenInFull) {
    EXPECT_TRUE(EepromRows(0, {}).empty());
    EXPECT_TRUE(EepromRows(7, {}).empty());
    EXPECT_EQ(Lines(EepromRows(0x12345, {0xaa})), (std::vector<std::string>{"12340|" + Blanks(5) + "aa "}));
}

TEST(PortWords, EveryPortChoiceNamesItsCodeAndUnknownCodesHaveFallbacks) {
    const std::vector<std::string> supported = {"TP", "AUI", "BNC", "MII", "FIBRE", "DA"};
    const std::vector<std::string> cable = {"Twisted Pair", "AUI", "BNC", "MII", "FIBRE", "DA"};
    const auto choices = PortChoices();
    ASSERT_EQ(choices.size(), supported.size());
    for (std::size_t i = 0; i < choices.size(); ++i) {
        const std::optional<int> code = PortCodeOfWord(choices[i].value);
        ASSERT_TRUE(code) << choices[i].value;
        EXPECT_EQ(*code, static_cast<int>(i)) << choices[i].value;
        EXPECT_EQ(SupportedPortWord(*code), supported[i]);
        EXPECT_EQ(CableTypeWord(*code), cable[i]);
    }
    EXPECT_FALSE(PortCodeOfWord("TP"));
    EXPECT_FALSE(PortCodeOfWord(""));
    for (int code : {-1, 6, 255}) {
        EXPECT_EQ(SupportedPortWord(code), "UNKNOWN") << code;
        EXPECT_EQ(CableTypeWord(code), "") << code;
    }
}

TEST(TransceiverWords, TwoCodesHaveWordsAndEveryOtherIsEmpty) {
    EXPECT_EQ(TransceiverWord(*TransceiverCodeOfWord("internal")), "internal");
    EXPECT_EQ(TransceiverWord(*TransceiverCodeOfWord("external")), "external");
    EXPECT_NE(*TransceiverCodeOfWord("internal"), *TransceiverCodeOfWord("external"));
    EXPECT_FALSE(TransceiverCodeOfWord("Internal"));
    EXPECT_EQ(TransceiverWord(2), "");
    EXPECT_EQ(TransceiverWord(-1), "");
}

TEST(WakeOn, LettersEnableTheModesInOrderAndNoOtherLetterEnablesAny) {
    const std::string letters = "pumbags";
    for (std::size_t i = 0; i < letters.size(); ++i) {
        const auto mode = WakeOnModeOfLetter(letters[i]);
        ASSERT_TRUE(mode) << letters[i];
        EXPECT_EQ(static_cast<int>(*mode), static_cast<int>(i)) << letters[i];
    }
    // `d` passes the option's pattern but enables no mode; modes 7 and 8
    // have no letter.
    for (char letter : {'d', 'P', 'x', '\0', ' '}) EXPECT_FALSE(WakeOnModeOfLetter(letter)) << int(letter);
}

TEST(WakeOn, EveryModeHasItsOwnWordAndUnknownModesReadNone) {
    std::set<std::string> words;
    for (int mode = 0; mode <= 8; ++mode) {
        const std::string word = WakeOnWord(mode);
        EXPECT_NE(word, "None") << mode;
        words.insert(word);
    }
    EXPECT_EQ(words.size(), 9u);
    EXPECT_EQ(WakeOnWord(1), "Unicast Messagess");
    EXPECT_EQ(WakeOnWord(6), "Enable SecureOn(tm) Password for" + std::string(28, ' ') + "MagicPacket(tm)");
    EXPECT_EQ(WakeOnWord(7), "Unsupported");
    EXPECT_EQ(WakeOnWord(8), "Disabled");
    EXPECT_EQ(WakeOnWord(9), "None");
    EXPECT_EQ(WakeOnWord(-1), "None");
}

TEST(LinkModeText, SpeedThenDuplexWordOrNothing) {
    EXPECT_EQ(LinkModeText({1000, 1}), "1000baseT/Full");
    EXPECT_EQ(LinkModeText({10, 2}), "10baseT/Half");
    EXPECT_EQ(LinkModeText({100000, 0}), "100000baseT/Auto");
    EXPECT_EQ(LinkModeText({25000, 3}), "25000baseT/");
    EXPECT_EQ(LinkModeText({5000000000LL, -1}), "5000000000baseT/");
}

}  // namespace
