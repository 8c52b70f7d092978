// The heap of the library under the control of a test: its live blocks are counted, and any one of
// its allocations can be made to fail. The test program is linked with
// -Wl,--wrap=malloc,--wrap=calloc,--wrap=realloc,--wrap=free, which catches the calls of the object
// files it is made of; the C++ library allocates elsewhere and is not counted.
#ifndef BLOCKS_H
#define BLOCKS_H

#include <gtest/gtest.h>

#include <cstddef>
#include <functional>
#include <set>

namespace blocks {

// The number of allocations that still succeed before one fails; negative when none is to fail.
extern long failAt;

// Whether, once one has failed, all the following ones fail too, until failAt is set to 0 or more,
// or reset() is called.
extern bool failFromThenOn;

// Lets every allocation succeed again.
void reset();

std::size_t live();        // blocks that were allocated and not released
std::size_t liveBytes();   // their bytes, as asked for
std::size_t peakBytes();   // the most that liveBytes() was since startCounting()
std::size_t allocations(); // allocations that succeeded since startCounting()
std::size_t allocated();   // their bytes
void startCounting();

// The live blocks themselves.
std::set<void *> all();

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

// Fails the test when more or fewer blocks are live at the end of the scope than at its start.
class BlockCheck {
public:
    BlockCheck() : before(live()) {}
    BlockCheck(const BlockCheck &) = delete;
    BlockCheck &operator=(const BlockCheck &) = delete;
    ~BlockCheck() { EXPECT_EQ(live(), before) << "blocks live at the end and at the start"; }

private:
    std::size_t before;
};

// A fixture that does so for each of its tests. With members or a SetUp that allocate, put a
// BlockCheck into the test instead.
class BlockTest : public testing::Test {
private:
    BlockCheck check;
};

// Runs `attempt` with its first allocation failing, then its second, until one run needs no more.
// Every attempt must leave as many live blocks as it found. Returns how many runs had a failure.
template <class Attempt>
long failEach(Attempt attempt)
{
    long n = 0;
    for (;; ++n) {
        SCOPED_TRACE(testing::Message()
                     << (failFromThenOn ? "from" : "only") << " allocation " << n + 1 << " fails");
        BlockCheck check;
        failAt = n;
        attempt();
        const bool failed = failAt < 0;
        reset();
        if (!failed) {
            return n;
        }
    }
}

// The same with every allocation from the first, the second, ... on failing.
template <class Attempt>
long failEachFrom(Attempt attempt)
{
    failFromThenOn = true;
    const long runs = failEach(attempt);
    failFromThenOn = false;
    return runs;
}

} // namespace blocks

#endif
