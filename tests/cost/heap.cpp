#include "heap.h"

#include <malloc.h>

extern "C" {
void *__real_malloc(std::size_t size);
void *__real_calloc(std::size_t count, std::size_t size);
void *__real_realloc(void *block, std::size_t size);
void __real_free(void *block);
}

namespace cost {

namespace {

bool counting;
std::size_t used;
std::size_t peak;
std::size_t blocks;

std::size_t taken(void *block)
{
    constexpr std::size_t kHeader = sizeof(std::size_t);
    return malloc_usable_size(block) + kHeader;
}

void *added(void *block)
{
    if (counting && block) {
        ++blocks;
        used += taken(block);
        peak = used > peak ? used : peak;
    }
    return block;
}

void removed(void *block)
{
    if (counting && block) {
        --blocks;
        used -= taken(block);
    }
}

} // namespace

std::size_t peakHeap()
{
    return peak;
}

std::size_t heapInUse()
{
    return used;
}

std::size_t blocksInUse()
{
    return blocks;
}

void startHeap()
{
    counting = true;
    used = 0;
    peak = 0;
    blocks = 0;
}

} // namespace cost

extern "C" {

void *__wrap_malloc(std::size_t size)
{
    return cost::added(__real_malloc(size));
}

void *__wrap_calloc(std::size_t count, std::size_t size)
{
    return cost::added(__real_calloc(count, size));
}

void *__wrap_realloc(void *block, std::size_t size)
{
    cost::removed(block);
    return cost::added(__real_realloc(block, size));
}

void __wrap_free(void *block)
{
    cost::removed(block);
    __real_free(block);
}
}
