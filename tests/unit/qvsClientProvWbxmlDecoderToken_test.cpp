// The token layer: elements, attributes, code pages, values in any encoding, skipping.
#include "blocks.h"
#include "decoding.h"
#include "qvsText.h"
#include "traces.h"

#include <cstring>

using decoding::Bytes;
using decoding::Decoder;
using decoding::OwnText;

namespace {

class Tokens : public blocks::BlockTest {};
class CodePage : public blocks::BlockTest {};
class Content : public blocks::BlockTest {};
class SkipElement : public blocks::BlockTest {};

// What Content makes of `bytes`, and where it stops.
struct Outcome {
    qvsResult result;
    std::string text;
    uint32_t position;

    bool operator==(const Outcome &) const = default;
};

std::ostream &operator<<(std::ostream &out, const Outcome &outcome)
{
    return out << outcome.result << " \"" << outcome.text << "\" at " << outcome.position;
}

// With the string table "tab\0le".
void giveTable(const Decoder &decoder)
{
    decoder->pStringTable = static_cast<char *>(qvsMemDup_debug("tab\0le\0", 8, "test", __LINE__));
    decoder->nStrSize = 6;
}

Outcome readContent(const Bytes &bytes, const char *before = nullptr)
{
    Decoder decoder(bytes);
    giveTable(decoder);
    OwnText text;
    if (before) {
        text.text = qvsStrdup_debug(before, "test", __LINE__);
    }
    const qvsResult result = qvsClientProvWbxmlDecoderContent(decoder, &text);
    return {result, text.str(), decoder.position()};
}

Outcome skip(const Bytes &bytes)
{
    Decoder decoder(bytes);
    giveTable(decoder);
    const qvsResult result = qvsClientProvWbxmlDecoderSkipElement(decoder);
    return {result, "", decoder.position()};
}

} // namespace

TEST_F(Tokens, ReadElementStoresTheFlagsAndMasksTheTag)
{
    for (int byte = 0; byte < 256; ++byte) {
        Decoder decoder({static_cast<uint8_t>(byte)});
        uint8_t tag = 0xEE;
        EXPECT_EQ(qvsClientProvWbxmlDecoderReadElement(decoder, &tag), QVS_OK);
        EXPECT_EQ(tag, byte & 0x3F);
        EXPECT_EQ(decoder->nHasContent, (byte & 0x40) ? 1U : 0U);
        EXPECT_EQ(decoder->nHasAttr, (byte & 0x80) ? 1U : 0U);
        EXPECT_EQ(qvsClientProvWbxmlDecoderReadElement(decoder, &tag), 4103U);
    }
}

TEST_F(Tokens, PeeksLeaveFlagsAndPositionAlone)
{
    Decoder decoder({0xC6});
    decoder->nHasContent = 9;
    decoder->nHasAttr = 9;
    uint8_t byte = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurElement(decoder, &byte), QVS_OK);
    EXPECT_EQ(byte, 0x06);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurElementNotAND(decoder, &byte), QVS_OK);
    EXPECT_EQ(byte, 0xC6);
    byte = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurAttr(decoder, &byte), QVS_OK);
    EXPECT_EQ(byte, 0xC6);
    EXPECT_EQ(decoder->nHasContent, 9U);
    EXPECT_EQ(decoder->nHasAttr, 9U);
    EXPECT_EQ(decoder.position(), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderReadAttr(decoder, &byte), QVS_OK);
    EXPECT_EQ(byte, 0xC6);
    EXPECT_EQ(decoder->nHasContent, 9U);
    EXPECT_EQ(decoder.position(), 1U);
}

TEST_F(Tokens, EveryReaderAndPeekAnswers4103AtTheEnd)
{
    Decoder decoder({});
    uint8_t byte = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderReadElement(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurElement(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurElementNotAND(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderReadAttr(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurAttr(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(decoder, 0x06), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttr(decoder, 0x06), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttrVersion(decoder), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderSkipAttribute(decoder), 4103U);
}

TEST_F(Tokens, CheckElementTakesTheTagWithAnyFlags)
{
    for (const uint8_t byte : {0x46, 0xC6, 0x86, 0x06}) {
        Decoder decoder({byte, 0x55});
        EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(decoder, 0x06), QVS_OK);
        EXPECT_EQ(decoder.position(), 1U);
        EXPECT_EQ(decoder->nHasContent, (byte & 0x40) ? 1U : 0U);
    }
}

TEST_F(Tokens, CheckElementRefusesAnotherTag)
{
    Decoder decoder({0xC5});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(decoder, 0x06), 4101U);
}

TEST_F(Tokens, CheckElementConsumesTheEndOfAnEmptyElementOnly)
{
    Decoder empty({0x06, 0x01, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(empty, 0x06), QVS_OK);
    EXPECT_EQ(empty.position(), 2U);
    Decoder flagged({0x06, 0xC1});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(flagged, 0x06), QVS_OK);
    EXPECT_EQ(flagged.position(), 2U) << "the END is seen without its top bits";
    EXPECT_EQ(flagged->nHasContent, 0U) << "the flags are those of the element";
    Decoder full({0x46, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(full, 0x06), QVS_OK);
    EXPECT_EQ(full.position(), 1U);
    Decoder last({0x06});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(last, 0x06), QVS_OK);
}

TEST_F(Tokens, CheckElementWithoutADecoderIsOneAndTraced)
{
    Traces traces;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckElement(nullptr, 0x06), 1U);
    EXPECT_TRUE(
        traces.has("[Error] [qvsClientProvWbxmlDecoderCheckElement] ptWbxmlDecoder NULL\n"));
}

TEST_F(Tokens, ElementReadsOneValueAndItsEnd)
{
    Decoder decoder({0x47, 0x03, 'a', 0, 0x01, 0x55});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderElement(decoder, 0x07, &text), QVS_OK);
    EXPECT_EQ(text.str(), "a");
    EXPECT_EQ(decoder.position(), 5U);
}

TEST_F(Tokens, ElementWithoutContentReadsNoValue)
{
    Decoder decoder({0x07, 0x55});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderElement(decoder, 0x07, &text), QVS_OK);
    EXPECT_TRUE(text.isNull());
}

TEST_F(Tokens, ElementFailsWithTheWrongTagOrValueOrEnd)
{
    struct Case {
        Bytes bytes;
        qvsResult result;
    };
    for (const Case &wrong : {Case{{0x46, 0x9A, 0x01}, 4101}, Case{{0x47}, 4103},
                              Case{{0x47, 0x9A}, 4101}, Case{{0x47, 0x9A, 0x02}, 4101}}) {
        Decoder decoder(wrong.bytes);
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderElement(decoder, 0x07, &text), wrong.result);
    }
}

TEST_F(Tokens, CheckAttrRefusesAnotherTokenWithATrace)
{
    Traces traces;
    Decoder decoder({0x06, 0x15});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttr(decoder, 0x06), QVS_OK);
    EXPECT_TRUE(traces.texts.empty());
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttr(decoder, 0x06), 4101U);
    EXPECT_TRUE(traces.has("nId:6, nTemp:15\n"));
    EXPECT_EQ(decoder.position(), 2U);
}

TEST_F(Tokens, CheckAttrVersionTakesBothVersionTokensAlone)
{
    for (int byte = 0; byte < 256; ++byte) {
        Traces traces;
        Decoder decoder({static_cast<uint8_t>(byte)});
        const bool known = byte == 0x45 || byte == 0x46;
        EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttrVersion(decoder), known ? 0U : 4101U);
        EXPECT_EQ(traces.texts.empty(), known);
    }
    Traces traces;
    Decoder decoder({0x4A});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckAttrVersion(decoder), 4101U);
    EXPECT_TRUE(traces.has("[Error] [qvsClientProvWbxmlDecoderCheckAttrVersion] nId [0x4a]\n"));
}

TEST_F(Tokens, SkipAttributeStopsBehindEndLiteralOrExtension)
{
    for (const uint8_t stop : {0x01, 0x04, 0x80}) {
        Decoder decoder({0x55, 0x03, stop, 0x01});
        EXPECT_EQ(qvsClientProvWbxmlDecoderSkipAttribute(decoder), QVS_OK);
        EXPECT_EQ(decoder.position(), 3U);
    }
    Decoder decoder({0x55, 0x03});
    EXPECT_EQ(qvsClientProvWbxmlDecoderSkipAttribute(decoder), 4103U);
}

TEST_F(Tokens, DocumentVersionMayBeATokenOrAString)
{
    Decoder token({0x46, 0x01, 0xC6});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(token), QVS_OK);
    EXPECT_EQ(token.position(), 2U);
    Decoder string({0x45, 0x03, '1', '.', '0', 0, 0x01, 0xC6});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(string), QVS_OK);
    EXPECT_EQ(string.position(), 7U);
    Decoder masked({0x45, 0x83, 0x00, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(masked), QVS_OK);
}

TEST_F(Tokens, DocumentVersionFollowedByAnythingElseIsRefused)
{
    Traces traces;
    Decoder decoder({0x46, 0x47, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder), 4101U);
    EXPECT_TRUE(traces.has("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n"));
    Decoder ended({0x46});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(ended), 4103U);
    Decoder wrong({0x47});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(wrong), 4101U);
}

TEST(Kept, version_skip_ignored)
{
    Decoder decoder({0x45, 0x03, '1', '.'});
    EXPECT_EQ(qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder), QVS_OK);
    EXPECT_EQ(decoder.position(), 4U);
}

TEST_F(CodePage, SwitchesToPageZeroAndOne)
{
    Traces traces;
    Decoder decoder({0x00, 0x01, 0x00, 0x00});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(decoder), QVS_OK);
    EXPECT_EQ(decoder->nCodePage, 1);
    EXPECT_TRUE(traces.has("QVS_WBXML_TAG_SWITCH_PAGE1\n"));
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(decoder), QVS_OK);
    EXPECT_EQ(decoder->nCodePage, 0);
    EXPECT_TRUE(traces.has("QVS_WBXML_TAG_SWITCH_PAGE0\n"));
}

TEST_F(CodePage, RefusesAnyOtherPageAndKeepsTheOneInForce)
{
    Traces traces;
    Decoder decoder({0x00, 0x02});
    decoder->nCodePage = 1;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(decoder), 4101U);
    EXPECT_EQ(decoder->nCodePage, 1);
    EXPECT_TRUE(traces.has("ERROR::QVS_CODE_PAGE_UNKNOWN\n"));
}

TEST_F(CodePage, CutOffSwitchIs4101)
{
    Decoder none({});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(none), 4101U);
    Decoder half({0x00});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(half), 4101U);
}

TEST(Kept, page_masked)
{
    blocks::BlockCheck check;
    Decoder decoder({0x77, 0x41, 0x00, 0x80});
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(decoder), QVS_OK) << "0x77 is not verified";
    EXPECT_EQ(decoder->nCodePage, 1) << "0x41 without its top bits";
    EXPECT_EQ(decoder->nHasContent, 1U);
    EXPECT_EQ(decoder->nHasAttr, 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCheckCodePage(decoder), QVS_OK);
    EXPECT_EQ(decoder->nCodePage, 0);
    EXPECT_EQ(decoder->nHasContent, 0U);
    EXPECT_EQ(decoder->nHasAttr, 1U);
}

TEST_F(Content, ReadsAnInlineStringAndLeavesTheEnd)
{
    EXPECT_EQ(readContent({0x03, 'a', 'b', 0, 0x01}), (Outcome{0, "ab", 4}));
}

TEST_F(Content, MixesStringsReferencesAndTokensInOneValue)
{
    EXPECT_EQ(readContent({0x03, 'a', 'b', 0, 0x83, 0x04, 0x01}), (Outcome{0, "able", 6}));
    EXPECT_EQ(readContent({0x83, 0x00, 0x85, 0x9A, 0x03, 'x', 0, 0x06}),
              (Outcome{0, "tabIPV4,PAPx", 7}));
}

TEST_F(Content, IsAppendedToATextThatIsThere)
{
    EXPECT_EQ(readContent({0x03, 'b', 0, 0x01}, "a"), (Outcome{0, "ab", 3}));
    EXPECT_EQ(readContent({0xC3, 0x01, 'b'}, "a"), (Outcome{0, "ab", 3}));
    EXPECT_EQ(readContent({0x9B}, "a"), (Outcome{0, "a,CHAP", 1}));
}

TEST_F(Content, OfAStringEndsAtEndOrValueAlone)
{
    EXPECT_EQ(readContent({0x03, 'a', 0, 0x06}), (Outcome{0, "a", 3}));
    EXPECT_EQ(readContent({0x03, 'a', 0}), (Outcome{4103, "a", 3}));
    EXPECT_EQ(readContent({0x03, 'a', 0, 0x05, 0x01}).result, 4103U);
    EXPECT_EQ(readContent({0x03, 'a', 0, 0xC3, 0x00, 0x01}).result, 4103U);
    EXPECT_EQ(readContent({0x03, 'a', 0, 0xFE, 0x01}).result, 4103U);
    EXPECT_EQ(readContent({0x83, 0x09, 0x01}).result, 4103U);
}

TEST_F(Content, ReadsOpaqueData)
{
    EXPECT_EQ(readContent({0xC3, 0x02, 'a', 'b', 0x01}), (Outcome{0, "ab", 4}));
    EXPECT_EQ(readContent({0xC3, 0x00, 0x01}), (Outcome{0, "", 2}));
    EXPECT_EQ(readContent({0xC3, 0x05, 'a'}).result, 4103U);
}

TEST_F(Content, ReadsAValueToken)
{
    EXPECT_EQ(readContent({0x87, 0x01}), (Outcome{0, "E164", 1}));
}

TEST_F(Content, MakesAnUnknownHighTokenATextOfItsOwn)
{
    for (const int token : {0x80, 0x84, 0x8D, 0xAB, 0xC2, 0xFE, 0xFF}) {
        EXPECT_EQ(readContent({static_cast<uint8_t>(token), 0x01}),
                  (Outcome{0, std::string(1, static_cast<char>(token)), 1}));
    }
}

TEST(Kept, unknown_token_replaces)
{
    blocks::BlockCheck check;
    Decoder decoder({0xFE});
    char *before = qvsStrdup_debug("abc", "test", __LINE__);
    OwnText text;
    text.text = before;
    EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "\xFE");
    EXPECT_STREQ(before, "abc") << "stays allocated";
    qvsMemFree_debug(before);
}

TEST_F(Content, KnowsTheLengthOfAnUnknownToken)
{
    Decoder decoder({0xFE, 0x03, 'x', 0, 0x01});
    qvs::DecodeState state;
    qvs::Text text;
    ASSERT_EQ(qvs::content(decoder, &state, &text), QVS_OK);
    EXPECT_EQ(text.length, 1U);
    EXPECT_EQ(text.capacity, 2U);
    // What is read next is joined to it.
    ASSERT_EQ(qvs::content(decoder, &state, &text), QVS_OK);
    EXPECT_STREQ(text.data, "\xFEx");
}

TEST_F(Content, SkipsFromAnUnknownLowToken)
{
    Traces traces;
    // 0x07 opens a level that 0x01 closes; the END stays for the caller.
    Decoder decoder({0x22, 0x07, 0x01});
    uint8_t byte = 0;
    (void)qvsClientProvWbxmlDecoderReadAttr(decoder, &byte);
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &text), QVS_OK);
    EXPECT_TRUE(text.isNull());
    EXPECT_EQ(decoder.position(), 2U);
    EXPECT_TRUE(traces.has("WARNING!!!!!!!! Not Support Type Numberic nTag=[22]\n"))
        << "the byte before the token";
    EXPECT_TRUE(traces.has("qvsClientProvWbxmlDecoderContent Error:0\n"));
    EXPECT_EQ(readContent({0x07}).result, 4103U);
}

TEST_F(Content, TracesItsResultOnEveryExit)
{
    struct Case {
        Bytes bytes;
        const char *trace;
    };
    for (const Case &exit : {Case{{}, "Error:4103\n"}, Case{{0x03, 'a', 0, 0x01}, "Error:0\n"},
                             Case{{0xC3, 0x09}, "Error:4103\n"}, Case{{0x9A}, "Error:0\n"},
                             Case{{0xFE}, "Error:0\n"}}) {
        Traces traces;
        (void)readContent(exit.bytes);
        ASSERT_FALSE(traces.texts.empty());
        EXPECT_EQ(traces.texts.back(),
                  std::string("qvsClientProvWbxmlDecoderContent ") + exit.trace);
    }
}

TEST_F(Content, FailsCleanlyWithoutMemory)
{
    for (const Bytes &bytes :
         {Bytes{0x03, 'a', 0, 0x83, 0x00, 0x01}, Bytes{0xC3, 0x01, 'a'}, Bytes{0xFE}}) {
        Decoder decoder(bytes);
        giveTable(decoder);
        long failures = 0;
        for (long n = 0;; ++n) {
            decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
            OwnText text;
            blocks::failAt = n;
            const qvsResult result = qvsClientProvWbxmlDecoderContent(decoder, &text);
            const bool failed = blocks::failAt < 0;
            blocks::reset();
            if (!failed) {
                EXPECT_EQ(result, QVS_OK);
                break;
            }
            EXPECT_EQ(result, 4103U);
            ++failures;
        }
        EXPECT_GE(failures, 1);
    }
}

TEST_F(Content, ReadsNothingWithoutADecoderOrABuffer)
{
    char *text = nullptr;
    qvsWbxmlDecoder empty = {};
    for (qvsWbxmlDecoder *decoder : {static_cast<qvsWbxmlDecoder *>(nullptr), &empty}) {
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetString(decoder, &text), 0U);
        EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &text), 4103U);
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x21), 4103U);
        EXPECT_EQ(text, nullptr);
    }
}

TEST_F(Content, GetStringStepsBackToTheTokenJustRead)
{
    Decoder decoder({0x03, 'a', 0, 0x01});
    uint8_t byte = 0;
    (void)qvsClientProvWbxmlDecoderReadAttr(decoder, &byte);
    OwnText text("x");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetString(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "xa");
    EXPECT_EQ(decoder.position(), 3U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetString(decoder, &text), 0U) << "the NUL is no token";
}

TEST_F(SkipElement, RestsOnTheEndThatClosesTheFirstLevel)
{
    EXPECT_EQ(skip({0x07, 0x01, 0x01}), (Outcome{0, "", 1}));
    EXPECT_EQ(skip({0x07, 0x08, 0x01, 0x01}), (Outcome{0, "", 3}));
}

TEST_F(SkipElement, PassesOverStringsOpaqueDataAndPageSwitches)
{
    EXPECT_EQ(skip({0x07, 0x03, 1, 1, 0, 0x01, 0x01}), (Outcome{0, "", 5}));
    EXPECT_EQ(skip({0x07, 0x83, 0x00, 0x01}), (Outcome{0, "", 3}));
    EXPECT_EQ(skip({0x07, 0xC3, 0x02, 0x01, 0x01, 0x01}), (Outcome{0, "", 5}));
    EXPECT_EQ(skip({0x07, 0x00, 0x01, 0x01}), (Outcome{0, "", 3})) << "0x01 is a page";
    EXPECT_EQ(skip({0x07, 0x00, 0x00, 0x01}), (Outcome{0, "", 3})) << "neither byte is a level";
}

TEST_F(SkipElement, WithoutItsEndIs4103AndTraced)
{
    Traces traces;
    EXPECT_EQ(skip({0x07}).result, 4103U);
    EXPECT_TRUE(traces.has("qvsClientProvWbxmlDecoderSkipElement Error Code:4103\n"));
    EXPECT_EQ(skip({}).result, 4103U);
    EXPECT_EQ(skip({0x07, 0x00}).result, 4103U);
    EXPECT_EQ(skip({0x07, 0x00, 0x01}).result, 4103U);
}

TEST_F(SkipElement, ReturnsTheFailureOfAString)
{
    EXPECT_EQ(skip({0x07, 0x83, 0x77, 0x01}).result, 4103U);
    EXPECT_EQ(skip({0x07, 0xC3, 0x77, 0x01}).result, 4103U);
}

TEST(Kept, skip_counts_tokens)
{
    blocks::BlockCheck check;
    // Tags, attribute starts and value tokens count alike.
    EXPECT_EQ(skip({0x87, 0x06, 0xAB, 0x01, 0x01, 0x01, 0x01}), (Outcome{0, "", 5}));
    // An END at depth 0 makes one more level necessary.
    EXPECT_EQ(skip({0x01, 0x07, 0x08, 0x01, 0x01}), (Outcome{0, "", 3}));
    EXPECT_EQ(skip({0x01, 0x07, 0x01}).result, 4103U);
}

TEST(Kept, skip_end_left)
{
    Decoder decoder({0x07, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderSkipElement(decoder), QVS_OK);
    uint8_t tag = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderReadElement(decoder, &tag), QVS_OK);
    EXPECT_EQ(tag, 0x01);
}
