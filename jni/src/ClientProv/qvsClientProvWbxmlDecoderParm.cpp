// The loop that reads a parm element by the table of its characteristic, and of any characteristic
// the parameters whose name is given as text.
#include "qvsParm.h"
#include "qvsstring.h"

using namespace qvs;

namespace {

// The token the loop decides on next, behind page switches if there are any.
qvsResult nextToken(qvsWbxmlDecoder *decoder, const ParmTable &table, uint8_t *token)
{
    bool present = peekByte(decoder, token);
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
        trace("%s[%x]", table.name, token);
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
    if (parm->label) {
        trace("%s", parm->label);
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

qvsResult qvs::readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table)
{
    if (table.entered) {
        trace("%s", table.entered);
    }
    if (!record) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckElement(decoder, tag::kParm)) {
        return result;
    }
    for (;;) {
        uint8_t token = 0;
        if (qvsResult result = nextToken(decoder, table, &token)) {
            return result;
        }
        const bool end = token == wbxml::kEnd;
        const qvsResult result = end ? qvsClientProvWbxmlDecoderReadElement(decoder, &token)
                                     : readParm(decoder, record, table, token);
        if (table.onToken) {
            table.onToken(token);
        }
        if (end || result != QVS_OK) {
            if (table.onEnd) {
                table.onEnd(token, result);
            }
            return result;
        }
    }
}

qvsResult qvs::readParmName(qvsWbxmlDecoder *decoder, uint8_t tag, const char *label,
                            bool mayBeEmpty, ParmName *name)
{
    trace("[%s] nTagID [0x%x]", label, tag);
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckAttr(decoder, tag)) {
        return result;
    }
    qvsResult result = content(decoder, &name->text);
    if (result == QVS_OK && !mayBeEmpty && name->text.length == 0) {
        result = QVS_ERROR_FAILED;
    }
    if (result != QVS_OK) {
        // Silent where not even a part of a name was read.
        if (mayBeEmpty || name->text.data || result == QVS_ERROR_FAILED) {
            trace("[%s] pszName NULL", label);
        }
        return result;
    }
    trace("[%s] pszName [%s]", label, name->text.data ? name->text.data : "");
    result = qvsClientProvWbxmlDecoderCurAttr(decoder, &name->next);
    if (result == QVS_OK) {
        trace("[%s] nID [0x%x]", label, name->next);
    }
    return result;
}

qvsResult qvs::readParmValue(qvsWbxmlDecoder *decoder, char **field)
{
    Text value;
    if (qvsResult result = paramValue(decoder, &value)) {
        return result;
    }
    *field = value.take();
    return QVS_OK;
}

char **qvs::findNamed(void *record, const Rows<NamedParm> &names, const char *name)
{
    for (const NamedParm &known : names) {
        if (qvsStrcmp(name, known.name) == 0) {
            return textAt(record, known.field.number);
        }
    }
    return nullptr;
}
