// The readers of bytes, tokens and values, called in any order on any bytes.
#include "check.h"
#include "reading_value.h"
#include "script.h"
#include "support/heap.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"

namespace fuzz {

namespace {

std::optional<std::string> textOf(const char *text)
{
    return text ? std::optional<std::string>(text) : std::nullopt;
}

// Runs the readers of the library and those of the reading side by side: results, texts and read
// positions are the same all the way.
class Readers : ValueReader {
public:
    // What to call, and what to read.
    Readers(const std::vector<uint8_t> &calls, const std::vector<uint8_t> &body)
        : ValueReader(body.data(), body.size()), ops(calls)
    {
        static const uint8_t nothing = 0;
        check(qvsClientProvWbxmlInitDecoder(&decoder, size ? data : &nothing,
                                            static_cast<uint32_t>(size)) == QVS_OK,
              "a decoder is made for any bytes");
    }

    ~Readers()
    {
        qvsMemFree_debug(text);
        (void)qvsListDeleteNodeAllAndList(list, nullptr);
        (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    }
    Readers(const Readers &) = delete;
    Readers &operator=(const Readers &) = delete;

    void run()
    {
        for (size_t i = 0; i + 1 < ops.size(); i += 2) {
            step(ops[i], ops[i + 1]);
            // Behind the data strings are empty, and reading goes no further than one byte behind
            // it.
            position = std::min<size_t>(position, decoder->ptBuffer->nCapacity + size_t{1});
            check(qvsClientProvWbxmlDecoderDecodingSize(decoder) == position,
                  "as much is read as the format says", i / 2, ". reader ", ops[i] % 29, ": ",
                  qvsClientProvWbxmlDecoderDecodingSize(decoder), " instead of ", position);
            check(textOf(text) == expected.own, "a text is read as the format says", i / 2,
                  ". reader ", ops[i] % 29, ": ", textOf(text).value_or("(null)"), " instead of ",
                  expected.own.value_or("(null)"));
            check(decoder->nCodePage == page, "the code page is the one that was switched to");
        }
    }

private:
    static void same(qvsResult result, uint32_t theirs)
    {
        check(result == theirs, "a reader gives the result that the format gives", result,
              " instead of ", theirs);
    }

    // For the readers that answer 1 when they read something.
    static void same(uint32_t answer, bool theirs)
    {
        check(answer == (theirs ? 1U : 0U), "a reader succeeds when the format says so", answer);
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
            return same(qvsClientProvWbxmlDecoderGetStr(decoder, &text), inlineString(&expected));
        case 3:
            return same(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text),
                        tableString(&expected));
        case 4:
            return opaqueData(argument);
        case 5:
            return makeTable();
        case 6:
            return wholeHeader();
        case 7:
            return anyElement();
        case 8:
            return same(qvsClientProvWbxmlDecoderCurElement(decoder, &byte), peeked());
        case 9:
            return same(qvsClientProvWbxmlDecoderCurElementNotAND(decoder, &byte), peeked());
        case 10:
            return same(qvsClientProvWbxmlDecoderCheckElement(decoder, argument),
                        element(argument, &byte));
        case 11:
            return wholeElement(argument);
        case 12:
            return same(qvsClientProvWbxmlDecoderReadAttr(decoder, &byte),
                        take(&byte) ? kOk : kNoData);
        case 13:
            return same(qvsClientProvWbxmlDecoderCurAttr(decoder, &byte), peeked());
        case 14:
            return same(qvsClientProvWbxmlDecoderCheckAttr(decoder, argument), attribute(argument));
        case 15:
            return same(qvsClientProvWbxmlDecoderCheckAttrVersion(decoder), version());
        case 16:
            return same(qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder),
                        versionAttributes());
        case 17:
            return same(qvsClientProvWbxmlDecoderSkipAttribute(decoder), skipAttributes());
        case 18:
            return same(qvsClientProvWbxmlDecoderCheckCodePage(decoder), switchPage());
        case 19:
            return oneValue();
        case 20:
            position -= position > 0; // the token of the string was read before
            return same(qvsClientProvWbxmlDecoderGetString(decoder, &text), stringRun(&expected));
        case 21:
            return same(qvsClientProvWbxmlDecoderSkipElement(decoder), skip());
        case 22:
            return valueOf(argument);
        case 23:
            return replaced([this] { return qvsClientProvWbxmlDecoderParamValue(decoder, &text); },
                            [this] { return value(&expected); });
        case 24:
            return parameter(argument);
        case 25:
            return listValues(argument);
        case 26:
            return same(qvsCommaAdd(decoder, &text), comma(&expected));
        case 27:
            return documentElement();
        default:
            return parmElement();
        }
    }

    uint32_t peeked() const
    {
        uint8_t byte = 0;
        return peek(&byte) ? kOk : kNoData;
    }

    void readByte()
    {
        uint8_t ours = 0;
        uint8_t theirs = 0;
        same(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &ours), take(&theirs));
        check(ours == theirs, "the next byte is read");
    }

    void readNumber()
    {
        uint32_t ours = 0;
        uint32_t theirs = 0;
        same(qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &ours), number(&theirs));
        check(ours == theirs, "a number is read as it is written", ours, " instead of ", theirs);
    }

    void opaqueData(uint8_t argument)
    {
        const uint8_t token = argument % 4 ? uint8_t{kOpaque} : argument;
        uint32_t length = 0;
        same(qvsClientProvWbxmlDecoderGetStrExtension(decoder, token, &text, &length),
             token != kOpaque || opaque(&expected));
    }

    void dropTable()
    {
        qvsMemFree_debug(decoder->pStringTable);
        decoder->pStringTable = nullptr;
        table.reset();
    }

    void makeTable()
    {
        dropTable();
        const int32_t length =
            qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable);
        decoder->nStrSize = static_cast<uint32_t>(length);
        readTable();
        check(decoder->nStrSize == tableSize, "a string table is as long as it says", length);
    }

    void wholeHeader()
    {
        dropTable();
        uint8_t version = 0;
        uint32_t publicId = 0;
        uint32_t charset = 0;
        uint32_t theirs = 0;
        same(qvsClientProvWbxmlDecoderWbxmlHeader(decoder, &version, &publicId, &charset),
             header(&theirs));
        check(publicId == theirs, "the public identifier is the one of the header", publicId);
    }

    void anyElement()
    {
        uint8_t tag = 0;
        uint8_t byte = 0;
        const bool there = take(&byte);
        same(qvsClientProvWbxmlDecoderReadElement(decoder, &tag), there ? kOk : kNoData);
        check(!there || (tag == byte % 64 && decoder->nHasContent == byte / 64U % 2 &&
                         decoder->nHasAttr == byte / 128U),
              "an element is its tag and two flags");
    }

    // ---- Values

    // A value that no text stands for takes the place of the text that was there, which stays
    // allocated.
    template <class Ours, class Theirs>
    void replaced(Ours ours, Theirs theirs)
    {
        char *const before = text;
        same(ours(), theirs());
        if (before && before != text && blocks::isLive(before)) {
            check(text && strlen(text) == 1 && static_cast<uint8_t>(*text) >= 0x80,
                  "only an unknown token takes the place of a text", textOf(text).value_or(""));
            qvsMemFree_debug(before);
        }
    }

    void oneValue()
    {
        replaced([this] { return qvsClientProvWbxmlDecoderContent(decoder, &text); },
                 [this] { return content(&expected); });
    }

    void wholeElement(uint8_t tag)
    {
        replaced([this, tag] { return qvsClientProvWbxmlDecoderElement(decoder, tag, &text); },
                 [this, tag] {
                     uint8_t token = 0;
                     uint32_t result = element(tag, &token);
                     if (result == kOk && token & kContentBit) {
                         result = content(&expected);
                         if (result == kOk && !(take(&token) && token == kEnd)) {
                             result = kUnknown;
                         }
                     }
                     return result;
                 });
    }

    void valueOf(uint8_t token)
    {
        const ValueToken *known = valueToken(token);
        if (known) {
            join(&expected, *known);
        }
        same(qvsClientProvWbxmlDecoderGetParamTokenVal(token, &text), known ? kOk : kUnknown);
    }

    void parameter(uint8_t name)
    {
        char *const before = text;
        Text read;
        const uint32_t theirs = pair(name, &read);
        same(qvsClientProvWbxmlDecoderParamString(decoder, &text, name), theirs);
        if (theirs == kOk) {
            check(!before || blocks::isLive(before),
                  "a repeated parameter leaves the text before it");
            qvsMemFree_debug(before);
            expected.own = read.own;
        }
    }

    void listValues(uint8_t name)
    {
        std::vector<std::string> read;
        const bool isNew = !list;
        const uint32_t theirs = listOfTexts(&read);
        same(qvsClientProvWbxmlDecoderParamListString(decoder, &list, name), theirs);
        if (theirs == kOk || !isNew) {
            items.insert(items.end(), read.begin(), read.end());
        }
        check((list ? qvsListGetCount(list) : 0) == items.size(), "a list has as many items");
        void *item = nullptr;
        for (size_t i = 0; i < items.size(); ++i) {
            check(qvsListGetItemIndex(list, &item, static_cast<uint32_t>(i)) == QVS_OK &&
                      items[i] == static_cast<char *>(item),
                  "the items of a list are its values", i);
        }
    }

    // ---- What only begins here

    // Without a place to put it.
    void documentElement()
    {
        uint8_t token = 0;
        uint32_t theirs = element(kDocument, &token);
        if (theirs == kOk && token & kContentBit) {
            theirs = kBadArgument;
        }
        same(qvsClientProvWbxmlDecoderWapDocVersion(decoder, nullptr), theirs);
    }

    // All parameters of an ACCESS are lists, so that none of them leaves a text. Only the tag is
    // held to the format here.
    void parmElement()
    {
        auto *record = qvs::newRecord<qvsWapAccess>("fuzz");
        const qvsResult result = qvsClientProvWbxmlDecoderParamAccess(decoder, record);
        check(qvsClientProvWbxmlDeleteAccess(record) == 1, "a record is released");
        uint8_t token = 0;
        const uint32_t theirs = element(kParm, &token);
        check(theirs == kOk || result == theirs, "a parm is an element of its own");
        position = qvsClientProvWbxmlDecoderDecodingSize(decoder);
        page = decoder->nCodePage;
    }

    const std::vector<uint8_t> &ops;
    qvsWbxmlDecoder *decoder = nullptr;
    char *text = nullptr; // read by the library,
    Text expected;        // and by the reading
    qvsList *list = nullptr;
    std::vector<std::string> items;
};

// ---- Calls that lack what they need

using Call = qvsResult (*)(qvsWbxmlDecoder *decoder);

template <auto Read>
qvsResult withoutRecord(qvsWbxmlDecoder *decoder)
{
    return Read(decoder, nullptr);
}

// With a text, whose reader answers 1 for one that was read.
template <auto Read>
qvsResult withText(qvsWbxmlDecoder *decoder)
{
    char *text = nullptr;
    const uint32_t read = Read(decoder, &text);
    qvsMemFree_debug(text);
    return read ? qvsResult{QVS_OK} : qvsResult{QVS_ERROR_FAILED};
}

template <class Record, auto Read>
qvsResult withName(qvsWbxmlDecoder *decoder)
{
    Record record = {};
    Record *there = &record;
    return Read(decoder, &there, 0x05);
}

template <class Made, auto Read>
qvsResult withPlace(qvsWbxmlDecoder *decoder)
{
    Made *made = nullptr;
    return Read(decoder, &made);
}

// Each refuses a decoder that has nothing to read.
constexpr Call kCalls[] = {
    [](qvsWbxmlDecoder *decoder) {
        const uint8_t *data = decoder && decoder->ptBuffer ? decoder->ptBuffer->pHead : nullptr;
        return qvsClinetProvWbxmlDecoderMain(data, 0) ? qvsResult{QVS_OK}
                                                      : qvsResult{QVS_ERROR_FAILED};
    },
    withPlace<qvsWapDoc, qvsClientProvWbxmlDecoder>,
    withPlace<qvsWapDoc, qvsClientProvWbxmlDecoderWbxmlBody>,
    [](qvsWbxmlDecoder *decoder) { return qvsClientProvWbxmlDecoderCheckElement(decoder, 0); },
    withText<qvsClientProvWbxmlDecoderGetStr>,
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
    withText<qvsClientProvWbxmlDecoderGetString>,
    withPlace<char, qvsClientProvWbxmlDecoderContent>,
    [](qvsWbxmlDecoder *decoder) {
        char *text = nullptr;
        uint32_t length = 0;
        return qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length)
                   ? qvsResult{QVS_OK}
                   : qvsResult{QVS_ERROR_FAILED};
    },
    withPlace<qvsList, qvsClientProvWbxmlDecoderCharacterList>,
    withPlace<qvsWapCharacter, qvsClientProvWbxmlDecoderCharacter>,
    withName<qvsWapNapDef, qvsClientProvWbxmlDecoderParamNapNameString>,
    withName<qvsWapApplication, qvsClientProvWbxmlDecoderParamAppNameString>,
    withName<qvsWapRoaming, qvsClientProvWbxmlDecoderParamRoamingNameString>,
    withName<qvsWapWifi, qvsClientProvWbxmlDecoderParamWifiNameString>,
    withName<qvsWapVoWifi, qvsClientProvWbxmlDecoderParamVoWifiNameString>,
    [](qvsWbxmlDecoder *decoder) {
        char *name = nullptr;
        char *value = nullptr;
        return qvsClientProvWbxmlDecoderParamVendorNameString(decoder, &name, &value, 0x05);
    },
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
    const std::vector<uint8_t> calls = script->bytes();
    const std::vector<uint8_t> body = script->rest();
    Readers(calls, body).run();
}

} // namespace fuzz
