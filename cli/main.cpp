// orvixcli: loads the command plug-ins and runs one command line, or, with
// --batch FILE, every command line of a file.
#include <sys/stat.h>

#include <cstdlib>
#include <iostream>
#include <optional>
#include <string>
#include <vector>

#include "PluginLoader.h"
#include "SupportEntries.h"
#include "framework/Batch.h"
#include "framework/Runner.h"

namespace {

// A batch read from a regular file runs its lines back to back: the host
// store may then flush its log to disk every so many changes and at the end
// instead of at every change (docs/host-store.md). Lines from a pipe or a
// terminal may come slowly, so each of their changes is flushed when made.
// A setting of the user's own stays as it is.
void DeferSyncForFileBatch(const AutoCli::BatchInvocation& batch) {
    struct stat st {};
    const int found = batch.file == "-" ? fstat(0, &st) : stat(batch.file.c_str(), &st);
    if (found == 0 && S_ISREG(st.st_mode)) setenv("ORVIX_HOST_SYNC", "deferred", 0);
}

}  // namespace

int main(int argc, char** argv) {
    std::ios::sync_with_stdio(false);
    const std::vector<std::string> args(argv + 1, argv + argc);
    if (std::optional<int> status = OrvixCli::RunSupportEntry(args)) return *status;

    AutoCli::RunOptions options;
    options.program = "orvixcli";
    options.version = ORVIX_VERSION;

    AutoCli::BatchInvocation batch;
    bool batchMode = false;
    try {
        batchMode = AutoCli::ParseBatchInvocation(args, batch);
    } catch (const AutoCli::UsageError& e) {
        std::cerr << options.program << ": " << e.what() << "\n";
        return AutoCli::kExitUsage;
    }

    boost::shared_ptr<AutoCli::Namespace> root = AutoCli::Namespace::New();
    OrvixCli::LoadPlugins(root, std::cerr);

    int status;
    if (batchMode) {
        DeferSyncForFileBatch(batch);
        status = AutoCli::RunBatchFile(root, batch, std::cout, std::cerr, options);
    } else {
        options.exitsAfterRun = true;
        status = AutoCli::Run(root, args, std::cout, std::cerr, options);
    }

    // Output that could not be written (a full disk, a closed pipe) must not
    // pass for success.
    std::cout.flush();
    if (!std::cout) {
        std::cerr << "orvixcli: cannot write the output\n";
        return AutoCli::kExitFailure;
    }
    return status;
}
