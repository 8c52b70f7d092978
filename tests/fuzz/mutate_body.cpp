// Tells the fuzzer how the input of the body target is changed.
#include "mutator.h"

extern "C" size_t LLVMFuzzerCustomMutator(uint8_t *data, size_t size, size_t maxSize, unsigned seed)
{
    return fuzz::mutateBody(data, size, maxSize, seed);
}

extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t *first, size_t firstSize,
                                            const uint8_t *second, size_t secondSize, uint8_t *out,
                                            size_t maxSize, unsigned seed)
{
    return fuzz::crossBodies(first, firstSize, second, secondSize, out, maxSize, seed);
}
