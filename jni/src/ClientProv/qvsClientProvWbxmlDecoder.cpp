// The decoder's entry: the WBXML header, the document type, and the way from bytes to a context.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsArena.h"
#include "qvsCtxCopy.h"
#include "qvsDecoding.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvsmemory.h"
#include "qvsstring.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// What the trees of short messages take needs no block at all.
constexpr size_t kTreeRoom = 2048;

constexpr char kDocumentType[] = "-//WAPFORUM//DTD PROV 1.0//EN";

// Reads the header and tells whether it announces a provisioning document.
qvsResult checkDocumentType(qvsWbxmlDecoder *decoder)
{
    uint8_t version = 0;
    uint32_t publicId = 0;
    uint32_t charset = 0;
    // kept[header-ignored]: a header that ends early is judged by what was read of it.
    (void)qvsClientProvWbxmlDecoderWbxmlHeader(decoder, &version, &publicId, &charset);
    // kept[public-id-index]: a document type given by text is the text that the string table begins
    // with, whatever index was given.
    const bool known =
        publicId == wbxml::kProvisioning || (publicId == 0 && decoder->pStringTable &&
                                             qvsStrcmp(decoder->pStringTable, kDocumentType) == 0);
    if (!known) {
        trace("ERROR : qvsClientProvWbxmlDecoder Difference Ver!!\n");
        return QVS_ERROR_WBXML_DOCUMENT_TYPE;
    }
    return QVS_OK;
}

// A buffer over bytes that stay the caller's, to be read only.
smlBuffer bufferOver(const uint8_t *data, uint32_t length)
{
    auto *start = const_cast<uint8_t *>(data);
    return {start, start, start + length, start + length, length, length, 1};
}

// The document of a body; null with its failure traced. The decoder lives here, over the caller's
// bytes: a copy of them and a block for each record would cost more than reading a short message.
qvsResult readDocument(const uint8_t *data, uint32_t length, qvsArena *arena, qvsWapDoc **document)
{
    if (!data) {
        trace("ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvWbxmlInitDecoder[0x%x]\n",
              QVS_ERROR_BAD_ARGUMENT);
        return QVS_ERROR_BAD_ARGUMENT;
    }
    smlBuffer buffer = bufferOver(data, length);
    qvsWbxmlDecoder decoder = {};
    decoder.ptBuffer = &buffer;
    DecodeState state = wholeDecode(&decoder, arena);
    const qvsResult result = decode(&decoder, &state, document);
    if (result != QVS_OK) {
        trace("ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvWbxmlDecoder[0x%x]\n", result);
    }
    qvsMemFree_debug(decoder.pStringTable);
    return result;
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderWbxmlHeader(qvsWbxmlDecoder *decoder, uint8_t *version,
                                               uint32_t *publicId, uint32_t *charset)
{
    if (!takeByte(decoder, version)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (!takeUint32(decoder, publicId)) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    uint32_t index = 0;
    if (*publicId == 0 && !takeUint32(decoder, &index)) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    if (!takeUint32(decoder, charset)) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    // kept[table-failure-ignored]: a table that could not be read is known by its length alone.
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    return QVS_OK;
}

qvsResult qvs::decode(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapDoc **document)
{
    qvsResult result = QVS_ERROR_BAD_ARGUMENT;
    if (decoder && smlBufferGetDataSize(decoder->ptBuffer) != 0) {
        result = checkDocumentType(decoder);
        if (result == QVS_OK) {
            result = decodeBody(decoder, state, document);
        }
    }
    traceError(result);
    return result;
}

qvsResult qvsClientProvWbxmlDecoder(qvsWbxmlDecoder *decoder, qvsWapDoc **document)
{
    DecodeState state = wholeDecode(decoder);
    return decode(decoder, &state, document);
}

qvsClientProvCtx *qvsClinetProvWbxmlDecoderMain(const uint8_t *data, uint32_t length)
{
    qvsWapDoc *document = nullptr;
    qvsClientProvCtx *context = nullptr;
    const uint32_t refusalsBefore = refusals;
    alignas(void *) char room[kTreeRoom];
    qvsArena pieces = {room, room + sizeof room};
    // While blocks are tracked each is one of its own, listed under the module that made it.
    qvsArena *arena = tracking ? nullptr : &pieces;
    if (readDocument(data, length, arena, &document) == QVS_OK) {
        context = arena ? takeContext(document) : qvsClientProvCtxMakeContext(document);
        // hardened: without memory for all that the message holds there is no context.
        if (context && refusals != refusalsBefore) {
            qvsClientProvCtxDelectContext(context);
            context = nullptr;
        }
        if (context) {
            trace("Success");
        } else {
            trace("ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvCtxMakeContext[0x%x]\n", 0);
        }
    }
    releaseDocument(arena, document);
    releaseArena(&pieces);
    if (!context) {
        qvsClientProvCtxDelectContext(nullptr);
    }
    return context;
}
