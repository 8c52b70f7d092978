// The two ways to read a parameter: the usual ones in one go, all others step by step. Both read
// the same, so what tells them apart is the line on which they ask for the block of a text.
#include "blocks.h"
#include "decoding.h"
#include "memcheck.h"
#include "traces.h"

#include <string>
#include <vector>

using decoding::Bytes;
using decoding::Decoder;
using decoding::OwnText;

namespace {

class UsualParm : public blocks::BlockTest {};

constexpr char kModule[] = "jni/src/ClientProv/qvsClientProvWbxmlDecoder";

// The line on which the text of a parameter is asked for; 0 when it has no text.
int lineOfText(const Bytes &bytes)
{
    Decoder decoder(bytes);
    OwnText text;
    const auto blocks = memcheck::reportedBy(
        [&] { EXPECT_EQ(qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x15), QVS_OK); });
    EXPECT_EQ(decoder.position(), bytes.size() - 1) << "its END is left";
    if (blocks.empty()) {
        EXPECT_TRUE(text.isNull());
        return 0;
    }
    EXPECT_EQ(blocks.size(), 1U);
    EXPECT_EQ(blocks[0].file, kModule);
    EXPECT_EQ(static_cast<size_t>(blocks[0].size), text.str().size() + 1 + 4)
        << "the text, its end and the spare zeros";
    return blocks[0].line;
}

// The lines on which the texts of a list are asked for, in the order of its items.
std::vector<int> linesOfList(const Bytes &bytes)
{
    Decoder decoder(bytes);
    qvsList *list = nullptr;
    std::vector<int> lines;
    for (const auto &block : memcheck::reportedBy([&] {
             EXPECT_EQ(qvsClientProvWbxmlDecoderParamListString(decoder, &list, 0x15), QVS_OK);
         })) {
        if (block.file == kModule) {
            lines.push_back(block.line);
        }
    }
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), QVS_OK);
    return lines;
}

const Bytes kString = {0x15, 0x06, 0x03, 'a', 'b', 0, 0x01};
const Bytes kEmptyString = {0x15, 0x06, 0x03, 0, 0x01};
const Bytes kToken = {0x15, 0x06, 0x85, 0x01};
const Bytes kOpaque = {0x15, 0x06, 0xC3, 0x01, 'a', 0x01};

} // namespace

TEST_F(UsualParm, IsReadInOneGo)
{
    const int line = lineOfText(kString);
    EXPECT_GT(line, 0);
    EXPECT_EQ(lineOfText(kEmptyString), line);
    EXPECT_EQ(lineOfText(kToken), line);
    EXPECT_EQ(lineOfText({0x15, 0x06, 0x95, 0x01}), line);
    EXPECT_EQ(linesOfList(kString), std::vector<int>{line});
    EXPECT_EQ(linesOfList(kToken), std::vector<int>{line});
}

TEST_F(UsualParm, IsWithoutPiecesSwitchesOrOtherKindsOfText)
{
    const int step = lineOfText(kOpaque);
    EXPECT_GT(step, 0);
    EXPECT_NE(step, lineOfText(kString));
    const Bytes others[] = {
        {0x15, 0x06, 0x00, 0x01, 0x03, 'a', 0, 0x01}, // a page switch before the string
        {0x15, 0x00, 0x01, 0x06, 0x03, 'a', 0, 0x01}, // a page switch before the VALUE
    };
    for (const Bytes &bytes : others) {
        EXPECT_EQ(lineOfText(bytes), step) << testing::PrintToString(bytes);
    }
    EXPECT_EQ(lineOfText({0x15, 0x01}), 0);
}

TEST_F(UsualParm, IsTheFirstOfAListAlone)
{
    const int line = lineOfText(kString);
    const std::vector<int> lines = linesOfList({0x15, 0x06, 0x85, 0x15, 0x06, 0x03, 'a', 0, 0x01});
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_NE(lines[0], line) << "something follows it";
    EXPECT_EQ(lines[1], lines[0]) << "it goes on with the text before it";
}

TEST_F(UsualParm, IsReadStepByStepForWhoeverListens)
{
    Traces traces;
    EXPECT_EQ(lineOfText(kString), lineOfText(kOpaque));
    EXPECT_EQ(lineOfText(kToken), lineOfText(kOpaque));
}
