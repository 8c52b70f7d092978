// The records of the context: what each copies of a record of the tree.
#include "qvsClientProvCtx.h"

#include "support/blocks.h"
#include "support/records.h"
#include "support/traces.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

using namespace records;

namespace {

using Texts = std::vector<std::optional<std::string>>;

// ---- What the builders copy, by the numbers of the fields

struct Copy {
    size_t from;
    size_t to;
};
using Copies = std::vector<Copy>;

// The fields that are copied to their own numbers.
Copies same(const Numbers &fields)
{
    Copies out;
    for (size_t field : fields) {
        out.push_back({field, field});
    }
    return out;
}

struct Kind {
    const char *name;
    size_t wapFields;
    size_t ctxFields;
    Copies texts; // in the order of copying
    Copies lists;
    std::function<void *(void *)> build;
};

template <class Ctx, class Wap>
std::function<void *(void *)> as(Ctx *(*build)(Wap *record))
{
    return [build](void *record) -> void * { return build(static_cast<Wap *>(record)); };
}

#define OF(name) as(qvsClientProvCtxVerifyContext##name)

const std::vector<Kind> &kinds()
{
    static const std::vector<Kind> all = {
        {"PxLogical",
         15,
         18,
         same({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 13}),
         {{14, 14}},
         OF(PxLogical)},
        {"PxAuthInfo", 3, 4, same(range(1, 3)), {}, OF(PxAuthInfo)},
        {"PxPhysical", 10, 11, same(range(1, 7)), {{9, 8}, {8, 9}}, OF(PxPhysical)},
        {"Port", 2, 3, same({1}), {{2, 2}}, OF(Port)},
        {"Napdef",
         31,
         33,
         same(join({range(1, 5), {28}, range(6, 27)})),
         {{29, 29}, {30, 30}},
         OF(Napdef)},
        {"NapAuthInfo", 5, 6, same(range(1, 4)), {{5, 5}}, OF(NapAuthInfo)},
        {"Validity", 5, 6, same(range(1, 5)), {}, OF(Validity)},
        {"Application", 16, 20, same(join({range(1, 12), {3}})), same({13, 14, 15}),
         OF(Application)},
        {"AppAddr", 3, 4, same({1, 2}), {}, OF(AppAddr)},
        {"AppAuth", 5, 6, same(range(1, 5)), {}, OF(AppAuth)},
        {"Resource", 8, 9, same(range(1, 8)), {}, OF(Resource)},
        {"Roaming", 2, 3, same({1, 2}), {}, OF(Roaming)},
        {"Bootstrap", 6, 7, same(range(1, 4)), same({5, 6}), OF(Bootstrap)},
        {"ClientIdent", 1, 1, same({1}), {}, OF(ClientIdent)},
        {"VenderConfig", 3, 4, same(range(1, 3)), {}, OF(VenderConfig)},
        {"Access", 6, 7, {}, same(range(1, 6)), OF(Access)},
        {"Wifi", 12, 13, same(range(1, 12)), {}, OF(Wifi)},
        {"VoWifi", 1, 2, same({1}), {}, OF(VoWifi)},
    };
    return all;
}

// The field of the children, in the five kinds that have some: the last one.
bool hasChildren(const Kind &kind)
{
    const Strings parents = {"PxLogical", "PxPhysical", "Napdef", "Application", "AppAddr"};
    return std::find(parents.begin(), parents.end(), kind.name) != parents.end();
}

bool isIn(const Copies &copies, size_t from)
{
    return std::any_of(copies.begin(), copies.end(),
                       [from](const Copy &copy) { return copy.from == from; });
}

// A text of its own for each field.
std::string valueOf(size_t field)
{
    return "text " + std::to_string(field);
}

// A record of the tree with something in each of the fields: texts, and lists of two texts.
void *filled(const Kind &kind, const Numbers &fields)
{
    void *record = blank(kind.wapFields);
    for (size_t field : fields) {
        if (hasChildren(kind) && field == kind.wapFields) {
            set(record, field, emptyList());
        } else if (isIn(kind.lists, field)) {
            set(record, field, list({valueOf(field), valueOf(field) + " again"}));
        } else {
            set(record, field, text(valueOf(field)));
        }
    }
    return record;
}

// What a record of the context holds, by its fields; a field that holds nothing is left out.
struct Holdings {
    std::map<size_t, std::string> texts;
    std::map<size_t, Texts> lists;

    bool operator==(const Holdings &) const = default;
};

void PrintTo(const Holdings &holdings, std::ostream *out)
{
    for (const auto &[field, value] : holdings.texts) {
        *out << field << ": " << value << "; ";
    }
    for (const auto &[field, values] : holdings.lists) {
        *out << field << ":";
        for (const auto &value : values) {
            *out << " " << value.value_or("(null)");
        }
        *out << "; ";
    }
}

Texts textsOf(const void *chain)
{
    Texts out;
    for (auto node = static_cast<const qvsCtxStrNode *>(chain); node; node = node->ptNext) {
        out.push_back(node->pszValue ? std::optional(std::string(node->pszValue)) : std::nullopt);
    }
    return out;
}

Holdings holdingsOf(const Kind &kind, const void *copy)
{
    Holdings out;
    for (size_t field = 1; field <= kind.ctxFields; ++field) {
        const void *value = get(copy, field);
        const bool isList = std::any_of(kind.lists.begin(), kind.lists.end(),
                                        [field](const Copy &row) { return row.to == field; });
        if (value && isList) {
            out.lists[field] = textsOf(value);
        } else if (value) {
            out.texts[field] = static_cast<const char *>(value);
        }
    }
    return out;
}

// The steps of a copy that ask for memory, in their order.
struct Step {
    enum { kText, kNode, kNodeText } what;
    size_t field; // of the context record
    size_t index = 0;
    std::string value;
};

std::vector<Step> stepsOf(const Kind &kind, const Numbers &fields)
{
    const auto isFilled = [&](size_t field) {
        return std::find(fields.begin(), fields.end(), field) != fields.end();
    };
    std::vector<Step> steps;
    for (const Copy &copy : kind.texts) {
        if (isFilled(copy.from)) {
            steps.push_back({Step::kText, copy.to, 0, valueOf(copy.from)});
        }
    }
    for (const Copy &copy : kind.lists) {
        if (isFilled(copy.from)) {
            for (size_t i = 0; i < 2; ++i) {
                steps.push_back({Step::kNode, copy.to, i, ""});
                steps.push_back(
                    {Step::kNodeText, copy.to, i, valueOf(copy.from) + (i == 0 ? "" : " again")});
            }
        }
    }
    return steps;
}

// What the copy holds when the steps from `first` to `last` get no memory.
Holdings expected(const std::vector<Step> &steps, size_t first = 1, size_t last = 0)
{
    Holdings out;
    for (size_t i = 0; i < steps.size(); ++i) {
        const Step &step = steps[i];
        const bool fails = first <= i && i <= last;
        if (step.what == Step::kText) {
            out.texts.erase(step.field);
            if (!fails) {
                out.texts[step.field] = step.value;
            }
        } else if (step.what == Step::kNodeText) {
            out.lists[step.field].push_back(fails ? std::nullopt : std::optional(step.value));
        } else if (fails) {
            // The list ends before the node.
            while (i + 1 < steps.size() && steps[i + 1].field == step.field) {
                ++i;
            }
        }
    }
    return out;
}

void PrintTo(const Kind &kind, std::ostream *out)
{
    *out << kind.name;
}

std::string nameOf(const testing::TestParamInfo<Kind> &row)
{
    return row.param.name;
}

class ContextRecord : public testing::TestWithParam<Kind> {
protected:
    const Kind &kind = GetParam();
    const Numbers allFields = range(1, kind.wapFields);
    Sweep sweep;
};

INSTANTIATE_TEST_SUITE_P(Kinds, ContextRecord, testing::ValuesIn(kinds()), nameOf);

TEST_P(ContextRecord, RefusesNull)
{
    Traces traces;
    EXPECT_EQ(kind.build(nullptr), nullptr);
    EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
}

TEST_P(ContextRecord, CopiesItsTable)
{
    void *record = filled(kind, allFields);
    const void *copy = kind.build(record);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(holdingsOf(kind, copy), expected(stepsOf(kind, allFields)));
}

TEST_P(ContextRecord, CopiesEachFieldAlone)
{
    for (size_t field : allFields) {
        const void *copy = kind.build(filled(kind, {field}));
        ASSERT_NE(copy, nullptr);
        EXPECT_EQ(holdingsOf(kind, copy), expected(stepsOf(kind, {field}))) << "field " << field;
    }
}

// Nothing of the copy points into the tree: it stays as it is when the tree is overwritten.
TEST_P(ContextRecord, OwnsItsTexts)
{
    void *record = filled(kind, allFields);
    const std::set<void *> ofTree = blocks::all();
    const void *copy = kind.build(record);
    ASSERT_NE(copy, nullptr);
    for (const Copy &row : kind.texts) {
        memset(get(record, row.from), '#', valueOf(row.from).size());
        EXPECT_EQ(ofTree.count(get(copy, row.to)), 0u) << "field " << row.to;
    }
    for (const Copy &row : kind.lists) {
        const auto *texts = static_cast<qvsList *>(get(record, row.from));
        for (qvsListNode *node = texts->ptFirst; node; node = node->ptNext) {
            *static_cast<char *>(node->pItem) = '#';
        }
    }
    EXPECT_EQ(holdingsOf(kind, copy), expected(stepsOf(kind, allFields)));
}

TEST_P(ContextRecord, TakesRecordsWithoutAnything)
{
    const void *copy = kind.build(blank(kind.wapFields));
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(holdingsOf(kind, copy), Holdings{});
}

// A list without texts is no list in the context.
TEST_P(ContextRecord, LeavesEmptyListsOut)
{
    void *record = blank(kind.wapFields);
    for (const Copy &row : kind.lists) {
        set(record, row.from, emptyList());
    }
    const void *copy = kind.build(record);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(holdingsOf(kind, copy), Holdings{});
}

// One allocation fails after the other: the record goes without what it was for. That also tells
// the order of copying.
TEST_P(ContextRecord, GoesWithoutWhatFindsNoMemory)
{
    void *record = filled(kind, allFields);
    const std::vector<Step> steps = stepsOf(kind, allFields);
    blocks::failAt = 0;
    EXPECT_EQ(kind.build(record), nullptr);
    blocks::reset();
    for (size_t i = 0; i < steps.size(); ++i) {
        blocks::failAt = static_cast<long>(i) + 1;
        const void *copy = kind.build(record);
        blocks::reset();
        ASSERT_NE(copy, nullptr);
        EXPECT_EQ(holdingsOf(kind, copy), expected(steps, i, i)) << "step " << i + 1;
    }
    blocks::failFromThenOn = true;
    for (size_t i = 0; i < steps.size(); ++i) {
        blocks::failAt = static_cast<long>(i) + 1;
        const void *copy = kind.build(record);
        blocks::reset();
        ASSERT_NE(copy, nullptr);
        EXPECT_EQ(holdingsOf(kind, copy), expected(steps, i, steps.size()))
            << "from step " << i + 1;
    }
    blocks::failFromThenOn = false;
}

// ---- Traces

// A record with lists, all empty, so that none of them is traced as missing.
template <class Wap>
Wap *withLists(const Numbers &lists)
{
    Wap *record = blank<Wap>();
    for (size_t field : lists) {
        set(record, field, emptyList());
    }
    return record;
}

TEST(ContextRecords, TraceTheFirstAuthEntity)
{
    Sweep sweep;
    qvsWapNapAuthInfo record{};
    record.ptAuthEntityList = list({"first", "second"});
    {
        Traces traces;
        ASSERT_NE(qvsClientProvCtxVerifyContextNapAuthInfo(&record), nullptr);
        EXPECT_EQ(traces.texts, Strings{"NAP:ptCtx->ptAuthEntity->pAuthEntity[first]\n"});
    }
    record.ptAuthEntityList = emptyList();
    Traces traces;
    ASSERT_NE(qvsClientProvCtxVerifyContextNapAuthInfo(&record), nullptr);
    EXPECT_EQ(traces.texts, Strings{});
}

TEST(ContextRecords, DoNotTraceAnEntityWithoutText)
{
    Sweep sweep;
    qvsWapNapAuthInfo record{};
    record.ptAuthEntityList = list({"first"});
    Traces traces;
    blocks::failAt = 2; // record, node, text
    const qvsCtxNapAuthInfo *copy = qvsClientProvCtxVerifyContextNapAuthInfo(&record);
    blocks::reset();
    ASSERT_NE(copy, nullptr);
    ASSERT_NE(copy->ptAuthEntity, nullptr);
    EXPECT_EQ(copy->ptAuthEntity->pAuthEntity, nullptr);
    EXPECT_EQ(traces.texts, Strings{});
}

constexpr char kMissingList[] = "[Syncml] ERROR : DM = fffff00c\n";

// A missing list of texts is traced once; a missing list of children by the walk, and by three of
// its five callers once more.
TEST(ContextRecords, TraceMissingLists)
{
    Sweep sweep;
    const std::map<std::string, size_t> more = {
        {"PxLogical", 2}, {"PxPhysical", 1}, {"Napdef", 2}, {"Application", 2}, {"AppAddr", 1}};
    for (const Kind &kind : kinds()) {
        const auto children = more.find(kind.name);
        const size_t count = kind.lists.size() + (children == more.end() ? 0 : children->second);
        Traces traces;
        ASSERT_NE(kind.build(blank(kind.wapFields)), nullptr);
        EXPECT_EQ(traces.texts, Strings(count, kMissingList)) << kind.name;
    }
}

// ---- Children that do not fit: the record is made all the same, with the children before them.

const Strings kMisfit = {"[WARNING] Not Support Context\n", "[Syncml] ERROR : 1\n"};
const Strings kMisfitTracedAgain = {"[WARNING] Not Support Context\n", "[Syncml] ERROR : 1\n",
                                    "[Syncml] ERROR : 1\n"};

// A PORT with its list, so that nothing of it is traced.
qvsWapCharacter *portNode()
{
    return node(3, withLists<qvsWapPort>({2}));
}

qvsWapCharacter *misfitNode()
{
    return node(14, blank<qvsWapClientIdentity>());
}

TEST(ContextRecords, PxLogicalKeepsWhatCameBeforeAMisfit)
{
    Sweep sweep;
    auto record = withLists<qvsWapPxLogical>({14, 15});
    add(&record->ptCharacterList, portNode());
    add(&record->ptCharacterList, node(5, blank<qvsWapNapDef>()));
    add(&record->ptCharacterList, node(2, blank<qvsWapPxAuthInfo>()));
    Traces traces;
    const qvsCtxPxLogical *copy = qvsClientProvCtxVerifyContextPxLogical(record);
    ASSERT_NE(copy, nullptr);
    EXPECT_NE(copy->ptPort, nullptr);
    EXPECT_EQ(copy->ptPxAuthInfo, nullptr);
    EXPECT_EQ(traces.texts, kMisfitTracedAgain);
}

TEST(ContextRecords, NapDefKeepsWhatCameBeforeAMisfit)
{
    Sweep sweep;
    auto record = withLists<qvsWapNapDef>({29, 30, 31});
    add(&record->ptCharacterList, node(7, blank<qvsWapValidity>()));
    add(&record->ptCharacterList, misfitNode());
    Traces traces;
    const qvsCtxNapDef *copy = qvsClientProvCtxVerifyContextNapdef(record);
    ASSERT_NE(copy, nullptr);
    EXPECT_NE(copy->ptValidity, nullptr);
    EXPECT_EQ(traces.texts, kMisfitTracedAgain);
}

TEST(ContextRecords, ApplicationKeepsWhatCameBeforeAMisfit)
{
    Sweep sweep;
    auto record = withLists<qvsWapApplication>({13, 14, 15, 16});
    add(&record->ptCharacterList, node(16, blank<qvsWapRoaming>()));
    add(&record->ptCharacterList, misfitNode());
    Traces traces;
    const qvsCtxApplication *copy = qvsClientProvCtxVerifyContextApplication(record);
    ASSERT_NE(copy, nullptr);
    EXPECT_NE(copy->ptRoaming, nullptr);
    EXPECT_EQ(traces.texts, kMisfitTracedAgain);
}

TEST(Kept, context_misfit_ignored)
{
    Sweep sweep;
    auto physical = withLists<qvsWapPxPhysical>({8, 9, 10});
    add(&physical->ptCharacterList, portNode());
    add(&physical->ptCharacterList, misfitNode());
    {
        Traces traces;
        const qvsCtxPxPhysical *copy = qvsClientProvCtxVerifyContextPxPhysical(physical);
        ASSERT_NE(copy, nullptr);
        EXPECT_NE(copy->ptPort, nullptr);
        EXPECT_EQ(traces.texts, kMisfit);
    }
    auto address = withLists<qvsWapAppAddr>({3});
    add(&address->ptCharacterList, portNode());
    add(&address->ptCharacterList, misfitNode());
    Traces traces;
    const qvsCtxAppAddr *copy = qvsClientProvCtxVerifyContextAppAddr(address);
    ASSERT_NE(copy, nullptr);
    EXPECT_NE(copy->ptPort, nullptr);
    EXPECT_EQ(traces.texts, kMisfit);
}

// ---- What the copies leave out, and what they hold twice

TEST(Kept, context_pxlogical_twelfth)
{
    Sweep sweep;
    qvsWapPxLogical record{};
    char text11[] = "11";
    char text12[] = "12";
    char text13[] = "13";
    record.pszReserved3 = text11;
    record.pszReserved4 = text12;
    record.pszReserved5 = text13;
    const qvsCtxPxLogical *copy = qvsClientProvCtxVerifyContextPxLogical(&record);
    ASSERT_NE(copy, nullptr);
    EXPECT_STREQ(copy->pszReserved3, "11");
    EXPECT_EQ(copy->pszReserved4, nullptr);
    EXPECT_STREQ(copy->pszReserved5, "13");
}

TEST(Kept, context_from_twice)
{
    blocks::BlockCheck check;
    qvsWapApplication record{};
    char from[] = "from";
    record.pszFrom = from;
    const std::set<void *> before = blocks::all();
    qvsCtxApplication *copy = qvsClientProvCtxVerifyContextApplication(&record);
    ASSERT_NE(copy, nullptr);
    EXPECT_STREQ(copy->pszFrom, "from");
    qvsClientProvCtxDelectContextApplication(copy);
    std::vector<void *> left;
    for (void *block : blocks::all()) {
        if (before.count(block) == 0) {
            left.push_back(block);
        }
    }
    ASSERT_EQ(left.size(), 1u);
    EXPECT_STREQ(static_cast<char *>(left[0]), "from");
    release(left);
}

TEST(Kept, context_spare_byte)
{
    Sweep sweep;
    for (const Kind &kind : kinds()) {
        void *record = blank(kind.wapFields);
        blocks::startCounting();
        ASSERT_NE(kind.build(record), nullptr);
        EXPECT_EQ(blocks::allocations(), 1u) << kind.name;
        EXPECT_EQ(blocks::allocated(), kind.ctxFields * sizeof(void *) + 1) << kind.name;
    }

    qvsList *texts = list({""});
    const size_t before = blocks::liveBytes();
    char *copied = text("");
    const size_t textBytes = blocks::liveBytes() - before;
    qvsMemFree_debug(copied);
    blocks::startCounting();
    ASSERT_NE(qvsClientProvCtxVerifyContextDomainList(texts), nullptr);
    EXPECT_EQ(blocks::allocations(), 2u);
    EXPECT_EQ(blocks::allocated(), sizeof(qvsCtxStrNode) + 1 + textBytes);

    qvsList *document = emptyList();
    qvsClientProvCtx *root = nullptr;
    blocks::startCounting();
    ASSERT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 1u);
    EXPECT_EQ(blocks::allocated(), sizeof *root + 1);
}

// ---- Lists of texts

struct ListKind {
    const char *name;
    qvsCtxStrNode *(*build)(qvsList *texts);
};

#define LIST(name)                                                                                 \
    {                                                                                              \
#name, qvsClientProvCtxVerifyContext##name##List                                           \
    }

const ListKind kListKinds[] = {
    LIST(ToAddr),  LIST(ToProxy), LIST(PortNbr),    LIST(AppId),  LIST(Rule),
    LIST(Network), LIST(ProxyId), LIST(AuthEntity), LIST(Bearer), LIST(DnsAddr),
    LIST(ToNapId), LIST(Service), LIST(Domain),
};

void PrintTo(const ListKind &kind, std::ostream *out)
{
    *out << kind.name;
}

class ContextList : public testing::TestWithParam<ListKind> {
protected:
    Sweep sweep;
};

INSTANTIATE_TEST_SUITE_P(Kinds, ContextList, testing::ValuesIn(kListKinds),
                         [](const auto &row) { return std::string(row.param.name); });

TEST_P(ContextList, TracesNull)
{
    Traces traces;
    EXPECT_EQ(GetParam().build(nullptr), nullptr);
    EXPECT_EQ(traces.texts, Strings{kMissingList});
}

TEST_P(ContextList, CopiesTextsInOrder)
{
    qvsList *texts = list({"one", "", "three", "four"});
    texts->ptCursor = texts->ptFirst->ptNext; // the build starts at the first all the same
    Traces traces;
    const qvsCtxStrNode *copy = GetParam().build(texts);
    EXPECT_EQ(textsOf(copy), (Texts{"one", "", "three", "four"}));
    EXPECT_NE(copy->pszValue, texts->ptFirst->pItem);
    EXPECT_EQ(traces.texts, Strings{});
}

TEST_P(ContextList, AnswersNullForNoText)
{
    qvsList *texts = emptyList();
    qvsListNode elsewhere = {};
    texts->ptCursor = &elsewhere;
    Traces traces;
    EXPECT_EQ(GetParam().build(texts), nullptr);
    EXPECT_EQ(traces.texts, Strings{});
    EXPECT_EQ(texts->ptCursor, nullptr);
}

TEST_P(ContextList, EndsWithoutMemoryForANode)
{
    qvsList *texts = list({"one", "two", "three"});
    blocks::failAt = 2; // node, text, node
    const qvsCtxStrNode *copy = GetParam().build(texts);
    blocks::reset();
    EXPECT_EQ(textsOf(copy), Texts{"one"});
    // Behind the text that was read for it.
    EXPECT_EQ(texts->ptCursor, texts->ptFirst->ptNext->ptNext);
    blocks::failAt = 0;
    EXPECT_EQ(GetParam().build(texts), nullptr);
    blocks::reset();
    EXPECT_EQ(texts->ptCursor, texts->ptFirst->ptNext);
}

TEST_P(ContextList, GoesOnWithoutMemoryForAText)
{
    qvsList *texts = list({"one", "two", "three"});
    blocks::failAt = 3; // node, text, node, text
    const qvsCtxStrNode *copy = GetParam().build(texts);
    blocks::reset();
    EXPECT_EQ(textsOf(copy), (Texts{"one", std::nullopt, "three"}));
}

TEST(ContextLists, EndAtAnItemWithoutAText)
{
    blocks::BlockCheck check;
    qvsList *texts = list({"a", "b", "c"});
    qvsMemFree_debug(texts->ptFirst->ptNext->pItem);
    texts->ptFirst->ptNext->pItem = nullptr;
    qvsCtxStrNode *copy = qvsClientProvCtxVerifyContextServiceList(texts);
    ASSERT_EQ(textsOf(copy).size(), 1U);
    EXPECT_EQ(textsOf(copy)[0], "a");
    // Behind that item, as a reader of the list would be.
    EXPECT_EQ(texts->ptCursor, texts->ptFirst->ptNext->ptNext);
    qvsClientProvCtxDelectContextServiceList(copy);
    EXPECT_EQ(qvsListDeleteNodeAllAndList(texts, nullptr), QVS_OK);
}

TEST(ContextLists, TakeAnyLength)
{
    blocks::BlockCheck check;
    constexpr size_t kMany = 200000;
    qvsList *texts = list(Strings(kMany, "x"));
    onSmallStack([&] {
        qvsCtxStrNode *copy = qvsClientProvCtxVerifyContextServiceList(texts);
        EXPECT_EQ(textsOf(copy).size(), kMany);
        qvsClientProvCtxDelectContextServiceList(copy);
    });
    EXPECT_EQ(qvsListDeleteNodeAllAndList(texts, nullptr), QVS_OK);
}

} // namespace
