// The parameters of a characteristic as rows, and the one loop that reads a parm element.
#ifndef QVSPARM_H
#define QVSPARM_H

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

#include <stddef.h>

namespace [[gnu::visibility("hidden")]] qvs {

// One parameter of a characteristic: the NAME token that announces it and the field it fills.
// The type of the field is the kind of the parameter: a text, a list of texts, or a reader of its
// own.
template <class Record>
struct Parm {
    using Reader = qvsResult (*)(qvsWbxmlDecoder *decoder, Record *record);

    constexpr Parm(uint8_t t, char *Record::*f, const char *l = nullptr)
        : token(t), text(f), label(l)
    {
    }
    constexpr Parm(uint8_t t, qvsList *Record::*f, const char *l = nullptr)
        : token(t), list(f), label(l)
    {
    }
    constexpr Parm(uint8_t t, Reader f, const char *l = nullptr) : token(t), reader(f), label(l) {}

    uint8_t token;
    char *Record::*text = nullptr;
    qvsList *Record::*list = nullptr;
    Reader reader = nullptr;
    const char *label; // traced before the parameter is read
};

// What sets one decoder's loop apart. Wording and one switch: nothing here decides what is
// accepted.
struct ParmStyle {
    const char *name;                   // named in the trace of a refused token
    bool freshTokenAfterSwitch = false; // read it again instead of peeking at it masked
    void (*onToken)(uint8_t token) = nullptr;
    void (*onRefused)(uint8_t token) = nullptr; // in place of the usual two lines
    void (*onEnd)(uint8_t token, qvsResult result) = nullptr;
};

// The token the loop decides on next, behind page switches if there are any.
inline qvsResult nextToken(qvsWbxmlDecoder *decoder, const ParmStyle &style, uint8_t *token)
{
    qvsResult result = qvsClientProvWbxmlDecoderCurAttr(decoder, token);
    while (result == QVS_OK && *token == wbxml::kSwitchPage) {
        // kept[parm-switch-ignored]: a switch to an unknown page is no failure by itself.
        (void)qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        if (style.freshTokenAfterSwitch) {
            result = qvsClientProvWbxmlDecoderCurAttr(decoder, token);
        } else {
            // kept[parm-switch-masked]: behind a switch the token is seen without its top bits.
            result = qvsClientProvWbxmlDecoderCurElement(decoder, token);
        }
    }
    return result;
}

inline void refuse(const ParmStyle &style, uint8_t token)
{
    if (style.onRefused) {
        style.onRefused(token);
        return;
    }
    trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
    trace("%s[%x]", style.name, token);
}

// Reads the parameter that `token` announces into its field.
template <class Record, size_t N>
qvsResult readParm(qvsWbxmlDecoder *decoder, Record *record, const Parm<Record> (&parms)[N],
                   const ParmStyle &style, uint8_t token)
{
    for (const Parm<Record> &parm : parms) {
        if (parm.token != token) {
            continue;
        }
        if (parm.label) {
            trace("%s", parm.label);
        }
        if (parm.text) {
            return qvsClientProvWbxmlDecoderParamString(decoder, &(record->*parm.text), token);
        }
        if (parm.list) {
            return qvsClientProvWbxmlDecoderParamListString(decoder, &(record->*parm.list), token);
        }
        return parm.reader(decoder, record);
    }
    refuse(style, token);
    return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

// Reads one parm element into `record`. Stops at the END of its attributes, which it consumes,
// or at the first token that is refused or cannot be read.
template <class Record, size_t N>
qvsResult readParms(qvsWbxmlDecoder *decoder, Record *record, const Parm<Record> (&parms)[N],
                    const ParmStyle &style)
{
    if (!record) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckElement(decoder, tag::kParm)) {
        return result;
    }
    for (;;) {
        uint8_t token = 0;
        if (qvsResult result = nextToken(decoder, style, &token)) {
            return result;
        }
        const bool end = token == wbxml::kEnd;
        const qvsResult result = end ? qvsClientProvWbxmlDecoderReadElement(decoder, &token)
                                     : readParm(decoder, record, parms, style, token);
        if (style.onToken) {
            style.onToken(token);
        }
        if (end || result != QVS_OK) {
            if (style.onEnd) {
                style.onEnd(token, result);
            }
            return result;
        }
    }
}

// ---- Parameters whose name is given as text

// A name, and the field that its value goes to.
template <class Record>
struct NamedParm {
    const char *name;
    char *Record::*field;
};

// The name of one parameter and the token behind it.
struct ParmName {
    Text text;
    uint8_t next = 0;
};

// Reads the NAME attribute `tag` and the text behind it, and peeks at the next token. `label` is
// what the traces are written under. QVS_ERROR_FAILED for a name that is not there; an empty one
// is one for `mayBeEmpty` alone.
qvsResult readParmName(qvsWbxmlDecoder *decoder, uint8_t tag, const char *label, bool mayBeEmpty,
                       ParmName *name);

// Reads a VALUE into `*field`, in place of what it held, which stays allocated. On failure the
// field stays.
qvsResult readParmValue(qvsWbxmlDecoder *decoder, char **field);

// The field of `record` that the name selects; null for a name that is not listed.
template <class Record, size_t N>
char **findNamed(Record *record, const NamedParm<Record> (&names)[N], const char *name)
{
    for (const NamedParm<Record> &known : names) {
        if (qvsStrcmp(name, known.name) == 0) {
            return &(record->*known.field);
        }
    }
    return nullptr;
}

} // namespace qvs

#endif
