# Turns a JSON profile into a C++ source defining DefaultProfileText().
file(READ ${INPUT} PROFILE_TEXT)
string(FIND "${PROFILE_TEXT}" ")orvixprofile\"" CLASH)
if(NOT CLASH EQUAL -1)
  message(FATAL_ERROR "${INPUT} contains the raw string delimiter")
endif()
file(WRITE ${OUTPUT}.tmp
"// Generated from profiles/default.json; do not edit.
#include \"hoststore/HostStore.h\"

namespace PldCtl {
namespace Store {

const std::string& DefaultProfileText() {
    static const std::string text = R\"orvixprofile(${PROFILE_TEXT})orvixprofile\";
    return text;
}

}  // namespace Store
}  // namespace PldCtl
")
file(RENAME ${OUTPUT}.tmp ${OUTPUT})
