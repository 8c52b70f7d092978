// load LIBRARY: what it takes to load a library, and to register its natives with a virtual machine
// that costs nothing; the fastest of many turns.
#include "quietvm.h"

#include <dlfcn.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>

namespace {

constexpr int kTurns = 2000;

using Clock = std::chrono::steady_clock;

jint (*loaded)(JavaVM *, void *);

double microseconds(Clock::duration duration)
{
    return std::chrono::duration<double, std::micro>(duration).count();
}

} // namespace

// What the machine calls: the entry of the library that is loaded.
jint JNI_OnLoad(JavaVM *vm, void *reserved)
{
    return loaded(vm, reserved);
}

int main(int argc, char **argv)
{
    if (argc != 2) {
        fputs("usage: load LIBRARY\n", stderr);
        return 2;
    }
    double opening = 1e9, registering = 1e9;
    for (int i = 0; i < kTurns; i++) {
        const auto start = Clock::now();
        void *library = dlopen(argv[1], RTLD_NOW);
        loaded =
            library ? reinterpret_cast<decltype(loaded)>(dlsym(library, "JNI_OnLoad")) : nullptr;
        if (!loaded) {
            fprintf(stderr, "load: %s\n", dlerror());
            return 1;
        }
        const auto opened = Clock::now();
        {
            quietvm::Vm vm;
        }
        const auto registered = Clock::now();
        dlclose(library);
        opening = std::min(opening, microseconds(opened - start));
        registering = std::min(registering, microseconds(registered - opened));
    }
    printf("loaded in %.1f us, JNI_OnLoad in %.1f us\n", opening, registering);
    return 0;
}
