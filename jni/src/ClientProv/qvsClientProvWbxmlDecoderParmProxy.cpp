// The parameters of proxies: PXLOGICAL, PXAUTHINFO, PORT, PXPHYSICAL.
#include "qvsParm.h"

using namespace qvs;

namespace {

// kept[pxphysical-domain]: a DOMAIN that cannot be read is traced and the parm goes on.
qvsResult readPhysicalDomain(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    if (readList(decoder, state, record, QVS_FIELD(qvsWapPxPhysical, ptDomainList)) != QVS_OK) {
        trace("[ERROR] qvsClientProvWbxmlDecoderParamListString Fail");
    }
    return state->textLimit ? QVS_ERROR_NO_MEMORY : QVS_OK;
}

namespace pxLogical {
using R = qvsWapPxLogical;
constexpr Parm kParms[] = {
    {page0::kName, QVS_FIELD(R, pszName)},
    {page0::kProxyId, QVS_FIELD(R, pszProxyId)},
    {page0::kProxyProviderId, QVS_FIELD(R, pszProxyProviderId)},
    {page0::kDomain, QVS_FIELD(R, ptDomainList)},
    {page0::kStartPage, QVS_FIELD(R, pszStartPage)},
    {page0::kTrust, QVS_FIELD(R, pszTrust)},
    {page0::kMaster, QVS_FIELD(R, pszMaster)},
    {page0::kProxyPw, QVS_FIELD(R, pszProxyPw)},
    {page0::kPpgAuthType, QVS_FIELD(R, pszPpgAuthType)},
};

void traceResult(uint8_t /*token*/, qvsResult result)
{
    trace("qvsClientProvWbxmlDecoderParamPxlogical Error Code:%d", static_cast<int>(result));
}
} // namespace pxLogical

namespace pxAuthInfo {
using R = qvsWapPxAuthInfo;
constexpr Parm kParms[] = {
    {page0::kPxAuthType, QVS_FIELD(R, pszPxAuthType)},
    {page0::kPxAuthId, QVS_FIELD(R, pszPxAuthId)},
    {page0::kPxAuthPw, QVS_FIELD(R, pszPxAuthPw)},
};

void traceToken(uint8_t token)
{
    trace("DecoderParam : nId = [0x%02x]", token);
}

// kept[pxauthinfo-error-trace]: written on success too.
void traceEnd(uint8_t token, qvsResult result)
{
    trace("DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x%02x]", token);
    trace("return ErrorCode[%d]", static_cast<int>(result));
}
} // namespace pxAuthInfo

namespace port {
using R = qvsWapPort;
constexpr Parm kParms[] = {
    {page0::kPortNbr, QVS_FIELD(R, pszPortNbr)},
    {page0::kService, QVS_FIELD(R, ptServiceList)},
};
} // namespace port

namespace pxPhysical {
using R = qvsWapPxPhysical;
constexpr Parm kParms[] = {
    {page0::kDomain, kByReader},
    {page0::kPushEnabled, QVS_FIELD(R, pszPushEnabled)},
    {page0::kPxAddr, QVS_FIELD(R, pszPxAddr)},
    {page0::kPxAddrType, QVS_FIELD(R, pszPxAddrType)},
    {page0::kToNapId, QVS_FIELD(R, ptToNapIdList)},
    {page0::kWspVersion, QVS_FIELD(R, pszWspVersion)},
    {page0::kPhysicalProxyId, QVS_FIELD(R, pszPhysicalProxyId)},
    {page0::kPxAddrFqdn, QVS_FIELD(R, pszPxAddrFqdn)},
    {page0::kPullEnabled, QVS_FIELD(R, pszPullEnabled)},
};
} // namespace pxPhysical

} // namespace

constexpr ParmTable qvs::kPxLogicalParms = {
    .name = "Pxlogical",
    .rows = pxLogical::kParms,
    .onEnd = pxLogical::traceResult,
};

constexpr ParmTable qvs::kPxAuthInfoParms = {
    .name = "PxAuthInfo",
    .rows = pxAuthInfo::kParms,
    .onToken = pxAuthInfo::traceToken,
    .onEnd = pxAuthInfo::traceEnd,
};

constexpr ParmTable qvs::kPortParms = {
    .name = "Port",
    .rows = port::kParms,
};

constexpr ParmTable qvs::kPxPhysicalParms = {
    .name = "PxPhysical",
    .rows = pxPhysical::kParms,
    .reader = readPhysicalDomain,
};

qvsResult qvsClientProvWbxmlDecoderParamPxlogical(qvsWbxmlDecoder *decoder, qvsWapPxLogical *record)
{
    return readParms(decoder, record, kPxLogicalParms);
}

qvsResult qvsClientProvWbxmlDecoderParamPxAuthInfo(qvsWbxmlDecoder *decoder,
                                                   qvsWapPxAuthInfo *record)
{
    return readParms(decoder, record, kPxAuthInfoParms);
}

qvsResult qvsClientProvWbxmlDecoderParamPort(qvsWbxmlDecoder *decoder, qvsWapPort *record)
{
    return readParms(decoder, record, kPortParms);
}

qvsResult qvsClientProvWbxmlDecoderParamPxPhysical(qvsWbxmlDecoder *decoder,
                                                   qvsWapPxPhysical *record)
{
    return readParms(decoder, record, kPxPhysicalParms);
}
