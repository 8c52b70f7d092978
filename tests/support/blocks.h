// What a test holds the blocks of the library to.
#ifndef BLOCKS_H
#define BLOCKS_H

#include "heap.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace blocks {

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
