// The value tokens and their joins, single values, lists of values, and the comma join.
#include "qvsDecoding.h"
#include "qvsParm.h"

#include "blocks.h"
#include "decoding.h"
#include "traces.h"

#include <cstring>
#include <functional>
#include <map>
#include <optional>
#include <string>

using decoding::Bytes;
using decoding::Decoder;
using decoding::OwnText;

namespace {

constexpr char kLookupWithoutMemory[] =
    "[Syncml] [Error] [qvsClientProvWbxmlDecoderGetParamTokenVal] pszData NULL "
    "jni/src/ClientProv/qvsClientProvWbxmlDecoder";

class ValueToken : public blocks::BlockTest {};
class ParamValue : public blocks::BlockTest {};
class ParamString : public blocks::BlockTest {};
class ParamList : public blocks::BlockTest {};
class CommaAdd : public blocks::BlockTest {};
class TextLimit : public blocks::BlockTest {};

enum class Join { kDirect, kComma, kHidden };

struct Token {
    const char *text;
    Join join;
};

// Every token that has a text, with the text that it gives.
const std::map<int, Token> kTokens = {
    {0x85, {"IPV4", Join::kDirect}},
    {0x86, {"IPV6", Join::kDirect}},
    {0x87, {"E164", Join::kDirect}},
    {0x88, {"ALPHA", Join::kDirect}},
    {0x89, {"APN", Join::kDirect}},
    {0x8A, {"SCODE", Join::kDirect}},
    {0x8B, {"TETRA-ITSI", Join::kDirect}},
    {0x8C, {"MAN", Join::kDirect}},
    {0x90, {"ANALOG-MODEM", Join::kHidden}},
    {0x91, {"HTTP", Join::kComma}},
    {0x92, {"BASIC", Join::kComma}},
    {0x93, {"DIGEST", Join::kComma}},
    {0x94, {"BIT-TRANSPARENT", Join::kHidden}},
    {0x95, {"DIRECT-ASYNCHRONOUS-DATA-SERVICE", Join::kHidden}},
    {0x9A, {"PAP", Join::kComma}},
    {0x9B, {"CHAP", Join::kComma}},
    {0x9C, {"HTTP-BASIC", Join::kComma}},
    {0x9D, {"HTTP-DIGEST", Join::kComma}},
    {0x9E, {"WTLS_SS", Join::kComma}},
    {0x9F, {"MD5", Join::kComma}},
};

std::string lookUp(std::initializer_list<int> tokens)
{
    OwnText text;
    for (const int token : tokens) {
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(static_cast<uint8_t>(token), &text),
                  QVS_OK);
    }
    return text.str();
}

// The items of a list of texts; a null list has none.
std::vector<std::string> items(const qvsList *list)
{
    std::vector<std::string> texts;
    for (const qvsListNode *node = list ? list->ptFirst : nullptr; node; node = node->ptNext) {
        texts.emplace_back(static_cast<const char *>(node->pItem));
    }
    return texts;
}

// A list that the test releases.
struct OwnList {
    ~OwnList() { (void)qvsListDeleteNodeAllAndList(list, nullptr); }
    qvsList *list = nullptr;
};

using Texts = std::vector<std::string>;

} // namespace

TEST_F(ValueToken, EachOfAllGivesItsTextOrNone)
{
    for (int token = 0; token < 256; ++token) {
        SCOPED_TRACE(token);
        OwnText text;
        const qvsResult result =
            qvsClientProvWbxmlDecoderGetParamTokenVal(static_cast<uint8_t>(token), &text);
        const auto known = kTokens.find(token);
        if (known == kTokens.end()) {
            EXPECT_EQ(result, 4101U);
            EXPECT_TRUE(text.isNull());
        } else {
            EXPECT_EQ(result, QVS_OK);
            EXPECT_EQ(text.str(), known->second.text);
        }
    }
}

TEST_F(ValueToken, EachJoinsATextThatIsThereInItsWay)
{
    for (const auto &[token, known] : kTokens) {
        SCOPED_TRACE(token);
        OwnText text("x");
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(static_cast<uint8_t>(token), &text),
                  QVS_OK);
        const std::string joined[] = {std::string("x") + known.text, std::string("x,") + known.text,
                                      "x"};
        EXPECT_EQ(text.str(), joined[static_cast<int>(known.join)]);
    }
}

TEST_F(ValueToken, UnknownLeavesTheTextAlone)
{
    OwnText text("x");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(0x8D, &text), 4101U);
    EXPECT_EQ(text.str(), "x");
}

TEST_F(ValueToken, TwiceJoinsByTheRuleOfItsTable)
{
    EXPECT_EQ(lookUp({0x85, 0x85}), "IPV4IPV4");
    EXPECT_EQ(lookUp({0x9A, 0x9B}), "PAP,CHAP");
    EXPECT_EQ(lookUp({0x91, 0x92}), "HTTP,BASIC");
    EXPECT_EQ(lookUp({0x90, 0x94}), "ANALOG-MODEM");
    EXPECT_EQ(lookUp({0x94, 0x9A, 0x95, 0x86}), "BIT-TRANSPARENT,PAPIPV6");
}

TEST_F(ValueToken, JoinsAnEmptyTextAsOneThatIsThere)
{
    OwnText text("");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(0x9A, &text), QVS_OK);
    EXPECT_EQ(text.str(), ",PAP");
}

TEST(Kept, call_type_join)
{
    blocks::BlockCheck check;
    OwnText text("PAP");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(0x94, &text), QVS_OK);
    EXPECT_EQ(memcmp(text.text, "PAP\0BIT-TRANSPARENT", 20), 0);
}

TEST(Kept, value_token_shadow)
{
    // The first of the texts that share a token is the one that it gives.
    EXPECT_EQ(lookUp({0x91}), "HTTP");   // not V.120
    EXPECT_EQ(lookUp({0x92}), "BASIC");  // not V.110
    EXPECT_EQ(lookUp({0x93}), "DIGEST"); // not X.31
    EXPECT_EQ(lookUp({0x9A, 0x93}), "PAP,DIGEST") << "not as an address type";
}

TEST(Kept, wtls_underscore)
{
    EXPECT_EQ(lookUp({0x9E}), "WTLS_SS");
}

TEST(Kept, lookup_without_memory)
{
    blocks::BlockCheck check;
    Traces traces;
    for (const char *before : {"", "x"}) {
        for (const int token : {0x85, 0x9A, 0x94}) {
            OwnText text;
            if (*before) {
                text.text = qvsStrdup_debug(before, "test", __LINE__);
            }
            blocks::failAt = 0;
            EXPECT_EQ(qvsClientProvWbxmlDecoderGetParamTokenVal(static_cast<uint8_t>(token), &text),
                      QVS_OK);
            blocks::reset();
            EXPECT_EQ(text.str(), *before ? "x" : "(null)");
        }
    }
    ASSERT_EQ(traces.texts.size(), 6U);
    EXPECT_EQ(traces.texts[0].find(kLookupWithoutMemory), 0U);
}

// What reading one parameter came to: result, text or items, and how far it read.
std::string readAs(const Bytes &bytes, bool list)
{
    Decoder decoder(bytes);
    std::string read;
    if (list) {
        qvsList *items = nullptr;
        read = std::to_string(qvsClientProvWbxmlDecoderParamListString(decoder, &items, 0x15));
        void *item = nullptr;
        for (uint32_t i = 0; items && qvsListGetItemIndex(items, &item, i) == QVS_OK; ++i) {
            read += " " + std::string(static_cast<const char *>(item));
        }
        (void)qvsListDeleteNodeAllAndList(items, nullptr);
    } else {
        OwnText text;
        read = std::to_string(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x15));
        read += " " + text.str();
    }
    return read + " @" + std::to_string(decoder.position());
}

// The usual parameters are read in one go, and step by step while somebody listens to the traces.
TEST_F(ParamString, ReadsInOneGoWhatItReadsStepByStep)
{
    const Bytes parameters[] = {
        {0x15, 0x06, 0x03, 'a', 'b', 0, 0x01},
        {0x15, 0x06, 0x03, 0, 0x01},
        {0x15, 0x06, 0x03, 'a', 0},
        {0x15, 0x06, 0x03, 'a', 'b'},
        {0x15, 0x06, 0x03},
        {0x15, 0x06, 0x03, 'a', 0, 0x06, 0x03, 'b', 0, 0x01},
        {0x15, 0x06, 0x03, 'a', 0, 0x03, 'b', 0, 0x01},
        {0x15, 0x06, 0x03, 'a', 0, 0x15, 0x06, 0x03, 'b', 0, 0x01},
        {0x15, 0x06, 0x85, 0x01},
        {0x15, 0x06, 0x85},
        {0x15, 0x06, 0x85, 0x86, 0x01},
        {0x15, 0x06, 0x94, 0x01},
        {0x15, 0x06, 0xF0, 0x01},
        {0x15, 0x06, 0x04, 0x01},
        {0x15, 0x06, 0x01, 0x01},
        {0x15, 0x06, 0x00, 0x01, 0x03, 'a', 0, 0x01},
        {0x15, 0x06, 0xC3, 0x01, 'a', 0x01},
        {0x15, 0x01},
        {0x15, 0x03, 'a', 0, 0x01},
        {0x16, 0x06, 0x03, 'a', 0, 0x01},
        {0x15},
    };
    for (const bool list : {false, true}) {
        for (const Bytes &bytes : parameters) {
            blocks::BlockCheck check;
            const std::string inOneGo = readAs(bytes, list);
            Traces traces;
            EXPECT_EQ(inOneGo, readAs(bytes, list)) << testing::PrintToString(bytes);
        }
    }
}

TEST_F(ParamString, EndsBehindTheLimitOfText)
{
    const Bytes usual[] = {{0x15, 0x06, 0x03, 'a', 'b', 0, 0x01}, {0x15, 0x06, 0x85, 0x01}};
    for (const Bytes &bytes : usual) {
        const uint64_t length = bytes[2] == 0x03 ? 2 : 4;
        for (const uint64_t beyond : {0, 1}) {
            Decoder decoder(bytes);
            qvs::DecodeState state = {.textLeft = static_cast<size_t>(length - beyond)};
            OwnText text;
            EXPECT_EQ(qvs::readText(decoder, &state, &text, 0x15),
                      beyond ? QVS_ERROR_NO_MEMORY : QVS_OK);
            EXPECT_EQ(state.textLimit, beyond);
        }
    }
}

TEST_F(ParamString, WithoutMemoryFailsForAStringAndGoesOnBehindAToken)
{
    for (const bool traced : {false, true}) {
        std::optional<Traces> traces;
        if (traced) {
            traces.emplace();
        }
        blocks::BlockCheck check;
        Decoder string({0x15, 0x06, 0x03, 'a', 0, 0x01});
        Decoder token({0x15, 0x06, 0x85, 0x01});
        OwnText text;
        blocks::failAt = 0;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(string, &text, 0x15),
                  QVS_ERROR_WBXML_NO_DATA);
        EXPECT_EQ(string.position(), 3U);
        blocks::failAt = 0;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(token, &text, 0x15), QVS_OK);
        EXPECT_EQ(token.position(), 3U);
        blocks::reset();
        EXPECT_TRUE(text.isNull());
    }
}

TEST_F(ParamValue, ReadsTheValueBehindItsToken)
{
    Decoder decoder({0x06, 0x03, 'a', 0, 0x01});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "a");
    EXPECT_EQ(decoder.position(), 4U);
}

TEST_F(ParamValue, WithoutAValueLeavesTheTextAsItWas)
{
    Decoder decoder({0x06, 0x01});
    OwnText text("x");
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "x");
    EXPECT_EQ(decoder.position(), 1U);
}

TEST_F(ParamValue, FollowsAPageSwitchAndThenSeesAMaskedEnd)
{
    Decoder decoder({0x06, 0x00, 0x01, 0x03, 'a', 0, 0x01});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "a");
    EXPECT_EQ(decoder->nCodePage, 1);
    Decoder masked({0x06, 0x00, 0x01, 0x81});
    OwnText none;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(masked, &none), QVS_OK);
    EXPECT_TRUE(none.isNull());
    Decoder unmasked({0x06, 0x81, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(unmasked, &none), QVS_OK);
    EXPECT_EQ(none.str(), "\x81") << "without a switch 0x81 is a value";
}

TEST_F(ParamValue, IgnoresASwitchToAnUnknownPage)
{
    Decoder decoder({0x06, 0x00, 0x05, 0x9A});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "PAP");
    EXPECT_EQ(decoder->nCodePage, 0);
}

TEST_F(ParamValue, FailsWithoutItsTokenOrBehindIt)
{
    OwnText text;
    Decoder wrong({0x05, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(wrong, &text), 4101U);
    for (const Bytes &bytes : {Bytes{}, Bytes{0x06}, Bytes{0x06, 0x00}, Bytes{0x06, 0x00, 0x01},
                               Bytes{0x06, 0x03, 'a', 0}}) {
        Decoder decoder(bytes);
        OwnText read;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamValue(decoder, &read), 4103U);
    }
}

TEST_F(ParamString, ReadsNameAndValue)
{
    Traces traces;
    Decoder decoder({0x11, 0x06, 0x03, 'a', 0, 0x01});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x11), QVS_OK);
    EXPECT_EQ(text.str(), "a");
    EXPECT_EQ(traces.texts.back(), "qvsClientProvWbxmlDecoderParamString Error Code:0\n");
}

TEST_F(ParamString, WithoutAValueIsNull)
{
    Traces traces;
    Decoder decoder({0x11, 0x01});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x11), QVS_OK);
    EXPECT_TRUE(text.isNull());
    EXPECT_EQ(decoder.position(), 1U);
    EXPECT_TRUE(traces.has("DecoderParam : Value is NULL\n\n"));
    Decoder valueless({0x11, 0x06, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(valueless, &text, 0x11), QVS_OK);
    EXPECT_TRUE(text.isNull());
}

TEST_F(ParamString, FollowsAPageSwitchInFrontOfTheValue)
{
    Decoder decoder({0x11, 0x00, 0x01, 0x06, 0x9A, 0x01});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x11), QVS_OK);
    EXPECT_EQ(text.str(), "PAP");
    EXPECT_EQ(decoder->nCodePage, 1);
}

TEST_F(ParamString, RefusesAnotherNameOrWhatIsNoValue)
{
    Traces traces;
    OwnText text("kept");
    Decoder other({0x12, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(other, &text, 0x11), 4101U);
    Decoder noValue({0x11, 0x12});
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(noValue, &text, 0x11), 4101U);
    EXPECT_TRUE(traces.has("DecoderParam : Tag Code [18] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n\n"));
    EXPECT_EQ(traces.texts.back(), "qvsClientProvWbxmlDecoderParamString Error Code:4101\n");
    for (const Bytes &cut : {Bytes{}, Bytes{0x11}, Bytes{0x11, 0x06}, Bytes{0x11, 0x06, 0x03}}) {
        Decoder decoder(cut);
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x11), 4103U);
    }
    EXPECT_EQ(text.str(), "kept");
}

TEST(Kept, repeated_parm)
{
    blocks::BlockCheck check;
    char *first = qvsStrdup_debug("first", "test", __LINE__);
    for (const Bytes &bytes : {Bytes{0x11, 0x06, 0x03, 'b', 0, 0x01}, Bytes{0x11, 0x01}}) {
        Decoder decoder(bytes);
        OwnText text;
        text.text = first;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x11), QVS_OK);
        EXPECT_NE(text.text, first);
        EXPECT_STREQ(first, "first") << "stays allocated";
    }
    qvsMemFree_debug(first);
}

TEST_F(ParamList, MakesAListOfTheFirstValueAndAppendsTheNext)
{
    OwnList own;
    for (const char *value : {"a", "b"}) {
        Decoder decoder({0x17, 0x06, 0x03, static_cast<uint8_t>(*value), 0, 0x01});
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), QVS_OK);
        EXPECT_EQ(decoder.position(), 5U) << "the END is left";
    }
    EXPECT_EQ(items(own.list), (Texts{"a", "b"}));
    EXPECT_EQ(own.list->nCount, 2U);
}

TEST_F(ParamList, AtItsEndHandsOutTheListAsItIs)
{
    Decoder decoder({0x01});
    OwnList own;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), QVS_OK);
    EXPECT_EQ(own.list, nullptr);
    EXPECT_EQ(decoder.position(), 0U);
}

TEST_F(ParamList, WithoutAValueMakesAnEmptyListOrAddsNothing)
{
    for (const Bytes &bytes : {Bytes{0x17, 0x01}, Bytes{0x17, 0x06, 0x01}}) {
        OwnList own;
        Decoder first(bytes);
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(first, &own.list, 0x17), QVS_OK);
        ASSERT_NE(own.list, nullptr);
        EXPECT_EQ(own.list->nCount, 0U);
        Decoder second(bytes);
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(second, &own.list, 0x17), QVS_OK);
        EXPECT_EQ(own.list->nCount, 0U);
    }
}

TEST_F(ParamList, TakesAnyNameBehindTheFirstPair)
{
    struct Case {
        Bytes second;
        Texts expected;
    };
    // What stands behind a first pair of the opaque value a, up to END. (A string ends at END or
    // VALUE alone, so a name behind one is not reached.)
    for (const Case &pair : {
             Case{{0x22, 0x06, 0xC3, 0x01, 'b'}, {"a", "ab"}},
             Case{{0x22, 0x06, 0x03, 'b', 0}, {"a", "ab"}},
             Case{{0x22, 0x06, 0x9A}, {"a", "a,PAP"}},
             Case{{0x22, 0x06, 0x94}, {"a", "a"}},
             Case{{0x22, 0x06, 0x85}, {"a", "aIPV4"}},
             Case{{0x22, 0x06, 0xFE}, {"a", "\xFE"}},
             Case{{0x22}, {"a"}},
             Case{{0x22, 0x06, 0x85, 0x22, 0x06, 0x9A}, {"a", "aIPV4", "aIPV4,PAP"}},
             Case{{0x22, 0x06, 0xFE, 0x22, 0x06, 0xC3, 0x01, 'c'},
                  {"a", "\xFE",
                   "\xFE"
                   "c"}},
             Case{{0x06, 0x06, 0xC3, 0x01, 'b'}, {"a", "ab"}},
         }) {
        Bytes bytes = {0x17, 0x06, 0xC3, 0x01, 'a'};
        bytes.insert(bytes.end(), pair.second.begin(), pair.second.end());
        bytes.push_back(0x01);
        Decoder decoder(bytes);
        OwnList own;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), QVS_OK);
        EXPECT_EQ(items(own.list), pair.expected);
    }
}

TEST_F(ParamList, StringIsNotFollowedByAnotherName)
{
    Decoder decoder({0x17, 0x06, 0x03, 'a', 0, 0x22, 0x06, 0x03, 'b', 0, 0x01});
    OwnList own;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), 4103U);
    EXPECT_EQ(own.list, nullptr);
}

TEST_F(ParamList, LaterPairWithoutAValueAddsNoItem)
{
    // The value of the second pair is skipped up to the END behind 0x07.
    Decoder skipped({0x17, 0x06, 0x9A, 0x22, 0x06, 0x07, 0x01});
    OwnList first;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(skipped, &first.list, 0x17), QVS_OK);
    EXPECT_EQ(items(first.list), Texts{"PAP"});
    Decoder ended({0x17, 0x06, 0x9A, 0x22, 0x06, 0x01});
    OwnList second;
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(ended, &second.list, 0x17), QVS_OK);
    EXPECT_EQ(items(second.list), Texts{"PAP"});
}

TEST_F(ParamList, FailureBehindAGoodPairReleasesANewListAndKeepsAnOldOne)
{
    const Bytes bytes = {0x17, 0x06, 0xC3, 0x01, 'a', 0x22, 0x33};
    {
        Decoder decoder(bytes);
        OwnList own;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), 4101U);
        EXPECT_EQ(own.list, nullptr);
    }
    Decoder decoder(bytes);
    OwnList own;
    ASSERT_EQ(qvsListCreate(&own.list, qvsStrdup_debug("x", "test", __LINE__)), QVS_OK);
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), 4101U);
    EXPECT_EQ(items(own.list), (Texts{"x", "a"}));
}

TEST_F(ParamList, FailsCleanlyWhereItIsCutOff)
{
    const Bytes whole = {0x17, 0x06, 0xC3, 0x01, 'a', 0x17, 0x06, 0x03, 'b', 0, 0x01};
    for (size_t length = 0; length < whole.size(); ++length) {
        Decoder decoder(Bytes(whole.begin(), whole.begin() + static_cast<long>(length)));
        OwnList own;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17), 4103U);
        EXPECT_EQ(own.list, nullptr);
    }
}

TEST_F(ParamList, FailsCleanlyWithoutMemory)
{
    Traces traces;
    const long failures = blocks::failEach([] {
        const long at = blocks::failAt;
        blocks::failAt = -1;
        Decoder decoder({0x17, 0x06, 0xC3, 0x01, 'a', 0x17, 0x06, 0x03, 'b', 0, 0x01});
        blocks::failAt = at;
        OwnList own;
        const qvsResult result = qvsClientProvWbxmlDecoderParamListString(decoder, &own.list, 0x17);
        const bool failed = blocks::failAt < 0;
        EXPECT_TRUE(failed ? result == 1U || result == 4103U : result == QVS_OK) << result;
        EXPECT_EQ(own.list == nullptr, failed);
    });
    EXPECT_EQ(failures, 5) << "two texts, a list and two nodes";
    EXPECT_TRUE(traces.has("[Error] [qvsClientProvWbxmlDecoderParamListString] ptTmpList NULL\n"));
}

TEST_F(ParamList, TracesNoMissingListWhereOneIsThereAndItsNodeIsNot)
{
    OwnList own;
    Decoder first({0x17, 0x06, 0x85, 0x01});
    ASSERT_EQ(qvsClientProvWbxmlDecoderParamListString(first, &own.list, 0x17), QVS_OK);
    Decoder second({0x17, 0x06, 0x86, 0x01});
    Traces traces;
    blocks::failAt = 1; // the text can be had
    EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(second, &own.list, 0x17), 1U);
    blocks::reset();
    EXPECT_EQ(own.list->nCount, 1U);
    EXPECT_FALSE(traces.has("[Error] [qvsClientProvWbxmlDecoderParamListString] ptTmpList NULL\n"));
}

TEST_F(CommaAdd, JoinsAStringBehindAComma)
{
    Decoder decoder({0x90, 0x03, 'x', 0, 0x01});
    OwnText text("HTTP");
    EXPECT_EQ(qvsCommaAdd(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "HTTP,x");
    EXPECT_EQ(decoder.position(), 4U);
    Decoder alone({0x90, 0x03, 'x', 0, 0x01});
    OwnText none;
    EXPECT_EQ(qvsCommaAdd(alone, &none), QVS_OK);
    EXPECT_EQ(none.str(), ",x");
}

TEST_F(CommaAdd, JoinsAValueTokenByItsOwnRule)
{
    Decoder decoder({0x77, 0x92, 0x01});
    OwnText text("HTTP");
    EXPECT_EQ(qvsCommaAdd(decoder, &text), QVS_OK) << "the first byte may be any";
    EXPECT_EQ(text.str(), "HTTP,BASIC");
    EXPECT_EQ(decoder.position(), 2U);
}

TEST(Kept, comma_drops_unknown)
{
    for (const int unknown : {0x01, 0x06, 0xAB, 0xC3}) {
        Decoder decoder({0x90, static_cast<uint8_t>(unknown), 0x01});
        OwnText text("HTTP");
        EXPECT_EQ(qvsCommaAdd(decoder, &text), QVS_OK);
        EXPECT_EQ(text.str(), "HTTP");
        EXPECT_EQ(decoder.position(), 2U);
    }
}

TEST_F(CommaAdd, TakesOneTokenBehindAPageSwitch)
{
    Decoder decoder({0x90, 0x00, 0x01, 0x93, 0x01});
    OwnText text("HTTP");
    EXPECT_EQ(qvsCommaAdd(decoder, &text), QVS_OK);
    EXPECT_EQ(text.str(), "HTTP,DIGEST");
    EXPECT_EQ(decoder->nCodePage, 1);
    EXPECT_EQ(decoder.position(), 4U);
    Decoder string({0x90, 0x00, 0x01, 0x03, 'x', 0});
    EXPECT_EQ(qvsCommaAdd(string, &text), QVS_OK);
    EXPECT_EQ(text.str(), "HTTP,DIGEST") << "a string token counts as an unknown one there";
    EXPECT_EQ(string.position(), 4U);
}

TEST_F(CommaAdd, IsCutOffWith4103)
{
    for (const Bytes &bytes : {Bytes{}, Bytes{0x90}, Bytes{0x90, 0x00}, Bytes{0x90, 0x00, 0x01},
                               Bytes{0x90, 0x03, 'a'}}) {
        Decoder decoder(bytes);
        OwnText text("HTTP");
        EXPECT_EQ(qvsCommaAdd(decoder, &text), 4103U);
    }
}

TEST_F(CommaAdd, WithoutMemoryIs4111AndKeepsTheText)
{
    Decoder decoder({0x90, 0x03, 'x', 0, 0x01});
    OwnText text("HTTP");
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsCommaAdd(decoder, &text), 4111U);
    blocks::reset();
    EXPECT_EQ(text.str(), "HTTP");
    ASSERT_EQ(traces.texts.size(), 1U);
    EXPECT_EQ(traces.texts[0].find(kLookupWithoutMemory), 0U);
}

TEST_F(CommaAdd, GoesOnWithALengthItAlreadyKnows)
{
    qvs::JoinedText known = {};
    Decoder decoder({0x90, 0x92, 0x90, 0x03, 'x', 0, 0x06});
    qvs::DecodeState state;
    OwnText text("HTTP");
    EXPECT_EQ(qvs::commaAdd(decoder, &state, &text, &known), QVS_OK);
    EXPECT_EQ(known.text, text.text);
    EXPECT_EQ(known.length, 10U);
    EXPECT_EQ(qvs::commaAdd(decoder, &state, &text, &known), QVS_OK);
    EXPECT_EQ(text.str(), "HTTP,BASIC,x");
    EXPECT_EQ(known.length, 12U);
}

std::string blocksFor(const Bytes &bytes,
                      const std::function<qvsResult(Decoder &, OwnText &)> &read)
{
    Decoder decoder(bytes);
    OwnText text;
    blocks::startCounting();
    EXPECT_EQ(read(decoder, text), QVS_OK);
    return std::to_string(blocks::allocations()) + " for " + text.str();
}

Bytes valueOf(const std::string &letters)
{
    Bytes bytes = {0x15, 0x06};
    for (const char letter : letters) {
        bytes.insert(bytes.end(), {0x03, static_cast<uint8_t>(letter), 0});
    }
    bytes.push_back(0x01);
    return bytes;
}

TEST_F(ParamString, DoublesTheBlockThatPiecesDoNotFitIn)
{
    const auto read = [](Decoder &decoder, OwnText &text) {
        return qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x15);
    };
    EXPECT_EQ(blocksFor(valueOf("a"), read), "1 for a");
    EXPECT_EQ(blocksFor(valueOf("ab"), read), "2 for ab");
    EXPECT_EQ(blocksFor(valueOf("abcdefghijklm"), read), "4 for abcdefghijklm");
}

TEST_F(ParamString, MakesOneBlockForThePiecesOfAParm)
{
    const auto read = [](Decoder &decoder, OwnText &text) {
        qvsWapPxLogical record = {};
        const qvsResult result = qvsClientProvWbxmlDecoderParamPxlogical(decoder, &record);
        text.text = record.pszProxyId;
        return result;
    };
    for (const char *letters : {"a", "ab", "abcdefghijklm"}) {
        Bytes parm = {0x87};
        const Bytes value = valueOf(letters);
        parm.insert(parm.end(), value.begin(), value.end());
        EXPECT_EQ(blocksFor(parm, read), std::string("1 for ") + letters);
    }
}

// The value of a parm, or what became of it.
std::string valueInParm(const Bytes &value, size_t left = SIZE_MAX, bool lacksMemory = false)
{
    Bytes parm = {0x87, 0x15, 0x06};
    parm.insert(parm.end(), value.begin(), value.end());
    parm.push_back(0x01);
    Decoder decoder(parm);
    qvsWapPxLogical record = {};
    qvs::DecodeState state = {.textLeft = left};
    if (lacksMemory) {
        blocks::failAt = 0;
    }
    const qvsResult result = qvs::readParms(decoder, &state, &record, qvs::kPxLogicalParms.table);
    OwnText text;
    text.text = record.pszProxyId;
    return (result ? std::to_string(result) + " at " + std::to_string(decoder.position())
                   : text.str()) +
           (state.textLimit ? ", too much" : "");
}

TEST_F(ParamString, JoinsThePiecesOfAParmAsTheirTokensSay)
{
    EXPECT_EQ(valueInParm({0x03, 'a', 0, 0x86, 0x03, 'b', 0}), "aIPV6b");
    EXPECT_EQ(valueInParm({0x03, 'a', 0, 0x9A, 0x03, 'b', 0}), "a,PAPb");
    EXPECT_EQ(valueInParm({0x03, 'a', 0, 0x94, 0x03, 'b', 0}), "ab");
    EXPECT_EQ(valueInParm({0x03, 0, 0x03, 0}), "");
    EXPECT_EQ(valueInParm({0x03, 'a', 0, 0x02}), "4103 at 7");
    EXPECT_EQ(valueInParm({0x03, 'a', 0, 0x83, 0x09}), "4103 at 8");
}

TEST_F(ParamString, CountsThePiecesOfAParmTogether)
{
    const Bytes value = {0x03, 'a', 'b', 0, 0x03, 'c', 0};
    EXPECT_EQ(valueInParm(value, 3), "abc");
    EXPECT_EQ(valueInParm(value, 2), "4111 at 8, too much");
    EXPECT_EQ(valueInParm(value, 1), "4111 at 4, too much");
}

TEST_F(ParamString, OfAParmInPiecesWithoutMemoryIs4103AtTheFirst)
{
    for (const Bytes &value : {Bytes{0x03, 'a', 0}, Bytes{0x03, 'a', 0, 0x03, 'b', 0}}) {
        EXPECT_EQ(valueInParm(value, SIZE_MAX, true), "4103 at 4");
    }
}

// A table of one megabyte, and references to it until the texts pass their limit.
TEST_F(TextLimit, EndsTheDecodeWith4111BeyondBothItsBounds)
{
    constexpr uint32_t kEntry = 1024 * 1024;
    Bytes bytes = {0x83, 0x00, 0x01};
    for (const uint32_t padding : {1000U, 200000U}) {
        bytes.resize(3 + padding, 0x55);
        const uint64_t limit = std::max<uint64_t>(8 * 1024 * 1024, 100 * bytes.size());
        Decoder decoder(bytes);
        decoder->pStringTable =
            static_cast<char *>(qvsMemAllocSetZero_debug(kEntry + 1, "test", __LINE__));
        memset(decoder->pStringTable, 'a', kEntry);
        decoder->nStrSize = kEntry;
        qvs::DecodeState state = qvs::wholeDecode(decoder);
        uint64_t total = 0;
        for (;;) {
            decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
            qvs::Text text;
            total += kEntry;
            const qvsResult result = qvs::content(decoder, &state, &text);
            if (total > limit) {
                EXPECT_EQ(result, 4111U);
                break;
            }
            ASSERT_EQ(result, QVS_OK) << total;
        }
        // From then on no text is read at all.
        decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
        OwnText text("x");
        EXPECT_EQ(qvs::readValue(decoder, &state, &text), 4101U) << "there is no VALUE";
        decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
        qvs::Text last;
        EXPECT_EQ(qvs::lookAt(decoder, &state, &last), 4111U);
        decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
        EXPECT_EQ(qvs::commaAdd(decoder, &state, &text, nullptr), 4111U);
        // A single step that a host calls has no limit.
        decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
        OwnText step;
        EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &step), QVS_OK);
    }
}

TEST_F(TextLimit, IsASize)
{
    Decoder decoder({0x01});
    const uint32_t size = decoder->ptBuffer->nSize;
    decoder->ptBuffer->nSize = 100'000'000;
    EXPECT_EQ(qvs::wholeDecode(decoder).textLeft, std::min<uint64_t>(10'000'000'000, SIZE_MAX));
    decoder->ptBuffer->nSize = size;
}

TEST_F(TextLimit, CountsTheTextThatALaterPairContinues)
{
    // Each pair adds one byte and copies all the ones before it.
    Bytes bytes;
    for (int pair = 0; pair < 4200; ++pair) {
        bytes.insert(bytes.end(), {0x17, 0x06, 0xC3, 0x01, 'a'});
    }
    bytes.push_back(0x01);
    Decoder decoder(bytes);
    qvs::DecodeState state = qvs::wholeDecode(decoder);
    qvs::OpenRecord open = {};
    state.open = &open;
    qvsWapPxPhysical record = {};
    EXPECT_EQ(qvs::readList(decoder, &state, &record, {&qvsWapPxPhysical::ptDomainList}), 4111U);
    EXPECT_EQ(record.ptDomainList, nullptr);
}
