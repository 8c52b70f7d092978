// The parameters of proxies: PXLOGICAL, PXAUTHINFO, PORT, PXPHYSICAL.
#include "qvsParm.h"

using namespace qvs;

namespace {

namespace pxLogical {
using R = qvsWapPxLogical;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kName, &R::pszName},
    {page0::kProxyId, &R::pszProxyId},
    {page0::kProxyProviderId, &R::pszProxyProviderId},
    {page0::kDomain, &R::ptDomainList},
    {page0::kStartPage, &R::pszStartPage},
    {page0::kTrust, &R::pszTrust},
    {page0::kMaster, &R::pszMaster},
    {page0::kProxyPw, &R::pszProxyPw},
    {page0::kPpgAuthType, &R::pszPpgAuthType},
});

void traceResult(uint8_t /*token*/, qvsResult result)
{
    trace("qvsClientProvWbxmlDecoderParamPxlogical Error Code:%d", static_cast<int>(result));
}
} // namespace pxLogical

namespace pxAuthInfo {
using R = qvsWapPxAuthInfo;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kPxAuthType, &R::pszPxAuthType},
    {page0::kPxAuthId, &R::pszPxAuthId},
    {page0::kPxAuthPw, &R::pszPxAuthPw},
});

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
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kPortNbr, &R::pszPortNbr},
    {page0::kService, &R::ptServiceList},
});
} // namespace port

namespace pxPhysical {
using R = qvsWapPxPhysical;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kDomain, kByReader},
    {page0::kPushEnabled, &R::pszPushEnabled},
    {page0::kPxAddr, &R::pszPxAddr},
    {page0::kPxAddrType, &R::pszPxAddrType},
    {page0::kToNapId, &R::ptToNapIdList},
    {page0::kWspVersion, &R::pszWspVersion},
    {page0::kPhysicalProxyId, &R::pszPhysicalProxyId},
    {page0::kPxAddrFqdn, &R::pszPxAddrFqdn},
    {page0::kPullEnabled, &R::pszPullEnabled},
});

// kept[pxphysical-domain]: a DOMAIN that cannot be read is traced and the parm goes on.
qvsResult readDomain(qvsWbxmlDecoder *decoder, DecodeState *state, R *record)
{
    if (readList(decoder, state, record, {&R::ptDomainList}) != QVS_OK) {
        trace("[ERROR] qvsClientProvWbxmlDecoderParamListString Fail");
    }
    return state->textLimit ? QVS_ERROR_NO_MEMORY : QVS_OK;
}
} // namespace pxPhysical

} // namespace

constexpr ParmsOf<qvsWapPxLogical> qvs::kPxLogicalParms = {
    {.name = "Pxlogical", .onEnd = pxLogical::traceResult}, pxLogical::kParms};

constexpr ParmsOf<qvsWapPxAuthInfo> qvs::kPxAuthInfoParms = {
    {.name = "PxAuthInfo", .onToken = pxAuthInfo::traceToken, .onEnd = pxAuthInfo::traceEnd},
    pxAuthInfo::kParms};

constexpr ParmsOf<qvsWapPort> qvs::kPortParms = {{.name = "Port"}, port::kParms};

constexpr ParmsOf<qvsWapPxPhysical> qvs::kPxPhysicalParms = {
    {.name = "PxPhysical"}, pxPhysical::kParms, kReadBy<qvsWapPxPhysical, pxPhysical::readDomain>};

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
