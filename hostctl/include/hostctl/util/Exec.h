// Commands the host runs (service restarts). The simulated host records each
// run in its exec log and runs nothing on the real machine.
#pragma once

#include <string>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Util {

// Runs `command` and returns its exit status: 0 for success. The command and
// its status are recorded; the three flags (wait, quiet, detach) are accepted
// for callers that pass them and change nothing here. Never throws: a host
// that cannot run it reports a non-zero status.
HOSTCTL_EXPORT int PldCtl_Exec(const std::string& command, bool wait, bool quiet, bool detach);

}  // namespace Util
}  // namespace PldCtl
