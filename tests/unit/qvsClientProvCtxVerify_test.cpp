// Which characteristics of a document reach the context, and where.
#include "qvsClientProvCtx.h"

#include "support/blocks.h"
#include "support/records.h"
#include "support/traces.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

using namespace records;

namespace {

constexpr size_t kSlots = 18;
constexpr char kMissingList[] = "[Syncml] ERROR : DM = fffff00c\n";
const Strings kMisfit = {"[WARNING] Not Support Context\n", "[Syncml] ERROR : 1\n"};

// A record of the tree of any kind, with nothing but a text in its first field.
constexpr size_t kAnyRecord = 40;

// A characteristic whose record has a first text. In ACCESS the first field is a list.
qvsWapCharacter *holder(size_t slot, const std::string &value)
{
    void *record = blank(kAnyRecord);
    constexpr size_t kAccess = 15;
    set(record, 1, slot == kAccess ? static_cast<void *>(list({value})) : text(value));
    return node(slot, record);
}

// A characteristic with a record in every slot from `first` on.
qvsWapCharacter *fullHolder(size_t first = 1)
{
    qvsWapCharacter *made = blank<qvsWapCharacter>();
    for (size_t slot = first; slot <= kSlots; ++slot) {
        set(made, slot, blank(kAnyRecord));
    }
    return made;
}

// The first texts of the records of a chain, whose ptNext is the field `next`.
Strings firstTexts(const void *chain, size_t next)
{
    Strings out;
    for (; chain; chain = get(chain, next)) {
        out.push_back(static_cast<const char *>(get(chain, 1)));
    }
    return out;
}

size_t length(const void *chain, size_t next)
{
    size_t count = 0;
    for (; chain; chain = get(chain, next)) {
        ++count;
    }
    return count;
}

// The fields of a record that hold something.
Numbers setFields(const void *record, size_t fields)
{
    Numbers out;
    for (size_t field = 1; field <= fields; ++field) {
        if (get(record, field)) {
            out.push_back(field);
        }
    }
    return out;
}

// ---- Children

// A kind of child that a parent accepts: its slot, the parent's field for it, its field ptNext.
struct Child {
    size_t slot;
    size_t field;
    size_t next;
};

struct Parent {
    const char *name;
    size_t fields;
    std::vector<Child> accepted; // in the order in which they are looked for
    std::function<qvsResult(qvsList *, void *)> walk;
};

template <class Ctx>
std::function<qvsResult(qvsList *, void *)> as(qvsResult (*walk)(qvsList *, Ctx *))
{
    return [walk](qvsList *children, void *parent) {
        return walk(children, static_cast<Ctx *>(parent));
    };
}

const std::vector<Parent> &parents()
{
    static const std::vector<Parent> all = {
        {"PxLogical",
         18,
         {{2, 15, 4}, {4, 17, 11}, {3, 16, 3}},
         as(qvsClientProvCtxVerifyCharacterPxLogical)},
        {"PxPhysical", 11, {{3, 10, 3}}, as(qvsClientProvCtxVerifyCharacterPxPhysical)},
        {"NapDef", 33, {{6, 31, 6}, {7, 32, 6}}, as(qvsClientProvCtxVerifyCharacterNapDef)},
        {"Application",
         20,
         {{16, 19, 3}, {8, 16, 4}, {10, 17, 6}, {9, 18, 9}},
         as(qvsClientProvCtxVerifyCharacterApplication)},
        {"AppAddr", 4, {{3, 3, 3}}, as(qvsClientProvCtxVerifyCharacterAppAddr)},
    };
    return all;
}

void PrintTo(const Parent &parent, std::ostream *out)
{
    *out << parent.name;
}

class Children : public testing::TestWithParam<Parent> {
protected:
    const Parent &parent = GetParam();
    Sweep sweep;
};

INSTANTIATE_TEST_SUITE_P(Parents, Children, testing::ValuesIn(parents()),
                         [](const auto &row) { return std::string(row.param.name); });

TEST_P(Children, AreTakenOrRefusedByTheirKind)
{
    for (size_t slot = 1; slot <= kSlots; ++slot) {
        SCOPED_TRACE(testing::Message() << "slot " << slot);
        const auto child = std::find_if(parent.accepted.begin(), parent.accepted.end(),
                                        [slot](const Child &kind) { return kind.slot == slot; });
        void *record = blank(parent.fields);
        qvsList *children = nullptr;
        add(&children, holder(slot, "value"));
        Traces traces;
        const qvsResult result = parent.walk(children, record);
        if (child == parent.accepted.end()) {
            EXPECT_EQ(result, QVS_ERROR_FAILED);
            EXPECT_EQ(setFields(record, parent.fields), Numbers{});
            EXPECT_EQ(traces.texts, kMisfit);
        } else {
            EXPECT_EQ(result, QVS_OK);
            EXPECT_EQ(setFields(record, parent.fields), Numbers{child->field});
            EXPECT_EQ(firstTexts(get(record, child->field), child->next), Strings{"value"});
            EXPECT_FALSE(traces.has(kMisfit[0]));
        }
    }
}

// Of several records in one characteristic the first accepted kind decides.
TEST_P(Children, CountAsTheirFirstAcceptedKind)
{
    qvsWapCharacter *child = fullHolder();
    qvsList *children = nullptr;
    add(&children, child);
    for (const Child &kind : parent.accepted) {
        void *record = blank(parent.fields);
        EXPECT_EQ(parent.walk(children, record), QVS_OK);
        EXPECT_EQ(setFields(record, parent.fields), Numbers{kind.field});
        set(child, kind.slot, nullptr);
    }
    void *record = blank(parent.fields);
    EXPECT_EQ(parent.walk(children, record), QVS_ERROR_FAILED);
    EXPECT_EQ(setFields(record, parent.fields), Numbers{});
}

TEST_P(Children, KeepTheirOrder)
{
    void *record = blank(parent.fields);
    qvsList *children = nullptr;
    for (const char *value : {"1", "2", "3"}) {
        for (const Child &kind : parent.accepted) {
            add(&children, holder(kind.slot, value));
        }
    }
    children->ptCursor = nullptr;
    EXPECT_EQ(parent.walk(children, record), QVS_OK);
    EXPECT_EQ(setFields(record, parent.fields).size(), parent.accepted.size());
    for (const Child &kind : parent.accepted) {
        EXPECT_EQ(firstTexts(get(record, kind.field), kind.next), (Strings{"1", "2", "3"}));
    }
    // Others go behind those that are there.
    EXPECT_EQ(parent.walk(children, record), QVS_OK);
    for (const Child &kind : parent.accepted) {
        EXPECT_EQ(firstTexts(get(record, kind.field), kind.next),
                  (Strings{"1", "2", "3", "1", "2", "3"}));
    }
}

TEST_P(Children, MayBeNone)
{
    void *record = blank(parent.fields);
    Traces traces;
    EXPECT_EQ(parent.walk(emptyList(), record), QVS_OK);
    EXPECT_EQ(setFields(record, parent.fields), Numbers{});
    EXPECT_EQ(traces.texts, Strings{});
}

TEST_P(Children, NeedAList)
{
    void *record = blank(parent.fields);
    Traces traces;
    EXPECT_EQ(parent.walk(nullptr, record), QVS_ERROR_LIST_ARGUMENT);
    EXPECT_EQ(traces.texts, Strings{kMissingList});
}

TEST_P(Children, NeedAParentOnlyToBeAttached)
{
    qvsList *empty = emptyList();
    qvsList *misfits = nullptr;
    add(&misfits, blank<qvsWapCharacter>());
    add(&misfits, holder(parent.accepted[0].slot, "value"));
    const size_t before = blocks::live();
    {
        Traces traces;
        EXPECT_EQ(parent.walk(nullptr, nullptr), QVS_ERROR_LIST_ARGUMENT);
        EXPECT_EQ(traces.texts, Strings{kMissingList});
    }
    {
        Traces traces;
        EXPECT_EQ(parent.walk(empty, nullptr), QVS_OK);
        EXPECT_EQ(traces.texts, Strings{});
    }
    {
        Traces traces;
        EXPECT_EQ(parent.walk(misfits, nullptr), QVS_ERROR_FAILED);
        EXPECT_EQ(traces.texts,
                  (Strings{"[WARNING] Not Support Context\n", "[Syncml] ERROR : 1\n"}));
    }
    EXPECT_EQ(blocks::live(), before);
    for (const Child &kind : parent.accepted) {
        qvsList *children = nullptr;
        add(&children, holder(kind.slot, "value"));
        const size_t held = blocks::live();
        Traces traces;
        EXPECT_EQ(parent.walk(children, nullptr), QVS_ERROR_BAD_ARGUMENT);
        EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
        EXPECT_EQ(blocks::live(), held);
    }
}

TEST(Kept, context_misfit_ends_walk)
{
    Sweep sweep;
    for (const Parent &parent : parents()) {
        const Child &kind = parent.accepted[0];
        qvsList *children = nullptr;
        add(&children, holder(kind.slot, "before"));
        add(&children, blank<qvsWapCharacter>());
        add(&children, holder(kind.slot, "behind"));
        void *record = blank(parent.fields);
        Traces traces;
        EXPECT_EQ(parent.walk(children, record), QVS_ERROR_FAILED) << parent.name;
        EXPECT_EQ(firstTexts(get(record, kind.field), kind.next), Strings{"before"});
        ASSERT_GE(traces.texts.size(), 2u);
        EXPECT_EQ(Strings(traces.texts.end() - 2, traces.texts.end()), kMisfit);
    }
}

// ---- The top level

struct Top {
    size_t slot;
    size_t field; // of the root
    size_t next;
};

const std::vector<Top> kTops = {
    {1, 1, 18},  // PXLOGICAL
    {5, 2, 33},  // NAPDEF
    {12, 3, 7},  // BOOTSTRAP
    {13, 5, 4},  // VENDORCONFIG
    {11, 6, 20}, // APPLICATION
    {15, 7, 7},  // ACCESS
    {17, 8, 13}, // WIFI
    {18, 9, 2},  // VOWIFI
};
constexpr size_t kClientIdentitySlot = 14;
constexpr size_t kClientIdentField = 4;
constexpr size_t kRootFields = 9;

class ContextTop : public testing::Test {
protected:
    // The context of the characteristics that were added.
    qvsClientProvCtx *verify()
    {
        qvsClientProvCtx *root = nullptr;
        EXPECT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
        return root;
    }

    Sweep sweep;
    qvsList *document = emptyList();
};

TEST_F(ContextTop, TakesEachKindToItsChain)
{
    for (const Top &kind : kTops) {
        document = list({});
        add(&document, holder(kind.slot, "value"));
        const qvsClientProvCtx *root = verify();
        EXPECT_EQ(setFields(root, kRootFields), Numbers{kind.field}) << "slot " << kind.slot;
        EXPECT_EQ(length(get(root, kind.field), kind.next), 1u);
    }
    document = list({});
    add(&document, holder(kClientIdentitySlot, "value"));
    const qvsClientProvCtx *root = verify();
    EXPECT_EQ(setFields(root, kRootFields), Numbers{kClientIdentField});
    EXPECT_STREQ(root->ptClientIdent->pszClientId, "value");
}

TEST_F(ContextTop, TakesAllKindsOfOneCharacteristic)
{
    add(&document, fullHolder());
    const qvsClientProvCtx *root = verify();
    EXPECT_EQ(setFields(root, kRootFields), range(1, kRootFields));
    for (const Top &kind : kTops) {
        EXPECT_EQ(length(get(root, kind.field), kind.next), 1u) << "slot " << kind.slot;
    }
}

TEST_F(ContextTop, TakesThemInTheirOrder)
{
    add(&document, fullHolder());
    Numbers order;
    for (long n = 1; order.size() < kRootFields && n < 1000; ++n) {
        blocks::failFromThenOn = true;
        blocks::failAt = n; // behind the root
        const qvsClientProvCtx *root = verify();
        blocks::reset();
        for (const size_t field : setFields(root, kRootFields)) {
            if (std::find(order.begin(), order.end(), field) == order.end()) {
                order.push_back(field);
            }
        }
    }
    blocks::failFromThenOn = false;
    EXPECT_EQ(order, (Numbers{1, 2, 3, 4, 5, 8, 9, 6, 7}));
}

TEST_F(ContextTop, KeepsTheOrder)
{
    for (const char *value : {"1", "2", "3"}) {
        for (const Top &kind : kTops) {
            add(&document, holder(kind.slot, value));
        }
    }
    document->ptCursor = nullptr;
    const qvsClientProvCtx *root = verify();
    for (const Top &kind : kTops) {
        const void *chain = get(root, kind.field);
        if (kind.field == 7) {
            EXPECT_EQ(length(chain, kind.next), 3u);
            Strings rules;
            for (const qvsCtxAccess *access = root->ptAccess; access; access = access->ptNext) {
                rules.push_back(access->ptRule->pszValue);
            }
            EXPECT_EQ(rules, (Strings{"1", "2", "3"}));
        } else {
            EXPECT_EQ(firstTexts(chain, kind.next), (Strings{"1", "2", "3"})) << kind.slot;
        }
    }
}

TEST_F(ContextTop, MayBeEmpty)
{
    Traces traces;
    const qvsClientProvCtx *root = verify();
    ASSERT_NE(root, nullptr);
    EXPECT_EQ(setFields(root, kRootFields), Numbers{});
    EXPECT_EQ(traces.texts, Strings{});
}

TEST_F(ContextTop, NeedsAListAndARoot)
{
    qvsClientProvCtx stale{};
    qvsClientProvCtx *root = &stale;
    {
        Traces traces;
        EXPECT_EQ(qvsClientProvCtxVerifyContext(nullptr, &root), QVS_ERROR_BAD_ARGUMENT);
        EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
        EXPECT_EQ(root, &stale);
    }
    add(&document, holder(1, "value"));
    const size_t before = blocks::live();
    Traces traces;
    EXPECT_EQ(qvsClientProvCtxVerifyContext(document, nullptr), QVS_ERROR_BAD_ARGUMENT);
    EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
    EXPECT_EQ(blocks::live(), before);
}

TEST_F(ContextTop, StoresNothingWithoutMemory)
{
    qvsClientProvCtx stale{};
    qvsClientProvCtx *root = &stale;
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_ERROR_FAILED);
    blocks::reset();
    EXPECT_EQ(root, &stale);
    EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 1\n"});
}

TEST_F(ContextTop, TriesTheNextClientIdentityWithoutMemoryForTheFirst)
{
    add(&document, holder(kClientIdentitySlot, "first"));
    add(&document, holder(kClientIdentitySlot, "second"));
    blocks::failAt = 1; // root, record
    const qvsClientProvCtx *root = verify();
    blocks::reset();
    ASSERT_NE(root->ptClientIdent, nullptr);
    EXPECT_STREQ(root->ptClientIdent->pszClientId, "second");
}

TEST(Kept, context_second_clientidentity)
{
    Sweep sweep;
    qvsList *document = nullptr;
    add(&document, holder(kClientIdentitySlot, "first"));
    add(&document, fullHolder());
    add(&document, holder(13, "behind"));
    Traces traces;
    qvsClientProvCtx *root = nullptr;
    ASSERT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
    EXPECT_STREQ(root->ptClientIdent->pszClientId, "first");
    // PXLOGICAL, NAPDEF and BOOTSTRAP of the second one, and the next characteristic.
    EXPECT_EQ(setFields(root, kRootFields), (Numbers{1, 2, 3, 4, 5}));
    EXPECT_EQ(firstTexts(root->ptVendorConfig, 4), Strings{"behind"});
    EXPECT_EQ(std::count(traces.texts.begin(), traces.texts.end(),
                         "[WARNING] Already Have ClientIdent Context\n"),
              1);
}

TEST(Kept, context_top_level_dropped)
{
    Sweep sweep;
    for (size_t slot : {2, 3, 4, 6, 7, 8, 9, 10, 16}) {
        qvsList *document = nullptr;
        add(&document, holder(slot, "value"));
        Traces traces;
        qvsClientProvCtx *root = nullptr;
        ASSERT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
        EXPECT_EQ(setFields(root, kRootFields), Numbers{}) << "slot " << slot;
        EXPECT_EQ(traces.texts, Strings{});
    }
}

TEST(Kept, context_null_linked)
{
    Sweep sweep;
    qvsList *document = nullptr;
    for (const char *value : {"1", "2", "3"}) {
        add(&document, holder(5, value));
    }
    qvsClientProvCtx *root = nullptr;
    blocks::failAt = 3; // root, record, text, record
    ASSERT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
    blocks::reset();
    EXPECT_EQ(firstTexts(root->ptNapDef, 33), (Strings{"1", "3"}));
    blocks::failAt = 1;
    ASSERT_EQ(qvsClientProvCtxVerifyContext(document, &root), QVS_OK);
    blocks::reset();
    EXPECT_EQ(firstTexts(root->ptNapDef, 33), (Strings{"2", "3"}));
}

// ---- A whole document

// Every kind where it belongs, with texts, lists and children. No FROM: its first copy stays.
qvsWapDoc *wholeDocument()
{
    auto document = blank<qvsWapDoc>();
    auto port = [] {
        auto record = blank<qvsWapPort>();
        record->pszPortNbr = text("9201");
        record->ptServiceList = list({"wsp", "wap"});
        return node(3, record);
    };
    for (int i = 0; i < 2; ++i) {
        auto logical = blank<qvsWapPxLogical>();
        logical->pszProxyId = text("proxy");
        logical->pszReserved4 = text("never copied");
        logical->ptDomainList = list({"a.example", "b.example"});
        auto physical = blank<qvsWapPxPhysical>();
        physical->pszPxAddr = text("192.0.2.1");
        physical->ptToNapIdList = list({"nap"});
        physical->ptDomainList = list({"c.example"});
        add(&physical->ptCharacterList, port());
        add(&physical->ptCharacterList, port());
        add(&logical->ptCharacterList, node(4, physical));
        auto login = blank<qvsWapPxAuthInfo>();
        login->pszPxAuthId = text("id");
        add(&logical->ptCharacterList, node(2, login));
        add(&logical->ptCharacterList, port());
        add(&document->ptCharacterList, node(1, logical));
    }
    auto nap = blank<qvsWapNapDef>();
    nap->pszNapId = text("nap");
    nap->ptBearerList = list({"GSM-GPRS"});
    nap->ptDnsAddrList = list({"192.0.2.2"});
    auto login = blank<qvsWapNapAuthInfo>();
    login->pszAuthType = text("PAP");
    login->ptAuthEntityList = list({"entity"});
    add(&nap->ptCharacterList, node(6, login));
    auto validity = blank<qvsWapValidity>();
    validity->pszSid = text("1");
    add(&nap->ptCharacterList, node(7, validity));
    add(&document->ptCharacterList, node(5, nap));
    auto application = blank<qvsWapApplication>();
    application->pszAppId = text("w2");
    application->ptToProxyList = list({"proxy"});
    application->ptToNapIdList = list({"nap"});
    application->ptAddrList = list({"d.example"});
    auto address = blank<qvsWapAppAddr>();
    address->pszAddr = text("192.0.2.3");
    add(&address->ptCharacterList, port());
    add(&application->ptCharacterList, node(8, address));
    auto auth = blank<qvsWapAppAuth>();
    auth->pszAAuthLevel = text("APPSRV");
    add(&application->ptCharacterList, node(10, auth));
    auto resource = blank<qvsWapResource>();
    resource->pszUri = text("uri");
    add(&application->ptCharacterList, node(9, resource));
    add(&application->ptCharacterList, node(14, blank<qvsWapClientIdentity>()));
    add(&document->ptCharacterList, node(11, application));
    auto bootstrap = blank<qvsWapBootstrap>();
    bootstrap->pszName = text("name");
    bootstrap->ptProxyIdList = list({"proxy"});
    bootstrap->ptNetworkList = list({"network"});
    add(&document->ptCharacterList, node(12, bootstrap));
    auto vendor = blank<qvsWapVendorConfig>();
    vendor->pszName = text("vendor");
    add(&document->ptCharacterList, node(13, vendor));
    for (const char *value : {"first", "second"}) {
        auto client = blank<qvsWapClientIdentity>();
        client->pszClientId = text(value);
        add(&document->ptCharacterList, node(14, client));
    }
    auto access = blank<qvsWapAccess>();
    access->ptRuleList = list({"1"});
    access->ptToProxyList = list({"proxy"});
    add(&document->ptCharacterList, node(15, access));
    auto voWifi = blank<qvsWapVoWifi>();
    voWifi->pszEpdgFqdn = text("epdg.example");
    add(&document->ptCharacterList, node(18, voWifi));
    return document;
}

TEST(WholeDocument, LeavesNothingBehind)
{
    blocks::BlockCheck check;
    qvsWapDoc *document = wholeDocument();
    qvsClientProvCtx *context = qvsClientProvCtxMakeContext(document);
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
    ASSERT_NE(context, nullptr);
    EXPECT_STREQ(
        context->ptPxLogical->ptNext->ptPxPhysical->ptPort->ptNext->ptService->ptNext->pszValue,
        "wap");
    EXPECT_STREQ(context->ptApplication->ptAppAddr->ptPort->ptService->pszValue, "wsp");
    EXPECT_STREQ(context->ptClientIdent->pszClientId, "first");
    qvsClientProvCtxDelectContext(context);
}

TEST(WholeDocument, SurvivesEveryFailure)
{
    blocks::BlockCheck check;
    qvsWapDoc *document = wholeDocument();
    const auto attempt = [&] {
        if (qvsClientProvCtx *context = qvsClientProvCtxMakeContext(document)) {
            qvsClientProvCtxDelectContext(context);
        }
    };
    EXPECT_GT(blocks::failEach(attempt), 80);
    EXPECT_GT(blocks::failEachFrom(attempt), 80);
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
}

// ---- Length costs no stack

TEST(LongChains, AreBuiltAndReleased)
{
    blocks::BlockCheck check;
    constexpr size_t kMany = 200000;
    auto document = blank<qvsWapDoc>();
    auto logical = blank<qvsWapPxLogical>();
    for (size_t i = 0; i < kMany; ++i) {
        addFirst(&document->ptCharacterList, node(18, blank<qvsWapVoWifi>()));
        if (i % 4 == 0) {
            addFirst(&logical->ptCharacterList, node(2, blank<qvsWapPxAuthInfo>()));
        }
    }
    addFirst(&document->ptCharacterList, node(1, logical));
    onSmallStack([&] {
        qvsClientProvCtx *root = qvsClientProvCtxMakeContext(document);
        EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
        ASSERT_NE(root, nullptr);
        EXPECT_EQ(length(root->ptVoWifi, 2), kMany);
        EXPECT_EQ(length(root->ptPxLogical->ptPxAuthInfo, 4), kMany / 4);
        qvsClientProvCtxDelectContext(root);
    });
}

} // namespace
