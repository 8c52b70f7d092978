// The provisioning context: made from a document, and released.
#include "qvsClientProvCtx.h"

#include "support/blocks.h"
#include "support/records.h"
#include "support/traces.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

using namespace records;

namespace {

// ---- What the releases let go, by the numbers of the fields

struct Kind {
    const char *name;
    size_t fields;
    Numbers texts;  // in the order of their release
    Numbers chains; // behind them, in theirs
    Numbers left;
    bool linked; // its last field is ptNext
    std::function<void(void *)> release;
};

template <class Record>
std::function<void(void *)> as(void (*release)(Record *record))
{
    return [release](void *record) { release(static_cast<Record *>(record)); };
}

Kind textList(const char *name, void (*release)(qvsCtxStrNode *node))
{
    return {name, 2, {1}, {}, {}, true, as(release)};
}

#define OF(name) as(qvsClientProvCtxDelectContext##name)

const std::vector<Kind> &kinds()
{
    static const std::vector<Kind> all = {
        {"Port", 3, {1}, {2}, {}, true, OF(Port)},
        {"NapAuthInfo", 6, range(1, 4), {5}, {}, true, OF(NapAuthInfo)},
        {"Validity", 6, range(1, 5), {}, {}, true, OF(Validity)},
        {"AppAddr", 4, {1, 2}, {3}, {}, true, OF(AppAddr)},
        {"AppAuth", 6, {5, 1, 3, 4, 2}, {}, {}, true, OF(AppAuth)},
        {"Resource", 9, {3, 7, 5, 6, 4, 2, 8, 1}, {}, {}, true, OF(Resource)},
        {"PxAuthInfo", 4, range(1, 3), {}, {}, true, OF(PxAuthInfo)},
        {"PxPhysical", 11, range(1, 7), {9, 8, 10}, {}, true, OF(PxPhysical)},
        {"Access", 7, {}, {2, 4, 3, 1, 5, 6}, {}, true, OF(Access)},
        {"Application",
         20,
         {5, 1, 6, 4, 2, 3, 7},
         {15, 14, 13, 16, 17, 18},
         {8, 9, 10, 11, 12, 19},
         true,
         OF(Application)},
        {"Bootstrap", 7, {4, 2, 1, 3}, {6, 5}, {}, true, OF(Bootstrap)},
        {"ClientIdent", 1, {1}, {}, {}, false, OF(ClientIdent)},
        {"NapDef", 33, range(1, 27), {29, 30, 31, 32}, {28}, true, OF(NapDef)},
        {"PxLogical", 18, range(1, 13), {14, 16, 15, 17}, {}, true, OF(PxLogical)},
        {"VenderConfig", 4, range(1, 3), {}, {}, true, OF(VenderConfig)},
        {"Wifi", 13, range(1, 12), {}, {}, true, OF(Wifi)},
        {"VoWifi", 2, {1}, {}, {}, true, OF(VoWifi)},
        {"Context", 9, {}, {7, 6, 3, 4, 2, 1, 5, 9}, {8}, false, as(qvsClientProvCtxDelectContext)},
        textList("RuleList", qvsClientProvCtxDelectContextRuleList),
        textList("AppIdList", qvsClientProvCtxDelectContextAppIdList),
        textList("PortNbrList", qvsClientProvCtxDelectContextPortNbrList),
        textList("DomainList", qvsClientProvCtxDelectContextDomainList),
        textList("ToNapIdList", qvsClientProvCtxDelectContextToNapIdList),
        textList("ToProxyList", qvsClientProvCtxDelectContextToProxyList),
        textList("ToAddrList", qvsClientProvCtxDelectContextToAddrList),
        textList("ServiceList", qvsClientProvCtxDelectContextServiceList),
        textList("NetworkList", qvsClientProvCtxDelectContextNetworkList),
        textList("ProxyIdList", qvsClientProvCtxDelectContextProxyIdList),
        textList("DnsAddrList", qvsClientProvCtxDelectContextDnsAddrList),
        textList("BearerList", qvsClientProvCtxDelectContextBearerList),
        textList("AuthEntityList", qvsClientProvCtxDelectContextAuthEntityList),
    };
    return all;
}

std::vector<Kind> linkedKinds()
{
    std::vector<Kind> some;
    for (const Kind &kind : kinds()) {
        if (kind.linked) {
            some.push_back(kind);
        }
    }
    return some;
}

void PrintTo(const Kind &kind, std::ostream *out)
{
    *out << kind.name;
}

std::string nameOf(const testing::TestParamInfo<Kind> &row)
{
    return row.param.name;
}

// A record of any kind without anything in it, as the head of a chain.
constexpr size_t kAnyRecord = 40;

class ContextRelease : public testing::TestWithParam<Kind> {
protected:
    const Kind &kind = GetParam();

    // Puts something of its own into the fields, and answers the names in the order given.
    Strings fill(Names *names, void *record, const std::string &name, const Numbers &fields)
    {
        Strings order;
        for (size_t field : fields) {
            order.push_back(name + "." + std::to_string(field));
            const bool heads =
                std::find(kind.chains.begin(), kind.chains.end(), field) != kind.chains.end();
            set(record, field,
                (*names)(order.back(),
                         heads ? blank(kAnyRecord) : static_cast<void *>(text("value"))));
        }
        return order;
    }
};

INSTANTIATE_TEST_SUITE_P(Kinds, ContextRelease, testing::ValuesIn(kinds()), nameOf);

TEST_P(ContextRelease, OnlyTracesNull)
{
    blocks::BlockCheck check;
    Traces traces;
    Releases releases;
    kind.release(nullptr);
    EXPECT_TRUE(releases.order.empty());
    EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
}

// Three records with all their fields: each is emptied in turn, then the last goes first.
TEST_P(ContextRelease, FollowsItsTable)
{
    blocks::BlockCheck check;
    ASSERT_EQ(kind.fields, join({kind.texts, kind.chains, kind.left}).size() + kind.linked);
    Names names;
    Strings expected;
    std::vector<void *> left;
    void *first = nullptr;
    void *last = nullptr;
    const size_t count = kind.linked ? 3 : 1;
    for (size_t i = 1; i <= count; ++i) {
        const std::string name = "record " + std::to_string(i);
        void *record = names(name, blank(kind.fields));
        const Strings part = fill(&names, record, name, join({kind.texts, kind.chains}));
        expected.insert(expected.end(), part.begin(), part.end());
        fill(&names, record, name, kind.left);
        for (size_t field : kind.left) {
            left.push_back(get(record, field));
        }
        if (last) {
            set(last, kind.fields, record);
        } else {
            first = record;
        }
        last = record;
    }
    for (size_t i = count; i > 0; --i) {
        expected.push_back("record " + std::to_string(i));
    }

    Strings order;
    {
        Traces traces;
        Releases releases;
        kind.release(first);
        order = names.of(releases.order);
        EXPECT_EQ(traces.texts, Strings{}); // no release was given null
    }
    EXPECT_EQ(order, expected);
    for (void *block : left) {
        EXPECT_STREQ(static_cast<char *>(block), "value");
    }
    release(left);
}

TEST_P(ContextRelease, ClearsTheTextsThatItReleases)
{
    blocks::BlockCheck check;
    void *record = blank(kind.fields);
    for (size_t field : kind.texts) {
        set(record, field, text("value"));
    }
    size_t cleared = 0;
    blocks::onRelease = [&](const void *block) {
        if (block == record) {
            for (size_t field : kind.texts) {
                cleared += get(record, field) == nullptr;
            }
        }
    };
    kind.release(record);
    blocks::onRelease = nullptr;
    EXPECT_EQ(cleared, kind.texts.size());
}

TEST_P(ContextRelease, TakesPartlyFilledRecords)
{
    blocks::BlockCheck check;
    for (size_t field : join({kind.texts, kind.chains})) {
        Names names;
        void *record = names("record", blank(kind.fields));
        Strings expected = fill(&names, record, "record", {field});
        expected.push_back("record");
        Releases releases;
        kind.release(record);
        EXPECT_EQ(names.of(releases.order), expected) << "field " << field;
    }
    Names names;
    void *record = names("record", blank(kind.fields));
    Traces traces;
    Releases releases;
    kind.release(record);
    EXPECT_EQ(names.of(releases.order), Strings{"record"});
    EXPECT_EQ(traces.texts, Strings{});
}

class ChainRelease : public testing::TestWithParam<Kind> {};

INSTANTIATE_TEST_SUITE_P(Kinds, ChainRelease, testing::ValuesIn(linkedKinds()), nameOf);

void releaseLong(const Kind &kind, unsigned length)
{
    blocks::BlockCheck check;
    void *first = nullptr;
    for (unsigned i = 0; i < length; ++i) {
        void *record = blank(kind.fields);
        set(record, kind.fields, first);
        first = record;
    }
    onSmallStack([&] { kind.release(first); });
}

TEST_P(ChainRelease, TakesAnyLength)
{
    releaseLong(GetParam(), 20000);
}

TEST(ContextReleases, TakeAnyLength)
{
    releaseLong(kinds().front(), 200000);
    releaseLong(kinds().back(), 200000);
}

// ---- A chain that hangs from a record is released whole, with all that hangs from it.

TEST(ContextReleases, ReachEverythingBelow)
{
    blocks::BlockCheck check;
    auto root = blank<qvsClientProvCtx>();
    for (int i = 0; i < 2; ++i) {
        auto logical = blank<qvsCtxPxLogical>();
        logical->ptNext = root->ptPxLogical;
        root->ptPxLogical = logical;
        for (int j = 0; j < 2; ++j) {
            auto physical = blank<qvsCtxPxPhysical>();
            physical->ptNext = logical->ptPxPhysical;
            logical->ptPxPhysical = physical;
            for (int k = 0; k < 2; ++k) {
                auto port = blank<qvsCtxPort>();
                port->pszPortNbr = text("9201");
                port->ptNext = physical->ptPort;
                physical->ptPort = port;
                auto service = blank<qvsCtxStrNode>();
                service->pszValue = text("CO-WSP");
                port->ptService = service;
            }
        }
    }
    qvsClientProvCtxDelectContext(root);
}

// ---- From a document

TEST(ContextMaking, TracesAMissingDocument)
{
    blocks::BlockCheck check;
    Traces traces;
    EXPECT_EQ(qvsClientProvCtxMakeContext(nullptr), nullptr);
    EXPECT_EQ(traces.texts, Strings{"[Syncml] ERROR : 2\n"});
}

TEST(ContextMaking, TracesADocumentWithoutList)
{
    blocks::BlockCheck check;
    qvsWapDoc document{};
    Traces traces;
    EXPECT_EQ(qvsClientProvCtxMakeContext(&document), nullptr);
    EXPECT_EQ(traces.texts, (Strings{"[Syncml] ERROR : 2\n", "[Syncml] ERROR : 2\n"}));
}

TEST(ContextMaking, CopiesTheDocument)
{
    blocks::BlockCheck check;
    auto document = blank<qvsWapDoc>();
    auto proxy = blank<qvsWapPxLogical>();
    proxy->pszProxyId = text("proxy");
    add(&document->ptCharacterList, node(1, proxy));
    Traces traces;
    qvsClientProvCtx *context = qvsClientProvCtxMakeContext(document);
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
    ASSERT_NE(context, nullptr);
    ASSERT_NE(context->ptPxLogical, nullptr);
    EXPECT_STREQ(context->ptPxLogical->pszProxyId, "proxy");
    qvsClientProvCtxDelectContext(context);
}

TEST(ContextMaking, SurvivesAMissingRoot)
{
    blocks::BlockCheck check;
    auto document = blank<qvsWapDoc>();
    document->ptCharacterList = emptyList();
    {
        Traces traces;
        blocks::failAt = 0;
        EXPECT_EQ(qvsClientProvCtxMakeContext(document), nullptr);
        blocks::reset();
        EXPECT_EQ(traces.texts, (Strings{"[Syncml] ERROR : 1\n", "[Syncml] ERROR : 1\n"}));
    }
    EXPECT_EQ(qvsClientProvWbxmlDeleteWapDoc(document), 1u);
}

// ---- What stays

TEST(Kept, context_wifi_left)
{
    blocks::BlockCheck check;
    auto root = blank<qvsClientProvCtx>();
    auto wifi = root->ptWifi = blank<qvsCtxWifi>();
    wifi->pszNetSsid = text("net");
    const size_t before = blocks::live();
    qvsClientProvCtxDelectContext(root);
    EXPECT_EQ(blocks::live(), before - 1); // the root alone
    EXPECT_STREQ(wifi->pszNetSsid, "net");
    qvsClientProvCtxDelectContextWifi(wifi);
}

TEST(Kept, context_napdef_skipped)
{
    blocks::BlockCheck check;
    auto root = blank<qvsClientProvCtx>();
    auto first = blank<qvsCtxNapDef>();
    first->pszNapId = text("first");
    first->ptNext = blank<qvsCtxNapDef>();
    root->ptNapDef = first->ptNext;
    const size_t before = blocks::live();
    qvsClientProvCtxDelectContext(root);
    EXPECT_EQ(blocks::live(), before - 2); // the root and the second record
    EXPECT_STREQ(first->pszNapId, "first");
    first->ptNext = nullptr;
    qvsClientProvCtxDelectContextNapDef(first);
}

TEST(Kept, context_application_left)
{
    blocks::BlockCheck check;
    auto record = blank<qvsCtxApplication>();
    auto roaming = record->ptRoaming = blank<qvsCtxRoaming>();
    const std::vector<void *> left = {
        record->pszXcapAuidDcs = text("dcs"),     record->pszXcapAuidPms = text("pms"),
        record->pszXcapAuidCdms = text("cdms"),   record->pszXcapImeiHeader = text("imei"),
        record->pszXcapTidHeader = text("tid"),   roaming->pszSyncAllowed = text("1"),
        roaming->ptNext = blank<qvsCtxRoaming>(), roaming,
    };
    const size_t before = blocks::live();
    qvsClientProvCtxDelectContextApplication(record);
    EXPECT_EQ(blocks::live(), before - 1); // the record alone
    EXPECT_STREQ(static_cast<char *>(left[0]), "dcs");
    EXPECT_STREQ(static_cast<char *>(left[4]), "tid");
    EXPECT_STREQ(roaming->pszSyncAllowed, "1");
    release(left);
}

TEST(Kept, context_init_left)
{
    blocks::BlockCheck check;
    auto record = blank<qvsCtxNapDef>();
    char *init = record->pszInit = text("empty");
    const size_t before = blocks::live();
    qvsClientProvCtxDelectContextNapDef(record);
    EXPECT_EQ(blocks::live(), before - 1); // the record alone
    EXPECT_STREQ(init, "empty");
    release({init});
}

} // namespace
