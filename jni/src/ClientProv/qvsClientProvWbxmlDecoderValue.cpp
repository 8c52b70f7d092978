// The values of parameters: the value tokens, how their texts join, and the comma join. Tokens are
// those of the OMA Client Provisioning content.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsFields.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// kept[call-type-join]: a call type joins out of sight, so that the text reads as before.
constexpr ValueToken kCallTypes[] = {
    {0x90, "ANALOG-MODEM", Join::kHidden},
    {0x91, "V.120", Join::kHidden},
    {0x92, "V.110", Join::kHidden},
    {0x93, "X.31", Join::kHidden},
    {0x94, "BIT-TRANSPARENT", Join::kHidden},
    {0x95, "DIRECT-ASYNCHRONOUS-DATA-SERVICE", Join::kHidden},
};

constexpr ValueToken kAuthSchemes[] = {
    {0x91, "HTTP", Join::kComma},
    {0x92, "BASIC", Join::kComma},
    {0x93, "DIGEST", Join::kComma},
};

constexpr ValueToken kAuthTypes[] = {
    {0x9A, "PAP", Join::kComma},
    {0x9B, "CHAP", Join::kComma},
    {0x9C, "HTTP-BASIC", Join::kComma},
    {0x9D, "HTTP-DIGEST", Join::kComma},
    // kept[wtls-underscore]: written with an underscore.
    {0x9E, "WTLS_SS", Join::kComma},
    {0x9F, "MD5", Join::kComma},
};

constexpr ValueToken kAddressTypes[] = {
    {0x85, "IPV4"},  {0x86, "IPV6"},       {0x87, "E164"}, {0x88, "ALPHA"},  {0x89, "APN"},
    {0x8A, "SCODE"}, {0x8B, "TETRA-ITSI"}, {0x8C, "MAN"},  {0x93, "DIGEST"},
};

// In the order in which rows of the same number are compared.
constexpr Rows<ValueToken> kTables[] = {kAddressTypes, kAuthTypes, kAuthSchemes, kCallTypes};

// What a token stands for: a row of a table, counted from 1; row 0 for nothing.
struct Meaning {
    uint8_t table : 2;
    uint8_t row : 4;
};
constexpr uint8_t kMostRows = 15;

// Of the tokens from kFirstValue on; those before it stand for nothing.
constexpr uint8_t kFirstValue = 0x80;
struct Meanings {
    Meaning of[256 - kFirstValue];
};

// Row 0 of every table is compared first, then row 1 of every table, and so on.
// kept[value-token-shadow]: 0x91, 0x92 and 0x93 are thus found among the schemes before the call
// types and the last address type are reached.
consteval Meanings firstHits()
{
    Meanings meanings = {};
    for (uint8_t row = 0; row < kMostRows; ++row) {
        for (size_t t = 0; t < countOf(kTables); ++t) {
            demand(kTables[t].count <= kMostRows);
            if (row < kTables[t].count) {
                Meaning &meaning = meanings.of[kTables[t].first[row].token - kFirstValue];
                if (meaning.row == 0) {
                    meaning.table = t & 3;
                    meaning.row = (row + 1) & kMostRows;
                }
            }
        }
    }
    return meanings;
}

constexpr Meanings kMeanings = firstHits();

} // namespace

const ValueToken *qvs::findValue(uint8_t token)
{
    const Meaning meaning = token < kFirstValue ? Meaning{} : kMeanings.of[token - kFirstValue];
    return meaning.row ? kTables[meaning.table].first + (meaning.row - 1) : nullptr;
}

qvsResult qvs::commaAdd(qvsWbxmlDecoder *decoder, DecodeState *state, char **text,
                        JoinedText *known)
{
    uint8_t token = 0;
    if (!takeByte(decoder, &token) || !peekByte(decoder, &token)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    const bool behindSwitch = token == wbxml::kSwitchPage;
    if (behindSwitch) {
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        if (!peekByte(decoder, &token)) {
            return QVS_ERROR_WBXML_NO_DATA;
        }
    }
    Text joined(*text, known);
    qvsResult result = QVS_OK;
    Piece piece = {",", 1};
    if (!behindSwitch && wbxml::isString(token)) {
        const uint32_t length = joined.length;
        (void)append(state, &joined, piece);
        result = QVS_ERROR_NO_MEMORY;
        if (joined.length > length) {
            result = content(decoder, state, &joined);
        }
    } else {
        // kept[comma-drops-unknown]: a token that stands for no text is dropped.
        if (tokenPiece(token, &piece)) {
            (void)append(state, &joined, piece);
        }
        ++decoder->ptBuffer->pHead;
        result = state->textLimit ? QVS_ERROR_NO_MEMORY : QVS_OK;
    }
    *text = joined.takeKnown(known);
    return result;
}

qvsResult qvsClientProvWbxmlDecoderGetParamTokenVal(uint8_t token, char **text)
{
    Piece piece;
    if (!tokenPiece(token, &piece)) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    DecodeState alone;
    Text built(*text);
    (void)append(&alone, &built, piece); // counts as read in any case
    *text = built.take();
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderParamValue(qvsWbxmlDecoder *decoder, char **text)
{
    DecodeState alone;
    Text built(*text);
    const qvsResult result = paramValue(decoder, &alone, &built);
    *text = built.take();
    return result;
}

qvsResult qvsCommaAdd(qvsWbxmlDecoder *decoder, char **text)
{
    DecodeState alone;
    return commaAdd(decoder, &alone, text, nullptr);
}
