// Helpers for tests of the host store: profile fixtures and raw SQL on a
// store file, beside the generic helpers they are used with.
#pragma once

#include <stdexcept>
#include <string>

#include "hoststore/HostStore.h"
#include "support/raw_sql.h"
#include "support/test_util.h"

namespace StoreTest {

inline std::string FixturePath(const std::string& name) {
    return std::string(ORVIX_TESTS_DIR) + "/hoststore/fixtures/" + name;
}

// A profile fixture, parsed and checked.
inline PldCtl::Store::Json Fixture(const std::string& name) {
    return PldCtl::Store::ParseProfile(OrvixTest::ReadFile(FixturePath(name)), name);
}

using OrvixTest::RawSql;

// The smallest valid profile: a host with nothing in it.
inline std::string EmptyProfileText() {
    return R"({"format": "orvix-host-profile", "version": 1})";
}

}  // namespace StoreTest
