// Decoders that a host makes, with whatever lies between and behind their six fields.
#include "qvsDecoding.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsTokens.h"
#include "smlbuffer.h"
#include "support/blocks.h"
#include "support/decoding.h"
#include "support/message.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>
#include <string>

using namespace decoding;

static_assert(offsetof(qvsWbxmlDecoder, nHasContent) == 0);
static_assert(offsetof(qvsWbxmlDecoder, nHasAttr) == 4);
static_assert(offsetof(qvsWbxmlDecoder, nStrSize) == 8);
static_assert(offsetof(qvsWbxmlDecoder, nCodePage) == 12);
static_assert(offsetof(qvsWbxmlDecoder, pStringTable) == 16);
static_assert(offsetof(qvsWbxmlDecoder, ptBuffer) == 16 + sizeof(void *));
// Hosts make decoders of their own: there is nothing behind the six fields.
static_assert(sizeof(qvsWbxmlDecoder) == 16 + 2 * sizeof(void *));

namespace {

// The record of a decoder as a host makes one, with the page behind it out of reach.
class HostDecoder {
public:
    explicit HostDecoder(const Bytes &bytes)
    {
        smlBuffer *buffer = nullptr;
        const auto length = static_cast<uint32_t>(bytes.size());
        EXPECT_EQ(smlBufferCreate(&buffer, length), 0U);
        EXPECT_EQ(smlBufferAppendTail(buffer, bytes.data(), length), 0U);
        const blocks::Fence fence;
        record = static_cast<qvsWbxmlDecoder *>(qvsMemAlloc_debug(sizeof *record, "host", 1));
        *record = {};
        record->ptBuffer = buffer;
    }
    HostDecoder(const HostDecoder &) = delete;
    HostDecoder &operator=(const HostDecoder &) = delete;
    ~HostDecoder() { (void)qvsClientProvWbxmlDeleteDecoder(record); }

    operator qvsWbxmlDecoder *() const { return record; }
    qvsWbxmlDecoder *operator->() const { return record; }

private:
    qvsWbxmlDecoder *record = nullptr;
};

std::string shown(const char *text)
{
    return text ? text : "(null)";
}

std::string shown(const qvsList *list)
{
    std::string all;
    for (const qvsListNode *node = list ? list->ptFirst : nullptr; node; node = node->ptNext) {
        all += static_cast<const char *>(node->pItem) + std::string(" ");
    }
    return all;
}

// Two lists by turns, children, a text from the string table, and one that grows by joins.
message::Bytes everything()
{
    message::Body body;
    body.characteristic(message::kPxLogical, [&] {
        body.parm(message::kName, message::tableString(0));
        body.characteristic(message::kPxPhysical, [&] {
            for (const char *number : {"1", "2", "3"}) {
                body.parm(message::kDomain, number).parm(message::kToNapId, number);
            }
        });
        body.characteristic(message::kPxPhysical, [&] { body.parm(message::kDomain, "4"); });
    });
    body.characteristic(message::kApplication, [&] {
        body.characteristic(message::kAppAuth, [&] {
            body.parm(message::kAAuthType, message::token(0x91));
            body.parm([&] { body.bytes({0x90, 0x92}); });
        });
    });
    return message::document(body, {.table = "table"});
}

template <class Decoder>
std::string decoded(const Decoder &decoder)
{
    qvsWapDoc *document = nullptr;
    const qvsResult result = qvsClientProvWbxmlDecoder(decoder, &document);
    std::string all = std::to_string(result);
    if (!document) {
        return all;
    }
    for (const qvsListNode *node = document->ptCharacterList->ptFirst; node; node = node->ptNext) {
        const auto *item = static_cast<const qvsWapCharacter *>(node->pItem);
        const qvsList *children = nullptr;
        if (const qvsWapPxLogical *proxy = item->ptPxLogical) {
            all += " " + shown(proxy->pszName);
            children = proxy->ptCharacterList;
        } else {
            children = item->ptApplication->ptCharacterList;
        }
        for (const qvsListNode *child = children->ptFirst; child; child = child->ptNext) {
            const auto *nested = static_cast<const qvsWapCharacter *>(child->pItem);
            if (const qvsWapPxPhysical *physical = nested->ptPxPhysical) {
                all += " domains " + shown(physical->ptDomainList);
                all += "napids " + shown(physical->ptToNapIdList);
            } else {
                all += " " + shown(nested->ptAppAuth->pszAAuthType);
            }
        }
    }
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
    return all;
}

class HostsDecoder : public blocks::BlockTest {};

} // namespace

TEST_F(HostsDecoder, DecodesAsOneOfTheLibraryDoes)
{
    const message::Bytes bytes = everything();
    const HostDecoder host(bytes);
    const Decoder own(bytes);
    const std::string answer = decoded(own);
    EXPECT_EQ(answer, "0 table domains 1 2 3 napids 1 2 3  domains 4 napids  HTTP,BASIC");
    EXPECT_EQ(decoded(host), answer);
    EXPECT_EQ(host->nStrSize, own->nStrSize);
    EXPECT_STREQ(host->pStringTable, own->pStringTable);
    EXPECT_EQ(host->nCodePage, own->nCodePage);
    EXPECT_EQ(host->nHasContent, own->nHasContent);
    EXPECT_EQ(host->nHasAttr, own->nHasAttr);
    EXPECT_EQ(qvsClientProvWbxmlDecoderDecodingSize(host), bytes.size());
}

TEST_F(HostsDecoder, IsHeldToTheLimitOfAllTexts)
{
    // 10,000 references to a text of 1,000 bytes.
    message::Body body;
    body.characteristic(message::kPxLogical, [&] {
        body.parm([&] {
            body.bytes({static_cast<uint8_t>(message::kName), message::kValue});
            for (int i = 0; i < 10000; ++i) {
                body.value(message::tableString(0));
            }
        });
    });
    const HostDecoder host(message::document(body, {.table = std::string(1000, 'x')}));
    EXPECT_EQ(decoded(host), "4111");
}

TEST_F(HostsDecoder, ReadsStepByStepWithinItsRecord)
{
    {
        const HostDecoder host({0x17, 0x06, 0x03, 'a', 0, 0x01, 0x17, 0x06, 0x03, 'b', 0, 0x01});
        qvsList *list = nullptr;
        for (int i = 0; i < 2; ++i) {
            EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(host, &list, 0x17), 0U);
            uint8_t end = 0;
            EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(host, &end), 1U);
        }
        EXPECT_EQ(shown(list), "a b ");
        EXPECT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), 0U);
    }
    {
        const HostDecoder host({0x07, 0x06, 0x03, 'n', 0, 0x01});
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(host, &text, 0x07), 0U);
        EXPECT_EQ(text.str(), "n");
    }
    {
        const HostDecoder host({0x90, 0x92});
        OwnText text("HTTP");
        EXPECT_EQ(qvsCommaAdd(host, &text), 0U);
        EXPECT_EQ(text.str(), "HTTP,BASIC");
    }
    {
        const HostDecoder host({'s', 0});
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(host, &text), 1U);
        EXPECT_EQ(text.str(), "s");
    }
    {
        const HostDecoder host({0xC6, 0x51, 0x01, 0x87, 0x17, 0x06, 0x03, 'a', 0, 0x01, 0x01});
        qvsWapCharacter *node = nullptr;
        EXPECT_EQ(qvsClientProvWbxmlDecoderCharacter(host, &node), 0U);
        ASSERT_NE(node, nullptr);
        EXPECT_EQ(shown(node->ptPxLogical->ptDomainList), "a ");
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
}

TEST_F(HostsDecoder, RefersToNoTableThatWasCutOff)
{
    const HostDecoder host({0x05, 'a', 'b'}); // claims five bytes and has two
    host->nStrSize =
        static_cast<uint32_t>(qvsClientProvWbxmlDecoderMakeStrTable(host, &host->pStringTable));
    EXPECT_EQ(host->nStrSize, 0xFFFFFFFFU);
    host->ptBuffer->pHead = host->ptBuffer->pStorage;
    *host->ptBuffer->pHead = 0;
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(host, &text), 0U);
    EXPECT_TRUE(text.isNull());
}

TEST_F(HostsDecoder, ReadsTheSameWithEveryValueInItsPadding)
{
    constexpr size_t kPadding = offsetof(qvsWbxmlDecoder, nCodePage) + 1;
    const Bytes bytes = {0x17, 0x06, 0x03, 'a', 0, 0x01};
    const HostDecoder host(bytes);
    uint8_t *const start = host->ptBuffer->pHead;
    for (uint32_t value = 0; value < 0x10000; ++value) {
        const uint8_t padding[3] = {static_cast<uint8_t>(value >> 4U), static_cast<uint8_t>(value),
                                    static_cast<uint8_t>(value >> 8U)};
        std::memcpy(reinterpret_cast<char *>(static_cast<qvsWbxmlDecoder *>(host)) + kPadding,
                    padding, sizeof padding);
        host->ptBuffer->pHead = start;
        qvsList *list = nullptr;
        ASSERT_EQ(qvsClientProvWbxmlDecoderParamListString(host, &list, 0x17), 0U) << value;
        ASSERT_EQ(shown(list), "a ") << value;
        ASSERT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), 0U);
    }
}

TEST_F(HostsDecoder, DecodesTheSameWithEveryValueInItsPadding)
{
    constexpr size_t kPadding = offsetof(qvsWbxmlDecoder, nCodePage) + 1;
    const message::Bytes bytes = everything();
    const std::string answer = decoded(HostDecoder(bytes));
    const HostDecoder host(bytes);
    uint8_t *const start = host->ptBuffer->pHead;
    for (uint32_t value = 0; value < 0x10000; value += 7) {
        std::memcpy(reinterpret_cast<char *>(static_cast<qvsWbxmlDecoder *>(host)) + kPadding + 1,
                    &value, 2);
        host->ptBuffer->pHead = start;
        host->nCodePage = 0;
        ASSERT_EQ(decoded(host), answer) << value;
        qvsMemFree_debug(host->pStringTable);
        host->pStringTable = nullptr;
    }
}
