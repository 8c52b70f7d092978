// A text under construction, and the bytes that the decoder has not read yet.
#ifndef QVSTEXT_H
#define QVSTEXT_H

#include "qvsClientProvWbxml.h"
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

// A text that grows at its end. Its block is exactly as long as the text until the second append,
// from then on it doubles, so that a text made of many pieces costs no more than its length.
// Owns its block until take().
struct Text {
    Text() = default;
    // Goes on with a text that already is a block of its own. `known` may tell its length and
    // capacity, so that a text joined again and again is not measured again and again.
    explicit Text(char *block, const JoinedText *known = nullptr) : data(block)
    {
        if (block && known && known->text == block) {
            length = known->length;
            capacity = known->capacity;
        } else if (block) {
            length = qvsStrlen(block);
            capacity = length + 1;
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

    // Whether there is a text, be it empty, that another one would be joined to.
    [[nodiscard]] bool holdsText() const { return data || before; }

    char *data = nullptr;         // NUL-terminated; null while nothing was read
    uint32_t length = 0;          // bytes before the terminator
    uint32_t capacity = 0;        // bytes of the block
    const char *before = nullptr; // borrowed: the text that the first append continues
};

// Place for `count` more bytes and a terminator at the end of the text, which stays as it is;
// null without memory, or once the texts of the decoder's message passed their limit.
// A null decoder counts nothing.
char *reserve(qvsWbxmlDecoder *decoder, Text *text, uint32_t count);

// Appends `count` bytes, which end the text at the first NUL among them. False as for reserve().
bool append(qvsWbxmlDecoder *decoder, Text *text, const void *bytes, uint32_t count);

// ---- The read position: the head of the buffer. It may stand one byte behind the data.

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

// Gives the byte read last back.
inline void stepBack(qvsWbxmlDecoder *decoder)
{
    smlBuffer *buffer = decoder ? decoder->ptBuffer : nullptr;
    if (buffer && buffer->pHead > buffer->pStorage) {
        --buffer->pHead;
    }
}

// ---- The readers of a text, behind the exported ones of the same name.

bool getStr(qvsWbxmlDecoder *decoder, Text *text);
bool getStrTable(qvsWbxmlDecoder *decoder, Text *text);
bool getStrExtension(qvsWbxmlDecoder *decoder, uint8_t token, Text *text, uint32_t *length);
bool getString(qvsWbxmlDecoder *decoder, uint8_t token, Text *text); // from `token` on, just read
qvsResult content(qvsWbxmlDecoder *decoder, Text *text);
qvsResult getParamTokenVal(qvsWbxmlDecoder *decoder, uint8_t token, Text *text);
qvsResult paramValue(qvsWbxmlDecoder *decoder, Text *text);

// What a value token stands for; null for a token that stands for no text.
const char *valueText(uint8_t token);

// Reads an inline string at the read position, the byte there included, and drops it.
qvsResult dropInlineString(qvsWbxmlDecoder *decoder);

} // namespace qvs

#endif
