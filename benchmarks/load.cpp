// load LIBRARY: what it takes to load a library, and to register its natives with a virtual machine
// that costs nothing; the fastest of many turns, each with a copy of its own, since a library that
// was loaded stays mapped.
#include "support/fakevm.h"

#include <dlfcn.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

namespace {

constexpr int kTurns = 300;

using Clock = std::chrono::steady_clock;

double microseconds(Clock::duration duration)
{
    return std::chrono::duration<double, std::micro>(duration).count();
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 2) {
        fputs("usage: load LIBRARY\n", stderr);
        return 2;
    }
    double fastestOpening = 1e9, fastestRegistering = 1e9;
    for (int i = 0; i < kTurns; i++) {
        const std::string copy = argv[1] + ("." + std::to_string(i));
        std::filesystem::copy_file(argv[1], copy);
        const auto start = Clock::now();
        void *library = dlopen(copy.c_str(), RTLD_NOW);
        const auto entry =
            library ? reinterpret_cast<decltype(&JNI_OnLoad)>(dlsym(library, "JNI_OnLoad"))
                    : nullptr;
        const auto opened = Clock::now();
        std::filesystem::remove(copy);
        if (!entry) {
            fprintf(stderr, "load: %s\n", dlerror());
            return 1;
        }
        const auto registering = Clock::now();
        {
            fakevm::Vm vm({.quiet = true});
            vm.load(entry);
        }
        const auto registered = Clock::now();
        fastestOpening = std::min(fastestOpening, microseconds(opened - start));
        fastestRegistering = std::min(fastestRegistering, microseconds(registered - registering));
    }
    printf("loaded in %.1f us, JNI_OnLoad in %.1f us\n", fastestOpening, fastestRegistering);
    return 0;
}
