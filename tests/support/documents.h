// Checks that a formatter's output is a document a script can parse.
#pragma once

#include <string>

namespace OrvixTest {

// True when the text is exactly one JSON value (strict: valid UTF-8, no raw
// control characters in strings, nothing after the value but blanks).
bool IsValidJson(const std::string& text);

// True when the text is a well-formed XML document.
bool IsWellFormedXml(const std::string& text);

}  // namespace OrvixTest
