// The library's hold on the simulated host's store, for callers that change
// the environment it is found by (tests that give each case its own host).
#pragma once

#include "hostctl/Export.h"

namespace PldCtl {
namespace Lib {

// Forgets the open host store: the next operation opens the store that
// $ORVIX_HOST_DB (and the variables after it) names then, creating it from
// $ORVIX_HOST_PROFILE or the default host when it does not exist.
HOSTCTL_EXPORT void ReopenHost();

}  // namespace Lib
}  // namespace PldCtl
