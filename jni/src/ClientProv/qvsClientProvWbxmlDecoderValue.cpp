// The values of parameters: the value tokens, how their texts join, and the comma join. Tokens are
// those of the OMA Client Provisioning content.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// How a token's text joins a text that is already there.
enum class Join : uint8_t {
    kDirect, // right behind it
    kComma,  // behind a comma
    kHidden, // behind its terminator
};

struct ValueToken {
    uint8_t token;
    const char *text;
};

constexpr ValueToken kCallTypes[] = {
    {0x90, "ANALOG-MODEM"}, {0x91, "V.120"},           {0x92, "V.110"},
    {0x93, "X.31"},         {0x94, "BIT-TRANSPARENT"}, {0x95, "DIRECT-ASYNCHRONOUS-DATA-SERVICE"},
};

constexpr ValueToken kAuthSchemes[] = {
    {0x91, "HTTP"},
    {0x92, "BASIC"},
    {0x93, "DIGEST"},
};

constexpr ValueToken kAuthTypes[] = {
    {0x9A, "PAP"},
    {0x9B, "CHAP"},
    {0x9C, "HTTP-BASIC"},
    {0x9D, "HTTP-DIGEST"},
    // kept[wtls-underscore]: written with an underscore.
    {0x9E, "WTLS_SS"},
    {0x9F, "MD5"},
};

constexpr ValueToken kAddressTypes[] = {
    {0x85, "IPV4"},  {0x86, "IPV6"},       {0x87, "E164"}, {0x88, "ALPHA"},  {0x89, "APN"},
    {0x8A, "SCODE"}, {0x8B, "TETRA-ITSI"}, {0x8C, "MAN"},  {0x93, "DIGEST"},
};

struct ValueTable {
    const ValueToken *rows;
    size_t count;
    Join join;
};

template <size_t N>
consteval ValueTable table(const ValueToken (&rows)[N], Join join)
{
    return {rows, N, join};
}

// In the order in which rows of the same number are compared.
constexpr ValueTable kTables[] = {
    table(kAddressTypes, Join::kDirect),
    table(kAuthTypes, Join::kComma),
    table(kAuthSchemes, Join::kComma),
    // kept[call-type-join]: a call type joins out of sight, so that the text reads as before.
    table(kCallTypes, Join::kHidden),
};

// What a token stands for: a row of a table, counted from 1; row 0 for nothing.
struct Meaning {
    uint8_t table : 2;
    uint8_t row : 4;
};

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
    for (uint8_t row = 0; row < 9; ++row) {
        for (uint8_t t = 0; t < 4; ++t) {
            if (row < kTables[t].count) {
                Meaning &meaning = meanings.of[kTables[t].rows[row].token - kFirstValue];
                if (meaning.row == 0) {
                    meaning.table = t & 3;
                    meaning.row = (row + 1) & 15;
                }
            }
        }
    }
    return meanings;
}

constexpr Meanings kMeanings = firstHits();

Meaning meaningOf(uint8_t token)
{
    return token < kFirstValue ? Meaning{} : kMeanings.of[token - kFirstValue];
}

bool joinText(qvsWbxmlDecoder *decoder, Text *text, const char *added, Join join)
{
    const uint32_t length = qvsStrlen(added);
    if (!text->holdsText() || join == Join::kDirect) {
        return append(decoder, text, added, length);
    }
    char *end = reserve(decoder, text, length + 1);
    if (!end) {
        return false;
    }
    end[0] = join == Join::kComma ? ',' : '\0';
    (void)qvsStrcpy(end + 1, added);
    if (join == Join::kComma) {
        text->length += length + 1;
    }
    return true;
}

} // namespace

const char *qvs::valueText(uint8_t token)
{
    const Meaning meaning = meaningOf(token);
    return meaning.row ? kTables[meaning.table].rows[meaning.row - 1].text : nullptr;
}

qvsResult qvs::getParamTokenVal(qvsWbxmlDecoder *decoder, uint8_t token, Text *text)
{
    const Meaning meaning = meaningOf(token);
    if (meaning.row == 0) {
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    const ValueTable &table = kTables[meaning.table];
    if (!joinText(decoder, text, table.rows[meaning.row - 1].text, table.join)) {
        // kept[lookup-without-memory]: the text stays as it was and the token counts as read.
        traceException("[Error] [qvsClientProvWbxmlDecoderGetParamTokenVal] pszData NULL",
                       kDecoderModule, __LINE__);
    }
    return QVS_OK;
}

qvsResult qvs::paramValue(qvsWbxmlDecoder *decoder, Text *text)
{
    if (qvsResult result = checkAttr(decoder, attr::kValue)) {
        return result;
    }
    uint8_t next = 0;
    bool present = peekByte(decoder, &next);
    if (present && next == wbxml::kSwitchPage) {
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        present = peekByte(decoder, &next);
        next &= wbxml::kTagMask;
    }
    if (!present) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (next == wbxml::kEnd) {
        return QVS_OK;
    }
    return content(decoder, text);
}

qvsResult qvsClientProvWbxmlDecoderGetParamTokenVal(uint8_t token, char **text)
{
    Text built(*text);
    const qvsResult result = getParamTokenVal(nullptr, token, &built);
    *text = built.take();
    return result;
}

qvsResult qvsClientProvWbxmlDecoderParamValue(qvsWbxmlDecoder *decoder, char **text)
{
    Text built(*text);
    const qvsResult result = paramValue(decoder, &built);
    *text = built.take();
    return result;
}

qvsResult qvsCommaAdd(qvsWbxmlDecoder *decoder, char **text)
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
    const DecodeState *state = stateOf(decoder);
    JoinedText *known = state ? state->joined : nullptr;
    Text joined(*text, known);
    qvsResult result = QVS_OK;
    if (!behindSwitch && wbxml::isString(token)) {
        if (append(decoder, &joined, ",", 1)) {
            result = content(decoder, &joined);
        } else {
            traceException("[Error] [qvsClientProvWbxmlDecoderGetParamTokenVal] pszData NULL",
                           kDecoderModule, __LINE__);
            result = QVS_ERROR_NO_MEMORY;
        }
    } else {
        // kept[comma-drops-unknown]: a token that stands for no text is dropped.
        (void)getParamTokenVal(decoder, token, &joined);
        (void)takeByte(decoder, &token);
        result = textLimitPassed(decoder) ? QVS_ERROR_NO_MEMORY : QVS_OK;
    }
    *text = joined.takeKnown(known);
    return result;
}
