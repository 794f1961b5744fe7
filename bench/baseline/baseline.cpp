// The baseline process the benchmark compares every command with: it starts,
// dlopens one shared library, calls one function and exits.
#include <dlfcn.h>
#include <unistd.h>

#include <cstdio>
#include <string>

int main() {
    char self[4096];
    ssize_t n = readlink("/proc/self/exe", self, sizeof self - 1);
    if (n <= 0) return 1;
    self[n] = '\0';
    std::string dir(self);
    dir.resize(dir.rfind('/'));
    void* lib = dlopen((dir + "/../lib/liborvix_bench_baseline.so").c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!lib) {
        std::fprintf(stderr, "baseline: %s\n", dlerror());
        return 1;
    }
    auto fn = reinterpret_cast<int (*)(int)>(dlsym(lib, "orvix_bench_baseline"));
    return fn && fn(41) == 42 ? 0 : 1;
}
