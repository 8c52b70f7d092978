#include "blocks.h"

#include <stddef.h>

long liveBlocks = 0;
bool counting = false;

#ifdef __SANITIZE_ADDRESS__
const bool blocksAreCounted = false;
#else
const bool blocksAreCounted = true;

extern "C" {

void *__libc_malloc(size_t size);
void *__libc_calloc(size_t count, size_t size);
void *__libc_realloc(void *block, size_t size);
void __libc_free(void *block);

static void *counted(void *block)
{
    if (counting && block) {
        ++liveBlocks;
    }
    return block;
}

void *malloc(size_t size)
{
    return counted(__libc_malloc(size));
}

void *calloc(size_t count, size_t size)
{
    return counted(__libc_calloc(count, size));
}

void *realloc(void *block, size_t size)
{
    return block ? __libc_realloc(block, size) : counted(__libc_malloc(size));
}

void free(void *block)
{
    if (counting && block) {
        --liveBlocks;
    }
    __libc_free(block);
}
}
#endif
