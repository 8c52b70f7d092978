// Heap blocks with their tracking table, and plain memory operations over the C library's.
#include "qvsmemory.h"

#include <stdio.h>
#include <stdlib.h>
#include <string.h>

bool qvs::tracking = false;
uint32_t qvs::refusals = 0;

void *qvs::refused()
{
    ++refusals;
    return nullptr;
}

namespace {

// One block in use; free while the address is null.
struct Entry {
    void *address;
    uint32_t size;
    const char *file;
    int line;
};

constexpr uint32_t kEntries = 2000;

static_assert(sizeof(void *) != 4 || kEntries * sizeof(Entry) == 32000);

Entry *entries; // null while tracking is off

// Free entries are those of the address null.
Entry *findEntry(const void *address)
{
    for (Entry *entry = entries; entry != entries + kEntries; ++entry) {
        if (entry->address == address) {
            return entry;
        }
    }
    return nullptr;
}

void remember(void *block, uint32_t size, const char *file, int line)
{
    Entry *entry = findEntry(nullptr);
    if (!entry) {
        puts("[syncml] MEMCHECK Not Found Empty Index");
        return;
    }
    *entry = {block, size, file, line};
}

[[gnu::cold, gnu::noinline]] void forget(const void *block)
{
    Entry *entry = findEntry(block);
    if (!entry) {
        puts("[syncml] MEMCHECK Not Found Address ");
        return;
    }
    *entry = {};
}

// The block, remembered if there is one. Apart, since a host tracks rarely.
[[gnu::cold, gnu::noinline]] void *remembered(void *block, uint32_t size, const char *file,
                                              int line)
{
    if (block) {
        remember(block, size, file, line);
    }
    return block;
}

// Blocks up to this size come from a cache of the C library's that calloc passes by.
constexpr uint32_t kClearedByHand = 512;

[[gnu::always_inline]] inline void *cleared(uint32_t size)
{
    if (size > kClearedByHand) {
        if (void *block = calloc(1, size)) {
            return block;
        }
        return qvs::refused();
    }
    void *block = malloc(size);
    asm("" : "+r"(block)); // keeps a compiler from making a calloc of the two
    return block ? memset(block, 0, size) : qvs::refused();
}

[[gnu::cold, gnu::noinline]] void *clearedTracked(uint32_t size, const char *file, int line)
{
    return remembered(cleared(size), size, file, line);
}

[[gnu::always_inline]] inline char *copyOf(const char *str, size_t length)
{
    char *block = static_cast<char *>(qvs::requested(length + 1 + qvs::kSpareZeros));
    if (block) {
        memcpy(block, str, length);
        // hardened: four zero bytes follow the terminator.
        memset(block + length, 0, 1 + qvs::kSpareZeros);
    }
    return block;
}

[[gnu::cold, gnu::noinline]] char *copyTracked(const char *str, const char *file, int line)
{
    const size_t length = strlen(str);
    // kept[memcheck-text-length]: the size that is remembered leaves the terminator out.
    return static_cast<char *>(
        remembered(copyOf(str, length), static_cast<uint32_t>(length), file, line));
}

} // namespace

// Without tracking each of these is the C library's function and one test.

void *qvsMemAlloc_debug(uint32_t size, const char *file, int line)
{
    void *block = qvs::requested(size);
    return qvs::tracking ? remembered(block, size, file, line) : block;
}

void *qvs::newCleared(uint32_t size, uint32_t spare, const char *module, int line)
{
    void *block = cleared(size + spare);
    return tracking ? remembered(block, size, module, line) : block;
}

void *qvsMemAllocSetZero_debug(uint32_t size, const char *file, int line)
{
    return qvs::tracking ? clearedTracked(size, file, line) : cleared(size);
}

uint16_t *qvsMemAllocW_debug(uint32_t count, const char *file, int line)
{
    // hardened: a count whose bytes cannot be counted in 32 bits gives null.
    if (count > UINT32_MAX / sizeof(uint16_t)) {
        return nullptr;
    }
    void *block = qvs::requested(count * sizeof(uint16_t));
    // kept[memcheck-unit-count]: the size that is remembered is the count of units, not of bytes.
    return static_cast<uint16_t *>(qvs::tracking ? remembered(block, count, file, line) : block);
}

char *qvsStrdup_debug(const char *str, const char *file, int line)
{
    // hardened: the copy of nothing is null.
    if (!str) {
        return nullptr;
    }
    return qvs::tracking ? copyTracked(str, file, line) : copyOf(str, strlen(str));
}

void *qvsMemDup_debug(const void *src, uint32_t size, const char *file, int line)
{
    // hardened: the copy of nothing is null.
    if (!src) {
        return nullptr;
    }
    void *block = qvs::requested(size);
    // hardened: without memory nothing is copied.
    if (!block) {
        return nullptr;
    }
    memcpy(block, src, size);
    return qvs::tracking ? remembered(block, size, file, line) : block;
}

void *qvsMemReAlloc_debug(void *old, uint32_t newsize, const char *file, int line)
{
    // kept[realloc-to-nothing]: a size of 0 gives null and releases nothing.
    if (!old || newsize == 0) {
        return nullptr;
    }
    // hardened: without memory the old block stays as it is.
    void *block = qvsMemDup_debug(old, newsize, file, line);
    if (block) {
        qvsMemFree_debug(old);
    }
    return block;
}

void qvsMemFree_debug(void *ptr)
{
    if (qvs::tracking && ptr) {
        forget(ptr);
    }
    free(ptr);
}

void qvsMemStartMemCheck(void)
{
    // hardened: a second start empties the table that is there.
    if (entries) {
        memset(entries, 0, kEntries * sizeof(Entry));
        return;
    }
    // hardened: without a table tracking stays off.
    entries = static_cast<Entry *>(calloc(kEntries, sizeof(Entry)));
    qvs::tracking = entries != nullptr;
}

void qvsMemEndMemCheck(void)
{
    if (!entries) {
        return;
    }
    for (Entry *entry = entries; entry != entries + kEntries; ++entry) {
        if (entry->address) {
            // hardened: a caller without a path has an empty one.
            const char *file = entry->file ? entry->file : "";
            printf("[syncml] MEMCHECK Filename:%s Line:%d Size:%d \n", file, entry->line,
                   static_cast<int>(entry->size));
        }
    }
    free(entries);
    entries = nullptr;
    qvs::tracking = false;
}

void *qvsMemSet(void *dst, int byte, uint32_t n)
{
    return memset(dst, byte, n);
}

void *qvsMemSetZero(void *dst, uint32_t n)
{
    return memset(dst, 0, n);
}

void *qvsMemCpy(void *dst, const void *src, uint32_t n)
{
    return memcpy(dst, src, n);
}

void *qvsMemMove(void *dst, const void *src, uint32_t n)
{
    return memmove(dst, src, n);
}

int qvsMemCmp(const void *a, const void *b, uint32_t n)
{
    return memcmp(a, b, n);
}

uint16_t *qvsMemSetW(uint16_t *dst, uint16_t unit, uint32_t n)
{
    for (uint32_t i = 0; i < n; ++i) {
        dst[i] = unit;
    }
    return dst;
}

uint16_t *qvsMemCpyW(uint16_t *dst, const uint16_t *src, uint32_t n)
{
    if (!dst || !src) {
        return nullptr;
    }
    memcpy(dst, src, size_t{n} * sizeof(uint16_t));
    return dst;
}
