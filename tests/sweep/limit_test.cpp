// The limit of the texts that one message may be decoded to, 8 MiB and 100 times its length, at
// both its edges: whole documents that stay just below it, and one step beyond.
#include "losses.h"

#include "support/blocks.h"
#include "support/message.h"

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxmlDecoder.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>

namespace {

using message::Body;
using message::Bytes;

constexpr uint64_t kAlways = 8 * 1024 * 1024;
constexpr uint64_t kPerByte = 100;
constexpr size_t kEntry = 1024; // bytes of the text that is referred to

// A document and how much text it is decoded to.
struct Document {
    Bytes body;
    uint64_t text;

    bool isWithin() const { return text <= kAlways || text <= kPerByte * body.size(); }
};

// Content inside one PXLOGICAL, behind a table with one long text and `unused` bytes behind it.
Bytes documentOf(const Bytes &content, size_t unused)
{
    const std::string table = std::string(kEntry, 't') + '\0' + std::string(unused, 'u') + '\0';
    Body body;
    body.characteristic(message::kPxLogical, [&] { body.bytes(content); });
    return message::document(body, {.table = table});
}

// `count` parms that refer to the text.
Document references(size_t count, size_t unused)
{
    Body parms;
    for (size_t i = 0; i < count; ++i) {
        parms.parm(message::kDomain, message::tableString(0));
    }
    return {documentOf(parms.data(), unused), uint64_t{kEntry} * count};
}

// One parm whose value is `count` references, one behind the other.
Document joinedReferences(size_t count, size_t unused)
{
    Bytes value;
    for (size_t i = 0; i < count; ++i) {
        value.insert(value.end(), {message::kStrT, 0});
    }
    Body parm;
    parm.parm(message::kDomain, message::Value(value));
    return {documentOf(parm.data(), unused), uint64_t{kEntry} * count};
}

// One parm with `count` values of a byte, each continuing the text of the one before it.
Document pairs(size_t count, size_t unused)
{
    Body parm;
    parm.parm([&] {
        for (size_t i = 0; i < count; ++i) {
            parm.bytes({message::kDomain, message::kValue, message::kOpaque, 1, 't'});
        }
    });
    return {documentOf(parm.data(), unused), uint64_t{count} * (count + 1) / 2};
}

// The same without a text that is kept: each value is skipped.
Document skipped(size_t count, size_t unused)
{
    Body parms;
    for (size_t i = 0; i < count; ++i) {
        parms.parm(message::kName, message::token(0x40) + message::tableString(0));
    }
    return {documentOf(parms.data(), unused), uint64_t{kEntry} * count};
}

qvsResult resultOf(const Bytes &body)
{
    qvsWbxmlDecoder *decoder = nullptr;
    qvsWapDoc *document = nullptr;
    EXPECT_EQ(
        qvsClientProvWbxmlInitDecoder(&decoder, body.data(), static_cast<uint32_t>(body.size())),
        QVS_OK);
    const qvsResult result = qvsClientProvWbxmlDecoder(decoder, &document);
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
    return result;
}

qvsClientProvCtx *contextOf(const Bytes &body)
{
    return qvsClinetProvWbxmlDecoderMain(body.data(), static_cast<uint32_t>(body.size()));
}

// The bytes of the texts of a list; all of them must be the one letter.
uint64_t textOf(const qvsCtxStrNode *list)
{
    uint64_t total = 0;
    for (; list; list = list->ptNext) {
        EXPECT_EQ(strspn(list->pszValue, "t"), strlen(list->pszValue));
        total += strlen(list->pszValue);
    }
    return total;
}

// Finds the largest document of its kind that is within the limit, and holds both sides of it to
// what they must give. `kept`: whether the text of the document is that of its list.
template <class Make>
void expectEdge(Make make, size_t unused, bool kept)
{
    blocks::BlockCheck check;
    size_t within = 1;
    size_t beyond = 2048;
    ASSERT_TRUE(make(within, unused).isWithin());
    while (make(beyond, unused).isWithin()) {
        beyond *= 2;
    }
    while (beyond - within > 1) {
        const size_t middle = within + (beyond - within) / 2;
        (make(middle, unused).isWithin() ? within : beyond) = middle;
    }
    const Document last = make(within, unused);
    EXPECT_EQ(resultOf(last.body), QVS_OK) << within;
    qvsClientProvCtx *context = contextOf(last.body);
    ASSERT_NE(context, nullptr);
    EXPECT_EQ(textOf(context->ptPxLogical->ptDomain), kept ? last.text : 0);
    qvsClientProvCtxDelectContext(context);
    const Document first = make(beyond, unused);
    EXPECT_EQ(resultOf(first.body), QVS_ERROR_NO_MEMORY) << beyond;
    EXPECT_EQ(contextOf(first.body), nullptr);
}

// Without unused bytes in the table 8 MiB is what counts, with them it is the length.
constexpr size_t kUnused[] = {0, 100000};

TEST(TextLimit, EndsADocumentOfReferences)
{
    for (const size_t unused : kUnused) {
        expectEdge(references, unused, true);
    }
}

TEST(TextLimit, EndsAValueOfReferences)
{
    for (const size_t unused : kUnused) {
        expectEdge(joinedReferences, unused, true);
    }
}

TEST(TextLimit, EndsAListWhoseTextsContinueEachOther)
{
    for (const size_t unused : kUnused) {
        expectEdge(pairs, unused, true);
    }
}

TEST(TextLimit, EndsADocumentOfSkippedReferences)
{
    for (const size_t unused : kUnused) {
        expectEdge(skipped, unused, false);
    }
}

// What stays allocated of one parm again and again is bounded by the limit, which for a short
// message is 8 MiB whatever its length.
TEST(TextLimit, BoundsWhatAShortMessageLeaves)
{
    // The document and the context leave each of these.
    const std::string names[] = {"FROM",           "XCAP_AUID_DCS",    "XCAP_AUID_PMS",
                                 "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER", "XCAP_TID_HEADER"};
    std::string table;
    for (const std::string &name : names) {
        table += name + '\0';
    }
    constexpr size_t kText = 8500;
    const auto text = static_cast<uint32_t>(table.size());
    const size_t applications = kAlways / (table.size() + std::size(names) * kText);
    Body body;
    for (size_t i = 0; i < applications; ++i) {
        body.characteristic(message::kApplication, [&] {
            uint32_t at = 0;
            for (const std::string &name : names) {
                body.parm(message::tableString(at), message::tableString(text));
                at += static_cast<uint32_t>(name.size()) + 1;
            }
        });
    }
    const Bytes bytes = message::document(body, {.table = table + std::string(kText, 't') + '\0'});
    const size_t count = 2 * std::size(names) * applications;
    const size_t before = blocks::liveBytesTaken();
    sweep::Losses losses;
    qvsClientProvCtx *context = contextOf(bytes);
    ASSERT_NE(context, nullptr);
    qvsClientProvCtxDelectContext(context);
    const size_t left = blocks::liveBytesTaken() - before;
    EXPECT_EQ(losses.count(), count);
    EXPECT_GT(left, count * kText);
    EXPECT_LT(left, count * (kText + 32));
    printf("%zu bytes leave %zu, %zu for each\n", bytes.size(), left, left / bytes.size());
}

} // namespace
