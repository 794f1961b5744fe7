// How a connection's endpoint and TCP state are shown: long IPv6 endpoints
// whole, and state numbers at both ends of the table and beyond.
#include <gtest/gtest.h>

#include <string>

#include "ip/connection/ConnectionRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

TEST(TcpStateWord, NamesTheElevenStatesAndNothingElse) {
    EXPECT_EQ(TcpStateWord(0), "CLOSED");
    EXPECT_EQ(TcpStateWord(3), "RCVD");
    EXPECT_EQ(TcpStateWord(10), "TIME_WAIT");
    EXPECT_EQ(TcpStateWord(11), "");
    EXPECT_EQ(TcpStateWord(-1), "");
    EXPECT_EQ(TcpStateWord(1 << 30), "");
}

TEST(EndpointText, KeepsLongAddressesAndPortsWhole) {
    EXPECT_EQ(EndpointText("0.0.0.0", 0), "0.0.0.0:0");
    EXPECT_EQ(EndpointText("192.0.2.21", 443), "192.0.2.21:443");
    const std::string longest = "2001:db8:1234:5678:9abc:def0:1234:5678";
    EXPECT_EQ(EndpointText(longest, 65535), longest + ":65535");
}

}  // namespace
