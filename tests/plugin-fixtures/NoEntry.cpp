// A shared library in the plug-in folder that is not a plug-in: it lacks the
// entry point.
extern "C" __attribute__((visibility("default"))) int NotAnEntryPoint() {
    return 0;
}
