// The decoder's entry: WBXML header, document type, and the way from bytes to a context.
#include "blocks.h"
#include "decoding.h"
#include "message.h"
#include "qvspushhandler.h"
#include "traces.h"

#include <cstring>
#include <fstream>
#include <iterator>
#include <set>
#include <string>

using decoding::Bytes;
using decoding::Decoder;

namespace {

constexpr char kType[] = "-//WAPFORUM//DTD PROV 1.0//EN";

class Header : public blocks::BlockTest {};
class Decode : public blocks::BlockTest {};
class DecoderMain : public blocks::BlockTest {};

struct HeaderItems {
    qvsResult result = 0;
    uint8_t version = 0;
    uint32_t publicId = 0;
    uint32_t charset = 0;
};

HeaderItems readHeader(qvsWbxmlDecoder *decoder)
{
    HeaderItems items;
    items.result = qvsClientProvWbxmlDecoderWbxmlHeader(decoder, &items.version, &items.publicId,
                                                        &items.charset);
    return items;
}

// The result of a whole decode of `bytes`.
qvsResult decode(const Bytes &bytes)
{
    Decoder decoder(bytes);
    qvsWapDoc *document = nullptr;
    const qvsResult result = qvsClientProvWbxmlDecoder(decoder, &document);
    EXPECT_TRUE(result == QVS_OK || !document);
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
    return result;
}

// A header whose document type is given by the string table `table`, and an empty document.
Bytes typedByTable(const std::string &table, uint8_t index = 0)
{
    Bytes bytes = {0x03, 0x00, index, 0x6A, static_cast<uint8_t>(table.size())};
    bytes.insert(bytes.end(), table.begin(), table.end());
    bytes.insert(bytes.end(), {0x45, 0x01});
    return bytes;
}

qvsClientProvCtx *decodeMain(const Bytes &bytes)
{
    return qvsClinetProvWbxmlDecoderMain(bytes.data(), static_cast<uint32_t>(bytes.size()));
}

} // namespace

TEST_F(Header, ReadsItsItemsInOrder)
{
    Decoder decoder({0x02, 0x0B, 0x6A, 0x02, 'a', 'b', 0x45});
    const HeaderItems items = readHeader(decoder);
    EXPECT_EQ(items.result, QVS_OK);
    EXPECT_EQ(items.version, 2);
    EXPECT_EQ(items.publicId, 11U);
    EXPECT_EQ(items.charset, 0x6AU);
    EXPECT_EQ(decoder->nStrSize, 2U);
    EXPECT_STREQ(decoder->pStringTable, "ab");
    EXPECT_EQ(decoder.position(), 6U);
}

TEST_F(Header, ReadsAnIndexBehindPublicIdentifierZeroAlone)
{
    Decoder decoder({0x03, 0x00, 0x85, 0x05, 0x6A, 0x00});
    const HeaderItems items = readHeader(decoder);
    EXPECT_EQ(items.result, QVS_OK);
    EXPECT_EQ(items.publicId, 0U);
    EXPECT_EQ(items.charset, 0x6AU);
    EXPECT_EQ(decoder->nStrSize, 0U);
    ASSERT_NE(decoder->pStringTable, nullptr);
    EXPECT_EQ(decoder->pStringTable[0], 0);
    EXPECT_EQ(decoder->pStringTable[1], 0);
}

TEST_F(Header, EndsWhereAnItemCannotBeRead)
{
    const struct {
        Bytes bytes;
        qvsResult result;
        uint32_t publicId;
    } cases[] = {
        {{}, 4103, 0},
        {{0x03}, 4101, 0},
        {{0x03, 0x80, 0x80, 0x80, 0x80, 0x80}, 4101, 0},
        {{0x03, 0x00}, 4101, 0},
        {{0x03, 0x00, 0x00}, 4101, 0},
        {{0x03, 0x0B}, 4101, 11},
    };
    for (const auto &cut : cases) {
        Decoder decoder(cut.bytes);
        const HeaderItems items = readHeader(decoder);
        EXPECT_EQ(items.result, cut.result);
        EXPECT_EQ(items.publicId, cut.publicId);
        EXPECT_EQ(decoder->pStringTable, nullptr);
        EXPECT_EQ(decoder->nStrSize, 0U);
    }
}

TEST(Kept, table_failure_ignored)
{
    blocks::BlockCheck check;
    Decoder missing({0x03, 0x0B, 0x6A});
    EXPECT_EQ(readHeader(missing).result, QVS_OK);
    EXPECT_EQ(missing->nStrSize, 0xFFFFFFFFU);
    EXPECT_EQ(missing->pStringTable, nullptr);
    Decoder cut({0x03, 0x0B, 0x6A, 0x05, 'a'});
    EXPECT_EQ(readHeader(cut).result, QVS_OK);
    EXPECT_EQ(cut->nStrSize, 0xFFFFFFFFU);
    EXPECT_STREQ(cut->pStringTable, "a");
}

TEST_F(Decode, RefusesNothingToDecode)
{
    Traces traces;
    qvsWapDoc *document = nullptr;
    EXPECT_EQ(qvsClientProvWbxmlDecoder(nullptr, &document), 2U);
    EXPECT_EQ(traces.texts, std::vector<std::string>{"[Syncml] ERROR : 2\n"});
    qvsWbxmlDecoder noBuffer = {};
    EXPECT_EQ(qvsClientProvWbxmlDecoder(&noBuffer, &document), 2U);
    EXPECT_EQ(decode({}), 2U);
    EXPECT_EQ(document, nullptr);
}

TEST_F(Decode, AcceptsPublicIdentifierElevenWithAnyTable)
{
    EXPECT_EQ(decode({0x03, 0x0B, 0x6A, 0x00, 0x45, 0x01}), QVS_OK);
    EXPECT_EQ(decode({0xFF, 0x0B, 0x03, 0x02, 'a', 'b', 0x45, 0x01}), QVS_OK);
}

TEST_F(Decode, RefusesAnotherPublicIdentifierWhateverTheTableNames)
{
    Traces traces;
    Bytes bytes = {0x03, 0x01, 0x6A, sizeof(kType)};
    bytes.insert(bytes.end(), kType, kType + sizeof(kType));
    bytes.insert(bytes.end(), {0x45, 0x01});
    EXPECT_EQ(decode(bytes), 4107U);
    EXPECT_TRUE(traces.has("ERROR : qvsClientProvWbxmlDecoder Difference Ver!!\n\n"));
    EXPECT_TRUE(traces.has("[Syncml] ERROR : DM = fffff00b\n")) << "4107 less 8192";
}

TEST_F(Decode, ComparesATypeGivenByTextExactly)
{
    const std::string type = kType;
    EXPECT_EQ(decode(typedByTable(type + '\0')), QVS_OK);
    EXPECT_EQ(decode(typedByTable(type)), QVS_OK) << "the table's own terminator will do";
    EXPECT_EQ(decode(typedByTable(type + '\0' + "more")), QVS_OK);
    EXPECT_EQ(decode(typedByTable("-//wapforum//dtd prov 1.0//en" + std::string(1, '\0'))), 4107U);
    EXPECT_EQ(decode(typedByTable(type + "x" + '\0')), 4107U);
    EXPECT_EQ(decode(typedByTable(type.substr(1))), 4107U);
    EXPECT_EQ(decode(typedByTable("")), 4107U);
}

TEST(Kept, public_id_index)
{
    EXPECT_EQ(decode(typedByTable(std::string("x\0", 2) + kType, 2)), 4107U);
    EXPECT_EQ(decode(typedByTable(kType, 77)), QVS_OK);
}

TEST(Kept, header_ignored)
{
    // Only a version byte: public identifier 0 and no table to compare.
    EXPECT_EQ(decode({0x03}), 4107U);
    // The charset is missing, the document type is known: the body is empty.
    EXPECT_EQ(decode({0x03, 0x0B}), 4103U);
    // The charset does not end; what follows it is taken for the body.
    EXPECT_EQ(decode({0x03, 0x0B, 0x80, 0x80, 0x80, 0x80, 0x80, 0x45, 0x01}), QVS_OK);
}

TEST_F(Decode, NeedsTheTypeToBeReadBeforeTheTableIsCutOff)
{
    Bytes bytes = typedByTable(std::string(kType) + '\0');
    bytes.resize(5 + 10);
    EXPECT_EQ(decode(bytes), 4107U);
}

TEST_F(DecoderMain, MakesAContextAndReleasesAllElse)
{
    message::Body body;
    body.characteristic(message::kNapDef, [&] { body.parm(message::kNapId, "n1"); });
    Traces traces;
    qvsClientProvCtx *context = decodeMain(message::document(body));
    ASSERT_NE(context, nullptr);
    ASSERT_NE(context->ptNapDef, nullptr);
    EXPECT_STREQ(context->ptNapDef->pszNapId, "n1");
    EXPECT_TRUE(traces.has("Success\n"));
    for (const std::string &text : traces.texts) {
        EXPECT_NE(text.rfind("ERROR", 0), 0U) << text;
    }
    qvsClientProvCtxDelectContext(context);
}

TEST_F(DecoderMain, AnswersNullWithItsStepTraced)
{
    {
        Traces traces;
        EXPECT_EQ(qvsClinetProvWbxmlDecoderMain(nullptr, 5), nullptr);
        EXPECT_TRUE(traces.has("ERROR : qvsClinetProvWbxmlDecoderMain "
                               "qvsClientProvWbxmlInitDecoder[0x2]\n\n"));
    }
    {
        Traces traces;
        EXPECT_EQ(decodeMain({0x03, 0x0B, 0x6A, 0x00, 0x45, 0x47}), nullptr);
        EXPECT_TRUE(traces.has(
            "ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvWbxmlDecoder[0x1005]\n\n"))
            << "a parm outside a characteristic";
        EXPECT_FALSE(traces.has(
            "ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvCtxMakeContext[0x0]\n\n"))
            << "of what was not decoded no context is tried";
    }
    {
        // A document without a list of characteristics makes no context.
        Traces traces;
        EXPECT_EQ(decodeMain({0x03, 0x0B, 0x6A, 0x00, 0x45, 0x01}), nullptr);
        EXPECT_TRUE(traces.has(
            "ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvCtxMakeContext[0x0]\n\n"));
    }
    EXPECT_EQ(decodeMain({0x03, 0x0B, 0x6A, 0x00, 0x01}), nullptr) << "no document at all";
    static const uint8_t byte = 3;
    EXPECT_EQ(qvsClinetProvWbxmlDecoderMain(&byte, 0), nullptr);
}

// A context that was not made is released all the same, which is traced as a failure of its own.
TEST_F(DecoderMain, EndsItsTracesWithTheReleaseOfNoContext)
{
    const Bytes refused[] = {
        {0x03, 0x0B, 0x6A, 0x00, 0x45, 0x47}, // not decoded
        {0x03, 0x0B, 0x6A, 0x00, 0x45, 0x01}, // without a context
    };
    for (const Bytes &bytes : refused) {
        Traces traces;
        EXPECT_EQ(decodeMain(bytes), nullptr);
        EXPECT_EQ(traces.texts.back(), "[Syncml] ERROR : 2\n");
        EXPECT_NE(*(traces.texts.end() - 2), traces.texts.back());
    }
    message::Body body;
    body.characteristic(message::kNapDef, [&] { body.parm(message::kNapId, "n1"); });
    Traces traces;
    qvsClientProvCtx *context = decodeMain(message::document(body));
    EXPECT_EQ(traces.texts.back(), "Success\n");
    ASSERT_NE(context, nullptr);
    EXPECT_STREQ(context->ptNapDef->pszNapId, "n1");
    qvsClientProvCtxDelectContext(context);
}

TEST_F(DecoderMain, AsksForItsBlocksUnderTheSourceOfEach)
{
    message::Body body;
    body.characteristic(message::kNapDef, [&] { body.parm(message::kNapId, "n1"); });
    const Bytes bytes = message::document(body);
    testing::internal::CaptureStdout();
    qvsMemStartMemCheck();
    qvsClientProvCtx *context = decodeMain(bytes);
    qvsMemEndMemCheck();
    const std::string report = testing::internal::GetCapturedStdout();
    qvsClientProvCtxDelectContext(context);
    // The context, its NAPDEF and the copy of a text.
    const auto blocksOf = [&](const std::string &module) {
        const std::string line = "Filename:jni/src/ClientProv/" + module + " ";
        size_t count = 0;
        for (size_t at = report.find(line); at != std::string::npos;
             at = report.find(line, at + 1)) {
            ++count;
        }
        return count;
    };
    EXPECT_EQ(blocksOf("qvsClientProvCtx"), 3U) << report;
    EXPECT_NE(report.find(" Size:2 "), std::string::npos) << report;
    EXPECT_EQ(blocksOf("qvsClientProvWbxmlDecoder"), 0U) << report;
    EXPECT_EQ(blocksOf("qvslist"), 0U) << report;
    EXPECT_EQ(report.find("Not Found"), std::string::npos) << report;
}

TEST_F(DecoderMain, LeavesTheBytesAloneAndKeepsNoPointerIntoThem)
{
    message::Body body;
    body.characteristic(message::kNapDef, [&] { body.parm(message::kNapId, "n1"); });
    const Bytes original = message::document(body);
    Bytes bytes = original;
    qvsClientProvCtx *context = decodeMain(bytes);
    ASSERT_NE(context, nullptr);
    EXPECT_EQ(bytes, original);
    bytes.assign(bytes.size(), 0xEE);
    EXPECT_STREQ(context->ptNapDef->pszNapId, "n1");
    qvsClientProvCtxDelectContext(context);
}

// A reader of modified UTF-8 may look at four bytes behind the terminator of a cut sequence.
TEST_F(DecoderMain, EndsEveryTextOfTheContextWithSpareZeros)
{
    const message::Value texts[] = {
        "plain",
        message::Value("two") + "pieces",
        message::token(0x85),
        message::Value("hidden") + message::token(0x94), // a call type joins behind the terminator
        message::opaque({'c', 'u', 't', 0, 'h', 'i', 'd', 'd', 'e', 'n'}),
        message::token(0xF0), // no text of its own: the token alone
    };
    for (const message::Value &text : texts) {
        message::Body body;
        body.characteristic(message::kNapDef, [&] {
            body.parm(message::kNapAddress, text).parm(message::kBearer, text);
        });
        blocks::dirty = true;
        qvsClientProvCtx *context = decodeMain(message::document(body));
        blocks::dirty = false;
        ASSERT_NE(context, nullptr);
        for (const char *shown :
             {context->ptNapDef->pszNapAddress, context->ptNapDef->ptBearer->pszValue}) {
            EXPECT_EQ(std::string(shown + std::strlen(shown), 5), std::string(5, '\0')) << shown;
        }
        qvsClientProvCtxDelectContext(context);
    }
}

// Proxies with characteristics and lists in them, so many that their tree takes blocks.
Bytes manyProxies()
{
    message::Body body;
    for (int i = 0; i < 20; ++i) {
        body.characteristic(message::kPxLogical, [&] {
            body.parm(message::kProxyId, "p1").parm(message::kDomain, "d1");
            body.parm(message::kDomain, message::token(0x9A)).parm(message::kStartPage, "s1");
            body.characteristic(message::kPort, [&] { body.parm(message::kPortNbr, "80"); });
            body.characteristic(message::kPort, [&] { body.parm(message::kPortNbr, "81"); });
        });
    }
    return message::document(body);
}

// A context, or none when an allocation failed.
void decodeWhole(const Bytes &bytes)
{
    qvsClientProvCtx *context = decodeMain(bytes);
    EXPECT_EQ(context == nullptr, blocks::failAt < 0);
    qvsClientProvCtxDelectContext(context);
}

TEST_F(DecoderMain, MakesNoSmallerContextWhenAnAllocationFails)
{
    const Bytes bytes = manyProxies();
    const auto attempt = [&] { decodeWhole(bytes); };
    EXPECT_GT(blocks::failEach(attempt), 200);
    EXPECT_GT(blocks::failEachFrom(attempt), 200);
}

TEST_F(DecoderMain, MakesNoSmallerContextWhileBlocksAreTracked)
{
    const Bytes bytes = manyProxies();
    qvsMemStartMemCheck();
    EXPECT_GT(blocks::failEach([&] { decodeWhole(bytes); }), 300);
    qvsMemEndMemCheck();
}

TEST_F(DecoderMain, TracesTheContextThatItDidNotKeepAsNone)
{
    const Bytes bytes = manyProxies();
    const Traces traces;
    blocks::failAt = 10; // of the tree: the table, records and texts of its start
    EXPECT_EQ(decodeMain(bytes), nullptr);
    EXPECT_FALSE(traces.has("Success\n"));
}

// The body of a message in which every characteristic and parameter is.
Bytes everything()
{
    std::ifstream file(OMACP_SAMPLES_DIR "/everything.push", std::ios::binary);
    const Bytes message(std::istreambuf_iterator<char>(file), {});
    smlpushHdlrInfo *header =
        smlpushHdlrParsingWSPHeader(message.data(), static_cast<uint32_t>(message.size()));
    if (!header) {
        ADD_FAILURE();
        return {};
    }
    const Bytes body(header->pBody, header->pBody + header->nBodyLen);
    qvs::releasePushHeader(header);
    return body;
}

// The bytes in a block that ends where they do.
struct FencedBytes {
    explicit FencedBytes(const Bytes &bytes) : size(static_cast<uint32_t>(bytes.size()))
    {
        const blocks::Fence fence;
        const uint32_t front = (8 - size % 8) % 8; // its end is that of an aligned block
        block = static_cast<uint8_t *>(qvsMemAlloc_debug(front + size, "test", __LINE__));
        data = block + front;
        std::memcpy(data, bytes.data(), size);
    }
    FencedBytes(const FencedBytes &) = delete;
    FencedBytes &operator=(const FencedBytes &) = delete;
    ~FencedBytes() { qvsMemFree_debug(block); }

    uint8_t *block;
    uint8_t *data;
    uint32_t size;
};

// Releases what a message leaves allocated on purpose, such as the first of two texts.
struct Rest {
    Rest() = default;
    Rest(const Rest &) = delete;
    Rest &operator=(const Rest &) = delete;
    ~Rest()
    {
        for (void *block : blocks::all()) {
            if (!before.count(block)) {
                qvsMemFree_debug(block);
            }
        }
    }

    std::set<void *> before = blocks::all();
};

// How many blocks are left of a body when its context is released.
template <class Fill>
size_t leftOf(const Fill &fill)
{
    const Rest rest;
    const size_t before = blocks::live();
    message::Body body;
    fill(&body);
    qvsClientProvCtx *context = decodeMain(message::document(body));
    EXPECT_NE(context, nullptr);
    qvsClientProvCtxDelectContext(context);
    return blocks::live() - before;
}

TEST_F(DecoderMain, LeavesWhatTheReleasesOfTreeAndContextLeave)
{
    using message::Body;
    using message::Value;
    const auto ofApplication = [](const char *name) {
        return leftOf([name](Body *body) {
            body->characteristic(message::kApplication, [&] { body->parm(Value(name), "v"); });
        });
    };
    for (const char *name : {"XCAP_AUID_DCS", "XCAP_AUID_PMS", "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER",
                             "XCAP_TID_HEADER"}) {
        EXPECT_EQ(ofApplication(name), 2U) << name << ": the text and its copy";
    }
    EXPECT_EQ(ofApplication("FROM"), 2U) << "the text and its first copy";
    EXPECT_EQ(ofApplication("OTHER"), 0U);
    EXPECT_EQ(leftOf([](Body *body) {
                  body->characteristic(message::kApplication, [&] {
                      body->characteristic(Value("ROAMING"),
                                           [&] { body->parm(Value("SYNC-ALLOWED"), "v"); });
                  });
              }),
              4U)
        << "two records and their texts";
    EXPECT_EQ(leftOf([](Body *body) {
                  body->characteristic(message::kVendorConfig, [&] {
                      body->parm(message::kName, "v").parm(Value("ANY"), "v");
                  });
              }),
              2U)
        << "name and value";
    EXPECT_EQ(leftOf([](Body *body) {
                  body->characteristic(message::kNapDef, [&] { body->parm(Value("INIT")); });
              }),
              1U)
        << "the copy";
    EXPECT_EQ(leftOf([](Body *body) {
                  body->characteristic(Value("WI-FI"), [&] { body->parm(Value("NETSSID"), "v"); });
              }),
              2U)
        << "the record and its text";
}

TEST_F(DecoderMain, TouchesNoByteOutsideOfItsBlocks)
{
    const Rest rest;
    const FencedBytes bytes(everything());
    const blocks::Fence fence;
    qvsClientProvCtx *context = qvsClinetProvWbxmlDecoderMain(bytes.data, bytes.size);
    EXPECT_NE(context, nullptr);
    qvsClientProvCtxDelectContext(context);

    // The same with records and lists that are blocks.
    qvsWbxmlDecoder *decoder = nullptr;
    ASSERT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, bytes.data, bytes.size), QVS_OK);
    qvsWapDoc *document = nullptr;
    EXPECT_EQ(qvsClientProvWbxmlDecoder(decoder, &document), QVS_OK);
    qvsClientProvWbxmlDeleteDecoder(decoder);
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1U);
}

TEST_F(DecoderMain, ReadsNoByteBehindAMessageCutAnywhere)
{
    for (Bytes bytes = everything(); !bytes.empty(); bytes.pop_back()) {
        const Rest rest;
        const FencedBytes cut(bytes);
        qvsClientProvCtxDelectContext(qvsClinetProvWbxmlDecoderMain(cut.data, cut.size));
    }
}

TEST_F(DecoderMain, LeavesNoBlockOfAMessageCutAnywhere)
{
    Bytes bytes = manyProxies();
    for (; !bytes.empty(); bytes.pop_back()) {
        SCOPED_TRACE(bytes.size());
        blocks::BlockCheck check;
        qvsClientProvCtxDelectContext(decodeMain(bytes));
    }
}

TEST_F(DecoderMain, TakesBlocksForRecordsAndTextsAlone)
{
    message::Body body;
    body.characteristic(message::kNapDef, [&] {
        body.parm(message::kNapId, "n").parm(message::kBearer, "b1").parm(message::kBearer, "b2");
    });
    const Bytes bytes = message::document(body);
    blocks::startCounting();
    qvsClientProvCtx *context = decodeMain(bytes);
    // The string table; a record of the tree and its three texts; context, record and the nodes of
    // its bearers.
    EXPECT_EQ(blocks::allocations(), 1U + 4U + 4U);
    qvsClientProvCtxDelectContext(context);
}
