// A text under construction, and the bytes that the decoder has not read yet.
#ifndef QVSTEXT_H
#define QVSTEXT_H

#include "qvsClientProvWbxml.h"
#include "qvsmemory.h"
#include "qvsstring.h"

#include <stddef.h>
#include <stdint.h>
#include <string.h>

namespace [[gnu::visibility("hidden")]] qvs {

// A text that grows at its end. Its block is exactly as long as the text until the second append,
// from then on it doubles, so that a text made of many pieces costs no more than its length.
// Owns its block until take().
struct Text {
    Text() = default;
    // Goes on with a text that already is a block of its own. `known` may tell its length and
    // capacity, so that a text joined again and again is not measured again and again.
    explicit Text(char *block, const qvsJoinedText *known = nullptr) : data(block)
    {
        if (block && known && known->pszText == block) {
            length = known->nLength;
            capacity = known->nCapacity;
        } else if (block) {
            length = qvsStrlen(block);
            capacity = length + 1;
        }
    }
    Text(const Text &) = delete;
    Text &operator=(const Text &) = delete;
    ~Text() { qvsMemFree_debug(data); }

    [[nodiscard]] char *take()
    {
        char *taken = data;
        data = nullptr;
        return taken;
    }

    // take(), with what the constructor may be told of the text.
    [[nodiscard]] char *takeKnown(qvsJoinedText *known)
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

inline bool peekByte(const qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    if (bytesLeft(decoder) == 0) {
        return false;
    }
    *byte = *decoder->ptBuffer->pHead;
    return true;
}

inline bool takeByte(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    if (!peekByte(decoder, byte)) {
        return false;
    }
    ++decoder->ptBuffer->pHead;
    return true;
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
bool getString(qvsWbxmlDecoder *decoder, Text *text);
qvsResult content(qvsWbxmlDecoder *decoder, Text *text);
qvsResult getParamTokenVal(qvsWbxmlDecoder *decoder, uint8_t token, Text *text);
qvsResult paramValue(qvsWbxmlDecoder *decoder, Text *text);

// Reads an inline string at the read position, the byte there included, and drops it.
qvsResult dropInlineString(qvsWbxmlDecoder *decoder);

} // namespace qvs

#endif
