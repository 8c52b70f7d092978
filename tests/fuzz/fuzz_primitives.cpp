// The byte readers, the string functions, lists, buffers, blocks and traces, on anything. The first
// byte of an input chooses which, the others are a script for it.
#include "check.h"
#include "script.h"
#include "support/heap.h"
#include "target.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    using Run = void (*)(fuzz::Script * script);
    constexpr Run kRuns[] = {fuzz::runDecoder, fuzz::runStrings, fuzz::runWideStrings,
                             fuzz::runList,    fuzz::runBuffer,  fuzz::runMemory};
    fuzz::Script script(data, size);
    kRuns[script.below(sizeof kRuns / sizeof *kRuns)](&script);
    fuzz::check(blocks::live() == 0, "no block is left", blocks::live());
    return 0;
}
