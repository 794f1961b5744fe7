// The types and ranges of the profile fields the host-control library reads.
#pragma once

#include <string>

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Store {

// Checks every field the library reads in one section of a profile (a
// singleton's object or a collection's array of objects). Throws ProfileError
// with "section[i].field: reason" (for a singleton "section.field: reason");
// the caller adds which profile.
void CheckSectionFields(const std::string& section, const Json& value);

}  // namespace Store
}  // namespace PldCtl
