// A context as it is found in memory.
#pragma once

#include "qvsClientProvCtx.h"

#include <cstddef>
#include <string>

namespace fuzz {

struct ContextView {
    // Every text of every record, in order: what the same message gives, says the same.
    std::string text;

    // Blocks that the root leads to.
    std::size_t blocks = 0;

    // Blocks that it does not lead to any more: the first copies of FROM.
    std::size_t abandoned = 0;

    // Of both, those that stay allocated by design when the context is released.
    std::size_t kept = 0;
};

ContextView viewOf(const qvsClientProvCtx *root);

// The blocks of the NAPDEF records from `first` up to, and without, `end`.
std::size_t blocksOf(const qvsCtxNapDef *first, const qvsCtxNapDef *end);

} // namespace fuzz
