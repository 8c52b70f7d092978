// One parm element: the loop that reads it by the table of its characteristic, and its value, which
// is a text or one more item of a list of texts.
#include "qvsParm.h"
#include "qvsstring.h"

using namespace qvs;

namespace {

// ---- Values

// Takes the VALUE behind a NAME and reads what it carries, as a new text, or as one that continues
// the text `before`.
inline qvsResult readPairValue(qvsWbxmlDecoder *decoder, DecodeState *state, char **text,
                               const char *before)
{
    if (qvsResult result = checkAttr(decoder, attr::kValue)) {
        return result;
    }
    return before ? continueValue(decoder, state, text, before) : readValue(decoder, state, text);
}

// Reads NAME and VALUE of one parameter into `*text`, which is null without a value: as a new text,
// or as one that continues the text `before`.
inline qvsResult readPair(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token,
                          const char *before)
{
    if (qvsResult result = checkAttr(decoder, token)) {
        return result;
    }
    uint8_t next = 0;
    qvsResult result = QVS_ERROR_WBXML_NO_DATA;
    if (peekByte(decoder->ptBuffer, &next)) {
        switch (next) {
        case wbxml::kSwitchPage:
            (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
            [[fallthrough]];
        case attr::kValue:
            result = readPairValue(decoder, state, text, before);
            break;
        case wbxml::kEnd:
            trace("DecoderParam : Value is NULL\n");
            *text = nullptr;
            result = QVS_OK;
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

// Adds a text to a list of texts, which takes it over. A null text adds nothing. `*end` is the
// list's last node.
qvsResult addText(const DecodeState *state, qvsList **list, char *text, qvsListNode **end)
{
    if (addItem(state->arena, list, text, end) == QVS_OK) {
        return QVS_OK;
    }
    if (!*list) {
        trace("[Error] [qvsClientProvWbxmlDecoderParamListString] ptTmpList NULL");
    }
    qvsMemFree_debug(text);
    return QVS_ERROR_FAILED;
}

// Reads one pair onto the list. `*last` is the text of the pair before it in the same element,
// which a later pair continues in an item of its own.
qvsResult readItem(qvsWbxmlDecoder *decoder, DecodeState *state, qvsList **list, uint8_t token,
                   const char **last, qvsListNode **end)
{
    char *item = nullptr;
    if (qvsResult result = readPair(decoder, state, &item, token, *last)) {
        return result;
    }
    if (item) {
        *last = item;
    }
    return addText(state, list, item, end);
}

// Reads the pairs up to END into `*list`.
qvsResult readItems(qvsWbxmlDecoder *decoder, DecodeState *state, qvsList **list, qvsListNode **end)
{
    const char *last = nullptr;
    uint8_t token = 0;
    while (peekByte(decoder, &token)) {
        if (token == wbxml::kEnd) {
            return QVS_OK;
        }
        if (qvsResult result = readItem(decoder, state, list, token, &last, end)) {
            return result;
        }
    }
    return QVS_ERROR_WBXML_NO_DATA;
}

// Reads one parameter into `*list`, whose last node is `*end`; null when it is not known.
qvsResult readOnto(qvsWbxmlDecoder *decoder, DecodeState *state, qvsList **list, qvsListNode **end)
{
    qvsList *built = *list;
    const qvsResult result = readItems(decoder, state, &built, end);
    if (result == QVS_OK) {
        *list = built;
    } else if (!*list && built) {
        releaseTexts(state->arena, built);
        *end = nullptr;
    }
    return result;
}

// ---- The loop

// The token behind page switches; another switch at the end of the data.
[[gnu::noinline, gnu::cold]] uint8_t skipSwitches(qvsWbxmlDecoder *decoder, const ParmTable &table)
{
    uint8_t token = 0;
    do {
        // kept[parm-switch-ignored]: a switch to an unknown page is no failure by itself.
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        if (!peekByte(decoder->ptBuffer, &token)) {
            return wbxml::kSwitchPage;
        }
        if (!table.style.freshTokenAfterSwitch) {
            // kept[parm-switch-masked]: behind a switch the token is seen without its top bits.
            token &= wbxml::kTagMask;
        }
    } while (token == wbxml::kSwitchPage);
    return token;
}

// Takes the END of a parm element, whose flags the decoder keeps: it has none unless it was masked.
inline void takeEnd(qvsWbxmlDecoder *decoder, bool isMasked)
{
    if (isMasked) [[unlikely]] {
        (void)takeSeenTag(decoder);
        return;
    }
    ++decoder->ptBuffer->pHead;
    decoder->nHasContent = 0;
    decoder->nHasAttr = 0;
}

const ParmRow *findParm(const ParmTable &table, uint8_t token)
{
    for (const ParmRow &parm : table.rows) {
        if (parm.token == token) {
            return &parm;
        }
    }
    return nullptr;
}

[[gnu::noinline, gnu::cold]] qvsResult refuse(const ParmTable &table, uint8_t token)
{
    if (table.style.onRefused) {
        table.style.onRefused(token);
    } else {
        trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
        trace("qvsClientProvWbxmlDecoderParam%s[%x]", table.style.name, token);
    }
    return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

// What a decoder traces of its own behind a parameter and at the end.
[[gnu::noinline, gnu::cold]] void traceStep(const ParmTable &table, uint8_t token, bool end,
                                            qvsResult result)
{
    if (table.style.onToken) {
        table.style.onToken(token);
    }
    if (table.style.onEnd && (end || result != QVS_OK)) {
        table.style.onEnd(token, result);
    }
}

// Reads the parameter that `token` announces into its field.
qvsResult readParm(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                   const ParmTable &table, uint8_t token)
{
    const ParmRow *parm = findParm(table, token);
    if (!parm) {
        return refuse(table, token);
    }
    if (traceSink && table.style.onParm) {
        table.style.onParm(token);
    }
    switch (parm->type) {
    case ParmType::kText:
        return readText(decoder, state, textAt(record, parm->field), token);
    case ParmType::kList:
        return readList(decoder, state, record, parm->field, parm->place);
    case ParmType::kNamed:
        return readNamed(decoder, state, record, token, *table.named);
    default:
        return table.reader(decoder, state, record);
    }
}

} // namespace

// kept[repeated-parm]: the text that was there stays allocated.
qvsResult qvs::readText(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token)
{
    return readPair(decoder, state, text, token, nullptr);
}

qvsResult qvsClientProvWbxmlDecoderParamString(qvsWbxmlDecoder *decoder, char **text, uint8_t token)
{
    DecodeState alone;
    return readText(decoder, &alone, text, token);
}

qvsResult qvsClientProvWbxmlDecoderParamListString(qvsWbxmlDecoder *decoder, qvsList **list,
                                                   uint8_t /*token*/)
{
    DecodeState alone;
    qvsListNode *unknown = nullptr;
    return readOnto(decoder, &alone, list, &unknown);
}

qvsResult qvs::readList(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t field,
                        uint8_t place)
{
    qvsListNode *unknown = nullptr;
    qvsListNode **last = state->open ? state->open->last + place : &unknown;
    return readOnto(decoder, state, listAt(record, field), last);
}

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table)
{
    OpenRecord open = {};
    DecodeState alone = {.open = &open};
    return readParms(decoder, &alone, record, table);
}

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                         const ParmTable &table)
{
    if (traceSink && table.style.entered) {
        trace("qvsClientProvWbxmlDecoderParam%s", table.style.entered);
    }
    if (!record) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (qvsResult result = checkElement(decoder, tag::kParm)) {
        return result;
    }
    uint8_t token = 0;
    while (peekByte(decoder->ptBuffer, &token)) {
        const bool behindSwitch = token == wbxml::kSwitchPage;
        if (behindSwitch) {
            token = skipSwitches(decoder, table);
            if (token == wbxml::kSwitchPage) {
                break;
            }
        }
        qvsResult result = QVS_OK;
        const bool end = token == wbxml::kEnd;
        if (end) {
            takeEnd(decoder, behindSwitch);
        } else {
            result = readParm(decoder, state, record, table, token);
        }
        if (traceSink) {
            traceStep(table, token, end, result);
        }
        if (end || result != QVS_OK) {
            return result;
        }
    }
    return QVS_ERROR_WBXML_NO_DATA;
}
