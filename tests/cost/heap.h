// The heap of the library, in bytes that it takes from the C library: what was asked for, rounded
// up, and the header of each block. Nothing is counted before the first startHeap(). A program is
// linked with -Wl,--wrap=malloc,--wrap=calloc,--wrap=realloc,--wrap=free, which catches the calls
// of the library's object files.
#pragma once

#include <cstddef>

namespace cost {

// The most bytes that were in use at a time since startHeap().
std::size_t peakHeap();

// The bytes, and the blocks, that are in use now, counted from startHeap() on.
std::size_t heapInUse();
std::size_t blocksInUse();

void startHeap();

} // namespace cost
