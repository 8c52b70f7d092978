// The parameters of applications: APPLICATION, APPADDR, APPAUTH, RESOURCE.
#include "qvsParm.h"

using namespace qvs;

namespace {

void traceToken(uint8_t token)
{
    if (token != wbxml::kEnd) {
        trace("DecoderParam : nId = [0x%02x]", token);
    }
}

// The parameters of APPLICATION and RESOURCE are traced by the name of their token.
constexpr struct {
    uint8_t token;
    char name[12];
} kTokenNames[] = {
    {page1::kName, "NAME"},
    {page1::kInternet, "INTERNET"},
    {page1::kStartPage, "STARTPAGE"},
    {page1::kToNapId, "TO_NAPID"},
    {page1::kAAccept, "AACCEPT"},
    {page1::kAAuthData, "AAUTHDATA"},
    {page1::kAAuthName, "AAUTHNAME"},
    {page1::kAAuthSecret, "AAUTHSECRET"},
    {page1::kAAuthType, "AAUTHTYPE"},
    {page1::kAddr, "ADDR"},
    {page1::kAppId, "APPID"},
    {page1::kAProtocol, "APROTOCOL"},
    {page1::kProviderId, "PROVIDER_ID"},
    {page1::kToProxy, "TO_PROXY"},
    {page1::kUri, "URI"},
};

void traceParm(uint8_t token)
{
    const char *name = "";
    for (const auto &known : kTokenNames) {
        if (known.token == token) {
            name = known.name;
        }
    }
    // The NAME that is given as text stands by itself.
    trace("SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME%s%s", *name ? "_" : "", name);
}

// The comma token where a name is expected: one more value of AAUTHTYPE.
qvsResult readComma(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapAppAuth *record)
{
    char **types = &record->pszAAuthType;
    const qvsResult result = commaAdd(decoder, state, types, &state->open->joined);
    trace("--------------------------[%s]", *types ? *types : "");
    return result;
}

// kept[resource-startpage]: a STARTPAGE that leaves the field without a value stores "startpage".
qvsResult readStartPage(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapResource *record)
{
    char **page = &record->pszStartPage;
    if (qvsResult result = readText(decoder, state, page, page1::kStartPage)) {
        return result;
    }
    if (!*page) {
        *page = qvsStrdup_debug("startpage", kDecoderModule, __LINE__);
    }
    return QVS_OK;
}

namespace application {
using R = qvsWapApplication;
constexpr auto kParms = tableOf<Parm<R>>({
    {attr::kName, kByName},
    {page1::kName, &R::pszName},
    {page1::kInternet, &R::pszInternet},
    {page1::kToNapId, &R::ptToNapIdList},
    {page1::kAAccept, &R::pszAAccept},
    {page1::kAddr, &R::ptAddrList},
    {page1::kAppId, &R::pszAppId},
    {page1::kAProtocol, &R::pszAProtocol},
    {page1::kProviderId, &R::pszProviderId},
    {page1::kToProxy, &R::ptToProxyList},
});

// Parameters whose name is given as text.
constexpr auto kNames = namesOf<R>({
    {"XCAP_AUID_DCS", &R::pszXcapAuidDcs},
    {"XCAP_AUID_PMS", &R::pszXcapAuidPms},
    {"XCAP_AUID_CDMS", &R::pszXcapAuidCdms},
    {"XCAP_IMEI_HEADER", &R::pszXcapImeiHeader},
    {"XCAP_TID_HEADER", &R::pszXcapTidHeader},
    {"FROM", &R::pszFrom},
});

constexpr NamedOf<R> kNamed = {kNames, "qvsClientProvWbxmlDecoderParamNameString", true};
} // namespace application

namespace appAddr {
using R = qvsWapAppAddr;
constexpr auto kParms = tableOf<Parm<R>>({
    {page1::kAddr, &R::pszAddr},
    {page1::kAddrType, &R::pszAddrType},
});
} // namespace appAddr

namespace appAuth {
using R = qvsWapAppAuth;
constexpr auto kParms = tableOf<Parm<R>>({
    {page1::kAAuthData, &R::pszAAuthData},
    {page1::kAAuthLevel, &R::pszAAuthLevel},
    {page1::kAAuthName, &R::pszAAuthName},
    {page1::kAAuthSecret, &R::pszAAuthSecret},
    {page1::kAAuthType, &R::pszAAuthType},
    {kCommaToken, kByReader},
});
} // namespace appAuth

namespace resource {
using R = qvsWapResource;
constexpr auto kParms = tableOf<Parm<R>>({
    {page1::kName, &R::pszName},
    {page1::kStartPage, kByReader},
    {page1::kAAccept, &R::pszAAccept},
    {page1::kAAuthData, &R::pszAAuthData},
    {page1::kAAuthName, &R::pszAAuthName},
    {page1::kAAuthSecret, &R::pszAAuthSecret},
    {page1::kAAuthType, &R::pszAAuthType},
    {page1::kUri, &R::pszUri},
});
} // namespace resource

} // namespace

constexpr ParmsOf<qvsWapApplication> qvs::kApplicationParms = {
    {.name = "Application", .onParm = traceParm, .onToken = traceToken},
    application::kParms,
    application::kNamed};

constexpr ParmsOf<qvsWapAppAddr> qvs::kAppAddrParms = {{.name = "AppAddr"}, appAddr::kParms};

constexpr ParmsOf<qvsWapAppAuth> qvs::kAppAuthParms = {
    {.name = "AppAuth", .freshTokenAfterSwitch = true},
    appAuth::kParms,
    kReadBy<qvsWapAppAuth, readComma>};

constexpr ParmsOf<qvsWapResource> qvs::kResourceParms = {
    {.name = "Resource", .freshTokenAfterSwitch = true, .onParm = traceParm},
    resource::kParms,
    kReadBy<qvsWapResource, readStartPage>};

qvsResult qvsClientProvWbxmlDecoderParamApplication(qvsWbxmlDecoder *decoder,
                                                    qvsWapApplication *record)
{
    return readParms(decoder, record, kApplicationParms);
}

qvsResult qvsClientProvWbxmlDecoderParamAppAddr(qvsWbxmlDecoder *decoder, qvsWapAppAddr *record)
{
    return readParms(decoder, record, kAppAddrParms);
}

qvsResult qvsClientProvWbxmlDecoderParamAppAuth(qvsWbxmlDecoder *decoder, qvsWapAppAuth *record)
{
    return readParms(decoder, record, kAppAuthParms);
}

qvsResult qvsClientProvWbxmlDecoderParamResource(qvsWbxmlDecoder *decoder, qvsWapResource *record)
{
    return readParms(decoder, record, kResourceParms);
}

qvsResult qvsClientProvWbxmlDecoderParamAppNameString(qvsWbxmlDecoder *decoder,
                                                      qvsWapApplication **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, application::kNamed);
}
