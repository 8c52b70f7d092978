// The byte buffer: every operation, in step and out of step, with the caller's storage and without
// memory.
#include "smlbuffer.h"

#include "blocks.h"
#include "memcheck.h"
#include "qvsmemory.h"

#include <gtest/gtest.h>

#include <array>
#include <cstddef>
#include <cstring>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

namespace {

#if __SIZEOF_POINTER__ == 4
static_assert(offsetof(smlBuffer, pHead) == 0);
static_assert(offsetof(smlBuffer, pStorage) == 4);
static_assert(offsetof(smlBuffer, pTail) == 8);
static_assert(offsetof(smlBuffer, pEnd) == 12);
static_assert(offsetof(smlBuffer, nSize) == 16);
static_assert(offsetof(smlBuffer, nCapacity) == 20);
static_assert(offsetof(smlBuffer, bOutside) == 24);
static_assert(sizeof(smlBuffer) == 28);
#endif

class Buffer : public blocks::BlockTest {};

const uint8_t *bytesOf(const std::string &text)
{
    return reinterpret_cast<const uint8_t *>(text.data());
}

qvsResult append(smlBuffer *buffer, const std::string &text)
{
    return smlBufferAppendTail(buffer, bytesOf(text), static_cast<uint32_t>(text.size()));
}

qvsResult insert(smlBuffer *buffer, const std::string &text)
{
    return smlBufferInsertHead(buffer, bytesOf(text), static_cast<uint32_t>(text.size()));
}

smlBuffer *bufferOf(const std::string &text, uint32_t capacity)
{
    smlBuffer *buffer = nullptr;
    EXPECT_EQ(smlBufferCreate(&buffer, capacity), QVS_OK);
    EXPECT_EQ(append(buffer, text), QVS_OK);
    return buffer;
}

void drop(smlBuffer *buffer)
{
    EXPECT_EQ(smlBufferDelete(buffer), QVS_OK);
}

std::string text(const uint8_t *from, std::size_t count)
{
    return {reinterpret_cast<const char *>(from), count};
}

std::string dataOf(const smlBuffer *buffer)
{
    return text(buffer->pHead, buffer->nSize);
}

// The whole storage of the buffer.
std::string storageOf(const smlBuffer *buffer)
{
    return text(buffer->pStorage, buffer->nCapacity);
}

std::string zeros(std::size_t count)
{
    return std::string(count, '\0');
}

// The distance of two positions, which need not lie in one block.
intptr_t between(const uint8_t *from, const uint8_t *to)
{
    return static_cast<intptr_t>(reinterpret_cast<uintptr_t>(to) -
                                 reinterpret_cast<uintptr_t>(from));
}

// Whether the numbers of the buffer agree.
void expectInStep(const smlBuffer *buffer)
{
    EXPECT_LE(buffer->pStorage, buffer->pHead);
    EXPECT_LE(buffer->pHead, buffer->pTail);
    EXPECT_LE(buffer->pTail, buffer->pEnd);
    EXPECT_EQ(buffer->pTail - buffer->pHead, static_cast<ptrdiff_t>(buffer->nSize));
    EXPECT_EQ(buffer->pEnd - buffer->pStorage, static_cast<ptrdiff_t>(buffer->nCapacity));
}

// A buffer with the data at an offset in its storage.
smlBuffer *bufferAt(uint32_t offset, const std::string &data, uint32_t capacity)
{
    smlBuffer *buffer = bufferOf(std::string(offset, '-') + data, capacity);
    EXPECT_EQ(smlBufferPull(buffer, offset), QVS_OK);
    return buffer;
}

// A buffer from which `over` bytes more were pulled than the three that it held.
smlBuffer *overdrawn(uint32_t over)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(smlBufferPull(buffer, 3 + over), QVS_OK);
    return buffer;
}

// The decoder's buffer: one block, and otherwise what creating and appending make.
TEST(MakeBuffer, IsABufferThatWasCreatedAndAppendedTo)
{
    blocks::BlockCheck check;
    const uint8_t data[600] = {1, 2, 3};
    for (uint32_t length : {0u, 1u, 255u, 256u, 257u, 600u}) {
        smlBuffer *grown = nullptr;
        ASSERT_EQ(smlBufferCreate(&grown, length), QVS_OK);
        ASSERT_EQ(smlBufferAppendTail(grown, data, length), QVS_OK);
        smlBuffer *made = nullptr;
        ASSERT_EQ(qvs::makeBuffer(&made, data, length), QVS_OK);
        EXPECT_EQ(made->nSize, grown->nSize);
        EXPECT_EQ(made->nCapacity, grown->nCapacity) << length;
        EXPECT_EQ(made->bOutside, 0u);
        EXPECT_EQ(made->pHead, made->pStorage);
        EXPECT_EQ(made->pTail, made->pStorage + length);
        EXPECT_EQ(made->pEnd, made->pStorage + made->nCapacity);
        EXPECT_EQ(memcmp(made->pStorage, grown->pStorage, grown->nCapacity + 1), 0);
        EXPECT_EQ(smlBufferDelete(made), QVS_OK);
        EXPECT_EQ(smlBufferDelete(grown), QVS_OK);
    }
}

TEST(MakeBuffer, HasNoMemoryForALengthWhoseRoomCannotBeCounted)
{
    const uint8_t data[1] = {};
    for (uint32_t length : {UINT32_MAX / 2 - 255, 0x90000000U, UINT32_MAX}) {
        smlBuffer *made = nullptr;
        EXPECT_EQ(qvs::makeBuffer(&made, data, length), QVS_ERROR_NO_MEMORY);
        EXPECT_EQ(made, nullptr);
    }
}

} // namespace

TEST_F(Buffer, IsCreatedEmptyAndZeroed)
{
    blocks::startCounting();
    smlBuffer *buffer = nullptr;
    ASSERT_EQ(smlBufferCreate(&buffer, 10), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 2U);
    EXPECT_EQ(blocks::allocated(), sizeof(smlBuffer) + 11) << "one spare byte";
    EXPECT_EQ(buffer->pHead, buffer->pStorage);
    EXPECT_EQ(buffer->nSize, 0U);
    EXPECT_EQ(buffer->nCapacity, 10U);
    EXPECT_EQ(buffer->bOutside, 0U);
    EXPECT_EQ(text(buffer->pStorage, 11), zeros(11));
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, IsAskedForUnderItsSource)
{
    const std::string file = "jni/src/ClientProv/smlbuffer";
    smlBuffer *buffer = nullptr;
    smlBuffer *outside = nullptr;
    uint8_t storage[4] = {};
    EXPECT_EQ(memcheck::filesOf([&] { EXPECT_EQ(smlBufferCreate(&buffer, 4), QVS_OK); }),
              (std::vector<std::string>{file, file}));
    EXPECT_EQ(memcheck::filesOf([&] {
                  EXPECT_EQ(smlBufferCreateOutsideBuf(&outside, storage, sizeof storage), QVS_OK);
              }),
              std::vector<std::string>{file});
    drop(buffer);
    drop(outside);
}

TEST_F(Buffer, MayHaveNoCapacity)
{
    smlBuffer *buffer = bufferOf("", 0);
    expectInStep(buffer);
    EXPECT_EQ(append(buffer, "ab"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "ab");
    EXPECT_EQ(buffer->nCapacity, 512U);
    drop(buffer);
}

TEST_F(Buffer, IsNotCreatedWithoutMemory)
{
    const long runs = blocks::failEach([] {
        smlBuffer untouched = {};
        smlBuffer *buffer = &untouched;
        if (smlBufferCreate(&buffer, 10) == QVS_OK) {
            drop(buffer);
        } else {
            EXPECT_EQ(buffer, nullptr);
        }
    });
    EXPECT_EQ(runs, 2);
    smlBuffer *buffer = nullptr;
    for (const long n : {0L, 1L}) {
        blocks::failAt = n;
        EXPECT_EQ(smlBufferCreate(&buffer, 10), 4111U);
    }
}

TEST_F(Buffer, IsNotCreatedWithACapacityWhoseSpareByteCannotBeCounted)
{
    smlBuffer untouched = {};
    smlBuffer *buffer = &untouched;
    EXPECT_EQ(smlBufferCreate(&buffer, 0xFFFFFFFFU), 4111U);
    EXPECT_EQ(buffer, nullptr);
}

TEST_F(Buffer, OverOutsideStorageClearsIt)
{
    std::array<uint8_t, 6> storage;
    storage.fill('#');
    blocks::startCounting();
    smlBuffer *buffer = nullptr;
    ASSERT_EQ(smlBufferCreateOutsideBuf(&buffer, storage.data(), 5), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 1U);
    EXPECT_EQ(buffer->pStorage, storage.data());
    EXPECT_EQ(buffer->pHead, storage.data());
    EXPECT_EQ(buffer->nCapacity, 5U);
    EXPECT_EQ(buffer->nSize, 0U);
    EXPECT_EQ(buffer->bOutside, 1U);
    EXPECT_EQ(text(storage.data(), 6), zeros(5) + "#");
    expectInStep(buffer);
    EXPECT_EQ(append(buffer, "abcd"), QVS_OK);
    EXPECT_EQ(text(storage.data(), 6), std::string("abcd\0#", 6));
    drop(buffer);
    EXPECT_EQ(storage[0], 'a') << "the caller's storage is not released";
}

TEST_F(Buffer, OverOutsideStorageNeedsARecordAndStorage)
{
    uint8_t storage[5];
    smlBuffer untouched = {};
    smlBuffer *buffer = &untouched;
    blocks::failAt = 0;
    EXPECT_EQ(smlBufferCreateOutsideBuf(&buffer, storage, 5), 4111U);
    blocks::reset();
    EXPECT_EQ(buffer, nullptr);
    buffer = &untouched;
    EXPECT_EQ(smlBufferCreateOutsideBuf(&buffer, nullptr, 5), 4113U);
    EXPECT_EQ(buffer, nullptr);
}

TEST_F(Buffer, OverOutsideStorageIsNotGrown)
{
    uint8_t storage[5];
    smlBuffer *buffer = nullptr;
    ASSERT_EQ(smlBufferCreateOutsideBuf(&buffer, storage, 5), QVS_OK);
    ASSERT_EQ(append(buffer, "abc"), QVS_OK);
    blocks::startCounting();
    EXPECT_EQ(smlBufferRealloc(buffer, 1), 4112U);
    EXPECT_EQ(append(buffer, "de"), 4112U) << "an exact fit would grow";
    EXPECT_EQ(smlBufferAppendTail(buffer, storage, 0xFFFFFFFFU), 4112U);
    EXPECT_EQ(insert(buffer, "xyz"), 4112U);
    EXPECT_EQ(dataOf(buffer), "abc");
    EXPECT_EQ(append(buffer, "d"), QVS_OK);
    EXPECT_EQ(insert(buffer, "x"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "xabcd");
    EXPECT_EQ(blocks::allocations(), 0U);
    drop(buffer);
}

TEST_F(Buffer, EveryOperationRefusesNoBuffer)
{
    uint8_t byte = 0;
    EXPECT_EQ(smlBufferCreate(nullptr, 1), 4113U);
    EXPECT_EQ(smlBufferCreateOutsideBuf(nullptr, &byte, 1), 4113U);
    EXPECT_EQ(smlBufferInit(nullptr), 4113U);
    EXPECT_EQ(smlBufferDelete(nullptr), 4113U);
    EXPECT_EQ(smlBufferRealloc(nullptr, 1), 4113U);
    EXPECT_EQ(smlBufferAppendTail(nullptr, &byte, 1), 4113U);
    EXPECT_EQ(smlBufferAppendTail(nullptr, &byte, 0), 4113U);
    EXPECT_EQ(smlBufferAppendStr(nullptr, "a"), 4113U);
    EXPECT_EQ(smlBufferInsertHead(nullptr, &byte, 1), 4113U);
    EXPECT_EQ(smlBufferGetData(nullptr, &byte, 1), 4113U);
    EXPECT_EQ(smlBufferPull(nullptr, 1), 4113U);
    EXPECT_EQ(smlBufferShifthead(nullptr), 4113U);
    EXPECT_EQ(smlBufferCut(nullptr, 0, 1), 4113U);
    smlBuffer *buffer = bufferOf("a", 5);
    smlBuffer *out = nullptr;
    EXPECT_EQ(smlBufferDuplicate(&out, nullptr), 4113U);
    EXPECT_EQ(smlBufferDuplicate(nullptr, buffer), 4113U);
    drop(buffer);
    EXPECT_EQ(smlBufferGetDataBuffer(nullptr, 0), nullptr);
    EXPECT_EQ(smlBufferGetDataSize(nullptr), 0U);
    EXPECT_EQ(smlBufferGetRemainSize(nullptr), 0U);
}

TEST_F(Buffer, InitEmptiesAndClears)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    EXPECT_EQ(smlBufferInit(buffer), QVS_OK);
    EXPECT_EQ(buffer->pHead, buffer->pStorage);
    EXPECT_EQ(buffer->nSize, 0U);
    EXPECT_EQ(storageOf(buffer), zeros(10));
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, ReallocGrowsByWhatIsWantedAndAtLeast512)
{
    for (const auto &[wanted, capacity] : std::vector<std::pair<uint32_t, uint32_t>>{
             {0, 522}, {1, 522}, {511, 522}, {512, 522}, {513, 523}, {2000, 2010}}) {
        smlBuffer *buffer = bufferAt(2, "abc", 10);
        blocks::startCounting();
        EXPECT_EQ(smlBufferRealloc(buffer, wanted), QVS_OK);
        EXPECT_EQ(blocks::allocations(), 1U);
        EXPECT_EQ(blocks::allocated(), capacity + 1U);
        EXPECT_EQ(buffer->nCapacity, capacity);
        EXPECT_EQ(buffer->pHead, buffer->pStorage) << "the data moves to the start";
        EXPECT_EQ(text(buffer->pStorage, capacity + 1), "abc" + zeros(capacity - 2));
        EXPECT_EQ(buffer->nSize, 3U);
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, ReallocWithoutMemoryChangesNothing)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    const smlBuffer before = *buffer;
    blocks::failAt = 0;
    EXPECT_EQ(smlBufferRealloc(buffer, 1), 4111U);
    blocks::failAt = 0;
    EXPECT_EQ(smlBufferRealloc(buffer, 0xFFFFFFFFU - 10), 4111U);
    EXPECT_EQ(blocks::failAt, 0) << "the heap was asked for a block that cannot be counted";
    blocks::reset();
    EXPECT_EQ(smlBufferRealloc(buffer, 0xFFFFFFFFU - 9), 4111U);
    EXPECT_EQ(smlBufferRealloc(buffer, 0xFFFFFFFFU), 4111U);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    EXPECT_EQ(dataOf(buffer), "abc");
    drop(buffer);
}

TEST_F(Buffer, ReallocAsksForTheLargestBlockThatCanBeCounted)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    blocks::failAt = 0;
    EXPECT_EQ(smlBufferRealloc(buffer, 0xFFFFFFFFU - 11), 4111U);
    EXPECT_EQ(blocks::failAt, -1) << "the heap was not asked";
    blocks::reset();
    drop(buffer);
}

TEST_F(Buffer, AppendsBehindTheData)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    EXPECT_EQ(append(buffer, "de"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "abcde");
    EXPECT_EQ(buffer->nCapacity, 10U);
    EXPECT_EQ(buffer->pHead, buffer->pStorage + 2);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, AppendingNothingChangesNothing)
{
    smlBuffer *buffer = bufferOf("abc", 3);
    const smlBuffer before = *buffer;
    uint8_t byte = 0;
    EXPECT_EQ(smlBufferAppendTail(buffer, &byte, 0), QVS_OK);
    EXPECT_EQ(smlBufferAppendTail(buffer, nullptr, 5), QVS_OK);
    EXPECT_EQ(smlBufferAppendStr(buffer, ""), QVS_OK);
    EXPECT_EQ(smlBufferAppendStr(buffer, nullptr), QVS_OK);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    drop(buffer);
}

TEST_F(Buffer, AppendingMoreThanTheRoomGrows)
{
    smlBuffer *buffer = bufferOf("", 4);
    EXPECT_EQ(append(buffer, "0123456789"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "0123456789");
    EXPECT_EQ(buffer->nCapacity, 516U);
    expectInStep(buffer);
    EXPECT_EQ(append(buffer, std::string(1000, 'x')), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "0123456789" + std::string(1000, 'x'));
    EXPECT_EQ(buffer->nCapacity, 516U + 1256U);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, AppendingOneByteLessThanTheRoomDoesNotGrow)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(append(buffer, "456789"), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 10U);
    EXPECT_EQ(smlBufferGetRemainSize(buffer), 1U);
    drop(buffer);
}

TEST_F(Buffer, AppendingWithoutMemoryChangesNothing)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    const smlBuffer before = *buffer;
    uint8_t byte = 0;
    blocks::failAt = 0;
    EXPECT_EQ(append(buffer, std::string(20, 'x')), 4111U);
    blocks::reset();
    EXPECT_EQ(smlBufferAppendTail(buffer, &byte, 0xFFFFFFFFU), 4111U);
    EXPECT_EQ(smlBufferAppendTail(buffer, &byte, 0xFFFFFFFFU - 255), 4111U);
    EXPECT_EQ(smlBufferAppendTail(buffer, &byte, 0xFFFFFFFFU - 256), 4111U);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    EXPECT_EQ(dataOf(buffer), "abc");
    drop(buffer);
}

TEST_F(Buffer, AppendsATextWithoutItsTerminator)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(smlBufferAppendStr(buffer, "de"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "abcde");
    drop(buffer);
}

TEST_F(Buffer, InsertsIntoTheRoomBeforeTheHead)
{
    for (const auto &[inserted, offset] :
         std::vector<std::pair<std::string, uint32_t>>{{"", 3}, {"x", 2}, {"xyz", 0}}) {
        smlBuffer *buffer = bufferAt(3, "abc", 7);
        blocks::startCounting();
        EXPECT_EQ(insert(buffer, inserted), QVS_OK);
        EXPECT_EQ(blocks::allocations(), 0U);
        EXPECT_EQ(dataOf(buffer), inserted + "abc");
        EXPECT_EQ(buffer->pHead, buffer->pStorage + offset);
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, InsertsByMovingTheDataUp)
{
    smlBuffer *buffer = bufferAt(1, "abc", 10);
    EXPECT_EQ(insert(buffer, "uvwxyz"), QVS_OK) << "exactly as much as there is behind the data";
    EXPECT_EQ(dataOf(buffer), "uvwxyzabc");
    EXPECT_EQ(buffer->pHead, buffer->pStorage + 1) << "the head stays";
    EXPECT_EQ(buffer->nCapacity, 10U);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, InsertsByGrowing)
{
    smlBuffer *buffer = bufferAt(1, "abc", 10);
    EXPECT_EQ(insert(buffer, "tuvwxyz"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "tuvwxyzabc");
    EXPECT_EQ(buffer->pHead, buffer->pStorage);
    EXPECT_EQ(buffer->nCapacity, 522U);
    expectInStep(buffer);
    EXPECT_EQ(insert(buffer, std::string(1000, 'x')), QVS_OK);
    EXPECT_EQ(dataOf(buffer), std::string(1000, 'x') + "tuvwxyzabc");
    EXPECT_EQ(buffer->nCapacity, 1522U);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, InsertsIntoAnEmptyBuffer)
{
    smlBuffer *buffer = bufferOf("", 5);
    EXPECT_EQ(insert(buffer, "ab"), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "ab");
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, InsertingNothingChangesNothing)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    const smlBuffer before = *buffer;
    EXPECT_EQ(smlBufferInsertHead(buffer, nullptr, 5), QVS_OK);
    EXPECT_EQ(insert(buffer, ""), QVS_OK);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    EXPECT_EQ(dataOf(buffer), "abc");
    drop(buffer);
}

TEST_F(Buffer, InsertingWithoutMemoryChangesNothing)
{
    smlBuffer *buffer = bufferAt(1, "abc", 10);
    const smlBuffer before = *buffer;
    uint8_t byte = 0;
    blocks::failAt = 0;
    EXPECT_EQ(insert(buffer, "tuvwxyz"), 4111U);
    blocks::reset();
    EXPECT_EQ(smlBufferInsertHead(buffer, &byte, 0xFFFFFFFFU), 4111U);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    EXPECT_EQ(dataOf(buffer), "abc");
    drop(buffer);
}

TEST_F(Buffer, GivesDataAndConsumesIt)
{
    smlBuffer *buffer = bufferOf("abcde", 10);
    const uint8_t *tail = buffer->pTail;
    std::array<uint8_t, 4> out;
    out.fill('#');
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 2), QVS_OK);
    EXPECT_EQ(text(out.data(), 4), "ab##");
    EXPECT_EQ(dataOf(buffer), "cde");
    EXPECT_EQ(buffer->pHead, buffer->pStorage + 2);
    EXPECT_EQ(buffer->pTail, tail);
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 0), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "cde");
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 3), QVS_OK) << "all that is left";
    EXPECT_EQ(text(out.data(), 4), "cde#");
    EXPECT_EQ(buffer->nSize, 0U);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, DoesNotGiveMoreThanThereIs)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    const smlBuffer before = *buffer;
    std::array<uint8_t, 10> out;
    out.fill('#');
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 4), 4114U);
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 0xFFFFFFFFU), 4114U);
    EXPECT_EQ(smlBufferGetData(buffer, nullptr, 1), 4113U);
    EXPECT_EQ(std::memcmp(buffer, &before, sizeof(before)), 0);
    EXPECT_EQ(text(out.data(), 10), std::string(10, '#'));
    EXPECT_EQ(smlBufferPull(buffer, 3), QVS_OK);
    EXPECT_EQ(smlBufferGetData(buffer, out.data(), 0), 4114U) << "nothing left at all";
    drop(buffer);

    smlBuffer headless = {};
    headless.nSize = 3;
    EXPECT_EQ(smlBufferGetData(&headless, out.data(), 1), 4114U);
}

TEST_F(Buffer, GivesAllTheDataOfAFullStorage)
{
    smlBuffer *buffer = bufferOf("abc", 5);
    EXPECT_EQ(insert(buffer, "xy"), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 5U);
    EXPECT_EQ(smlBufferGetRemainSize(buffer), 0U);
    uint8_t out[5];
    EXPECT_EQ(smlBufferGetData(buffer, out, 5), QVS_OK);
    EXPECT_EQ(text(out, 5), "xyabc");
    EXPECT_EQ(buffer->pHead, buffer->pEnd);
    EXPECT_EQ(append(buffer, "z"), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 5U + 512U) << "there is no room behind the head";
    EXPECT_EQ(dataOf(buffer), "z");
    drop(buffer);
}

TEST_F(Buffer, PullConsumes)
{
    smlBuffer *buffer = bufferOf("abcde", 10);
    EXPECT_EQ(smlBufferPull(buffer, 2), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "cde");
    EXPECT_EQ(smlBufferPull(buffer, 0), QVS_OK);
    EXPECT_EQ(smlBufferPull(buffer, 3), QVS_OK);
    EXPECT_EQ(buffer->nSize, 0U);
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, PullOutOfTheStorageConsumesAll)
{
    for (const uint32_t count : {9U, 0x7FFFFFFFU, 0xFFFFFFF0U}) {
        smlBuffer *buffer = bufferAt(2, "abc", 10);
        EXPECT_EQ(smlBufferPull(buffer, count), QVS_OK);
        EXPECT_EQ(buffer->nSize, 0U);
        EXPECT_EQ(buffer->pHead, buffer->pStorage + 5);
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, ShiftheadMovesTheDataToTheStartAndClearsTheRest)
{
    smlBuffer *buffer = bufferAt(2, "abcdef", 10);
    blocks::startCounting();
    EXPECT_EQ(smlBufferShifthead(buffer), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 0U);
    EXPECT_EQ(buffer->pHead, buffer->pStorage);
    EXPECT_EQ(buffer->nSize, 6U);
    EXPECT_EQ(storageOf(buffer), "abcdef" + zeros(4));
    expectInStep(buffer);
    drop(buffer);
}

TEST_F(Buffer, ShiftheadAtTheStartDoesNothing)
{
    smlBuffer *buffer = bufferOf("abcde", 10);
    EXPECT_EQ(smlBufferCut(buffer, 2, 1), QVS_OK);
    EXPECT_EQ(smlBufferShifthead(buffer), QVS_OK);
    EXPECT_EQ(storageOf(buffer), "abdee" + zeros(5)) << "what is behind the data stays";
    drop(buffer);
}

TEST_F(Buffer, ShiftheadClearsAllWithoutData)
{
    for (const std::string data : {"", "a"}) {
        smlBuffer *buffer = bufferAt(3, data, 10);
        EXPECT_EQ(smlBufferShifthead(buffer), QVS_OK);
        EXPECT_EQ(buffer->pHead, buffer->pStorage);
        EXPECT_EQ(storageOf(buffer), data + zeros(10 - data.size()));
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, CutClosesTheGap)
{
    for (const auto &[offset, count, rest] :
         std::vector<std::tuple<uint32_t, uint32_t, std::string>>{
             {0, 1, "bcdef"}, {2, 3, "abf"}, {4, 1, "abcdf"}, {2, 0, "abcdef"}}) {
        smlBuffer *buffer = bufferAt(1, "abcdef", 10);
        EXPECT_EQ(smlBufferCut(buffer, offset, count), QVS_OK);
        EXPECT_EQ(dataOf(buffer), rest);
        EXPECT_EQ(buffer->pHead, buffer->pStorage + 1);
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, CutIsClampedToTheData)
{
    for (const uint32_t count : {2U, 3U, 0xFFFFFFFFU}) {
        smlBuffer *buffer = bufferOf("abcdef", 10);
        EXPECT_EQ(smlBufferCut(buffer, 4, count), QVS_OK);
        EXPECT_EQ(buffer->nSize, 4U);
        EXPECT_EQ(storageOf(buffer), zeros(2) + "cdef" + zeros(4));
        expectInStep(buffer);
        drop(buffer);
    }
}

TEST_F(Buffer, CutAtTheEndOfTheDataRemovesNothing)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(smlBufferCut(buffer, 3, 5), QVS_OK);
    EXPECT_EQ(dataOf(buffer), "abc");
    drop(buffer);
}

TEST_F(Buffer, CutNeedsDataUpToItsOffset)
{
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(smlBufferCut(buffer, 4, 1), 4114U);
    EXPECT_EQ(dataOf(buffer), "abc");
    EXPECT_EQ(smlBufferPull(buffer, 3), QVS_OK);
    EXPECT_EQ(smlBufferCut(buffer, 0, 1), 4114U);
    EXPECT_EQ(smlBufferCut(buffer, 0, 0), 4114U);
    drop(buffer);
}

TEST_F(Buffer, GivesAPositionInItsData)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 0), buffer->pHead);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 2), buffer->pHead + 2);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 3), buffer->pTail);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 4), nullptr);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 0xFFFFFFFFU), nullptr);
    drop(buffer);
}

TEST_F(Buffer, GivesItsSizes)
{
    smlBuffer *buffer = bufferAt(2, "abc", 10);
    EXPECT_EQ(smlBufferGetDataSize(buffer), 3U);
    EXPECT_EQ(smlBufferGetRemainSize(buffer), 5U);
    drop(buffer);
}

TEST_F(Buffer, ADuplicateHasACopyOfTheStorage)
{
    smlBuffer *source = bufferOf("abc", 10);
    smlBuffer *copy = nullptr;
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    EXPECT_NE(copy->pStorage, source->pStorage);
    EXPECT_EQ(copy->nCapacity, 10U);
    EXPECT_EQ(storageOf(copy), storageOf(source));
    EXPECT_EQ(copy->pEnd, copy->pStorage + 10);
    EXPECT_EQ(smlBufferGetDataSize(copy), 3U);
    EXPECT_EQ(copy->bOutside, 0U);
    drop(copy);
    drop(source);
}

TEST_F(Buffer, ADuplicateOfAnEmptyBufferIsInStep)
{
    smlBuffer *source = bufferOf("", 10);
    smlBuffer *copy = nullptr;
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    expectInStep(copy);
    EXPECT_EQ(append(copy, "ab"), QVS_OK);
    EXPECT_EQ(dataOf(copy), "ab");
    EXPECT_EQ(storageOf(source), zeros(10));
    drop(copy);
    drop(source);

    uint8_t storage[4] = {};
    ASSERT_EQ(smlBufferCreateOutsideBuf(&source, storage, 4), QVS_OK);
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    EXPECT_EQ(append(copy, "abcdefgh"), QVS_OK) << "its storage is its own";
    EXPECT_EQ(copy->nCapacity, 516U);
    drop(copy);
    drop(source);
}

TEST_F(Buffer, IsNotDuplicatedWithoutMemory)
{
    smlBuffer *source = bufferOf("abc", 10);
    for (const long n : {0L, 1L}) {
        smlBuffer *copy = source;
        blocks::failAt = n;
        EXPECT_EQ(smlBufferDuplicate(&copy, source), 4111U);
        blocks::reset();
        EXPECT_EQ(copy, nullptr);
    }
    drop(source);
}

TEST_F(Buffer, ADuplicateGivesTheDataOfASourceWithItsHeadAtTheStart)
{
    smlBuffer *source = bufferOf("abc", 10);
    smlBuffer *copy = nullptr;
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    uint8_t out[3];
    EXPECT_EQ(smlBufferGetDataBuffer(copy, 1), copy->pStorage + 1);
    EXPECT_EQ(smlBufferGetData(copy, out, 3), QVS_OK);
    EXPECT_EQ(text(out, 3), "abc");
    drop(copy);
    drop(source);
}

TEST_F(Buffer, ADuplicatesTailIsPutInStepWhenItIsNeeded)
{
    using Change = qvsResult (*)(smlBuffer *);
    const std::vector<std::pair<Change, std::string>> changes = {
        {[](smlBuffer *buffer) { return append(buffer, "de"); }, "abcde"},
        {[](smlBuffer *buffer) { return append(buffer, std::string(6, 'x')); }, "abcxxxxxx"},
        {[](smlBuffer *buffer) { return append(buffer, std::string(7, 'x')); }, "abcxxxxxxx"},
        {[](smlBuffer *buffer) { return insert(buffer, "de"); }, "deabc"},
        {[](smlBuffer *buffer) { return insert(buffer, std::string(8, 'x')); }, "xxxxxxxxabc"},
        {[](smlBuffer *buffer) { return smlBufferRealloc(buffer, 1); }, "abc"},
        {[](smlBuffer *buffer) { return smlBufferCut(buffer, 1, 1); }, "ac"}};
    smlBuffer *source = bufferOf("abc", 10);
    for (const auto &[change, expected] : changes) {
        smlBuffer *copy = nullptr;
        ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
        EXPECT_EQ(change(copy), QVS_OK);
        EXPECT_EQ(dataOf(copy), expected);
        expectInStep(copy);
        drop(copy);
    }
    drop(source);
}

// Neither reads nor writes anything outside the storage: the sanitizers see to that.
TEST_F(Buffer, ADuplicateWithItsHeadBeforeTheStorageHasNoData)
{
    using Change = qvsResult (*)(smlBuffer *);
    const std::vector<std::pair<Change, std::string>> changes = {
        {[](smlBuffer *buffer) { return append(buffer, "de"); }, "de"},
        {[](smlBuffer *buffer) { return insert(buffer, "de"); }, "de"},
        {[](smlBuffer *buffer) { return smlBufferRealloc(buffer, 1); }, ""},
        {[](smlBuffer *buffer) { return smlBufferShifthead(buffer); }, ""},
        {[](smlBuffer *buffer) { return smlBufferInit(buffer); }, ""},
        {[](smlBuffer *buffer) { return smlBufferPull(buffer, 1); }, ""}};
    smlBuffer *source = bufferAt(3, "abc", 10);
    for (const auto &[change, expected] : changes) {
        smlBuffer *copy = nullptr;
        ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
        EXPECT_EQ(change(copy), QVS_OK);
        EXPECT_EQ(dataOf(copy), expected);
        expectInStep(copy);
        drop(copy);
    }
    smlBuffer *copy = nullptr;
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    uint8_t out[3];
    EXPECT_EQ(smlBufferGetData(copy, out, 3), 4114U);
    EXPECT_EQ(smlBufferGetDataBuffer(copy, 0), nullptr);
    EXPECT_EQ(smlBufferGetDataBuffer(copy, 3), copy->pStorage);
    EXPECT_EQ(smlBufferPull(copy, 3), QVS_OK);
    EXPECT_EQ(copy->pHead, copy->pStorage) << "the head may come back";
    EXPECT_EQ(smlBufferCut(copy, 0, 1), 4114U);
    drop(copy);
    drop(source);
}

TEST_F(Buffer, AnOverdrawnBufferIsEmptyToWhatChangesIt)
{
    using Change = qvsResult (*)(smlBuffer *);
    const std::vector<std::pair<Change, std::string>> changes = {
        {[](smlBuffer *buffer) { return append(buffer, "de"); }, "de"},
        {[](smlBuffer *buffer) { return append(buffer, "0123456789"); }, "0123456789"},
        {[](smlBuffer *buffer) { return insert(buffer, "de"); }, "de"},
        {[](smlBuffer *buffer) { return insert(buffer, "0123456789"); }, "0123456789"},
        {[](smlBuffer *buffer) { return smlBufferRealloc(buffer, 1); }, ""},
        {[](smlBuffer *buffer) { return smlBufferShifthead(buffer); }, ""},
        {[](smlBuffer *buffer) { return smlBufferPull(buffer, 100); }, ""}};
    for (const uint32_t over : {1U, 7U}) {
        for (const auto &[change, expected] : changes) {
            smlBuffer *buffer = overdrawn(over);
            EXPECT_EQ(change(buffer), QVS_OK);
            EXPECT_EQ(dataOf(buffer), expected);
            expectInStep(buffer);
            drop(buffer);
        }
        smlBuffer *buffer = overdrawn(over);
        EXPECT_EQ(smlBufferCut(buffer, 0, 1), 4114U);
        drop(buffer);
        buffer = overdrawn(over);
        const uint8_t *head = buffer->pHead;
        EXPECT_EQ(smlBufferPull(buffer, 100), QVS_OK);
        EXPECT_EQ(buffer->pHead, head) << "nothing was there to be consumed";
        drop(buffer);
    }
}

TEST_F(Buffer, AnOverdrawnBufferGivesNoData)
{
    smlBuffer *buffer = overdrawn(2);
    uint8_t out[10];
    EXPECT_EQ(smlBufferGetData(buffer, out, 1), 4114U);
    EXPECT_EQ(smlBufferGetData(buffer, out, 10), 4114U);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 0), buffer->pStorage + 5);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 5), buffer->pEnd);
    EXPECT_EQ(smlBufferGetDataBuffer(buffer, 6), nullptr);
    drop(buffer);
}

TEST(Kept, append_exact_fit)
{
    const blocks::BlockCheck check;
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(append(buffer, "3456789"), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 10U + 512U);
    EXPECT_EQ(append(buffer, std::string(512, 'x')), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 522U + 512U + 256U);
    EXPECT_EQ(dataOf(buffer), "abc3456789" + std::string(512, 'x'));
    drop(buffer);
}

TEST(Kept, cut_clears_head)
{
    const blocks::BlockCheck check;
    smlBuffer *buffer = bufferOf("abcde", 10);
    EXPECT_EQ(smlBufferCut(buffer, 2, 3), QVS_OK);
    EXPECT_EQ(smlBufferGetDataSize(buffer), 2U);
    EXPECT_EQ(storageOf(buffer), zeros(3) + "de" + zeros(5));
    drop(buffer);
}

TEST(Kept, pull_unchecked)
{
    const blocks::BlockCheck check;
    smlBuffer *buffer = bufferOf("abc", 10);
    EXPECT_EQ(smlBufferPull(buffer, 5), QVS_OK);
    EXPECT_EQ(smlBufferGetDataSize(buffer), 0xFFFFFFFEU);
    EXPECT_EQ(buffer->pHead, buffer->pStorage + 5);
    EXPECT_EQ(buffer->pTail, buffer->pStorage + 3);
    EXPECT_EQ(smlBufferGetRemainSize(buffer), 7U);
    EXPECT_EQ(smlBufferPull(buffer, 5), QVS_OK);
    EXPECT_EQ(smlBufferGetDataSize(buffer), 0xFFFFFFF9U);
    EXPECT_EQ(buffer->pHead, buffer->pEnd);
    EXPECT_EQ(append(buffer, "z"), QVS_OK);
    EXPECT_EQ(buffer->nCapacity, 10U + 512U) << "the head stayed where it was";
    EXPECT_EQ(dataOf(buffer), "z");
    drop(buffer);
}

TEST(Kept, duplicate_mirrored)
{
    const blocks::BlockCheck check;
    smlBuffer *source = bufferAt(2, "abc", 10);
    smlBuffer *copy = nullptr;
    ASSERT_EQ(smlBufferDuplicate(&copy, source), QVS_OK);
    EXPECT_EQ(between(copy->pStorage, copy->pHead), -2);
    EXPECT_EQ(between(copy->pStorage, copy->pTail), -5);
    EXPECT_EQ(copy->nSize, 3U);
    EXPECT_EQ(smlBufferGetRemainSize(copy), 15U);
    drop(copy);
    drop(source);
}
