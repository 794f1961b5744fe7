// Transactions over the store's one connection, single reads, and the
// whole-host operations (dump and load).
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <random>
#include <thread>

#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

using Clock = std::chrono::steady_clock;

// Under ordinary contention SQLite's own busy wait lets a change through
// long before this; the deadline only bounds a store that stays locked.
constexpr auto kRetryDeadline = std::chrono::seconds(30);
constexpr auto kFirstPause = std::chrono::milliseconds(1);
constexpr auto kLongestPause = std::chrono::milliseconds(100);

// Random extra pause, so processes that failed together do not retry in
// lock step.
std::chrono::microseconds Jitter(std::chrono::microseconds upTo) {
    thread_local std::minstd_rand random(static_cast<unsigned>(getpid()) ^
                                         static_cast<unsigned>(Clock::now().time_since_epoch().count()));
    return std::chrono::microseconds(std::uniform_int_distribution<long>(0, upTo.count())(random));
}

}  // namespace

std::string TableSql(const std::string& section, const char* format) {
    const std::string literal = Sql::Literal(section);
    // SQLite flattens the subquery into the statement, so a read of one
    // collection uses the object table's indexes as if it were a table.
    const std::string rows = "(SELECT * FROM object WHERE section = " + literal + ")";
    std::string sql = format;
    for (auto at = sql.find('%'); at != std::string::npos && at + 1 < sql.size(); at = sql.find('%', at)) {
        const char what = sql[at + 1];
        if (what != 'T' && what != 'S') {
            ++at;
            continue;
        }
        const std::string& replacement = what == 'T' ? rows : literal;
        sql.replace(at, 2, replacement);
        at += replacement.size();
    }
    return sql;
}

Json ParseDoc(const Sql::Database& db, const std::string& text) {
    try {
        return Json::parse(text);
    } catch (const Json::parse_error&) {
        throw StoreError(Sql::Describe(db.Path(), "holds an object that is not JSON; it is damaged"));
    }
}

void HostStore::Impl::RequireIdle() const {
    if (mode != Mode::Idle) {
        throw std::logic_error(Sql::Describe(db.Path(), "was asked for a change or read inside another one"));
    }
}

Sql::Database& HostStore::Impl::Writable() {
    if (mode != Mode::Writing) throw std::logic_error(Sql::Describe(db.Path(), "is written only inside Change()"));
    return db;
}

void HostStore::Impl::Run(Mode transactionMode, const std::function<void()>& body) {
    RequireIdle();
    // Resets the mode however the attempt ends.
    struct ModeGuard {
        Mode& mode;
        ~ModeGuard() { mode = Mode::Idle; }
    };
    const auto deadline = Clock::now() + kRetryDeadline;
    std::chrono::microseconds pause = kFirstPause;
    for (;;) {
        try {
            ModeGuard guard{mode};
            mode = transactionMode;
            db.Exec(transactionMode == Mode::Writing ? "BEGIN IMMEDIATE" : "BEGIN");
            body();
            db.Exec("COMMIT");
            if (transactionMode == Mode::Writing && deferredSync && ++unsynced >= kDeferredSyncInterval) SyncLog();
            return;
        } catch (const Sql::BusyError&) {
            db.RollbackQuietly();
            if (Clock::now() + pause > deadline) throw;
        } catch (...) {
            db.RollbackQuietly();
            throw;
        }
        std::this_thread::sleep_for(pause + Jitter(pause));
        pause = std::min<std::chrono::microseconds>(pause * 2, kLongestPause);
    }
}

HostStore::HostStore(const std::string& path) : path_(path), impl_(std::make_unique<Impl>(path)) {}

HostStore::~HostStore() {
    if (!impl_->deferredSync || impl_->unsynced == 0) return;
    // The changes were reported done; one that cannot be made durable now
    // must not end in success. A destructor cannot throw, and this one runs
    // as the process ends, so the process ends here, failing.
    try {
        impl_->SyncLog();
    } catch (const StoreError& e) {
        std::fprintf(stderr, "%s\n", e.what());
        std::fflush(stderr);
        _exit(3);
    }
}

void HostStore::Change(const std::function<void(Transaction&)>& fn) {
    impl_->Run(Impl::Mode::Writing, [&] {
        Transaction transaction(*this);
        fn(transaction);
    });
}

void HostStore::Read(const std::function<void(Transaction&)>& fn) {
    impl_->Run(Impl::Mode::Reading, [&] {
        Transaction transaction(*this);
        fn(transaction);
    });
}

// A single statement is a transaction of its own, so these need no BEGIN.
std::optional<Json> HostStore::Get(const std::string& section, const std::string& key) {
    return Transaction(*this).Get(section, key);
}

std::vector<Json> HostStore::List(const std::string& section) {
    return Transaction(*this).List(section);
}

std::vector<Json> HostStore::ListChildren(const std::string& section, const std::string& parent) {
    return Transaction(*this).ListChildren(section, parent);
}

Json HostStore::GetSingleton(const std::string& name) {
    return Transaction(*this).GetSingleton(name);
}

std::int64_t HostStore::CountChildren(const std::string& section, const std::string& parent,
                                      const std::vector<FieldTest>& tests) {
    return Transaction(*this).CountChildren(section, parent, tests);
}

// ---- Stored text -----------------------------------------------------------

std::optional<std::string> HostStore::GetText(const std::string& section, const std::string& key) {
    return Transaction(*this).GetText(section, key);
}

std::vector<std::string> HostStore::ListText(const std::string& section) {
    return Transaction(*this).ListText(section);
}

std::vector<std::string> HostStore::ListChildrenText(const std::string& section, const std::string& parent) {
    return Transaction(*this).ListChildrenText(section, parent);
}

std::string HostStore::GetSingletonText(const std::string& name) {
    return Transaction(*this).GetSingletonText(name);
}

StoreError HostStore::DamagedObjectError() const {
    return StoreError(Sql::Describe(path_, "holds an object that is not JSON; it is damaged"));
}

// ---- end of stored text -----------------------------------------------------

Json HostStore::Dump() {
    Json profile = {{"format", kProfileFormat}, {"version", kProfileVersion}};
    Read([&](Transaction& transaction) {
        auto singletons = impl_->db.Prepare("SELECT name, doc FROM singleton");
        while (singletons.Next()) profile[singletons.Text(0)] = ParseDoc(impl_->db, singletons.Text(1));
        for (const auto& collection : Collections()) {
            auto objects = transaction.List(collection.section);
            if (!objects.empty()) profile[collection.section] = std::move(objects);
        }
    });
    return profile;
}

void HostStore::Load(const Json& profile) {
    ValidateProfile(profile);
    Change([&](Transaction& transaction) {
        impl_->db.Exec("DELETE FROM singleton");
        for (const auto& name : Singletons()) {
            if (profile.contains(name)) transaction.PutSingleton(name, profile.at(name));
        }
        impl_->db.Exec("DELETE FROM object");
        for (const auto& collection : Collections()) {
            if (!profile.contains(collection.section)) continue;
            for (const auto& object : profile.at(collection.section)) transaction.Put(collection.section, object);
        }
    });
}

}  // namespace Store
}  // namespace PldCtl
