// The parameters of BOOTSTRAP, CLIENTIDENTITY, VENDORCONFIG and ACCESS.
#include "qvsParm.h"

using namespace qvs;

namespace {

qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, char **name, char **value,
                    uint8_t tag)
{
    static constexpr char kLabel[] = "qvsClientProvWbxmlDecoderParamVendorNameString";
    ParmName read;
    if (qvsResult result = readParmName(decoder, state, tag, kLabel, true, &read)) {
        return result;
    }
    if (read.next == wbxml::kEnd) {
        // kept[vendor-name-trace]: traced under the other readers' name.
        trace("[qvsClientProvWbxmlDecoderParamNameString] nID [0x%x]", read.next);
    }
    if (read.next == attr::kValue) {
        if (qvsResult result = readValue(decoder, state, value)) {
            return result;
        }
        trace("--------------------------[%s]", *value ? *value : "");
    }
    // kept[vendor-any-name]: no name is compared; the last one and its value replace earlier ones,
    // which stay allocated.
    *name = read.text.take();
    return QVS_OK;
}

qvsResult readName(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapVendorConfig *record)
{
    return readNamed(decoder, state, &record->pszParamName, &record->pszParamValue, attr::kName);
}

namespace bootstrap {
using R = qvsWapBootstrap;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kName, &R::pszName},
    {page0::kCountry, &R::pszCountry},
    {page0::kNetwork, &R::ptNetworkList},
    {page0::kProxyId, &R::ptProxyIdList},
    {page0::kProvUrl, &R::pszProvUrl},
    {page0::kContextAllow, &R::pszContextAllow},
});
} // namespace bootstrap

namespace clientIdentity {
using R = qvsWapClientIdentity;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kClientId, &R::pszClientId},
});
} // namespace clientIdentity

namespace vendorConfig {
using R = qvsWapVendorConfig;
constexpr auto kParms = tableOf<Parm<R>>({
    {attr::kName, kByReader},
    {page0::kName, &R::pszName},
});
} // namespace vendorConfig

namespace access {
using R = qvsWapAccess;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kDomain, &R::ptDomainList},
    {page0::kToNapId, &R::ptToNapIdList},
    {page0::kPortNbr, &R::ptPortNbrList},
    {page1::kAppId, &R::ptAppIdList},
    {page1::kToProxy, &R::ptToProxyList},
    {page1::kRule, &R::ptRuleList},
});
} // namespace access

} // namespace

constexpr ParmsOf<qvsWapBootstrap> qvs::kBootstrapParms = {{.name = "Bootstrap"},
                                                           bootstrap::kParms};

constexpr ParmsOf<qvsWapClientIdentity> qvs::kClientIdentityParms = {{.name = "ClientIdentity"},
                                                                     clientIdentity::kParms};

constexpr ParmsOf<qvsWapVendorConfig> qvs::kVendorConfigParms = {
    {.name = "VendorConfig"}, vendorConfig::kParms, kReadBy<qvsWapVendorConfig, readName>};

constexpr ParmsOf<qvsWapAccess> qvs::kAccessParms = {{.name = "Access"}, access::kParms};

qvsResult qvsClientProvWbxmlDecoderParamBootstrap(qvsWbxmlDecoder *decoder, qvsWapBootstrap *record)
{
    return readParms(decoder, record, kBootstrapParms);
}

qvsResult qvsClientProvWbxmlDecoderParamClientIdentity(qvsWbxmlDecoder *decoder,
                                                       qvsWapClientIdentity *record)
{
    return readParms(decoder, record, kClientIdentityParms);
}

qvsResult qvsClientProvWbxmlDecoderParamVendorConfig(qvsWbxmlDecoder *decoder,
                                                     qvsWapVendorConfig *record)
{
    return readParms(decoder, record, kVendorConfigParms);
}

qvsResult qvsClientProvWbxmlDecoderParamAccess(qvsWbxmlDecoder *decoder, qvsWapAccess *record)
{
    return readParms(decoder, record, kAccessParms);
}

qvsResult qvsClientProvWbxmlDecoderParamVendorNameString(qvsWbxmlDecoder *decoder, char **name,
                                                         char **value, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, name, value, tag);
}
