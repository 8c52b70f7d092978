// What the fuzz targets share: the function that each of them defines, and its input.
#pragma once

#include "check.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <memory>

// Runs one input. Ends the program when a property does not hold.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);

namespace fuzz {

// A copy of the input in a block of just its size, so that a sanitizer sees every byte that is read
// behind it.
class Input {
public:
    Input(const uint8_t *bytes, size_t size) : count(size), block(new uint8_t[size])
    {
        std::copy_n(bytes, size, block.get());
    }
    Input(const Input &other) : Input(other.block.get(), other.count) {}
    Input &operator=(const Input &) = delete;

    const uint8_t *data() const { return block.get(); }
    uint32_t size() const { return static_cast<uint32_t>(count); }

    // Nothing may still be read from the input.
    void overwrite() { std::fill_n(block.get(), count, uint8_t{0xA5}); }

    void checkUnchanged(const Input &original) const
    {
        check(std::equal(block.get(), block.get() + count, original.data()),
              "the bytes of the message are unchanged");
    }

private:
    size_t count;
    std::unique_ptr<uint8_t[]> block;
};

} // namespace fuzz
