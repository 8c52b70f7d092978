// The text that strings and value tokens are appended to, and the one reader of all their runs.
#include "qvsText.h"

using namespace qvs;

namespace {

// Pieces of a run that are looked at before they are appended.
constexpr uint32_t kMostPieces = 4;

// Bytes in front of a piece that joins a text.
inline uint32_t separatorOf(const Piece &piece)
{
    return piece.join == Join::kComma || piece.join == Join::kHidden ? 1 : 0;
}

// Makes room for `added` bytes behind a text and a terminator, `spare` bytes more. False without
// memory, or once the texts of the message passed their limit.
[[gnu::always_inline]] inline bool reserve(DecodeState *state, Text *text, uint64_t added,
                                           uint32_t spare)
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

// Writes a piece behind the text; answers the end of its bytes.
[[gnu::always_inline]] inline char *write(Text *text, const Piece &piece, bool joins)
{
    char *at = text->data + text->length;
    const uint32_t separator = joins ? separatorOf(piece) : 0;
    if (separator) {
        *at++ = piece.join == Join::kComma ? ',' : '\0';
    }
    memcpy(at, piece.bytes, piece.length);
    if (piece.join == Join::kOpaque) [[unlikely]] {
        const void *nul = memchr(at, '\0', piece.length);
        text->length +=
            nul ? static_cast<uint32_t>(static_cast<const char *>(nul) - at) : piece.length;
    } else if (!joins || piece.join != Join::kHidden) {
        text->length += separator + piece.length;
    }
    return at + piece.length;
}

// What there is of pieces without memory: up to the first string.
[[gnu::noinline, gnu::cold]] const Piece *appendNone(const Piece *piece, const Piece *end)
{
    for (; piece != end && !piece->unread; ++piece) {
        // kept[lookup-without-memory]: the text stays as it was and the token counts as read.
        traceException("[Error] [qvsClientProvWbxmlDecoderGetParamTokenVal] pszData NULL",
                       kDecoderModule, __LINE__);
    }
    if (piece != end) {
        trace("[Error] [qvsClientProvWbxmlDecoderGetStr] pszData NULL");
    }
    return piece;
}

// Appends pieces that add so many bytes, in one block. Answers the first one that is not appended.
const Piece *appendAll(DecodeState *state, Text *text, const Piece *first, const Piece *end,
                       uint64_t added)
{
    const Piece *piece = first;
    bool joins = text->str() != nullptr;
    if (!reserve(state, text, added, piece->join == Join::kOpaque ? 1 : 0)) [[unlikely]] {
        return appendNone(piece, end);
    }
    char *last = nullptr;
    do {
        last = write(text, *piece, joins);
        joins = true;
    } while (++piece != end);
    // Nobody sees what lies behind the terminator of a text in the tree of a session, and the
    // context takes it over with its zeros.
    memset(state->arena ? text->data + text->length : last, 0, 1 + kSpareZeros);
    return piece;
}

// The result where a piece that has been taken is not appended.
[[gnu::noinline, gnu::cold]] qvsResult lackPiece(qvsWbxmlDecoder *decoder, uint8_t *unread)
{
    const Piece piece = {nullptr, 0, Join::kDirect, unread};
    if (appendNone(&piece, &piece + 1) != &piece) {
        return QVS_OK;
    }
    decoder->ptBuffer->pHead = unread;
    return QVS_ERROR_WBXML_NO_DATA;
}

// Reads a run, a value token, opaque data, or a token that stands for no text.
qvsResult readAny(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
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

// Appends the pieces of a run, which may be none. Answers the first one that is not appended: where
// the texts of the message come near their limit, what is in front of the piece that passes it is.
const Piece *appendRun(DecodeState *state, Text *text, const Piece *first, const Piece *end,
                       uint64_t added)
{
    if (added + text->length <= state->textLeft) [[likely]] {
        return first != end ? appendAll(state, text, first, end, added) : end;
    }
    const Piece *piece = first;
    while (piece != end && append(state, text, *piece)) {
        ++piece;
    }
    return piece;
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
    const uint32_t separator = text->str() ? separatorOf(piece) : 0;
    const uint64_t added = uint64_t{piece.length} + separator;
    return appendAll(state, text, &piece, &piece + 1, added) != &piece;
}

uint32_t qvs::lengthBehind(const smlBuffer *buffer, const uint8_t *at, uint32_t left)
{
    // hardened: behind the data nothing is read but the storage, which the buffer has to tell.
    const size_t from = static_cast<size_t>(at - buffer->pStorage);
    const size_t capacity = static_cast<size_t>(buffer->pEnd - buffer->pStorage);
    if (from + left > capacity || capacity != buffer->nCapacity) {
        return left;
    }
    const void *nul = memchr(at, '\0', capacity - from);
    return static_cast<uint32_t>((nul ? static_cast<const uint8_t *>(nul) : buffer->pEnd) - at);
}

// All pieces are looked at before a block is made for them; of many, so many at a time, and while
// blocks are tracked each by itself.
bool qvs::readRun(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text)
{
    Piece pieces[kMostPieces];
    const Piece *const most = pieces + (tracking ? 1 : kMostPieces);
    uint8_t *at = decoder->ptBuffer->pHead;
    const uint8_t *const end = at + bytesLeft(decoder);
    bool joins = text->str() != nullptr;
    bool complete = false;
    for (bool more = at != end; more;) {
        Piece *piece = pieces;
        uint64_t added = 0;
        while (more && piece != most) {
            const uint8_t token = *at++;
            bool found = true;
            if (token == wbxml::kStrI) {
                inlinePiece(decoder->ptBuffer, &at, end, piece);
            } else if (token == wbxml::kStrT) {
                found = tablePiece(decoder, &at, end, piece);
            } else if (endsRun(token)) {
                --at;
                complete = true;
                found = false;
            } else if (tokenPiece(token, piece)) {
                added += joins ? separatorOf(*piece) : 0;
            } else {
                found = false;
            }
            more = found && at < end;
            added += found ? piece++->length : 0;
            joins = true;
        }
        const Piece *const left = appendRun(state, text, pieces, piece, added);
        if (left != piece) [[unlikely]] {
            decoder->ptBuffer->pHead = left->unread;
            return false;
        }
    }
    decoder->ptBuffer->pHead = at;
    return complete;
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
    if (bytesLeft(decoder) == 0 || !onlyPiece(decoder, &at, endOf(buffer), &piece) ||
        piece.length > state->textLeft) {
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
