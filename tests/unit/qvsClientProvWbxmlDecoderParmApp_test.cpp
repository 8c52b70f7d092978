// The parameters of applications: APPLICATION, APPADDR, APPAUTH, RESOURCE.
#include "parms.h"
#include "qvsParm.h"

#include <cstring>

using namespace parms;

namespace {

struct Application : Usual<qvsWapApplication, qvsClientProvWbxmlDecoderParamApplication,
                           qvsClientProvWbxmlDeleteApplication> {
    using R = Record;
    static constexpr char kCharacteristic[] = "APPLICATION";
    static constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamNameString]";
    static constexpr bool kReadsAnyValue = true;

    // The fields of the named parameters stay allocated when the tree is released.
    static void release(R *record)
    {
        for (const NamedRow<R> &row : names()) {
            qvsMemFree_debug(record->*row.text);
        }
        Usual::release(record);
    }
    static qvsResult readName(qvsWbxmlDecoder *decoder, R **record, uint8_t tag)
    {
        return qvsClientProvWbxmlDecoderParamAppNameString(decoder, record, tag);
    }
    static bool hasOtherMeaning(uint8_t token) { return token == 0x05; }

    static std::vector<Row<R>> rows()
    {
        return {
            {0x07, "NAME", &R::pszName},           {0x14, "INTERNET", &R::pszInternet},
            {0x22, "TO-NAPID", &R::ptToNapIdList}, {0x2E, "AACCEPT", &R::pszAAccept},
            {0x34, "ADDR", &R::ptAddrList},        {0x36, "APPID", &R::pszAppId},
            {0x37, "APROTOCOL", &R::pszAProtocol}, {0x38, "PROVIDER-ID", &R::pszProviderId},
            {0x39, "TO-PROXY", &R::ptToProxyList},
        };
    }
    static std::vector<NamedRow<R>> names()
    {
        return {
            {"XCAP_AUID_DCS", &R::pszXcapAuidDcs},     {"XCAP_AUID_PMS", &R::pszXcapAuidPms},
            {"XCAP_AUID_CDMS", &R::pszXcapAuidCdms},   {"XCAP_IMEI_HEADER", &R::pszXcapImeiHeader},
            {"XCAP_TID_HEADER", &R::pszXcapTidHeader}, {"FROM", &R::pszFrom},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamApplication", token) +
               lines({format("DecoderParam : nId = [0x%02x]", token)});
    }
};

struct AppAddr
    : Usual<qvsWapAppAddr, qvsClientProvWbxmlDecoderParamAppAddr, qvsClientProvWbxmlDeleteAppAddr> {
    using R = Record;
    static constexpr char kCharacteristic[] = "APPADDR";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x34, "ADDR", &R::pszAddr},
            {0x35, "ADDRTYPE", &R::pszAddrType},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamAppAddr", token);
    }
};

struct AppAuth
    : Usual<qvsWapAppAuth, qvsClientProvWbxmlDecoderParamAppAuth, qvsClientProvWbxmlDeleteAppAuth> {
    using R = Record;
    static constexpr char kCharacteristic[] = "APPAUTH";
    static constexpr bool kFresh = true;

    static bool hasOtherMeaning(uint8_t token) { return token == 0x90; }

    static std::vector<Row<R>> rows()
    {
        return {
            {0x2F, "AAUTHDATA", &R::pszAAuthData}, {0x30, "AAUTHLEVEL", &R::pszAAuthLevel},
            {0x31, "AAUTHNAME", &R::pszAAuthName}, {0x32, "AAUTHSECRET", &R::pszAAuthSecret},
            {0x33, "AAUTHTYPE", &R::pszAAuthType},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamAppAuth", token);
    }
};

struct Resource : Usual<qvsWapResource, qvsClientProvWbxmlDecoderParamResource,
                        qvsClientProvWbxmlDeleteResource> {
    using R = Record;
    static constexpr char kCharacteristic[] = "RESOURCE";
    static constexpr bool kFresh = true;

    static const char *withoutValue(uint8_t token) { return token == 0x1C ? "startpage" : nullptr; }

    static std::vector<Row<R>> rows()
    {
        return {
            {0x07, "NAME", &R::pszName},           {0x1C, "STARTPAGE", &R::pszStartPage},
            {0x2E, "AACCEPT", &R::pszAAccept},     {0x2F, "AAUTHDATA", &R::pszAAuthData},
            {0x31, "AAUTHNAME", &R::pszAAuthName}, {0x32, "AAUTHSECRET", &R::pszAAuthSecret},
            {0x33, "AAUTHTYPE", &R::pszAAuthType}, {0x3A, "URI", &R::pszUri},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamResource", token);
    }
};

INSTANTIATE_TEST_SUITE_P(Applications, ParmLoop,
                         (decoders<Application, AppAddr, AppAuth, Resource>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Applications, TokenParm,
                         (decoders<Application, AppAddr, AppAuth, Resource>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Applications, TextParm,
                         (decoders<Application, AppAddr, AppAuth, Resource>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Applications, ListParm, decoders<Application>(), nameOf);
INSTANTIATE_TEST_SUITE_P(Applications, NameReader, decoders<Application>(), nameOf);
INSTANTIATE_TEST_SUITE_P(Applications, NamedParm, decoders<Application>(), nameOf);

class ApplicationParm : public blocks::BlockTest {};
class AppAuthParm : public blocks::BlockTest {};
class ResourceParm : public blocks::BlockTest {};

// The label of a parameter: its name with underscores.
std::string labelOf(std::string name)
{
    for (char &letter : name) {
        letter = letter == '-' ? '_' : letter;
    }
    return "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_" + name;
}

// What AAUTHTYPE holds behind parms of these attributes, with "tab" at 1 in the string table, and
// the joins that were traced.
struct Joined {
    std::string text;
    Strings traced;
    qvsResult result;
    size_t left;
};

Joined readAuth(const Bytes &parms)
{
    Reading<AppAuth> run(parms);
    run.decoder->pStringTable = static_cast<char *>(qvsMemDup_debug("x"
                                                                    "tab\0",
                                                                    6, "test", 1));
    run.decoder->nStrSize = 5;
    Traces traces;
    Joined joined{};
    while (run.left() && joined.result == 0) {
        joined.result = run.read();
    }
    for (const std::string &text : traces.texts) {
        if (text.rfind("-----", 0) == 0) {
            joined.traced.push_back(text);
        }
    }
    joined.text = shown(run.record->pszAAuthType);
    joined.left = run.left();
    return joined;
}

// AAUTHTYPE of a token or a text, and what joins it.
void expectJoin(const Bytes &attributes, const std::string &expected)
{
    SCOPED_TRACE(testing::PrintToString(attributes));
    const Joined joined = readAuth(parm(attributes));
    EXPECT_EQ(joined.result, 0U);
    EXPECT_EQ(joined.left, 0U);
    EXPECT_EQ(joined.text, expected);
    ASSERT_FALSE(joined.traced.empty());
    if (expected != "(null)") {
        EXPECT_EQ(joined.traced.back(), "--------------------------[" + expected + "]\n");
    }
}

} // namespace

TEST_F(ApplicationParm, TracesItsLabelBeforeAndItsTokenBehindEachParm)
{
    for (const auto &row : Application::rows()) {
        SCOPED_TRACE(row.name);
        EXPECT_EQ(tracesOf<Application>(parm(row.token, "value")),
                  lines({labelOf(row.name), "qvsClientProvWbxmlDecoderContent Error:0",
                         "qvsClientProvWbxmlDecoderParamString Error Code:0",
                         format("DecoderParam : nId = [0x%02x]", row.token)}));
    }
}

TEST_F(ApplicationParm, TracesTheTokenOfAParmThatCannotBeRead)
{
    Reading<Application> run({0x87, 0x36, 0x06, 0x03, 'w'});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(traces.texts.front(), "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_APPID\n");
    EXPECT_EQ(traces.texts.back(), "DecoderParam : nId = [0x36]\n");
}

TEST_F(ApplicationParm, TracesTheStepsOfAKnownName)
{
    EXPECT_EQ(tracesOf<Application>(named("FROM", "me")),
              lines({"SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME",
                     "[qvsClientProvWbxmlDecoderParamNameString] nTagID [0x5]",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     "[qvsClientProvWbxmlDecoderParamNameString] pszName [FROM]",
                     "[qvsClientProvWbxmlDecoderParamNameString] nID [0x6]",
                     "qvsClientProvWbxmlDecoderContent Error:0", "DecoderParam : nId = [0x05]"}));
}

TEST_F(ApplicationParm, TracesTheValueThatItDrops)
{
    EXPECT_EQ(tracesOf<Application>(named("from", "me")),
              lines({"SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME",
                     "[qvsClientProvWbxmlDecoderParamNameString] nTagID [0x5]",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     "[qvsClientProvWbxmlDecoderParamNameString] pszName [from]",
                     "[qvsClientProvWbxmlDecoderParamNameString] nID [0x6]",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     "[qvsClientProvWbxmlDecoderParamNameString] pszValue [me]",
                     "DecoderParam : nId = [0x05]"}));
}

TEST_F(ApplicationParm, TracesNoValueThatCannotBeRead)
{
    Reading<Application> run(prefix(named("from", "me"), 13));
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    for (const std::string &text : traces.texts) {
        EXPECT_EQ(text.find("pszValue"), std::string::npos) << text;
    }
}

TEST_F(ApplicationParm, DropsAValueThatCarriesNothing)
{
    Reading<Application> run(parm(join({{0x05}, message::Value("from").bytes, {0x06}})));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_TRUE(traces.has("[qvsClientProvWbxmlDecoderParamNameString] pszValue []\n"));
    EXPECT_EQ(run.left(), 0U);
    EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
}

TEST_F(ApplicationParm, DropsAValueOfSeveralPiecesWithoutABlock)
{
    for (const size_t left : {10U, 9U, 5U}) {
        Reading<Application> run(parm(join({{0x05, 0x03, 'x', 0x00, 0x06, 0x03, 'a', 'b', 0x00},
                                            {0x03, 'c', 'd', 'e', 0x00, 0x86, 0x01}})));
        qvs::DecodeState state = {.textLeft = left};
        blocks::startCounting();
        EXPECT_EQ(qvs::readParms(run.decoder, &state, run.record, qvs::kApplicationParms.table),
                  left < 10 ? 4111U : 0U);
        EXPECT_EQ(state.textLeft, 0U);
        EXPECT_EQ(blocks::allocations() == 0, left == 10);
    }
}

TEST_F(ApplicationParm, ReadsTheNextParameterBehindANameWithoutAValue)
{
    Reading<Application> run(
        parm(join({{0x05, 0xC3, 0x04, 'F', 'R', 'O', 'M', 0x36}, value("w2")})));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.record->pszFrom, nullptr);
    EXPECT_STREQ(run.record->pszAppId, "w2");
}

TEST_F(AppAuthParm, JoinsTheValueBehindTheCommaToken)
{
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x03, 'x', 0x00}, "HTTP,x");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x83, 0x01}, "HTTP,tab");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x92}, "HTTP,BASIC");
    expectJoin({0x33, 0x06, 0x9C, 0x90, 0x9D}, "HTTP-BASIC,HTTP-DIGEST");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x92, 0x90, 0x93, 0x90, 0x03, 'z', 0x00},
               "HTTP,BASIC,DIGEST,z");
    // A string takes along what follows it.
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x03, 'x', 0x00, 0x92, 0x03, 'y', 0x00}, "HTTP,x,BASICy");
    expectJoin({0x33, 0x06, 0xC3, 0x01, 'A', 0x90, 0x03, 'B', 0x00}, "A,B");
}

TEST_F(AppAuthParm, JoinsAsTheTokensThemselvesJoin)
{
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x85}, "HTTPIPV4");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x90}, "HTTP");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x94, 0x90, 0x03, 'x', 0x00}, "HTTP,x");
}

TEST_F(AppAuthParm, DropsATokenWithoutAText)
{
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x7F}, "HTTP");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0xC3}, "HTTP");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x01}, "HTTP");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x30}, "HTTP");
}

TEST_F(AppAuthParm, JoinsToNoValueAtAll)
{
    expectJoin({0x90, 0x03, 'x', 0x00}, ",x");
    expectJoin({0x90, 0x92}, "BASIC");
    expectJoin({0x90, 0x7F}, "(null)");
}

TEST_F(AppAuthParm, JoinsATokenBehindAPageSwitch)
{
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x00, 0x01, 0x92}, "HTTP,BASIC");
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x00, 0x02, 0x92}, "HTTP,BASIC");
    expectJoin({0x33, 0x06, 0x91, 0x00, 0x01, 0x90, 0x92}, "HTTP,BASIC");
    // Strings are none behind a switch: the token is dropped, and the END follows.
    expectJoin({0x33, 0x06, 0x91, 0x90, 0x00, 0x00, 0x03}, "HTTP");
}

TEST_F(AppAuthParm, JoinsAcrossOtherParametersAndParms)
{
    expectJoin(join({{0x33, 0x06, 0x91, 0x30}, opaque("APPSRV"), {0x90, 0x92}}), "HTTP,BASIC");
    const Joined joined = readAuth(join({parm({0x33, 0x06, 0x91}), parm({0x90, 0x92})}));
    EXPECT_EQ(joined.result, 0U);
    EXPECT_EQ(joined.text, "HTTP,BASIC");
}

TEST_F(AppAuthParm, TakesTheCommaTokenBehindAStringForAPartOfTheValue)
{
    for (const Bytes &second : {Bytes{0x03, 'B', 0x00}, Bytes{0x83, 0x04}}) {
        const Joined joined = readAuth(parm(join({{0x33, 0x06, 0x03, 'A', 0x00, 0x90}, second})));
        EXPECT_EQ(joined.result, 0U);
        EXPECT_EQ(joined.text, second[0] == 0x03 ? "AB" : "A");
        EXPECT_EQ(joined.traced, Strings{});
    }
}

TEST_F(AppAuthParm, FailsWhereTheDataEndsInAJoin)
{
    for (const Bytes &cut : {Bytes{0x90}, Bytes{0x90, 0x00}, Bytes{0x90, 0x00, 0x01},
                             Bytes{0x90, 0x03}, Bytes{0x90, 0x03, 'x'}, Bytes{0x90, 0x03, 'x', 0},
                             Bytes{0x90, 0x83}, Bytes{0x90, 0x92}}) {
        SCOPED_TRACE(testing::PrintToString(cut));
        const Joined joined = readAuth(join({{0x87, 0x33, 0x06, 0x91}, cut}));
        EXPECT_EQ(joined.result, 4103U);
        EXPECT_EQ(joined.text.rfind("HTTP", 0), 0U) << "what was there stays";
    }
}

TEST_F(AppAuthParm, FailsOfAStringThatCannotBeJoined)
{
    EXPECT_EQ(readAuth(parm({0x33, 0x06, 0x91, 0x90, 0x83, 0x7F})).result, 4103U);
    EXPECT_EQ(readAuth(parm({0x33, 0x06, 0x91, 0x90, 0x03, 'x', 0x00, 0x60})).result, 4103U);
}

TEST_F(AppAuthParm, JoinsNothingWithoutMemory)
{
    const auto join = [](const Bytes &attributes, qvsResult expected) {
        Reading<AppAuth> run(parm(parms::join({{0x33, 0x06, 0x91}, attributes})));
        blocks::failAt = 1; // the first one is for HTTP
        EXPECT_EQ(run.read(), expected);
        blocks::reset();
        EXPECT_STREQ(run.record->pszAAuthType, "HTTP");
    };
    join({0x90, 0x03, 'x', 0x00}, 4111);
    join({0x90, 0x92}, 0);
}

TEST_F(ResourceParm, TracesItsLabelBeforeEachParm)
{
    for (const auto &row : Resource::rows()) {
        SCOPED_TRACE(row.name);
        EXPECT_EQ(tracesOf<Resource>(parm(row.token, "value")),
                  lines({labelOf(row.name), "qvsClientProvWbxmlDecoderContent Error:0",
                         "qvsClientProvWbxmlDecoderParamString Error Code:0"}));
    }
}

TEST_F(ResourceParm, LeavesAStartPageThatCannotBeReadWithoutOne)
{
    Reading<Resource> run({0x87, 0x1C, 0x06, 0x03, 'y'});
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(run.record->pszStartPage, nullptr);
    Reading<Resource> other({0x87, 0x1C, 0x1C});
    EXPECT_EQ(other.read(), 4101U);
    EXPECT_EQ(other.record->pszStartPage, nullptr);
}

TEST_F(ResourceParm, IsNoStartPageWithoutMemoryForTheText)
{
    Reading<Resource> run(parm({0x1C}));
    blocks::failAt = 0;
    EXPECT_EQ(run.read(), 0U);
    blocks::reset();
    EXPECT_EQ(run.record->pszStartPage, nullptr);
}

TEST(Kept, resource_startpage)
{
    blocks::BlockCheck check;
    Reading<Resource> run(
        join({parm({0x1C}), parm(0x1C, "own"), parm({0x1C, 0x06}), parm(0x1C, "")}));
    const char *expected[] = {"startpage", "own", "startpage", ""};
    char *last = nullptr;
    for (const char *text : expected) {
        qvsMemFree_debug(last); // a text that is replaced stays allocated
        EXPECT_EQ(run.read(), 0U);
        last = run.record->pszStartPage;
        EXPECT_STREQ(last, text);
    }
}
