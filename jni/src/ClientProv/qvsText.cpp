// The text that strings and value tokens are appended to, and the reader of their runs.
#include "qvsText.h"

using namespace qvs;

namespace {

// Makes room for `added` bytes behind a text and a terminator, `spare` bytes more. False without
// memory, or once the texts of the message passed their limit.
bool reserve(DecodeState *state, Text *text, uint64_t added, uint32_t spare)
{
    if (!countText(state, text->data ? added : text->length + added)) [[unlikely]] {
        return false;
    }
    uint64_t needed = text->length + added + 1 + spare;
    if (text->data && !tracking) {
        if (needed <= text->capacity) {
            return true;
        }
        // Twice as long, and as long as the limit of texts lets it become once that is more than
        // half of it: the old block and the new one are there together.
        const uint64_t left = state->textLeft < kLongest ? state->textLeft : kLongest;
        const uint64_t most = needed + left < kLongest ? needed + left : kLongest;
        const uint64_t twice = uint64_t{text->capacity} * 2;
        const uint64_t grown = twice > most / 2 ? most : twice;
        needed = grown > needed ? grown : needed;
    }
    char *block =
        needed > kLongest ? nullptr : newText(static_cast<uint32_t>(needed), kDecoderModule);
    if (!block) [[unlikely]] {
        return false;
    }
    if (text->length) {
        memcpy(block, text->str(), text->length);
    }
    if (text->data) {
        freeBlock(text->data);
    }
    text->data = block;
    text->capacity = static_cast<uint32_t>(needed);
    return true;
}

// Traces that there is no memory for a piece; true for a token's, which counts as read.
[[gnu::noinline, gnu::cold]] bool lackBlock(const Piece &piece)
{
    if (piece.unread) {
        trace("[Error] [qvsClientProvWbxmlDecoderGetStr] pszData NULL");
        return false;
    }
    // kept[lookup-without-memory]: the text stays as it was and the token counts as read.
    traceException("[Error] [qvsClientProvWbxmlDecoderGetParamTokenVal] pszData NULL",
                   kDecoderModule, __LINE__);
    return true;
}

// The result where a piece that has been taken is not appended.
[[gnu::noinline, gnu::cold]] qvsResult lackPiece(qvsWbxmlDecoder *decoder, uint8_t *unread)
{
    if (lackBlock({nullptr, 0, Join::kDirect, unread})) {
        return QVS_OK;
    }
    decoder->ptBuffer->pHead = unread;
    return QVS_ERROR_WBXML_NO_DATA;
}

// Reads a run, a value token, opaque data, or a token that stands for no text.
[[gnu::cold]] qvsResult readAny(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
{
    uint8_t token = 0;
    if (!peekByte(decoder->ptBuffer, &token)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (wbxml::isString(token)) {
        return readRun(decoder, state, text) ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
    }
    uint8_t *&head = decoder->ptBuffer->pHead;
    ++head;
    const bool opaque = token == wbxml::kOpaque;
    uint32_t length = 0;
    Piece piece;
    if (opaque ? takeOpaque(&head, head + bytesLeft(decoder), &length, &piece)
               : tokenPiece(token, &piece)) {
        return append(state, text, piece) ? qvsResult{QVS_OK} : lackPiece(decoder, piece.unread);
    }
    if (opaque) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    char *unknown = nullptr;
    const qvsResult result = readUnknown(decoder, state, &unknown);
    if (unknown) {
        // kept[unknown-token-replaces]: the token takes the place of a text that was there, which
        // stays allocated.
        text->data = unknown;
        text->length = 1;
        text->capacity = 2;
    }
    return result;
}

// The result of reading a value, traced.
inline qvsResult endOfContent(const DecodeState *state, qvsResult result)
{
    if (state->textLimit) [[unlikely]] {
        result = QVS_ERROR_NO_MEMORY;
    }
    trace("qvsClientProvWbxmlDecoderContent Error:%d", static_cast<int>(result));
    return result;
}

// Takes a page switch behind a VALUE, up to the value. It may be none, where an END stands.
[[gnu::noinline]] qvsResult enterValue(qvsWbxmlDecoder *decoder, bool *present)
{
    uint8_t next = 0;
    bool left = peekByte(decoder->ptBuffer, &next);
    if (left && next == wbxml::kSwitchPage) {
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        left = peekByte(decoder->ptBuffer, &next);
        next &= wbxml::kTagMask;
    }
    *present = next != wbxml::kEnd;
    return left ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

} // namespace

DecodeState qvs::wholeDecode(const qvsWbxmlDecoder *decoder, qvsArena *arena)
{
    const uint64_t forLength =
        kTextPerByte * (decoder ? smlBufferGetDataSize(decoder->ptBuffer) : 0);
    const uint64_t limit = forLength > kTextAlways ? forLength : kTextAlways;
    return {.textLeft = limit < SIZE_MAX ? static_cast<size_t>(limit) : SIZE_MAX, .arena = arena};
}

bool qvs::append(DecodeState *state, Text *text, const Piece &piece)
{
    const bool joins = text->str() != nullptr;
    const bool separated = piece.join == Join::kComma || piece.join == Join::kHidden;
    const uint32_t separator = joins && separated ? 1 : 0;
    const bool opaque = piece.join == Join::kOpaque;
    if (!reserve(state, text, uint64_t{piece.length} + separator, opaque ? 1 : 0)) [[unlikely]] {
        return lackBlock(piece);
    }
    char *at = text->data + text->length;
    if (separator) {
        *at++ = piece.join == Join::kComma ? ',' : '\0';
    }
    memcpy(at, piece.bytes, piece.length);
    char *const last = at + piece.length;
    if (opaque) {
        const void *nul = memchr(at, '\0', piece.length);
        text->length +=
            nul ? static_cast<uint32_t>(static_cast<const char *>(nul) - at) : piece.length;
    } else if (!joins || piece.join != Join::kHidden) {
        text->length += separator + piece.length;
    }
    // Nobody sees what lies behind the terminator of a text in the tree of a session, and the
    // context takes it over with its zeros.
    memset(state->arena ? text->data + text->length : last, 0, 1 + kSpareZeros);
    return true;
}

uint32_t qvs::lengthBehind(const smlBuffer *buffer, const uint8_t *at, uint32_t left)
{
    // hardened: behind the data nothing is read but the storage, which the buffer has to tell.
    const auto capacity = static_cast<size_t>(buffer->pEnd - buffer->pStorage);
    if (capacity != buffer->nCapacity || at + left > buffer->pEnd) {
        return left;
    }
    const void *nul = memchr(at, '\0', static_cast<size_t>(buffer->pEnd - at));
    return static_cast<uint32_t>((nul ? static_cast<const uint8_t *>(nul) : buffer->pEnd) - at);
}

bool qvs::readRun(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
{
    Rest rest(decoder);
    bool more = true;
    while (more && rest.at < rest.end && !endsRun(*rest.at)) {
        const uint8_t token = *rest.at++;
        Piece piece;
        if (token == wbxml::kStrI) {
            inlinePiece(decoder->ptBuffer, &rest.at, rest.end, &piece);
        } else {
            more = token == wbxml::kStrT ? tablePiece(decoder, &rest.at, rest.end, &piece)
                                         : tokenPiece(token, &piece);
        }
        if (more && !append(state, text, piece)) {
            rest.at = piece.unread;
            more = false;
        }
    }
    decoder->ptBuffer->pHead = rest.at;
    return more && rest.at < rest.end;
}

qvsResult qvs::dropInlineString(qvsWbxmlDecoder *decoder, DecodeState *state)
{
    uint8_t *at = decoder->ptBuffer->pHead;
    Piece piece;
    inlinePiece(decoder->ptBuffer, &at, at + bytesLeft(decoder), &piece);
    if (!countText(state, piece.length)) {
        return QVS_ERROR_NO_MEMORY;
    }
    decoder->ptBuffer->pHead = at;
    return QVS_OK;
}

qvsResult qvs::content(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
{
    return endOfContent(state, readAny(decoder, state, text));
}

qvsResult qvs::lookAt(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    uint8_t *at = buffer->pHead;
    Piece piece;
    if (bytesLeft(decoder) == 0 || !nextPiece(decoder, &at, endOf(buffer), &piece) ||
        (!endsRun(*at) && wbxml::isString(*buffer->pHead)) || piece.length > state->textLeft) {
        return content(decoder, state, text);
    }
    state->textLeft -= piece.length;
    buffer->pHead = at;
    text->before = piece.bytes;
    text->length = piece.length;
    return endOfContent(state, QVS_OK);
}

qvsResult qvs::paramValue(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text,
                          ValueReader reader)
{
    if (qvsResult result = checkAttr(decoder, attr::kValue)) {
        return result;
    }
    bool present = false;
    const qvsResult result = enterValue(decoder, &present);
    return result == QVS_OK && present ? reader(decoder, state, text) : result;
}

qvsResult qvs::readValue(qvsWbxmlDecoder *decoder, DecodeState *state, char **text,
                         const char *before)
{
    if (qvsResult result = checkAttr(decoder, attr::kValue)) {
        return result;
    }
    bool present = false;
    qvsResult result = enterValue(decoder, &present);
    Text read;
    if (result == QVS_OK && present) {
        read.before = before;
        read.length = qvsStrlen(before);
        result = content(decoder, state, &read);
    }
    if (result == QVS_OK) {
        *text = read.take();
    }
    return result;
}

qvsResult qvs::lackValue(qvsWbxmlDecoder *decoder, const DecodeState *state, uint8_t *value)
{
    const uint8_t token = *value++;
    uint32_t index = 0;
    if (token == wbxml::kStrT) {
        (void)takeUint32(&value, endOf(decoder->ptBuffer), &index);
    }
    return endOfContent(state, lackPiece(decoder, wbxml::isString(token) ? value : nullptr));
}
