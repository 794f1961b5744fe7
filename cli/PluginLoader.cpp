#include "PluginLoader.h"

#include <dirent.h>
#include <dlfcn.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>

namespace OrvixCli {

namespace {

using RegisterFunction = void (*)(boost::shared_ptr<AutoCli::Namespace>);
constexpr const char* kEntryPoint = "AutoCli_RegisterNamespaces";

// The folder of this executable; empty when it cannot be known (no /proc,
// as in a bare chroot).
std::string ExecutableDirectory() {
    std::string buffer(4096, '\0');
    ssize_t n = readlink("/proc/self/exe", &buffer[0], buffer.size() - 1);
    if (n <= 0) return "";
    buffer.resize(static_cast<std::size_t>(n));
    std::size_t slash = buffer.rfind('/');
    return slash == std::string::npos ? "" : buffer.substr(0, slash);
}

std::vector<std::string> SharedObjectsIn(const std::string& dir) {
    std::vector<std::string> files;
    DIR* d = opendir(dir.c_str());
    if (!d) return files;
    while (dirent* entry = readdir(d)) {
        std::string name = entry->d_name;
        if (name.size() > 3 && name.compare(name.size() - 3, 3, ".so") == 0) files.push_back(dir + "/" + name);
    }
    closedir(d);
    std::sort(files.begin(), files.end());
    return files;
}

}  // namespace

std::vector<std::string> PluginDirectories() {
    std::vector<std::string> dirs;
    const char* env = std::getenv("ORVIX_PLUGIN_PATH");
    if (env && *env) {
        std::string list = env;
        std::size_t start = 0;
        while (start <= list.size()) {
            std::size_t colon = list.find(':', start);
            if (colon == std::string::npos) colon = list.size();
            if (colon > start) dirs.push_back(list.substr(start, colon - start));
            start = colon + 1;
        }
        return dirs;
    }
    // Without its own folder the CLI takes the installation's plug-in folder
    // chosen at build time, never one relative to the working directory,
    // where anybody's code could be waiting to be loaded.
    const std::string executable = ExecutableDirectory();
    dirs.push_back(executable.empty() ? ORVIX_INSTALLED_PLUGIN_DIR : executable + "/../lib/orvixcli/plugins");
    return dirs;
}

void LoadPlugins(const boost::shared_ptr<AutoCli::Namespace>& root, std::ostream& err) {
    for (const auto& dir : PluginDirectories()) {
        for (const auto& file : SharedObjectsIn(dir)) {
            // Plug-ins stay loaded for the life of the process: the tree they
            // build points into their code. Their functions are bound when
            // first called: one command calls few of those its plug-in and
            // the plug-in's libraries could, and binding them all up front
            // was a noticeable part of every command's start.
            void* handle = dlopen(file.c_str(), RTLD_LAZY | RTLD_LOCAL);
            if (!handle) {
                err << "orvixcli: cannot load plug-in '" << file << "': " << dlerror() << "\n";
                continue;
            }
            auto entry = reinterpret_cast<RegisterFunction>(dlsym(handle, kEntryPoint));
            if (!entry) {
                err << "orvixcli: plug-in '" << file << "' has no entry point " << kEntryPoint << "; skipped\n";
                continue;
            }
            try {
                entry(root);
            } catch (const std::exception& e) {
                err << "orvixcli: plug-in '" << file << "' failed to register its commands: " << e.what()
                    << "; skipped\n";
            } catch (...) {
                err << "orvixcli: plug-in '" << file << "' failed to register its commands; skipped\n";
            }
        }
    }
}

}  // namespace OrvixCli
