// Heap blocks, each asked for under a source path and line, and plain memory operations. While
// tracking (MEMCHECK) is on, a table of 2000 entries remembers the blocks that were not released.
// Valid C and C++.
#ifndef QVSMEMORY_H
#define QVSMEMORY_H

#include "qvsresult.h"

#include <stdint.h>
#include <stdlib.h>

QVS_BEGIN_DECLS

// ---- Blocks. `file` is the caller's source path, which is not copied and has to outlive the
// block while tracking is on; `line` is the line in it. Every block belongs to the caller, who
// releases it with qvsMemFree_debug; without memory the answer is null.

// qvsMemAlloc_debug gives a block of `size` bytes, not cleared.
QVS_API void *qvsMemAlloc_debug(uint32_t size, const char *file, int line);

// qvsMemAllocSetZero_debug gives a block of `size` bytes, all zero.
QVS_API void *qvsMemAllocSetZero_debug(uint32_t size, const char *file, int line);

// qvsMemAllocW_debug gives a block of `count` 16-bit units, not cleared.
QVS_API uint16_t *qvsMemAllocW_debug(uint32_t count, const char *file, int line);

// qvsStrdup_debug gives a copy of a NUL-terminated text, followed by four more zero bytes. Null
// for a null text.
QVS_API char *qvsStrdup_debug(const char *str, const char *file, int line);

// qvsMemDup_debug gives a copy of `size` bytes. Null for a null source.
QVS_API void *qvsMemDup_debug(const void *src, uint32_t size, const char *file, int line);

// qvsMemReAlloc_debug gives a new block with the first `newsize` bytes of `old`, which must have
// that many, and releases `old`. Null, with `old` untouched, for a null `old`, a size of 0, or
// without memory.
QVS_API void *qvsMemReAlloc_debug(void *old, uint32_t newsize, const char *file, int line);

// qvsMemFree_debug releases a block; null is ignored.
QVS_API void qvsMemFree_debug(void *ptr);

// ---- Tracking, for the host; off at the start. The 2001st block in use is not tracked.

// qvsMemStartMemCheck turns tracking on with an empty table; it stays off without memory.
QVS_API void qvsMemStartMemCheck(void);

// qvsMemEndMemCheck prints one line per block that was not released on standard output, and turns
// tracking off. Nothing happens when it is off.
QVS_API void qvsMemEndMemCheck(void);

// ---- Memory, as the C library's memset, memcpy, memmove and memcmp; `n` counts bytes, in the two
// functions that end in W 16-bit units. They return `dst`.

QVS_API void *qvsMemSet(void *dst, int byte, uint32_t n);
QVS_API void *qvsMemSetZero(void *dst, uint32_t n);
QVS_API void *qvsMemCpy(void *dst, const void *src, uint32_t n);
QVS_API void *qvsMemMove(void *dst, const void *src, uint32_t n);
QVS_API int qvsMemCmp(const void *a, const void *b, uint32_t n);
QVS_API uint16_t *qvsMemSetW(uint16_t *dst, uint16_t unit, uint32_t n);

// qvsMemCpyW copies `n` 16-bit units that do not overlap. Null when either pointer is null.
QVS_API uint16_t *qvsMemCpyW(uint16_t *dst, const uint16_t *src, uint32_t n);

QVS_END_DECLS

#ifdef __cplusplus
namespace [[gnu::visibility("hidden")]] qvs {

// A text handed to the Java VM may end in a cut multi-byte sequence, which leads its reader up to
// four bytes behind the terminator. They are zero in every text of a context; a text of a tree that
// a session decodes has room for them.
constexpr uint32_t kSpareZeros = 4;

// Whether blocks are tracked.
extern bool tracking;

// The blocks of all functions here that could not be had since the library was loaded. What was
// made while it grew may lack something.
extern uint32_t refusals;

// Counts one; null.
[[gnu::cold, gnu::noinline]] void *refused();

// A block that is not tracked.
inline void *requested(size_t size)
{
    if (void *block = malloc(size)) {
        return block;
    }
    return refused();
}

// qvsMemAlloc_debug and qvsMemFree_debug where a parse spends its time: with one test of tracking,
// and no call but the C library's.
inline void *newBlock(uint32_t size, const char *module, int line = __builtin_LINE())
{
    return tracking ? qvsMemAlloc_debug(size, module, line) : requested(size);
}

// A zero-filled block with `spare` bytes more, which its tracked size leaves out.
void *newCleared(uint32_t size, uint32_t spare, const char *module, int line);

// A block for a text of `size` bytes with its terminator, and kSpareZeros more.
inline char *newText(uint32_t size, const char *module, int line = __builtin_LINE())
{
    return static_cast<char *>(tracking ? newCleared(size, kSpareZeros, module, line)
                                        : requested(size + kSpareZeros));
}

inline void freeBlock(void *block)
{
    if (tracking) {
        qvsMemFree_debug(block);
    } else {
        free(block);
    }
}

// Zero-filled record with `spare` bytes behind it, tracked under the module that asked for it and
// the line it asked on. Null without memory.
template <class Record>
Record *newRecord(const char *module, uint32_t spare = 0, int line = __builtin_LINE())
{
    return static_cast<Record *>(qvsMemAllocSetZero_debug(sizeof(Record) + spare, module, line));
}

} // namespace qvs
#endif

#endif
