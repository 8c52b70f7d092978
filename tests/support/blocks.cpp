// The wrapped heap functions. Built with -fno-builtin: at -O2 a compiler turns malloc and memset
// into calloc.
#include "blocks.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <unordered_map>

extern "C" {
void *__real_malloc(std::size_t size);
void *__real_calloc(std::size_t count, std::size_t size);
void *__real_realloc(void *block, std::size_t size);
void __real_free(void *block);
}

namespace blocks {

long failAt = -1;
bool failFromThenOn = false;
std::function<void(const void *block)> onRelease;

namespace {

// What a fenced block lies in.
struct Pages {
    void *start;
    std::size_t size;
};

// What is counted. Never destroyed: blocks are released until the very end of the program.
struct Heap {
    std::unordered_map<void *, std::size_t> sizes;
    std::size_t bytes = 0;
    std::size_t peak = 0;
    std::size_t calls = 0;
    std::size_t total = 0;
    bool failing = false;
    bool fencing = false;
    std::unordered_map<void *, Pages> fenced;
};

Heap &heap()
{
    static Heap *counted = new Heap;
    return *counted;
}

bool fails()
{
    if (failAt >= 0) {
        heap().failing = failAt-- == 0;
        return heap().failing;
    }
    return heap().failing && failFromThenOn;
}

void *added(void *block, std::size_t size)
{
    if (block) {
        heap().sizes[block] = size;
        heap().bytes += size;
        heap().peak = std::max(heap().peak, heap().bytes);
        ++heap().calls;
        heap().total += size;
    }
    return block;
}

// A block that ends with a page, in front of one that cannot be touched. It is aligned for
// pointers.
void *fencedBlock(std::size_t size)
{
    const std::size_t page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
    const std::size_t room = (size / page + 1) * page;
    void *start =
        mmap(nullptr, room + page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (start == MAP_FAILED) {
        return nullptr;
    }
    char *end = static_cast<char *>(start) + room;
    if (mprotect(end, page, PROT_NONE) != 0) {
        std::abort();
    }
    char *block = end - (size + alignof(void *) - 1) / alignof(void *) * alignof(void *);
    heap().fenced[block] = {start, room + page};
    return block;
}

bool isFenced(void *block)
{
    return heap().fenced.count(block) != 0;
}

void releaseFenced(void *block)
{
    const auto known = heap().fenced.find(block);
    munmap(known->second.start, known->second.size);
    heap().fenced.erase(known);
}

// A block that was allocated elsewhere is none of ours.
void removed(void *block)
{
    const auto known = heap().sizes.find(block);
    if (known != heap().sizes.end()) {
        if (onRelease) {
            onRelease(block);
        }
        heap().bytes -= known->second;
        heap().sizes.erase(known);
    }
}

} // namespace

Fence::Fence() : before(heap().fencing)
{
    heap().fencing = true;
}

Fence::~Fence()
{
    heap().fencing = before;
}

void reset()
{
    failAt = -1;
    heap().failing = false;
}

std::size_t live()
{
    return heap().sizes.size();
}

std::size_t liveBytes()
{
    return heap().bytes;
}

std::size_t peakBytes()
{
    return heap().peak;
}

std::size_t allocations()
{
    return heap().calls;
}

std::size_t allocated()
{
    return heap().total;
}

std::set<void *> all()
{
    std::set<void *> blocks;
    for (const auto &known : heap().sizes) {
        blocks.insert(known.first);
    }
    return blocks;
}

void startCounting()
{
    heap().peak = heap().bytes;
    heap().calls = 0;
    heap().total = 0;
}

} // namespace blocks

extern "C" {

void *__wrap_malloc(std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    return blocks::added(blocks::heap().fencing ? blocks::fencedBlock(size) : __real_malloc(size),
                         size);
}

void *__wrap_calloc(std::size_t count, std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    void *block = blocks::heap().fencing ? blocks::fencedBlock(count * size) // pages are zero
                                         : __real_calloc(count, size);
    return blocks::added(block, count * size);
}

void *__wrap_realloc(void *block, std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    if (blocks::heap().fencing || blocks::isFenced(block)) {
        std::abort(); // nothing in the library moves a block
    }
    blocks::removed(block);
    return blocks::added(__real_realloc(block, size), size);
}

void __wrap_free(void *block)
{
    blocks::removed(block);
    if (blocks::isFenced(block)) {
        blocks::releaseFenced(block);
    } else {
        __real_free(block);
    }
}
}
