// orvixcli: loads the command plug-ins and runs one command line.
#include <iostream>
#include <optional>
#include <string>
#include <vector>

#include "PluginLoader.h"
#include "SupportEntries.h"
#include "framework/Runner.h"

int main(int argc, char** argv) {
    std::ios::sync_with_stdio(false);
    const std::vector<std::string> args(argv + 1, argv + argc);
    if (std::optional<int> status = OrvixCli::RunSupportEntry(args)) return *status;

    boost::shared_ptr<AutoCli::Namespace> root = AutoCli::Namespace::New();
    OrvixCli::LoadPlugins(root, std::cerr);

    AutoCli::RunOptions options;
    options.program = "orvixcli";
    options.version = ORVIX_VERSION;
    options.exitsAfterRun = true;
    int status = AutoCli::Run(root, args, std::cout, std::cerr, options);

    // Output that could not be written (a full disk, a closed pipe) must not
    // pass for success.
    std::cout.flush();
    if (!std::cout) {
        std::cerr << "orvixcli: cannot write the output\n";
        return AutoCli::kExitFailure;
    }
    return status;
}
