// Rules for text the library stores and later shows: names end up in JSON
// documents, which hold only valid UTF-8, and on terminals, where a control
// character can act instead of being shown.
#pragma once

#include <cstddef>
#include <optional>
#include <string_view>

namespace PldCtl {
namespace Detail {

// The number of characters in `text` when it is valid UTF-8 without control
// characters (C0, DEL or C1); nullopt otherwise.
std::optional<std::size_t> PrintableLength(std::string_view text);

}  // namespace Detail
}  // namespace PldCtl
