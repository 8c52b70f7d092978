// The wrapped heap functions and the table of live blocks. Built with -fno-builtin: at -O2 a
// compiler turns malloc and memset into calloc.
#include "heap.h"

#include "check.h"

#include <cstdint>
#include <vector>

extern "C" {
void *__real_malloc(std::size_t size);
void *__real_calloc(std::size_t count, std::size_t size);
void *__real_realloc(void *block, std::size_t size);
void __real_free(void *block);
}

namespace fuzz::heap {

namespace {

// A table of addresses with open addressing. An entry that is taken out is filled by a later one,
// so that a search may end at the first gap.
class Table {
public:
    Table() : entries(1024) {}

    std::size_t size() const { return used; }

    bool has(const void *block) const { return block && entries[find(block)] == block; }

    void insert(void *block)
    {
        if (2 * (used + 1) > entries.size()) {
            grow();
        }
        entries[find(block)] = block;
        ++used;
    }

    bool erase(const void *block)
    {
        std::size_t gap = find(block);
        if (!block || !entries[gap]) {
            return false;
        }
        --used;
        for (std::size_t i = next(gap); entries[i]; i = next(i)) {
            const std::size_t home = place(entries[i]);
            if (((i - home) & (entries.size() - 1)) >= ((i - gap) & (entries.size() - 1))) {
                entries[gap] = entries[i];
                gap = i;
            }
        }
        entries[gap] = nullptr;
        return true;
    }

    std::vector<void *> takeAll()
    {
        std::vector<void *> all;
        for (void *&entry : entries) {
            if (entry) {
                all.push_back(entry);
                entry = nullptr;
            }
        }
        used = 0;
        return all;
    }

private:
    // NOLINTNEXTLINE: addresses are spread by multiplication.
    std::size_t place(const void *block) const
    {
        const std::uint64_t key = reinterpret_cast<std::uintptr_t>(block) * 0x9E3779B97F4A7C15ULL;
        return static_cast<std::size_t>(key >> 32) & (entries.size() - 1);
    }

    std::size_t next(std::size_t i) const { return (i + 1) & (entries.size() - 1); }

    std::size_t find(const void *block) const
    {
        std::size_t i = place(block);
        while (entries[i] && entries[i] != block) {
            i = next(i);
        }
        return i;
    }

    void grow()
    {
        std::vector<void *> old(2 * entries.size());
        old.swap(entries);
        for (void *block : old) {
            if (block) {
                entries[find(block)] = block;
            }
        }
    }

    std::vector<void *> entries; // a power of two of them
    std::size_t used = 0;
};

// Never destroyed: blocks are released until the very end of the program.
Table &table()
{
    static Table *const blocks = new Table;
    return *blocks;
}

void *added(void *block)
{
    if (block) {
        table().insert(block);
    }
    return block;
}

} // namespace

std::size_t live()
{
    return table().size();
}

bool isLive(const void *block)
{
    return table().has(block);
}

void releaseAll()
{
    if (table().size() == 0) {
        return;
    }
    for (void *block : table().takeAll()) {
        __real_free(block);
    }
}

} // namespace fuzz::heap

extern "C" {

void *__wrap_malloc(std::size_t size)
{
    return fuzz::heap::added(__real_malloc(size));
}

void *__wrap_calloc(std::size_t count, std::size_t size)
{
    return fuzz::heap::added(__real_calloc(count, size));
}

void *__wrap_realloc(void *block, std::size_t size)
{
    fuzz::heap::table().erase(block);
    return fuzz::heap::added(__real_realloc(block, size));
}

void __wrap_free(void *block)
{
    // What was allocated elsewhere is none of the library's.
    fuzz::heap::table().erase(block);
    __real_free(block);
}
}
