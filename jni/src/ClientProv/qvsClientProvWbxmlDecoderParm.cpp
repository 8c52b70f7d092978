// One parm element: the loop that reads it by the table of its characteristic, and its value, which
// is a text or one more item of a list of texts.
#include "qvsParm.h"
#include "qvsstring.h"

using namespace qvs;

namespace {

// ---- Values

// The longest text that may still be read, in bytes.
inline size_t mostText(const DecodeState *state)
{
    return state->textLeft < kLongest ? state->textLeft : kLongest - 1;
}

// Looks at a value, a run of strings and tokens or a token alone, and tells its length and what is
// behind it. False for one that is read piece by piece.
[[gnu::noinline]] bool measure(const qvsWbxmlDecoder *decoder, const DecodeState *state,
                               uint8_t **at, uint32_t *length)
{
    const uint8_t *const end = endOf(decoder->ptBuffer);
    const bool run = *at != end && wbxml::isString(**at);
    Piece piece;
    *length = 0;
    do {
        if (*at == end || !nextPiece(decoder, at, end, &piece) ||
            (run && piece.join != Join::kDirect) || piece.length > mostText(state) - *length) {
            return false;
        }
        *length += piece.length;
    } while (run && !endsRun(**at));
    return true;
}

// readNext() of a value of several pieces: one block is made for them.
[[gnu::noinline]] qvsResult readPieces(qvsWbxmlDecoder *decoder, DecodeState *state, char **text)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    uint8_t *const value = buffer->pHead + 1;
    uint8_t *at = value;
    uint32_t length = 0;
    if (tracking || !measure(decoder, state, &at, &length)) {
        return readValue(decoder, state, text);
    }
    state->textLeft -= length;
    buffer->pHead = at;
    char *block = newText(length + 1, kDecoderModule);
    if (!block) [[unlikely]] {
        return lackValue(decoder, state, value);
    }
    *text = block;
    Piece piece = {};
    for (at = value; !endsRun(*at);) {
        (void)nextPiece(decoder, &at, endOf(buffer), &piece);
        memcpy(block, piece.bytes, piece.length);
        block += piece.length;
    }
    memset(block, 0, 1 + kSpareZeros);
    return QVS_OK;
}

// readValue() of a VALUE that was seen, while nobody takes traces: most are one piece.
[[gnu::noinline]] qvsResult readNext(qvsWbxmlDecoder *decoder, DecodeState *state, char **text)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    uint8_t *const value = buffer->pHead + 1;
    const uint8_t *const end = endOf(buffer);
    uint8_t *at = value;
    Piece piece;
    if (at == end || !nextPiece(decoder, &at, end, &piece) || piece.length > mostText(state)) {
        return readValue(decoder, state, text);
    }
    const uint32_t length = piece.length;
    if (!endsRun(*at) && wbxml::isString(*value)) {
        return readPieces(decoder, state, text);
    }
    state->textLeft -= length;
    buffer->pHead = at;
    char *block = newText(length + 1, kDecoderModule);
    if (!block) [[unlikely]] {
        return lackValue(decoder, state, value);
    }
    memcpy(block, piece.bytes, length);
    memset(block + length, 0, 1 + kSpareZeros);
    *text = block;
    return QVS_OK;
}

// Reads NAME and VALUE of one parameter into `*text`, which is null without a value: as a new text,
// or as one that continues the text `before`.
[[gnu::noinline]] qvsResult readAnyPair(qvsWbxmlDecoder *decoder, DecodeState *state, char **text,
                                        uint8_t token, const char *before)
{
    if (qvsResult result = checkAttr(decoder, token)) {
        return result;
    }
    uint8_t next = 0;
    qvsResult result = QVS_ERROR_WBXML_NO_DATA;
    if (peekByte(decoder->ptBuffer, &next)) {
        switch (next) {
        case wbxml::kSwitchPage:
            (void)switchPage(decoder);
            [[fallthrough]];
        case attr::kValue:
            result = readValue(decoder, state, text, before);
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

// The same where a byte was seen.
inline qvsResult readPair(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token,
                          const char *before)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    const uint8_t *const end = endOf(buffer);
    uint8_t *const name = buffer->pHead;
    if (traceSink || before || *name != token || name + 1 >= end) {
        return readAnyPair(decoder, state, text, token, before);
    }
    if (name[1] == wbxml::kSwitchPage) {
        ++buffer->pHead;
        (void)switchPage(decoder);
        return buffer->pHead < end && *buffer->pHead == attr::kValue
                   ? readNext(decoder, state, text)
                   : readValue(decoder, state, text);
    }
    if (name[1] != attr::kValue) {
        return readAnyPair(decoder, state, text, token, before);
    }
    ++buffer->pHead;
    return readNext(decoder, state, text);
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

// ---- Names given as text

// leaveUnknown() of a VALUE that was seen, while nobody takes traces.
[[gnu::noinline]] qvsResult leaveNext(qvsWbxmlDecoder *decoder, DecodeState *state,
                                      const NamedParms &parms)
{
    uint8_t *at = decoder->ptBuffer->pHead + 1;
    uint32_t length = 0;
    if (!parms.dropsUnknown || !measure(decoder, state, &at, &length)) {
        return leaveUnknown(decoder, state, parms);
    }
    state->textLeft -= length;
    decoder->ptBuffer->pHead = at;
    return QVS_OK;
}

// readNamed() where a name of one piece and a VALUE are next.
inline qvsResult readNamedNext(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                               const NamedParms &parms)
{
    smlBuffer *const buffer = decoder->ptBuffer;
    const uint8_t *const end = endOf(buffer);
    uint8_t *at = buffer->pHead;
    Piece name;
    if (traceSink || *at++ != attr::kName || at == end || !nextPiece(decoder, &at, end, &name) ||
        *at != attr::kValue || name.length == 0 || name.length > state->textLeft) {
        return readNamed(decoder, state, record, attr::kName, parms);
    }
    state->textLeft -= name.length;
    buffer->pHead = at;
    char **field = findNamed(record, parms.names, name.bytes, name.length);
    return field ? readNext(decoder, state, field) : leaveNext(decoder, state, parms);
}

// ---- The loop

// The token behind page switches; another switch at the end of the data.
[[gnu::noinline]] uint8_t skipSwitches(qvsWbxmlDecoder *decoder, const ParmTable &table)
{
    uint8_t token = 0;
    do {
        // kept[parm-switch-ignored]: a switch to an unknown page is no failure by itself.
        (void)switchPage(decoder);
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

// Nearly every parm element has attributes and no content.
constexpr uint8_t kParmStart = tag::kParm | wbxml::kHasAttr;

inline qvsResult takeStart(qvsWbxmlDecoder *decoder)
{
    uint8_t *const at = decoder->ptBuffer->pHead;
    if (at + 1 >= endOf(decoder->ptBuffer) || at[0] != kParmStart ||
        (at[1] & wbxml::kTagMask) == wbxml::kEnd) {
        return checkElement(decoder, tag::kParm);
    }
    decoder->ptBuffer->pHead = at + 1;
    decoder->nHasContent = 0;
    decoder->nHasAttr = 1;
    return QVS_OK;
}

// Takes the END of a parm element, whose flags the decoder keeps.
inline void takeEnd(qvsWbxmlDecoder *decoder)
{
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

inline void traceEntry(const ParmTable &table)
{
    if (traceSink && table.style.entered) {
        trace("qvsClientProvWbxmlDecoderParam%s", table.style.entered);
    }
}

// What a decoder traces of its own behind a parameter and at the end.
inline void traceStep(const ParmTable &table, uint8_t token, qvsResult result)
{
    if (traceSink && table.style.onToken) {
        table.style.onToken(token);
    }
    if (traceSink && table.style.onEnd && (token == wbxml::kEnd || result != QVS_OK)) {
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
        return readPair(decoder, state, textAt(record, parm->field), token, nullptr);
    case ParmType::kList:
        return readList(decoder, state, record, parm->field, parm->place);
    case ParmType::kNamed:
        return readNamedNext(decoder, state, record, *table.named);
    default:
        return table.reader(decoder, state, record);
    }
}

// Reads the parm element at the read position into `record`, its attributes up to END.
inline qvsResult readElement(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                             const ParmTable &table)
{
    if (qvsResult result = takeStart(decoder)) {
        return result;
    }
    uint8_t token = 0;
    while (peekByte(decoder->ptBuffer, &token)) {
        if (token == wbxml::kEnd) {
            takeEnd(decoder);
            traceStep(table, token, QVS_OK);
            return QVS_OK;
        }
        if (token == wbxml::kSwitchPage) {
            token = skipSwitches(decoder, table);
            if (token == wbxml::kSwitchPage) {
                break;
            }
            if (token == wbxml::kEnd) {
                (void)takeSeenTag(decoder); // which may have been masked
                traceStep(table, token, QVS_OK);
                return QVS_OK;
            }
        }
        const qvsResult result = readParm(decoder, state, record, table, token);
        traceStep(table, token, result);
        if (result != QVS_OK) {
            return result;
        }
    }
    return QVS_ERROR_WBXML_NO_DATA;
}

} // namespace

// kept[repeated-parm]: the text that was there stays allocated.
qvsResult qvs::readText(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token)
{
    return readAnyPair(decoder, state, text, token, nullptr);
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
    return readOnto(decoder, state, listAt(record, field), state->open->last + place);
}

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table)
{
    if (record && bytesLeft(decoder) == 0) {
        traceEntry(table);
        return noElement(decoder);
    }
    OpenRecord open = {};
    DecodeState alone = {.open = &open};
    return readParms(decoder, &alone, record, table, false);
}

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                         const ParmTable &table, bool all)
{
    traceEntry(table);
    if (!record) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    const smlBuffer *const buffer = decoder->ptBuffer;
    for (;;) {
        qvsResult result = readElement(decoder, state, record, table);
        if (!all || traceSink) {
            return result;
        }
        while (result == QVS_OK && buffer->pHead < endOf(buffer) &&
               *buffer->pHead == wbxml::kStrI) {
            result = dropInlineString(decoder, state);
        }
        if (result != QVS_OK || buffer->pHead >= endOf(buffer) || *buffer->pHead != kParmStart) {
            return result;
        }
    }
}
