// Pieces and the blocks that they share.
#include "qvsArena.h"

#include "qvsmemory.h"

#include <stddef.h>
#include <string.h>

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvsArena";

// From 1 KB on the C library joins its free small blocks for each that it is asked for.
constexpr uint32_t kBlockSize = 960;
static_assert(kBlockSize >= sizeof(void *) + kLargestPiece);

} // namespace

bool addBlock(qvsArena *arena)
{
    auto *block = static_cast<char *>(newBlock(kBlockSize, kModule));
    if (!block) {
        return false;
    }
    memcpy(block, &arena->blocks, sizeof arena->blocks);
    arena->blocks = block;
    arena->next = block + sizeof arena->blocks;
    arena->end = block + kBlockSize;
    return true;
}

void *newPiece(qvsArena *arena, uint32_t size, const char *module, uint32_t spare, int line)
{
    if (!arena) {
        return newCleared(size - spare, spare, module, line);
    }
    char *piece = takeRoom(arena, size);
    return piece ? memset(piece, 0, size) : nullptr;
}

void releaseArena(qvsArena *arena)
{
    while (void *block = arena->blocks) {
        memcpy(&arena->blocks, block, sizeof arena->blocks);
        freeBlock(block);
    }
}

} // namespace qvs
