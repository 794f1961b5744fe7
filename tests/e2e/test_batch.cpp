// The real orvixcli in batch mode fed through a pipe, and help over the real
// command tree.
#include <stdio.h>
#include <unistd.h>

#include <chrono>
#include <set>
#include <thread>

#include <gtest/gtest.h>

#include "support/process.h"
#include "support/test_util.h"

namespace OrvixTest {
namespace {

std::vector<std::string> BaseEnv(const std::string& dir) {
    std::vector<std::string> env = {"PATH=/usr/bin:/bin", "HOME=" + dir, "ORVIX_HOST_DB=" + dir + "/host.db"};
    for (const auto& setting : SanitizerEnvironment()) env.push_back(setting);
    return env;
}

std::vector<std::string> SplitRows(const std::string& text) {
    std::vector<std::string> rows;
    std::istringstream in(text);
    for (std::string row; std::getline(in, row);) rows.push_back(row);
    return rows;
}

// Waits until the file holds `text` (a batch line's output), for up to 30 s.
bool WaitForText(const std::string& file, const std::string& text) {
    const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(30);
    while (std::chrono::steady_clock::now() < deadline) {
        std::ifstream in(file);
        std::stringstream content;
        content << in.rdbuf();
        if (content.str().find(text) != std::string::npos) return true;
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
    return false;
}

// A batch waiting for its next line holds no read transaction: a change
// another process makes meanwhile is what the next line sees, and the
// other process's change was not blocked by the batch. Lines from a pipe
// are each flushed to disk when made.
TEST(Batch, LinesFromAPipeSeeTheHostAsItIsThen) {
    const TempDir dir;
    const std::vector<std::string> env = BaseEnv(dir.Path());
    ASSERT_EQ(RunProcess({Bin("orvixcli"), "network", "ip", "get"}, dir.Path(), env).status, 0);

    const std::string command = "exec env ORVIX_HOST_DB='" + dir / "host.db" + "' HOME='" + dir.Path() + "' '" +
                                Bin("orvixcli") + "' --batch - >'" + dir / "out" + "' 2>'" + dir / "err" + "'";
    FILE* batch = popen(command.c_str(), "w");
    ASSERT_NE(batch, nullptr);
    fputs("network ip get\n", batch);
    fflush(batch);
    const bool firstDone = WaitForText(dir / "out", "IPv6 Enabled: true");

    ProcessResult change =
        RunProcess({Bin("orvixcli"), "network", "ip", "set", "--ipv6-enabled=false"}, dir.Path(), env);
    fputs("network ip get\nnetwork ip set -e true\n", batch);
    const int status = pclose(batch);

    EXPECT_TRUE(firstDone);
    EXPECT_EQ(change.status, 0) << change.err;
    EXPECT_EQ(WEXITSTATUS(status), 0);
    EXPECT_EQ(ReadFile(dir / "out"), "   IPv6 Enabled: true\n   IPv6 Enabled: false\n");
    EXPECT_EQ(ReadFile(dir / "err"), "");
    // The batch's last change is in the store for the next process.
    EXPECT_EQ(RunProcess({Bin("orvixcli"), "network", "ip", "get"}, dir.Path(), env).out, "   IPv6 Enabled: true\n");
}

// Every change a batch from a file reported done is in the store when the
// batch ends, also when a later line fails.
TEST(Batch, ChangesBeforeAFailingLineStay) {
    const TempDir dir;
    const std::vector<std::string> env = BaseEnv(dir.Path());
    std::string lines;
    for (int i = 0; i < 250; ++i)
        lines += "network vswitch standard portgroup add -v vSwitch0 -p batch" + std::to_string(i) + "\n";
    lines += "network vswitch standard portgroup add -v vSwitch0 -p batch0\n";
    lines += "network vswitch standard portgroup add -v vSwitch0 -p never\n";
    WriteFile(dir / "lines.txt", lines);

    ProcessResult run = RunProcess({Bin("orvixcli"), "--batch", "lines.txt"}, dir.Path(), env);
    EXPECT_EQ(run.status, 1);
    EXPECT_NE(run.err.find("lines.txt:251: failed with exit status 1"), std::string::npos) << run.err;

    ProcessResult list = RunProcess(
        {Bin("orvixcli"), "network", "vswitch", "standard", "portgroup", "list", "--formatter=csv"}, dir.Path(), env);
    std::set<std::string> names;
    for (const auto& row : SplitRows(list.out)) names.insert(row.substr(0, row.find(',')));
    for (int i = 0; i < 250; ++i) EXPECT_TRUE(names.count("batch" + std::to_string(i))) << i;
    EXPECT_FALSE(names.count("never"));
}

// Walks the real tree through help: every namespace a listing shows leads
// to at least one command, so no help page lists nothing.
TEST(Help, NoNamespaceOfTheRealTreeIsEmpty) {
    const TempDir dir;
    const std::vector<std::string> env = BaseEnv(dir.Path());
    std::vector<std::vector<std::string>> pending = {{}};
    int pages = 0;
    while (!pending.empty()) {
        std::vector<std::string> path = pending.back();
        pending.pop_back();
        std::vector<std::string> argv = {Bin("orvixcli")};
        argv.insert(argv.end(), path.begin(), path.end());
        argv.push_back("--help");
        ProcessResult help = RunProcess(argv, dir.Path(), env);
        ASSERT_EQ(help.status, 0) << help.err;
        ++pages;
        bool inNamespaces = false;
        int children = 0;
        for (const auto& line : SplitRows(help.out)) {
            if (line == "Available Namespaces:" || line == "Available Commands:") {
                inNamespaces = line == "Available Namespaces:";
                continue;
            }
            if (line.rfind("  ", 0) != 0 || line.rfind("   ", 0) == 0 || line.find("--") != std::string::npos) {
                if (line.empty()) inNamespaces = false;
                continue;
            }
            ++children;
            if (inNamespaces) {
                std::vector<std::string> child = path;
                child.push_back(line.substr(2, line.find(' ', 2) - 2));
                pending.push_back(child);
            }
        }
        std::string shown;
        for (const auto& word : path) shown += word + " ";
        EXPECT_GT(children, 0) << "help of '" << shown << "' lists nothing";
    }
    // The network tree has dozens of namespaces; the walk must have seen them.
    EXPECT_GT(pages, 50);
}

}  // namespace
}  // namespace OrvixTest
