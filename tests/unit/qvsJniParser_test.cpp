// The parse session: XCPCtxParser with real messages, and what a session leaves behind.
#include "support/blocks.h"
#include "support/fakevm.h"
#include "support/handmade.h"
#include "support/message.h"

#include "qvsJni.h"

#include <gtest/gtest.h>

#include <numeric>
#include <string>
#include <utility>
#include <vector>

namespace {

using fakevm::Answer;
using fakevm::Bytes;
using fakevm::Text;
using handmade::LoadedVm;
using message::Body;

constexpr jint kHeaderOnly = 1;
const Answer kTrue{.number = 1};
const Answer kFalse{};
const std::string kMac = "0123456789ABCDEF0123456789ABCDEF01234567";

// A document with a proxy, and one with an access point.
Bytes proxyDocument()
{
    Body body;
    body.characteristic(message::kPxLogical, [&] {
        body.parm(message::kProxyId, "proxy");
        body.parm(message::kDomain, "example.org");
    });
    return message::document(body);
}

Bytes napDocument()
{
    Body body;
    body.characteristic(message::kNapDef, [&] { body.parm(message::kNapId, "nap"); });
    return message::document(body);
}

Bytes brokenDocument()
{
    Bytes document = proxyDocument();
    document.resize(document.size() - 3);
    return document;
}

// A push with both security parameters.
Bytes signedPush(const Bytes &body)
{
    return message::push(body,
                         {.security = message::join({message::sec(0x81), message::mac(kMac)})});
}

void expectNoHeader(LoadedVm *vm)
{
    EXPECT_EQ(qvs::ptPushHdlrInfo, nullptr);
    for (const char *native :
         {"qvomacp_GetParserContentType", "qvomacp_GetParserHeaderLen", "qvomacp_GetParserBodyLen",
          "qvomacp_GetParserMACLen", "qvomacp_GetParserSEC"}) {
        EXPECT_EQ(vm->call(native), Answer{.number = -1}) << native;
    }
    for (const char *native : {"qvomacp_GetParserMAC", "qvomacp_GetParserBody"}) {
        EXPECT_EQ(vm->call(native), Answer{}) << native;
    }
}

// Ends what a test began, and checks that nothing is left of it.
struct Session : LoadedVm {
    ~Session()
    {
        call("qvomacp_parser_del");
        EXPECT_EQ(ptCtx, nullptr);
        EXPECT_EQ(qvs::ptPushHdlrInfo, nullptr);
    }

    blocks::BlockCheck check;
};

TEST(Parser, StartsWithoutAResult)
{
    Session vm;
    EXPECT_EQ(ptCtx, nullptr);
    expectNoHeader(&vm);
}

TEST(Parser, ParsesAHeaderAlone)
{
    Session vm;
    EXPECT_EQ(vm.parse(signedPush(proxyDocument()), kHeaderOnly), kTrue);
    EXPECT_EQ(vm.number("qvomacp_GetParserContentType"), 54);
    EXPECT_EQ(ptCtx, nullptr);
    EXPECT_EQ(vm.number("qvomacp_GetPxLogicalCount"), 0);
}

TEST(Parser, AnswersWhatTheHeaderSays)
{
    Session vm;
    const Bytes body = {1, 2, 3, 0, 255};
    const Bytes pushed = message::join(
        {{0x01, 0x06, 0x2F, 0x1F, 0x2D, 0xB6, 0x91, 0x81, 0x92}, message::cString(kMac), body});
    ASSERT_EQ(vm.parse(pushed, kHeaderOnly), kTrue);
    EXPECT_EQ(vm.number("qvomacp_GetParserContentType"), 54);
    EXPECT_EQ(vm.number("qvomacp_GetParserHeaderLen"), 47);
    EXPECT_EQ(vm.number("qvomacp_GetParserBodyLen"), 5);
    EXPECT_EQ(vm.number("qvomacp_GetParserMACLen"), 40);
    EXPECT_EQ(vm.number("qvomacp_GetParserSEC"), 0x81);
    EXPECT_EQ(vm.call("qvomacp_GetParserMAC").bytes, Bytes(kMac.begin(), kMac.end()));
    EXPECT_EQ(vm.call("qvomacp_GetParserBody").bytes, body);
}

TEST(Parser, AnswersEmptyArraysForWhatIsNotThere)
{
    Session vm;
    ASSERT_EQ(vm.parse(message::push({}), kHeaderOnly), kTrue);
    EXPECT_EQ(vm.number("qvomacp_GetParserSEC"), 0);
    EXPECT_EQ(vm.number("qvomacp_GetParserMACLen"), 0);
    EXPECT_EQ(vm.number("qvomacp_GetParserBodyLen"), 0);
    EXPECT_EQ(vm.call("qvomacp_GetParserMAC").bytes, Bytes{});
    EXPECT_EQ(vm.call("qvomacp_GetParserBody").bytes, Bytes{});
}

TEST(Parser, ParsesAWholeMessageInEveryModeButOne)
{
    for (jint mode : {INT32_MIN, -1, 0, 2, INT32_MAX}) {
        Session vm;
        EXPECT_EQ(vm.parse(signedPush(proxyDocument()), mode), kTrue) << mode;
        EXPECT_NE(ptCtx, nullptr);
        EXPECT_EQ(vm.number("qvomacp_GetPxLogicalCount"), 1);
        EXPECT_EQ(vm.array("qvomacp_GetProxyData", {1})->at(0), "proxy");
        EXPECT_EQ(vm.text("qvomacp_GetPxDomainData", {1, 1}), "example.org");
        EXPECT_EQ(vm.number("qvomacp_GetParserContentType"), 54);
    }
}

TEST(Parser, DecodesTheBodyWhateverItsContentType)
{
    Session vm;
    ASSERT_EQ(vm.parse(message::push(napDocument(), {.contentType = {0xC4}})), kTrue);
    EXPECT_EQ(vm.number("qvomacp_GetParserContentType"), 68);
    EXPECT_EQ(vm.number("qvomacp_GetPxNapDefCount"), 1);
}

TEST(Parser, HandsTheBytesBackOnceTheHeaderIsParsed)
{
    const std::vector<std::string> expected = {"GetArrayLength", "GetByteArrayElements",
                                               "ReleaseByteArrayElements"};
    Session vm;
    EXPECT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    EXPECT_EQ(vm.calls(), expected);
    vm.call("qvomacp_parser_del");
    EXPECT_EQ(vm.parse(signedPush(brokenDocument())), kFalse);
    EXPECT_EQ(vm.calls(), expected);
    EXPECT_EQ(vm.parse(message::push({}, {.pduType = 0x07})), kFalse);
    EXPECT_EQ(vm.calls(), expected);
}

TEST(Parser, RefusesAMessageThatIsNoPush)
{
    Session vm;
    EXPECT_EQ(vm.parse(message::push(proxyDocument(), {.pduType = 0x07})), kFalse);
    expectNoHeader(&vm);
    EXPECT_EQ(ptCtx, nullptr);
}

TEST(Parser, RefusesNoMessageAndAnEmptyOne)
{
    Session vm;
    EXPECT_EQ(vm.parse(nullptr, 100, 0), kFalse);
    expectNoHeader(&vm);
    EXPECT_EQ(vm.parse(nullptr, 0, 0), kFalse);
    EXPECT_EQ(vm.parse(Bytes{}, 0), kFalse);
    expectNoHeader(&vm);
}

TEST(Parser, ForgetsTheHeaderWithARefusedMessage)
{
    const Bytes pushed = signedPush(proxyDocument());
    const std::vector<std::pair<const Bytes *, jlong>> refused = {
        {nullptr, 3}, {&pushed, static_cast<jlong>(pushed.size()) + 1}, {&pushed, 0}};
    for (const auto &[bytes, length] : refused) {
        Session vm;
        ASSERT_EQ(vm.parse(pushed, kHeaderOnly), kTrue);
        smlpushHdlrInfo *lost = qvs::ptPushHdlrInfo;
        EXPECT_EQ(vm.parse(bytes, length, kHeaderOnly), kFalse);
        expectNoHeader(&vm);
        qvs::releasePushHeader(lost);
    }
}

TEST(Parser, TakesTheLengthForTheMessage)
{
    Session vm;
    const Bytes body = {1, 2, 3, 4};
    const Bytes pushed = message::push(body);
    const jlong length = static_cast<jlong>(pushed.size());
    ASSERT_EQ(vm.parse(&pushed, length - 3, kHeaderOnly), kTrue);
    EXPECT_EQ(vm.call("qvomacp_GetParserBody").bytes, Bytes{1});
    vm.call("qvomacp_parser_del");
    ASSERT_EQ(vm.parse(&pushed, length - 4, kHeaderOnly), kTrue);
    EXPECT_EQ(vm.call("qvomacp_GetParserBody").bytes, Bytes{});
    vm.call("qvomacp_parser_del");
    EXPECT_EQ(vm.parse(&pushed, length - 5, kHeaderOnly), kFalse);
}

TEST(Parser, TakesTheLow32BitsOfTheLength)
{
    Session vm;
    const Bytes pushed = message::push({1, 2});
    const jlong length = static_cast<jlong>(pushed.size());
    for (jlong high : {jlong{0}, jlong{1} << 32, jlong{0x7FFFFFFF} << 32, jlong{-1} << 32}) {
        ASSERT_EQ(vm.parse(&pushed, high | length, kHeaderOnly), kTrue) << high;
        EXPECT_EQ(vm.number("qvomacp_GetParserBodyLen"), 2);
        vm.call("qvomacp_parser_del");
        EXPECT_EQ(vm.parse(&pushed, high, kHeaderOnly), kFalse) << high;
    }
}

TEST(Parser, RefusesALengthBeyondTheArray)
{
    Session vm;
    const Bytes pushed = signedPush(proxyDocument());
    const jlong length = static_cast<jlong>(pushed.size());
    for (jlong wrong :
         {length + 1, jlong{INT32_MAX}, jlong{0x80000000}, jlong{0xFFFFFFFF}, jlong{-1}, -length}) {
        EXPECT_EQ(vm.parse(&pushed, wrong, 0), kFalse) << wrong;
        expectNoHeader(&vm);
    }
}

TEST(Parser, ForgetsTheHeaderAndKeepsTheContextWhenTheBytesCannotBeHad)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    const qvsClientProvCtx *context = ptCtx;
    smlpushHdlrInfo *header = qvs::ptPushHdlrInfo;
    vm.failCall(0);
    EXPECT_EQ(vm.parse(signedPush(napDocument())), Answer{.exception = true});
    EXPECT_TRUE(vm.hasFailed());
    EXPECT_EQ(vm.calls(), (std::vector<std::string>{"GetArrayLength", "GetByteArrayElements"}));
    EXPECT_EQ(ptCtx, context);
    expectNoHeader(&vm);
    qvs::releasePushHeader(header);
}

TEST(Parser, ReleasesTheHeaderOfABodyThatCannotBeDecoded)
{
    Session vm;
    EXPECT_EQ(vm.parse(signedPush(brokenDocument())), kFalse);
    expectNoHeader(&vm);
    EXPECT_EQ(ptCtx, nullptr);
    blocks::BlockCheck check;
    EXPECT_EQ(vm.parse(message::push({})), kFalse);
    expectNoHeader(&vm);
}

TEST(Parser, DropsTheContextOfAnEarlierParseWithABodyThatCannotBeDecoded)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    qvsClientProvCtx *lostContext = ptCtx;
    smlpushHdlrInfo *lostHeader = qvs::ptPushHdlrInfo;
    EXPECT_EQ(vm.parse(signedPush(brokenDocument())), kFalse);
    EXPECT_EQ(ptCtx, nullptr);
    expectNoHeader(&vm);
    qvsClientProvCtxDelectContext(lostContext);
    qvs::releasePushHeader(lostHeader);
}

TEST(Parser, DeletesHarmlesslyTwiceAndWithNothingParsed)
{
    Session vm;
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(vm.call("qvomacp_parser_del"), Answer{});
        expectNoHeader(&vm);
    }
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(vm.call("qvomacp_parser_del"), Answer{});
        EXPECT_TRUE(vm.calls().empty());
        expectNoHeader(&vm);
        EXPECT_EQ(ptCtx, nullptr);
    }
}

TEST(Parser, ParsesAgainAfterADelete)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    vm.call("qvomacp_parser_del");
    ASSERT_EQ(vm.parse(signedPush(napDocument())), kTrue);
    EXPECT_EQ(vm.number("qvomacp_GetPxLogicalCount"), 0);
    EXPECT_EQ(vm.number("qvomacp_GetPxNapDefCount"), 1);
}

TEST(Parser, AnswersNullWithEveryCallThatFails)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument()), kHeaderOnly), kTrue);
    for (const char *native : {"qvomacp_GetParserMAC", "qvomacp_GetParserBody"}) {
        for (long n = 0; n < 2; ++n) {
            vm.failCall(n);
            EXPECT_EQ(vm.call(native), Answer{.exception = true}) << native;
            EXPECT_TRUE(vm.hasFailed());
        }
        vm.failCall(2);
        EXPECT_TRUE(vm.call(native).bytes);
        EXPECT_FALSE(vm.hasFailed());
    }
}

TEST(Parser, AnswersNullForABodyThatNoJavaArrayHolds)
{
    LoadedVm vm;
    smlpushHdlrInfo header{};
    qvs::ptPushHdlrInfo = &header;
    for (uint32_t length : {0x80000000u, 0xFFFFFFFFu}) {
        header.nBodyLen = length;
        EXPECT_EQ(vm.call("qvomacp_GetParserBody"), Answer{});
        EXPECT_TRUE(vm.calls().empty());
    }
    header.nBodyLen = INT32_MAX; // the longest that one holds, if there is memory for it
    vm.failCall(0);
    EXPECT_EQ(vm.call("qvomacp_GetParserBody"), Answer{.exception = true});
    EXPECT_TRUE(vm.hasFailed());
    qvs::ptPushHdlrInfo = nullptr;
}

TEST(Parser, TakesAMessageWholeOrRefusesItWithEveryAllocationFailing)
{
    LoadedVm vm;
    const Bytes pushed = signedPush(proxyDocument());
    for (jint mode : {0, kHeaderOnly}) {
        const auto session = [&] {
            const Answer parsed = vm.parse(pushed, mode);
            EXPECT_EQ(parsed.number, blocks::failAt < 0 ? 0 : 1);
            EXPECT_EQ(qvs::ptPushHdlrInfo != nullptr, parsed.number == 1);
            EXPECT_EQ(parsed.number == 1 && mode != kHeaderOnly, ptCtx != nullptr);
            vm.call("qvomacp_parser_del");
        };
        EXPECT_GE(blocks::failEach(session), 2);
        EXPECT_GE(blocks::failEachFrom(session), 2);
    }
    EXPECT_EQ(vm.parse(pushed), kTrue);
    vm.call("qvomacp_parser_del");
}

TEST(Parser, TakesAMessageWholeOrRefusesItWhileBlocksAreTracked)
{
    LoadedVm vm;
    Body body;
    body.characteristic(message::kNapDef, [&] {
        body.parm(message::kNapAddrType, message::token(0x89));
        body.parm(message::kBearer, message::Value("GSM") + message::token(0x9A));
    });
    const Bytes pushed = message::push(message::document(body));
    qvsMemStartMemCheck();
    const auto session = [&] {
        const Answer parsed = vm.parse(pushed);
        EXPECT_EQ(parsed.number, blocks::failAt < 0 ? 0 : 1);
        vm.call("qvomacp_parser_del");
    };
    EXPECT_GE(blocks::failEach(session), 10);
    qvsMemEndMemCheck();
}

TEST(Kept, parse_overwrites)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    qvsClientProvCtx *lostContext = ptCtx;
    smlpushHdlrInfo *lostHeader = qvs::ptPushHdlrInfo;
    ASSERT_EQ(vm.parse(message::push(napDocument())), kTrue);
    EXPECT_NE(ptCtx, lostContext);
    EXPECT_NE(qvs::ptPushHdlrInfo, lostHeader);
    EXPECT_STREQ(lostContext->ptPxLogical->pszProxyId, "proxy");
    EXPECT_STREQ(lostHeader->szMac, kMac.c_str());
    qvsClientProvCtxDelectContext(lostContext);
    qvs::releasePushHeader(lostHeader);
}

TEST(Kept, parse_keeps_context)
{
    Session vm;
    ASSERT_EQ(vm.parse(signedPush(proxyDocument())), kTrue);
    const qvsClientProvCtx *context = ptCtx;
    smlpushHdlrInfo *lostHeader = qvs::ptPushHdlrInfo;
    ASSERT_EQ(vm.parse(message::push(napDocument()), kHeaderOnly), kTrue);
    qvs::releasePushHeader(lostHeader);
    EXPECT_EQ(ptCtx, context);
    lostHeader = qvs::ptPushHdlrInfo;
    EXPECT_EQ(vm.parse(message::push(napDocument(), {.pduType = 0x07})), kFalse);
    qvs::releasePushHeader(lostHeader);
    expectNoHeader(&vm);
    EXPECT_EQ(ptCtx, context);
    EXPECT_EQ(vm.array("qvomacp_GetProxyData", {1})->at(0), "proxy");
}

} // namespace
