// The CLI as a program: plug-in loading and the plug-in's exported surface.
#include <gtest/gtest.h>

#include "support/process.h"
#include "support/test_util.h"

namespace OrvixTest {
namespace {

const std::string kTestPlugins = Bin("../lib/test-plugins");

std::vector<std::string> BaseEnv(const std::string& dir) {
    std::vector<std::string> env = {"PATH=/usr/bin:/bin", "HOME=" + dir, "ORVIX_HOST_DB=" + dir + "/host.db"};
    for (const auto& setting : SanitizerEnvironment()) env.push_back(setting);
    return env;
}

TEST(Cli, SkipsBrokenPluginsAndKeepsTheGoodOnes) {
    const TempDir dir;
    std::vector<std::string> env = BaseEnv(dir.Path());
    env.push_back("ORVIX_PLUGIN_PATH=" + std::string(ORVIX_PLUGIN_DIR) + ":" + kTestPlugins);

    const std::string warnings = "orvixcli: plug-in '" + kTestPlugins +
                                 "/NoEntry.so' has no entry point AutoCli_RegisterNamespaces; skipped\n"
                                 "orvixcli: plug-in '" +
                                 kTestPlugins +
                                 "/Throwing.so' failed to register its commands: cannot build the broken tree; "
                                 "skipped\n";

    ProcessResult ok = RunProcess({Bin("orvixcli"), "network", "ip", "get"}, dir.Path(), env);
    EXPECT_EQ(ok.status, 0);
    EXPECT_EQ(ok.out, "   IPv6 Enabled: true\n");
    EXPECT_EQ(ok.err, warnings);

    // The half-built tree of the failed plug-in is nowhere.
    ProcessResult broken = RunProcess({Bin("orvixcli"), "broken"}, dir.Path(), env);
    EXPECT_EQ(broken.status, 2);
    EXPECT_EQ(broken.err, warnings + "orvixcli: Unknown command or namespace 'broken'\n");

    // Without any plug-in the CLI still answers, with an empty tree.
    env.back() = "ORVIX_PLUGIN_PATH=" + dir.Path();
    ProcessResult none = RunProcess({Bin("orvixcli"), "network"}, dir.Path(), env);
    EXPECT_EQ(none.status, 2);
    EXPECT_EQ(none.err, "orvixcli: Unknown command or namespace 'network'\n");
}

TEST(Cli, PluginExportsOnlyItsEntryPoint) {
    EXPECT_EQ(ExportedSymbols(std::string(ORVIX_PLUGIN_DIR) + "/network.so"),
              std::vector<std::string>{"AutoCli_RegisterNamespaces"});
}

}  // namespace
}  // namespace OrvixTest
