// The document: its root element and what stands around the run of characteristics in it.
#include "qvsArena.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// Reads the document element.
qvsResult readElement(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapDoc *document)
{
    if (qvsResult result = checkElement(decoder, tag::kWapProvisioningDoc)) {
        return result;
    }
    if (!decoder->nHasContent) {
        return QVS_OK;
    }
    if (!document) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (decoder->nHasAttr) {
        if (qvsResult result = qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder)) {
            return result;
        }
    }
    for (;;) {
        uint8_t tag = 0;
        if (!peekTag(decoder, &tag)) {
            return QVS_ERROR_WBXML_NO_DATA;
        }
        qvsResult result = QVS_OK;
        switch (tag) {
        case wbxml::kEnd:
            (void)takeSeenTag(decoder);
            return QVS_OK;
        case wbxml::kStrI:
            result = dropInlineString(decoder, state);
            break;
        case wbxml::kSwitchPage:
            dropPageSwitch(decoder);
            break;
        case tag::kCharacteristic:
            result = decodeCharacters(decoder, state, &document->ptCharacterList);
            break;
        default:
            // hardened: a parm outside a characteristic is refused too; nobody would read it.
            trace("Tag Code [%d] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n", tag);
            return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
        }
        if (result != QVS_OK) {
            return result;
        }
    }
}

qvsResult readDocument(qvsWbxmlDecoder *decoder, DecodeState *state, uint8_t tag,
                       qvsWapDoc *document)
{
    switch (tag) {
    case tag::kWapProvisioningDoc:
        return readElement(decoder, state, document);
    case tag::kCharacteristic:
        return decodeCharacters(decoder, state, &document->ptCharacterList);
    case wbxml::kSwitchPage:
        // kept[body-switch]: the document ends here, empty.
        dropPageSwitch(decoder);
        return QVS_OK;
    case tag::kParm:
        return QVS_OK; // kept[body-parm]: the document is empty, and nothing is read.
    default:
        trace("Unknown Element[%x]", tag);
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
}

} // namespace

qvsResult qvs::decodeBody(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapDoc **document)
{
    qvsArena *const arena = state->arena;
    auto *built = static_cast<qvsWapDoc *>(newPiece(arena, sizeof(qvsWapDoc), kDecoderModule));
    if (!built) {
        trace("[Error] [qvsClientProvWbxmlDecoderWbxmlBody] ptTmpWapDoc NULL");
        return QVS_ERROR_FAILED;
    }
    uint8_t tag = 0;
    const bool present = peekTag(decoder, &tag);
    if (present && tag == wbxml::kEnd) {
        // kept[body-end]: success without a document.
        releaseDocument(arena, built);
        (void)takeSeenTag(decoder);
        return QVS_OK;
    }
    qvsResult result = QVS_ERROR_WBXML_NO_DATA;
    if (present) {
        result = readDocument(decoder, state, tag, built);
        if (result != QVS_OK) {
            trace("WBXML Decode Error[%x]", result);
        }
    }
    if (result != QVS_OK) {
        releaseDocument(arena, built);
        return result;
    }
    *document = built;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderWbxmlBody(qvsWbxmlDecoder *decoder, qvsWapDoc **document)
{
    if (!decoder || !decoder->ptBuffer) {
        return QVS_ERROR_WBXML_NO_BUFFER;
    }
    DecodeState state = wholeDecode(decoder);
    return decodeBody(decoder, &state, document);
}

qvsResult qvsClientProvWbxmlDecoderWapDocVersion(qvsWbxmlDecoder *decoder, qvsWapDoc *document)
{
    DecodeState state = wholeDecode(decoder);
    return readElement(decoder, &state, document);
}
