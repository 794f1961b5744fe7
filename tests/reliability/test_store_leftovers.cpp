// What a dead store leaves behind: a process killed with the store open
// leaves its write-ahead log and shared-memory index beside the file. When
// the file itself is then removed, a store created at the same path must
// start from its own pages only, never from the dead store's log.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <functional>

#include "support/store_test_util.h"

namespace {

using PldCtl::Store::HostStore;
using PldCtl::Store::Json;

struct Leftovers {
    std::string wal;
    std::string shm;
};

// Creates the default-like fixture host at path, lets a child process add a
// switch and die with the store open, removes the store file and returns the
// log and index the child left.
Leftovers DeadStoreLeftovers(const std::string& path) {
    HostStore::Create(path, StoreTest::Fixture("small-host.json"), "old host");
    const pid_t child = fork();
    if (child == 0) {
        auto store = HostStore::Open(path);
        store->Change([](PldCtl::Store::Transaction& t) { t.Put("vswitches", {{"name", "fromOldHost"}}); });
        // Dies without closing the connection: the change lives only in the log.
        _exit(0);
    }
    int status = 0;
    waitpid(child, &status, 0);
    EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
    EXPECT_GT(std::filesystem::file_size(path + "-wal"), 0u);
    Leftovers leftovers{OrvixTest::ReadFile(path + "-wal"), OrvixTest::ReadFile(path + "-shm")};
    unlink(path.c_str());
    return leftovers;
}

TEST(StoreLeftoversTest, ANewStoreNeverReplaysADeadStoresLog) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "host.db";
    const Leftovers leftovers = DeadStoreLeftovers(path);
    const Json empty = {{"format", "orvix-host-profile"}, {"version", 1}};

    // Every way a store comes to be: created outright, created on first use,
    // and the process-wide store.
    const std::vector<std::pair<std::string, std::function<std::unique_ptr<HostStore>()>>> creators = {
        {"Create", [&] { return HostStore::Create(path, StoreTest::EmptyProfileText()); }},
        {"OpenOrCreate", [&] { return HostStore::OpenOrCreate(path, StoreTest::EmptyProfileText()); }},
        {"OpenOrCreate(Json)", [&] { return HostStore::OpenOrCreate(path, empty, "empty"); }},
    };
    for (const auto& [name, create] : creators) {
        SCOPED_TRACE(name);
        OrvixTest::WriteFile(path + "-wal", leftovers.wal);
        OrvixTest::WriteFile(path + "-shm", leftovers.shm);
        OrvixTest::WriteFile(path + "-journal", "stale rollback journal");
        ASSERT_FALSE(std::filesystem::exists(path));
        {
            auto store = create();
            EXPECT_EQ(store->Dump(), empty);
            EXPECT_FALSE(std::filesystem::exists(path + "-journal"));
        }
        // Reopened, the store still holds only its own host and is whole.
        EXPECT_EQ(HostStore::Open(path)->Dump(), empty);
        EXPECT_EQ(StoreTest::RawSql(path, "PRAGMA integrity_check"), "ok");
        unlink(path.c_str());
    }
}

}  // namespace
