// The byte readers: integers, inline strings, the string table and references into it, opaque data.
#include "blocks.h"
#include "decoding.h"
#include "traces.h"

#include <cstring>
#include <malloc.h>

using decoding::Bytes;
using decoding::Decoder;
using decoding::OwnText;

namespace {

constexpr char kNoMemory[] = "[Error] [qvsClientProvWbxmlDecoderGetStr] pszData NULL\n";

class ByteReader : public blocks::BlockTest {};
class StringTable : public blocks::BlockTest {};
class StringReader : public blocks::BlockTest {};

// Reads one mb_u_int32; -1 for a failure.
int64_t readInteger(const Bytes &bytes, uint32_t *position = nullptr)
{
    Decoder decoder(bytes);
    uint32_t value = 0xDEADBEEF;
    const uint32_t read = qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &value);
    if (position) {
        *position = decoder.position();
    }
    EXPECT_TRUE(read == 1 || value == 0xDEADBEEF) << "a failure stores nothing";
    return read ? int64_t{value} : -1;
}

} // namespace

TEST_F(ByteReader, ReadsEachByteAndThenAnswersZero)
{
    Decoder decoder({0x10, 0xFF});
    uint8_t byte = 0;
    EXPECT_EQ(decoder.position(), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 1U);
    EXPECT_EQ(byte, 0x10);
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 1U);
    EXPECT_EQ(byte, 0xFF);
    EXPECT_EQ(decoder.position(), 2U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 0U);
    EXPECT_EQ(byte, 0xFF);
    EXPECT_EQ(decoder.position(), 2U);
}

TEST_F(ByteReader, AnswersZeroWithoutADecoderOrABuffer)
{
    uint8_t byte = 7;
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(nullptr, &byte), 0U);
    qvsWbxmlDecoder empty = {};
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(&empty, &byte), 0U);
    uint32_t number = 7;
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadUint32(nullptr, &number), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadUint32(&empty, &number), 0U);
    EXPECT_EQ(number, 7U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderDecodingSize(nullptr), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderDecodingSize(&empty), 0U);
    char *text = nullptr;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(nullptr, &text), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(&empty, &text), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(nullptr, &text), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(&empty, &text), 0U);
    uint32_t length = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(nullptr, 0xC3, &text, &length), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(&empty, 0xC3, &text, &length), 0U);
    EXPECT_EQ(text, nullptr);
}

TEST_F(ByteReader, ReadsIntegersOfOneToFiveBytes)
{
    EXPECT_EQ(readInteger({0x00}), 0);
    EXPECT_EQ(readInteger({0x7F}), 127);
    EXPECT_EQ(readInteger({0x81, 0x00}), 128);
    EXPECT_EQ(readInteger({0x81, 0x20}), 160);
    EXPECT_EQ(readInteger({0x83, 0xFF, 0x7F}), 0xFFFF);
    EXPECT_EQ(readInteger({0x80, 0x80, 0x80, 0x80, 0x05}), 5);
    EXPECT_EQ(readInteger({0x8F, 0xFF, 0xFF, 0xFF, 0x7F}), 0xFFFFFFFFLL);
}

TEST_F(ByteReader, LetsTheHighBitsOfALongIntegerFallOff)
{
    EXPECT_EQ(readInteger({0xFF, 0x80, 0x80, 0x80, 0x01}), 0xF0000001LL);
}

TEST_F(ByteReader, FailsBehindTheFifthContinuationByte)
{
    uint32_t position = 0;
    EXPECT_EQ(readInteger({0x80, 0x80, 0x80, 0x80, 0x80, 0x01}, &position), -1);
    EXPECT_EQ(position, 5U);
}

TEST_F(ByteReader, FailsWhereAnIntegerIsCutOff)
{
    EXPECT_EQ(readInteger({}), -1);
    EXPECT_EQ(readInteger({0x80}), -1);
    EXPECT_EQ(readInteger({0x80, 0x80, 0x80, 0x80}), -1);
}

TEST_F(StringTable, IsCopiedWithATerminator)
{
    Decoder decoder({0x04, 'a', 0, 'b', 'c', 0x05});
    EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), 4);
    EXPECT_EQ(memcmp(decoder->pStringTable, "a\0bc\0", 6), 0);
    EXPECT_EQ(decoder.position(), 5U);
}

TEST_F(StringTable, OfLengthZeroIsTwoZeroBytes)
{
    Decoder decoder({0x00});
    EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), 0);
    EXPECT_EQ(decoder->pStringTable[0], 0);
    EXPECT_EQ(decoder->pStringTable[1], 0);
}

TEST_F(StringTable, LongerThanTheDataFailsAndKeepsWhatThereWas)
{
    blocks::startCounting();
    Decoder decoder({0x83, 0xFF, 0x7F, 'a', 'b'});
    EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), -1);
    EXPECT_STREQ(decoder->pStringTable, "ab");
    EXPECT_EQ(decoder.position(), 5U);
    EXPECT_LT(blocks::allocated(), 2000U) << "no block of the claimed length";
}

TEST_F(StringTable, LengthAboveTheLimitOrUnreadableFails)
{
    for (const Bytes &bytes : {Bytes{0x8F, 0xFF, 0xFF, 0xFF, 0x7E}, // 0xFFFFFFFE
                               Bytes{0x8F, 0xFF, 0xFF, 0xFF, 0x7F}, Bytes{0x80}, Bytes{}}) {
        Decoder decoder(bytes);
        EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), -1);
        EXPECT_EQ(decoder->pStringTable, nullptr);
    }
    Decoder decoder({0x8F, 0xFF, 0xFF, 0xFF, 0x7D, 'x'}); // 0xFFFFFFFD is within the limit
    EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), -1);
    EXPECT_STREQ(decoder->pStringTable, "x");
}

TEST_F(StringTable, WithoutMemoryFails)
{
    Decoder decoder({0x01, 'a'});
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable), -1);
    blocks::reset();
    EXPECT_EQ(decoder->pStringTable, nullptr);
    EXPECT_TRUE(traces.has(kNoMemory));
}

TEST_F(StringReader, ReadsAnInlineStringUpToItsNul)
{
    Decoder decoder({'a', 'b', 0, 'c'});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "ab");
    EXPECT_EQ(decoder.position(), 3U);
}

TEST_F(StringReader, TakesAnInlineStringThatTheDataEndsIn)
{
    Decoder decoder({'a', 'b'});
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "ab");
    uint8_t byte = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 0U);
}

TEST_F(StringReader, TakesTheTokenByteThatWasOnlyPeekedAt)
{
    Decoder decoder({0x03, 'a', 0});
    OwnText text;
    uint8_t tag = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurElement(decoder, &tag), QVS_OK);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "\x03"
                          "a");
}

TEST_F(StringReader, NeverReadsOutsideAStorageWithoutASpareByte)
{
    // The storage ends with the string; behind it there is nothing.
    auto *storage = static_cast<uint8_t *>(qvsMemAlloc_debug(2, "test", __LINE__));
    Decoder decoder({'z'});
    (void)smlBufferDelete(decoder->ptBuffer);
    decoder->ptBuffer = nullptr;
    ASSERT_EQ(smlBufferCreateOutsideBuf(&decoder->ptBuffer, storage, 2), QVS_OK);
    memcpy(storage, "ab", 2);
    decoder->ptBuffer->nSize = 2;
    for (int i = 0; i < 3; ++i) {
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
        EXPECT_EQ(text.str(), i == 0 ? "ab" : "");
    }
    EXPECT_EQ(decoder.position(), 3U) << "behind the terminator that is not there, and no further";
    qvsMemFree_debug(storage);
}

TEST_F(StringReader, ReadsOnBehindTheDataAsFarAsTheStorageGoes)
{
    Decoder decoder({'a', 'b', 'c', 'd', 0, 'e'});
    decoder->ptBuffer->nSize = 2;
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "abcd");
    EXPECT_EQ(decoder.position(), 5U);
    uint8_t byte = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 0U);
    // From behind the data too.
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "abcde");
    EXPECT_EQ(decoder.position(), 7U);
}

TEST_F(StringReader, ReadsByTheHeadTheStorageAndTheSizeOfABufferAlone)
{
    Decoder decoder({'a', 0, 0, 'b'});
    const smlBuffer whole = *decoder->ptBuffer;
    uint8_t elsewhere = 0;
    decoder->ptBuffer->pTail = nullptr;
    decoder->ptBuffer->nCapacity = 0xFFFFFFF0;
    decoder->ptBuffer->bOutside = 1;
    for (uint8_t *end : {static_cast<uint8_t *>(nullptr), &elsewhere}) {
        decoder->ptBuffer->pHead = whole.pHead;
        decoder->ptBuffer->pEnd = end;
        OwnText text;
        for (const uint32_t position : {2U, 3U, 5U}) {
            EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
            EXPECT_EQ(decoder.position(), position);
        }
        EXPECT_EQ(text.str(), "ab");
    }
    *decoder->ptBuffer = whole;
}

TEST_F(StringReader, AdvancesByTheTerminatorAtTheVeryEnd)
{
    Decoder decoder({'a', 'b'});
    smlBuffer *buffer = decoder->ptBuffer;
    buffer->pHead = buffer->pEnd;
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "");
    EXPECT_EQ(buffer->pHead, buffer->pEnd + 1);
    // A read position behind the end is one of a decoder without more data.
    uint8_t byte = 0;
    uint32_t number = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadByte(decoder, &byte), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderBufferReadUint32(decoder, &number), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderCurAttr(decoder, &byte), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &number), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &text), 4103U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(buffer->pHead, buffer->pEnd + 1);
}

TEST_F(StringReader, AppendsToATextThatIsThereInANewBlock)
{
    Decoder decoder({'b', 'c', 0});
    OwnText text("a");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "abc");
}

TEST_F(StringReader, AppendsAnEmptyTextToAHostsBlockInANewOne)
{
    // The host's block ends with the terminator; behind it there is nothing.
    const auto hostText = [] {
        const blocks::Fence fence;
        return static_cast<char *>(qvsMemDup_debug("1234567", 8, "host", __LINE__));
    };
    OwnText text;
    text.text = hostText();
    Decoder decoder({0x00});
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "1234567");

    OwnText opaque;
    opaque.text = hostText();
    uint32_t length = 1;
    Decoder empty({0x00});
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(empty, 0xC3, &opaque, &length), 1U);
    EXPECT_EQ(opaque.str(), "1234567");
    EXPECT_EQ(length, 0U);
}

TEST_F(StringReader, WithoutMemoryKeepsTheTextThatWasThere)
{
    Decoder decoder({'b', 0});
    OwnText text("a");
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStr(decoder, &text), 0U);
    blocks::reset();
    EXPECT_EQ(text.str(), "a");
    EXPECT_TRUE(traces.has(kNoMemory));
}

TEST_F(StringReader, ReadsAReferenceIntoTheTable)
{
    Decoder decoder({0x05, 'a', 'b', 0, 'c', 'd', 0x03, 0x01});
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    OwnText text("x");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "xcd");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "xcdb");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U) << "no index is left";
}

TEST_F(StringReader, RefusesAReferenceBeyondTheTable)
{
    Decoder decoder({0x02, 'a', 'b', 0x01, 0x02, 0x03});
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 1U);
    EXPECT_EQ(text.str(), "b");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U);
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U);
    EXPECT_EQ(text.str(), "b");
}

TEST(Kept, empty_table_index)
{
    blocks::BlockCheck check;
    Decoder decoder({0x00, 0x00, 0x01, 0x02});
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    for (int index = 0; index < 2; ++index) {
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 1U);
        EXPECT_EQ(text.str(), "");
    }
    OwnText text;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U) << "outside the block";
}

TEST_F(StringReader, RefusesAnyReferenceWithoutATable)
{
    for (const uint32_t size : {0U, 3U, 0xFFFFFFFFU}) {
        Decoder decoder({0x00});
        decoder->nStrSize = size;
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U);
        EXPECT_TRUE(text.isNull());
    }
}

TEST_F(StringReader, RefusesAnyReferenceToATableThatWasCutOff)
{
    Decoder decoder({0x05, 'a', 'b'}); // claims five bytes and has two
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    EXPECT_EQ(decoder->nStrSize, 0xFFFFFFFFU);
    for (uint8_t index = 0; index < 6; ++index) {
        decoder->ptBuffer->pHead = decoder->ptBuffer->pStorage;
        *decoder->ptBuffer->pHead = index;
        OwnText text;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U);
    }
}

TEST_F(StringReader, ReferenceWithoutMemoryKeepsTheTextThatWasThere)
{
    Decoder decoder({0x01, 'b', 0x00});
    decoder->nStrSize = static_cast<uint32_t>(
        qvsClientProvWbxmlDecoderMakeStrTable(decoder, &decoder->pStringTable));
    OwnText text("a");
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrTable(decoder, &text), 0U);
    blocks::reset();
    EXPECT_EQ(text.str(), "a");
    EXPECT_TRUE(traces.has(kNoMemory));
}

TEST_F(StringReader, ReadsOpaqueDataWithItsLength)
{
    Decoder decoder({0x03, 'a', 0, 'b', 'c'});
    OwnText text;
    uint32_t length = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 1U);
    EXPECT_EQ(length, 3U);
    ASSERT_FALSE(text.isNull());
    EXPECT_EQ(memcmp(text.text, "a\0b\0", 4), 0);
    EXPECT_EQ(decoder.position(), 4U);
}

TEST_F(StringReader, EndsOpaqueDataInTwoZeroBytes)
{
    for (const size_t size : {0U, 1U, 2U, 7U, 40U}) {
        Bytes bytes(size + 1, 'x');
        bytes[0] = static_cast<uint8_t>(size);
        Decoder decoder(bytes);
        OwnText text;
        uint32_t length = 0;
        mallopt(M_PERTURB, 0x5A); // memory is what others have left in it
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 1U);
        mallopt(M_PERTURB, 0);
        EXPECT_EQ(text.str(), std::string(size, 'x'));
        EXPECT_EQ(text.text[size + 1], '\0');
    }
}

TEST_F(StringReader, AppendsOpaqueDataToTheVisibleText)
{
    Decoder decoder({0x03, 'b', 0, 'x', 0x01, 'c'});
    OwnText text("a");
    uint32_t length = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 1U);
    EXPECT_EQ(text.str(), "ab");
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 1U);
    EXPECT_EQ(text.str(), "abc");
}

TEST_F(StringReader, AnswersOneAndReadsNothingForAnyTokenButOpaque)
{
    for (int token = 0; token < 256; ++token) {
        if (token == 0xC3) {
            continue;
        }
        Decoder decoder({0x01, 'a'});
        OwnText text;
        uint32_t length = 77;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, static_cast<uint8_t>(token),
                                                           &text, &length),
                  1U);
        EXPECT_TRUE(text.isNull());
        EXPECT_EQ(length, 77U);
        EXPECT_EQ(decoder.position(), 0U);
    }
}

TEST_F(StringReader, RefusesOpaqueDataLongerThanWhatIsLeft)
{
    for (const Bytes &bytes : {Bytes{0x03, 'a', 'b'}, Bytes{0x8F, 0xFF, 0xFF, 0xFF, 0x7F, 'a'},
                               Bytes{0x8F, 0xFF, 0xFF, 0xFF, 0x7E, 'a'}, Bytes{0x80}, Bytes{}}) {
        Decoder decoder(bytes);
        OwnText text;
        uint32_t length = 0;
        EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 0U);
        EXPECT_TRUE(text.isNull());
    }
    Decoder decoder({0x02, 'a', 'b'});
    OwnText text;
    uint32_t length = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 1U)
        << "all that is left";
    EXPECT_EQ(text.str(), "ab");
}

TEST_F(StringReader, OpaqueDataWithoutMemoryIsAFailure)
{
    Decoder decoder({0x01, 'a'});
    OwnText text;
    uint32_t length = 0;
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderGetStrExtension(decoder, 0xC3, &text, &length), 0U);
    blocks::reset();
    EXPECT_TRUE(text.isNull());
    EXPECT_TRUE(traces.has(kNoMemory));
}
