// The bytes of a body: single bytes, multi-byte integers, strings, the string table, opaque data.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

constexpr uint32_t kLongestTable = 0xFFFFFFFD;

// Appends one piece of a single step.
bool appendOne(char **text, const Piece &piece)
{
    DecodeState alone;
    Text built(*text);
    const bool appended = append(&alone, &built, piece);
    *text = built.take();
    return appended;
}

} // namespace

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
    return takeUint32(decoder, value) ? 1 : 0;
}

int32_t qvsClientProvWbxmlDecoderMakeStrTable(qvsWbxmlDecoder *decoder, char **table)
{
    uint32_t length = 0;
    if (!takeUint32(decoder, &length) || length > kLongestTable) {
        return -1;
    }
    // hardened: the block is as long as the data warrants, whatever length is claimed.
    const uint32_t left = bytesLeft(decoder);
    const uint32_t present = length < left ? length : left;
    char *block =
        static_cast<char *>(qvsMemAllocSetZero_debug(present + 2, kDecoderModule, __LINE__));
    if (!block) {
        trace("[Error] [qvsClientProvWbxmlDecoderGetStr] pszData NULL");
        return -1;
    }
    (void)qvsMemCpy(block, decoder->ptBuffer->pHead, present);
    decoder->ptBuffer->pHead += present;
    *table = block;
    return present == length ? static_cast<int32_t>(length) : -1;
}

uint32_t qvsClientProvWbxmlDecoderGetStr(qvsWbxmlDecoder *decoder, char **text)
{
    Rest rest(decoder);
    if (!rest.at) {
        return 0;
    }
    Piece piece;
    inlinePiece(decoder->ptBuffer, &rest.at, rest.end, &piece);
    if (!appendOne(text, piece)) {
        return 0;
    }
    // hardened: a read position behind the storage goes no further.
    if (decoder->ptBuffer->pHead != rest.end || rest.end <= decoder->ptBuffer->pEnd) {
        decoder->ptBuffer->pHead = rest.at;
    }
    return 1;
}

uint32_t qvsClientProvWbxmlDecoderGetStrTable(qvsWbxmlDecoder *decoder, char **text)
{
    Rest rest(decoder);
    Piece piece;
    const bool found = decoder && tablePiece(decoder, &rest.at, rest.end, &piece);
    if (rest.at) {
        decoder->ptBuffer->pHead = rest.at;
    }
    return found && appendOne(text, piece) ? 1 : 0;
}

uint32_t qvsClientProvWbxmlDecoderGetStrExtension(qvsWbxmlDecoder *decoder, uint8_t token,
                                                  char **data, uint32_t *length)
{
    if (token != wbxml::kOpaque) {
        return 1;
    }
    if (!decoder || !decoder->ptBuffer) {
        return 0;
    }
    Rest rest(decoder);
    Piece piece;
    const bool found = takeOpaque(&rest.at, rest.end, length, &piece);
    decoder->ptBuffer->pHead = found ? piece.unread : rest.at;
    if (!found || !appendOne(data, piece)) {
        return 0;
    }
    decoder->ptBuffer->pHead = rest.at;
    return 1;
}
