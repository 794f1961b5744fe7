// The host store's objects, order, singletons, dump/load and transactions.
#include <gtest/gtest.h>

#include <stdexcept>

#include "support/store_test_util.h"

namespace {

using PldCtl::Store::HostStore;
using PldCtl::Store::Json;
using PldCtl::Store::Transaction;

class HostStoreTest : public ::testing::Test {
protected:
    void SetUp() override {
        store = HostStore::Create(dir / "host.db", StoreTest::Fixture("small-host.json"), "small");
    }

    std::vector<std::string> Names(const std::vector<Json>& objects) {
        std::vector<std::string> names;
        for (const auto& object : objects) names.push_back(object.at("name"));
        return names;
    }

    OrvixTest::TempDir dir;
    std::unique_ptr<HostStore> store;
};

TEST_F(HostStoreTest, PutKeepsPlacesAndAppendsNewObjects) {
    EXPECT_EQ(Names(store->List("vswitches")), (std::vector<std::string>{"vSwitch0", "vSwitch1"}));
    store->Change([](Transaction& t) {
        // An update keeps its place; a new object goes to the end.
        t.Put("vswitches", {{"name", "vSwitch0"}, {"mtu", 9000}});
        t.Put("vswitches", {{"name", "vSwitch2"}, {"mtu", 1500}});
        t.Put("vswitches", {{"name", "a-first-by-name"}});
    });
    EXPECT_EQ(Names(store->List("vswitches")),
              (std::vector<std::string>{"vSwitch0", "vSwitch1", "vSwitch2", "a-first-by-name"}));
    EXPECT_EQ(store->Get("vswitches", "vSwitch0")->at("mtu"), 9000);
    // The update replaced the whole object.
    EXPECT_FALSE(store->Get("vswitches", "vSwitch0")->contains("uplinks"));
    EXPECT_FALSE(store->Get("vswitches", "vSwitch9").has_value());

    // Moving a port group to another switch changes its parent, not its place.
    store->Change([](Transaction& t) { t.Put("portgroups", {{"name", "VM Network"}, {"vswitch", "vSwitch1"}}); });
    EXPECT_EQ(Names(store->ListChildren("portgroups", "vSwitch1")),
              (std::vector<std::string>{"VM Network", "Storage"}));
    EXPECT_EQ(Names(store->ListChildren("portgroups", "vSwitch0")), (std::vector<std::string>{"Management Network"}));
}

TEST_F(HostStoreTest, KeysRemoveAndCount) {
    // Keys join their fields with "|" and give integers in decimal.
    EXPECT_TRUE(store->Get("routes", "defaultTcpipStack|0.0.0.0/0|192.0.2.1").has_value());
    store->Change([](Transaction& t) {
        t.Put("dvports", {{"dvswitch", "dvs0"}, {"id", 7}});
        EXPECT_TRUE(t.Exists("dvports", "dvs0|7"));
        EXPECT_THROW(t.Put("worlds", {{"id", 1.5}}), PldCtl::Store::ProfileError);
        EXPECT_EQ(t.CountChildren("portgroups", "vSwitch0"), 2);
        EXPECT_TRUE(t.Remove("portgroups", "Storage"));
        EXPECT_FALSE(t.Remove("portgroups", "Storage"));
        EXPECT_EQ(t.RemoveChildren("portgroups", "vSwitch0"), 2);
        EXPECT_EQ(t.Count("portgroups"), 0);
        // Other collections, even with objects of the same key, are untouched.
        t.Put("nics", {{"name", "Storage"}});
        EXPECT_FALSE(t.Remove("portgroups", "Storage"));
        EXPECT_EQ(t.Count("vswitches"), 2);
    });
    EXPECT_TRUE(store->Get("nics", "Storage").has_value());
}

TEST_F(HostStoreTest, PositionalCollectionsAlwaysAppend) {
    const Json entry = {{"command", "init-network"}, {"args", Json::array()}};
    store->Change([&](Transaction& t) {
        t.Put("execLog", entry);  // the same object again is a new entry
        t.Put("execLog", {{"command", "late"}});
    });
    const auto log = store->List("execLog");
    ASSERT_EQ(log.size(), 4u);
    EXPECT_EQ(log[2], entry);
    EXPECT_EQ(log[3].at("command"), "late");
    // Positions are keys, so an entry can be read and removed.
    EXPECT_EQ(store->Get("execLog", "#4")->at("command"), "late");
    store->Change([](Transaction& t) { EXPECT_TRUE(t.Remove("execLog", "#1")); });
    store->Change([](Transaction& t) { t.Put("execLog", {{"command", "after removal"}}); });
    EXPECT_EQ(store->Get("execLog", "#5")->at("command"), "after removal");
    EXPECT_EQ(store->List("execLog").size(), 4u);
}

TEST_F(HostStoreTest, Singletons) {
    EXPECT_EQ(store->GetSingleton("system").at("hostname"), "host-a");
    EXPECT_EQ(store->GetSingleton("ipsec"), Json::object());  // never written
    store->Change([](Transaction& t) { t.PutSingleton("ipsec", {{"enabled", false}}); });
    EXPECT_EQ(store->GetSingleton("ipsec"), (Json{{"enabled", false}}));
    // A collection is no singleton, nor the other way round.
    EXPECT_THROW(store->GetSingleton("nics"), std::invalid_argument);
    EXPECT_THROW(store->List("system"), std::invalid_argument);
}

TEST_F(HostStoreTest, DumpGivesTheProfileBackAndLoadReplacesEverything) {
    // Objects are stored as given, so the dump is the fixture itself.
    const Json dump = store->Dump();
    EXPECT_EQ(dump, StoreTest::Fixture("small-host.json"));

    store->AddFault({0, "PnicImpl::GetPnicStats", "", "boom", std::nullopt});
    store->Load(PldCtl::Store::ParseProfile(StoreTest::EmptyProfileText(), "empty"));
    EXPECT_EQ(store->Dump(), (Json{{"format", "orvix-host-profile"}, {"version", 1}}));
    // Faults are not part of a host.
    EXPECT_EQ(store->ListFaults().size(), 1u);

    store->Load(dump);
    EXPECT_EQ(store->Dump(), dump);
    // The text keeps a reader's order: format and version first, then the
    // singletons, then the collections, as Collections() lists them.
    const std::string text = PldCtl::Store::FormatProfile(dump);
    EXPECT_EQ(text.rfind("{\n  \"format\": \"orvix-host-profile\",\n  \"version\": 1,\n  \"system\": {", 0), 0u);
    EXPECT_LT(text.find("\"firewall\""), text.find("\"nics\""));
    EXPECT_LT(text.find("\"ports\""), text.find("\"execLog\""));
    EXPECT_EQ(Json::parse(text), dump);
}

TEST_F(HostStoreTest, ExceptionRollsBackTheWholeChange) {
    const Json before = store->Dump();
    EXPECT_THROW(store->Change([](Transaction& t) {
        t.Put("nics", {{"name", "hwnic9"}});
        t.Remove("vswitches", "vSwitch1");
        t.PutSingleton("system", {{"hostname", "changed"}});
        throw std::runtime_error("callback failed");
    }),
                 std::runtime_error);
    EXPECT_EQ(store->Dump(), before);
}

TEST_F(HostStoreTest, NestingAndWritingOutsideChangeAreRefused) {
    store->Read([&](Transaction& t) {
        EXPECT_THROW(store->Change([](Transaction&) {}), std::logic_error);
        EXPECT_THROW(store->CheckFault("A::B"), std::logic_error);
        EXPECT_THROW(t.Put("nics", {{"name", "x"}}), std::logic_error);
    });
    // The refusals did not leave the store stuck in a transaction.
    store->Change([](Transaction& t) { t.Put("nics", {{"name", "x"}}); });
    EXPECT_EQ(store->List("nics").size(), 3u);
}

TEST_F(HostStoreTest, AReadSeesOneStateWhileAnotherConnectionWrites) {
    auto other = HostStore::Open(store->Path());
    other->Read([&](Transaction& t) {
        EXPECT_EQ(t.Count("worlds"), 1);
        store->Change([](Transaction& w) { w.Put("worlds", {{"id", 3003}}); });
        EXPECT_EQ(t.Count("worlds"), 1);
    });
    EXPECT_EQ(other->List("worlds").size(), 2u);
}

}  // namespace
