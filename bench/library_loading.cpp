// Tells how many microseconds loading the shared library takes: libraries that it needs, relocation and
// static initialisation. A program by itself, linked with nothing, so that nothing is there before.

#include <dlfcn.h>

#include <chrono>
#include <cstdio>

int main(int argc, char** argv) {
    if (argc != 2) return 2;
    const auto start = std::chrono::steady_clock::now();
    const void* const library = dlopen(argv[1], RTLD_NOW | RTLD_LOCAL);
    const auto end = std::chrono::steady_clock::now();
    if (library == nullptr) {
        std::fprintf(stderr, "%s\n", dlerror());
        return 1;
    }
    std::printf("%.1f\n", std::chrono::duration<double, std::micro>(end - start).count());
}
