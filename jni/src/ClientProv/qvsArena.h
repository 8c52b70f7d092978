// Memory for pieces that are released together, in a few blocks. The tree of a session comes from
// one: nobody else sees it, and it goes as a whole. Private, C++ only.
#ifndef QVSARENA_H
#define QVSARENA_H

#include <stddef.h>
#include <stdint.h>

// Where a function takes an arena, null stands for pieces that are blocks of their own.
struct qvsArena {
    char *next; // the free room
    char *end;
    void *blocks = nullptr; // the last block, which begins with the address of the one before it
};

namespace [[gnu::visibility("hidden")]] qvs {

// The largest piece that an arena gives, in bytes.
constexpr uint32_t kLargestPiece = 512;

// Makes room in a new block. False without memory.
bool addBlock(qvsArena *arena);

// A cleared piece of `size` bytes: a multiple of the size of a pointer, kLargestPiece at most. One
// that is a block of its own is tracked under the module and the line that asked for it, without
// the `spare` bytes at its end. Null without memory.
void *newPiece(qvsArena *arena, uint32_t size, const char *module, uint32_t spare = 0,
               int line = __builtin_LINE());

// Room for a piece of an arena, not cleared.
inline char *takeRoom(qvsArena *arena, uint32_t size)
{
    if (arena->end - arena->next < static_cast<ptrdiff_t>(size) && !addBlock(arena)) [[unlikely]] {
        return nullptr;
    }
    char *room = arena->next;
    arena->next += size;
    return room;
}

// Releases all blocks of an arena, and so its pieces.
void releaseArena(qvsArena *arena);

} // namespace qvs

#endif
