// A fresh simulated host for each library test: the default host, or one
// made from a profile the test gives as text. The store is private to the
// library, so a test looks into it, arms faults and damages it the way any
// other program does: through orvix-hostsim or a connection of its own.
#pragma once

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <functional>
#include <stdexcept>
#include <string>
#include <vector>

#include "hostctl/HostSession.h"
#include "hostctl/Lib.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/vswitch/Policy.h"
#include "support/process.h"
#include "support/raw_sql.h"
#include "support/test_util.h"

class FreshHost : public ::testing::Test {
protected:
    using Json = nlohmann::json;
    using NetworkFactory = HostCtl::Network::NetworkFactory;
    using NicTeamingPolicy = HostCtl::Network::NicTeamingPolicy;
    using PortSecurityPolicy = HostCtl::Network::PortSecurityPolicy;
    using ShapingPolicy = HostCtl::Network::ShapingPolicy;

    FreshHost() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Lib::ReopenHost();
    }
    ~FreshHost() override { PldCtl::Lib::ReopenHost(); }

    // Makes the host from this profile; call it before the library is used.
    void MakeHost(const std::string& profileText) {
        OrvixTest::WriteFile(dir_ / "profile.json", profileText);
        HostSim({"init", "--profile", dir_ / "profile.json"});
        PldCtl::Lib::ReopenHost();
    }

    std::string DbPath() const { return dir_ / "host.db"; }

    // Runs orvix-hostsim on this host and returns what it printed. The
    // library opens the store afresh afterwards, as a new command would: a
    // process that found no faults armed does not look for them again.
    std::string HostSim(std::vector<std::string> arguments) const {
        PldCtl::Lib::ReopenHost();
        arguments.insert(arguments.begin(), {OrvixTest::Bin("orvix-hostsim"), "--db", DbPath()});
        std::vector<std::string> env = {"PATH=/usr/bin:/bin"};
        for (const auto& setting : OrvixTest::SanitizerEnvironment()) env.push_back(setting);
        const OrvixTest::ProcessResult result = OrvixTest::RunProcess(arguments, dir_.Path(), env);
        if (result.status != 0) throw std::runtime_error("orvix-hostsim failed: " + result.err);
        return result.out;
    }

    // The host as a profile, as `orvix-hostsim dump` writes it.
    Json Dump() const { return Json::parse(HostSim({"dump"})); }

    // The stored object of a collection whose `field` is `value`, or null.
    Json Stored(const std::string& section, const std::string& field, const Json& value) const {
        for (const Json& object : Dump().value(section, Json::array())) {
            if (object.value(field, Json()) == value) return object;
        }
        return Json();
    }

    // Runs SQL on the store file through a connection of its own, bypassing
    // the library, as a damaged or hand-edited store would look. The
    // library's own connection is closed first: it links its own copy of
    // SQLite, and two copies must never hold the same file open at once.
    void RawSql(const std::string& sql) const {
        PldCtl::Lib::ReopenHost();
        OrvixTest::RawSql(DbPath(), sql);
    }

    // The library's message for a refused operation.
    static std::string MessageOf(const std::function<void()>& action) {
        try {
            action();
        } catch (const HostCtl::Lib::HostCtlException& e) {
            return e.GetMessage(0);
        }
        return "(no error)";
    }

private:
    OrvixTest::TempDir dir_;
    OrvixTest::ScopedEnv db_;
    OrvixTest::ScopedEnv profile_;
};
