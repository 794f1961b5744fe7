// Fuzzes the host profile loader: the input is the text of a profile file.
// A profile is either accepted or refused with a ProfileError; any other
// exception, crash or sanitizer report is a fault.
#include <cstddef>
#include <cstdint>
#include <string>

#include "hoststore/HostStore.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    try {
        const PldCtl::Store::Json profile = PldCtl::Store::ParseProfile(text, "fuzz.json");
        PldCtl::Store::ValidateProfile(profile);
    } catch (const PldCtl::Store::ProfileError&) {
        // A refused profile is an expected outcome.
    }
    return 0;
}
