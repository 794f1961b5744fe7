// The store is private to the host-control library: liborvix_hostctl.so
// links it in but exports none of it, so no program or plug-in can reach the
// store except through the library's operations.
#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace {

// The demangled names of the dynamic symbols a shared object defines.
std::vector<std::string> ExportedSymbols(const std::string& file) {
    const std::string command = "nm -DC --defined-only '" + file + "'";
    FILE* pipe = popen(command.c_str(), "r");
    if (!pipe) return {};
    std::vector<std::string> symbols;
    char line[4096];
    while (std::fgets(line, sizeof line, pipe)) {
        // "<address> <type> <name>"; names of C++ symbols contain blanks.
        std::string text(line);
        const auto name = text.find(' ', text.find(' ') + 1);
        if (name != std::string::npos) symbols.push_back(text.substr(name + 1, text.size() - name - 2));
    }
    EXPECT_EQ(pclose(pipe), 0) << command;
    return symbols;
}

TEST(StoreExports, HostControlLibraryExportsNoStoreSymbol) {
    const auto symbols = ExportedSymbols(std::string(ORVIX_BIN_DIR) + "/../lib/liborvix_hostctl.so");
    // The library's own surface is there, so the list is the real one.
    EXPECT_NE(std::find(symbols.begin(), symbols.end(), "PldCtl::Lib::ReopenHost()"), symbols.end());
    for (const auto& symbol : symbols) {
        EXPECT_EQ(symbol.find("PldCtl::Store::"), std::string::npos) << symbol;
        EXPECT_NE(symbol.rfind("sqlite3", 0), 0u) << symbol;
    }
}

}  // namespace
