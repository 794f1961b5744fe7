// Injected faults: which fault an operation meets, and counted faults
// being used up, also from another connection.
#include <gtest/gtest.h>

#include "support/store_test_util.h"

namespace {

using PldCtl::Store::Fault;
using PldCtl::Store::HostStore;

// The message of the fault that fires, or "" when none does.
std::string Fired(HostStore& store, const std::string& operation, const std::string& key = "") {
    try {
        store.CheckFault(operation, key);
    } catch (const PldCtl::Store::InjectedFault& e) {
        return e.what();
    }
    return "";
}

class FaultTest : public ::testing::Test {
protected:
    void SetUp() override { store = HostStore::Create(dir / "host.db", StoreTest::EmptyProfileText()); }

    OrvixTest::TempDir dir;
    std::unique_ptr<HostStore> store;
};

TEST_F(FaultTest, MatchingByOperationAndKey) {
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "");
    const auto first = store->AddFault({0, "PnicImpl::GetPnicStats", "hwnic2", "hwnic2 is gone", std::nullopt});
    const auto second = store->AddFault({0, "PnicImpl::GetPnicStats", "", "no statistics", std::nullopt});
    EXPECT_LT(first, second);

    // The first matching fault by id wins; one without key matches any key.
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "hwnic2 is gone");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic0"), "no statistics");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats"), "no statistics");
    // Unlimited faults keep firing; other operations are not affected.
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "hwnic2 is gone");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStat", "hwnic2"), "");

    store->ClearFaults();
    EXPECT_TRUE(store->ListFaults().empty());
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "");
}

TEST_F(FaultTest, CountedFaultsAreUsedUpAcrossConnections) {
    auto other = HostStore::Open(store->Path());
    store->AddFault({0, "Vswitch::Add", "", "twice", 2});
    store->AddFault({0, "Vswitch::Add", "", "afterwards", std::nullopt});
    EXPECT_EQ(Fired(*store, "Vswitch::Add"), "twice");
    EXPECT_EQ(other->ListFaults().at(0).remaining, 1);
    // The other connection sees and takes the last firing.
    EXPECT_EQ(Fired(*other, "Vswitch::Add"), "twice");
    // Used up and gone, so the next fault matches.
    EXPECT_EQ(store->ListFaults().size(), 1u);
    EXPECT_EQ(Fired(*store, "Vswitch::Add"), "afterwards");
}

TEST_F(FaultTest, BadFaultsAreRefused) {
    for (const char* operation : {"GetPnicStats", "Pnic::", "A::B::C", "1A::B"}) {
        EXPECT_THROW(store->AddFault({0, operation, "", "x", std::nullopt}), std::invalid_argument) << operation;
    }
    EXPECT_THROW(store->AddFault({0, "A::B", "", "x", 0}), std::invalid_argument);
    EXPECT_TRUE(store->ListFaults().empty());
    EXPECT_NO_THROW(store->AddFault({0, "Net_2::Op_1", "", "x", 1}));
}

}  // namespace
