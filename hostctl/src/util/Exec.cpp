// The simulated host's exec: every run is appended to the exec log with its
// exit status, and nothing is run on the real machine.
#include "hostctl/util/Exec.h"

#include "Operation.h"
#include "hoststore/CollectionNames.h"
#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

struct ExecRecord {
    static constexpr const char* kSection = Store::Section::kExecLog;

    std::string command;
    int exitStatus = 0;
};

// clang-format off
template <>
struct RecordFields<ExecRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("command", &ExecRecord::command),
            Field("exitStatus", &ExecRecord::exitStatus));
    }
};
// clang-format on

}  // namespace Detail

namespace Util {

namespace {
// The status of a run the host could not make: a fault injected on it, or a
// store that cannot record it.
constexpr int kRunFailed = 1;
}  // namespace

int PldCtl_Exec(const std::string& command, bool, bool, bool) {
    try {
        Detail::ExecRecord run;
        run.command = command;
        Store::HostStore* store = nullptr;
        try {
            store = &Detail::EnterOperation("Util::PldCtl_Exec", command);
        } catch (const HostCtl::Lib::HostCtlException&) {
            // An injected fault is a failed run, recorded like any other.
            run.exitStatus = kRunFailed;
            store = &Store::HostStore::Default();
        }
        store->Change([&](Store::Transaction& t) { Detail::Create(t, run); });
        return run.exitStatus;
    } catch (const std::exception&) {
        return kRunFailed;
    }
}

}  // namespace Util
}  // namespace PldCtl
