// The blocks that a session leaves behind.
#pragma once

#include "support/blocks.h"

#include <cstddef>
#include <cstdlib>
#include <set>

namespace sweep {

// Blocks that were allocated since it was made and not released.
class Losses {
public:
    Losses() : before_(blocks::all()) {}
    Losses(const Losses &) = delete;
    Losses &operator=(const Losses &) = delete;

    // Counts them and releases them, so that they do not add up.
    size_t count()
    {
        size_t lost = 0;
        for (void *block : blocks::all()) {
            if (!before_.count(block)) {
                ++lost;
                free(block);
            }
        }
        return lost;
    }

private:
    std::set<void *> before_;
};

} // namespace sweep
