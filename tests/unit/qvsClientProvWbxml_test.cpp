// Creation of the decoder, and the releases of the document tree.
#include "qvsClientProvWbxml.h"

#include "support/blocks.h"
#include "support/memcheck.h"
#include "support/records.h"
#include "support/traces.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <random>
#include <string>
#include <vector>

using namespace records;

namespace {

// ---- What the releases let go, by the numbers of the fields

struct Kind {
    const char *name;
    size_t slot;
    size_t fields;
    Numbers texts; // in the order of their release
    Numbers lists;
    size_t children; // 0 where nothing nests
    Numbers left;
    std::function<qvsResult(void *)> release;
};

template <class Record>
std::function<qvsResult(void *)> as(qvsResult (*release)(Record *record))
{
    return [release](void *record) { return release(static_cast<Record *>(record)); };
}

const std::vector<Kind> &kinds()
{
    static const std::vector<Kind> all = {
        {"PxLogical", 1, 15, range(1, 13), {14}, 15, {}, as(qvsClientProvWbxmlDeletePxlogical)},
        {"PxAuthInfo", 2, 3, range(1, 3), {}, 0, {}, as(qvsClientProvWbxmlDeletePxAuthInfo)},
        {"Port", 3, 2, {1}, {2}, 0, {}, as(qvsClientProvWbxmlDeletePort)},
        {"PxPhysical", 4, 10, range(1, 7), {8, 9}, 10, {}, as(qvsClientProvWbxmlDeletePxphysical)},
        {"NapDef", 5, 31, range(1, 27), {29, 30}, 31, {28}, as(qvsClientProvWbxmlDeleteNapDef)},
        {"NapAuthInfo", 6, 5, range(1, 4), {5}, 0, {}, as(qvsClientProvWbxmlDeleteNapAuthInfo)},
        {"Validity", 7, 5, range(1, 5), {}, 0, {}, as(qvsClientProvWbxmlDeleteValidity)},
        {"AppAddr", 8, 3, {2, 1}, {}, 3, {}, as(qvsClientProvWbxmlDeleteAppAddr)},
        {"Resource", 9, 8, range(1, 8), {}, 0, {}, as(qvsClientProvWbxmlDeleteResource)},
        {"AppAuth", 10, 5, range(1, 5), {}, 0, {}, as(qvsClientProvWbxmlDeleteAppAuth)},
        {"Application",
         11,
         16,
         {1, 2, 4, 5, 6, 7},
         {13, 14, 15},
         16,
         {3, 8, 9, 10, 11, 12},
         as(qvsClientProvWbxmlDeleteApplication)},
        {"Bootstrap", 12, 6, range(1, 4), {5, 6}, 0, {}, as(qvsClientProvWbxmlDeleteBootstrap)},
        {"VendorConfig", 13, 3, {1}, {}, 0, {2, 3}, as(qvsClientProvWbxmlDeleteVendorConfig)},
        {"ClientIdentity", 14, 1, {1}, {}, 0, {}, as(qvsClientProvWbxmlDeleteClientIdentity)},
        {"Access", 15, 6, {}, range(1, 6), 0, {}, as(qvsClientProvWbxmlDeleteAccess)},
        {"Wifi", 17, 12, range(1, 12), {}, 0, {}, as(qvsClientProvWbxmlDeleteWifi)},
        {"VoWifi", 18, 1, {1}, {}, 0, {}, as(qvsClientProvWbxmlDeleteVoWifi)},
    };
    return all;
}

constexpr size_t kRoamingSlot = 16;

// The kinds that others nest in.
std::vector<Kind> parents()
{
    std::vector<Kind> some;
    for (const Kind &kind : kinds()) {
        if (kind.children) {
            some.push_back(kind);
        }
    }
    return some;
}

// Puts something of its own into one field, and answers its blocks in their order of release.
Strings fill(Names *names, const Kind &kind, void *record, size_t field)
{
    const std::string name = std::to_string(field);
    const auto in = [field](const Numbers &fields) {
        return std::find(fields.begin(), fields.end(), field) != fields.end();
    };
    if (in(kind.lists)) {
        qvsList *texts = list({"first", "second"});
        set(record, field, texts);
        return names->addList(name, texts);
    }
    if (field == kind.children) {
        qvsList *children = nullptr;
        Strings order;
        for (const char *child : {"left", "right"}) {
            qvsWapPort *port = (*names)(name + child, blank<qvsWapPort>());
            port->pszPortNbr = (*names)(name + child + " text", text("9201"));
            qvsWapCharacter *holder = (*names)(name + child + " node", node(3, port));
            add(&children, holder);
            qvsListNode *last = children->ptFirst;
            while (last->ptNext) {
                last = last->ptNext;
            }
            (*names)(name + child + " list node", last);
            order.insert(order.end(), {name + child + " text", name + child, name + child + " node",
                                       name + child + " list node"});
        }
        (*names)(name, children);
        order.push_back(name);
        set(record, field, children);
        return order;
    }
    set(record, field, (*names)(name, text("value " + name)));
    return {name};
}

void PrintTo(const Kind &kind, std::ostream *out)
{
    *out << kind.name;
}

std::string nameOf(const testing::TestParamInfo<Kind> &row)
{
    return row.param.name;
}

class TreeRelease : public testing::TestWithParam<Kind> {};

INSTANTIATE_TEST_SUITE_P(Kinds, TreeRelease, testing::ValuesIn(kinds()), nameOf);

TEST_P(TreeRelease, AnswersNothingForNull)
{
    blocks::BlockCheck check;
    Releases releases;
    EXPECT_EQ(GetParam().release(nullptr), 0u);
    EXPECT_TRUE(releases.order.empty());
}

// All fields at once: the order, and what stays.
TEST_P(TreeRelease, FollowsItsTable)
{
    blocks::BlockCheck check;
    blocks::Fence fence;
    const Kind &kind = GetParam();
    Names names;
    void *record = names("record", blank(kind.fields));
    const Numbers children = kind.children ? Numbers{kind.children} : Numbers{};
    ASSERT_EQ(kind.fields, join({kind.texts, kind.lists, children, kind.left}).size());
    Strings expected;
    for (size_t field : join({kind.texts, kind.lists, children})) {
        const Strings part = fill(&names, kind, record, field);
        expected.insert(expected.end(), part.begin(), part.end());
    }
    expected.push_back("record");
    std::vector<void *> left;
    for (size_t field : kind.left) {
        fill(&names, kind, record, field);
        left.push_back(get(record, field));
    }

    Strings order;
    {
        Releases releases;
        EXPECT_EQ(kind.release(record), 1u);
        order = names.of(releases.order);
    }
    EXPECT_EQ(order, expected);
    for (size_t i = 0; i < left.size(); ++i) {
        EXPECT_STREQ(static_cast<char *>(left[i]),
                     ("value " + std::to_string(kind.left[i])).c_str());
    }
    release(left);
}

TEST_P(TreeRelease, TakesPartlyFilledRecords)
{
    blocks::BlockCheck check;
    blocks::Fence fence;
    const Kind &kind = GetParam();
    const Numbers children = kind.children ? Numbers{kind.children} : Numbers{};
    for (size_t field : join({kind.texts, kind.lists, children})) {
        Names names;
        void *record = names("record", blank(kind.fields));
        Strings expected = fill(&names, kind, record, field);
        expected.push_back("record");
        Releases releases;
        EXPECT_EQ(kind.release(record), 1u);
        EXPECT_EQ(names.of(releases.order), expected) << "field " << field;
    }
    Names names;
    void *record = names("record", blank(kind.fields));
    Releases releases;
    EXPECT_EQ(kind.release(record), 1u);
    EXPECT_EQ(names.of(releases.order), Strings{"record"});
}

TEST_P(TreeRelease, TakesListsWithoutItems)
{
    blocks::BlockCheck check;
    const Kind &kind = GetParam();
    Names names;
    void *record = names("record", blank(kind.fields));
    Strings expected;
    for (size_t field : join({kind.lists, kind.children ? Numbers{kind.children} : Numbers{}})) {
        set(record, field, names(std::to_string(field), emptyList()));
        expected.push_back(std::to_string(field));
    }
    expected.push_back("record");
    Releases releases;
    EXPECT_EQ(kind.release(record), 1u);
    EXPECT_EQ(names.of(releases.order), expected);
}

// As the item of a node: the same, and the node behind it.
TEST_P(TreeRelease, ServesItsSlot)
{
    blocks::BlockCheck check;
    blocks::Fence fence;
    const Kind &kind = GetParam();
    Names names;
    void *record = names("record", blank(kind.fields));
    Strings expected;
    for (size_t field :
         join({kind.texts, kind.lists, kind.children ? Numbers{kind.children} : Numbers{}})) {
        const Strings part = fill(&names, kind, record, field);
        expected.insert(expected.end(), part.begin(), part.end());
    }
    expected.insert(expected.end(), {"record", "node"});
    qvsWapCharacter *holder = names("node", node(kind.slot, record));
    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteCharacter(holder), 1u);
    EXPECT_EQ(names.of(releases.order), expected);
}

// ---- Nodes and documents

TEST(TreeReleases, HaveNothingToDoForNull)
{
    blocks::BlockCheck check;
    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(nullptr), 0u);
    EXPECT_EQ(qvsClientProvWbxmlDeleteCharacter(nullptr), 0u);
    EXPECT_TRUE(releases.order.empty());
}

TEST(TreeReleases, TakeDocumentsWithoutCharacteristics)
{
    blocks::BlockCheck check;
    Names names;
    qvsWapDoc *document = names("document", blank<qvsWapDoc>());
    {
        Releases releases;
        EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
        EXPECT_EQ(names.of(releases.order), Strings{"document"});
    }
    document = names("document", blank<qvsWapDoc>());
    document->ptCharacterList = names("list", emptyList());
    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
    EXPECT_EQ(names.of(releases.order), (Strings{"list", "document"}));
}

TEST(TreeReleases, GoThroughTheSlotsInOrder)
{
    blocks::BlockCheck check;
    Names names;
    qvsWapCharacter *holder = names("node", blank<qvsWapCharacter>());
    Strings expected;
    for (const Kind &kind : kinds()) {
        void *record = names(kind.name, blank(kind.fields));
        if (kind.children) {
            set(record, kind.children, names(std::string(kind.name) + " list", list({})));
            expected.push_back(std::string(kind.name) + " list");
        }
        set(holder, kind.slot, record);
        expected.push_back(kind.name);
    }
    expected.push_back("node");
    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteCharacter(holder), 1u);
    EXPECT_EQ(names.of(releases.order), expected);
}

// A PXLOGICAL holding a PXPHYSICAL holding a PORT.
TEST(TreeReleases, GoDownFirst)
{
    blocks::BlockCheck check;
    Names names;
    auto port = names("port", blank<qvsWapPort>());
    auto physical = names("physical", blank<qvsWapPxPhysical>());
    add(&physical->ptCharacterList, names("port node", node(3, port)));
    names("physical's list node", physical->ptCharacterList->ptFirst);
    names("physical's list", physical->ptCharacterList);
    auto logical = names("logical", blank<qvsWapPxLogical>());
    add(&logical->ptCharacterList, names("physical node", node(4, physical)));
    names("logical's list node", logical->ptCharacterList->ptFirst);
    names("logical's list", logical->ptCharacterList);
    auto document = names("document", blank<qvsWapDoc>());
    add(&document->ptCharacterList, names("logical node", node(1, logical)));
    names("document's list node", document->ptCharacterList->ptFirst);
    names("document's list", document->ptCharacterList);

    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
    EXPECT_EQ(names.of(releases.order),
              (Strings{"port", "port node", "physical's list node", "physical's list", "physical",
                       "physical node", "logical's list node", "logical's list", "logical",
                       "logical node", "document's list node", "document's list", "document"}));
}

// A child list put together by hand may hold no item in a node.
TEST(TreeReleases, PassOverMissingItems)
{
    blocks::BlockCheck check;
    auto document = blank<qvsWapDoc>();
    add(&document->ptCharacterList, text("in place of a characteristic"));
    add(&document->ptCharacterList, node(18, blank<qvsWapVoWifi>()));
    qvsMemFree_debug(document->ptCharacterList->ptFirst->pItem);
    document->ptCharacterList->ptFirst->pItem = nullptr;
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
}

// ---- Any tree: the order is that of a recursive release

class RandomTree {
public:
    explicit RandomTree(unsigned seed) : random(seed) {}

    qvsWapCharacter *character(unsigned depth)
    {
        qvsWapCharacter *made = blank<qvsWapCharacter>();
        for (const Kind &kind : kinds()) {
            if (one(depth == 0 ? 12 : 6)) {
                set(made, kind.slot, record(kind, depth));
            }
        }
        return made;
    }

private:
    bool one(unsigned of) { return random() % of == 0; }

    void *record(const Kind &kind, unsigned depth)
    {
        void *made = blank(kind.fields);
        for (size_t field : kind.texts) {
            if (one(4)) {
                set(made, field, text("x"));
            }
        }
        for (size_t field : kind.lists) {
            if (one(3)) {
                set(made, field, list(Strings(random() % 3, "y")));
            }
        }
        if (kind.children && depth > 0) {
            qvsList *children = one(3) ? emptyList() : nullptr;
            for (unsigned count = random() % 4; count > 0; --count) {
                add(&children, character(depth - 1));
            }
            set(made, kind.children, children);
        }
        return made;
    }

    std::mt19937 random;
};

// What a recursive release would let go, in its order.
void expectBlocks(const qvsWapCharacter *node, std::vector<const void *> *order)
{
    for (const Kind &kind : kinds()) {
        const void *record = get(node, kind.slot);
        if (!record) {
            continue;
        }
        for (size_t field : kind.texts) {
            if (const void *value = get(record, field)) {
                order->push_back(value);
            }
        }
        for (size_t field : kind.lists) {
            if (const auto *values = static_cast<qvsList *>(get(record, field))) {
                for (qvsListNode *value = values->ptFirst; value; value = value->ptNext) {
                    order->insert(order->end(), {value->pItem, value});
                }
                order->push_back(values);
            }
        }
        const void *children = kind.children ? get(record, kind.children) : nullptr;
        if (children) {
            const auto *list = static_cast<const qvsList *>(children);
            for (qvsListNode *child = list->ptFirst; child; child = child->ptNext) {
                expectBlocks(static_cast<qvsWapCharacter *>(child->pItem), order);
                order->push_back(child);
            }
            order->push_back(children);
        }
        order->push_back(record);
    }
    order->push_back(node);
}

TEST(TreeReleases, KeepTheOrderOfARecursion)
{
    size_t released = 0;
    for (unsigned seed = 0; seed < 200; ++seed) {
        blocks::BlockCheck check;
        RandomTree random(seed);
        qvsWapCharacter *tree = random.character(4);
        std::vector<const void *> expected;
        expectBlocks(tree, &expected);
        Releases releases;
        EXPECT_EQ(qvsClientProvWbxmlDeleteCharacter(tree), 1u);
        ASSERT_EQ(releases.order, expected) << "seed " << seed;
        released += expected.size();
    }
    EXPECT_GT(released, 10000u);
}

// ---- Size costs no stack

constexpr unsigned kMany = 200000;

// Characteristics in one another, the five parents by turns; the innermost is a PORT.
qvsWapCharacter *nest(unsigned levels)
{
    const std::vector<Kind> turns = parents();
    qvsWapCharacter *inner = node(3, blank<qvsWapPort>());
    for (unsigned level = 0; level < levels; ++level) {
        const Kind &kind = turns[level % turns.size()];
        void *record = blank(kind.fields);
        set(record, 1, text("x"));
        qvsList *children = nullptr;
        add(&children, inner);
        set(record, kind.children, children);
        inner = node(kind.slot, record);
    }
    return inner;
}

TEST(TreeReleases, TakeAnyDepth)
{
    blocks::BlockCheck check;
    auto document = blank<qvsWapDoc>();
    add(&document->ptCharacterList, nest(kMany));
    onSmallStack([&] { EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u); });
    qvsWapCharacter *tree = nest(kMany / 4);
    onSmallStack([&] { EXPECT_EQ(qvsClientProvWbxmlDeleteCharacter(tree), 1u); });
}

class ParentRelease : public testing::TestWithParam<Kind> {};

INSTANTIATE_TEST_SUITE_P(Kinds, ParentRelease, testing::ValuesIn(parents()), nameOf);

TEST_P(ParentRelease, TakesAnyDepth)
{
    const Kind &kind = GetParam();
    blocks::BlockCheck check;
    void *record = blank(kind.fields);
    qvsList *children = nullptr;
    add(&children, nest(kMany / 10));
    set(record, kind.children, children);
    onSmallStack([&] { EXPECT_EQ(kind.release(record), 1u); });
}

TEST(TreeReleases, TakeAnyWidth)
{
    blocks::BlockCheck check;
    auto document = blank<qvsWapDoc>();
    for (unsigned i = 0; i < kMany; ++i) {
        addFirst(&document->ptCharacterList, node(3, blank<qvsWapPort>()));
    }
    auto port = static_cast<qvsWapPort *>(get(document->ptCharacterList->ptFirst->pItem, 3));
    port->ptServiceList = list(Strings(kMany, "wsp"));
    onSmallStack([&] { EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u); });
}

// ---- What stays

TEST(Kept, tree_application_left)
{
    blocks::BlockCheck check;
    auto record = blank<qvsWapApplication>();
    const std::vector<void *> left = {
        record->pszFrom = text("from"),           record->pszXcapAuidDcs = text("dcs"),
        record->pszXcapAuidPms = text("pms"),     record->pszXcapAuidCdms = text("cdms"),
        record->pszXcapImeiHeader = text("imei"), record->pszXcapTidHeader = text("tid"),
    };
    const size_t before = blocks::live();
    EXPECT_EQ(qvsClientProvWbxmlDeleteApplication(record), 1u);
    EXPECT_EQ(blocks::live(), before - 1); // the record alone
    EXPECT_STREQ(static_cast<char *>(left.front()), "from");
    EXPECT_STREQ(static_cast<char *>(left.back()), "tid");
    release(left);
}

TEST(Kept, tree_vendorconfig_left)
{
    blocks::BlockCheck check;
    auto record = blank<qvsWapVendorConfig>();
    record->pszName = text("vendor");
    char *name = record->pszParamName = text("name");
    char *value = record->pszParamValue = text("value");
    const size_t before = blocks::live();
    EXPECT_EQ(qvsClientProvWbxmlDeleteVendorConfig(record), 1u);
    EXPECT_EQ(blocks::live(), before - 2); // the record and its name
    EXPECT_STREQ(name, "name");
    EXPECT_STREQ(value, "value");
    release({name, value});
}

TEST(Kept, tree_roaming_left)
{
    blocks::BlockCheck check;
    auto record = blank<qvsWapRoaming>();
    record->pszSyncAllowed = text("1");
    record->pszSyncDefault = text("0");
    auto document = blank<qvsWapDoc>();
    add(&document->ptCharacterList, node(kRoamingSlot, record));
    const size_t before = blocks::live();
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
    EXPECT_EQ(blocks::live(), before - 4); // document, list, its node, the characteristic
    EXPECT_STREQ(record->pszSyncAllowed, "1");
    EXPECT_STREQ(record->pszSyncDefault, "0");
    release({record->pszSyncAllowed, record->pszSyncDefault, record});
}

TEST(Kept, tree_init_left)
{
    blocks::BlockCheck check;
    char constant[] = "empty";
    auto record = blank<qvsWapNapDef>();
    record->pszInit = constant;
    record->pszTBit = text("1");
    Names names;
    names("record", record);
    names("T-BIT", record->pszTBit);
    Releases releases;
    EXPECT_EQ(qvsClientProvWbxmlDeleteNapDef(record), 1u);
    EXPECT_EQ(names.of(releases.order), (Strings{"T-BIT", "record"}));
    EXPECT_STREQ(constant, "empty");
}

// ---- The decoder

TEST(DecoderCreation, CopiesTheBody)
{
    blocks::BlockCheck check;
    uint8_t body[] = {0x03, 0x0B, 0x6A, 0x00};
    qvsWbxmlDecoder *decoder = nullptr;
    ASSERT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, body, sizeof body), QVS_OK);
    ASSERT_NE(decoder, nullptr);
    EXPECT_EQ(decoder->nHasContent, 0u);
    EXPECT_EQ(decoder->nHasAttr, 0u);
    EXPECT_EQ(decoder->nStrSize, 0u);
    EXPECT_EQ(decoder->nCodePage, 0u);
    EXPECT_EQ(decoder->pStringTable, nullptr);
    ASSERT_NE(decoder->ptBuffer, nullptr);
    memset(body, 0xFF, sizeof body);
    const uint8_t expected[] = {0x03, 0x0B, 0x6A, 0x00};
    EXPECT_EQ(decoder->ptBuffer->nSize, sizeof expected);
    EXPECT_EQ(decoder->ptBuffer->pHead, decoder->ptBuffer->pStorage);
    EXPECT_EQ(memcmp(decoder->ptBuffer->pHead, expected, sizeof expected), 0);
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
}

TEST(DecoderCreation, AsksForItsBlocksUnderTheSourceOfEach)
{
    blocks::BlockCheck check;
    const uint8_t byte = 3;
    qvsWbxmlDecoder *decoder = nullptr;
    EXPECT_EQ(memcheck::filesOf(
                  [&] { EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, &byte, 1), QVS_OK); }),
              (Strings{"jni/src/ClientProv/qvsClientProvWbxml", "jni/src/ClientProv/smlbuffer",
                       "jni/src/ClientProv/smlbuffer"}));
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
}

TEST(DecoderCreation, TakesNoBytes)
{
    blocks::BlockCheck check;
    const uint8_t nothing = 0;
    qvsWbxmlDecoder *decoder = nullptr;
    ASSERT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, &nothing, 0), QVS_OK);
    ASSERT_NE(decoder->ptBuffer, nullptr);
    EXPECT_EQ(decoder->ptBuffer->nSize, 0u);
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
}

TEST(DecoderCreation, RefusesMissingArguments)
{
    blocks::BlockCheck check;
    qvsWbxmlDecoder stale{};
    qvsWbxmlDecoder *decoder = &stale;
    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, nullptr, 4), QVS_ERROR_BAD_ARGUMENT);
    EXPECT_EQ(decoder, nullptr);
    const uint8_t byte = 3;
    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(nullptr, &byte, 1), QVS_ERROR_BAD_ARGUMENT);
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(nullptr), QVS_ERROR_BAD_ARGUMENT);
}

TEST(DecoderCreation, TracesAMissingRecord)
{
    blocks::BlockCheck check;
    const uint8_t byte = 3;
    qvsWbxmlDecoder stale{};
    qvsWbxmlDecoder *decoder = &stale;
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, &byte, 1), QVS_ERROR_BAD_ARGUMENT);
    blocks::reset();
    EXPECT_EQ(decoder, nullptr);
    EXPECT_EQ(traces.texts, Strings{"[Error] [qvsClientProvWbxmlInitDecoder] ptTmp NULL\n"});
}

TEST(DecoderCreation, SurvivesEveryFailure)
{
    const uint8_t body[] = {1, 2, 3};
    const auto attempt = [&] {
        qvsWbxmlDecoder *decoder = nullptr;
        if (qvsClientProvWbxmlInitDecoder(&decoder, body, sizeof body) == QVS_OK) {
            EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
        }
    };
    EXPECT_GE(blocks::failEach(attempt), 3);
    EXPECT_GE(blocks::failEachFrom(attempt), 3);
}

TEST(DecoderDeletion, ReleasesTheStringTable)
{
    blocks::BlockCheck check;
    const uint8_t byte = 3;
    qvsWbxmlDecoder *decoder = nullptr;
    ASSERT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, &byte, 1), QVS_OK);
    decoder->pStringTable = text("table");
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
}

TEST(Kept, decoder_buffer_unchecked)
{
    blocks::BlockCheck check;
    const uint8_t body[] = {1, 2, 3};
    qvsWbxmlDecoder *decoder = nullptr;
    blocks::failAt = 1;
    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, body, sizeof body), QVS_OK);
    blocks::reset();
    ASSERT_NE(decoder, nullptr);
    EXPECT_EQ(decoder->ptBuffer, nullptr); // none could be made
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);

    blocks::failAt = 2;
    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, body, sizeof body), QVS_OK);
    blocks::reset();
    ASSERT_NE(decoder, nullptr);
    EXPECT_EQ(decoder->ptBuffer, nullptr); // there was no storage for it
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);

    EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&decoder, body, 0), QVS_OK);
    ASSERT_NE(decoder, nullptr);
    ASSERT_NE(decoder->ptBuffer, nullptr);
    EXPECT_EQ(decoder->ptBuffer->nSize, 0u);
    EXPECT_EQ(qvsClientProvWbxmlDeleteDecoder(decoder), QVS_OK);
}

} // namespace
