// Characteristics inside and beside each other: who accepts whom, runs of siblings, what becomes of
// a document that fails, any depth and any number in little stack, and every allocation failing.
#include "kinds.h"

using namespace parms;
using kinds::Character;
using kinds::characteristic;
using kinds::Document;
using kinds::Kind;

namespace {

class Nesting : public blocks::BlockTest {};
class SiblingRun : public blocks::BlockTest {};
class FailedDocument : public blocks::BlockTest {};
class LittleStack : public blocks::BlockTest {};

const Bytes kLogical = characteristic({0x51});
const Bytes kPort = characteristic({0x53});
const Bytes kText = {0x03, 'x', 0x00};
const Bytes kEmpty = {0x06, 0x01}; // without content

// The attributes of a kind that hold on any page.
Bytes typeOf(const Kind &kind)
{
    return join({{0x00, 0x00}, kind.type});
}

// The child list of a record in its slot: the last field of every record that has one.
const qvsList *childrenOf(const qvsWapCharacter *node, const Kind &kind)
{
    return static_cast<const qvsList *>(records::get(records::get(node, kind.slot), kind.fields));
}

// A document with each kind of characteristic and each of its parameters; the five parents nested.
Bytes everyKind()
{
    const auto of = [](const char *name, const Bytes &content) {
        return characteristic(typeOf(kinds::of(name)), content);
    };
    const auto leaf = [&](const char *name) { return of(name, kinds::of(name).parm); };
    const Bytes port = of("PORT", join({parm(0x23, "80"), parm(0x24, "http"), parm(0x24, "ftp")}));
    const Bytes physical =
        of("PXPHYSICAL",
           join({parm(0x2F, "ph"), kText, parm(0x22, "nap"), port, kText, port, kEmpty}));
    const Bytes logical = of("PXLOGICAL", join({parm(0x15, "px"), parm(0x17, "a"), parm(0x17, "b"),
                                                leaf("PXAUTHINFO"), physical}));
    const Bytes napDef =
        of("NAPDEF", join({parm(0x11, "nap"), named("INIT"), parm(0x10, "gsm"), parm(0x48, "dns"),
                           leaf("NAPAUTHINFO"), leaf("VALIDITY")}));
    const Bytes appAuth = of("APPAUTH", parm({0x33, 0x06, 0x91, 0x90, 0x03, 'x', 0x00}));
    const Bytes application =
        of("APPLICATION", join({parm(0x36, "w2"), named("OTHER", "v"), parm(0x39, "px"),
                                of("APPADDR", join({parm(0x34, "addr"), port})), appAuth,
                                of("RESOURCE", join({parm(0x3A, "uri"), parm({0x1C})}))}));
    return join({{0xC5, 0x46, 0x01},
                 logical,
                 napDef,
                 kText,
                 application,
                 leaf("BOOTSTRAP"),
                 leaf("VENDORCONFIG"),
                 leaf("CLIENTIDENTITY"),
                 leaf("ACCESS"),
                 leaf("WI-FI"),
                 leaf("Vodafone VoWiFi"),
                 {0x01}});
}

// How many blocks more are live behind a body that fails than in front of it.
size_t leftBehind(const Bytes &body)
{
    const size_t before = blocks::live();
    EXPECT_NE(Document(body).result, 0U);
    return blocks::live() - before;
}

// Characteristics of a document that is too large for a recursion.
constexpr size_t kMany = 300000;

Bytes repeat(const Bytes &bytes, size_t count)
{
    Bytes out;
    out.reserve(bytes.size() * count);
    for (size_t i = 0; i < count; ++i) {
        out.insert(out.end(), bytes.begin(), bytes.end());
    }
    return out;
}

// Decodes and releases on a thread with little stack.
qvsResult decodeOnSmallStack(const Bytes &body)
{
    decoding::Decoder decoder(body);
    qvsResult result = 0;
    records::onSmallStack([&] {
        qvsWapDoc *document = nullptr;
        result = qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document);
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
    });
    return result;
}

} // namespace

// ---- Nesting

TEST(NestingTable, HoldsForEachParentAndEachChild)
{
    const size_t before = blocks::live();
    size_t kept = 0;
    for (const Kind &parent : kinds::all()) {
        for (const Kind &child : kinds::all()) {
            SCOPED_TRACE(std::string(parent.name) + " > " + child.name);
            Traces traces;
            const Character read(
                characteristic(typeOf(parent), characteristic(typeOf(child), child.parm)));
            if (parent.nesting == kinds::kHolds) {
                EXPECT_EQ(read.result, 0U);
                EXPECT_EQ(read.left(), 0U);
                ASSERT_TRUE(read.node);
                EXPECT_EQ(fieldsSet(read.node), records::Numbers{parent.slot});
                const qvsWapCharacter *inner = kinds::nodeAt(childrenOf(read.node, parent), 0);
                ASSERT_TRUE(inner);
                EXPECT_EQ(fieldsSet(inner), records::Numbers{child.slot});
                continue;
            }
            EXPECT_EQ(read.result, 4101U);
            EXPECT_EQ(read.node, nullptr);
            EXPECT_EQ(traces.texts.back(), parent.refusal ? std::string(parent.refusal) + "\n"
                                                          : kinds::turn(0x06, 0x50).back());
            kept += parent.slot == 16; // the record of a ROAMING that failed
        }
    }
    EXPECT_EQ(blocks::live(), before + kept);
}

TEST_F(Nesting, IsRefusedBeforeTheChildIsRead)
{
    const Bytes bytes = characteristic({0x56}, kPort);
    const Character read(bytes);
    EXPECT_EQ(read.result, 4101U);
    EXPECT_EQ(read.decoder.position(), 3U);
}

TEST_F(Nesting, IsDecidedByTheLastTypeOfTheParent)
{
    Traces traces;
    EXPECT_EQ(Character(characteristic({0x51, 0x53}, kPort)).result, 4101U);
    EXPECT_TRUE(traces.has("BOOTSTRAP is Not Support Chiled PORT.\n"));
    const Character read(characteristic({0x53, 0x51}, kPort));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_TRUE(read.node->ptPxLogical->ptCharacterList);
}

TEST_F(Nesting, IsDecidedByThePageBehindTheAttributesOfTheParent)
{
    // The child switches the page; its sibling still goes to the NAPDEF, not to an APPLICATION.
    const Character read(
        characteristic({0x55}, join({characteristic({0x00, 0x01, 0x59}), characteristic({0x59})})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    const qvsList *children = read.node->ptNapDef->ptCharacterList;
    ASSERT_TRUE(kinds::nodeAt(children, 1));
    EXPECT_TRUE(kinds::nodeAt(children, 0)->ptResource);
    EXPECT_TRUE(kinds::nodeAt(children, 1)->ptResource) << "the page stays switched for it";
}

TEST_F(Nesting, FollowsParmsStringsAndSwitches)
{
    const Character read(characteristic(
        {0x51}, join({parm(0x15, "px"), kText, {0x00, 0x01}, kText, kPort, kText, kPort})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    EXPECT_EQ(read.node->ptPxLogical->ptCharacterList->nCount, 2U);
}

TEST_F(Nesting, IsFollowedByTheEndOfTheParentAlone)
{
    const Bytes others[] = {parm(0x15, "px"),
                            {0x00, 0x00},
                            join({kText, kText}),
                            {0x05, 0x01},
                            join({kText, parm(0x15, "px")})};
    for (const Bytes &other : others) {
        SCOPED_TRACE(testing::PrintToString(other));
        EXPECT_EQ(Character(characteristic({0x51}, join({kPort, other}))).result, 4101U);
    }
    EXPECT_EQ(Character(characteristic({0x51}, join({kPort, kText}))).result, 0U);
}

TEST_F(Nesting, OfElementsWithoutContentMakesAnEmptyList)
{
    const Character read(characteristic({0x51}, join({kEmpty, kEmpty})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    ASSERT_TRUE(read.node->ptPxLogical->ptCharacterList);
    EXPECT_EQ(read.node->ptPxLogical->ptCharacterList->nCount, 0U);

    const Character one(characteristic({0x51}, join({kEmpty, kPort, kEmpty})));
    ASSERT_TRUE(one.node);
    EXPECT_EQ(one.node->ptPxLogical->ptCharacterList->nCount, 1U);
}

TEST_F(Nesting, TracesTheTurnsOfTheParentAroundThoseOfTheChild)
{
    Traces traces;
    const Character read(characteristic({0x51}, kPort));
    EXPECT_EQ(traces.texts,
              kinds::turn(0x06, 0x51) + kinds::turn(0x01, 0x53) + kinds::turn(0x01, 0x51));
}

TEST_F(Nesting, KeepsItsOrderInEachParent)
{
    const Bytes inner = characteristic({0x52}, join({kPort, characteristic({0x54}), kPort}));
    const Character read(characteristic({0x51}, join({kPort, inner, characteristic({0x5B})})));
    EXPECT_EQ(read.result, 0U);
    ASSERT_TRUE(read.node);
    const qvsList *outer = read.node->ptPxLogical->ptCharacterList;
    ASSERT_EQ(outer->nCount, 3U);
    EXPECT_TRUE(kinds::nodeAt(outer, 0)->ptPort);
    EXPECT_TRUE(kinds::nodeAt(outer, 2)->ptAccess);
    const qvsList *nested = kinds::nodeAt(outer, 1)->ptPxPhysical->ptCharacterList;
    ASSERT_EQ(nested->nCount, 3U);
    EXPECT_TRUE(kinds::nodeAt(nested, 0)->ptPort);
    EXPECT_TRUE(kinds::nodeAt(nested, 1)->ptValidity);
    EXPECT_TRUE(kinds::nodeAt(nested, 2)->ptPort);
}

TEST(Kept, refusal_wording)
{
    blocks::BlockCheck check;
    const auto refusalOf = [](const char *parent) {
        Traces traces;
        (void)Character(characteristic(kinds::of(parent).type, kPort));
        return traces.texts.back();
    };
    EXPECT_EQ(refusalOf("VALIDITY"), "BOOTSTRAP is Not Support Chiled PORT.\n");
    EXPECT_EQ(refusalOf("NAPAUTHINFO"), "BOOTSTRAP is Not Support Chiled PORT.\n");
    EXPECT_EQ(refusalOf("CLIENTIDENTITY"), "BOOTSTRAP is Not Support Chiled CLIENTIDENTITY.\n");
    EXPECT_EQ(refusalOf("PXAUTHINFO"), "RESOURCE is Not Support Chiled CHARACTER.\n");
    EXPECT_EQ(refusalOf("ACCESS"), "BOOTSTRAP is Not Support Chiled ACCESS.\n");
}

// ---- Siblings

TEST_F(SiblingRun, RunToAnEndThatStays)
{
    for (const uint8_t end : {0x01, 0x41, 0x81, 0xC1}) {
        kinds::Siblings run(join({kLogical, kText, kPort, {end, 0x01}}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 2U);
        ASSERT_EQ(run.list->nCount, 2U);
        EXPECT_TRUE(kinds::nodeAt(run.list, 0)->ptPxLogical);
        EXPECT_TRUE(kinds::nodeAt(run.list, 1)->ptPort);
    }
}

TEST_F(SiblingRun, MayEndBehindAString)
{
    kinds::Siblings run(join({kPort, kText, {0x01}}));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 1U);
    EXPECT_EQ(run.list->nCount, 1U);
}

TEST_F(SiblingRun, AreAppendedToAListThatIsThere)
{
    kinds::Siblings run(join({kPort, {0x01}, kLogical, kEmpty, kPort, {0x01}}));
    EXPECT_EQ(run.read(), 0U);
    const qvsList *list = run.list;
    uint8_t end = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderReadAttr(run.decoder, &end), 0U);
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.list, list);
    ASSERT_EQ(list->nCount, 3U);
    EXPECT_TRUE(kinds::nodeAt(list, 1)->ptPxLogical);
}

TEST_F(SiblingRun, WithoutContentAddNothing)
{
    kinds::Siblings run(join({kEmpty, {0x01}, kPort, kEmpty, {0x01}}));
    EXPECT_EQ(run.read(), 0U);
    ASSERT_TRUE(run.list) << "the first one makes the list";
    EXPECT_EQ(run.list->nCount, 0U);
    EXPECT_EQ(run.left(), kPort.size() + kEmpty.size() + 2);
}

TEST_F(SiblingRun, WithoutContentLeaveAttributesThatAreNoElement)
{
    kinds::Siblings run({0x86, 0x51, 0x01, 0x01});
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(run.list, nullptr);
}

TEST_F(SiblingRun, FailAtAnythingElse)
{
    const Bytes others[] = {parm(0x15, "px"),
                            {0x00, 0x00},
                            join({kText, kText}),
                            join({kText, parm(0x15, "px")}),
                            {0x45}};
    for (const Bytes &other : others) {
        SCOPED_TRACE(testing::PrintToString(other));
        kinds::Siblings fresh(join({kPort, other, {0x01}}));
        EXPECT_EQ(fresh.read(), 4101U);
        EXPECT_EQ(fresh.list, nullptr) << "a new list is not handed out";

        kinds::Siblings run(join({kPort, kLogical, other, {0x01}}));
        EXPECT_EQ(qvsListCreate(&run.list, nullptr), 0U);
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.list->nCount, 2U) << "a list that was there keeps them";
    }
}

TEST_F(SiblingRun, FailWhereTheDataEnds)
{
    const Bytes whole = join({kPort, kText, kLogical});
    for (size_t count = 0; count <= whole.size(); ++count) {
        SCOPED_TRACE(count);
        kinds::Siblings run(prefix(whole, count));
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_EQ(run.list, nullptr);
    }
}

TEST_F(SiblingRun, TraceAListThatFindsNoMemory)
{
    decoding::Decoder decoder(join({kEmpty, {0x01}}));
    qvsList *list = nullptr;
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderCharacterList(decoder, &list), 1U);
    blocks::reset();
    EXPECT_EQ(list, nullptr);
    EXPECT_EQ(traces.texts.back(),
              "[Error] [qvsClientProvWbxmlDecoderCharacterList] ptTmpList NULL\n");
}

TEST_F(SiblingRun, TracesNoMissingListWhereOneIsThereAndItsNodeIsNot)
{
    decoding::Decoder decoder(join({kLogical, {0x01}}));
    qvsList *list = nullptr;
    ASSERT_EQ(qvsListCreate(&list, nullptr), QVS_OK);
    Traces traces;
    blocks::failAt = 2; // the element and its record can be had
    EXPECT_EQ(qvsClientProvWbxmlDecoderCharacterList(decoder, &list), 1U);
    blocks::reset();
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_FALSE(traces.has("[Error] [qvsClientProvWbxmlDecoderCharacterList] ptTmpList NULL\n"));
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), QVS_OK);
}

// ---- Documents that fail

TEST_F(FailedDocument, IsReleasedWhereverTheDataEnds)
{
    const Bytes whole = everyKind();
    {
        const Document document(whole);
        EXPECT_EQ(document.result, 0U);
        EXPECT_EQ(document.left(), 0U);
        ASSERT_TRUE(document.nodes());
        EXPECT_EQ(document.nodes()->nCount, 9U);
    }
    for (size_t count = 0; count < whole.size(); ++count) {
        SCOPED_TRACE(count);
        blocks::BlockCheck documentCheck;
        const Document document(prefix(whole, count));
        // A page switch that is cut counts as one to an unknown page.
        EXPECT_TRUE(document.result == 4103 || document.result == 4101) << document.result;
        EXPECT_EQ(document.document, nullptr);
    }
}

TEST_F(FailedDocument, IsReleasedWhicheverByteIsWrong)
{
    const Bytes whole = everyKind();
    for (size_t place = 0; place < whole.size(); ++place) {
        SCOPED_TRACE(place);
        blocks::BlockCheck documentCheck;
        Bytes bytes = whole;
        bytes[place] = 0x7E; // no tag, attribute, value token or page
        const Document document(bytes);
        EXPECT_TRUE(document.result == 0 || !document.document);
    }
}

TEST_F(FailedDocument, IsReleasedWhicheverAllocationFails)
{
    const Bytes whole = everyKind();
    const auto attempt = [&] {
        const long failAt = std::exchange(blocks::failAt, -1);
        decoding::Decoder decoder(whole);
        qvsWapDoc *document = nullptr;
        blocks::failAt = failAt;
        const qvsResult result = qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document);
        EXPECT_EQ(result == 0, document != nullptr);
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
    };
    EXPECT_GT(blocks::failEach(attempt), 100);
    EXPECT_GT(blocks::failEachFrom(attempt), 100);
}

TEST_F(FailedDocument, IsReleasedWithTheCharacteristicWhoseAttributesFailed)
{
    // Types that make a record, in front of a token that is refused, on two levels.
    const Bytes failing = {0xC6, 0x51, 0x52, 0x00, 0x01, 0x55, 0x7F};
    EXPECT_EQ(Document(join({{0x45}, kLogical, failing})).result, 4101U);
    EXPECT_EQ(Document(join({{0x45, 0xC6, 0x51, 0x01}, kPort, failing})).result, 4101U);
}

TEST(FailedDocumentKeeps, WhatTheReleaseOfATreeLeaves)
{
    const auto failing = [](const Bytes &attributes, const Bytes &content) {
        return join({{0x45}, characteristic(attributes, content), {0x7F}});
    };
    const Bytes roaming = kinds::of("ROAMING").type;
    EXPECT_EQ(leftBehind(failing(roaming, {})), 1U);
    EXPECT_EQ(leftBehind(failing(roaming, named("SYNC-ALLOWED", "1"))), 2U);
    EXPECT_EQ(leftBehind(join({{0x45, 0xC6}, roaming, {0x7F}})), 1U) << "a name that fails";
    EXPECT_EQ(leftBehind(failing({0x57}, named("name", "value"))), 2U);
    EXPECT_EQ(leftBehind(failing({0x00, 0x01, 0x55}, named("FROM", "me"))), 1U);
    EXPECT_EQ(leftBehind(failing({0x53}, join({parm(0x23, "1"), parm(0x23, "2")}))), 1U);
    EXPECT_EQ(leftBehind(failing({0x53, 0x53}, {})), 1U);
}

TEST(FailedDocumentKeeps, NoMoreWhicheverAllocationFails)
{
    const Bytes body =
        join({{0x45},
              kPort,
              characteristic({0x00, 0x01, 0x55},
                             join({named("FROM", "a"), named("XCAP_AUID_DCS", "b")})),
              characteristic({0x00, 0x00, 0x57}, named("name", "value")),
              characteristic(kinds::of("ROAMING").type,
                             join({named("SYNC-ALLOWED", "1"), named("SYNC-DEFAULT", "0")})),
              {0x01}});
    constexpr size_t kKept = 2 + 2 + 3;
    size_t last = 0;
    for (long n = 0;; ++n) {
        SCOPED_TRACE(n);
        decoding::Decoder decoder(body);
        qvsWapDoc *document = nullptr;
        const size_t before = blocks::live();
        blocks::failAt = n;
        const qvsResult result = qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document);
        const bool failed = blocks::failAt < 0;
        blocks::reset();
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
        const size_t left = blocks::live() - before;
        EXPECT_EQ(result == 0, !failed);
        EXPECT_GE(left, last) << "it was there before the failure";
        EXPECT_LE(left, kKept);
        last = left;
        if (!failed) {
            break;
        }
    }
    EXPECT_EQ(last, kKept);
}

// ---- Any depth and any number

TEST_F(LittleStack, IsEnoughForAnyDepth)
{
    const Bytes start = join({{0x45}, repeat({0xC6, 0x51, 0x01}, kMany)});
    const Bytes end(kMany, 0x01);
    EXPECT_EQ(decodeOnSmallStack(join({start, end, {0x01}})), 0U);
    EXPECT_EQ(decodeOnSmallStack(join({start, end})), 4103U) << "fails at the very end";
    EXPECT_EQ(decodeOnSmallStack(join({start, {0xC6, 0x53, 0x7F}})), 4101U) << "at the very bottom";
}

TEST_F(LittleStack, IsEnoughForTheDepthOfEachParent)
{
    for (const Bytes &type : {Bytes{0x51}, Bytes{0x52}, Bytes{0x00, 0x00, 0x55},
                              Bytes{0x00, 0x01, 0x55}, Bytes{0x00, 0x01, 0x56}}) {
        const size_t depth = 20000;
        EXPECT_EQ(
            decodeOnSmallStack(join(
                {{0x45}, repeat(join({{0xC6}, type, {0x01}}), depth), Bytes(depth + 1, 0x01)})),
            0U);
    }
}

TEST_F(LittleStack, IsEnoughForAnyNumberOfSiblings)
{
    const Bytes run = repeat(kPort, kMany);
    EXPECT_EQ(decodeOnSmallStack(join({{0x45}, run, {0x01}})), 0U);
    EXPECT_EQ(decodeOnSmallStack(join({{0x45}, run})), 4103U) << "fails at the very end";
    EXPECT_EQ(decodeOnSmallStack(join({{0x45, 0xC6, 0x51, 0x01}, run, {0x05}})), 4101U);
}

TEST_F(LittleStack, IsEnoughForAnyNumberOfTypesInOneElement)
{
    // Page switches between, so that nothing is lost but time.
    const Bytes body = join({{0x45, 0xC6}, repeat({0x00, 0x01}, kMany), {0x51, 0x01, 0x01, 0x01}});
    EXPECT_EQ(decodeOnSmallStack(body), 0U);
}
