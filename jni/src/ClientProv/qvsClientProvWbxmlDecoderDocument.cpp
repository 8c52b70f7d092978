// The document: its root element and what stands around the run of characteristics in it.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvsTree.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

qvsResult readDocument(qvsWbxmlDecoder *decoder, uint8_t tag, qvsWapDoc *document)
{
    switch (tag) {
    case tag::kWapProvisioningDoc:
        return qvsClientProvWbxmlDecoderWapDocVersion(decoder, document);
    case tag::kCharacteristic:
        return qvsClientProvWbxmlDecoderCharacterList(decoder, &document->ptCharacterList);
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

qvsResult readBody(qvsWbxmlDecoder *decoder, qvsArena *arena, qvsWapDoc **document)
{
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
        result = readDocument(decoder, tag, built);
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

} // namespace

qvsResult qvsClientProvWbxmlDecoderWbxmlBody(qvsWbxmlDecoder *decoder, qvsWapDoc **document)
{
    if (!decoder || !decoder->ptBuffer) {
        return QVS_ERROR_WBXML_NO_BUFFER;
    }
    if (const DecodeState *state = stateOf(decoder)) {
        return readBody(decoder, state->arena, document);
    }
    // A host's own decoder gets what limits and speeds up a decode for as long as it lasts.
    Decoding decoding = {*decoder, {}};
    decoding.decoder.nMark = markOf(&decoding.decoder);
    const qvsResult result = readBody(&decoding.decoder, nullptr, document);
    decoding.decoder.nMark = decoder->nMark;
    *decoder = decoding.decoder;
    return result;
}

qvsResult qvsClientProvWbxmlDecoderWapDocVersion(qvsWbxmlDecoder *decoder, qvsWapDoc *document)
{
    if (qvsResult result =
            qvsClientProvWbxmlDecoderCheckElement(decoder, tag::kWapProvisioningDoc)) {
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
            result = dropInlineString(decoder);
            break;
        case wbxml::kSwitchPage:
            dropPageSwitch(decoder);
            break;
        case tag::kCharacteristic:
            result = qvsClientProvWbxmlDecoderCharacterList(decoder, &document->ptCharacterList);
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
