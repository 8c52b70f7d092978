// The message builder against bytes written out by hand.
#include "support/message.h"

#include <gtest/gtest.h>

using namespace message;

namespace {

TEST(Message, WritesACharacteristicOfParms)
{
    Body body;
    body.characteristic(kPxLogical, [&] {
        body.parm(kProxyId, "p1");
        body.parm(kStartPage);
        body.characteristic(kPort, [&] { body.parm(kService, token(0xCB)); });
    });

    const Bytes expected = {
        0xC6, 0x51, 0x01,                              // characteristic, PXLOGICAL
        0x87, 0x15, 0x06, 0x03, 'p',  '1', 0x00, 0x01, // parm, PROXY-ID, VALUE, inline string
        0x87, 0x1C, 0x01,                              // parm, STARTPAGE
        0xC6, 0x53, 0x01,                              // characteristic, PORT
        0x87, 0x24, 0x06, 0xCB, 0x01,                  // parm, SERVICE, VALUE, a token
        0x01,                                          // end of PORT
        0x01,                                          // end of PXLOGICAL
    };
    EXPECT_EQ(body.data(), expected);
}

TEST(Message, SwitchesThePageThatATypeNeedsAndNoMore)
{
    Body body;
    body.characteristic(kApplication, [&] { body.characteristic(kAppAddr, [] {}); });
    body.characteristic(kAccess, [] {});
    body.characteristic(kNapDef, [] {});

    const Bytes expected = {
        0xC6, 0x00, 0x01, 0x55, 0x01,       // characteristic, to page 1, APPLICATION
        0xC6, 0x56, 0x01, 0x01,             // characteristic, APPADDR, its end
        0x01,                               // end of APPLICATION
        0xC6, 0x5B, 0x01, 0x01,             // characteristic, ACCESS on either page, its end
        0xC6, 0x00, 0x00, 0x55, 0x01, 0x01, // characteristic, to page 0, NAPDEF, its end
    };
    EXPECT_EQ(body.data(), expected);
}

TEST(Message, WritesNamesAndTypesGivenAsText)
{
    Body body;
    body.characteristic("WI-FI", [&] {
        body.parm("NETSSID", "home");
        body.parm(tableString(0x80), opaque({0xFF}));
        body.parm("INIT");
    });

    const Bytes expected = {
        0xC6, 0x50, 0x03, 'W',  'I',  '-', 'F',  'I',  0x00, 0x01,       // TYPE, inline string
        0x87, 0x05, 0x03, 'N',  'E',  'T', 'S',  'S',  'I',  'D',  0x00, // NAME, inline string
        0x06, 0x03, 'h',  'o',  'm',  'e', 0x00, 0x01,                   // VALUE, inline string
        0x87, 0x05, 0x83, 0x81, 0x00,                        // NAME, index 128 of the string table
        0x06, 0xC3, 0x01, 0xFF, 0x01,                        // VALUE, one byte of opaque data
        0x87, 0x05, 0x03, 'I',  'N',  'I', 'T',  0x00, 0x01, // NAME, no VALUE
        0x01,                                                // end of the characteristic
    };
    EXPECT_EQ(body.data(), expected);
}

TEST(Message, WritesAttributesAsTheyAreGiven)
{
    Body body;
    body.parm([&] {
        body.page(1).bytes({kAppId, kValue}).value(Value("w") + token(0x90) + "2");
        body.bytes({kValue}).inlineString("x");
    });

    const Bytes expected = {
        0x87, 0x00, 0x01, 0x36,                        // parm, to page 1, APPID
        0x06, 0x03, 'w',  0x00, 0x90, 0x03, '2', 0x00, // VALUE in three parts
        0x06, 0x03, 'x',  0x00, 0x01,                  // a second VALUE, end
    };
    EXPECT_EQ(body.data(), expected);
}

TEST(Message, WritesNumbersInGroupsOfSevenBits)
{
    EXPECT_EQ(mbUint32(0), (Bytes{0x00}));
    EXPECT_EQ(mbUint32(0x7F), (Bytes{0x7F}));
    EXPECT_EQ(mbUint32(0x80), (Bytes{0x81, 0x00}));
    EXPECT_EQ(mbUint32(0xFFFFFFFF), (Bytes{0x8F, 0xFF, 0xFF, 0xFF, 0x7F}));
}

TEST(Message, WritesTheDocumentAroundItsContent)
{
    Body body;
    body.bytes({0xAA});

    const Bytes plain = {
        0x03, 0x0B, 0x6A, 0x00, // version, identifier, UTF-8, no table
        0xC5, 0x46, 0x01,       // document, version 1.0
        0xAA, 0x01,             // content, end
    };
    EXPECT_EQ(document(body), plain);

    const Bytes withTable = {
        0x03, 0x00, 0x01, 0x6A,       // version, identifier at index 1 of the table, UTF-8
        0x03, 'x',  0x00, 'y',        // three bytes of table
        0xC5, 0x46, 0x01, 0xAA, 0x01, // document
    };
    const Header header = {.publicId = 0, .publicIdIndex = 1, .table = std::string_view("x\0y", 3)};
    EXPECT_EQ(document(body, header), withTable);
}

TEST(Message, WritesThePushAroundTheBody)
{
    const Bytes plain = {
        0x01, 0x06, 0x03, // transaction, Push, length of the headers
        0x1F, 0x01, 0xB6, // quoted length of the content type, short code
        0xAA,             // body
    };
    EXPECT_EQ(push({0xAA}), plain);

    const Bytes secured = {
        0x01, 0x06, 0x09,       // transaction, Push, length of the headers
        0xB6,                   // content type
        0x91, 0x81,             // SEC: USERPIN
        0x92, '0',  'F',  0x00, // MAC
        0xAF, 0x82,             // one more header
        0xAA,                   // body
    };
    PushOptions options;
    options.lengthQuote = false;
    options.security = join({sec(0x81), mac("0F")});
    options.moreHeaders = {0xAF, 0x82};
    EXPECT_EQ(push({0xAA}, options), secured);
}

} // namespace
