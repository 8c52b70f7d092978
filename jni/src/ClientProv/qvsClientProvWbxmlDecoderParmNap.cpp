// The parameters of network access points: NAPDEF, NAPAUTHINFO, VALIDITY.
#include "qvsParm.h"

using namespace qvs;

namespace {

// What pszInit points at: never allocated, never released.
char kInit[] = "empty";

qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapNapDef *record, uint8_t tag)
{
    static constexpr char kLabel[] = "qvsClientProvWbxmlDecoderParamNameString";
    ParmName name;
    if (qvsResult result = readParmName(decoder, state, tag, kLabel, false, &name)) {
        return result;
    }
    // kept[napdef-init]: INIT is remembered when it has no value, as a constant text; the value of
    // any named parameter is read and dropped.
    if (name.next == wbxml::kEnd && qvsStrcmp(name.text.str(), "INIT") == 0) {
        record->pszInit = kInit;
        trace("[%s] INIT Value is NULL!!!!!!!!", kLabel);
    }
    if (name.next == attr::kValue) {
        Text dropped;
        return paramValue(decoder, state, &dropped, lookAt);
    }
    return QVS_OK;
}

qvsResult readName(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapNapDef *record)
{
    return readNamed(decoder, state, record, attr::kName);
}

namespace napDef {
using R = qvsWapNapDef;
constexpr auto kParms = tableOf<Parm<R>>({
    {attr::kName, kByReader},
    {page0::kName, &R::pszName},
    {page0::kNapAddress, &R::pszNapAddress},
    {page0::kNapAddrType, &R::pszNapAddrType},
    {page0::kCallType, &R::pszCallType},
    {page0::kLinger, &R::pszLinger},
    {page0::kBearer, &R::ptBearerList},
    {page0::kNapId, &R::pszNapId},
    {page0::kInternet, &R::pszInternet},
    {page0::kLinkSpeed, &R::pszLinkSpeed},
    {page0::kDnLinkSpeed, &R::pszDnLinkSpeed},
    {page0::kLocalAddr, &R::pszLocalAddr},
    {page0::kLocalAddrType, &R::pszLocalAddrType},
    {page0::kDeliveryErrSdu, &R::pszDeliveryErrSdu},
    {page0::kDeliveryOrder, &R::pszDeliveryOrder},
    {page0::kTrafficClass, &R::pszTrafficClass},
    {page0::kMaxSduSize, &R::pszMaxSduSize},
    {page0::kMaxBitrateUplink, &R::pszMaxBitrateUplink},
    {page0::kMaxBitrateDnlink, &R::pszMaxBitrateDnlink},
    {page0::kDnsAddr, &R::ptDnsAddrList},
    {page0::kMaxNumRetry, &R::pszMaxNumRetry},
    {page0::kFirstRetryTimeout, &R::pszFirstRetryTimeout},
    {page0::kReregThreshold, &R::pszReregThreshold},
    {page0::kTBit, &R::pszTBit},
});

void traceRefused(uint8_t token)
{
    trace("qvsClientProvWbxmlDecoderParamNapDef : Tag Code [%d] = "
          "QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n",
          token);
}
} // namespace napDef

namespace napAuthInfo {
using R = qvsWapNapAuthInfo;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kAuthType, &R::pszAuthType},
    {page0::kAuthName, &R::pszAuthName},
    {page0::kAuthSecret, &R::pszAuthSecret},
    {page0::kAuthEntity, &R::ptAuthEntityList},
});
} // namespace napAuthInfo

namespace validity {
using R = qvsWapValidity;
constexpr auto kParms = tableOf<Parm<R>>({
    {page0::kValidUntil, &R::pszValidUntil},
    {page0::kCountry, &R::pszCountry},
    {page0::kNetwork, &R::pszNetwork},
    {page0::kSid, &R::pszSid},
    {page0::kSoc, &R::pszSoc},
});
} // namespace validity

} // namespace

constexpr ParmsOf<qvsWapNapDef> qvs::kNapDefParms = {
    {.name = "NapDef", .onRefused = napDef::traceRefused},
    napDef::kParms,
    kReadBy<qvsWapNapDef, readName>};

constexpr ParmsOf<qvsWapNapAuthInfo> qvs::kNapAuthInfoParms = {{.name = "NapAuthInfo"},
                                                               napAuthInfo::kParms};

constexpr ParmsOf<qvsWapValidity> qvs::kValidityParms = {{.name = "Validity"}, validity::kParms};

qvsResult qvsClientProvWbxmlDecoderParamNapDef(qvsWbxmlDecoder *decoder, qvsWapNapDef *record)
{
    return readParms(decoder, record, kNapDefParms);
}

qvsResult qvsClientProvWbxmlDecoderParamNapAuthInfo(qvsWbxmlDecoder *decoder,
                                                    qvsWapNapAuthInfo *record)
{
    return readParms(decoder, record, kNapAuthInfoParms);
}

qvsResult qvsClientProvWbxmlDecoderParamValidity(qvsWbxmlDecoder *decoder, qvsWapValidity *record)
{
    return readParms(decoder, record, kValidityParms);
}

qvsResult qvsClientProvWbxmlDecoderParamNapNameString(qvsWbxmlDecoder *decoder,
                                                      qvsWapNapDef **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag);
}
