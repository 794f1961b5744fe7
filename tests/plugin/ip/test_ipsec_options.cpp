// The IPsec room's option readers at their edges: SPIs with and without a
// prefix, text after the digits, signs, values at and beyond 32 bits; ports
// at and beyond their range; and the messages a refusal leaves.
#include <gtest/gtest.h>

#include <cstdint>
#include <optional>
#include <string>

#include "framework/CallSpec.h"
#include "hostctl/Lib.h"
#include "ip/ipsec/IpsecOptions.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

TEST(ParseSpi, ReadsHexadecimalWithOrWithoutPrefix) {
    EXPECT_EQ(ParseSpi("1f4"), std::optional<std::uint32_t>(500));
    EXPECT_EQ(ParseSpi("0x1f4"), std::optional<std::uint32_t>(500));
    EXPECT_EQ(ParseSpi("0X1F4"), std::optional<std::uint32_t>(500));
    EXPECT_EQ(ParseSpi("  ff"), std::optional<std::uint32_t>(255));
    EXPECT_EQ(ParseSpi("+10"), std::optional<std::uint32_t>(16));
    EXPECT_EQ(ParseSpi("0"), std::optional<std::uint32_t>(0));
}

TEST(ParseSpi, StopsAtTheFirstCharacterThatIsNoDigit) {
    EXPECT_EQ(ParseSpi("1f4zz"), std::optional<std::uint32_t>(500));
    EXPECT_EQ(ParseSpi("12 34"), std::optional<std::uint32_t>(0x12));
    // "0x" without a digit after it is the number 0 followed by "x".
    EXPECT_EQ(ParseSpi("0x"), std::optional<std::uint32_t>(0));
    EXPECT_EQ(ParseSpi("0xg1"), std::optional<std::uint32_t>(0));
}

TEST(ParseSpi, RefusesTextWithoutLeadingDigit) {
    EXPECT_FALSE(ParseSpi(""));
    EXPECT_FALSE(ParseSpi("   "));
    EXPECT_FALSE(ParseSpi("zz"));
    EXPECT_FALSE(ParseSpi("x1"));
    EXPECT_FALSE(ParseSpi("+"));
}

TEST(ParseSpi, RefusesMinusSignInsteadOfWrapping) {
    EXPECT_FALSE(ParseSpi("-1"));
    EXPECT_FALSE(ParseSpi("-0x1f4"));
    EXPECT_FALSE(ParseSpi(" -ff"));
}

TEST(ParseSpi, KeepsThirtyTwoBitsAndRefusesMoreInsteadOfWrapping) {
    EXPECT_EQ(ParseSpi("ffffffff"), std::optional<std::uint32_t>(0xffffffffu));
    EXPECT_EQ(ParseSpi("0x00000000ffffffff"), std::optional<std::uint32_t>(0xffffffffu));
    EXPECT_FALSE(ParseSpi("100000000"));
    EXPECT_FALSE(ParseSpi("0x1000001f4"));
    // Far beyond 64 bits: no overflow of the accumulator either.
    EXPECT_FALSE(ParseSpi("ffffffffffffffffffffffffffffffff"));
}

TEST(ReadSpi, ReportsTheTextAsTypedWhenRefused) {
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    input->SetString("sa-spi", "-1f4");
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    EXPECT_FALSE(ReadSpi(*input, *output));
    ASSERT_EQ(output->GetErrors().size(), 1u);
    EXPECT_EQ(output->GetErrors()[0], "Check the input value for '--sa-spi'. Should be hex integer. Got -1f4");

    input->SetString("sa-spi", "0xff");
    boost::shared_ptr<CallSpec::Output> quiet = CallSpec::Output::New();
    EXPECT_EQ(ReadSpi(*input, *quiet), std::optional<std::uint32_t>(255));
    EXPECT_FALSE(quiet->HasError());
}

TEST(ReadPort, AcceptsTheWholeRangeAndRefusesEachSideOfIt) {
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    input->SetInt("source-port", "0", 0);
    EXPECT_EQ(ReadPort(*input, "source-port", *output), std::optional<int>(0));
    input->SetInt("source-port", "65535", 65535);
    EXPECT_EQ(ReadPort(*input, "source-port", *output), std::optional<int>(65535));
    EXPECT_FALSE(output->HasError());

    input->SetInt("source-port", "65536", 65536);
    EXPECT_FALSE(ReadPort(*input, "source-port", *output));
    input->SetInt("destination-port", "-1", -1);
    EXPECT_FALSE(ReadPort(*input, "destination-port", *output));
    // Beyond 32 bits: not narrowed onto a port in range.
    input->SetInt("destination-port", "4294967376", 4294967376LL);
    EXPECT_FALSE(ReadPort(*input, "destination-port", *output));
    ASSERT_EQ(output->GetErrors().size(), 3u);
    EXPECT_EQ(output->GetErrors()[0],
              "Check the input value for '--source-port'. Should be in range 0-65535. Got 65536");
    EXPECT_EQ(output->GetErrors()[1],
              "Check the input value for '--destination-port'. Should be in range 0-65535. Got -1");
    EXPECT_EQ(output->GetErrors()[2],
              "Check the input value for '--destination-port'. Should be in range 0-65535. Got 4294967376");
}

TEST(SaEndAddress, AnyIsTheUnspecifiedAddressAndOtherTextIsParsed) {
    EXPECT_TRUE(SaEndAddress("any").IsUnspecified());
    EXPECT_EQ(SaEndAddress("2001:DB8:0::5").GetStringAddress(), "2001:db8::5");
    EXPECT_THROW(SaEndAddress("ANY"), HostCtl::Lib::HostCtlException);
    EXPECT_THROW(SaEndAddress("192.0.2.1/24"), HostCtl::Lib::HostCtlException);
}

}  // namespace
