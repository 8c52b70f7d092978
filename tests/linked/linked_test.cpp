// A program linked with the library, as a host is: what the library exports as data is one object
// for both. The program is position dependent, the case in which the linker copies exported data
// into it.
#include "qvsJniParser.h"
#include "qvstrace.h"

#include <gtest/gtest.h>

TEST(Linked, SeesWhatTheLibraryWritesIntoItsDumpBuffer)
{
    const uint8_t bytes[] = {0x41, 0x0A};
    qvcTraceDump22(bytes, sizeof(bytes));
    EXPECT_STREQ(_szBuffer, "41 0A A.");
}

TEST(Linked, SeesTheContextPointer)
{
    EXPECT_EQ(ptCtx, nullptr);
}
