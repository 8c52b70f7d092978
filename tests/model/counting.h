// Counts the blocks that the library holds: those that it is given while counting is on, less those
// that go.
#ifndef MODEL_COUNTING_H
#define MODEL_COUNTING_H

#include "../support/heap.h"

// Under the address sanitizer, which brings an allocator of its own, nothing is counted.
#ifdef __SANITIZE_ADDRESS__
constexpr bool kBlocksAreCounted = false;
#else
constexpr bool kBlocksAreCounted = true;
#endif

struct Counting {
    Counting() { blocks::counting = true; }
    ~Counting() { blocks::counting = false; }
};

// For what the library calls in turn.
struct NotCounting {
    const bool before = blocks::counting;

    NotCounting() { blocks::counting = false; }
    ~NotCounting() { blocks::counting = before; }
};

#endif
