// The parameters of proxies (PXLOGICAL, PXAUTHINFO, PORT, PXPHYSICAL), and of any characteristic
// those whose name is given as text.
#include "qvsParm.h"

using namespace qvs;

namespace {

// kept[pxphysical-domain]: a DOMAIN that cannot be read is traced and the parm goes on.
qvsResult readPhysicalDomain(qvsWbxmlDecoder *decoder, qvsWapPxPhysical *record)
{
    if (qvsClientProvWbxmlDecoderParamListString(decoder, &record->ptDomainList, page0::kDomain) !=
        QVS_OK) {
        trace("[ERROR] qvsClientProvWbxmlDecoderParamListString Fail");
    }
    return decoder->bTextLimit ? QVS_ERROR_NO_MEMORY : QVS_OK;
}

} // namespace

qvsResult qvs::readParmName(qvsWbxmlDecoder *decoder, uint8_t tag, const char *label,
                            bool mayBeEmpty, ParmName *name)
{
    trace("[%s] nTagID [0x%x]", label, tag);
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckAttr(decoder, tag)) {
        return result;
    }
    qvsResult result = content(decoder, &name->text);
    if (result == QVS_OK && !mayBeEmpty && name->text.length == 0) {
        result = QVS_ERROR_FAILED;
    }
    if (result != QVS_OK) {
        // Silent where not even a part of a name was read.
        if (mayBeEmpty || name->text.data || result == QVS_ERROR_FAILED) {
            trace("[%s] pszName NULL", label);
        }
        return result;
    }
    trace("[%s] pszName [%s]", label, name->text.data ? name->text.data : "");
    result = qvsClientProvWbxmlDecoderCurAttr(decoder, &name->next);
    if (result == QVS_OK) {
        trace("[%s] nID [0x%x]", label, name->next);
    }
    return result;
}

qvsResult qvs::readParmValue(qvsWbxmlDecoder *decoder, char **field)
{
    Text value;
    if (qvsResult result = paramValue(decoder, &value)) {
        return result;
    }
    *field = value.take();
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderParamPxlogical(qvsWbxmlDecoder *decoder, qvsWapPxLogical *record)
{
    using R = qvsWapPxLogical;
    static constexpr Parm<R> kParms[] = {
        {page0::kName, &R::pszName},
        {page0::kProxyId, &R::pszProxyId},
        {page0::kProxyProviderId, &R::pszProxyProviderId},
        {page0::kDomain, &R::ptDomainList},
        {page0::kStartPage, &R::pszStartPage},
        {page0::kTrust, &R::pszTrust},
        {page0::kMaster, &R::pszMaster},
        {page0::kProxyPw, &R::pszProxyPw},
        {page0::kPpgAuthType, &R::pszPpgAuthType},
    };
    static constexpr ParmStyle kStyle = {
        .name = "qvsClientProvWbxmlDecoderParamPxlogical",
        .onEnd =
            [](uint8_t, qvsResult result) {
                trace("qvsClientProvWbxmlDecoderParamPxlogical Error Code:%d",
                      static_cast<int>(result));
            },
    };
    return readParms(decoder, record, kParms, kStyle);
}

qvsResult qvsClientProvWbxmlDecoderParamPxAuthInfo(qvsWbxmlDecoder *decoder,
                                                   qvsWapPxAuthInfo *record)
{
    using R = qvsWapPxAuthInfo;
    static constexpr Parm<R> kParms[] = {
        {page0::kPxAuthType, &R::pszPxAuthType},
        {page0::kPxAuthId, &R::pszPxAuthId},
        {page0::kPxAuthPw, &R::pszPxAuthPw},
    };
    static constexpr ParmStyle kStyle = {
        .name = "qvsClientProvWbxmlDecoderParamPxAuthInfo",
        .onToken = [](uint8_t token) { trace("DecoderParam : nId = [0x%02x]", token); },
        .onEnd =
            [](uint8_t token, qvsResult result) {
                // kept[pxauthinfo-error-trace]: written on success too.
                trace("DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x%02x]", token);
                trace("return ErrorCode[%d]", static_cast<int>(result));
            },
    };
    return readParms(decoder, record, kParms, kStyle);
}

qvsResult qvsClientProvWbxmlDecoderParamPort(qvsWbxmlDecoder *decoder, qvsWapPort *record)
{
    using R = qvsWapPort;
    static constexpr Parm<R> kParms[] = {
        {page0::kPortNbr, &R::pszPortNbr},
        {page0::kService, &R::ptServiceList},
    };
    return readParms(decoder, record, kParms, {__func__});
}

qvsResult qvsClientProvWbxmlDecoderParamPxPhysical(qvsWbxmlDecoder *decoder,
                                                   qvsWapPxPhysical *record)
{
    using R = qvsWapPxPhysical;
    static constexpr Parm<R> kParms[] = {
        {page0::kDomain, readPhysicalDomain},
        {page0::kPushEnabled, &R::pszPushEnabled},
        {page0::kPxAddr, &R::pszPxAddr},
        {page0::kPxAddrType, &R::pszPxAddrType},
        {page0::kToNapId, &R::ptToNapIdList},
        {page0::kWspVersion, &R::pszWspVersion},
        {page0::kPhysicalProxyId, &R::pszPhysicalProxyId},
        {page0::kPxAddrFqdn, &R::pszPxAddrFqdn},
        {page0::kPullEnabled, &R::pszPullEnabled},
    };
    return readParms(decoder, record, kParms, {__func__});
}
