// The parameters of applications: APPLICATION, APPADDR, APPAUTH, RESOURCE.
#include "qvsParm.h"

using namespace qvs;

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvsClientProvWbxmlDecoder";

void traceToken(uint8_t token)
{
    if (token != wbxml::kEnd) {
        trace("DecoderParam : nId = [0x%02x]", token);
    }
}

qvsResult readAppNamed(qvsWbxmlDecoder *decoder, qvsWapApplication *record)
{
    return qvsClientProvWbxmlDecoderParamAppNameString(decoder, &record, attr::kName);
}

// The comma token where a name is expected: one more value of AAUTHTYPE.
qvsResult readComma(qvsWbxmlDecoder *decoder, qvsWapAppAuth *record)
{
    const qvsResult result = qvsCommaAdd(decoder, &record->pszAAuthType);
    trace("--------------------------[%s]", record->pszAAuthType ? record->pszAAuthType : "");
    return result;
}

// kept[resource-startpage]: a STARTPAGE that leaves the field without a value stores "startpage".
qvsResult readStartPage(qvsWbxmlDecoder *decoder, qvsWapResource *record)
{
    if (qvsResult result = qvsClientProvWbxmlDecoderParamString(decoder, &record->pszStartPage,
                                                                page1::kStartPage)) {
        return result;
    }
    if (!record->pszStartPage) {
        record->pszStartPage = qvsStrdup_debug("startpage", kModule, __LINE__);
    }
    return QVS_OK;
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderParamApplication(qvsWbxmlDecoder *decoder,
                                                    qvsWapApplication *record)
{
    using R = qvsWapApplication;
    static constexpr Parm<R> kParms[] = {
        {attr::kName, readAppNamed, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME"},
        {page1::kName, &R::pszName, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_NAME"},
        {page1::kInternet, &R::pszInternet, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_INTERNET"},
        {page1::kToNapId, &R::ptToNapIdList, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_TO_NAPID"},
        {page1::kAAccept, &R::pszAAccept, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AACCEPT"},
        {page1::kAddr, &R::ptAddrList, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_ADDR"},
        {page1::kAppId, &R::pszAppId, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_APPID"},
        {page1::kAProtocol, &R::pszAProtocol, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_APROTOCOL"},
        {page1::kProviderId, &R::pszProviderId, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_PROVIDER_ID"},
        {page1::kToProxy, &R::ptToProxyList, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_TO_PROXY"},
    };
    return readParms(decoder, record, kParms, {.name = __func__, .onToken = traceToken});
}

qvsResult qvsClientProvWbxmlDecoderParamAppNameString(qvsWbxmlDecoder *decoder,
                                                      qvsWapApplication **record, uint8_t tag)
{
    using R = qvsWapApplication;
    static constexpr char kLabel[] = "qvsClientProvWbxmlDecoderParamNameString";
    static constexpr NamedParm<R> kNames[] = {
        {"XCAP_AUID_DCS", &R::pszXcapAuidDcs},     {"XCAP_AUID_PMS", &R::pszXcapAuidPms},
        {"XCAP_AUID_CDMS", &R::pszXcapAuidCdms},   {"XCAP_IMEI_HEADER", &R::pszXcapImeiHeader},
        {"XCAP_TID_HEADER", &R::pszXcapTidHeader}, {"FROM", &R::pszFrom},
    };
    ParmName name;
    if (qvsResult result = readParmName(decoder, tag, kLabel, false, &name)) {
        return result;
    }
    if (name.next != attr::kValue) {
        return QVS_OK;
    }
    if (char **field = findNamed(*record, kNames, name.text.data)) {
        return readParmValue(decoder, field);
    }
    Text dropped;
    const qvsResult result = paramValue(decoder, &dropped);
    if (result == QVS_OK) {
        trace("[%s] pszValue [%s]", kLabel, dropped.data ? dropped.data : "");
    }
    return result;
}

qvsResult qvsClientProvWbxmlDecoderParamAppAddr(qvsWbxmlDecoder *decoder, qvsWapAppAddr *record)
{
    using R = qvsWapAppAddr;
    static constexpr Parm<R> kParms[] = {
        {page1::kAddr, &R::pszAddr},
        {page1::kAddrType, &R::pszAddrType},
    };
    return readParms(decoder, record, kParms, {__func__});
}

qvsResult qvsClientProvWbxmlDecoderParamAppAuth(qvsWbxmlDecoder *decoder, qvsWapAppAuth *record)
{
    using R = qvsWapAppAuth;
    static constexpr Parm<R> kParms[] = {
        {page1::kAAuthData, &R::pszAAuthData}, {page1::kAAuthLevel, &R::pszAAuthLevel},
        {page1::kAAuthName, &R::pszAAuthName}, {page1::kAAuthSecret, &R::pszAAuthSecret},
        {page1::kAAuthType, &R::pszAAuthType}, {kCommaToken, readComma},
    };
    return readParms(decoder, record, kParms, {.name = __func__, .freshTokenAfterSwitch = true});
}

qvsResult qvsClientProvWbxmlDecoderParamResource(qvsWbxmlDecoder *decoder, qvsWapResource *record)
{
    using R = qvsWapResource;
    static constexpr Parm<R> kParms[] = {
        {page1::kName, &R::pszName, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_NAME"},
        {page1::kStartPage, readStartPage, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_STARTPAGE"},
        {page1::kAAccept, &R::pszAAccept, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AACCEPT"},
        {page1::kAAuthData, &R::pszAAuthData, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AAUTHDATA"},
        {page1::kAAuthName, &R::pszAAuthName, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AAUTHNAME"},
        {page1::kAAuthSecret, &R::pszAAuthSecret,
         "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AAUTHSECRET"},
        {page1::kAAuthType, &R::pszAAuthType, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_AAUTHTYPE"},
        {page1::kUri, &R::pszUri, "SMLDM_CPPARSER_ATTR_PARM_CODE_1_NAME_URI"},
    };
    return readParms(decoder, record, kParms, {.name = __func__, .freshTokenAfterSwitch = true});
}
