// The process-wide store and where it lives.
#include <cstdlib>
#include <mutex>

#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

std::string Env(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

std::mutex& DefaultMutex() {
    static std::mutex mutex;
    return mutex;
}

std::unique_ptr<HostStore>& DefaultStore() {
    static std::unique_ptr<HostStore> store;
    return store;
}

}  // namespace

std::string HostStore::ResolvePath() {
    const std::string db = Env("ORVIX_HOST_DB");
    if (!db.empty()) return db;
#ifdef ORVIX_SYSTEM_HOST_DB
    // An installed package simulates one host for the whole machine, made by
    // its installation; every user and every environment finds the same one.
    return ORVIX_SYSTEM_HOST_DB;
#else
    std::string state = Env("XDG_STATE_HOME");
    if (state.empty()) {
        const std::string home = Env("HOME");
        if (home.empty()) throw StoreError("cannot locate the host store: neither ORVIX_HOST_DB nor HOME is set");
        state = home + "/.local/state";
    }
    return state + "/orvix/host.db";
#endif
}

std::string HostStore::ResolveProfileOrigin() {
    const std::string file = Env("ORVIX_HOST_PROFILE");
    return file.empty() ? "(embedded default)" : file;
}

std::string HostStore::ResolveProfileText() {
    const std::string file = Env("ORVIX_HOST_PROFILE");
    if (file.empty()) return DefaultProfileText();
    try {
        return ReadProfileFile(file);
    } catch (const ProfileError& e) {
        throw StoreError(std::string(e.what()) + " (named by ORVIX_HOST_PROFILE)");
    }
}

HostStore& HostStore::Default() {
    std::lock_guard<std::mutex> lock(DefaultMutex());
    auto& store = DefaultStore();
    if (store) return *store;
    const std::string path = ResolvePath();
    if (PathExists(path)) {
        store = Open(path);
        return *store;
    }
    const std::string origin = ResolveProfileOrigin();
    Json profile;
    try {
        profile = ParseProfile(ResolveProfileText(), origin);
    } catch (const std::runtime_error& e) {
        // The user must learn which store could not be made and from what.
        throw StoreError(Sql::Describe(path, "cannot be created: ") + e.what());
    }
    store = OpenOrCreate(path, profile, origin);
    return *store;
}

void HostStore::ResetDefault() {
    std::lock_guard<std::mutex> lock(DefaultMutex());
    DefaultStore().reset();
}

}  // namespace Store
}  // namespace PldCtl
