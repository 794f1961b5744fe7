// A good store that cannot be used right now (a full disk, missing rights)
// is reported as what it is, never as damaged, and a forced init neither
// removes it nor leaves anything of a failed replacement behind.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

#include "support/process.h"
#include "support/store_test_util.h"

namespace {

using OrvixTest::ProcessResult;

class StoreTroubleTest : public ::testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(Hostsim({"init", "--profile", fixture}).status, 0); }

    // orvix-hostsim on this test's store, behind `prefix` (a command that
    // runs the rest of its arguments under some restriction).
    ProcessResult Hostsim(std::vector<std::string> args, std::vector<std::string> prefix = {}) {
        args.insert(args.begin(), {OrvixTest::Bin("orvix-hostsim"), "--db", db});
        prefix.insert(prefix.end(), args.begin(), args.end());
        std::vector<std::string> env = {"PATH=/usr/bin:/bin", "HOME=" + dir.Path()};
        for (const auto& setting : OrvixTest::SanitizerEnvironment()) env.push_back(setting);
        return OrvixTest::RunProcess(prefix, dir.Path(), env);
    }

    // The store's log files go, so that the next process must create them.
    void RemoveLogFiles() {
        for (const char* suffix : {"-wal", "-shm"}) unlink((db + suffix).c_str());
    }

    // A store refused for a reason other than damage: exit status 3, one
    // line naming the file and the cause, and the file as it was.
    void ExpectRefusedUntouched(const ProcessResult& result, const std::string& bytes, const std::string& cause) {
        EXPECT_EQ(result.status, 3);
        EXPECT_EQ(result.err.rfind("orvix-hostsim: host store '" + db + "' ", 0), 0u) << result.err;
        EXPECT_NE(result.err.find(cause), std::string::npos) << result.err;
        EXPECT_EQ(result.err.find("damaged"), std::string::npos) << result.err;
        EXPECT_EQ(OrvixTest::ReadFile(db), bytes);
        ExpectNoTemporaryFiles();
    }

    void ExpectNoTemporaryFiles() {
        for (const auto& entry : std::filesystem::directory_iterator(std::filesystem::path(db).parent_path())) {
            EXPECT_EQ(entry.path().string().find(".tmp-"), std::string::npos) << entry.path();
        }
    }

    OrvixTest::TempDir dir;
    const std::string db = dir / "store/host.db";
    const std::string fixture = StoreTest::FixturePath("small-host.json");
    const std::string fixtureDump = PldCtl::Store::FormatProfile(StoreTest::Fixture("small-host.json")) + "\n";
};

// A full disk, as a file size limit of 4 KB: no file may grow past it.
const std::vector<std::string> kFullDisk = {"sh", "-c", "trap '' XFSZ; ulimit -f 8; exec \"$@\"", "sh"};

TEST_F(StoreTroubleTest, AFullDiskNeitherMisdiagnosesNorLosesTheStore) {
    const std::string bytes = OrvixTest::ReadFile(db);
    RemoveLogFiles();
    ExpectRefusedUntouched(Hostsim({"dump"}, kFullDisk), bytes, "File too large");
    RemoveLogFiles();
    ExpectRefusedUntouched(Hostsim({"init", "--force"}, kFullDisk), bytes, "File too large");
    EXPECT_EQ(Hostsim({"dump"}).out, fixtureDump);

    // A damaged store whose replacement cannot be built stays as it was.
    OrvixTest::WriteFile(db, "not a database at all");
    RemoveLogFiles();
    const ProcessResult forced = Hostsim({"init", "--force"}, kFullDisk);
    EXPECT_EQ(forced.status, 3);
    EXPECT_EQ(forced.err.rfind("orvix-hostsim: host store '" + db +
                                   "' is not an SQLite database or is damaged; replacing it\n"
                                   "orvix-hostsim: host store '" +
                                   db + "' cannot be created: ",
                               0),
              0u)
        << forced.err;
    EXPECT_EQ(OrvixTest::ReadFile(db), "not a database at all");
    ExpectNoTemporaryFiles();

    EXPECT_EQ(Hostsim({"init", "--force", "--profile", fixture}).status, 0);
    EXPECT_EQ(Hostsim({"dump"}).out, fixtureDump);
}

// Missing rights: a store in a directory where its log files cannot be
// created, and another user's private store.
TEST_F(StoreTroubleTest, MissingRightsAreReportedAsSuch) {
    if (geteuid() != 0 || access("/usr/bin/setpriv", X_OK) != 0) {
        GTEST_SKIP() << "needs root and setpriv to run orvix-hostsim as another user";
    }
    const std::vector<std::string> asNobody = {"/usr/bin/setpriv", "--reuid=65534", "--regid=65534", "--clear-groups"};
    const std::string bytes = OrvixTest::ReadFile(db);
    const std::string store = dir / "store";
    RemoveLogFiles();
    ASSERT_EQ(chmod(dir.Path().c_str(), 0755), 0);
    ASSERT_EQ(chmod(store.c_str(), 0555), 0);
    ASSERT_EQ(chmod(db.c_str(), 0644), 0);
    ExpectRefusedUntouched(Hostsim({"dump"}, asNobody), bytes, "readonly");
    ExpectRefusedUntouched(Hostsim({"init", "--force"}, asNobody), bytes, "readonly");

    ASSERT_EQ(chmod(store.c_str(), 0755), 0);
    ASSERT_EQ(chmod(db.c_str(), 0600), 0);
    ExpectRefusedUntouched(Hostsim({"dump"}, asNobody), bytes, "Permission denied");
    ExpectRefusedUntouched(Hostsim({"init", "--force"}, asNobody), bytes, "Permission denied");
    EXPECT_EQ(Hostsim({"dump"}).out, fixtureDump);
}

}  // namespace
