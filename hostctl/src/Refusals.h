// Checks several library operations share, each refusing with a
// HostCtlException whose message names what was refused.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>

#include "hostctl/Lib.h"

namespace PldCtl {
namespace Detail {

// Refuses `value` outside lo..hi: "Invalid FIELD value V for SUBJECT: must be
// between LO and HI" (without " for SUBJECT" when `subject` is empty).
inline void CheckRange(const std::string& field, std::int64_t value, const std::string& subject, std::int64_t lo,
                       std::int64_t hi) {
    if (value >= lo && value <= hi) return;
    throw HostCtl::Lib::HostCtlException("Invalid " + field + " value " + std::to_string(value) +
                                         (subject.empty() ? "" : " for " + subject) + ": must be between " +
                                         std::to_string(lo) + " and " + std::to_string(hi));
}

// The content of the regular file `path`, of at most `limit` bytes, read
// without ever blocking: the name is looked at first, and the file opened
// without blocking is looked at again, so a FIFO, device or directory is
// refused unread. A file that grows while it is read is caught too. The
// refusals read "WHAT PATH cannot be read: REASON", "WHAT PATH is not a
// regular file", and `tooLarge(size)` for a file past the limit.
std::string ReadRegularFile(const std::string& what, const std::string& path, std::size_t limit,
                            const std::function<std::string(std::uint64_t size)>& tooLarge);

}  // namespace Detail
}  // namespace PldCtl
