// Mutations that know the format: whole characteristics and parameters come, go and change places,
// tokens and values are exchanged, numbers and flags lie. Plain bytes are changed as well.
#pragma once

#include <cstddef>
#include <cstdint>

namespace fuzz {

// Each changes the `size` bytes at `data` in place, to at most `maxSize`, and returns their new
// count. The same seed makes the same change.
size_t mutateBody(uint8_t *data, size_t size, size_t maxSize, unsigned seed);
size_t mutateMessage(uint8_t *data, size_t size, size_t maxSize, unsigned seed);

// Puts elements of a second body into the first. Returns the count of bytes at `out`.
size_t crossBodies(const uint8_t *first, size_t firstSize, const uint8_t *second, size_t secondSize,
                   uint8_t *out, size_t maxSize, unsigned seed);
size_t crossMessages(const uint8_t *first, size_t firstSize, const uint8_t *second,
                     size_t secondSize, uint8_t *out, size_t maxSize, unsigned seed);

} // namespace fuzz
