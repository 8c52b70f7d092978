// Characteristics: types, their slots and parameters, attributes, and what stands between elements.
#include "qvsDecoding.h"

#include "kinds.h"
#include "memcheck.h"

using namespace parms;
using kinds::Character;
using kinds::characteristic;
using kinds::Document;
using kinds::Kind;
using kinds::turn;

namespace {

class Characteristic : public blocks::BlockTest {};

// Attributes from page 1 instead of page 0.
Bytes fromPage1(const Bytes &attributes)
{
    return join({{0x00, 0x01}, attributes});
}

// A node's field as it is shown.
std::string shownIn(const qvsWapCharacter *node, const Kind &kind)
{
    const void *record = records::get(node, kind.slot);
    if (!record) {
        return "no record";
    }
    const void *value = records::get(record, kind.field);
    return kind.place == kinds::kList ? shown(static_cast<const qvsList *>(value))
                                      : shown(static_cast<const char *>(value));
}

// PXLOGICAL with nothing in it.
const Bytes kLogical = characteristic({0x51});

} // namespace

// ---- Types

TEST_F(Characteristic, MakesTheRecordOfItsTypeInItsSlot)
{
    for (const Kind &kind : kinds::all()) {
        SCOPED_TRACE(kind.name);
        const Character read(characteristic(kind.type));
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.left(), 0U);
        ASSERT_TRUE(read.node);
        EXPECT_EQ(fieldsSet(read.node), records::Numbers{kind.slot});
        for (const size_t field : records::range(1, kind.fields)) {
            EXPECT_EQ(records::get(records::get(read.node, kind.slot), field), nullptr) << field;
        }
    }
}

TEST_F(Characteristic, ReadsItsParmsByItsType)
{
    for (const Kind &kind : kinds::all()) {
        SCOPED_TRACE(kind.name);
        const Character read(characteristic(kind.type, kind.parm));
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.left(), 0U);
        ASSERT_TRUE(read.node);
        EXPECT_EQ(fieldsSet(read.node), records::Numbers{kind.slot});
        EXPECT_EQ(shownIn(read.node, kind), kind.place == kinds::kList ? "[v]" : "v");
    }
}

TEST_F(Characteristic, HasTheSameTypeOnBothPagesOrAnotherOne)
{
    for (const Kind &kind : kinds::all()) {
        SCOPED_TRACE(kind.name);
        const Bytes type = kind.type.size() == 3 ? Bytes{kind.type[2]} : fromPage1(kind.type);
        const Character read(characteristic(type));
        EXPECT_EQ(read.result, 0U);
        ASSERT_TRUE(read.node);
        EXPECT_EQ(fieldsSet(read.node) == records::Numbers{kind.slot},
                  kind.pages == kinds::kBothPages);
    }
}

TEST_F(Characteristic, TakesTheTypesOfThePageThatIsInForce)
{
    const struct {
        uint8_t token;
        size_t slots[2];
    } types[] = {{0x55, {5, 11}}, {0x56, {12, 8}}, {0x57, {13, 10}}, {0x59, {2, 9}}};
    for (const auto &type : types) {
        for (const uint8_t page : {0, 1}) {
            const Character read(characteristic({type.token}), page);
            ASSERT_TRUE(read.node);
            EXPECT_EQ(fieldsSet(read.node), records::Numbers{type.slots[page]});
        }
    }
    const Character back(characteristic({0x00, 0x01, 0x00, 0x00, 0x55}));
    ASSERT_TRUE(back.node);
    EXPECT_TRUE(back.node->ptNapDef);
}

TEST_F(Characteristic, TakesANamedTypeInAnyEncoding)
{
    const Bytes names[] = {
        message::opaque({'W', 'I', '-', 'F', 'I'}).bytes,
        (message::Value("WI") + message::Value("-FI")).bytes,
        (message::tableString(0) + message::Value("FI")).bytes,
    };
    for (const Bytes &name : names) {
        SCOPED_TRACE(testing::PrintToString(name));
        decoding::Decoder decoder(characteristic(join({{0x50}, name})));
        decoder->pStringTable = qvsStrdup_debug("WI-", "test", __LINE__);
        decoder->nStrSize = 4;
        qvsWapCharacter *node = nullptr;
        EXPECT_EQ(qvsClientProvWbxmlDecoderCharacter(decoder, &node), 0U);
        ASSERT_TRUE(node);
        EXPECT_TRUE(node->ptWifi);
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
}

TEST_F(Characteristic, HasNoRecordOfAnotherName)
{
    for (const char *name : {"wi-fi", "WI-FI ", "WI-F", "WIFI", "", "roaming", "ROAMING2",
                             "Vodafone", "vodafone vowifi"}) {
        SCOPED_TRACE(name);
        const Bytes type = kinds::byText(0x50, name);
        const Character empty(characteristic(type));
        EXPECT_EQ(empty.result, 0U);
        ASSERT_TRUE(empty.node);
        EXPECT_EQ(fieldsSet(empty.node), records::Numbers{});

        Traces traces;
        const Character read(characteristic(type, named("NETSSID", "v")));
        EXPECT_EQ(read.result, 4101U);
        EXPECT_EQ(read.node, nullptr);
        EXPECT_EQ(traces.texts,
                  lines({"qvsClientProvWbxmlDecoderContent Error:0"}) + turn(0x07, 0x50) +
                      lines({"................NEW.................",
                             "Tag Code = CHARACTER ATTR TYPE HAVE NOT...CP SPEC....."}));
    }
}

TEST_F(Characteristic, HasNoRecordOfANameThatWasNotRead)
{
    const Character read(characteristic({0x50, 0x60}));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_EQ(fieldsSet(read.node), records::Numbers{});
    EXPECT_EQ(Character(characteristic({0x50, 0x60}, parm({0x07}))).result, 4101U);
}

TEST_F(Characteristic, TracesTheNamesThatItKnows)
{
    const auto tracesOf = [](const char *name) {
        Traces traces;
        const Character read(characteristic(kinds::byText(0x50, name)));
        return traces.texts;
    };
    const Strings content = lines({"qvsClientProvWbxmlDecoderContent Error:0"});
    EXPECT_EQ(tracesOf("ROAMING"),
              content + lines({"------------------NEW-------------------!!"}) + turn(0x01, 0x50));
    for (const char *name : {"WI-FI", "Vodafone VoWiFi"}) {
        EXPECT_EQ(tracesOf(name),
                  content + lines({"------------WIFI------------------!!"}) + turn(0x01, 0x50));
    }
}

TEST_F(Characteristic, FillsTheSlotOfEachOfItsTypesAndReadsParmsByTheLast)
{
    const Character port(characteristic({0x51, 0x53}, parm(0x23, "80")));
    EXPECT_EQ(port.result, 0U);
    ASSERT_TRUE(port.node);
    EXPECT_EQ(fieldsSet(port.node), (records::Numbers{1, 3}));
    EXPECT_STREQ(port.node->ptPort->pszPortNbr, "80");

    EXPECT_EQ(Character(characteristic({0x53, 0x51}, parm(0x23, "80"))).result, 4101U);

    const Character both(characteristic({0x55, 0x00, 0x01, 0x55}, parm(0x36, "w2")));
    ASSERT_TRUE(both.node);
    EXPECT_EQ(fieldsSet(both.node), (records::Numbers{5, 11}));
    EXPECT_STREQ(both.node->ptApplication->pszAppId, "w2");

    const Bytes wifi = join({{0x50}, message::opaque({'W', 'I', '-', 'F', 'I'}).bytes});
    const Character last(characteristic(join({wifi, {0x53}}), parm(0x23, "80")));
    ASSERT_TRUE(last.node);
    EXPECT_EQ(fieldsSet(last.node), (records::Numbers{3, 17}));
    const Character text(characteristic(join({{0x53}, wifi}), named("SECMODE", "1")));
    ASSERT_TRUE(text.node);
    EXPECT_EQ(fieldsSet(text.node), (records::Numbers{3, 17}));
    EXPECT_STREQ(text.node->ptWifi->pszSecMode, "1");
}

TEST_F(Characteristic, FillsAllItsSlotsAtOnce)
{
    const auto opaqueType = [](const std::string &name) {
        return join({{0x50}, message::opaque(Bytes(name.begin(), name.end())).bytes});
    };
    Bytes types;
    for (const Kind &kind : kinds::all()) {
        types =
            join({types, {0x00, 0x00}, kind.type[0] == 0x50 ? opaqueType(kind.name) : kind.type});
    }
    const Character read(characteristic(types));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_EQ(fieldsSet(read.node), records::range(1, 18));
}

// ---- What stands inside a characteristic

TEST_F(Characteristic, KeepsListsApartThatGrowByTurns)
{
    struct Lists {
        const char *name;
        std::map<uint8_t, size_t> fields; // by their tokens
    };
    const Lists all[] = {
        {"PXPHYSICAL", {{0x22, 8}, {0x17, 9}}},
        {"NAPDEF", {{0x48, 29}, {0x10, 30}}},
        {"APPLICATION", {{0x39, 13}, {0x22, 14}, {0x34, 15}}},
        {"BOOTSTRAP", {{0x15, 5}, {0x13, 6}}},
        {"ACCESS", {{0x3B, 1}, {0x36, 2}, {0x23, 3}, {0x17, 4}, {0x22, 5}, {0x39, 6}}},
    };
    for (const Lists &lists : all) {
        Bytes content;
        for (const char *value : {"1", "2", "3"}) {
            for (const auto &[token, field] : lists.fields) {
                content = join({content, parm(token, std::to_string(field) + value)});
            }
        }
        const Kind &kind = kinds::of(lists.name);
        const Character read(characteristic(kind.type, content));
        ASSERT_TRUE(read.node) << lists.name;
        const void *record = records::get(read.node, kind.slot);
        for (const auto &[token, field] : lists.fields) {
            const auto *list = static_cast<const qvsList *>(records::get(record, field));
            const std::string number = std::to_string(field);
            EXPECT_EQ(shown(list),
                      shown(records::Strings{number + "1", number + "2", number + "3"}))
                << lists.name;
        }
    }
}

TEST_F(Characteristic, IsNoNodeWithoutContent)
{
    const Bytes elements[] = {{0x86, 0x01}, {0x06, 0x01}, {0x86}, {0x06, 0x81}};
    for (const Bytes &bytes : elements) {
        SCOPED_TRACE(testing::PrintToString(bytes));
        const Character read(bytes);
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.left(), 0U);
        EXPECT_EQ(read.node, nullptr);
    }
    const Character attributes({0x86, 0x51, 0x01});
    EXPECT_EQ(attributes.result, 0U);
    EXPECT_EQ(attributes.node, nullptr);
    EXPECT_EQ(attributes.left(), 2U) << "its attributes are not read";
}

TEST_F(Characteristic, AcceptsNoElementWithoutAType)
{
    const Character empty({0x46, 0x01});
    EXPECT_EQ(empty.result, 0U);
    ASSERT_TRUE(empty.node);
    EXPECT_EQ(fieldsSet(empty.node), records::Numbers{});
    for (const Bytes &start : {Bytes{0x46}, Bytes{0xC6, 0x01}}) {
        for (const Bytes &content : {parm(0x15, "v"), kLogical}) {
            Traces traces;
            const Character read(join({start, content, {0x01}}));
            EXPECT_EQ(read.result, 4101U);
            EXPECT_EQ(traces.texts, turn(content[0] & 0x3F, 0x00)) << "without message";
        }
    }
}

TEST_F(Characteristic, RefusesEveryOtherElement)
{
    for (unsigned byte = 0; byte < 256; ++byte) {
        const uint8_t tag = byte & 0x3F;
        SCOPED_TRACE(byte);
        Traces traces;
        const Character read(
            characteristic({0x51}, join({{static_cast<uint8_t>(byte)}, {0x15, 0x06, 0x85, 0x01}})));
        switch (tag) {
        case 0x00: // with 0x15 as its page, then VALUE is the start of a characteristic
        case 0x01:
        case 0x03: // a string up to the end
        case 0x06: // with attributes that are refused, or without content
        case 0x07:
            EXPECT_EQ(read.result, tag == 0x01 || tag == 0x07 ? 0U : tag == 0x03 ? 4103U : 4101U);
            break;
        default:
            EXPECT_EQ(read.result, 4101U);
            EXPECT_EQ(traces.texts,
                      turn(tag, 0x51) + refusal("qvsClientProvWbxmlDecoderCharacter", tag));
            EXPECT_EQ(read.decoder.position(), 3U) << "the tag stays";
        }
    }
}

TEST_F(Characteristic, DropsInlineStringsAmongItsParms)
{
    // Their tokens are seen without the top bits: a table string and opaque data are taken for
    // inline strings, up to the next NUL.
    for (const uint8_t string : {0x03, 0x43, 0x83, 0xC3}) {
        const Bytes text = {string, ' ', 0x05, 0xC6, 0x00};
        const Character read(characteristic(
            {0x53}, join({text, parm(0x23, "80"), text, text, parm(0x24, "s"), text})));
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.left(), 0U);
        ASSERT_TRUE(read.node);
        EXPECT_STREQ(read.node->ptPort->pszPortNbr, "80");
        EXPECT_EQ(shown(read.node->ptPort->ptServiceList), "[s]");
    }
}

TEST_F(Characteristic, EndsAtAnyByteWithTheTagOfAnEnd)
{
    for (const uint8_t end : {0x01, 0x41, 0x81, 0xC1}) {
        const Character read({0xC6, 0x53, 0x01, end, 0x01});
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.left(), 1U);
        EXPECT_TRUE(read.node);
    }
}

TEST_F(Characteristic, TracesEachTurn)
{
    Traces traces;
    const Character read(
        characteristic({0x53}, join({{0x03, 'x', 0x00, 0x00, 0x01}, parm(0x23, "80")})));
    EXPECT_EQ(read.result, 0U);
    EXPECT_EQ(traces.texts, turn(0x03, 0x53) + turn(0x00, 0x53) + turn(0x07, 0x53) +
                                lines({"qvsClientProvWbxmlDecoderContent Error:0",
                                       "qvsClientProvWbxmlDecoderParamString Error Code:0"}) +
                                turn(0x01, 0x53));
}

TEST_F(Characteristic, KeepsItsKindWhenAParmSwitchesThePage)
{
    const Bytes switching = parm({0x00, 0x01, 0x14, 0x06, 0x85});
    const Character read(characteristic({0x55}, join({switching, parm(0x11, "nap")})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_STREQ(read.node->ptNapDef->pszNapId, "nap");
    EXPECT_EQ(read.decoder->nCodePage, 1) << "for whoever comes next";
}

TEST_F(Characteristic, FailsWhereTheDataEnds)
{
    const Bytes whole =
        characteristic({0x53}, join({{0x03, 'x', 0x00}, parm(0x23, "80"), {0x00, 0x00}}));
    for (size_t count = 0; count < whole.size(); ++count) {
        SCOPED_TRACE(count);
        const Character read(prefix(whole, count));
        EXPECT_EQ(read.result, 4103U);
        EXPECT_EQ(read.node, nullptr);
    }
}

TEST_F(Characteristic, FailsWithoutMemoryForItsNodeOrItsRecord)
{
    for (const Kind &kind : kinds::all()) {
        if (kind.type[0] == 0x50) {
            continue; // its name is read in between
        }
        for (const long failing : {0, 1}) {
            decoding::Decoder decoder(characteristic(kind.type));
            qvsWapCharacter *node = nullptr;
            blocks::failAt = failing;
            EXPECT_EQ(qvsClientProvWbxmlDecoderCharacter(decoder, &node), 1U) << kind.name;
            EXPECT_LT(blocks::failAt, 0);
            blocks::reset();
            EXPECT_EQ(node, nullptr);
        }
    }
}

TEST_F(Characteristic, FailsWithoutMemoryForTheRecordOfItsName)
{
    const Bytes bytes = {0xC6, 0x50, 0x03, 'W', 'I', '-', 'F', 'I', 0x00, 0x01, 0x01};
    long failures = 0;
    for (bool failed = true; failed; ++failures) {
        decoding::Decoder decoder(bytes);
        qvsWapCharacter *node = nullptr;
        blocks::failAt = failures;
        const qvsResult result = qvsClientProvWbxmlDecoderCharacter(decoder, &node);
        failed = blocks::failAt < 0;
        blocks::reset();
        EXPECT_EQ(result != QVS_OK, failed) << failures;
        EXPECT_EQ(node == nullptr, failed) << failures;
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
    EXPECT_EQ(failures, 3) << "the element and its record, and none";
}

TEST_F(Characteristic, IsRecordedWithTheSizesOfItsNodeAndItsRecord)
{
    for (const Kind &kind : kinds::all()) {
        qvsWapCharacter *node = nullptr;
        decoding::Decoder decoder(characteristic(kind.type));
        const auto blocks = memcheck::reportedBy(
            [&] { EXPECT_EQ(qvsClientProvWbxmlDecoderCharacter(decoder, &node), QVS_OK); });
        ASSERT_EQ(blocks.size(), 2U) << kind.name;
        EXPECT_EQ(blocks[0].size, static_cast<int>(sizeof(qvsWapCharacter)));
        EXPECT_EQ(blocks[1].size, static_cast<int>(kind.fields * sizeof(void *))) << kind.name;
        kinds::releaseKept(node);
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
}

TEST_F(Characteristic, EndsAtAStringThatPassesTheLimitOfAllTexts)
{
    decoding::Decoder decoder(characteristic({0x53}, {0x03, 'x', 0x00}));
    qvs::DecodeState state = {.textLeft = 0};
    qvsList *list = nullptr;
    EXPECT_EQ(qvs::decodeCharacters(decoder, &state, &list), 4111U);
    EXPECT_EQ(list, nullptr);
}

TEST_F(Characteristic, JoinsALongValueOfManyPieces)
{
    Bytes attributes = {0x33, 0x06, 0x91};
    std::string expected = "HTTP";
    for (int i = 0; i < 500; ++i) {
        attributes.insert(attributes.end(), {0x90, 0x92, 0x90, 0x94, 0x90, 0x00, 0x01, 0x9B});
        expected += ",BASIC,CHAP";
    }
    blocks::startCounting();
    const Character read(
        characteristic({0x00, 0x01, 0x57}, join({parm(join({attributes, {0x90, 0x03, 'x', 0x00}})),
                                                 parm({0x90, 0x93}), parm(0x30, "level")})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_EQ(read.node->ptAppAuth->pszAAuthType, expected + ",x,DIGEST");
    // The text is not copied anew for each piece.
    EXPECT_LT(blocks::allocated(), 8 * expected.size());
}

TEST(CharacteristicKeeps, TheValueThatAJoinedOneTookThePlaceOf)
{
    const Bytes bytes = characteristic(
        {0x00, 0x01, 0x57},
        join({parm({0x33, 0x06, 0x91, 0x90, 0x92}), parm({0x33, 0x06, 0x9A, 0x90, 0x9B})}));
    const size_t before = blocks::live();
    {
        const Character read(bytes);
        ASSERT_TRUE(read.node);
        EXPECT_STREQ(read.node->ptAppAuth->pszAAuthType, "PAP,CHAP");
    }
    EXPECT_EQ(blocks::live(), before + 1) << "the first one stays allocated";
}

TEST(Kept, element_switch)
{
    blocks::BlockCheck check;
    // In a characteristic: neither its parms nor the next characteristic see the page.
    for (const Bytes &page : {Bytes{0x00, 0x01}, Bytes{0x40, 0x01}, Bytes{0x00, 0x3F}}) {
        const Bytes first = characteristic({0x55}, join({page, parm(0x11, "nap"), page}));
        const Character read(first);
        EXPECT_EQ(read.result, 0U);
        EXPECT_EQ(read.decoder->nCodePage, 0);
        ASSERT_TRUE(read.node);
        EXPECT_STREQ(read.node->ptNapDef->pszNapId, "nap");

        const Document document(join({{0x45}, page, characteristic({0x55}), {0x01}}));
        EXPECT_EQ(document.result, 0U);
        ASSERT_TRUE(kinds::nodeAt(document.nodes(), 0));
        EXPECT_TRUE(kinds::nodeAt(document.nodes(), 0)->ptNapDef);
    }
}
