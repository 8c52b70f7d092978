// The bytes of a body: single bytes, multi-byte integers, strings, the string table, opaque data;
// and the text that the string readers append to.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

constexpr char kNoMemory[] = "[Error] [qvsClientProvWbxmlDecoderGetStr] pszData NULL";

constexpr uint32_t kUnreadTable = 0xFFFFFFFF;
constexpr uint32_t kLongestTable = 0xFFFFFFFD;
constexpr uint32_t kMultiByteMax = 5; // bytes of an mb_u_int32

// Counts text that is read or appended. False once there is too much of it.
bool countText(qvsWbxmlDecoder *decoder, uint32_t count)
{
    DecodeState *state = stateOf(decoder);
    if (!state) {
        return true;
    }
    state->textRead += count;
    if (state->textRead > kTextAlways &&
        state->textRead > kTextPerByte * smlBufferGetDataSize(decoder->ptBuffer)) {
        state->textLimit = true;
    }
    return !state->textLimit;
}

// Moves the read position, at most to the end of the storage.
void skip(qvsWbxmlDecoder *decoder, uint32_t count)
{
    smlBuffer *buffer = decoder->ptBuffer;
    const size_t room = static_cast<size_t>(buffer->pEnd - buffer->pHead);
    buffer->pHead += count < room ? count : room;
}

// A block for the text and its terminator, and in it what the text was and what it continues.
bool grow(Text *text, uint32_t start, uint64_t needed)
{
    uint64_t capacity = needed;
    if (text->data && capacity < uint64_t{text->capacity} * 2) {
        capacity = uint64_t{text->capacity} * 2;
    }
    if (capacity > UINT32_MAX - kSpareZeros) {
        return false;
    }
    char *block = static_cast<char *>(
        qvsMemAlloc_debug(static_cast<uint32_t>(capacity) + kSpareZeros, kDecoderModule, __LINE__));
    if (!block) {
        return false;
    }
    if (start) {
        (void)qvsMemCpy(block, text->data ? text->data : text->before, start);
    }
    block[start] = '\0';
    (void)qvsMemSetZero(block + capacity, kSpareZeros); // opaque data ends in more than one
    qvsMemFree_debug(text->data);
    text->data = block;
    text->length = start;
    text->capacity = static_cast<uint32_t>(capacity);
    return true;
}

// Whether a reference to `index` stays inside the block that holds the string table.
bool isInTable(const qvsWbxmlDecoder *decoder, uint32_t index)
{
    if (!decoder->pStringTable || index > decoder->nStrSize - 1) {
        return false;
    }
    if (decoder->nStrSize == 0) {
        // kept[empty-table-index]: every index passes the check of an empty table; its block of
        // two zero bytes answers 0 and 1 with the empty text.
        // hardened: an index behind that block fails.
        return index < 2;
    }
    const DecodeState *state = stateOf(decoder);
    return decoder->nStrSize != kUnreadTable || (state && index < state->tableBlock);
}

} // namespace

char *qvs::reserve(qvsWbxmlDecoder *decoder, Text *text, uint32_t count)
{
    const uint32_t start = text->data ? text->length : qvsStrlen(text->before);
    const uint32_t copied = text->data ? 0 : start;
    if (!countText(decoder, count) || !countText(decoder, copied)) {
        return nullptr;
    }
    const uint64_t needed = uint64_t{start} + count + 1;
    if (needed > text->capacity && !grow(text, start, needed)) {
        return nullptr;
    }
    return text->data + start;
}

bool qvs::append(qvsWbxmlDecoder *decoder, Text *text, const void *bytes, uint32_t count)
{
    char *end = reserve(decoder, text, count);
    if (!end) {
        return false;
    }
    (void)qvsMemCpy(end, bytes, count);
    end[count] = '\0';
    const void *nul = memchr(end, '\0', count);
    text->length += nul ? static_cast<uint32_t>(static_cast<const char *>(nul) - end) : count;
    return true;
}

bool qvs::getStr(qvsWbxmlDecoder *decoder, Text *text)
{
    if (!decoder || !decoder->ptBuffer) {
        return false;
    }
    const uint32_t left = bytesLeft(decoder);
    const uint8_t *start = decoder->ptBuffer->pHead;
    const void *nul = left ? memchr(start, '\0', left) : nullptr;
    // A string that the data ends in is taken as it stands.
    const uint32_t length =
        nul ? static_cast<uint32_t>(static_cast<const uint8_t *>(nul) - start) : left;
    if (!append(decoder, text, start, length)) {
        trace(kNoMemory);
        return false;
    }
    skip(decoder, length + 1);
    return true;
}

bool qvs::getStrTable(qvsWbxmlDecoder *decoder, Text *text)
{
    uint32_t index = 0;
    if (!qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &index) || !isInTable(decoder, index)) {
        return false;
    }
    const char *entry = decoder->pStringTable + index;
    if (!append(decoder, text, entry, qvsStrlen(entry))) {
        trace(kNoMemory);
        return false;
    }
    return true;
}

bool qvs::getStrExtension(qvsWbxmlDecoder *decoder, uint8_t token, Text *text, uint32_t *length)
{
    if (token != wbxml::kOpaque) {
        return true;
    }
    uint32_t count = 0;
    if (!qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &count)) {
        return false;
    }
    *length = count;
    // hardened: data longer than what is left is refused.
    if (count > bytesLeft(decoder)) {
        return false;
    }
    if (!append(decoder, text, decoder->ptBuffer->pHead, count)) {
        trace(kNoMemory);
        return false;
    }
    skip(decoder, count);
    return true;
}

qvsResult qvs::dropInlineString(qvsWbxmlDecoder *decoder)
{
    Text dropped;
    if (getStr(decoder, &dropped)) {
        return QVS_OK;
    }
    return textLimitPassed(decoder) ? QVS_ERROR_NO_MEMORY : QVS_ERROR_WBXML_NO_DATA;
}

uint32_t qvsClientProvWbxmlDecoderDecodingSize(const qvsWbxmlDecoder *decoder)
{
    if (!decoder || !decoder->ptBuffer) {
        return 0;
    }
    return static_cast<uint32_t>(decoder->ptBuffer->pHead - decoder->ptBuffer->pStorage);
}

uint32_t qvsClientProvWbxmlDecoderBufferReadByte(qvsWbxmlDecoder *decoder, uint8_t *byte)
{
    return takeByte(decoder, byte) ? 1 : 0;
}

uint32_t qvsClientProvWbxmlDecoderBufferReadUint32(qvsWbxmlDecoder *decoder, uint32_t *value)
{
    uint32_t result = 0;
    for (uint32_t i = 0; i < kMultiByteMax; ++i) {
        uint8_t byte = 0;
        if (!takeByte(decoder, &byte)) {
            return 0;
        }
        result = (result << 7) + (byte & 0x7FU); // the high bits of a long value fall off
        if ((byte & 0x80) == 0) {
            *value = result;
            return 1;
        }
    }
    return 0;
}

int32_t qvsClientProvWbxmlDecoderMakeStrTable(qvsWbxmlDecoder *decoder, char **table)
{
    uint32_t length = 0;
    if (!qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &length) || length > kLongestTable) {
        return -1;
    }
    // hardened: the block is as long as the data warrants, whatever length is claimed.
    const uint32_t left = bytesLeft(decoder);
    const uint32_t present = length < left ? length : left;
    char *block =
        static_cast<char *>(qvsMemAllocSetZero_debug(present + 2, kDecoderModule, __LINE__));
    if (!block) {
        trace(kNoMemory);
        return -1;
    }
    (void)qvsMemCpy(block, decoder->ptBuffer->pHead, present);
    skip(decoder, present);
    if (DecodeState *state = stateOf(decoder)) {
        state->tableBlock = present + 2;
    }
    *table = block;
    return present == length ? static_cast<int32_t>(length) : -1;
}

uint32_t qvsClientProvWbxmlDecoderGetStr(qvsWbxmlDecoder *decoder, char **text)
{
    Text built(*text);
    const bool read = getStr(decoder, &built);
    *text = built.take();
    return read ? 1 : 0;
}

uint32_t qvsClientProvWbxmlDecoderGetStrTable(qvsWbxmlDecoder *decoder, char **text)
{
    Text built(*text);
    const bool read = getStrTable(decoder, &built);
    *text = built.take();
    return read ? 1 : 0;
}

uint32_t qvsClientProvWbxmlDecoderGetStrExtension(qvsWbxmlDecoder *decoder, uint8_t token,
                                                  char **data, uint32_t *length)
{
    Text built(*data);
    const bool read = getStrExtension(decoder, token, &built, length);
    *data = built.take();
    return read ? 1 : 0;
}
