// What liborvix_hostctl.so offers the plug-in, the tools and the tests. The
// library is built with hidden visibility, so only the classes and functions
// marked here are exported; the store and the library's own helpers stay
// inside, and loading the library resolves few symbols.
#pragma once

#define HOSTCTL_EXPORT __attribute__((visibility("default")))
