// Decodes by the exported functions, step by step, with an allocation that fails: each in turn.
// Their trees are made of blocks, where those of sessions share them.
#include "choice.h"
#include "documents.h"
#include "losses.h"
#include "session.h"

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"
#include "qvspushhandler.h"

#include "fuzz/generate.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace sweep {

namespace {

// The body of a pushed message; empty without one.
Bytes bodyOf(const Bytes &message)
{
    Losses losses;
    const smlpushHdlrInfo *info =
        smlpushHdlrParsingWSPHeader(message.data(), static_cast<uint32_t>(message.size()));
    const Bytes body = info ? Bytes(info->pBody, info->pBody + info->nBodyLen) : Bytes();
    losses.count();
    return body;
}

// A decoder over bytes; without memory it is null.
struct Decoder {
    explicit Decoder(const Bytes &bytes)
    {
        (void)qvsClientProvWbxmlInitDecoder(&decoder, bytes.data(),
                                            static_cast<uint32_t>(bytes.size()));
    }
    Decoder(const Decoder &) = delete;
    Decoder &operator=(const Decoder &) = delete;
    ~Decoder() { qvsClientProvWbxmlDeleteDecoder(decoder); }

    qvsWbxmlDecoder *decoder = nullptr;
};

// The functions here answer how many blocks stay allocated by design of a context: an allocation
// that fails may bring to light what another record would have hidden.

// From a body to a context, and all let go of.
size_t decode(const Bytes &body)
{
    qvsWapDoc *document = nullptr;
    {
        Decoder decoder(body);
        if (decoder.decoder && !decoder.decoder->ptBuffer) {
            char *text = nullptr;
            EXPECT_NE(qvsClientProvWbxmlDecoderParamString(decoder.decoder, &text, 0x07), QVS_OK);
            EXPECT_EQ(text, nullptr);
        }
        const qvsResult result = qvsClientProvWbxmlDecoder(decoder.decoder, &document);
        EXPECT_TRUE(result == QVS_OK || !document);
    }
    qvsClientProvCtx *context = qvsClientProvCtxMakeContext(document);
    qvsClientProvWbxmlDeleteWapDoc(document);
    const size_t kept = context ? keptBy(context) : 0;
    qvsClientProvCtxDelectContext(context);
    return kept;
}

// The attributes of the first characteristic, read on their own.
size_t readAttributes(const Bytes &body)
{
    const auto start = std::find(body.begin(), body.end(), 0xC6);
    if (start == body.end()) {
        return 0;
    }
    const Decoder decoder(Bytes(start + 1, body.end()));
    auto *node = static_cast<qvsWapCharacter *>(
        qvsMemAllocSetZero_debug(sizeof(qvsWapCharacter), "steps", 1));
    if (!decoder.decoder || !decoder.decoder->ptBuffer || !node) {
        qvsMemFree_debug(node);
        return 0;
    }
    uint8_t attrId = 0;
    uint8_t codePage = 0;
    char *name = nullptr;
    (void)qvsClientProvWbxmlDecoderCharacterAttribute(decoder.decoder, node, &attrId, &codePage,
                                                      &name);
    qvsMemFree_debug(name); // which is handed out on failure too
    qvsClientProvWbxmlDeleteCharacter(node);
    return 0;
}

// All of the body as a text.
size_t readText(const Bytes &body)
{
    const Decoder decoder(body);
    char *text = nullptr;
    if (decoder.decoder) {
        (void)qvsClientProvWbxmlDecoderGetStr(decoder.decoder, &text);
    }
    qvsMemFree_debug(text);
    return 0;
}

using Steps = size_t (*)(const Bytes &body);

// With an allocation failing, once or from then on, no more is lost than without. Returns how many
// failures were tried.
size_t sweepSteps(const Document &document, Steps steps, fuzz::Random *random, size_t parts)
{
    SCOPED_TRACE(document.name);
    const Bytes body = bodyOf(document.message);
    Losses losses;
    blocks::startCounting();
    const size_t kept = steps(body);
    const size_t allocations = blocks::allocations();
    const size_t lost = losses.count();
    size_t tried = 0;
    for (const bool fromThenOn : {false, true}) {
        for (size_t n = random->below(parts); n < allocations; n += parts) {
            SCOPED_TRACE(testing::Message()
                         << (fromThenOn ? "from" : "only") << " allocation " << n << " fails");
            blocks::failFromThenOn = fromThenOn;
            blocks::failAt = static_cast<long>(n);
            const size_t keptNow = steps(body);
            EXPECT_LT(blocks::failAt, 0) << "there was no such allocation";
            blocks::reset();
            blocks::failFromThenOn = false;
            EXPECT_LE(losses.count(), lost + std::max(keptNow, kept) - kept);
            ++tried;
            if (testing::Test::HasFailure()) {
                return tried;
            }
        }
    }
    return tried;
}

void sweepAll(Steps steps)
{
    const Choice chosen = choice();
    fuzz::Random random(chosen.seed);
    size_t tried = 0;
    for (const Document &document : files()) {
        tried += sweepSteps(document, steps, &random, chosen.parts);
        if (testing::Test::HasFailure()) {
            return;
        }
    }
    EXPECT_GT(tried, 0U);
    printf("%zu failures\n", tried);
}

TEST(Steps, OfADecode)
{
    sweepAll(decode);
}

TEST(Steps, OfAttributes)
{
    sweepAll(readAttributes);
}

TEST(Steps, OfAText)
{
    sweepAll(readText);
}

} // namespace

} // namespace sweep
