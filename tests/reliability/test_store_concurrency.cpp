// Many processes changing one store at once, and writers killed in the
// middle of their work: no change is lost, torn or refused.
#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <random>
#include <set>
#include <thread>

#include "support/process.h"
#include "support/store_test_util.h"

namespace {

using OrvixTest::Bin;
using OrvixTest::Process;
using PldCtl::Store::HostStore;
using PldCtl::Store::Json;

// The counter the stress program keeps in the "system" singleton.
std::int64_t Counter(HostStore& store) {
    return store.GetSingleton("system").value("stressCounter", std::int64_t(0));
}

TEST(StoreConcurrencyTest, ConcurrentReadModifyWriteLosesNothing) {
    constexpr int kProcesses = 8;
    constexpr int kChanges = 50;
    OrvixTest::TempDir dir;
    const std::string db = dir / "host.db";
    HostStore::Create(db, StoreTest::EmptyProfileText());

    std::vector<std::unique_ptr<Process>> writers;
    for (int i = 0; i < kProcesses; ++i) {
        const std::string name = "w" + std::to_string(i);
        writers.push_back(std::make_unique<Process>(
            Bin("store-stress"), std::vector<std::string>{"counter", db, std::to_string(kChanges), name},
            dir / (name + ".out"), dir / (name + ".err")));
    }
    for (auto& writer : writers) {
        const int status = writer->Wait();
        EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << "status " << status << ": " << writer->Err();
        // In particular no "database is locked" from any of them.
        EXPECT_EQ(writer->Err(), "");
    }

    auto store = HostStore::Open(db);
    EXPECT_EQ(Counter(*store), kProcesses * kChanges);
    std::set<std::string> ids;
    for (const auto& world : store->List("worlds")) ids.insert(world.at("id").get<std::string>());
    EXPECT_EQ(ids.size(), std::size_t(kProcesses * kChanges));
    for (int i = 0; i < kProcesses; ++i) {
        for (int j = 1; j <= kChanges; ++j) {
            EXPECT_EQ(ids.count("w" + std::to_string(i) + "-" + std::to_string(j)), 1u);
        }
    }
}

// The last line of a writer's output: the last change it reported done.
std::int64_t LastNumber(const std::string& output, std::int64_t otherwise) {
    const auto end = output.find_last_of('\n');
    if (end == std::string::npos) return otherwise;
    const auto start = output.find_last_of('\n', end == 0 ? 0 : end - 1);
    return std::stoll(output.substr(start == std::string::npos || end == 0 ? 0 : start + 1));
}

TEST(StoreConcurrencyTest, KilledWritersLeaveAWholeStore) {
    constexpr int kRounds = 50;
    OrvixTest::TempDir dir;
    const std::string db = dir / "host.db";
    HostStore::Create(db, StoreTest::EmptyProfileText());
    std::mt19937 random(20240611);
    std::uniform_int_distribution<int> delay(0, 40);

    std::int64_t done = 0;  // changes the store holds
    for (int round = 0; round < kRounds; ++round) {
        SCOPED_TRACE("round " + std::to_string(round));
        Process writer(Bin("store-stress"), {"sequence", db, std::to_string(done + 1)}, dir / "out", dir / "err");
        // The kill comes at a random moment once the writer is making changes,
        // however long a (sanitized, loaded) machine takes to start it.
        const auto giveUp = std::chrono::steady_clock::now() + std::chrono::seconds(30);
        while (writer.Out().empty() && std::chrono::steady_clock::now() < giveUp) {
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(delay(random)));
        writer.Kill();
        const int status = writer.Wait();
        ASSERT_TRUE(WIFSIGNALED(status)) << "the writer ended by itself: " << writer.Err();
        const std::int64_t printed = LastNumber(writer.Out(), done);

        auto store = HostStore::Open(db);
        ASSERT_EQ(StoreTest::RawSql(db, "PRAGMA integrity_check"), "ok");
        const std::int64_t counter = Counter(*store);
        EXPECT_GE(counter, printed);
        EXPECT_GE(counter, done);
        // Exactly worlds 1..counter, in order: every change whole or absent.
        const auto worlds = store->List("worlds");
        ASSERT_EQ(worlds.size(), std::size_t(counter));
        for (std::size_t i = 0; i < worlds.size(); ++i) ASSERT_EQ(worlds[i].at("id"), std::int64_t(i) + 1);
        done = counter;
    }
    // The kills came while changes were being made, not only before the first.
    EXPECT_GT(done, kRounds);
    // The log a killed writer left was copied into the database and emptied
    // when the next connection closed.
    EXPECT_EQ(std::filesystem::file_size(db + "-wal"), 0u);
}

// The log files outlive every connection, and the store stays whole: while
// connections are open, each process sees the others' changes through the
// log; once the last one closed, the database file alone holds them all.
TEST(StoreConcurrencyTest, ChangesMeetThroughTheKeptLog) {
    OrvixTest::TempDir dir;
    const std::string db = dir / "host.db";
    auto store = HostStore::Create(db, StoreTest::EmptyProfileText());
    store->Change([](PldCtl::Store::Transaction& transaction) { transaction.Put("worlds", {{"id", "here"}}); });
    EXPECT_GT(std::filesystem::file_size(db + "-wal"), 0u) << "the change should still be in the log";

    Process dump(Bin("orvix-hostsim"), {"--db", db, "dump"}, dir / "out", dir / "err");
    ASSERT_EQ(dump.Wait(), 0) << dump.Err();
    EXPECT_EQ(Json::parse(dump.Out()).at("worlds"), Json::parse(R"([{"id": "here"}])"));
    Process writer(Bin("store-stress"), {"counter", db, "3", "there"}, dir / "out", dir / "err");
    ASSERT_EQ(writer.Wait(), 0) << writer.Err();
    EXPECT_EQ(Counter(*store), 3);
    EXPECT_EQ(store->List("worlds").size(), 4u);

    store.reset();
    EXPECT_EQ(std::filesystem::file_size(db + "-wal"), 0u);
    const std::string copy = dir / "copy.db";
    std::filesystem::copy_file(db, copy);
    EXPECT_EQ(HostStore::Open(copy)->Dump(), HostStore::Open(db)->Dump());
    EXPECT_EQ(HostStore::Open(copy)->List("worlds").size(), 4u);
}

}  // namespace
