// The body of a message through the decoder's main function.
#include "check.h"
#include "context.h"
#include "reading.h"
#include "support/heap.h"
#include "target.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"
#include "qvstrace.h"
#include "smlbuffer.h"

#include <cstring>

namespace {

using namespace fuzz;

// Reads a document with the decoder and lets it go again.
void decodeWith(qvsWbxmlDecoder *decoder, const Input &input, const BodyReading &expected)
{
    qvsWapDoc *document = nullptr;
    const qvsResult result = qvsClientProvWbxmlDecoder(decoder, &document);
    check(result == expected.result, "the decode ends with the result that the format gives",
          "result ", result, " instead of ", expected.result);
    check(result == QVS_OK || !document, "a failed decode hands out no document");
    check(qvsClientProvWbxmlDecoderDecodingSize(decoder) <= input.size() + 1,
          "no more is read than there is");
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
}

// Decodes the body into a document with a decoder of the library, and with one of a host.
void decode(const Input &input, const BodyReading &expected)
{
    qvsWbxmlDecoder *decoder = nullptr;
    check(qvsClientProvWbxmlInitDecoder(&decoder, input.data(), input.size()) == QVS_OK,
          "a decoder is made for any bytes");
    decodeWith(decoder, input, expected);
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    check(blocks::live() == expected.kept, "a decode leaves no block but the kept ones",
          blocks::live(), " blocks instead of ", expected.kept);
    blocks::releaseAll();

    qvsWbxmlDecoder host = {};
    (void)smlBufferCreate(&host.ptBuffer, input.size());
    (void)smlBufferAppendTail(host.ptBuffer, input.data(), input.size());
    decodeWith(&host, input, expected);
    qvsMemFree_debug(host.pStringTable);
    (void)smlBufferDelete(host.ptBuffer);
    check(blocks::live() == expected.kept, "a decode by a host's decoder leaves no block but these",
          blocks::live(), " blocks instead of ", expected.kept);
    blocks::releaseAll();
}

// Makes the context of the body, overwrites the body, and lets the context go again. Returns what
// the context says.
std::string makeContext(const Input &input, const BodyReading &expected)
{
    Input copy = input;
    qvsClientProvCtx *context = qvsClinetProvWbxmlDecoderMain(copy.data(), copy.size());
    copy.checkUnchanged(input);
    check((context != nullptr) == expected.context, "the body is accepted as the format says",
          context ? "accepted" : "refused");
    if (!context) {
        check(blocks::live() == expected.kept, "a refused body leaves no block but the kept ones",
              blocks::live(), " blocks instead of ", expected.kept);
        blocks::releaseAll();
        return "";
    }
    copy.overwrite();
    const ContextView view = viewOf(context);
    const size_t blocks = view.blocks + view.abandoned + expected.kept;
    check(blocks::live() == blocks, "a context is all that a body leaves", blocks::live(),
          " blocks instead of ", blocks);
    qvsClientProvCtxDelectContext(context);
    check(blocks::live() == view.kept + expected.kept,
          "a released context leaves no block but the kept ones", blocks::live(),
          " blocks instead of ", view.kept, " + ", expected.kept);
    blocks::releaseAll();
    return view.text;
}

void checkTrace(const char *text, uint32_t length)
{
    check(strlen(text) == length && length > 0 && length < 20480, "a trace is as long as it says");
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const Input input(data, size);
    const BodyReading expected = readBody(data, size);
    decode(input, expected);
    const std::string first = makeContext(input, expected);
    qvcTraceSetSink(checkTrace);
    const std::string second = makeContext(input, expected);
    qvcTraceSetSink(nullptr);
    check(first == second, "what was accepted says the same when parsed again", first, "\n\n",
          second);
    input.checkUnchanged(Input(data, size));
    return 0;
}
