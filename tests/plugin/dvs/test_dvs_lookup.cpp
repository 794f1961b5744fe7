// The LACP readers' hold on a switch's LACP data: the data goes back to the
// switch on every path, and a failure while it was held comes out afterwards
// with its message and the reader's origin.
#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <string>

#include "vswitch/dvs/DvsLookup.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::LacpInfo;

std::unique_ptr<LacpInfo> InfoWithLags(std::size_t count) {
    auto info = std::make_unique<LacpInfo>();
    info->lags.resize(count);
    return info;
}

TEST(BuildThenRelease, HandsTheDataBackAfterBuildingFromIt) {
    std::size_t seen = 0;
    std::unique_ptr<LacpInfo> released;
    BuildThenRelease(
        InfoWithLags(3), [&](std::unique_ptr<LacpInfo> info) { released = std::move(info); },
        [&](const LacpInfo& info) { seen = info.lags.size(); }, "here", 7);
    EXPECT_EQ(seen, 3u);
    ASSERT_TRUE(released);
    EXPECT_EQ(released->lags.size(), 3u);
}

TEST(BuildThenRelease, ALibraryFailureComesOutAfterTheReleaseWithItsMessageAndOrigin) {
    bool releasedBeforeRaise = false;
    bool released = false;
    try {
        BuildThenRelease(
            InfoWithLags(1), [&](std::unique_ptr<LacpInfo> info) { released = info != nullptr; },
            [&](const LacpInfo&) { throw HostCtl::Lib::HostCtlException("LACP daemon not answering"); },
            "plugins/network/vswitch/dvs/Reader", 42);
        FAIL() << "the failure was swallowed";
    } catch (const PldCtl::Lib::PldCtlException& e) {
        releasedBeforeRaise = released;
        EXPECT_EQ(e.GetMessage(0), "LACP daemon not answering");
        EXPECT_EQ(e.GetSourcePath(), "plugins/network/vswitch/dvs/Reader");
        EXPECT_EQ(e.GetLine(), 42);
    }
    EXPECT_TRUE(releasedBeforeRaise);
}

TEST(BuildThenRelease, OtherExceptionsAreNotTurnedIntoLibraryErrors) {
    // Only the library's failures are the command's to report; anything else
    // leaves unchanged.
    EXPECT_THROW(BuildThenRelease(
                     InfoWithLags(0), [](std::unique_ptr<LacpInfo>) {},
                     [](const LacpInfo&) { throw std::logic_error("bug"); }, "here", 1),
                 std::logic_error);
}

}  // namespace
