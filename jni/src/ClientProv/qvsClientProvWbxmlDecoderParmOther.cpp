// The parameters of BOOTSTRAP, CLIENTIDENTITY, VENDORCONFIG and ACCESS.
#include "qvsParm.h"

using namespace qvs;

namespace {

qvsResult readVendorNamed(qvsWbxmlDecoder *decoder, qvsWapVendorConfig *record)
{
    return qvsClientProvWbxmlDecoderParamVendorNameString(decoder, &record->pszParamName,
                                                          &record->pszParamValue, attr::kName);
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderParamBootstrap(qvsWbxmlDecoder *decoder, qvsWapBootstrap *record)
{
    using R = qvsWapBootstrap;
    static constexpr Parm<R> kParms[] = {
        {page0::kName, &R::pszName},          {page0::kCountry, &R::pszCountry},
        {page0::kNetwork, &R::ptNetworkList}, {page0::kProxyId, &R::ptProxyIdList},
        {page0::kProvUrl, &R::pszProvUrl},    {page0::kContextAllow, &R::pszContextAllow},
    };
    return readParms(decoder, record, kParms, {__func__});
}

qvsResult qvsClientProvWbxmlDecoderParamClientIdentity(qvsWbxmlDecoder *decoder,
                                                       qvsWapClientIdentity *record)
{
    using R = qvsWapClientIdentity;
    static constexpr Parm<R> kParms[] = {
        {page0::kClientId, &R::pszClientId},
    };
    return readParms(decoder, record, kParms, {__func__});
}

qvsResult qvsClientProvWbxmlDecoderParamVendorConfig(qvsWbxmlDecoder *decoder,
                                                     qvsWapVendorConfig *record)
{
    using R = qvsWapVendorConfig;
    static constexpr Parm<R> kParms[] = {
        {attr::kName, readVendorNamed},
        {page0::kName, &R::pszName},
    };
    return readParms(decoder, record, kParms, {__func__});
}

qvsResult qvsClientProvWbxmlDecoderParamVendorNameString(qvsWbxmlDecoder *decoder, char **name,
                                                         char **value, uint8_t tag)
{
    static constexpr char kLabel[] = "qvsClientProvWbxmlDecoderParamVendorNameString";
    ParmName read;
    if (qvsResult result = readParmName(decoder, tag, kLabel, true, &read)) {
        return result;
    }
    if (read.next == wbxml::kEnd) {
        // kept[vendor-name-trace]: traced under the other readers' name.
        trace("[qvsClientProvWbxmlDecoderParamNameString] nID [0x%x]", read.next);
    }
    if (read.next == attr::kValue) {
        if (qvsResult result = readParmValue(decoder, value)) {
            return result;
        }
        trace("--------------------------[%s]", *value ? *value : "");
    }
    // kept[vendor-any-name]: no name is compared; the last one and its value replace earlier ones,
    // which stay allocated.
    *name = read.text.take();
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderParamAccess(qvsWbxmlDecoder *decoder, qvsWapAccess *record)
{
    using R = qvsWapAccess;
    static constexpr Parm<R> kParms[] = {
        {page0::kDomain, &R::ptDomainList},   {page0::kToNapId, &R::ptToNapIdList},
        {page0::kPortNbr, &R::ptPortNbrList}, {page1::kAppId, &R::ptAppIdList},
        {page1::kToProxy, &R::ptToProxyList}, {page1::kRule, &R::ptRuleList},
    };
    return readParms(decoder, record, kParms, {__func__});
}
