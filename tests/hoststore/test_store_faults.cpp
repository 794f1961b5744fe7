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

Fault MakeFault(const std::string& operation, const std::string& key, const std::string& message,
                std::optional<std::int64_t> count = std::nullopt) {
    Fault fault;
    fault.operation = operation;
    fault.key = key;
    fault.message = message;
    fault.remaining = count;
    return fault;
}

class FaultTest : public ::testing::Test {
protected:
    void SetUp() override { store = HostStore::Create(dir / "host.db", StoreTest::EmptyProfileText()); }

    StoreTest::TempDir dir;
    std::unique_ptr<HostStore> store;
};

TEST_F(FaultTest, MatchingByOperationAndKey) {
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "");
    const auto first = store->AddFault(MakeFault("PnicImpl::GetPnicStats", "hwnic2", "hwnic2 is gone"));
    const auto second = store->AddFault(MakeFault("PnicImpl::GetPnicStats", "", "no statistics"));
    EXPECT_LT(first, second);

    // The first matching fault by id wins; one without key matches any key.
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "hwnic2 is gone");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic0"), "no statistics");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats"), "no statistics");
    // Unlimited faults keep firing; other operations are not affected.
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "hwnic2 is gone");
    EXPECT_EQ(Fired(*store, "PnicImpl::SetPnicSpeed", "hwnic2"), "");
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStat", "hwnic2"), "");

    const auto faults = store->ListFaults();
    ASSERT_EQ(faults.size(), 2u);
    EXPECT_EQ(faults[0].id, first);
    EXPECT_EQ(faults[0].key, "hwnic2");
    EXPECT_FALSE(faults[1].remaining.has_value());
    store->ClearFaults();
    EXPECT_TRUE(store->ListFaults().empty());
    EXPECT_EQ(Fired(*store, "PnicImpl::GetPnicStats", "hwnic2"), "");
}

TEST_F(FaultTest, CountedFaultsAreUsedUpAcrossConnections) {
    auto other = HostStore::Open(store->Path());
    store->AddFault(MakeFault("Vswitch::Add", "", "twice", 2));
    store->AddFault(MakeFault("Vswitch::Add", "", "afterwards"));
    EXPECT_EQ(Fired(*store, "Vswitch::Add"), "twice");
    EXPECT_EQ(other->ListFaults().at(0).remaining, 1);
    // The other connection sees and takes the last firing.
    EXPECT_EQ(Fired(*other, "Vswitch::Add"), "twice");
    // Used up and gone, so the next fault matches.
    EXPECT_EQ(store->ListFaults().size(), 1u);
    EXPECT_EQ(Fired(*store, "Vswitch::Add"), "afterwards");
}

TEST_F(FaultTest, BadFaultsAreRefused) {
    EXPECT_THROW(store->AddFault(MakeFault("GetPnicStats", "", "x")), std::invalid_argument);
    EXPECT_THROW(store->AddFault(MakeFault("Pnic::", "", "x")), std::invalid_argument);
    EXPECT_THROW(store->AddFault(MakeFault("A::B::C", "", "x")), std::invalid_argument);
    EXPECT_THROW(store->AddFault(MakeFault("A::B", "", "x", 0)), std::invalid_argument);
    EXPECT_TRUE(store->ListFaults().empty());
    EXPECT_NO_THROW(store->AddFault(MakeFault("Net_2::Op_1", "", "x", 1)));
}

}  // namespace
