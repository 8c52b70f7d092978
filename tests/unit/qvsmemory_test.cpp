// Blocks, their tracking, and the plain memory operations.
#include "qvsmemory.h"

#include "blocks.h"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <string>
#include <vector>

namespace {

constexpr char kFile[] = "jni/src/ClientProv/caller";

class Memory : public blocks::BlockTest {};

// What `action` prints on standard output.
template <class Action>
std::string printedBy(Action action)
{
    testing::internal::CaptureStdout();
    action();
    return testing::internal::GetCapturedStdout();
}

// What tracking reports of the blocks that `action` leaves; it is to release them afterwards.
template <class Action>
std::string reportOf(Action action)
{
    return printedBy([&] {
        qvsMemStartMemCheck();
        action();
        qvsMemEndMemCheck();
    });
}

std::string reported(const char *file, int line, int size)
{
    return std::string("[syncml] MEMCHECK Filename:") + file + " Line:" + std::to_string(line) +
           " Size:" + std::to_string(size) + " \n";
}

bool isZero(const void *block, std::size_t size)
{
    const std::string zeros(size, '\0');
    return std::memcmp(block, zeros.data(), size) == 0;
}

} // namespace

TEST_F(Memory, AllocGivesABlockOfItsSize)
{
    blocks::startCounting();
    void *block = qvsMemAlloc_debug(100, kFile, 1);
    ASSERT_NE(block, nullptr);
    std::memset(block, 0xFF, 100);
    EXPECT_EQ(blocks::allocated(), 100U);
    EXPECT_EQ(blocks::allocations(), 1U);
    qvsMemFree_debug(block);
}

TEST_F(Memory, AllocSetZeroGivesZeros)
{
    // A dirty block of the same size is likely to be handed out again.
    void *dirty = qvsMemAlloc_debug(100, kFile, 1);
    ASSERT_NE(dirty, nullptr);
    std::memset(dirty, 0xFF, 100);
    qvsMemFree_debug(dirty);

    blocks::startCounting();
    void *block = qvsMemAllocSetZero_debug(100, kFile, 2);
    ASSERT_NE(block, nullptr);
    EXPECT_TRUE(isZero(block, 100));
    EXPECT_EQ(blocks::allocated(), 100U);
    qvsMemFree_debug(block);
}

TEST_F(Memory, AllocWGivesTwoBytesPerUnit)
{
    blocks::startCounting();
    uint16_t *block = qvsMemAllocW_debug(50, kFile, 1);
    ASSERT_NE(block, nullptr);
    EXPECT_EQ(blocks::allocated(), 100U);
    block[49] = 0xFFFF;
    qvsMemFree_debug(block);
}

TEST_F(Memory, AllocWRefusesACountWhoseBytesRunOver)
{
    EXPECT_EQ(qvsMemAllocW_debug(0x80000000U, kFile, 1), nullptr);
    EXPECT_EQ(qvsMemAllocW_debug(0x80000001U, kFile, 1), nullptr);
    EXPECT_EQ(qvsMemAllocW_debug(0xFFFFFFFFU, kFile, 1), nullptr);
}

TEST_F(Memory, AllocWAsksForTheLargestCountThatCanBeCounted)
{
    blocks::failAt = 0;
    EXPECT_EQ(qvsMemAllocW_debug(0x7FFFFFFFU, kFile, 1), nullptr);
    EXPECT_EQ(blocks::failAt, -1) << "the heap was not asked";
    blocks::reset();
}

TEST_F(Memory, CountsTheBlocksThatCouldNotBeHad)
{
    char text[] = "abc";
    void *(*const requests[])(void *text) = {
        [](void *) { return qvsMemAlloc_debug(8, kFile, 1); },
        [](void *) { return qvsMemAllocSetZero_debug(8, kFile, 1); },
        [](void *) { return qvsMemAllocSetZero_debug(4096, kFile, 1); },
        [](void *) { return static_cast<void *>(qvsMemAllocW_debug(8, kFile, 1)); },
        [](void *from) -> void * {
            return qvsStrdup_debug(static_cast<const char *>(from), kFile, 1);
        },
        [](void *from) { return qvsMemDup_debug(from, 4, kFile, 1); },
        [](void *from) { return qvsMemReAlloc_debug(from, 4, kFile, 1); },
        [](void *) { return qvs::newBlock(8, kFile); },
        [](void *) -> void * { return qvs::newText(8, kFile); },
        [](void *) -> void * { return qvs::newText(4096, kFile); },
    };
    for (const bool tracked : {false, true}) {
        if (tracked) {
            qvsMemStartMemCheck();
        }
        for (const auto &request : requests) {
            const uint32_t before = qvs::refusals;
            blocks::failAt = 0;
            EXPECT_EQ(request(text), nullptr);
            EXPECT_EQ(qvs::refusals, before + 1);
            blocks::reset();
        }
        qvsMemEndMemCheck();
    }
    const uint32_t before = qvs::refusals;
    qvsMemFree_debug(qvsMemAlloc_debug(8, kFile, 1));
    EXPECT_EQ(qvsStrdup_debug(nullptr, kFile, 1), nullptr);
    EXPECT_EQ(qvs::refusals, before);
}

TEST_F(Memory, ATextIsTrackedWithoutItsSpareZerosHoweverLong)
{
    for (const uint32_t size : {2U, 4096U}) {
        char *text = nullptr;
        const int line = __LINE__ + 1;
        const std::string report = reportOf([&] { text = qvs::newText(size, kFile); });
        ASSERT_NE(text, nullptr);
        EXPECT_EQ(report, reported(kFile, line, size));
        qvsMemFree_debug(text);
    }
}

TEST_F(Memory, StrdupCopiesATextAndItsTerminator)
{
    char text[] = "abc";
    char *copy = qvsStrdup_debug(text, kFile, 1);
    text[0] = 'x';
    EXPECT_STREQ(copy, "abc");
    qvsMemFree_debug(copy);

    char *empty = qvsStrdup_debug("", kFile, 1);
    EXPECT_STREQ(empty, "");
    qvsMemFree_debug(empty);
}

TEST_F(Memory, StrdupWritesFourMoreZeros)
{
    void *dirty = qvsMemAlloc_debug(8, kFile, 1);
    ASSERT_NE(dirty, nullptr);
    std::memset(dirty, 0xFF, 8);
    qvsMemFree_debug(dirty);

    blocks::startCounting();
    char *copy = qvsStrdup_debug("abc", kFile, 1);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(blocks::allocated(), 8U);
    EXPECT_TRUE(isZero(copy + 3, 5));
    qvsMemFree_debug(copy);
}

TEST_F(Memory, StrdupOfNullIsNull)
{
    EXPECT_EQ(qvsStrdup_debug(nullptr, kFile, 1), nullptr);
}

TEST_F(Memory, DupCopiesBytes)
{
    const char bytes[] = {1, 0, 2, 0, 3};
    blocks::startCounting();
    void *copy = qvsMemDup_debug(bytes, 5, kFile, 1);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(std::memcmp(copy, bytes, 5), 0);
    EXPECT_EQ(blocks::allocated(), 5U);
    qvsMemFree_debug(copy);
}

TEST_F(Memory, DupOfNullIsNull)
{
    EXPECT_EQ(qvsMemDup_debug(nullptr, 5, kFile, 1), nullptr);
    EXPECT_EQ(qvsMemDup_debug(nullptr, 0, kFile, 1), nullptr);
}

TEST_F(Memory, ReAllocCopiesAndReleasesTheOldBlock)
{
    char *old = qvsStrdup_debug("abcdefgh", kFile, 1);
    blocks::startCounting();
    char *copy = static_cast<char *>(qvsMemReAlloc_debug(old, 5, kFile, 2));
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(std::string(copy, 5), "abcde");
    EXPECT_EQ(blocks::allocated(), 5U);
    qvsMemFree_debug(copy);
}

TEST_F(Memory, ReAllocOfNullIsNull)
{
    EXPECT_EQ(qvsMemReAlloc_debug(nullptr, 10, kFile, 1), nullptr);
}

TEST_F(Memory, FreeIgnoresNull)
{
    EXPECT_EQ(printedBy([] { qvsMemFree_debug(nullptr); }), "");
    EXPECT_EQ(reportOf([] { qvsMemFree_debug(nullptr); }), "");
}

TEST_F(Memory, EveryAllocatorGivesNullWithoutMemory)
{
    const auto refused = [](auto allocate) {
        blocks::failAt = 0;
        EXPECT_EQ(allocate(), nullptr);
        blocks::reset();
    };
    char *text = qvsStrdup_debug("abc", kFile, 1);
    refused([] { return qvsMemAlloc_debug(10, kFile, 1); });
    refused([] { return qvsMemAllocSetZero_debug(10, kFile, 1); });
    refused([] { return qvsMemAllocW_debug(10, kFile, 1); });
    refused([] { return qvsStrdup_debug("abc", kFile, 1); });
    refused([text] { return qvsMemDup_debug(text, 3, kFile, 1); });
    refused([text] { return qvsMemReAlloc_debug(text, 3, kFile, 1); });
    EXPECT_STREQ(text, "abc") << "the old block is still there";
    qvsMemFree_debug(text);
    const auto large = [] { return qvsMemAllocSetZero_debug(4096, kFile, 1); };
    refused(large);
    EXPECT_EQ(reportOf([&] { refused(large); }), "");
}

TEST_F(Memory, NothingIsTrackedBeforeTheStart)
{
    EXPECT_EQ(printedBy([] { qvsMemEndMemCheck(); }), "");
    void *block = nullptr;
    EXPECT_EQ(printedBy([&] { block = qvsMemAlloc_debug(10, kFile, 1); }), "");
    EXPECT_EQ(printedBy([&] { qvsMemFree_debug(block); }), "");
}

TEST_F(Memory, TrackingReportsWhatWasNotReleased)
{
    std::vector<void *> left;
    const std::string report = reportOf([&] {
        left.push_back(qvsMemAlloc_debug(10, "one", 11));
        void *released = qvsMemAlloc_debug(20, "two", 22);
        left.push_back(qvsMemAllocSetZero_debug(30, "three", 33));
        left.push_back(qvsMemDup_debug("abcd", 4, "four", 44));
        qvsMemFree_debug(released);
    });
    EXPECT_EQ(report,
              reported("one", 11, 10) + reported("three", 33, 30) + reported("four", 44, 4));
    for (void *block : left) {
        qvsMemFree_debug(block);
    }
}

TEST_F(Memory, TrackingUsesTheFirstFreeEntry)
{
    std::vector<void *> left;
    const std::string report = reportOf([&] {
        void *released = qvsMemAlloc_debug(1, "released", 1);
        left.push_back(qvsMemAlloc_debug(2, "second", 2));
        qvsMemFree_debug(released);
        left.push_back(qvsMemAlloc_debug(3, "third", 3));
    });
    EXPECT_EQ(report, reported("third", 3, 3) + reported("second", 2, 2));
    for (void *block : left) {
        qvsMemFree_debug(block);
    }
}

TEST_F(Memory, TrackingReportsNothingWhenAllIsReleased)
{
    EXPECT_EQ(reportOf([] {
                  qvsMemFree_debug(qvsMemAlloc_debug(10, kFile, 1));
                  qvsMemFree_debug(qvsStrdup_debug("abc", kFile, 1));
              }),
              "");
}

TEST_F(Memory, ReAllocTracksTheNewBlockInPlaceOfTheOld)
{
    void *block = nullptr;
    const std::string report = reportOf(
        [&] { block = qvsMemReAlloc_debug(qvsMemAllocSetZero_debug(10, "old", 1), 8, "new", 2); });
    EXPECT_EQ(report, reported("new", 2, 8));
    qvsMemFree_debug(block);
}

TEST_F(Memory, AFailedAllocationIsNotTracked)
{
    EXPECT_EQ(reportOf([] {
                  blocks::failAt = 0;
                  EXPECT_EQ(qvsMemAlloc_debug(10, kFile, 1), nullptr);
                  blocks::reset();
              }),
              "");
}

TEST_F(Memory, APathThatIsNullIsReportedEmpty)
{
    void *block = nullptr;
    EXPECT_EQ(reportOf([&] { block = qvsMemAlloc_debug(10, nullptr, 7); }), reported("", 7, 10));
    qvsMemFree_debug(block);
}

TEST_F(Memory, FreeingAnUntrackedBlockIsReportedAndDone)
{
    void *block = qvsMemAlloc_debug(10, kFile, 1);
    EXPECT_EQ(reportOf([&] { qvsMemFree_debug(block); }), "[syncml] MEMCHECK Not Found Address \n");
}

TEST_F(Memory, TheTableHolds2000Blocks)
{
    std::vector<void *> all;
    const std::string report = printedBy([&] {
        qvsMemStartMemCheck();
        for (int i = 0; i < 2000; ++i) {
            all.push_back(qvsMemAlloc_debug(1, kFile, i));
        }
    });
    EXPECT_EQ(report, "");
    EXPECT_EQ(printedBy([&] { all.push_back(qvsMemAlloc_debug(1, kFile, 2000)); }),
              "[syncml] MEMCHECK Not Found Empty Index\n");
    ASSERT_NE(all.back(), nullptr);
    EXPECT_EQ(printedBy([&] { qvsMemFree_debug(all.back()); }),
              "[syncml] MEMCHECK Not Found Address \n");
    all.pop_back();
    EXPECT_EQ(printedBy([&] {
                  qvsMemFree_debug(all.back());
                  all.back() = qvsMemAlloc_debug(5, "last", 5);
              }),
              "")
        << "the entry of a released block is free again";
    std::string expected;
    for (int i = 0; i < 1999; ++i) {
        expected += reported(kFile, i, 1);
    }
    EXPECT_EQ(printedBy([] { qvsMemEndMemCheck(); }), expected + reported("last", 5, 5));
    for (void *block : all) {
        qvsMemFree_debug(block);
    }
}

TEST_F(Memory, TheTableIsOneBlockOf32000BytesOn32Bits)
{
    blocks::startCounting();
    qvsMemStartMemCheck();
    EXPECT_EQ(blocks::allocations(), 1U);
    if (sizeof(void *) == 4) {
        EXPECT_EQ(blocks::allocated(), 32000U);
    }
    qvsMemEndMemCheck();
}

TEST_F(Memory, ASecondStartEmptiesTheTable)
{
    void *first = nullptr;
    void *second = nullptr;
    const std::string report = reportOf([&] {
        first = qvsMemAlloc_debug(10, "first", 1);
        qvsMemStartMemCheck();
        second = qvsMemAlloc_debug(20, "second", 2);
    });
    EXPECT_EQ(report, reported("second", 2, 20));
    qvsMemFree_debug(first);
    qvsMemFree_debug(second);
}

TEST_F(Memory, TrackingStaysOffWithoutMemoryForTheTable)
{
    blocks::failAt = 0;
    qvsMemStartMemCheck();
    blocks::reset();
    void *block = nullptr;
    EXPECT_EQ(printedBy([&] {
                  block = qvsMemAlloc_debug(10, kFile, 1);
                  qvsMemEndMemCheck();
              }),
              "");
    qvsMemFree_debug(block);
}

TEST_F(Memory, TheEndTurnsTrackingOff)
{
    void *block = nullptr;
    (void)reportOf([] {});
    EXPECT_EQ(printedBy([&] {
                  block = qvsMemAlloc_debug(10, kFile, 1);
                  qvsMemEndMemCheck();
                  qvsMemFree_debug(block);
              }),
              "");
}

TEST_F(Memory, SetAndSetZeroFillBytes)
{
    std::array<unsigned char, 5> bytes = {1, 2, 3, 4, 5};
    EXPECT_EQ(qvsMemSet(bytes.data(), 0x1AB, 4), bytes.data());
    EXPECT_EQ(bytes, (std::array<unsigned char, 5>{0xAB, 0xAB, 0xAB, 0xAB, 5}));
    EXPECT_EQ(qvsMemSetZero(bytes.data(), 2), bytes.data());
    EXPECT_EQ(bytes, (std::array<unsigned char, 5>{0, 0, 0xAB, 0xAB, 5}));
}

TEST_F(Memory, CpyAndMoveCopyBytes)
{
    char bytes[] = "abcdef";
    EXPECT_EQ(qvsMemCpy(bytes, "xyz", 2), bytes);
    EXPECT_STREQ(bytes, "xycdef");
    EXPECT_EQ(qvsMemMove(bytes + 1, bytes, 4), bytes + 1);
    EXPECT_STREQ(bytes, "xxycdf");
}

TEST_F(Memory, CmpComparesBytesAsUnsigned)
{
    EXPECT_EQ(qvsMemCmp("abc", "abd", 2), 0);
    EXPECT_LT(qvsMemCmp("abc", "abd", 3), 0);
    EXPECT_GT(qvsMemCmp("\xFF", "\x01", 1), 0);
    EXPECT_EQ(qvsMemCmp("a", "b", 0), 0);
}

TEST_F(Memory, SetWFillsUnits)
{
    std::array<uint16_t, 4> units = {1, 2, 3, 4};
    EXPECT_EQ(qvsMemSetW(units.data(), 0xABCD, 3), units.data());
    EXPECT_EQ(units, (std::array<uint16_t, 4>{0xABCD, 0xABCD, 0xABCD, 4}));
}

TEST_F(Memory, CpyWCopiesUnits)
{
    const std::array<uint16_t, 3> source = {0x1122, 0, 0x3344};
    std::array<uint16_t, 4> units = {9, 9, 9, 9};
    EXPECT_EQ(qvsMemCpyW(units.data(), source.data(), 3), units.data());
    EXPECT_EQ(units, (std::array<uint16_t, 4>{0x1122, 0, 0x3344, 9}));
}

TEST_F(Memory, CpyWOfOrToNullIsNull)
{
    uint16_t unit = 7;
    EXPECT_EQ(qvsMemCpyW(nullptr, &unit, 1), nullptr);
    EXPECT_EQ(qvsMemCpyW(&unit, nullptr, 1), nullptr);
    EXPECT_EQ(unit, 7);
}

TEST_F(Memory, ARecordIsZeroedAndTrackedUnderItsLine)
{
    struct Record {
        uint32_t first;
        uint32_t second;
    };
    Record *record = nullptr;
    int line = 0;
    blocks::startCounting();
    const std::string report = reportOf([&] {
        blocks::startCounting();
        record = qvs::newRecord<Record>(kFile, 3);
        line = __LINE__ - 1;
    });
    ASSERT_NE(record, nullptr);
    EXPECT_EQ(blocks::allocated(), 11U);
    EXPECT_TRUE(isZero(record, 11));
    EXPECT_EQ(report, reported(kFile, line, 11));
    qvsMemFree_debug(record);
}

TEST(Kept, memcheck_unit_count)
{
    const blocks::BlockCheck check;
    uint16_t *block = nullptr;
    EXPECT_EQ(reportOf([&] { block = qvsMemAllocW_debug(50, kFile, 1); }), reported(kFile, 1, 50));
    qvsMemFree_debug(block);
}

TEST(Kept, memcheck_text_length)
{
    const blocks::BlockCheck check;
    char *text = nullptr;
    EXPECT_EQ(reportOf([&] { text = qvsStrdup_debug("abc", kFile, 1); }), reported(kFile, 1, 3));
    qvsMemFree_debug(text);
}

TEST(Kept, realloc_to_nothing)
{
    const blocks::BlockCheck check;
    char *old = qvsStrdup_debug("abc", kFile, 1);
    EXPECT_EQ(qvsMemReAlloc_debug(old, 0, kFile, 2), nullptr);
    EXPECT_STREQ(old, "abc");
    qvsMemFree_debug(old);
}
