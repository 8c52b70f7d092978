// All queries over one large context, with every combination of indexes, and without a context;
// and what the virtual machine sees of them.
#include "support/handmade.h"

#include <climits>

namespace {

using fakevm::Answer;
using fakevm::Array;
using fakevm::Native;
using handmade::Context;
using handmade::LoadedVm;

using Indexes = std::vector<jint>;

Indexes operator+(Indexes path, jint index)
{
    path.push_back(index);
    return path;
}

// A context with chains and lists of several lengths, and every answer that it must give. Records
// are numbered from 1; those with an even number have nothing below them.
struct Everything {
    Everything()
    {
        for (jint p : records("qvomacp_GetPxLogicalCount", {}, 3)) {
            addProxy(p);
        }
        for (jint n : records("qvomacp_GetPxNapDefCount", {}, 3)) {
            addNapDef(n);
        }
        for (jint a : records("qvomacp_GetPxApplicationCount", {}, 3)) {
            addApplication(a);
        }
        addOthers();
    }

    Context context;
    std::map<std::string_view, std::map<Indexes, Answer>> answers;

    // The indexes of `size` records, of which a native answers the count.
    Indexes records(const char *count, const Indexes &path, jint size)
    {
        answers[count][path] = {.number = size};
        Indexes indexes;
        for (jint i = 1; i <= size; ++i) {
            indexes.push_back(i);
        }
        return indexes;
    }

    // A text of its own for each native and path.
    static std::string name(std::string_view native, const Indexes &path)
    {
        std::string text(native);
        for (jint index : path) {
            text += '-' + std::to_string(index);
        }
        return text;
    }

    void list(qvsCtxStrNode **head, const char *count, const char *data, const Indexes &path,
              jint size)
    {
        for (jint d : records(count, path, size)) {
            context.add(head, name(data, path + d));
            answers[data][path + d] = {.text = name(data, path + d)};
        }
    }

    // Fills a record and expects its fields in an array; `shown` replaces elements.
    template <class Record>
    void fields(Record *record, const char *data, const Indexes &path, size_t size,
                const std::map<size_t, fakevm::Text> &shown = {})
    {
        context.fill(record, size, name(data, path));
        Array array;
        for (size_t field = 1; field <= size; ++field) {
            const auto known = shown.find(field - 1);
            array.push_back(known != shown.end() ? known->second
                                                 : name(data, path) + '.' + std::to_string(field));
        }
        array.push_back(std::nullopt);
        answers[data][path] = {.array = array};
    }

    // A port; its services answer their texts, or the names of the rows.
    void port(qvsCtxPort **chain, const char *data, const char *count, const char *service,
              const Indexes &path, bool byRow)
    {
        static const char *const kRows[] = {"CL-WSP", "CO-WSP", "CL-SEC-WSP"};
        qvsCtxPort *made = context.add(chain);
        made->pszPortNbr = context.text(name(data, path));
        answers[data][path] = {.text = name(data, path)};
        if (path.back() % 2 == 0) {
            return;
        }
        list(&made->ptService, count, service, path, 2);
        for (jint s = 1; byRow && s <= 2; ++s) {
            answers[service][path + s] = {.text = kRows[s]};
        }
    }

    void addProxy(jint p)
    {
        qvsCtxPxLogical *proxy = context.add(&context->ptPxLogical);
        fields(proxy, "qvomacp_GetProxyData", {p}, 13);
        if (p % 2 == 0) {
            return;
        }
        list(&proxy->ptDomain, "qvomacp_GetPxDomainCount", "qvomacp_GetPxDomainData", {p}, p);
        for (jint d : records("qvomacp_GetPxAuthInfoCount", {p}, p + 1)) {
            fields(context.add(&proxy->ptPxAuthInfo), "qvomacp_GetPxAuthInfoData", {p, d}, 3);
        }
        for (jint t : records("qvomacp_GetPxPortCount", {p}, 3)) {
            port(&proxy->ptPort, "qvomacp_GetPxPortData", "qvomacp_GetPxPortServiceCount",
                 "qvomacp_GetPxPortServiceData", {p, t}, true);
        }
        for (jint h : records("qvomacp_GetPxPhysicalCount", {p}, 3)) {
            addPhysical(context.add(&proxy->ptPxPhysical), {p, h});
        }
    }

    void addPhysical(qvsCtxPxPhysical *physical, const Indexes &path)
    {
        fields(physical, "qvomacp_GetPxPhysicalData", path, 7, {{2, "NET_ADDR_IPV4"}});
        if (path.back() % 2 == 0) {
            return;
        }
        list(&physical->ptDomain, "qvomacp_GetPxPhysicalDomainCount",
             "qvomacp_GetPxPhsicalDomainData", path, 2);
        list(&physical->ptToNapId, "qvomacp_GetPxPhsicalNapIdCount",
             "qvomacp_GetPxPhysicalNapIdData", path, 3);
        for (jint t : records("qvomacp_GetPxPhysicalPortCount", path, 2)) {
            port(&physical->ptPort, "qvomacp_GetPxPhysicalPortData",
                 "qvomacp_GetPxPhysicalPortServiceCount", "qvomacp_GetPxPhysicalPortServiceData",
                 path + t, true);
        }
    }

    void addNapDef(jint n)
    {
        qvsCtxNapDef *napDef = context.add(&context->ptNapDef);
        fields(napDef, "qvomacp_GetPxNapDefData", {n}, 28);
        napDef->pszNapAddrType = context.text("\x89");
        (*answers["qvomacp_GetPxNapDefData"][{n}].array)[4] = "0x89";
        if (n % 2 == 0) {
            return;
        }
        list(&napDef->ptDnsAddr, "qvomacp_GetPxDnsAddrCount", "qvomacp_GetPxDnsAddrData", {n}, n);
        for (jint d : records("qvomacp_GetPxBearerCount", {n}, 2)) {
            context.add(&napDef->ptBearer, d == 1 ? "\xAB" : "\xBC");
            answers["qvomacp_GetPxBearerData"][{n, d}] = {.text = d == 1 ? "GSM-GPRS" : "WLAN"};
        }
        for (jint index : {INT_MIN, -1, 0}) { // they count for the first access point
            answers["qvomacp_GetPxBearerCount"][{index}] = {.number = 2};
        }
        for (jint a : records("qvomacp_GetPxNapAuthInfoCount", {n}, 2)) {
            qvsCtxNapAuthInfo *info = context.add(&napDef->ptNapAuthInfo);
            fields(info, "qvomacp_GetPxNapAuthInfoData", {n, a}, 4, {{0, "NONE"}});
            if (a == 1) {
                list(&info->ptAuthEntity, "qvomacp_GetPxNapAuthEntityCount",
                     "qvomacp_GetPxAuthInfopAuthEntityData", {n, a}, 2);
            }
        }
        for (jint a : records("qvomacp_GetPxNapValidityCount", {n}, 3)) {
            fields(context.add(&napDef->ptValidity), "qvomacp_GetPxValidityData", {n, a}, 5);
        }
    }

    void addApplication(jint a)
    {
        qvsCtxApplication *application = context.add(&context->ptApplication);
        fields(application, "qvomacp_GetApplicationData", {a}, 12);
        if (a % 2 == 0) {
            return;
        }
        list(&application->ptToProxy, "qvomacp_GetPxToProxyCount", "qvomacp_GetPxToProxyData", {a},
             1);
        list(&application->ptToNapId, "qvomacp_GetPxNapIdCount", "qvomacp_GetPxNapIdData", {a}, 2);
        list(&application->ptToAddr, "qvomacp_GetPxToAddrCount", "qvomacp_GetPxToAddrData", {a}, 3);
        for (jint r : records("qvomacp_GetPxAppAddrCount", {a}, 3)) {
            qvsCtxAppAddr *address = context.add(&application->ptAppAddr);
            fields(address, "qvomacp_GetPxAppAddrData", {a, r}, 2);
            if (r % 2 == 0) {
                continue;
            }
            for (jint t : records("qvomacp_GetPxAppPortCount", {a, r}, 2)) {
                port(&address->ptPort, "qvomacp_GetPxAppPortData", "qvomacp_GetPxServiceCount",
                     "qvomacp_GetPxServiceData", {a, r, t}, false);
            }
        }
        for (jint r : records("qvomacp_GetPxAppAuthCount", {a}, 2)) {
            fields(context.add(&application->ptAppAuth), "qvomacp_GetPxAppAuthData", {a, r}, 5,
                   {{0, std::nullopt}});
        }
        for (jint r : records("qvomacp_GetPxResourceCount", {a}, 2)) {
            fields(context.add(&application->ptResource), "qvomacp_GetPxResourceData", {a, r}, 8);
        }
        qvsCtxRoaming *roaming = context.add(&application->ptRoaming);
        if (a == 1) {
            fields(roaming, "qvomacp_GetPxRoamingData", {}, 2);
        }
    }

    void addOthers()
    {
        for (jint n : records("qvomacp_GetPxBootstrapCount", {}, 3)) {
            qvsCtxBootstrap *bootstrap = context.add(&context->ptBootstrap);
            fields(bootstrap, "qvomacp_GetBootstrapData", {n}, 4);
            if (n % 2 != 0) {
                list(&bootstrap->ptProxyId, "qvomacp_GetPxProxyIdCount", "qvomacp_GetPxProxyIdData",
                     {n}, 2);
                list(&bootstrap->ptNetwork, "qvomacp_GetPxNetworkCount", "qvomacp_GetPxNetworkData",
                     {n}, 3);
            }
        }
        context->ptClientIdent = context.record<qvsCtxClientIdent>();
        context->ptClientIdent->pszClientId = context.text("me");
        answers["qvomacp_GetPxClientIdentityData"][{}] = {.text = "me"};
        for (jint n : records("qvomacp_GetPxVenderConfigCount", {}, 2)) {
            fields(context.add(&context->ptVendorConfig), "qvomacp_GetPxVenderConfigData", {n}, 3);
        }
        for (jint n : records("qvomacp_GetPxCtxAccessCount", {}, 3)) {
            qvsCtxAccess *access = context.add(&context->ptAccess);
            if (n % 2 != 0) {
                list(&access->ptRule, "qvomacp_GetPxRuleCount", "qvomacp_GetPxRuleData", {n}, 1);
                list(&access->ptAppId, "qvomacp_GetPxAppIdCount", "qvomacp_GetPxAppIdData", {n}, 2);
                list(&access->ptPortNbr, "qvomacp_GetPxPortNbrCount", "qvomacp_GetPxPortNbrData",
                     {n}, 3);
                list(&access->ptDomain, "qvomacp_GetPxAccessDomainCount",
                     "qvomacp_GetPxAccessDomainData", {n}, 2);
                list(&access->ptToNapId, "qvomacp_GetPxAccessToNapIdCount",
                     "qvomacp_GetPxAccessToNapIdData", {n}, 3);
                list(&access->ptToProxy, "qvomacp_GetPxAccessToProxyCount",
                     "qvomacp_GetPxAccessToProxyData", {n}, 1);
            }
        }
        for (jint n : records("qvomacp_GetPxWifiCount", {}, 2)) {
            fields(context.add(&context->ptWifi), "qvomacp_GetPxWifiData", {n}, 12);
        }
        for (jint n : records("qvomacp_GetPxVoWifiCount", {}, 2)) {
            fields(context.add(&context->ptVoWifi), "qvomacp_GetPxVoWifiData", {n}, 1);
        }
    }
};

// Whether a native reads the context: not one of the parser, nor the one that chooses a start.
bool isQuery(const Native &native)
{
    return native.javaClass != "com/qvomacp/eng/parser/XCPCtxParser" &&
           native.name != "qvomacp_SetPxNapDefIndex";
}

// Calls `visit` with every combination of `indexes` for as many arguments as the native takes.
template <class Visit>
void forEachPath(const Native &native, const Indexes &indexes, const Visit &visit,
                 const Indexes &path = {})
{
    if (path.size() == native.indexes()) {
        visit(path);
        return;
    }
    for (jint index : indexes) {
        forEachPath(native, indexes, visit, path + index);
    }
}

TEST(Queries, AnswerEveryCombinationOfIndexes)
{
    Everything everything;
    LoadedVm vm;
    int queries = 0;
    for (const Native &native : vm.natives()) {
        if (!isQuery(native)) {
            continue;
        }
        ++queries;
        ASSERT_FALSE(everything.answers[native.name].empty()) << native.name;
        const std::map<Indexes, Answer> &known = everything.answers[native.name];
        Answer missing;
        if (native.name == "qvomacp_GetProxyData") {
            missing.array = Array(14, "");
        }
        size_t found = 0;
        forEachPath(native, {INT_MIN, -1, 0, 1, 2, 3, 4, 5, INT_MAX}, [&](const Indexes &path) {
            const auto expected = known.find(path);
            found += expected != known.end();
            ASSERT_EQ(vm.call(native, path), expected != known.end() ? expected->second : missing)
                << Everything::name(native.name, path);
        });
        EXPECT_EQ(found, known.size()) << native.name;
    }
    EXPECT_EQ(queries, 77);
}

TEST(Queries, CountTheChainThatIsTheirs)
{
    struct Count {
        const char *native;
        Indexes path;
        jint length;
    };
    Context context;
    std::vector<Count> counts;
    // Makes a chain longer than any before; answers its first record.
    const auto chain = [&](auto **head, const char *native, const Indexes &path = {}) {
        counts.push_back({native, path, static_cast<jint>(counts.size()) + 1});
        for (jint n = 0; n < counts.back().length; ++n) {
            context.add(head);
        }
        return *head;
    };
    auto *proxy = chain(&context->ptPxLogical, "qvomacp_GetPxLogicalCount");
    chain(&proxy->ptDomain, "qvomacp_GetPxDomainCount", {1});
    chain(&proxy->ptPxAuthInfo, "qvomacp_GetPxAuthInfoCount", {1});
    auto *port = chain(&proxy->ptPort, "qvomacp_GetPxPortCount", {1});
    chain(&port->ptService, "qvomacp_GetPxPortServiceCount", {1, 1});
    auto *physical = chain(&proxy->ptPxPhysical, "qvomacp_GetPxPhysicalCount", {1});
    chain(&physical->ptDomain, "qvomacp_GetPxPhysicalDomainCount", {1, 1});
    chain(&physical->ptToNapId, "qvomacp_GetPxPhsicalNapIdCount", {1, 1});
    port = chain(&physical->ptPort, "qvomacp_GetPxPhysicalPortCount", {1, 1});
    chain(&port->ptService, "qvomacp_GetPxPhysicalPortServiceCount", {1, 1, 1});
    auto *napDef = chain(&context->ptNapDef, "qvomacp_GetPxNapDefCount");
    chain(&napDef->ptDnsAddr, "qvomacp_GetPxDnsAddrCount", {1});
    chain(&napDef->ptBearer, "qvomacp_GetPxBearerCount", {1});
    auto *info = chain(&napDef->ptNapAuthInfo, "qvomacp_GetPxNapAuthInfoCount", {1});
    chain(&info->ptAuthEntity, "qvomacp_GetPxNapAuthEntityCount", {1, 1});
    chain(&napDef->ptValidity, "qvomacp_GetPxNapValidityCount", {1});
    auto *bootstrap = chain(&context->ptBootstrap, "qvomacp_GetPxBootstrapCount");
    chain(&bootstrap->ptProxyId, "qvomacp_GetPxProxyIdCount", {1});
    chain(&bootstrap->ptNetwork, "qvomacp_GetPxNetworkCount", {1});
    chain(&context->ptVendorConfig, "qvomacp_GetPxVenderConfigCount");
    auto *application = chain(&context->ptApplication, "qvomacp_GetPxApplicationCount");
    chain(&application->ptToProxy, "qvomacp_GetPxToProxyCount", {1});
    chain(&application->ptToNapId, "qvomacp_GetPxNapIdCount", {1});
    chain(&application->ptToAddr, "qvomacp_GetPxToAddrCount", {1});
    auto *address = chain(&application->ptAppAddr, "qvomacp_GetPxAppAddrCount", {1});
    port = chain(&address->ptPort, "qvomacp_GetPxAppPortCount", {1, 1});
    chain(&port->ptService, "qvomacp_GetPxServiceCount", {1, 1, 1});
    chain(&application->ptAppAuth, "qvomacp_GetPxAppAuthCount", {1});
    chain(&application->ptResource, "qvomacp_GetPxResourceCount", {1});
    auto *access = chain(&context->ptAccess, "qvomacp_GetPxCtxAccessCount");
    chain(&access->ptRule, "qvomacp_GetPxRuleCount", {1});
    chain(&access->ptAppId, "qvomacp_GetPxAppIdCount", {1});
    chain(&access->ptPortNbr, "qvomacp_GetPxPortNbrCount", {1});
    chain(&access->ptDomain, "qvomacp_GetPxAccessDomainCount", {1});
    chain(&access->ptToNapId, "qvomacp_GetPxAccessToNapIdCount", {1});
    chain(&access->ptToProxy, "qvomacp_GetPxAccessToProxyCount", {1});
    chain(&context->ptWifi, "qvomacp_GetPxWifiCount");
    chain(&context->ptVoWifi, "qvomacp_GetPxVoWifiCount");
    LoadedVm vm;
    for (const Count &count : counts) {
        EXPECT_EQ(vm.call(vm.native(count.native), count.path), Answer{.number = count.length})
            << count.native;
    }
}

TEST(Queries, AnswerZeroOrNullWithoutAContext)
{
    LoadedVm vm;
    ASSERT_EQ(ptCtx, nullptr);
    for (const Native &native : vm.natives()) {
        if (isQuery(native)) {
            forEachPath(native, {-1, 0, 1}, [&](const Indexes &path) {
                ASSERT_EQ(vm.call(native, path), Answer{}) << native.name;
                ASSERT_TRUE(vm.calls().empty()) << native.name;
            });
        }
    }
}

TEST(Queries, AnswerZeroOrNullInAnEmptyContext)
{
    Context context;
    LoadedVm vm;
    for (const Native &native : vm.natives()) {
        if (isQuery(native) && native.name != "qvomacp_GetProxyData") {
            EXPECT_EQ(vm.call(native, Indexes(native.indexes(), 1)), Answer{}) << native.name;
            EXPECT_TRUE(vm.calls().empty()) << native.name;
        }
    }
}

// The calls that a native makes to build an array of these elements.
std::vector<std::string> callsOfArray(const Array &array)
{
    std::vector<std::string> calls = {"FindClass", "NewStringUTF", "NewObjectArray",
                                      "DeleteLocalRef", "DeleteLocalRef"};
    for (const fakevm::Text &element : array) {
        if (element) {
            calls.push_back("NewStringUTF");
        }
        calls.insert(calls.end(), {"SetObjectArrayElement", "ExceptionCheck"});
        if (element) {
            calls.push_back("DeleteLocalRef");
        }
    }
    return calls;
}

TEST(Queries, AskTheMachineForNothingThatTheAnswerDoesNotNeed)
{
    Everything everything;
    LoadedVm vm;
    for (const Native &native : vm.natives()) {
        if (!isQuery(native)) {
            continue;
        }
        const Answer answer = vm.call(native, Indexes(native.indexes(), 1));
        std::vector<std::string> expected;
        if (answer.text) {
            expected = {"NewStringUTF"};
        } else if (answer.array) {
            expected = callsOfArray(*answer.array);
        } else {
            EXPECT_GT(answer.number, 0) << native.name;
        }
        EXPECT_EQ(vm.calls(), expected) << native.name;
    }
}

TEST(Queries, AnswerNullWithEveryCallThatFails)
{
    Everything everything;
    LoadedVm vm;
    for (const Native &native : vm.natives()) {
        if (!isQuery(native)) {
            continue;
        }
        const Indexes path(native.indexes(), 1);
        const Answer whole = vm.call(native, path);
        long fallible = 0;
        for (const std::string &entry : vm.calls()) {
            fallible += entry != "DeleteLocalRef" && entry != "ExceptionCheck";
        }
        long failures = 0;
        for (;; ++failures) {
            vm.failCall(failures);
            const Answer answer = vm.call(native, path);
            if (!vm.hasFailed()) {
                EXPECT_EQ(answer, whole);
                break;
            }
            EXPECT_EQ(answer, Answer{.exception = true}) << native.name << ' ' << failures;
        }
        EXPECT_EQ(failures, fallible) << native.name;
    }
}

TEST(Queries, AnswerNullWhenTheArrayOfAMissingProxyCannotBeMade)
{
    Context context;
    LoadedVm vm;
    for (long n = 0; n < 3; ++n) {
        vm.failCall(n);
        EXPECT_EQ(vm.call("qvomacp_GetProxyData", {1}), Answer{.exception = true}) << n;
        EXPECT_TRUE(vm.hasFailed());
    }
    vm.failCall(3);
    EXPECT_EQ(vm.call("qvomacp_GetProxyData", {1}), (Answer{.array = Array(14, "")}));
    EXPECT_FALSE(vm.hasFailed());
}

TEST(Queries, FindTheLastOfALongChain)
{
    constexpr jint kLength = 100000;
    Context context;
    LoadedVm vm;
    qvsCtxWifi **end = &context->ptWifi;
    for (jint i = 0; i < kLength; ++i) {
        *end = context.record<qvsCtxWifi>();
        end = &(*end)->ptNext;
    }
    EXPECT_EQ(vm.number("qvomacp_GetPxWifiCount"), kLength);
    EXPECT_EQ(vm.array("qvomacp_GetPxWifiData", {kLength}), Array(13, std::nullopt));
    EXPECT_EQ(vm.array("qvomacp_GetPxWifiData", {kLength + 1}), std::nullopt);
}

TEST(Queries, PassTextOnAsItIs)
{
    Context context;
    LoadedVm vm;
    context->ptClientIdent = context.record<qvsCtxClientIdent>();
    for (const char *value : {"", "\x01\xFF", "\xC3", "\xE2\x82", "\xF0\x9F\x98\x80"}) {
        context->ptClientIdent->pszClientId = context.text(value);
        EXPECT_EQ(vm.text("qvomacp_GetPxClientIdentityData"), value);
    }
}

} // namespace
