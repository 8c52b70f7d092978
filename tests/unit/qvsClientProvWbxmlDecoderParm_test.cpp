// The blocks of texts as memory checking reports them, by what a text is made of.
#include "blocks.h"
#include "decoding.h"
#include "memcheck.h"
#include "traces.h"

#include <algorithm>
#include <string>
#include <vector>

using decoding::Bytes;
using decoding::Decoder;
using decoding::OwnText;

namespace {

class BlockOfAText : public blocks::BlockTest {};

// The size that is recorded for the text that `read` makes or continues; 0 for no block.
template <class Read>
int recordedFor(const Bytes &bytes, const char *before, Read read)
{
    Decoder decoder(bytes);
    OwnText text;
    const auto blocks = memcheck::reportedBy([&] {
        text.text = before ? qvsStrdup_debug(before, "test", 1) : nullptr;
        (void)read(decoder, &text.text);
    });
    if (blocks.empty()) {
        EXPECT_TRUE(text.isNull());
        return 0;
    }
    EXPECT_EQ(blocks.size(), 1U);
    return blocks[0].size;
}

int recorded(const Bytes &bytes, const char *before = nullptr)
{
    return recordedFor(bytes, before, qvsClientProvWbxmlDecoderContent);
}

} // namespace

TEST_F(BlockOfAText, IsRecordedWithItsTerminator)
{
    EXPECT_EQ(recorded({0x03, 'a', 'b', 0, 0x01}), 3);
    EXPECT_EQ(recorded({0x03, 0, 0x01}), 1);
    EXPECT_EQ(recorded({0x85}), 5) << "IPV4";
    EXPECT_EQ(recorded({0x03, 'a', 0, 0x03, 'b', 0, 0x9A, 0x01}), 7) << "ab,PAP";
    EXPECT_EQ(recorded({0x03, 'c', 0, 0x01}, "ab"), 4);
    EXPECT_EQ(recorded({0x92}, "ab"), 9) << "ab,BASIC";
    EXPECT_EQ(recorded({0x85}, "ab"), 7) << "abIPV4";
}

TEST_F(BlockOfAText, IsRecordedWithTwoMoreBytesForATokenOpaqueDataAndAJoinOutOfSight)
{
    EXPECT_EQ(recorded({0xFE}), 2);
    EXPECT_EQ(recorded({0xC3, 0x03, 'a', 0, 'b'}), 5);
    EXPECT_EQ(recorded({0xC3, 0x01, 'c'}, "ab"), 5);
    EXPECT_EQ(recorded({0x94}, "ab"), 2 + 15 + 2) << "BIT-TRANSPARENT";
    EXPECT_EQ(recorded({0x03, 'a', 0, 0x94, 0x9A, 0x01}), 6) << "a,PAP";
}

TEST_F(BlockOfAText, IsANewOneForEachJoinWhileBlocksAreTracked)
{
    // The first join would leave room for the second.
    const Bytes joins = {0x90, 0x92, 0x90, 0x93};
    EXPECT_EQ(recordedFor(joins, "A-text-of-some-length",
                          [](qvsWbxmlDecoder *decoder, char **text) {
                              (void)qvsCommaAdd(decoder, text);
                              return qvsCommaAdd(decoder, text);
                          }),
              21 + 6 + 7 + 1);
    EXPECT_EQ(recordedFor({0x90, 0x03, 'x', 0, 0x01}, "ab", qvsCommaAdd), 5) << "ab,x";
}

TEST_F(BlockOfAText, IsAskedForUnderOneSourceByAllReaders)
{
    for (const Bytes &bytes : {Bytes{0x03, 'a', 0, 0x01}, Bytes{0x85}, Bytes{0xC3, 0x01, 'a'},
                               Bytes{0xFE}, Bytes{0x03, 'a', 0, 0x85, 0x01}}) {
        Decoder decoder(bytes);
        OwnText text;
        const auto files = memcheck::filesOf(
            [&] { EXPECT_EQ(qvsClientProvWbxmlDecoderContent(decoder, &text), QVS_OK); });
        EXPECT_EQ(files, std::vector<std::string>{"jni/src/ClientProv/qvsClientProvWbxmlDecoder"});
    }
}

// A value of several pieces continues the text of the pair before it in the same element.
TEST_F(BlockOfAText, OfALaterPairTakesThePiecesOfBoth)
{
    Decoder decoder({0x15, 0x06, 0x85, 0x15, 0x06, 0x03, 'a', 0, 0x03, 'b', 0, 0x01});
    qvsList *list = nullptr;
    std::vector<int> sizes;
    for (const auto &block : memcheck::reportedBy([&] {
             EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &list, 0x15), QVS_OK);
         })) {
        if (block.file != "jni/src/ClientProv/qvslist") {
            sizes.push_back(block.size);
        }
    }
    std::sort(sizes.begin(), sizes.end());
    EXPECT_EQ(sizes, (std::vector<int>{5, 7})) << "IPV4 and IPV4ab";
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), QVS_OK);
}
