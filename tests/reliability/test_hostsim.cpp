// orvix-hostsim as a user runs it: exact output, messages and exit statuses.
#include <gtest/gtest.h>

#include "support/process.h"
#include "support/store_test_util.h"

namespace {

using PldCtl::Store::HostStore;

struct Result {
    int status;
    std::string out;
    std::string err;
};

class HostsimTest : public ::testing::Test {
protected:
    // Runs orvix-hostsim on this test's store.
    Result Run(std::vector<std::string> args) {
        args.insert(args.begin(), {"--db", db});
        return RunBare(args);
    }
    Result RunBare(const std::vector<std::string>& args) {
        OrvixTest::Process process(OrvixTest::Bin("orvix-hostsim"), args, dir / "out", dir / "err");
        const int status = process.Wait();
        return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, process.Out(), process.Err()};
    }
    // The one-line message of a failed run, checked for its shape.
    std::string Failure(const std::vector<std::string>& args, int status) {
        const Result result = Run(args);
        EXPECT_EQ(result.status, status);
        EXPECT_EQ(result.out, "");
        return result.err;
    }

    OrvixTest::TempDir dir;
    const std::string db = dir / "host.db";
    const std::string fixture = StoreTest::FixturePath("small-host.json");
    const std::string fixtureDump = PldCtl::Store::FormatProfile(StoreTest::Fixture("small-host.json")) + "\n";
    const std::string emptyDump = "{\n  \"format\": \"orvix-host-profile\",\n  \"version\": 1\n}\n";
};

TEST_F(HostsimTest, InitDumpAndForce) {
    OrvixTest::WriteFile(dir / "empty.json", StoreTest::EmptyProfileText());
    EXPECT_EQ(Run({"init", "--profile", fixture}).status, 0);
    EXPECT_EQ(Run({"dump"}).out, fixtureDump);
    EXPECT_EQ(Failure({"init", "--profile=" + (dir / "empty.json")}, 1),
              "orvix-hostsim: host store '" + db + "' exists; use --force to replace it\n");
    EXPECT_EQ(Run({"fault", "add", "A::B", "--message", "m"}).out, "1\n");

    // --force replaces the host and clears its faults, in the same file.
    EXPECT_EQ(Run({"init", "--force", "--profile", dir / "empty.json"}).status, 0);
    EXPECT_EQ(Run({"dump"}).out, emptyDump);
    EXPECT_EQ(Run({"fault", "list"}).out, "ID  OPERATION  KEY  REMAINING  MESSAGE\n");

    // A damaged store is replaced only with --force.
    OrvixTest::WriteFile(db, "not a database at all");
    EXPECT_EQ(Failure({"dump"}, 3), "orvix-hostsim: host store '" + db + "' is not an SQLite database or is damaged\n");
    EXPECT_EQ(Failure({"init"}, 1), "orvix-hostsim: host store '" + db + "' exists; use --force to replace it\n");
    const Result forced = Run({"init", "--force", "--profile", fixture});
    EXPECT_EQ(forced.status, 0);
    EXPECT_EQ(forced.err,
              "orvix-hostsim: host store '" + db + "' is not an SQLite database or is damaged; replacing it\n");
    EXPECT_EQ(Run({"dump"}).out, fixtureDump);
}

TEST_F(HostsimTest, LoadReplacesOrCreates) {
    EXPECT_EQ(Run({"load", fixture}).status, 0);  // creates the store
    EXPECT_EQ(Run({"dump"}).out, fixtureDump);
    // A bad profile fails the request and changes nothing.
    OrvixTest::WriteFile(dir / "bad.json", R"({"format": "orvix-host-profile", "version": 1, "worlds": [{"id": []}]})");
    EXPECT_EQ(Failure({"load", dir / "bad.json"}, 1),
              "orvix-hostsim: profile " + (dir / "bad.json") +
                  ": worlds[0]: field 'id' must be a string or an integer, not array\n");
    EXPECT_EQ(Run({"dump"}).out, fixtureDump);
}

TEST_F(HostsimTest, Faults) {
    EXPECT_EQ(
        Run({"fault", "add", "PnicImpl::GetPnicStats", "--key", "hwnic2", "--message", "link lost", "--count", "2"})
            .out,
        "1\n");
    EXPECT_EQ(Run({"fault", "add", "Vswitch::Add", "--message=no room"}).out, "2\n");
    EXPECT_EQ(Run({"fault", "list"}).out,
              "ID  OPERATION               KEY     REMAINING  MESSAGE\n"
              "1   PnicImpl::GetPnicStats  hwnic2  2          link lost\n"
              "2   Vswitch::Add            -       always     no room\n");
    // The faults fire for the library, in another process.
    auto store = HostStore::Open(db);
    EXPECT_THROW(store->CheckFault("PnicImpl::GetPnicStats", "hwnic2"), PldCtl::Store::InjectedFault);
    EXPECT_EQ(store->ListFaults().at(0).remaining, 1);
    EXPECT_EQ(Run({"fault", "clear"}).status, 0);
    EXPECT_TRUE(store->ListFaults().empty());

    EXPECT_EQ(Failure({"fault", "add", "GetPnicStats", "--message", "m"}, 2),
              "orvix-hostsim: fault operation 'GetPnicStats' must look like Class::Operation\n");
    EXPECT_EQ(Failure({"fault", "add", "A::B", "--message", "m", "--count", "2x"}, 2),
              "orvix-hostsim: --count: '2x' is not an integer\n");
    EXPECT_EQ(Failure({"fault", "add", "A::B"}, 2), "orvix-hostsim: fault add: --message is required\n");
    EXPECT_TRUE(store->ListFaults().empty());
}

// What a user typed reaches the terminal with its control characters
// escaped, in messages and in the fault table alike; the store keeps it exact.
TEST_F(HostsimTest, ControlCharactersAreShownEscaped) {
    EXPECT_EQ(Failure({"fault", "add", "\x1b]0;owned\x07", "--message", "m"}, 2),
              "orvix-hostsim: fault operation '\\x1b]0;owned\\x07' must look like Class::Operation\n");
    EXPECT_EQ(Run({"fault", "add", "A::B", "--key", "k\xc2\x9b", "--message", "\x1b[31mred"}).out, "1\n");
    EXPECT_EQ(Run({"fault", "list"}).out,
              "ID  OPERATION  KEY      REMAINING  MESSAGE\n"
              "1   A::B       k\\u009b  always     \\x1b[31mred\n");
    EXPECT_EQ(HostStore::Open(db)->ListFaults().at(0).message, "\x1b[31mred");
}

TEST_F(HostsimTest, UsageErrorsAndHelp) {
    EXPECT_EQ(Failure({}, 2), "orvix-hostsim: missing command (see orvix-hostsim --help)\n");
    EXPECT_EQ(Failure({"dumb"}, 2), "orvix-hostsim: unknown command 'dumb' (see orvix-hostsim --help)\n");
    EXPECT_EQ(Failure({"fault"}, 2), "orvix-hostsim: fault: expected one of add, list, clear\n");
    EXPECT_EQ(Failure({"load"}, 2), "orvix-hostsim: load: missing FILE\n");
    EXPECT_EQ(Failure({"dump", "extra"}, 2), "orvix-hostsim: dump: unexpected argument 'extra'\n");
    EXPECT_EQ(Failure({"dump", "--all"}, 2), "orvix-hostsim: dump: unknown option '--all'\n");
    EXPECT_EQ(Failure({"init", "--force=yes"}, 2), "orvix-hostsim: --force takes no value\n");
    EXPECT_EQ(Failure({"init", "--force", "--force"}, 2), "orvix-hostsim: --force given twice\n");
    EXPECT_EQ(RunBare({"--db"}).err, "orvix-hostsim: --db needs a value\n");
    EXPECT_EQ(RunBare({"--verbose", "dump"}).err, "orvix-hostsim: unknown option '--verbose'\n");
    EXPECT_EQ(Failure({"fault", "add", "notanop", "--message", "x"}, 2),
              "orvix-hostsim: fault operation 'notanop' must look like Class::Operation\n");
    EXPECT_EQ(Failure({"fault", "add", "A::B", "--message", "x", "--count", "0"}, 2),
              "orvix-hostsim: a fault's count must be at least 1, not 0\n");
    // Nothing was created by any of them.
    EXPECT_FALSE(std::filesystem::exists(db));

    const Result addHelp = Run({"fault", "add", "--help"});
    EXPECT_EQ(addHelp.status, 0);
    EXPECT_EQ(addHelp.out.rfind(
                  "Usage: orvix-hostsim [--db PATH] fault add OPERATION [--key KEY] --message TEXT [--count N]\n", 0),
              0u);
}

// A store path that names a directory is refused by both tools, naming the
// path, before any directory on the way is made.
TEST_F(HostsimTest, AStorePathNamingADirectoryCreatesNothing) {
    for (const std::string& path : {dir / "some/dir/", dir / "some/dir/.", dir / "some/.."}) {
        SCOPED_TRACE(path);
        const std::string problem =
            "host store '" + path + "' cannot be created: the path names a directory, not a file\n";
        const Result dump = RunBare({"--db", path, "dump"});
        EXPECT_EQ(dump.status, 3);
        EXPECT_EQ(dump.err, "orvix-hostsim: " + problem);

        std::vector<std::string> env = {"PATH=/usr/bin:/bin", "HOME=" + dir.Path(), "ORVIX_HOST_DB=" + path,
                                        "ORVIX_PLUGIN_PATH=" + std::string(ORVIX_PLUGIN_DIR)};
        for (const auto& setting : OrvixTest::SanitizerEnvironment()) env.push_back(setting);
        const auto cli = OrvixTest::RunProcess({OrvixTest::Bin("orvixcli"), "network", "ip", "get"}, dir.Path(), env);
        EXPECT_EQ(cli.status, 3);
        EXPECT_EQ(cli.err, "orvixcli: " + problem);
        EXPECT_FALSE(std::filesystem::exists(dir / "some"));
    }
}

TEST_F(HostsimTest, PathFollowsOptionAndEnvironment) {
    OrvixTest::ScopedEnv env("ORVIX_HOST_DB", dir / "env.db");
    EXPECT_EQ(RunBare({"path"}).out, (dir / "env.db") + "\n");
    EXPECT_EQ(Run({"path"}).out, db + "\n");
}

}  // namespace
