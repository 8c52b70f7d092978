// Which failures are tried.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace sweep {

// Those that a number in the environment chooses, as OMACP_SWEEP=325; all
// of them without.
struct Choice {
    uint64_t seed = 0;
    size_t parts = 1; // of which one is tried
};

#if defined(__SANITIZE_ADDRESS__)
inline constexpr size_t kParts = 12; // a session takes ten times as long
#else
inline constexpr size_t kParts = 4;
#endif

inline Choice choice()
{
    const char *seed = getenv("OMACP_SWEEP");
    return seed ? Choice{strtoull(seed, nullptr, 10), kParts} : Choice{};
}

} // namespace sweep
