// Text helpers of the library that commands use too.
#pragma once

#include <string>
#include <vector>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Util {

// Appends to `tokens` the non-empty pieces of `text` between any of the
// characters of `delimiters`, in order.
HOSTCTL_EXPORT void StringTokenize(const std::string& text, std::vector<std::string>& tokens,
                                   const std::string& delimiters);

}  // namespace Util
}  // namespace PldCtl
