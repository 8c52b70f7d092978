// One parm element: the loop that reads it by the table of its characteristic, and its value, which
// is a text or one more item of a list of texts.
#include "qvsParm.h"

using namespace qvs;

namespace {

// ---- Values

// Reads NAME and VALUE of one parameter onto `text`, step by step.
qvsResult readAnyPair(qvsWbxmlDecoder *decoder, Text *text, uint8_t token)
{
    if (qvsResult result = checkAttr(decoder, token)) {
        return result;
    }
    uint8_t next = 0;
    qvsResult result = QVS_ERROR_WBXML_NO_DATA;
    if (peekByte(decoder, &next)) {
        result = QVS_OK;
        switch (next) {
        case wbxml::kEnd:
            text->before = nullptr;
            trace("DecoderParam : Value is NULL\n");
            break;
        case wbxml::kSwitchPage:
            (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
            result = paramValue(decoder, text);
            break;
        case attr::kValue:
            result = paramValue(decoder, text);
            break;
        default:
            trace("DecoderParam : Tag Code [%d] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n", next);
            result = QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
            break;
        }
    }
    trace("qvsClientProvWbxmlDecoderParamString Error Code:%d", static_cast<int>(result));
    return result;
}

constexpr uint32_t kPlainStart = 3; // NAME, VALUE, STR_I

// The text of a usual parameter, which is NAME, VALUE and one inline string with END behind it, and
// the bytes of it with its NUL. Null for any other, and for one that has something to trace or
// comes near the limit of text.
const uint8_t *plainText(const qvsWbxmlDecoder *decoder, uint8_t token, uint32_t *size)
{
    const uint32_t left = bytesLeft(decoder);
    if (left <= kPlainStart || traceSink) {
        return nullptr;
    }
    const uint8_t *read = decoder->ptBuffer->pHead;
    if (read[0] != token || read[1] != attr::kValue || read[2] != wbxml::kStrI) {
        return nullptr;
    }
    const uint8_t *text = read + kPlainStart;
    const auto *nul = static_cast<const uint8_t *>(memchr(text, '\0', left - kPlainStart));
    if (!nul || nul + 1 == read + left || nul[1] != wbxml::kEnd) {
        return nullptr;
    }
    *size = static_cast<uint32_t>(nul + 1 - text);
    return decoder->nTextRead + *size <= kTextAlways ? text : nullptr;
}

// Reads NAME and VALUE of one parameter onto `text`. The usual ones are read in one go, in half the
// instructions.
qvsResult readPair(qvsWbxmlDecoder *decoder, Text *text, uint8_t token)
{
    uint32_t size = 0;
    const uint8_t *plain = text->holdsText() ? nullptr : plainText(decoder, token, &size);
    if (!plain) {
        return readAnyPair(decoder, text, token);
    }
    text->data = static_cast<char *>(newBlock(size, kDecoderModule));
    if (!text->data) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    memcpy(text->data, plain, size);
    text->length = size - 1;
    text->capacity = size;
    decoder->nTextRead += size - 1;
    decoder->ptBuffer->pHead += kPlainStart + size;
    return QVS_OK;
}

// Adds a text to a list of texts, which is made when there is none. A null text adds nothing.
// The list takes the text over.
qvsResult addText(qvsList **list, char *text)
{
    if (!*list) {
        if (qvsListCreate(list, text) == QVS_OK) {
            return QVS_OK;
        }
        trace("[Error] [qvsClientProvWbxmlDecoderParamListString] ptTmpList NULL");
    } else if (!text || qvsListAddNodeLast(*list, text) == QVS_OK) {
        return QVS_OK;
    }
    qvsMemFree_debug(text);
    return QVS_ERROR_FAILED;
}

// Reads the pairs up to END into `*list`. A later pair of the same element continues the text of
// the one before it in an item of its own.
qvsResult readPairs(qvsWbxmlDecoder *decoder, qvsList **list)
{
    const char *last = nullptr;
    for (;;) {
        uint8_t token = 0;
        if (!peekByte(decoder, &token)) {
            return QVS_ERROR_WBXML_NO_DATA;
        }
        if (token == wbxml::kEnd) {
            return QVS_OK;
        }
        Text text;
        text.before = last;
        if (qvsResult result = readPair(decoder, &text, token)) {
            return result;
        }
        last = text.data ? text.data : text.before;
        if (qvsResult result = addText(list, text.take())) {
            return result;
        }
    }
}

// ---- The loop

// The token the loop decides on next, behind page switches if there are any.
qvsResult nextToken(qvsWbxmlDecoder *decoder, const ParmTable &table, uint8_t *token)
{
    bool present = peekByte(decoder->ptBuffer, token);
    while (present && *token == wbxml::kSwitchPage) {
        // kept[parm-switch-ignored]: a switch to an unknown page is no failure by itself.
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        present = peekByte(decoder, token);
        if (!table.freshTokenAfterSwitch) {
            // kept[parm-switch-masked]: behind a switch the token is seen without its top bits.
            *token &= wbxml::kTagMask;
        }
    }
    return present ? QVS_OK : QVS_ERROR_WBXML_NO_DATA;
}

const Parm *findParm(const ParmTable &table, uint8_t token)
{
    for (const Parm &parm : table.rows) {
        if (parm.token == token) {
            return &parm;
        }
    }
    return nullptr;
}

qvsResult refuse(const ParmTable &table, uint8_t token)
{
    if (table.onRefused) {
        table.onRefused(token);
    } else {
        trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
        trace("qvsClientProvWbxmlDecoderParam%s[%x]", table.name, token);
    }
    return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

// Reads the parameter that `token` announces into its field.
qvsResult readParm(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table, uint8_t token)
{
    const Parm *parm = findParm(table, token);
    if (!parm) {
        return refuse(table, token);
    }
    if (traceSink && table.onParm) {
        table.onParm(token);
    }
    switch (parm->type) {
    case ParmType::kText:
        return qvsClientProvWbxmlDecoderParamString(decoder, textAt(record, parm->field), token);
    case ParmType::kList:
        return qvsClientProvWbxmlDecoderParamListString(decoder, listAt(record, parm->field),
                                                        token);
    default:
        return table.reader(decoder, record);
    }
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderParamString(qvsWbxmlDecoder *decoder, char **text, uint8_t token)
{
    Text read;
    if (qvsResult result = readPair(decoder, &read, token)) {
        return result;
    }
    *text = read.take(); // kept[repeated-parm]: the text that was there stays allocated.
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderParamListString(qvsWbxmlDecoder *decoder, qvsList **list,
                                                   uint8_t /*token*/)
{
    qvsList *built = *list;
    const qvsResult result = readPairs(decoder, &built);
    if (result == QVS_OK) {
        *list = built;
    } else if (!*list) {
        (void)qvsListDeleteNodeAllAndList(built, nullptr);
    }
    return result;
}

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table)
{
    if (traceSink && table.entered) {
        trace("qvsClientProvWbxmlDecoderParam%s", table.entered);
    }
    if (!record) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (qvsResult result = checkElement(decoder, tag::kParm)) {
        return result;
    }
    for (;;) {
        uint8_t token = 0;
        if (qvsResult result = nextToken(decoder, table, &token)) {
            return result;
        }
        const bool end = token == wbxml::kEnd;
        qvsResult result = QVS_OK;
        if (end) {
            (void)takeSeenTag(decoder);
        } else {
            result = readParm(decoder, record, table, token);
        }
        if (traceSink && table.onToken) {
            table.onToken(token);
        }
        if (end || result != QVS_OK) {
            if (traceSink && table.onEnd) {
                table.onEnd(token, result);
            }
            return result;
        }
    }
}
