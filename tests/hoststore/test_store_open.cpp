// Creating and opening store files, finding the default store, and refusing
// files that are not (or no longer) ours without touching them.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>
#include <thread>

#include "support/store_test_util.h"

namespace {

using OrvixTest::ScopedEnv;
using PldCtl::Store::HostStore;
using PldCtl::Store::Json;
using PldCtl::Store::StoreError;

std::string OpenError(const std::string& path) {
    try {
        HostStore::Open(path);
    } catch (const StoreError& e) {
        return e.what();
    }
    return "(opened)";
}

std::vector<std::string> DirectoryEntries(const std::string& directory) {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(directory)) names.push_back(entry.path().filename());
    std::sort(names.begin(), names.end());
    return names;
}

// What a store that was used leaves in its directory.
const std::vector<std::string> kStoreFiles = {"host.db", "host.db-shm", "host.db-wal"};

TEST(StoreOpenTest, CreateBuildsACompleteStoreInPrivateDirectories) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "state/orvix/host.db";
    auto store = HostStore::Create(path, StoreTest::Fixture("small-host.json"), "small-host.json");
    EXPECT_EQ(store->Path(), path);
    struct stat st {};
    ASSERT_EQ(stat((dir / "state").c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 0777, 0700u);
    store.reset();
    // No temporary file is left. The log files stay, and the log is empty:
    // the database file alone holds the store.
    EXPECT_EQ(DirectoryEntries(dir / "state/orvix"), kStoreFiles);
    EXPECT_EQ(std::filesystem::file_size(path + "-wal"), 0u);
    EXPECT_EQ(StoreTest::RawSql(path, "PRAGMA journal_mode"), "wal");
    EXPECT_EQ(StoreTest::RawSql(path, "SELECT value FROM meta WHERE name = 'profile'"), "small-host.json");
    EXPECT_EQ(HostStore::Open(path)->List("portgroups").size(), 3u);

    const std::string before = OrvixTest::ReadFile(path);
    try {
        HostStore::Create(path, StoreTest::EmptyProfileText());
        FAIL() << "created over an existing store";
    } catch (const StoreError& e) {
        EXPECT_EQ(std::string(e.what()), "host store '" + path + "' exists already");
    }
    EXPECT_EQ(OrvixTest::ReadFile(path), before);
    // An existing store is opened as it is; the profile is not even read.
    EXPECT_EQ(HostStore::OpenOrCreate(path, "not json")->List("nics").size(), 2u);
}

TEST(StoreOpenTest, BadProfileCreatesNothing) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "host.db";
    EXPECT_THROW(HostStore::OpenOrCreate(path, "{"), PldCtl::Store::ProfileError);
    EXPECT_THROW(HostStore::Create(path, R"({"format": "orvix-host-profile", "version": 1, "nic": []})"),
                 PldCtl::Store::ProfileError);
    EXPECT_TRUE(DirectoryEntries(dir.Path()).empty());
}

TEST(StoreOpenTest, RefusedFilesStayAsTheyWere) {
    OrvixTest::TempDir dir;
    EXPECT_EQ(OpenError(dir / "missing.db"), "host store '" + (dir / "missing.db") + "' does not exist");
    EXPECT_EQ(OpenError(dir.Path()), "host store '" + dir.Path() + "' is not a regular file");

    const std::string newer = dir / "newer.db";
    HostStore::Create(newer, StoreTest::EmptyProfileText());
    StoreTest::RawSql(newer, "PRAGMA user_version = 7");
    const std::string newerBytes = OrvixTest::ReadFile(newer);
    EXPECT_EQ(OpenError(newer),
              "host store '" + newer + "' was written by a newer version (schema 7, this build reads up to 2)");
    EXPECT_EQ(OrvixTest::ReadFile(newer), newerBytes);
}

// Schema 1 kept each collection in a table of its own; opening such a store
// moves every object into the one object table, keeping keys and order.
TEST(StoreOpenTest, AStoreOfSchemaOneIsUpgradedInPlace) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "host.db";
    const Json dump = HostStore::Create(path, StoreTest::Fixture("small-host.json"), "small")->Dump();
    std::string downgrade;
    for (const auto& collection : PldCtl::Store::Collections()) {
        const std::string section = collection.section;
        downgrade += "CREATE TABLE \"" + section +
                     "\"(key TEXT PRIMARY KEY, parent TEXT, seq INTEGER NOT NULL, doc TEXT NOT NULL); INSERT INTO \"" +
                     section + "\" SELECT key, parent, seq, doc FROM object WHERE section = '" + section + "';";
    }
    StoreTest::RawSql(path, downgrade + "DROP TABLE object; PRAGMA user_version = 1;");

    auto store = HostStore::Open(path);
    EXPECT_EQ(StoreTest::RawSql(path, "PRAGMA user_version"), "2");
    EXPECT_EQ(StoreTest::RawSql(path, "SELECT count(*) FROM sqlite_schema WHERE name = 'portgroups'"), "0");
    EXPECT_EQ(store->Dump(), dump);
    // Positions carry on where the old table left them.
    store->Change([](PldCtl::Store::Transaction& t) { t.Put("execLog", {{"command", "third"}}); });
    EXPECT_EQ(store->Get("execLog", "#3")->at("command"), "third");
}

TEST(StoreOpenTest, ResolvePathFollowsTheEnvironment) {
    ScopedEnv db("ORVIX_HOST_DB", "");
    ScopedEnv state("XDG_STATE_HOME", "/var/state");
    ScopedEnv home("HOME", "/home/op");
    EXPECT_EQ(HostStore::ResolvePath(), "/var/state/orvix/host.db");
    ScopedEnv emptyState("XDG_STATE_HOME", "");
    EXPECT_EQ(HostStore::ResolvePath(), "/home/op/.local/state/orvix/host.db");
    ScopedEnv noHome("HOME", std::nullopt);
    EXPECT_THROW(HostStore::ResolvePath(), StoreError);
}

// A default store that cannot be created names the store and the profile
// it could not be made from, and leaves nothing behind. (Creating one from
// the named profile is what every transcript does.)
TEST(StoreOpenTest, DefaultStoreFromABadProfile) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "sub/host.db";
    ScopedEnv db("ORVIX_HOST_DB", path);
    OrvixTest::WriteFile(dir / "bad.json", R"({"format": "orvix-host-profile", "version": 1, "nics": [{}]})");
    ScopedEnv bad("ORVIX_HOST_PROFILE", dir / "bad.json");
    HostStore::ResetDefault();
    try {
        HostStore::Default();
        FAIL() << "created from a bad profile";
    } catch (const StoreError& e) {
        EXPECT_EQ(std::string(e.what()), "host store '" + path + "' cannot be created: profile " + (dir / "bad.json") +
                                             ": nics[0]: key field 'name' is missing");
    }
    EXPECT_FALSE(std::filesystem::exists(path));
}

TEST(StoreOpenTest, RacingCreatorsAllOpenTheWinnersStore) {
    OrvixTest::TempDir dir;
    const std::string path = dir / "race/host.db";
    constexpr std::size_t kCreators = 6;
    std::vector<std::string> hostnames(kCreators);
    std::vector<std::string> errors(kCreators);
    std::vector<std::thread> threads;
    for (std::size_t i = 0; i < hostnames.size(); ++i) {
        threads.emplace_back([&, i] {
            try {
                const Json profile = {{"format", "orvix-host-profile"},
                                      {"version", 1},
                                      {"system", {{"hostname", "creator-" + std::to_string(i)}}},
                                      {"worlds", {{{"id", i}}}}};
                auto store = HostStore::OpenOrCreate(path, profile, "thread");
                hostnames[i] = store->GetSingleton("system").at("hostname");
                // Each store is a complete one: its singleton and its world agree.
                const std::string id = hostnames[i].substr(hostnames[i].find('-') + 1);
                if (!store->Get("worlds", id)) errors[i] = "world " + id + " missing";
            } catch (const std::exception& e) {
                errors[i] = e.what();
            }
        });
    }
    for (auto& thread : threads) thread.join();
    for (std::size_t i = 0; i < hostnames.size(); ++i) {
        EXPECT_EQ(errors[i], "");
        EXPECT_EQ(hostnames[i], hostnames[0]);
    }
    EXPECT_EQ(DirectoryEntries(dir / "race"), kStoreFiles);
}

}  // namespace
