// The heap functions that stand before those of the C library. Built with -fno-builtin: at -O2 a
// compiler turns malloc and memset into calloc.
#include "heap.h"

#include <malloc.h>
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>

#ifdef OMACP_HEAP_OF_THE_PROCESS
#define HERE(function) function
#define REAL(function) __libc_##function
#else
#define HERE(function) __wrap_##function
#define REAL(function) __real_##function
#endif

extern "C" {
void *REAL(malloc)(std::size_t size);
void *REAL(calloc)(std::size_t count, std::size_t size);
void *REAL(realloc)(void *block, std::size_t size);
void REAL(free)(void *block);
}

namespace blocks {

#ifdef OMACP_HEAP_OF_THE_PROCESS
bool counting = false;
#else
bool counting = true;
#endif
long failAt = -1;
bool failFromThenOn = false;
bool dirty = false;
std::function<void(const void *block)> onRelease;

namespace {

struct Block {
    void *address; // null: no block
    std::size_t asked;
    std::size_t taken;
    bool fenced;
};

// The live blocks: a table with open addressing, which takes its own memory from the C library. An
// entry that is taken out is filled by a later one, so that a search may end at the first gap.
class Table {
public:
    std::size_t size() const { return used; }

    const Block *find(const void *address) const
    {
        const Block *entry = used && address ? &entries[place(address)] : nullptr;
        return entry && entry->address ? entry : nullptr;
    }

    void insert(const Block &block)
    {
        if (2 * (used + 1) > room) {
            resize(room ? 2 * room : kLeastRoom);
        }
        entries[place(block.address)] = block;
        ++used;
    }

    void erase(const Block *block)
    {
        std::size_t gap = static_cast<std::size_t>(block - entries);
        for (std::size_t i = next(gap); entries[i].address; i = next(i)) {
            const std::size_t home = hash(entries[i].address);
            if (((i - home) & (room - 1)) >= ((i - gap) & (room - 1))) {
                entries[gap] = entries[i];
                gap = i;
            }
        }
        entries[gap] = {};
        --used;
        if (room > kLeastRoom && 8 * used < room) {
            resize(room / 2); // it is walked as a whole
        }
    }

    template <class Visit>
    void forEach(Visit visit) const
    {
        for (std::size_t i = 0; i < room; ++i) {
            if (entries[i].address) {
                visit(entries[i]);
            }
        }
    }

    void clear()
    {
        REAL(free)(entries);
        entries = nullptr;
        room = 0;
        used = 0;
    }

private:
    static constexpr std::size_t kLeastRoom = 1024;

    // Addresses are spread by multiplication.
    std::size_t hash(const void *address) const
    {
        const std::uint64_t key =
            reinterpret_cast<std::uintptr_t>(address) * std::uint64_t{0x9E3779B97F4A7C15};
        return static_cast<std::size_t>(key >> 32) & (room - 1);
    }

    std::size_t next(std::size_t i) const { return (i + 1) & (room - 1); }

    // The entry of an address, or the gap where it belongs.
    std::size_t place(const void *address) const
    {
        std::size_t i = hash(address);
        while (entries[i].address && entries[i].address != address) {
            i = next(i);
        }
        return i;
    }

    void resize(std::size_t newRoom)
    {
        Block *const old = entries;
        const std::size_t oldRoom = room;
        room = newRoom;
        entries = static_cast<Block *>(REAL(calloc)(room, sizeof(Block)));
        if (!entries) {
            std::abort();
        }
        for (std::size_t i = 0; i < oldRoom; ++i) {
            if (old[i].address) {
                entries[place(old[i].address)] = old[i];
            }
        }
        REAL(free)(old);
    }

    Block *entries = nullptr;
    std::size_t room = 0; // a power of two
    std::size_t used = 0;
};

// What is counted. Blocks are released until the very end of the program.
Table table;
std::size_t bytes;
std::size_t bytesTaken;
std::size_t peakTaken;
std::size_t calls;
std::size_t total;
bool failing;
bool fencing;

bool fails()
{
    if (failAt >= 0) {
        failing = failAt-- == 0;
        return failing;
    }
    return failing && failFromThenOn;
}

void *added(void *block, std::size_t size, bool fenced = false)
{
    if (block && counting) {
        const std::size_t taken = (fenced ? size : malloc_usable_size(block)) + sizeof(size_t);
        table.insert({block, size, taken, fenced});
        bytes += size;
        bytesTaken += taken;
        peakTaken = std::max(peakTaken, bytesTaken);
        ++calls;
        total += size;
    }
    return block;
}

std::size_t pageSize()
{
    return static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
}

// The pages of a fenced block, of which the last cannot be touched.
std::size_t roomFor(std::size_t size)
{
    return (size / pageSize() + 2) * pageSize();
}

// Bytes up to a multiple of the size of a pointer.
std::size_t aligned(std::size_t size)
{
    return (size + alignof(void *) - 1) / alignof(void *) * alignof(void *);
}

// A block of zeros that ends with a page, in front of one that cannot be touched.
void *fencedBlock(std::size_t size)
{
    const std::size_t room = roomFor(size);
    void *start = mmap(nullptr, room, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (start == MAP_FAILED) {
        return nullptr;
    }
    char *end = static_cast<char *>(start) + room - pageSize();
    if (mprotect(end, pageSize(), PROT_NONE) != 0) {
        std::abort();
    }
    return added(end - aligned(size), size, true);
}

void release(void *address, const Block &block)
{
    if (block.fenced) {
        char *start = static_cast<char *>(address) + aligned(block.asked) + pageSize();
        munmap(start - roomFor(block.asked), roomFor(block.asked));
    } else {
        REAL(free)(address);
    }
}

// Takes a block out; one that was allocated elsewhere is none of ours.
Block removed(void *block)
{
    const Block *known = table.find(block);
    if (!known) {
        return {};
    }
    if (onRelease) {
        onRelease(block);
    }
    const Block copy = *known;
    bytes -= copy.asked;
    bytesTaken -= copy.taken;
    table.erase(known);
    return copy;
}

} // namespace

Fence::Fence() : before(fencing)
{
    fencing = true;
}

Fence::~Fence()
{
    fencing = before;
}

void reset()
{
    failAt = -1;
    failing = false;
}

std::size_t live()
{
    return table.size();
}

std::size_t liveBytes()
{
    return bytes;
}

std::size_t liveBytesTaken()
{
    return bytesTaken;
}

std::size_t peakBytesTaken()
{
    return peakTaken;
}

std::size_t allocations()
{
    return calls;
}

std::size_t allocated()
{
    return total;
}

bool isLive(const void *block)
{
    return table.find(block) != nullptr;
}

std::set<void *> all()
{
    std::set<void *> blocks;
    table.forEach([&](const Block &block) { blocks.insert(block.address); });
    return blocks;
}

void releaseAll()
{
    if (table.size() == 0) {
        return;
    }
    table.forEach([](const Block &block) { release(block.address, block); });
    table.clear();
    bytes = 0;
    bytesTaken = 0;
}

void startCounting()
{
    peakTaken = bytesTaken;
    calls = 0;
    total = 0;
}

} // namespace blocks

// The address sanitizer brings a heap of its own.
#if !defined(OMACP_HEAP_OF_THE_PROCESS) || !defined(__SANITIZE_ADDRESS__)
extern "C" {

void *HERE(malloc)(std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    void *block =
        blocks::fencing ? blocks::fencedBlock(size) : blocks::added(REAL(malloc)(size), size);
    return block && blocks::dirty ? memset(block, 0xEE, size) : block;
}

void *HERE(calloc)(std::size_t count, std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    return blocks::fencing ? blocks::fencedBlock(count * size)
                           : blocks::added(REAL(calloc)(count, size), count * size);
}

void *HERE(realloc)(void *block, std::size_t size)
{
    if (blocks::fails()) {
        return nullptr;
    }
    if (blocks::fencing || blocks::removed(block).fenced) {
        std::abort(); // nothing in the library moves a block
    }
    return blocks::added(REAL(realloc)(block, size), size);
}

void HERE(free)(void *block)
{
    blocks::release(block, blocks::removed(block));
}
}
#endif
