// The CLI as a program: plug-in loading and the plug-in's exported surface.
#include <cstdio>
#include <cstdlib>

#include <gtest/gtest.h>

#include "Transcript.h"

namespace OrvixTest {
namespace {

const std::string kBin = ORVIX_BIN_DIR;
const std::string kTestPlugins = kBin + "/../lib/test-plugins";

std::vector<std::string> BaseEnv(const std::string& dir) {
    std::vector<std::string> env = {"PATH=/usr/bin:/bin", "HOME=" + dir, "ORVIX_HOST_DB=" + dir + "/host.db"};
    for (const auto& setting : SanitizerEnvironment()) env.push_back(setting);
    return env;
}

TEST(Cli, SkipsBrokenPluginsAndKeepsTheGoodOnes) {
    char dirTemplate[] = "/tmp/orvix-cli-XXXXXX";
    ASSERT_NE(mkdtemp(dirTemplate), nullptr);
    std::vector<std::string> env = BaseEnv(dirTemplate);
    env.push_back("ORVIX_PLUGIN_PATH=" + std::string(ORVIX_PLUGIN_DIR) + ":" + kTestPlugins);

    const std::string warnings = "orvixcli: plug-in '" + kTestPlugins +
                                 "/NoEntry.so' has no entry point AutoCli_RegisterNamespaces; skipped\n"
                                 "orvixcli: plug-in '" +
                                 kTestPlugins +
                                 "/Throwing.so' failed to register its commands: cannot build the broken tree; "
                                 "skipped\n";

    ProcessResult ok = RunProcess({kBin + "/orvixcli", "network", "ip", "get"}, dirTemplate, env);
    EXPECT_EQ(ok.status, 0);
    EXPECT_EQ(ok.out, "   IPv6 Enabled: true\n");
    EXPECT_EQ(ok.err, warnings);

    // The half-built tree of the failed plug-in is nowhere.
    ProcessResult broken = RunProcess({kBin + "/orvixcli", "broken"}, dirTemplate, env);
    EXPECT_EQ(broken.status, 2);
    EXPECT_EQ(broken.err, warnings + "orvixcli: Unknown command or namespace 'broken'\n");

    // Without any plug-in the CLI still answers, with an empty tree.
    env.back() = "ORVIX_PLUGIN_PATH=" + std::string(dirTemplate);
    ProcessResult none = RunProcess({kBin + "/orvixcli", "network"}, dirTemplate, env);
    EXPECT_EQ(none.status, 2);
    EXPECT_EQ(none.err, "orvixcli: Unknown command or namespace 'network'\n");
    std::system(("rm -rf " + std::string(dirTemplate)).c_str());
}

TEST(Cli, PluginExportsOnlyItsEntryPoint) {
    const std::string command = "nm -D --defined-only '" + std::string(ORVIX_PLUGIN_DIR) + "/network.so'";
    FILE* pipe = popen(command.c_str(), "r");
    ASSERT_NE(pipe, nullptr);
    std::vector<std::string> symbols;
    char line[1024];
    while (std::fgets(line, sizeof line, pipe)) {
        std::string text(line);
        std::size_t space = text.rfind(' ');
        symbols.push_back(text.substr(space + 1, text.size() - space - 2));
    }
    ASSERT_EQ(pclose(pipe), 0);
    EXPECT_EQ(symbols, std::vector<std::string>{"AutoCli_RegisterNamespaces"});
}

}  // namespace
}  // namespace OrvixTest
