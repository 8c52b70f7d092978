// The readers of bytes, tokens and values, called in any order on any bytes.
#include "check.h"
#include "heap.h"
#include "script.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"

namespace fuzz {

namespace {

// Results of a function that reads tokens.
bool isResult(qvsResult result)
{
    switch (result) {
    case QVS_OK:
    case QVS_ERROR_FAILED:
    case QVS_ERROR_BAD_ARGUMENT:
    case QVS_ERROR_WBXML_UNKNOWN_ELEMENT:
    case QVS_ERROR_WBXML_NO_DATA:
    case QVS_ERROR_NO_MEMORY:
        return true;
    default:
        return false;
    }
}

std::string shown(const char *text)
{
    return text ? text : "";
}

class Readers {
public:
    explicit Readers(Script *source) : script(source)
    {
        ops = script->bytes();
        data = script->rest();
        static const uint8_t nothing = 0;
        check(qvsClientProvWbxmlInitDecoder(&decoder, data.empty() ? &nothing : data.data(),
                                            static_cast<uint32_t>(data.size())) == QVS_OK,
              "a decoder is made for any bytes");
    }

    ~Readers()
    {
        qvsMemFree_debug(text);
        (void)qvsListDeleteNodeAllAndList(list, nullptr);
        (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    }

    void run()
    {
        for (size_t i = 0; i + 1 < ops.size(); i += 2) {
            const size_t before = position();
            step(ops[i], ops[i + 1]);
            // An inline string that is read behind the data is empty, and its NUL is stepped over.
            check(position() <= decoder->ptBuffer->nCapacity,
                  "the read position stays inside the storage");
            check(position() + 1 >= before, "one byte at most is given back");
            check(decoder->nCodePage <= 1, "there are two code pages");
        }
    }

private:
    size_t position() const { return qvsClientProvWbxmlDecoderDecodingSize(decoder); }

    size_t left() const { return position() < data.size() ? data.size() - position() : 0; }

    static void known(qvsResult result)
    {
        check(isResult(result), "a reader gives a result that it may give", result);
    }

    void step(uint8_t op, uint8_t argument)
    {
        uint8_t byte = 0;
        switch (op % 29) {
        case 0:
            return readByte();
        case 1:
            return readNumber();
        case 2:
            return inlineString();
        case 3:
            return tableString();
        case 4:
            return opaque(argument);
        case 5:
            return makeTable();
        case 6:
            return header();
        case 7:
            return element();
        case 8:
            return known(qvsClientProvWbxmlDecoderCurElement(decoder, &byte));
        case 9:
            return known(qvsClientProvWbxmlDecoderCurElementNotAND(decoder, &byte));
        case 10:
            return known(qvsClientProvWbxmlDecoderCheckElement(decoder, argument));
        case 11:
            return joins(&Readers::wholeElement, argument);
        case 12:
            return known(qvsClientProvWbxmlDecoderReadAttr(decoder, &byte));
        case 13:
            return known(qvsClientProvWbxmlDecoderCurAttr(decoder, &byte));
        case 14:
            return known(qvsClientProvWbxmlDecoderCheckAttr(decoder, argument));
        case 15:
            return known(qvsClientProvWbxmlDecoderCheckAttrVersion(decoder));
        case 16:
            return known(qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder));
        case 17:
            return known(qvsClientProvWbxmlDecoderSkipAttribute(decoder));
        case 18:
            return known(qvsClientProvWbxmlDecoderCheckCodePage(decoder));
        case 19:
            return joins(&Readers::content, argument);
        case 20:
            return joins(&Readers::string, argument);
        case 21:
            return known(qvsClientProvWbxmlDecoderSkipElement(decoder));
        case 22:
            return joins(&Readers::token, argument);
        case 23:
            return joins(&Readers::value, argument);
        case 24:
            return parameter(argument);
        case 25:
            return listOfTexts(argument);
        case 26:
            return joins(&Readers::comma, argument);
        case 27:
            return known(qvsClientProvWbxmlDecoderWapDocVersion(decoder, nullptr));
        default:
            return parmElement();
        }
    }

    void readByte()
    {
        const size_t before = position();
        const bool there = left() > 0;
        uint8_t byte = 0;
        const bool read = qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte) == 1;
        check(read == there && (!read || (byte == data[before] && position() == before + 1)),
              "the next byte is read if there is one");
    }

    void readNumber()
    {
        size_t at = position();
        uint32_t expected = 0;
        bool ends = false;
        for (int i = 0; i < 5 && !ends && at < data.size(); ++i) {
            expected = expected * 128 + data[at] % 128;
            ends = data[at++] < 128;
        }
        uint32_t number = 0;
        const bool read = qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &number) == 1;
        check(read == ends && (!read || number == expected), "a number is read as it is written",
              number, " instead of ", expected);
    }

    void inlineString()
    {
        const size_t at = position();
        const std::string before = shown(text);
        const uint8_t *start = data.data() + std::min(at, data.size());
        const uint8_t *end = std::find(start, start + left(), uint8_t{0});
        if (qvsClientProvWbxmlDecoderGetStr(decoder, &text) == 1) {
            check(shown(text) == before + std::string(start, end), "an inline string is appended");
        } else {
            tooMuch();
        }
    }

    void tableString()
    {
        const std::string before = shown(text);
        if (qvsClientProvWbxmlDecoderGetStrTable(decoder, &text) == 1) {
            const std::string after = shown(text);
            const std::string added = after.substr(before.size());
            const std::string table(decoder->pStringTable, decoder->nTableBlock);
            check(after.rfind(before, 0) == 0 && table.find(added + '\0') != std::string::npos,
                  "a string of the table is appended", added);
        } else {
            check(shown(text) == before, "a reference that fails appends nothing");
        }
    }

    void opaque(uint8_t argument)
    {
        const uint8_t token = argument % 4 ? 0xC3 : argument;
        const std::string before = shown(text);
        const size_t at = position();
        uint32_t length = 0;
        if (qvsClientProvWbxmlDecoderGetStrExtension(decoder, token, &text, &length) != 1) {
            check(shown(text) == before, "opaque data that fails appends nothing");
        } else if (token == 0xC3) {
            check(length <= data.size() - at, "opaque data is part of the body", length);
            const uint8_t *start = data.data() + position() - length;
            const uint8_t *end = std::find(start, start + length, uint8_t{0});
            check(shown(text) == before + std::string(start, end), "opaque data is appended");
        } else {
            check(position() == at && shown(text) == before, "any other token reads nothing");
        }
    }

    void dropTable()
    {
        qvsMemFree_debug(decoder->pStringTable);
        decoder->pStringTable = nullptr;
    }

    void makeTable()
    {
        dropTable();
        const size_t before = left();
        const int32_t length =
            qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable);
        decoder->nStrSize = static_cast<uint32_t>(length);
        check(length == -1 || static_cast<size_t>(length) <= before,
              "a string table is part of the body", length);
    }

    void header()
    {
        dropTable();
        uint8_t version = 0;
        uint32_t publicId = 0;
        uint32_t charset = 0;
        known(qvsClientProvWbxmlDecoderWbxmlHeader(decoder, &version, &publicId, &charset));
    }

    void element()
    {
        const size_t at = position();
        uint8_t tag = 0;
        const qvsResult result = qvsClientProvWbxmlDecoderReadElement(decoder, &tag);
        known(result);
        if (result == QVS_OK) {
            check(tag == data[at] % 64 && decoder->nHasContent == (data[at] / 64U) % 2 &&
                      decoder->nHasAttr == data[at] / 128U,
                  "an element is its tag and two flags");
        }
    }

    // ---- Values

    qvsResult wholeElement(uint8_t tag)
    {
        return qvsClientProvWbxmlDecoderElement(decoder, tag, &text);
    }
    qvsResult content(uint8_t) { return qvsClientProvWbxmlDecoderContent(decoder, &text); }
    qvsResult string(uint8_t)
    {
        return qvsClientProvWbxmlDecoderGetString(decoder, &text) == 1
                   ? qvsResult{QVS_OK}
                   : qvsResult{QVS_ERROR_WBXML_NO_DATA};
    }
    qvsResult token(uint8_t value)
    {
        return qvsClientProvWbxmlDecoderGetParamTokenVal(value, &text);
    }
    qvsResult value(uint8_t) { return qvsClientProvWbxmlDecoderParamValue(decoder, &text); }
    qvsResult comma(uint8_t) { return qvsCommaAdd(decoder, &text); }

    // A reader that joins what it reads to the text that is there.
    void joins(qvsResult (Readers::*read)(uint8_t), uint8_t argument)
    {
        char *const before = text;
        const std::string said = shown(before);
        known((this->*read)(argument));
        const std::string says = shown(text);
        if (before && before != text && heap::isLive(before)) {
            check(text && says.size() == 1 && static_cast<uint8_t>(says[0]) >= 0x80,
                  "only an unknown token takes the place of a text", says);
            qvsMemFree_debug(before);
        } else {
            check(says.rfind(said, 0) == 0, "a text is only added to", said, " became ", says);
        }
    }

    void parameter(uint8_t name)
    {
        char *const before = text;
        const qvsResult result = qvsClientProvWbxmlDecoderParamString(decoder, &text, name);
        known(result);
        if (result == QVS_OK) {
            check(!before || heap::isLive(before),
                  "a repeated parameter leaves the text before it");
            qvsMemFree_debug(before);
        } else {
            check(text == before, "a parameter that fails stores nothing");
        }
    }

    void listOfTexts(uint8_t name)
    {
        const uint32_t before = list ? qvsListGetCount(list) : 0;
        const qvsResult result = qvsClientProvWbxmlDecoderParamListString(decoder, &list, name);
        known(result);
        check((list ? qvsListGetCount(list) : 0) >= before, "a list only grows");
    }

    // All parameters of an ACCESS are lists, so that none of them leaves a text.
    void parmElement()
    {
        auto *record = qvs::newRecord<qvsWapAccess>("fuzz");
        known(qvsClientProvWbxmlDecoderParamAccess(decoder, record));
        check(qvsClientProvWbxmlDeleteAccess(record) == 1, "a record is released");
    }

    void tooMuch()
    {
        check(decoder->bTextLimit == 1, "a string fails only when there is too much text");
    }

    Script *script;
    std::vector<uint8_t> ops;
    std::vector<uint8_t> data;
    qvsWbxmlDecoder *decoder = nullptr;
    char *text = nullptr;
    qvsList *list = nullptr;
};

// ---- Calls that lack what they need

using qvs::ScopedText;
using Call = qvsResult (*)(qvsWbxmlDecoder *decoder);

template <auto Read>
qvsResult withoutRecord(qvsWbxmlDecoder *decoder)
{
    return Read(decoder, nullptr);
}

// Each refuses a decoder that has nothing to read.
constexpr Call kCalls[] = {
    [](qvsWbxmlDecoder *decoder) {
        const uint8_t *data = decoder && decoder->ptBuffer ? decoder->ptBuffer->pHead : nullptr;
        return qvsClinetProvWbxmlDecoderMain(data, 0) ? qvsResult{QVS_OK}
                                                      : qvsResult{QVS_ERROR_FAILED};
    },
    [](qvsWbxmlDecoder *decoder) {
        qvsWapDoc *document = nullptr;
        return qvsClientProvWbxmlDecoder(decoder, &document);
    },
    [](qvsWbxmlDecoder *decoder) {
        qvsWapDoc *document = nullptr;
        return qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document);
    },
    [](qvsWbxmlDecoder *decoder) { return qvsClientProvWbxmlDecoderCheckElement(decoder, 0); },
    [](qvsWbxmlDecoder *decoder) {
        ScopedText text;
        return qvsClientProvWbxmlDecoderGetStr(decoder, &text.text) ? qvsResult{QVS_OK}
                                                                    : qvsResult{QVS_ERROR_FAILED};
    },
    [](qvsWbxmlDecoder *decoder) { return qvsClientProvWbxmlDecoderSkipAttribute(decoder); },
    [](qvsWbxmlDecoder *decoder) { return qvsClientProvWbxmlDecoderSkipElement(decoder); },
    withoutRecord<qvsClientProvWbxmlDecoderParamPxlogical>,
    withoutRecord<qvsClientProvWbxmlDecoderParamPxAuthInfo>,
    withoutRecord<qvsClientProvWbxmlDecoderParamPort>,
    withoutRecord<qvsClientProvWbxmlDecoderParamPxPhysical>,
    withoutRecord<qvsClientProvWbxmlDecoderParamNapDef>,
    withoutRecord<qvsClientProvWbxmlDecoderParamNapAuthInfo>,
    withoutRecord<qvsClientProvWbxmlDecoderParamValidity>,
    withoutRecord<qvsClientProvWbxmlDecoderParamApplication>,
    withoutRecord<qvsClientProvWbxmlDecoderParamAppAddr>,
    withoutRecord<qvsClientProvWbxmlDecoderParamAppAuth>,
    withoutRecord<qvsClientProvWbxmlDecoderParamResource>,
    withoutRecord<qvsClientProvWbxmlDecoderParamBootstrap>,
    withoutRecord<qvsClientProvWbxmlDecoderParamClientIdentity>,
    withoutRecord<qvsClientProvWbxmlDecoderParamVendorConfig>,
    withoutRecord<qvsClientProvWbxmlDecoderParamAccess>,
    withoutRecord<qvsClientProvWbxmlDecoderParamRoaming>,
    withoutRecord<qvsClientProvWbxmlDecoderParamWifi>,
    withoutRecord<qvsClientProvWbxmlDecoderParamVoWifi>,
};

// Without a decoder, with one that has no buffer, and with one whose buffer is at its end.
void callWithoutData(uint8_t which)
{
    const Call call = kCalls[which % (sizeof kCalls / sizeof *kCalls)];
    check(call(nullptr) != QVS_OK, "nothing is read without a decoder");
    qvsWbxmlDecoder bare = {};
    check(qvsClientProvWbxmlDecoderDecodingSize(&bare) == 0 && call(&bare) != QVS_OK,
          "nothing is read without a buffer");
    qvsWbxmlDecoder *atEnd = nullptr;
    check(qvsClientProvWbxmlInitDecoder(&atEnd, &which, 0) == QVS_OK, "a decoder over no bytes");
    (void)call(atEnd); // an empty string is all that can be read here
    (void)qvsClientProvWbxmlDeleteDecoder(atEnd);
}

} // namespace

void runDecoder(Script *script)
{
    if (script->below(16) == 15) {
        return callWithoutData(script->byte());
    }
    Readers readers(script);
    readers.run();
}

} // namespace fuzz
