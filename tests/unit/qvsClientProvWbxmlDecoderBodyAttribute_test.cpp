// The attributes of a characteristic: which tokens there are, what they make, and which one
// decides.
#include "kinds.h"

using namespace parms;
using kinds::Character;
using kinds::characteristic;
using kinds::Kind;
using kinds::turn;

namespace {

class CharacteristicAttribute : public blocks::BlockTest {};

// The attributes of a characteristic, read into a node of the test's own.
struct Attributes {
    explicit Attributes(const Bytes &bytes) : decoder(bytes)
    {
        result =
            qvsClientProvWbxmlDecoderCharacterAttribute(decoder, node, &attrId, &codePage, &name);
    }
    Attributes(const Attributes &) = delete;
    Attributes &operator=(const Attributes &) = delete;
    ~Attributes()
    {
        kinds::releaseKept(node);
        (void)qvsClientProvWbxmlDeleteCharacter(node);
        qvsMemFree_debug(name);
    }

    decoding::Decoder decoder;
    qvsWapCharacter *node = records::blank<qvsWapCharacter>();
    uint8_t attrId = 0xEE;
    uint8_t codePage = 0xEE;
    char *name = nullptr;
    qvsResult result;
};

// PXLOGICAL with nothing in it.
const Bytes kLogical = characteristic({0x51});

} // namespace

TEST_F(CharacteristicAttribute, ReadsANameAfreshForEachTypeGivenAsText)
{
    const Bytes bytes = join({{0x50, 0xC3, 0x05, 'W', 'I', '-', 'F', 'I'},
                              {0x50, 0xC3, 0x07, 'R', 'O', 'A', 'M', 'I', 'N', 'G', 0x01}});
    const Attributes read(bytes);
    EXPECT_EQ(read.result, 0U);
    EXPECT_STREQ(read.name, "ROAMING");
    EXPECT_EQ(fieldsSet(read.node), (records::Numbers{16, 17}));

    // An unknown name behind a known one takes its place.
    const Bytes unknown = {0x50, 0xC3, 0x05, 'W', 'I', '-', 'F', 'I', 0x50, 0xC3, 0x01, 'x'};
    EXPECT_EQ(Character(characteristic(unknown, named("SECMODE", "1"))).result, 4101U);
}

TEST_F(CharacteristicAttribute, GivesTheLastTokenThePageAndTheName)
{
    const Attributes token({0x00, 0x01, 0x55, 0x01, 0x07});
    EXPECT_EQ(token.result, 0U);
    EXPECT_EQ(token.attrId, 0x55);
    EXPECT_EQ(token.codePage, 1);
    EXPECT_EQ(token.name, nullptr);
    EXPECT_EQ(token.decoder.position(), 4U);

    const Attributes text(join({kinds::byText(0x50, "any"), {0x01}}));
    EXPECT_EQ(text.result, 0U);
    EXPECT_EQ(text.attrId, 0x50);
    EXPECT_EQ(text.codePage, 0);
    EXPECT_STREQ(text.name, "any");

    const Attributes none({0x01});
    EXPECT_EQ(none.result, 0U);
    EXPECT_EQ(none.attrId, 0xEE) << "untouched";
    EXPECT_EQ(none.decoder.position(), 1U);
}

TEST_F(CharacteristicAttribute, RefusesEveryOtherToken)
{
    for (unsigned token = 0x02; token < 256; ++token) {
        if (token >= 0x50 && token <= 0x5B) {
            continue;
        }
        SCOPED_TRACE(token);
        Traces traces;
        const Attributes read({0x53, static_cast<uint8_t>(token), 0x01});
        EXPECT_EQ(read.result, 4101U);
        EXPECT_EQ(read.decoder.position(), 1U);
        EXPECT_EQ(traces.texts, refusal("qvsClientProvWbxmlDecoderCharacterAttribute",
                                        static_cast<uint8_t>(token)));
        EXPECT_TRUE(read.node->ptPort) << "what was read before stays";
    }
}

TEST_F(CharacteristicAttribute, ReturnsTheFailureOfAPageSwitch)
{
    for (const Bytes &bytes : {Bytes{0x53, 0x00, 0x02, 0x01}, Bytes{0x53, 0x00}}) {
        const Attributes read(bytes);
        EXPECT_EQ(read.result, 4101U);
        EXPECT_TRUE(read.node->ptPort);
    }
    const Attributes masked({0x00, 0x41, 0x55, 0x01});
    EXPECT_EQ(masked.result, 0U);
    EXPECT_TRUE(masked.node->ptApplication);
}

TEST_F(CharacteristicAttribute, MakesTheRecordOfANameBeforeItReturnsItsFailure)
{
    const Attributes read({0x50, 0x03, 'W', 'I', '-', 'F', 'I', 0x00, 0x53, 0x01});
    EXPECT_EQ(read.result, 4103U);
    EXPECT_TRUE(read.node->ptWifi);
    EXPECT_EQ(read.node->ptPort, nullptr);
    EXPECT_STREQ(read.name, "WI-FI");
}

TEST_F(CharacteristicAttribute, HandsTheNameOutInFrontOfAFailure)
{
    const Attributes unknown({0x50, 0xC3, 0x03, 'a', 'n', 'y', 0x5C});
    EXPECT_EQ(unknown.result, 4101U);
    EXPECT_STREQ(unknown.name, "any");

    const Attributes second({0x50, 0xC3, 0x03, 'a', 'n', 'y', 0x50});
    EXPECT_EQ(second.result, 4103U);
    EXPECT_EQ(second.name, nullptr) << "nothing was read of the second one";
}

TEST_F(CharacteristicAttribute, FailsWhereTheDataEnds)
{
    for (const Bytes &cut : {Bytes{}, Bytes{0x53}, Bytes{0x50}, Bytes{0x50, 0x03, 'x'},
                             Bytes{0x50, 0x03, 'x', 0x00}, Bytes{0x00, 0x01}}) {
        EXPECT_EQ(Attributes(cut).result, 4103U);
    }
}

TEST(Kept, slot_replaced)
{
    blocks::BlockCheck check;
    for (const Kind &kind : kinds::all()) {
        SCOPED_TRACE(kind.name);
        void *old = records::blank(kind.fields);
        qvsWapCharacter *node = records::blank<qvsWapCharacter>();
        records::set(node, kind.slot, old);
        uint8_t attrId = 0;
        uint8_t codePage = 0;
        decoding::OwnText name;
        Traces traces;
        decoding::Decoder decoder(join({kind.type, {0x01}}));
        EXPECT_EQ(
            qvsClientProvWbxmlDecoderCharacterAttribute(decoder, node, &attrId, &codePage, &name),
            0U);
        EXPECT_TRUE(traces.has("qvsClientProvWbxmlDecoderCharacterAttribute : ERROR!!!\n"));
        EXPECT_EQ(fieldsSet(node), records::Numbers{kind.slot});
        EXPECT_NE(records::get(node, kind.slot), old);
        records::release({old}); // it stayed allocated
        kinds::releaseKept(node);
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
}

TEST(Kept, attr_last_token)
{
    blocks::BlockCheck check;
    const Attributes attributes({0x51, 0x00, 0x01, 0x01});
    EXPECT_EQ(attributes.result, 0U);
    EXPECT_EQ(attributes.attrId, 0);
    EXPECT_EQ(attributes.codePage, 1);
    EXPECT_TRUE(attributes.node->ptPxLogical);
    for (const Bytes &content : {parm(0x15, "v"), kLogical}) {
        Traces traces;
        EXPECT_EQ(Character(characteristic({0x51, 0x00, 0x01}, content)).result, 4101U);
        EXPECT_EQ(traces.texts.back(), turn(content[0] & 0x3F, 0x00).back()) << "without message";
    }
}
