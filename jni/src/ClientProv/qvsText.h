// A text under construction, the pieces that it is made of, and the bytes that the decoder has not
// read yet.
#ifndef QVSTEXT_H
#define QVSTEXT_H

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsDecoding.h"
#include "qvsTokens.h"
#include "qvsmemory.h"
#include "qvsstring.h"
#include "qvstrace.h"

#include <stddef.h>
#include <stdint.h>
#include <string.h>

namespace [[gnu::visibility("hidden")]] qvs {

// The source that the blocks of the decoder are asked for under.
inline constexpr char kDecoderModule[] = "jni/src/ClientProv/qvsClientProvWbxmlDecoder";

// hardened: a string-table reference costs two bytes and copies a whole string, so 64 KiB could ask
// for gigabytes. A message may be decoded to this many bytes of text whatever its length, and
// beyond to this many times its length.
constexpr uint64_t kTextAlways = 8U << 20U;
constexpr uint64_t kTextPerByte = 100;

// Bytes that a block for a text may have.
constexpr uint32_t kLongest = UINT32_MAX - kSpareZeros;

// The length of a string table that could not be read.
constexpr uint32_t kUnreadTable = 0xFFFFFFFF;

// How a piece joins a text that is already there.
enum class Join : uint8_t {
    kDirect, // right behind it
    kComma,  // behind a comma
    kHidden, // behind its terminator
    kOpaque, // right behind it, with a zero byte more
};

// A part of a text as it lies in the message, in its string table, or in the table of value tokens.
struct Piece {
    const char *bytes; // they end the text at the first NUL among them
    uint32_t length;
    Join join = Join::kDirect;
    uint8_t *unread = nullptr; // the read position when a string cannot be had; null for a token's
};

// A text that grows at its end, piece by piece. Owns its block until take().
struct Text {
    Text() = default;
    // Goes on with a text that is a block of its own, in which there is no room. `known` may tell
    // its length and capacity, so that one joined again and again is not measured each time.
    explicit Text(char *block, const JoinedText *known = nullptr) : data(block)
    {
        if (block && known && known->text == block) {
            length = known->length;
            capacity = known->capacity;
        } else if (block) {
            length = qvsStrlen(block);
            capacity = length;
        }
    }
    Text(const Text &) = delete;
    Text &operator=(const Text &) = delete;
    ~Text()
    {
        if (data) {
            freeBlock(data);
        }
    }

    [[nodiscard]] char *take()
    {
        char *taken = data;
        data = nullptr;
        return taken;
    }

    // take(), with what the constructor may be told of the text.
    [[nodiscard]] char *takeKnown(JoinedText *known)
    {
        if (known) {
            *known = {data, length, capacity};
        }
        return take();
    }

    // The text, be it empty, that another one would be joined to; null for none.
    [[nodiscard]] const char *str() const { return data ? data : before; }

    char *data = nullptr;         // NUL-terminated
    uint32_t length = 0;          // bytes before the terminator
    uint32_t capacity = 0;        // bytes of the block
    const char *before = nullptr; // borrowed: the text that the first append continues
};

// Appends a piece, in the block or in a new one that is twice as long; exactly as long as needed
// for the first piece, and always new while blocks are tracked. False for a string without memory,
// or once the texts of the message passed their limit; the text of a token counts as appended.
// Cold, which makes it shorter: the value of a parm alone is written without it.
[[gnu::cold]] bool append(DecodeState *state, Text *text, const Piece &piece);

// ---- The read position: the head of the buffer. It may stand one byte behind the storage.

// Bytes not read yet; none without a decoder or a buffer.
inline uint32_t bytesLeft(const qvsWbxmlDecoder *decoder)
{
    if (!decoder || !decoder->ptBuffer) {
        return 0;
    }
    const smlBuffer *buffer = decoder->ptBuffer;
    const size_t consumed = static_cast<size_t>(buffer->pHead - buffer->pStorage);
    return consumed < buffer->nSize ? static_cast<uint32_t>(buffer->nSize - consumed) : 0;
}

inline bool peekByte(const smlBuffer *buffer, uint8_t *byte)
{
    if (static_cast<size_t>(buffer->pHead - buffer->pStorage) >= buffer->nSize) {
        return false;
    }
    *byte = *buffer->pHead;
    return true;
}

inline bool peekByte(const qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    return decoder && decoder->ptBuffer && peekByte(decoder->ptBuffer, byte);
}

inline bool takeByte(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    if (!peekByte(decoder, byte)) {
        return false;
    }
    ++decoder->ptBuffer->pHead;
    return true;
}

// Looks at an element token, without its flags.
inline bool peekTag(const qvsWbxmlDecoder *decoder, uint8_t *tag)
{
    const bool present = peekByte(decoder, tag);
    *tag &= wbxml::kTagMask;
    return present;
}

// Takes the element token that was seen, whose flags the decoder keeps.
inline uint8_t takeSeenTag(qvsWbxmlDecoder *decoder)
{
    const uint8_t byte = *decoder->ptBuffer->pHead++;
    decoder->nHasContent = (byte & wbxml::kHasContent) ? 1 : 0;
    decoder->nHasAttr = (byte & wbxml::kHasAttr) ? 1 : 0;
    return byte & wbxml::kTagMask;
}

// Takes an element token.
inline bool takeTag(qvsWbxmlDecoder *decoder, uint8_t *tag)
{
    if (!peekByte(decoder, tag)) {
        return false;
    }
    *tag = takeSeenTag(decoder);
    return true;
}

// Why there is no element token to take.
qvsResult noElement(const qvsWbxmlDecoder *decoder);

// Takes an element token, which has to be `tag`, and the END behind an element without content.
inline qvsResult checkElement(qvsWbxmlDecoder *decoder, uint8_t tag)
{
    uint8_t read = 0;
    if (!takeTag(decoder, &read)) {
        return noElement(decoder);
    }
    if (read != tag) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    uint8_t next = 0;
    if (!decoder->nHasContent && peekTag(decoder, &next) && next == wbxml::kEnd) {
        ++decoder->ptBuffer->pHead;
    }
    return QVS_OK;
}

// Takes an attribute start, which has to be `token`.
inline qvsResult checkAttr(qvsWbxmlDecoder *decoder, uint8_t token)
{
    uint8_t read = 0;
    if (!takeByte(decoder, &read)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (read != token) {
        trace("nId:%x, nTemp:%x", token, read);
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    return QVS_OK;
}

// A SWITCH_PAGE between elements.
// kept[element-switch]: it is read without effect on the code page.
inline void dropPageSwitch(qvsWbxmlDecoder *decoder)
{
    uint8_t byte = 0;
    (void)takeByte(decoder, &byte);
    (void)takeByte(decoder, &byte);
}

// qvsClientProvWbxmlDecoderCheckCodePage of a switch that is next.
inline qvsResult switchPage(qvsWbxmlDecoder *decoder)
{
    const uint8_t *const at = decoder->ptBuffer->pHead;
    if (traceSink || bytesLeft(decoder) < 2 || at[1] > 1) [[unlikely]] {
        return qvsClientProvWbxmlDecoderCheckCodePage(decoder);
    }
    decoder->nHasContent = 0;
    decoder->nHasAttr = 0;
    decoder->nCodePage = at[1];
    decoder->ptBuffer->pHead += 2;
    return QVS_OK;
}

// Gives the byte read last back.
inline void stepBack(qvsWbxmlDecoder *decoder)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    if (buffer->pHead > buffer->pStorage) {
        --buffer->pHead;
    }
}

// Takes an mb_u_int32 of at most five bytes from `*at` on, in 32-bit arithmetic: the high bits of a
// long value fall off. False for one that does not end.
inline bool takeUint32(uint8_t **at, const uint8_t *end, uint32_t *value)
{
    uint32_t read = 0;
    for (int i = 0; i < 5 && *at != end; ++i) {
        const uint8_t byte = *(*at)++;
        read = (read << 7) + (byte & 0x7FU);
        if ((byte & 0x80) == 0) {
            *value = read;
            return true;
        }
    }
    return false;
}

// The data of a decoder from its read position on.
struct Rest {
    explicit Rest(const qvsWbxmlDecoder *decoder)
        : at(decoder && decoder->ptBuffer ? decoder->ptBuffer->pHead : nullptr),
          end(at + bytesLeft(decoder))
    {
    }

    uint8_t *at;
    const uint8_t *end;
};

inline bool takeUint32(qvsWbxmlDecoder *decoder, uint32_t *value)
{
    Rest rest(decoder);
    const bool read = takeUint32(&rest.at, rest.end, value);
    if (rest.at) {
        decoder->ptBuffer->pHead = rest.at;
    }
    return read;
}

// ---- Pieces, read from `*at` on, which moves behind them; `end` is the end of the data.

// The length of an inline string that has no NUL in the `left` bytes of data from `at` on.
[[gnu::cold]] uint32_t lengthBehind(const smlBuffer *buffer, const uint8_t *at, uint32_t left);

// An inline string, up to a NUL in the data or behind it.
inline void inlinePiece(const smlBuffer *buffer, uint8_t **at, const uint8_t *end, Piece *piece)
{
    const auto left = static_cast<uint32_t>(end - *at);
    const void *nul = left ? memchr(*at, '\0', left) : nullptr;
    const uint32_t length = nul ? static_cast<uint32_t>(static_cast<const uint8_t *>(nul) - *at)
                                : lengthBehind(buffer, *at, left);
    *piece = {reinterpret_cast<const char *>(*at), length, Join::kDirect, *at};
    *at += length + 1;
}

// Opaque data of `*length` bytes.
inline bool takeOpaque(uint8_t **at, const uint8_t *end, uint32_t *length, Piece *piece)
{
    // hardened: data longer than what is left is refused.
    if (!takeUint32(at, end, length) || *length > static_cast<size_t>(end - *at)) {
        return false;
    }
    *piece = {reinterpret_cast<const char *>(*at), *length, Join::kOpaque, *at};
    *at += *length;
    return true;
}

// What a reference into the string table stands for. False for one that is none.
inline bool tablePiece(const qvsWbxmlDecoder *decoder, uint8_t **at, const uint8_t *end,
                       Piece *piece)
{
    uint32_t index = 0;
    // hardened: a table that was cut off, whose length is not known, is referred to in vain.
    if (!takeUint32(at, end, &index) || !decoder->pStringTable ||
        decoder->nStrSize == kUnreadTable) {
        return false;
    }
    // kept[empty-table-index]: every index is one of an empty table; its block of two zero bytes
    // answers 0 and 1 with the empty text. hardened: an index behind that block fails.
    if (index >= (decoder->nStrSize ? decoder->nStrSize : 2)) {
        return false;
    }
    const char *entry = decoder->pStringTable + index;
    *piece = {entry, static_cast<uint32_t>(strlen(entry)), Join::kDirect, *at};
    return true;
}

// What a value token stands for.
struct ValueToken {
    template <size_t N>
    consteval ValueToken(uint8_t t, const char (&s)[N], Join j = Join::kDirect)
        : token(t), length(N - 1), join(j), text(s)
    {
    }

    uint8_t token;
    uint8_t length;
    Join join;
    const char *text;
};

// The row of a value token; null for a token that stands for no text.
const ValueToken *findValue(uint8_t token);

// The text of a value token. False for a token that stands for no text.
inline bool tokenPiece(uint8_t token, Piece *piece)
{
    const ValueToken *value = findValue(token);
    if (!value) {
        return false;
    }
    *piece = {value->text, value->length, value->join};
    return true;
}

// Whether a token ends a run of strings and value tokens.
constexpr bool endsRun(uint8_t token)
{
    return token == wbxml::kEnd || token == attr::kValue;
}

// The next piece of a value. False for anything else, and for one that the data ends with. Inline,
// with nothing that a function outside writes to, since nothing is called as often.
[[gnu::always_inline]] inline bool nextPiece(const qvsWbxmlDecoder *decoder, uint8_t **at,
                                             const uint8_t *end, Piece *piece)
{
    const uint8_t token = *(*at)++;
    if (token == wbxml::kStrI) {
        auto *nul = static_cast<uint8_t *>(memchr(*at, '\0', static_cast<size_t>(end - *at)));
        if (!nul) {
            return false;
        }
        *piece = {reinterpret_cast<const char *>(*at), static_cast<uint32_t>(nul - *at)};
        *at = nul + 1;
    } else if (token == wbxml::kStrT ? !tablePiece(decoder, at, end, piece)
                                     : !tokenPiece(token, piece)) {
        return false;
    }
    return *at < end;
}

// The end of the data, where the read position is in front of it.
inline const uint8_t *endOf(const smlBuffer *buffer)
{
    return buffer->pStorage + buffer->nSize;
}

// ---- The readers of a text.

// A run of strings and value tokens to an END or VALUE, which stays.
bool readRun(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text);

// A value token just read that stands for no text: a block of that one byte, or what follows it is
// skipped.
[[gnu::cold]] qvsResult readUnknown(qvsWbxmlDecoder *decoder, DecodeState *state, char **text);

// A value in any encoding: onto a text, or to be looked at, for which one of a single piece needs
// no block but stays where it lies, as the text `before`.
using ValueReader = qvsResult (*)(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text);
qvsResult content(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text);
qvsResult lookAt(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text);

// A VALUE and what it carries: as a reader has it, or as a new text, which may continue the text
// `before` and is null for nothing.
qvsResult paramValue(qvsWbxmlDecoder *decoder, DecodeState *state, Text *text,
                     ValueReader reader = content);
qvsResult readValue(qvsWbxmlDecoder *decoder, DecodeState *state, char **text,
                    const char *before = nullptr);

// The result where there is no memory for a value of one piece, which begins at `value`.
[[gnu::cold]] qvsResult lackValue(qvsWbxmlDecoder *decoder, const DecodeState *state,
                                  uint8_t *value);

// qvsCommaAdd onto a text of which `known` may tell more.
qvsResult commaAdd(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, JoinedText *known);

// Reads an inline string at the read position, the byte there included, and drops it.
qvsResult dropInlineString(qvsWbxmlDecoder *decoder, DecodeState *state);

} // namespace qvs

#endif
