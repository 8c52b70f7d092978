// The push header: what is read from a message, what is refused, and that no byte outside it is
// looked at.
#include "qvspushhandler.h"

#include "blocks.h"
#include "memcheck.h"
#include "qvsmemory.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace {

#if __SIZEOF_POINTER__ == 4
static_assert(offsetof(smlpushHdlrInfo, nContentType) == 0);
static_assert(offsetof(smlpushHdlrInfo, nHeaderLen) == 4);
static_assert(offsetof(smlpushHdlrInfo, nBodyLen) == 8);
static_assert(offsetof(smlpushHdlrInfo, nMacLen) == 12);
static_assert(offsetof(smlpushHdlrInfo, nSec) == 16);
static_assert(offsetof(smlpushHdlrInfo, szMac) == 20);
static_assert(sizeof(smlpushHdlrInfo::szMac) == 44);
static_assert(offsetof(smlpushHdlrInfo, pBody) == 64);
static_assert(sizeof(smlpushHdlrInfo) == 68);
#endif

using namespace std::string_literals;

const std::string kMac(40, 'M');
const std::string kWbxmlName = "application/vnd.wap.connectivity-wbxml";

struct Release {
    void operator()(smlpushHdlrInfo *info) const { qvs::releasePushHeader(info); }
};
using Header = std::unique_ptr<smlpushHdlrInfo, Release>;

// Parses a message that stands in a block of exactly its length, so that a sanitizer sees a read
// behind it, and that is gone before the header is looked at.
Header parsed(const std::string &message)
{
    auto *bytes = static_cast<uint8_t *>(
        qvsMemAlloc_debug(static_cast<uint32_t>(message.size()), "test", __LINE__));
    std::memcpy(bytes, message.data(), message.size());
    Header header(smlpushHdlrParsingWSPHeader(bytes, static_cast<uint32_t>(message.size())));
    EXPECT_EQ(std::string(reinterpret_cast<char *>(bytes), message.size()), message)
        << "the message is the caller's";
    std::memset(bytes, 0xEE, message.size());
    qvsMemFree_debug(bytes);
    return header;
}

// A message with the given headers and body.
std::string push(const std::string &headers, const std::string &body = "body")
{
    return "\x01\x06"s + static_cast<char>(headers.size()) + headers + body;
}

Header parsedHeaders(const std::string &headers)
{
    return parsed(push(headers));
}

std::string bodyOf(const Header &header)
{
    EXPECT_EQ(header->pBody[header->nBodyLen], 0);
    return {reinterpret_cast<char *>(header->pBody), header->nBodyLen};
}

class Push : public blocks::BlockTest {};

} // namespace

TEST_F(Push, ReadsASignedMessage)
{
    const std::string message =
        "\x01\x06\x2F\x1F\x2D\xB6\x91\x81\x92"s + kMac + "\0"s + "\x03\x0B\x6A\x00"s;
    blocks::startCounting();
    const Header header = parsed(message);
    ASSERT_TRUE(header);
    EXPECT_EQ(header->nContentType, 54U);
    EXPECT_EQ(header->nHeaderLen, 47U);
    EXPECT_EQ(header->nSec, 129U);
    EXPECT_EQ(header->nMacLen, 40U);
    EXPECT_STREQ(header->szMac, kMac.c_str());
    EXPECT_EQ(bodyOf(header), message.substr(50));
    EXPECT_EQ(blocks::allocations(), 3U) << "the message of the test, the record and the body";
    EXPECT_EQ(blocks::allocated(), message.size() + sizeof(smlpushHdlrInfo) + 4 + 1);
}

TEST_F(Push, ReadsAMessageWithoutLengthQuoteAndParameters)
{
    const Header header = parsedHeaders("\xB6\xAF\x80");
    ASSERT_TRUE(header);
    EXPECT_EQ(header->nContentType, 54U);
    EXPECT_EQ(header->nHeaderLen, 3U);
    EXPECT_EQ(header->nSec, 0U);
    EXPECT_EQ(header->nMacLen, 0U);
    EXPECT_EQ(std::string(header->szMac, sizeof(header->szMac)), std::string(44, '\0'));
    EXPECT_EQ(bodyOf(header), "body");
}

TEST_F(Push, AsksForItsBlocksUnderItsSource)
{
    const std::string file = "jni/src/ClientProv/qvspushhandler";
    Header header;
    const auto files = memcheck::filesOf([&] { header = parsedHeaders("\xB6\xAF\x80"); });
    EXPECT_EQ(files, (std::vector<std::string>{file, file}));
}

TEST_F(Push, RefusesNull)
{
    EXPECT_EQ(smlpushHdlrParsingWSPHeader(nullptr, 100), nullptr);
    EXPECT_EQ(smlpushHdlrParsingWSPHeader(nullptr, 0), nullptr);
}

TEST_F(Push, RefusesOtherPdus)
{
    for (int type = 0; type < 256; ++type) {
        std::string message = push("\xB6");
        message[1] = static_cast<char>(type);
        EXPECT_EQ(parsed(message) != nullptr, type == 6) << type;
    }
}

TEST_F(Push, DoesNotLookAtTheTransaction)
{
    for (int transaction = 0; transaction < 256; ++transaction) {
        std::string message = push("\xB6");
        message[0] = static_cast<char>(transaction);
        EXPECT_TRUE(parsed(message)) << transaction;
    }
}

TEST_F(Push, KnowsFiveShortCodes)
{
    for (unsigned byte = 0x80; byte < 0x100; ++byte) {
        const unsigned code = byte & 0x7F;
        const bool known = code == 54 || code == 53 || code == 68 || code == 78 || code == 66;
        const Header header = parsedHeaders(std::string(1, static_cast<char>(byte)) + "\x91\x80");
        EXPECT_EQ(header != nullptr, known) << byte;
        if (header) {
            EXPECT_EQ(header->nContentType, code);
            EXPECT_EQ(header->nSec, 0x80U);
        }
    }
}

TEST_F(Push, RefusesBytesBelowTheBlank)
{
    for (int byte = 0; byte < 0x20; ++byte) {
        EXPECT_FALSE(parsedHeaders(std::string(1, static_cast<char>(byte)) + "\x91\x80")) << byte;
    }
}

TEST_F(Push, KnowsFiveNames)
{
    for (const auto &[name, code] : std::vector<std::pair<std::string, uint32_t>>{
             {"application/vnd.wap.connectivity-wbxml", 54},
             {"application/vnd.wap.connectivity-xml", 53},
             {"application/vnd.syncml.notification", 68},
             {"application/vnd.syncml.ds.notification", 78},
             {"application/vnd.syncml.dm+wbxml", 66}}) {
        const Header header = parsedHeaders(name + "\0\x91\x82"s);
        ASSERT_TRUE(header) << name;
        EXPECT_EQ(header->nContentType, code);
        EXPECT_EQ(header->nSec, 0x82U) << "the parameters follow the terminator";
        const Header quoted = parsedHeaders("\x1F\x30"s + name + "\0\x91\x82"s);
        ASSERT_TRUE(quoted) << name;
        EXPECT_EQ(quoted->nContentType, code);
        EXPECT_EQ(quoted->nSec, 0x82U);
    }
}

TEST_F(Push, ComparesNamesExactly)
{
    for (const std::string &name :
         {"APPLICATION/VND.WAP.CONNECTIVITY-WBXML"s, "Application/vnd.wap.connectivity-wbxml"s,
          "application/vnd.wap.connectivity-wbxm"s, "application/vnd.wap.connectivity-wbxmll"s,
          " application/vnd.wap.connectivity-wbxml"s, "text/xml"s, "a"s, "\x7F"s, " "s}) {
        EXPECT_FALSE(parsedHeaders(name + "\0"s)) << name;
    }
}

TEST_F(Push, TakesATextThatIsNoNameForTheCodeOfItsFirstByte)
{
    for (const unsigned code : {0x35U, 0x36U, 0x42U, 0x44U, 0x4EU}) {
        const std::string byte(1, static_cast<char>(code));
        for (const std::string &behind : {"\x91\x81\0"s, "\x91\x81"s + std::string(100, 'x')}) {
            const Header header = parsedHeaders(byte + behind);
            ASSERT_TRUE(header) << code;
            EXPECT_EQ(header->nContentType, code);
            EXPECT_EQ(header->nSec, 0x81U) << "the parameters follow the byte";
        }
    }
}

TEST_F(Push, RefusesATextThatDoesNotEndInTheMessage)
{
    const std::string unended = "\x01\x06\x01"s + kWbxmlName;
    EXPECT_FALSE(parsed(unended));
    EXPECT_TRUE(parsed(unended + "\0"s));
}

TEST_F(Push, RefusesATextOf64Characters)
{
    for (const std::size_t length : {63U, 64U, 65U, 200U}) {
        EXPECT_FALSE(parsedHeaders(std::string(length, 'a') + "\0"s)) << length;
        EXPECT_FALSE(
            parsedHeaders(kWbxmlName + std::string(length - kWbxmlName.size(), 'a') + "\0"s))
            << length;
    }
}

TEST_F(Push, TakesTheSecurityMethodAsItStands)
{
    for (int value = 0; value < 256; ++value) {
        const std::string byte(1, static_cast<char>(value));
        const Header binary = parsedHeaders("\xB6\x91"s + byte);
        ASSERT_TRUE(binary);
        EXPECT_EQ(binary->nSec, static_cast<uint32_t>(value));
        const Header named = parsedHeaders("\xB6SEC\0"s + byte);
        ASSERT_TRUE(named);
        EXPECT_EQ(named->nSec, static_cast<uint32_t>(value));
    }
}

TEST_F(Push, TakesParameterNamesInAnyCase)
{
    for (const char *sec : {"SEC", "sec", "sEc"}) {
        for (const char *mac : {"MAC", "mac", "Mac"}) {
            const Header header = parsedHeaders("\xB6"s + sec + "\0\x83"s + mac + "\0"s + "12\0"s);
            ASSERT_TRUE(header);
            EXPECT_EQ(header->nSec, 0x83U) << sec;
            EXPECT_STREQ(header->szMac, "12") << mac;
            EXPECT_EQ(header->nMacLen, 2U);
        }
    }
    const Header other = parsedHeaders("\xB6SEK\0\x83"s);
    ASSERT_TRUE(other);
    EXPECT_EQ(other->nSec, 0U);
}

TEST_F(Push, DoesNotLookAtTheByteBehindAParameterName)
{
    const Header header = parsedHeaders("\xB6SEC!\x83MAC!12\0"s);
    ASSERT_TRUE(header);
    EXPECT_EQ(header->nSec, 0x83U);
    EXPECT_STREQ(header->szMac, "12");
}

TEST_F(Push, MixesFormsOfParameters)
{
    const Header first = parsedHeaders("\xB6\x91\x80MAC\0"s + "12\0"s);
    ASSERT_TRUE(first);
    EXPECT_EQ(first->nSec, 0x80U);
    EXPECT_STREQ(first->szMac, "12");
    const Header second = parsedHeaders("\xB6SEC\0\x80\x92"s + "12\0"s);
    ASSERT_TRUE(second);
    EXPECT_EQ(second->nSec, 0x80U);
    EXPECT_STREQ(second->szMac, "12");
}

TEST_F(Push, TakesAMacWithoutASecurityMethod)
{
    for (const std::string &mac : {"\x92"s, "MAC\0"s}) {
        const Header header = parsedHeaders("\xB6"s + mac + kMac + "\0"s);
        ASSERT_TRUE(header);
        EXPECT_EQ(header->nSec, 0U);
        EXPECT_EQ(header->nMacLen, 40U);
        EXPECT_STREQ(header->szMac, kMac.c_str());
    }
}

TEST_F(Push, TakesAMacOfUpTo43Characters)
{
    for (const std::size_t length : {0U, 1U, 43U, 44U, 45U, 200U}) {
        const std::string mac(length, 'x');
        for (const std::string &name : {"\x92"s, "MAC\0"s}) {
            const Header header = parsedHeaders("\xB6\x91\x81"s + name + mac + "\0"s);
            ASSERT_EQ(header != nullptr, length <= 43) << length;
            if (header) {
                EXPECT_EQ(header->nMacLen, length);
                EXPECT_STREQ(header->szMac, mac.c_str());
            }
        }
    }
}

TEST_F(Push, RefusesAMacThatDoesNotEndInTheMessage)
{
    for (const std::string &name : {"\x92"s, "MAC\0"s}) {
        const std::string unended = push("\xB6"s + name + "12", "");
        EXPECT_FALSE(parsed(unended));
        const Header ended = parsed(unended + "\0"s);
        ASSERT_TRUE(ended);
        EXPECT_STREQ(ended->szMac, "12");
    }
}

TEST_F(Push, AParameterWhoseValueWouldStartBehindTheMessageIsAbsent)
{
    for (const std::string &cut :
         {"\x91"s, "S"s, "SE"s, "SEC"s, "SEC\0"s, "\x92"s, "MA"s, "MAC"s, "MAC\0"s, ""s}) {
        for (const std::string &before : {""s, "\x91\x80"s}) {
            const Header header = parsed(push("\xB6" + before + cut, ""));
            ASSERT_TRUE(header) << cut;
            EXPECT_EQ(header->nSec, before.empty() ? 0U : 0x80U) << cut;
            EXPECT_EQ(header->nMacLen, 0U);
            EXPECT_EQ(header->nBodyLen, 0U);
        }
    }
}

TEST_F(Push, AParameterWhoseValueIsTheLastByteIsThere)
{
    const Header binary = parsed(push("\xB6\x91\x80", ""));
    ASSERT_TRUE(binary);
    EXPECT_EQ(binary->nSec, 0x80U);
    const Header named = parsed(push("\xB6SEC\0\x80"s, ""));
    ASSERT_TRUE(named);
    EXPECT_EQ(named->nSec, 0x80U);
    const Header mac = parsed(push("\xB6\x92\0"s, ""));
    ASSERT_TRUE(mac);
    EXPECT_EQ(mac->nMacLen, 0U);
}

TEST_F(Push, RefusesMessagesOfLessThan4Bytes)
{
    EXPECT_EQ(smlpushHdlrParsingWSPHeader(reinterpret_cast<const uint8_t *>("\x01\x06\x00\xB6"), 0),
              nullptr);
    for (const std::string &message : {"\x01"s, "\x01\x06"s, "\x01\x06\x00"s}) {
        EXPECT_FALSE(parsed(message));
    }
    const Header header = parsed("\x01\x06\x00\xB6"s);
    ASSERT_TRUE(header);
    EXPECT_EQ(bodyOf(header), "\xB6") << "no header at all: the content type is in the body";
}

TEST_F(Push, RefusesMessagesShorterThanTheirHeaders)
{
    for (const std::size_t length : {1U, 2U, 100U, 255U}) {
        const std::string message = push("\xB6" + std::string(length - 1, '\0'), "");
        EXPECT_FALSE(parsed(message.substr(0, message.size() - 1))) << length;
        const Header header = parsed(message);
        ASSERT_TRUE(header) << length;
        EXPECT_EQ(header->nHeaderLen, length);
        EXPECT_EQ(header->nBodyLen, 0U);
        EXPECT_EQ(header->pBody[0], 0);
    }
}

TEST_F(Push, RefusesAMessageThatEndsBeforeItsContentType)
{
    EXPECT_FALSE(parsed("\x01\x06\x00\x1F"s));
    EXPECT_FALSE(parsed("\x01\x06\x00\x1F\x2D"s));
    EXPECT_TRUE(parsed("\x01\x06\x00\x1F\x2D\xB6"s));
}

TEST_F(Push, CopiesABodyOfAnyBytes)
{
    std::string body;
    for (int byte = 0; byte < 70000; ++byte) {
        body += static_cast<char>(byte);
    }
    const Header header = parsed(push("\xB6", body));
    ASSERT_TRUE(header);
    EXPECT_EQ(header->nBodyLen, 70000U);
    EXPECT_EQ(bodyOf(header), body);
}

TEST_F(Push, ReadsEveryPrefixWithoutLookingBehindIt)
{
    for (const std::string &headers : {"\x1F\x2D\xB6\x91\x81\x92"s + kMac + "\0"s,
                                       kWbxmlName + "\0SEC\0\x81MAC\0"s + kMac + "\0"s}) {
        const std::string message = push(headers);
        for (std::size_t length = 1; length <= message.size(); ++length) {
            const Header header = parsed(message.substr(0, length));
            EXPECT_EQ(header != nullptr, length >= 3 + headers.size()) << length;
            std::string small = message.substr(0, length);
            if (length > 2) {
                small[2] = 0; // the headers are then read as far as there are bytes
                (void)parsed(small);
            }
        }
    }
}

TEST_F(Push, WithoutMemoryThereIsNoRecord)
{
    const std::string message = push("\xB6\x91\x81\x92"s + kMac + "\0"s);
    const auto *bytes = reinterpret_cast<const uint8_t *>(message.data());
    const long runs = blocks::failEach([&] {
        const Header header(
            smlpushHdlrParsingWSPHeader(bytes, static_cast<uint32_t>(message.size())));
        EXPECT_EQ(header == nullptr, blocks::failAt < 0);
    });
    EXPECT_EQ(runs, 2);
}

TEST_F(Push, ReleasesNull)
{
    blocks::startCounting();
    qvs::releasePushHeader(nullptr);
    EXPECT_EQ(blocks::allocations(), 0U);
}

TEST(Kept, push_headers_length)
{
    const blocks::BlockCheck check;
    // The first byte of a multi-byte length would be 0x81.
    const Header one = parsed("\x01\x06\x81\xB6"s + std::string(0x80, 'h') + "body");
    ASSERT_TRUE(one);
    EXPECT_EQ(one->nHeaderLen, 0x81U);
    EXPECT_EQ(bodyOf(one), "body");
    // Parameters are read wherever the headers are said to end.
    const Header all = parsed("\x01\x06\x01\xB6\x91\x81\x92"s + "12\0"s);
    ASSERT_TRUE(all);
    EXPECT_EQ(all->nSec, 0x81U);
    EXPECT_STREQ(all->szMac, "12");
    EXPECT_EQ(bodyOf(all), "\x91\x81\x92"s + "12\0"s);
}

TEST(Kept, push_order)
{
    const blocks::BlockCheck check;
    const Header macFirst = parsedHeaders("\xB6\x92"s + "12\0"s + "\x91\x81"s);
    ASSERT_TRUE(macFirst);
    EXPECT_EQ(macFirst->nSec, 0U);
    EXPECT_STREQ(macFirst->szMac, "12");
    const Header between = parsedHeaders("\xB6\x91\x81\xAF\x80\x92"s + "12\0"s);
    ASSERT_TRUE(between);
    EXPECT_EQ(between->nSec, 0x81U);
    EXPECT_EQ(between->nMacLen, 0U);
    const Header before = parsedHeaders("\xB6\xAF\x80\x91\x81"s);
    ASSERT_TRUE(before);
    EXPECT_EQ(before->nSec, 0U);
    const Header twice = parsedHeaders("\xB6\x91\x81\x91\x82"s);
    ASSERT_TRUE(twice);
    EXPECT_EQ(twice->nSec, 0x81U);
}

TEST(Kept, push_quoted_length)
{
    const blocks::BlockCheck check;
    for (int length = 0; length < 256; ++length) {
        const Header header = parsedHeaders("\x1F"s + static_cast<char>(length) + "\xB6\x91\x81");
        ASSERT_TRUE(header) << length;
        EXPECT_EQ(header->nSec, 0x81U);
    }
    EXPECT_FALSE(parsedHeaders("\x1F\x02\x1F\x01\xB6")) << "only one is looked for";
}

TEST(Kept, push_short_form)
{
    const blocks::BlockCheck check;
    const Header header = parsedHeaders("\x36\x91\x81");
    ASSERT_TRUE(header);
    EXPECT_EQ(header->nContentType, 54U);
    EXPECT_EQ(header->nSec, 0x81U);
}
