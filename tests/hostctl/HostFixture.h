// A fresh simulated host for each library test: the default host, or one
// made from a profile the test gives as text.
#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <string>

#include "hostctl/Lib.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/vswitch/Policy.h"
#include "support/store_test_util.h"

class FreshHost : public ::testing::Test {
protected:
    using NetworkFactory = HostCtl::Network::NetworkFactory;
    using NicTeamingPolicy = HostCtl::Network::NicTeamingPolicy;
    using PortSecurityPolicy = HostCtl::Network::PortSecurityPolicy;
    using ShapingPolicy = HostCtl::Network::ShapingPolicy;

    FreshHost() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Store::HostStore::ResetDefault();
    }
    ~FreshHost() override { PldCtl::Store::HostStore::ResetDefault(); }

    // Makes the host from this profile; call it before the library is used.
    void MakeHost(const std::string& profileText) { PldCtl::Store::HostStore::Create(DbPath(), profileText); }

    std::string DbPath() const { return dir_ / "host.db"; }

    // The host as a profile, as `orvix-hostsim dump` writes it.
    static PldCtl::Store::Json Dump() { return PldCtl::Store::HostStore::Default().Dump(); }

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
    StoreTest::TempDir dir_;
    StoreTest::ScopedEnv db_;
    StoreTest::ScopedEnv profile_;
};
