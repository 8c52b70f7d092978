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
qvsResult readComma(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    char **types = &static_cast<qvsWapAppAuth *>(record)->pszAAuthType;
    const qvsResult result =
        commaAdd(decoder, state, types, state->open ? &state->open->joined : nullptr);
    trace("--------------------------[%s]", *types ? *types : "");
    return result;
}

// kept[resource-startpage]: a STARTPAGE that leaves the field without a value stores "startpage".
qvsResult readStartPage(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    char **page = &static_cast<qvsWapResource *>(record)->pszStartPage;
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
constexpr Parm kParms[] = {
    {attr::kName, kByReader},
    {page1::kName, QVS_FIELD(R, pszName)},
    {page1::kInternet, QVS_FIELD(R, pszInternet)},
    {page1::kToNapId, QVS_FIELD(R, ptToNapIdList)},
    {page1::kAAccept, QVS_FIELD(R, pszAAccept)},
    {page1::kAddr, QVS_FIELD(R, ptAddrList)},
    {page1::kAppId, QVS_FIELD(R, pszAppId)},
    {page1::kAProtocol, QVS_FIELD(R, pszAProtocol)},
    {page1::kProviderId, QVS_FIELD(R, pszProviderId)},
    {page1::kToProxy, QVS_FIELD(R, ptToProxyList)},
};

// Parameters whose name is given as text.
constexpr NamedParm kNamed[] = {
    {"XCAP_AUID_DCS", QVS_FIELD(R, pszXcapAuidDcs)},
    {"XCAP_AUID_PMS", QVS_FIELD(R, pszXcapAuidPms)},
    {"XCAP_AUID_CDMS", QVS_FIELD(R, pszXcapAuidCdms)},
    {"XCAP_IMEI_HEADER", QVS_FIELD(R, pszXcapImeiHeader)},
    {"XCAP_TID_HEADER", QVS_FIELD(R, pszXcapTidHeader)},
    {"FROM", QVS_FIELD(R, pszFrom)},
};

// The value of a name that is not listed is read and dropped.
qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t tag)
{
    static constexpr char kLabel[] = "qvsClientProvWbxmlDecoderParamNameString";
    ParmName name;
    if (qvsResult result = readParmName(decoder, state, tag, kLabel, false, &name)) {
        return result;
    }
    if (name.next != attr::kValue) {
        return QVS_OK;
    }
    if (char **field = findNamed(record, kNamed, name.text)) {
        return readValue(decoder, state, field);
    }
    Text dropped;
    const qvsResult result = paramValue(decoder, state, &dropped, lookAt);
    if (result == QVS_OK) {
        trace("[%s] pszValue [%s]", kLabel, dropped.str() ? dropped.str() : "");
    }
    return result;
}

qvsResult readName(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    return readNamed(decoder, state, record, attr::kName);
}
} // namespace application

namespace appAddr {
using R = qvsWapAppAddr;
constexpr Parm kParms[] = {
    {page1::kAddr, QVS_FIELD(R, pszAddr)},
    {page1::kAddrType, QVS_FIELD(R, pszAddrType)},
};
} // namespace appAddr

namespace appAuth {
using R = qvsWapAppAuth;
constexpr Parm kParms[] = {
    {page1::kAAuthData, QVS_FIELD(R, pszAAuthData)},
    {page1::kAAuthLevel, QVS_FIELD(R, pszAAuthLevel)},
    {page1::kAAuthName, QVS_FIELD(R, pszAAuthName)},
    {page1::kAAuthSecret, QVS_FIELD(R, pszAAuthSecret)},
    {page1::kAAuthType, QVS_FIELD(R, pszAAuthType)},
    {kCommaToken, kByReader},
};
} // namespace appAuth

namespace resource {
using R = qvsWapResource;
constexpr Parm kParms[] = {
    {page1::kName, QVS_FIELD(R, pszName)},
    {page1::kStartPage, kByReader},
    {page1::kAAccept, QVS_FIELD(R, pszAAccept)},
    {page1::kAAuthData, QVS_FIELD(R, pszAAuthData)},
    {page1::kAAuthName, QVS_FIELD(R, pszAAuthName)},
    {page1::kAAuthSecret, QVS_FIELD(R, pszAAuthSecret)},
    {page1::kAAuthType, QVS_FIELD(R, pszAAuthType)},
    {page1::kUri, QVS_FIELD(R, pszUri)},
};
} // namespace resource

} // namespace

constexpr ParmTable qvs::kApplicationParms = {
    .name = "Application",
    .rows = application::kParms,
    .reader = application::readName,
    .onParm = traceParm,
    .onToken = traceToken,
};

constexpr ParmTable qvs::kAppAddrParms = {
    .name = "AppAddr",
    .rows = appAddr::kParms,
};

constexpr ParmTable qvs::kAppAuthParms = {
    .name = "AppAuth",
    .rows = appAuth::kParms,
    .reader = readComma,
    .freshTokenAfterSwitch = true,
};

constexpr ParmTable qvs::kResourceParms = {
    .name = "Resource",
    .rows = resource::kParms,
    .reader = readStartPage,
    .freshTokenAfterSwitch = true,
    .onParm = traceParm,
};

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
    return application::readNamed(decoder, &alone, *record, tag);
}
