// What liborvix_framework.so offers the programs and plug-ins that link it.
// The library is built with hidden visibility, so only the classes and
// functions marked here are exported: loading it then resolves a few
// hundred symbols fewer, which every command pays for at start.
#pragma once

#define AUTOCLI_EXPORT __attribute__((visibility("default")))
