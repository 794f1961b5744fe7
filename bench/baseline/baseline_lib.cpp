// The baseline's shared library: one function, so the baseline pays for
// loading a library and calling into it, as orvixcli pays for its plug-in.
extern "C" __attribute__((visibility("default"))) int orvix_bench_baseline(int x) {
    return x + 1;
}
