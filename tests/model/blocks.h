// Counts the blocks that the library holds: those that it was given while counting was on, less
// those that it gave back.
#ifndef MODEL_BLOCKS_H
#define MODEL_BLOCKS_H

extern long liveBlocks;

// Under the address sanitizer, which brings an allocator of its own, nothing is counted.
extern const bool blocksAreCounted;

extern bool counting;

struct Counting {
    Counting() { counting = true; }
    ~Counting() { counting = false; }
};

// For what the library calls in turn.
struct NotCounting {
    const bool before = counting;

    NotCounting() { counting = false; }
    ~NotCounting() { counting = before; }
};

#endif
