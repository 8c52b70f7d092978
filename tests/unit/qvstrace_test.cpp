// Trace messages, word for word, and nothing without a sink.
#include "qvstrace.h"

#include "blocks.h"
#include "memcheck.h"
#include "qvsmemory.h"
#include "traces.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <cstring>
#include <string>
#include <utility>
#include <vector>

namespace {

using Texts = std::vector<std::string>;

static_assert(sizeof(_szBuffer) == 32000);

// What `action` traces.
template <class Action>
Texts tracedBy(Action action)
{
    Traces traces;
    action();
    EXPECT_TRUE(traces.terminated);
    return traces.texts;
}

const uint8_t *bytesOf(const std::string &text)
{
    return reinterpret_cast<const uint8_t *>(text.data());
}

// Calls every trace function.
void traceAll()
{
    qvcTrace("%d", 1);
    qvcTraceError(2);
    qvcTraceFunction("name");
    qvcTraceString("%s", "text");
    qvcTraceExcption("message", "file", 3);
    qvcTraceDump("label", bytesOf("data"), 4);
    qvs::trace("text");
    qvs::trace("%d", 5);
    qvs::traceError(6);
    qvs::traceException("message", "file", 7);
}

class Trace : public blocks::BlockTest {};

// A wide character that no multi-byte encoding has: the C library refuses to format it.
const wchar_t kNoText[] = {static_cast<wchar_t>(0x7FFFFFFF), 0};

} // namespace

TEST_F(Trace, FormatsAndEndsTheLine)
{
    EXPECT_EQ(
        tracedBy([] {
            qvcTrace("%s length:%d", "label", 5);
            qvcTrace("WARNING!!!!!!!! Not Support Type Numberic nTag=[%x]", 0x7FU);
            qvcTrace("%s", "");
        }),
        (Texts{"label length:5\n", "WARNING!!!!!!!! Not Support Type Numberic nTag=[7f]\n", "\n"}));
}

TEST_F(Trace, CutsATextThatDoesNotFit)
{
    for (const std::size_t length : {20477U, 20478U, 20479U, 20480U, 40000U}) {
        const std::string text(length, 'a');
        const Texts texts = tracedBy([&] { qvcTrace("%s", text.c_str()); });
        ASSERT_EQ(texts.size(), 1U);
        EXPECT_EQ(texts[0], text.substr(0, 20478) + "\n") << length;
    }
}

TEST_F(Trace, ShowsATextThatCannotBeFormattedAsEmpty)
{
    EXPECT_EQ(tracedBy([] { qvcTrace("a%lsb", kNoText); }), Texts{"\n"});
}

TEST_F(Trace, TracesNothingForNullFormatsAndNames)
{
    const char *null = nullptr;
    EXPECT_EQ(tracedBy([&] {
                  qvcTrace(null);
                  qvcTraceFunction(null);
                  qvcTraceString(null, "text");
              }),
              Texts{});
}

TEST_F(Trace, ErrorShowsTheCode)
{
    for (const auto &[code, text] :
         std::vector<std::pair<qvsResult, const char *>>{{1, "[Syncml] ERROR : 1\n"},
                                                         {0xABC, "[Syncml] ERROR : abc\n"},
                                                         {4095, "[Syncml] ERROR : fff\n"},
                                                         {8192, "[Syncml] ERROR : DM = 0\n"},
                                                         {8193, "[Syncml] ERROR : DM = 1\n"},
                                                         {12287, "[Syncml] ERROR : DM = fff\n"}}) {
        const qvsResult traced = code;
        EXPECT_EQ(tracedBy([traced] { qvcTraceError(traced); }), Texts{text}) << code;
    }
}

TEST_F(Trace, ErrorShowsNothingForSuccessAndFrom12288)
{
    EXPECT_EQ(tracedBy([] {
                  qvcTraceError(0);
                  qvcTraceError(12288);
                  qvcTraceError(UINT_MAX);
              }),
              Texts{});
}

TEST_F(Trace, FunctionShowsTheName)
{
    const std::string longName(1000, 'n');
    EXPECT_EQ(tracedBy([&] {
                  qvcTraceFunction("name");
                  qvcTraceFunction("");
                  qvcTraceFunction(longName.c_str());
              }),
              (Texts{"[Syncml] name()\n", "[Syncml] ()\n", "[Syncml] " + longName + "()\n"}));
}

TEST_F(Trace, StringShowsTheFormattedText)
{
    const std::string longText(1000, 't');
    EXPECT_EQ(
        tracedBy([&] {
            qvcTraceString("value=%s.", "text");
            qvcTraceString("value=%s.", nullptr);
            qvcTraceString("%s", longText.c_str());
        }),
        (Texts{"[Syncml] value=text.\n", "[Syncml] value=.\n", "[Syncml] " + longText + "\n"}));
}

TEST_F(Trace, StringCutsWhatTheFormatAddsBeyond90Bytes)
{
    // The block has 101 bytes more than the text: 9 are the prefix, one the line end, one the NUL.
    for (const std::size_t added : {89U, 90U, 91U, 92U, 101U, 500U}) {
        const std::string format = "%s" + std::string(added, '+');
        EXPECT_EQ(
            tracedBy([&] { qvcTraceString(format.c_str(), "text"); }),
            Texts{"[Syncml] text" + std::string(std::min<std::size_t>(added, 90), '+') + "\n"})
            << added;
    }
}

TEST_F(Trace, ExceptionShowsMessageFileAndLine)
{
    const std::string longText(1000, 't');
    EXPECT_EQ(
        tracedBy([&] {
            qvcTraceExcption("message", "file.c:", 17);
            qvcTraceExcption("", "", INT_MIN);
            qvcTraceExcption(nullptr, "file", 1);
            qvcTraceExcption("message", nullptr, 1);
            qvcTraceExcption(longText.c_str(), longText.c_str(), INT_MIN);
        }),
        (Texts{"[Syncml] message file.c:17\n", "[Syncml]  -2147483648\n", "[Syncml]  file1\n",
               "[Syncml] message 1\n", "[Syncml] " + longText + " " + longText + "-2147483648\n"}));
}

TEST_F(Trace, BlocksOfMessagesHaveTheirSizesAndAreReleasedAtOnce)
{
    const Traces traces;
    const auto allocatedBy = [](auto action) {
        blocks::startCounting();
        action();
        return std::pair(blocks::allocations(), blocks::allocated());
    };
    using Counted = std::pair<std::size_t, std::size_t>;
    EXPECT_EQ(allocatedBy([] { qvcTraceFunction("name"); }), Counted(1, 4 + 31));
    EXPECT_EQ(allocatedBy([] { qvcTraceString("%s", "text"); }), Counted(2, 2 * (4 + 101)));
    EXPECT_EQ(allocatedBy([] { qvcTraceExcption("message", "file", 1); }), Counted(1, 7 + 4 + 41));
    EXPECT_EQ(allocatedBy([] {
                  qvcTrace("%s", "text");
                  qvcTraceError(1);
                  qvcTraceDump("label", bytesOf("data"), 4);
                  qvcTraceDump22(bytesOf("data"), 4);
              }),
              Counted(0, 0));
}

TEST_F(Trace, WithoutMemoryThereIsNoMessage)
{
    EXPECT_EQ(blocks::failEach([] {
                  const Texts texts = tracedBy([] { qvcTraceFunction("name"); });
                  EXPECT_LE(texts.size(), blocks::failAt < 0 ? 0U : 1U);
              }),
              1);
    EXPECT_EQ(blocks::failEach([] {
                  const Texts texts = tracedBy([] { qvcTraceString("%s", "text"); });
                  EXPECT_LE(texts.size(), blocks::failAt < 0 ? 0U : 1U);
              }),
              2);
    EXPECT_EQ(blocks::failEachFrom([] {
                  const Texts texts = tracedBy([] { qvcTraceExcption("message", "file", 1); });
                  EXPECT_LE(texts.size(), blocks::failAt < 0 ? 0U : 1U);
              }),
              1);
}

TEST_F(Trace, DumpShowsLengthDigitsAndCharacters)
{
    EXPECT_EQ(tracedBy([] { qvcTraceDump("body", bytesOf("A\x01~\x7F"), 4); }),
              (Texts{"body length:4\n", "41 01 7E 7F    A.~.\n"}));
}

TEST_F(Trace, DumpBreaksLinesBehind16Bytes)
{
    const std::string bytes = "0123456789ABCDEF";
    const std::string line =
        "30 31 32 33 34 35 36 37 38 39 41 42 43 44 45 46    0123456789ABCDEF\n";
    EXPECT_EQ(tracedBy([&] { qvcTraceDump(nullptr, bytesOf(bytes), 15); }),
              Texts{"30 31 32 33 34 35 36 37 38 39 41 42 43 44 45    0123456789ABCDE\n"});
    EXPECT_EQ(tracedBy([&] { qvcTraceDump(nullptr, bytesOf(bytes), 16); }), Texts{line});
    EXPECT_EQ(tracedBy([&] { qvcTraceDump(nullptr, bytesOf(bytes + "!"), 17); }),
              (Texts{line, "21    !\n"}));
    EXPECT_EQ(tracedBy([&] { qvcTraceDump("x", bytesOf(bytes + bytes), 32); }),
              (Texts{"x length:32\n", line, line}));
}

TEST_F(Trace, DumpOfNoBytesIsOnlyItsLabel)
{
    EXPECT_EQ(tracedBy([] { qvcTraceDump("body", bytesOf(""), 0); }), Texts{"body length:0\n"});
    EXPECT_EQ(tracedBy([] { qvcTraceDump(nullptr, bytesOf(""), 0); }), Texts{});
    EXPECT_EQ(tracedBy([] { qvcTraceDump("body", nullptr, 4); }), Texts{});
}

TEST_F(Trace, Dump22FillsTheBuffer)
{
    ASSERT_EQ(qvs::traceSink, nullptr);
    qvcTraceDump22(bytesOf("0123456789ABCDEF!"), 17);
    EXPECT_STREQ(_szBuffer,
                 "30 31 32 33 34 35 36 37 38 39 41 42 43 44 45 46    0123456789ABCDEF\r\n"
                 "21 !");
    qvcTraceDump22(nullptr, 17);
    EXPECT_STREQ(_szBuffer, "");
    std::memset(_szBuffer, '#', 10);
    qvcTraceDump22(bytesOf("x"), 0);
    EXPECT_STREQ(_szBuffer, "");
}

TEST_F(Trace, Dump22WithASinkFillsTheBufferAndTracesNothing)
{
    EXPECT_EQ(tracedBy([] { qvcTraceDump22(bytesOf("A"), 1); }), Texts{});
    EXPECT_STREQ(_szBuffer, "41 A");
}

TEST_F(Trace, Dump22CutsDataThatDoesNotFit)
{
    // 463 lines of 69 bytes, and 13 bytes more: a dump of 7421 bytes may take exactly 32000 bytes.
    const std::string bytes(8000, 'a');
    for (const uint32_t length : {7420U, 7421U, 7422U, 8000U, UINT_MAX}) {
        qvcTraceDump22(bytesOf(bytes), length);
        const std::size_t shown = std::min(length, 7421U);
        EXPECT_EQ(std::strlen(_szBuffer), 463 * 69 + (shown - 463 * 16) * 4) << length;
    }
}

TEST_F(Trace, CallsOfTheLibraryReachTheSink)
{
    EXPECT_EQ(tracedBy([] {
                  qvs::trace("100%");
                  qvs::trace("%s=%d", "a", 1);
                  qvs::traceError(1);
                  qvs::traceException("message", "file", 2);
              }),
              (Texts{"100%\n", "a=1\n", "[Syncml] ERROR : 1\n", "[Syncml] message file2\n"}));
}

TEST_F(Trace, NothingIsFormedWithoutASink)
{
    ASSERT_EQ(qvs::traceSink, nullptr);
    blocks::startCounting();
    testing::internal::CaptureStdout();
    traceAll();
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
    EXPECT_EQ(blocks::allocations(), 0U);
}

TEST_F(Trace, FormsAMessageInABlockUnderItsSource)
{
    const auto files = memcheck::filesOf([] {
        qvcTraceSetSink([](const char *, uint32_t) { qvsMemEndMemCheck(); });
        qvcTraceFunction("f");
        qvcTraceSetSink(nullptr);
    });
    EXPECT_EQ(files, Texts{"jni/src/ClientProv/qvstrace"});
}

TEST_F(Trace, NothingIsPrintedWithASink)
{
    testing::internal::CaptureStdout();
    const Texts texts = tracedBy(traceAll);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
    EXPECT_EQ(texts.size(), 11U);
}

TEST(Kept, trace_error_wraps)
{
    EXPECT_EQ(tracedBy([] { qvcTraceError(4096); }), Texts{"[Syncml] ERROR : DM = fffff000\n"});
    EXPECT_EQ(tracedBy([] { qvcTraceError(4101); }), Texts{"[Syncml] ERROR : DM = fffff005\n"});
    EXPECT_EQ(tracedBy([] { qvcTraceError(8191); }), Texts{"[Syncml] ERROR : DM = ffffffff\n"});
}

TEST(Kept, trace_exception_joined)
{
    EXPECT_EQ(tracedBy([] { qvcTraceExcption("m", "jni/src/ClientProv/qvs", 123); }),
              Texts{"[Syncml] m jni/src/ClientProv/qvs123\n"});
}
