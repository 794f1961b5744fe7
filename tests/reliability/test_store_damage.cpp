// Damaged, truncated and foreign files: the library and orvix-hostsim refuse
// them with a message naming the file, and leave them exactly as they were.
#include <gtest/gtest.h>
#include <unistd.h>

#include <random>

#include "support/process.h"
#include "support/store_test_util.h"

namespace {

using PldCtl::Store::HostStore;

struct DamagedFile {
    std::string name;
    std::string bytes;
};

std::vector<DamagedFile> DamagedFiles(const OrvixTest::TempDir& dir) {
    const std::string real = dir / "real.db";
    HostStore::Create(real, StoreTest::Fixture("small-host.json"), "small-host.json");
    const std::string store = OrvixTest::ReadFile(real);
    unlink(real.c_str());

    std::mt19937 random(7);
    std::string garbage(8192, '\0');
    for (auto& c : garbage) c = static_cast<char>(random());

    const std::string foreign = dir / "foreign-source.db";
    StoreTest::RawSql(foreign,
                      "CREATE TABLE accounts(id INTEGER PRIMARY KEY, owner TEXT); "
                      "INSERT INTO accounts(owner) VALUES ('someone')");
    const std::string foreignBytes = OrvixTest::ReadFile(foreign);
    unlink(foreign.c_str());

    return {{"half.db", store.substr(0, store.size() / 2)},
            {"hundred.db", store.substr(0, 100)},
            {"garbage.db", garbage},
            {"foreign.db", foreignBytes},
            {"empty.db", ""}};
}

TEST(StoreDamageTest, DamagedFilesAreRefusedAndLeftAlone) {
    OrvixTest::TempDir dir;
    for (const auto& file : DamagedFiles(dir)) {
        SCOPED_TRACE(file.name);
        const std::string path = dir / file.name;
        OrvixTest::WriteFile(path, file.bytes);

        try {
            HostStore::Open(path);
            ADD_FAILURE() << "opened";
        } catch (const PldCtl::Store::StoreError& e) {
            EXPECT_EQ(std::string(e.what()).rfind("host store '" + path + "' ", 0), 0u) << e.what();
        }
        EXPECT_EQ(OrvixTest::ReadFile(path), file.bytes);

        OrvixTest::Process dump(OrvixTest::Bin("orvix-hostsim"), {"--db", path, "dump"}, dir / "out", dir / "err");
        const int status = dump.Wait();
        EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 3) << "status " << status;
        EXPECT_EQ(dump.Out(), "");
        const std::string err = dump.Err();
        EXPECT_EQ(err.rfind("orvix-hostsim: host store '" + path + "' ", 0), 0u) << err;
        EXPECT_EQ(std::count(err.begin(), err.end(), '\n'), 1) << err;
        EXPECT_EQ(OrvixTest::ReadFile(path), file.bytes);
        // Neither left a side file behind.
        EXPECT_FALSE(std::filesystem::exists(path + "-wal"));
        EXPECT_FALSE(std::filesystem::exists(path + "-shm"));
        unlink(path.c_str());
    }
}

}  // namespace
