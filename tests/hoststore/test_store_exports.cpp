// The store is private to the host-control library: liborvix_hostctl.so
// links it in but exports none of it, so no program or plug-in can reach the
// store except through the library's operations.
#include <algorithm>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "support/process.h"

namespace {

TEST(StoreExports, HostControlLibraryExportsNoStoreSymbol) {
    const auto symbols = OrvixTest::ExportedSymbols(std::string(ORVIX_BIN_DIR) + "/../lib/liborvix_hostctl.so", true);
    // The library's own surface is there, so the list is the real one.
    EXPECT_NE(std::find(symbols.begin(), symbols.end(), "PldCtl::Lib::ReopenHost()"), symbols.end());
    for (const auto& symbol : symbols) {
        EXPECT_EQ(symbol.find("PldCtl::Store::"), std::string::npos) << symbol;
        EXPECT_NE(symbol.rfind("sqlite3", 0), 0u) << symbol;
    }
}

}  // namespace
