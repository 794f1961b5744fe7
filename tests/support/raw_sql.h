// Runs SQL on a database file through a connection of its own, bypassing the
// store: how a test damages or inspects a store the way a hand edit would.
// Only the store's own tests open it alongside; a test of liborvix_hostctl.so
// must close the library's connection first (it links its own SQLite).
#pragma once

#include <sqlite3.h>

#include <stdexcept>
#include <string>

namespace OrvixTest {

// Returns the first column of the last row the SQL produced, if any.
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

}  // namespace OrvixTest
