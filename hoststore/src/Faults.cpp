// Injected faults. They live in the store, not in the process, so a test can
// arm a fault with orvix-hostsim and see the next orvixcli process hit it.
#include <cctype>

#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

bool IsIdentifier(const std::string& text) {
    if (text.empty() || std::isdigit(static_cast<unsigned char>(text.front()))) return false;
    for (char c : text) {
        if (!std::isalnum(static_cast<unsigned char>(c)) && c != '_') return false;
    }
    return true;
}

// "Class::Operation": two identifiers joined by one "::".
bool IsOperationName(const std::string& operation) {
    const auto colons = operation.find("::");
    return colons != std::string::npos && IsIdentifier(operation.substr(0, colons)) &&
           IsIdentifier(operation.substr(colons + 2));
}

}  // namespace

void HostStore::CheckFault(std::string_view operation, std::string_view key) {
    impl_->RequireIdle();
    if (impl_->noFaults) return;
    auto& db = impl_->db;
    if (db.Integer("SELECT NOT EXISTS (SELECT 1 FROM fault)") != 0) {
        impl_->noFaults = true;
        return;
    }
    std::int64_t id = 0;
    std::string message;
    bool counted = false;
    {
        // While there are faults the table is read on every call: another
        // process may have used one up since.
        auto query = db.Prepare(
            "SELECT id, message, remaining IS NOT NULL FROM fault "
            "WHERE operation = ?1 AND (key = '' OR key = ?2) ORDER BY id LIMIT 1");
        if (!query.Bind(1, std::string(operation)).Bind(2, std::string(key)).Next()) return;
        id = query.Int(0);
        message = query.Text(1);
        counted = query.Int(2) != 0;
    }
    if (counted) {
        // Using up one firing is a write of its own; when another process
        // took the last one first, the update changes nothing and the fault
        // does not fire here.
        bool fired = false;
        impl_->Run(Impl::Mode::Writing, [&] {
            db.Prepare("UPDATE fault SET remaining = remaining - 1 WHERE id = ?1 AND remaining > 0").Bind(1, id).Run();
            fired = db.Changes() > 0;
            db.Prepare("DELETE FROM fault WHERE id = ?1 AND remaining <= 0").Bind(1, id).Run();
        });
        if (!fired) return;
    }
    throw InjectedFault(message);
}

std::vector<Fault> HostStore::ListFaults() {
    auto query = impl_->db.Prepare("SELECT id, operation, key, message, remaining FROM fault ORDER BY id");
    std::vector<Fault> faults;
    while (query.Next()) {
        Fault fault;
        fault.id = query.Int(0);
        fault.operation = query.Text(1);
        fault.key = query.Text(2);
        fault.message = query.Text(3);
        if (!query.IsNull(4)) fault.remaining = query.Int(4);
        faults.push_back(std::move(fault));
    }
    return faults;
}

void CheckFaultArguments(const Fault& fault) {
    if (!IsOperationName(fault.operation)) {
        throw std::invalid_argument("fault operation '" + fault.operation + "' must look like Class::Operation");
    }
    if (fault.remaining && *fault.remaining < 1) {
        throw std::invalid_argument("a fault's count must be at least 1, not " + std::to_string(*fault.remaining));
    }
}

std::int64_t HostStore::AddFault(const Fault& fault) {
    CheckFaultArguments(fault);
    std::int64_t id = 0;
    impl_->Run(Impl::Mode::Writing, [&] {
        impl_->db.Prepare("INSERT INTO fault(operation, key, message, remaining) VALUES (?1, ?2, ?3, ?4)")
            .Bind(1, fault.operation)
            .Bind(2, fault.key)
            .Bind(3, fault.message)
            .Bind(4, fault.remaining)
            .Run();
        id = impl_->db.LastInsertId();
    });
    impl_->noFaults = false;
    return id;
}

void HostStore::ClearFaults() {
    impl_->Run(Impl::Mode::Writing, [&] { impl_->db.Exec("DELETE FROM fault"); });
}

}  // namespace Store
}  // namespace PldCtl
