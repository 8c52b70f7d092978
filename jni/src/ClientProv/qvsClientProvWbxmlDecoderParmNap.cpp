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

qvsResult readName(qvsWbxmlDecoder *decoder, DecodeState *state, void *record)
{
    return readNamed(decoder, state, static_cast<qvsWapNapDef *>(record), attr::kName);
}

namespace napDef {
using R = qvsWapNapDef;
constexpr Parm kParms[] = {
    {attr::kName, kByReader},
    {page0::kName, QVS_FIELD(R, pszName)},
    {page0::kNapAddress, QVS_FIELD(R, pszNapAddress)},
    {page0::kNapAddrType, QVS_FIELD(R, pszNapAddrType)},
    {page0::kCallType, QVS_FIELD(R, pszCallType)},
    {page0::kLinger, QVS_FIELD(R, pszLinger)},
    {page0::kBearer, QVS_FIELD(R, ptBearerList)},
    {page0::kNapId, QVS_FIELD(R, pszNapId)},
    {page0::kInternet, QVS_FIELD(R, pszInternet)},
    {page0::kLinkSpeed, QVS_FIELD(R, pszLinkSpeed)},
    {page0::kDnLinkSpeed, QVS_FIELD(R, pszDnLinkSpeed)},
    {page0::kLocalAddr, QVS_FIELD(R, pszLocalAddr)},
    {page0::kLocalAddrType, QVS_FIELD(R, pszLocalAddrType)},
    {page0::kDeliveryErrSdu, QVS_FIELD(R, pszDeliveryErrSdu)},
    {page0::kDeliveryOrder, QVS_FIELD(R, pszDeliveryOrder)},
    {page0::kTrafficClass, QVS_FIELD(R, pszTrafficClass)},
    {page0::kMaxSduSize, QVS_FIELD(R, pszMaxSduSize)},
    {page0::kMaxBitrateUplink, QVS_FIELD(R, pszMaxBitrateUplink)},
    {page0::kMaxBitrateDnlink, QVS_FIELD(R, pszMaxBitrateDnlink)},
    {page0::kDnsAddr, QVS_FIELD(R, ptDnsAddrList)},
    {page0::kMaxNumRetry, QVS_FIELD(R, pszMaxNumRetry)},
    {page0::kFirstRetryTimeout, QVS_FIELD(R, pszFirstRetryTimeout)},
    {page0::kReregThreshold, QVS_FIELD(R, pszReregThreshold)},
    {page0::kTBit, QVS_FIELD(R, pszTBit)},
};

void traceRefused(uint8_t token)
{
    trace("qvsClientProvWbxmlDecoderParamNapDef : Tag Code [%d] = "
          "QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n",
          token);
}
} // namespace napDef

namespace napAuthInfo {
using R = qvsWapNapAuthInfo;
constexpr Parm kParms[] = {
    {page0::kAuthType, QVS_FIELD(R, pszAuthType)},
    {page0::kAuthName, QVS_FIELD(R, pszAuthName)},
    {page0::kAuthSecret, QVS_FIELD(R, pszAuthSecret)},
    {page0::kAuthEntity, QVS_FIELD(R, ptAuthEntityList)},
};
} // namespace napAuthInfo

namespace validity {
using R = qvsWapValidity;
constexpr Parm kParms[] = {
    {page0::kValidUntil, QVS_FIELD(R, pszValidUntil)},
    {page0::kCountry, QVS_FIELD(R, pszCountry)},
    {page0::kNetwork, QVS_FIELD(R, pszNetwork)},
    {page0::kSid, QVS_FIELD(R, pszSid)},
    {page0::kSoc, QVS_FIELD(R, pszSoc)},
};
} // namespace validity

} // namespace

constexpr ParmTable qvs::kNapDefParms = {
    .name = "NapDef",
    .rows = napDef::kParms,
    .reader = readName,
    .onRefused = napDef::traceRefused,
};

constexpr ParmTable qvs::kNapAuthInfoParms = {
    .name = "NapAuthInfo",
    .rows = napAuthInfo::kParms,
};

constexpr ParmTable qvs::kValidityParms = {
    .name = "Validity",
    .rows = validity::kParms,
};

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
