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

qvsResult readName(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    auto *vendor = static_cast<qvsWapVendorConfig *>(record);
    return readNamed(decoder, state, &vendor->pszParamName, &vendor->pszParamValue, attr::kName);
}

namespace bootstrap {
using R = qvsWapBootstrap;
constexpr Parm kParms[] = {
    {page0::kName, QVS_FIELD(R, pszName)},
    {page0::kCountry, QVS_FIELD(R, pszCountry)},
    {page0::kNetwork, QVS_FIELD(R, ptNetworkList)},
    {page0::kProxyId, QVS_FIELD(R, ptProxyIdList)},
    {page0::kProvUrl, QVS_FIELD(R, pszProvUrl)},
    {page0::kContextAllow, QVS_FIELD(R, pszContextAllow)},
};
} // namespace bootstrap

namespace clientIdentity {
using R = qvsWapClientIdentity;
constexpr Parm kParms[] = {
    {page0::kClientId, QVS_FIELD(R, pszClientId)},
};
} // namespace clientIdentity

namespace vendorConfig {
using R = qvsWapVendorConfig;
constexpr Parm kParms[] = {
    {attr::kName, kByReader},
    {page0::kName, QVS_FIELD(R, pszName)},
};
} // namespace vendorConfig

namespace access {
using R = qvsWapAccess;
constexpr Parm kParms[] = {
    {page0::kDomain, QVS_FIELD(R, ptDomainList)},   {page0::kToNapId, QVS_FIELD(R, ptToNapIdList)},
    {page0::kPortNbr, QVS_FIELD(R, ptPortNbrList)}, {page1::kAppId, QVS_FIELD(R, ptAppIdList)},
    {page1::kToProxy, QVS_FIELD(R, ptToProxyList)}, {page1::kRule, QVS_FIELD(R, ptRuleList)},
};
} // namespace access

} // namespace

constexpr ParmTable qvs::kBootstrapParms = {
    .name = "Bootstrap",
    .rows = bootstrap::kParms,
};

constexpr ParmTable qvs::kClientIdentityParms = {
    .name = "ClientIdentity",
    .rows = clientIdentity::kParms,
};

constexpr ParmTable qvs::kVendorConfigParms = {
    .name = "VendorConfig",
    .rows = vendorConfig::kParms,
    .reader = readName,
};

constexpr ParmTable qvs::kAccessParms = {
    .name = "Access",
    .rows = access::kParms,
};

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
