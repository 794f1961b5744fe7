// Helpers for tests of the host store: profile fixtures and raw SQL on a
// store file, beside the generic helpers they are used with.
#pragma once

#include <sqlite3.h>

#include <stdexcept>
#include <string>

#include "hoststore/HostStore.h"
#include "support/test_util.h"

namespace StoreTest {

inline std::string FixturePath(const std::string& name) {
    return std::string(ORVIX_TESTS_DIR) + "/hoststore/fixtures/" + name;
}

// A profile fixture, parsed and checked.
inline PldCtl::Store::Json Fixture(const std::string& name) {
    return PldCtl::Store::ParseProfile(OrvixTest::ReadFile(FixturePath(name)), name);
}

// Runs SQL on a database file through a connection of its own, bypassing
// the store; returns the first column of the last row, if any.
inline std::string RawSql(const std::string& path, const std::string& sql) {
    sqlite3* db = nullptr;
    std::string result;
    int rc = sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE, nullptr);
    if (rc == SQLITE_OK) {
        rc = sqlite3_exec(
            db, sql.c_str(),
            [](void* out, int, char** values, char**) {
                *static_cast<std::string*>(out) = values[0] ? values[0] : "";
                return 0;
            },
            &result, nullptr);
    }
    const std::string message = sqlite3_errmsg(db);
    sqlite3_close(db);
    if (rc != SQLITE_OK) throw std::runtime_error(path + ": " + message);
    return result;
}

// The smallest valid profile: a host with nothing in it.
inline std::string EmptyProfileText() {
    return R"({"format": "orvix-host-profile", "version": 1})";
}

}  // namespace StoreTest
