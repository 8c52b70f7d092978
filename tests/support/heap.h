// The heap of the library under the control of a test: its live blocks are counted, and any one of
// its allocations can be made to fail. A program is linked with
// -Wl,--wrap=malloc,--wrap=calloc,--wrap=realloc,--wrap=free, which catches the calls of the object
// files it is made of; the C++ library allocates elsewhere and is not counted. One that loads the
// library compiles it with OMACP_HEAP_OF_THE_PROCESS: then all calls come here.
#ifndef HEAP_H
#define HEAP_H

#include <cstddef>
#include <functional>
#include <set>

namespace blocks {

// Whether allocations are counted; what was counted is noticed when it goes, at any time. On at
// the start, but for a whole process.
extern bool counting;

// The number of allocations that still succeed before one fails; negative when none is to fail.
extern long failAt;

// Whether, once one has failed, all the following ones fail too, until failAt is set to 0 or more,
// or reset() is called.
extern bool failFromThenOn;

// Whether blocks come full of other bytes than zeros, but for those of calloc.
extern bool dirty;

// Lets every allocation succeed again.
void reset();

std::size_t live();           // blocks that were allocated and not released
std::size_t liveBytes();      // their bytes, as asked for
std::size_t liveBytesTaken(); // and as the C library takes them, with the header of each
std::size_t peakBytesTaken(); // the most that these were since startCounting()
std::size_t allocations();    // allocations that succeeded since startCounting()
std::size_t allocated();      // their bytes, as asked for
void startCounting();

// Whether `block` is live.
bool isLive(const void *block);

// The live blocks themselves.
std::set<void *> all();

// Releases all of them: those that stay allocated by design do not add up over a run.
void releaseAll();

// Called with every live block before it is released, unless it is empty.
extern std::function<void(const void *block)> onRelease;

// While one lives, every block ends where its memory does, so far as its alignment lets it, so that
// the first byte behind it can be neither read nor written, and no byte of it once it is released.
// It takes pages, so it is for few blocks at a time; they may outlive it.
class Fence {
public:
    Fence();
    Fence(const Fence &) = delete;
    Fence &operator=(const Fence &) = delete;
    ~Fence();

private:
    bool before;
};

} // namespace blocks

#endif
