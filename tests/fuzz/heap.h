// The blocks of the library, counted. A program is linked with
// -Wl,--wrap=malloc,--wrap=calloc,--wrap=realloc,--wrap=free, which catches the calls of the
// library's object files; the C++ library allocates elsewhere and is not counted.
#pragma once

#include <cstddef>

namespace fuzz::heap {

// Blocks that were allocated and not released.
std::size_t live();

// Whether `block` is one of them.
bool isLive(const void *block);

// Releases all of them: those that stay allocated by design do not add up over a run.
void releaseAll();

} // namespace fuzz::heap
