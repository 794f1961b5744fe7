#include "SupportEntries.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <iostream>
#include <sstream>
#include <stdexcept>

#include "PluginLoader.h"
#include "framework/Completion.h"
#include "framework/Format.h"
#include "framework/ManPages.h"
#include "framework/Runner.h"

namespace OrvixCli {

namespace {

constexpr const char* kProgram = "orvixcli";
constexpr const char* kCompleteEntry = "__complete";
constexpr const char* kManPagesEntry = "__manpages";

boost::shared_ptr<AutoCli::Namespace> LoadTree(std::ostream& err) {
    boost::shared_ptr<AutoCli::Namespace> root = AutoCli::Namespace::New();
    LoadPlugins(root, err);
    return root;
}

// --completion SHELL or --completion=SHELL.
int PrintScript(const std::vector<std::string>& args) {
    const std::string& option = args[0];
    const std::size_t eq = option.find('=');
    const bool inlineShell = eq != std::string::npos;
    if (args.size() != (inlineShell ? 1 : 2)) {
        std::cerr << kProgram << ": Option --completion needs one value: "
                  << AutoCli::JoinNames(AutoCli::CompletionShells(), " or ") << "\n";
        return AutoCli::kExitUsage;
    }
    try {
        std::cout << AutoCli::CompletionScript(inlineShell ? option.substr(eq + 1) : args[1], kProgram, kCompleteEntry);
    } catch (const std::invalid_argument& e) {
        std::cerr << kProgram << ": " << e.what() << "\n";
        return AutoCli::kExitUsage;
    }
    return AutoCli::kExitOk;
}

int Complete(const std::vector<std::string>& args) {
    // Whatever goes wrong in the middle of a command line stays off the
    // terminal: a plug-in that cannot load only offers fewer candidates.
    std::ostringstream ignored;
    boost::shared_ptr<AutoCli::Namespace> root = LoadTree(ignored);
    const std::vector<std::string> words(args.begin() + 1, args.end());
    for (const std::string& candidate : AutoCli::CompleteWords(*root, words)) std::cout << candidate << "\n";
    return AutoCli::kExitOk;
}

AutoCli::ManualInfo ProgramManual(const std::string& date) {
    AutoCli::ManualInfo info;
    info.program = kProgram;
    info.version = ORVIX_VERSION;
    info.date = date;
    info.summary = "manage the networking of a simulated hypervisor host";
    info.description = {
        "orvixcli lists and changes a host's networking: standard and distributed virtual switches, port groups "
        "and their policies, physical NICs, the kernel's IP interfaces, routes, DNS, netstacks, IPsec, the "
        "firewall, LACP, ports and the networking of virtual machines.",
        "A command is named by its path through the namespaces, for example \"network vswitch standard list\", "
        "and followed by its own options. Help is available at every level with --help. Namespaces and commands "
        "come from plug-ins loaded at start.",
        "Every command works on one simulated host, whose whole state is kept in one SQLite file, the host store; "
        "orvix-hostsim creates, shows and replaces stores.",
    };
    info.programOptions = {
        {"completion", "", true,
         "Print the shell completion script for the shell named, bash or zsh, and exit. Load it with: "
         "source <(orvixcli --completion bash)."},
    };
    info.extraSynopses = {"--completion bash|zsh"};
    info.environment = {
        {"ORVIX_HOST_DB",
         "The host store to use. When it is unset or empty, the store is "
         "${XDG_STATE_HOME:-$HOME/.local/state}/orvix/host.db."},
        {"ORVIX_HOST_PROFILE",
         "The JSON profile a missing store is created from; by default the host built into the program."},
        {"ORVIX_PLUGIN_PATH",
         "Folders, separated by colons, whose *.so plug-ins are loaded instead of those installed with the "
         "program."},
        {"XDG_STATE_HOME", "Where the default host store lives, when ORVIX_HOST_DB is not set."},
    };
    info.files = {
        {"${XDG_STATE_HOME:-$HOME/.local/state}/orvix/host.db",
         "The default host store, created from the default profile on first use."},
        {"lib/orvixcli/plugins/*.so",
         "The plug-ins, in the folder beside the program's bin folder (/usr/lib/orvixcli/plugins when installed "
         "under /usr)."},
    };
    return info;
}

int WriteManPages(const std::vector<std::string>& args) {
    if (args.size() < 2 || args.size() > 3) {
        std::cerr << kProgram << ": usage: " << kProgram << " " << kManPagesEntry << " DIR [DATE]\n";
        return AutoCli::kExitUsage;
    }
    const std::string dir = args[1];
    // A plug-in that fails to load would leave its commands out of the
    // pages without anyone noticing; the build stops instead.
    std::ostringstream loadErrors;
    boost::shared_ptr<AutoCli::Namespace> root = LoadTree(loadErrors);
    if (!loadErrors.str().empty()) {
        std::cerr << loadErrors.str();
        return AutoCli::kExitFailure;
    }
    const AutoCli::ManualInfo info = ProgramManual(args.size() == 3 ? args[2] : std::string());
    for (const AutoCli::ManPage& page : AutoCli::RenderManPages(*root, info)) {
        const std::string path = dir + "/" + page.name + "." + info.section;
        std::ofstream file(path, std::ios::binary | std::ios::trunc);
        file << page.text;
        file.close();
        if (!file) {
            std::cerr << kProgram << ": cannot write '" << path << "': " << std::strerror(errno) << "\n";
            return AutoCli::kExitFailure;
        }
    }
    return AutoCli::kExitOk;
}

}  // namespace

std::optional<int> RunSupportEntry(const std::vector<std::string>& args) {
    if (args.empty()) return std::nullopt;
    int status = AutoCli::kExitOk;
    if (args[0] == "--completion" || args[0].rfind("--completion=", 0) == 0) {
        status = PrintScript(args);
    } else if (args[0] == kCompleteEntry) {
        status = Complete(args);
    } else if (args[0] == kManPagesEntry) {
        status = WriteManPages(args);
    } else {
        return std::nullopt;
    }
    std::cout.flush();
    if (!std::cout) {
        std::cerr << kProgram << ": cannot write the output\n";
        return AutoCli::kExitFailure;
    }
    return status;
}

}  // namespace OrvixCli
