// The tokens of a body: elements, attributes, code pages, values in any encoding, and what is
// skipped. Global tokens are those of WBXML 1.x.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// The byte in front of the one read last; 0 in front of the first.
uint8_t byteBefore(const qvsWbxmlDecoder *decoder)
{
    const smlBuffer *buffer = decoder->ptBuffer;
    return buffer->pHead - buffer->pStorage >= 2 ? buffer->pHead[-2] : 0;
}

// Skips to the END that closes the nesting.
[[gnu::cold]] qvsResult skipElement(qvsWbxmlDecoder *decoder, DecodeState *state)
{
    // kept[skip-counts-tokens]: every token that is no string and no END counts as one level, tags,
    // attribute starts and value tokens alike; an END outside them counts below zero.
    int64_t depth = 0;
    for (;;) {
        uint8_t token = 0;
        if (!takeByte(decoder, &token)) {
            trace("qvsClientProvWbxmlDecoderSkipElement Error Code:%d",
                  static_cast<int>(QVS_ERROR_WBXML_NO_DATA));
            return QVS_ERROR_WBXML_NO_DATA;
        }
        if (token == wbxml::kSwitchPage) {
            (void)takeByte(decoder, &token);
        } else if (token == wbxml::kEnd) {
            --depth;
            if (depth == 0) {
                stepBack(decoder); // kept[skip-end-left]: the closing END is left for the caller.
                return QVS_OK;
            }
        } else if (wbxml::isString(token) || token == wbxml::kOpaque) {
            stepBack(decoder);
            Text scratch;
            if (qvsResult result = lookAt(decoder, state, &scratch)) {
                return result;
            }
        } else {
            ++depth;
        }
    }
}

} // namespace

qvsResult qvs::readUnknown(qvsWbxmlDecoder *decoder, DecodeState *state, char **text)
{
    const uint8_t token = decoder->ptBuffer->pHead[-1];
    if (token < 0x80) {
        trace("WARNING!!!!!!!! Not Support Type Numberic nTag=[%x]", byteBefore(decoder));
        stepBack(decoder);
        return skipElement(decoder, state);
    }
    *text = newText(2, kDecoderModule);
    if (!*text) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    memset(*text, 0, 2 + kSpareZeros);
    **text = static_cast<char>(token);
    return QVS_OK;
}

qvsResult qvs::noElement(const qvsWbxmlDecoder *decoder)
{
    if (!decoder) {
        trace("[Error] [qvsClientProvWbxmlDecoderCheckElement] ptWbxmlDecoder NULL");
        return QVS_ERROR_FAILED;
    }
    return QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderReadElement(qvsWbxmlDecoder *decoder, uint8_t *tag)
{
    return takeTag(decoder, tag) ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderCurElement(qvsWbxmlDecoder *decoder, uint8_t *tag)
{
    uint8_t byte = 0;
    if (!peekByte(decoder, &byte)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    *tag = byte & wbxml::kTagMask;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderCurElementNotAND(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    return peekByte(decoder, byte) ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderCheckElement(qvsWbxmlDecoder *decoder, uint8_t tag)
{
    return checkElement(decoder, tag);
}

qvsResult qvsClientProvWbxmlDecoderElement(qvsWbxmlDecoder *decoder, uint8_t tag, char **text)
{
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckElement(decoder, tag)) {
        return result;
    }
    if (!decoder->nHasContent) {
        return QVS_OK;
    }
    if (qvsResult result = qvsClientProvWbxmlDecoderContent(decoder, text)) {
        return result;
    }
    uint8_t end = 0;
    const bool ended = takeByte(decoder, &end) && end == wbxml::kEnd;
    return ended ? QVS_OK : QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

qvsResult qvsClientProvWbxmlDecoderReadAttr(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    return takeByte(decoder, byte) ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderCurAttr(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    return peekByte(decoder, byte) ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderCheckAttr(qvsWbxmlDecoder *decoder, uint8_t token)
{
    return checkAttr(decoder, token);
}

qvsResult qvsClientProvWbxmlDecoderCheckAttrVersion(qvsWbxmlDecoder *decoder)
{
    uint8_t read = 0;
    if (!takeByte(decoder, &read)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (read != attr::kVersion && read != attr::kVersion10) {
        trace("[Error] [qvsClientProvWbxmlDecoderCheckAttrVersion] nId [0x%x]", read);
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderAttributeWapDocVersion(qvsWbxmlDecoder *decoder)
{
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckAttrVersion(decoder)) {
        return result;
    }
    uint8_t next = 0;
    if (!peekTag(decoder, &next)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (next != wbxml::kEnd && next != wbxml::kStrI) {
        trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    // kept[version-skip-ignored]: attributes that do not end are noticed by whoever reads next.
    (void)qvsClientProvWbxmlDecoderSkipAttribute(decoder);
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderSkipAttribute(qvsWbxmlDecoder *decoder)
{
    uint8_t token = 0;
    while (takeByte(decoder, &token)) {
        if (token == wbxml::kEnd || token == wbxml::kLiteral || token == wbxml::kExtI0) {
            return QVS_OK;
        }
    }
    return QVS_ERROR_WBXML_NO_DATA;
}

qvsResult qvsClientProvWbxmlDecoderCheckCodePage(qvsWbxmlDecoder *decoder)
{
    // kept[page-masked]: both bytes are read as element tokens: the first is not verified, the page
    // is masked, and the flags of the decoder become those of the page byte.
    uint8_t page = 0;
    if (bytesLeft(decoder) < 2) {
        (void)takeTag(decoder, &page);
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    ++decoder->ptBuffer->pHead;
    page = takeSeenTag(decoder);
    if (page > 1) {
        trace("ERROR::QVS_CODE_PAGE_UNKNOWN");
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    if (page == 0) {
        trace("QVS_WBXML_TAG_SWITCH_PAGE0");
    } else {
        trace("QVS_WBXML_TAG_SWITCH_PAGE1");
    }
    decoder->nCodePage = page;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderContent(qvsWbxmlDecoder *decoder, char **text)
{
    if (!decoder || !decoder->ptBuffer) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    DecodeState alone;
    Text built(*text);
    const qvsResult result = content(decoder, &alone, &built);
    *text = built.take();
    return result;
}

uint32_t qvsClientProvWbxmlDecoderGetString(qvsWbxmlDecoder *decoder, char **text)
{
    if (!decoder || !decoder->ptBuffer) {
        return 0;
    }
    stepBack(decoder);
    DecodeState alone;
    Text built(*text);
    const bool read = readRun(decoder, &alone, &built);
    *text = built.take();
    return read ? 1 : 0;
}

qvsResult qvsClientProvWbxmlDecoderSkipElement(qvsWbxmlDecoder *decoder)
{
    DecodeState alone;
    return skipElement(decoder, &alone);
}
