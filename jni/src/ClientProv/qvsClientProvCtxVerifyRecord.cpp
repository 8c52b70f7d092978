// The kinds of record of the context: for each the texts, lists and children of the tree's record
// that it is a copy of.
#include "qvsClientProvCtx.h"
#include "qvsCtxCopy.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

using Node = qvsWapCharacter;

namespace port {
using C = qvsCtxPort;
using W = qvsWapPort;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszPortNbr), QVS_FIELD(C, pszPortNbr)},
    {QVS_FIELD(W, ptServiceList), QVS_FIELD(C, ptService)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace port

namespace pxAuthInfo {
using C = qvsCtxPxAuthInfo;
using W = qvsWapPxAuthInfo;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszPxAuthType), QVS_FIELD(C, pszPxAuthType)},
    {QVS_FIELD(W, pszPxAuthId), QVS_FIELD(C, pszPxAuthId)},
    {QVS_FIELD(W, pszPxAuthPw), QVS_FIELD(C, pszPxAuthPw)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace pxAuthInfo

namespace pxPhysical {
using C = qvsCtxPxPhysical;
using W = qvsWapPxPhysical;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszPhysicalProxyId), QVS_FIELD(C, pszPhysicalProxyId)},
    {QVS_FIELD(W, pszPxAddr), QVS_FIELD(C, pszPxAddr)},
    {QVS_FIELD(W, pszPxAddrType), QVS_FIELD(C, pszPxAddrType)},
    {QVS_FIELD(W, pszPxAddrFqdn), QVS_FIELD(C, pszPxAddrFqdn)},
    {QVS_FIELD(W, pszWspVersion), QVS_FIELD(C, pszWspVersion)},
    {QVS_FIELD(W, pszPushEnabled), QVS_FIELD(C, pszPushEnabled)},
    {QVS_FIELD(W, pszPullEnabled), QVS_FIELD(C, pszPullEnabled)},
    {QVS_FIELD(W, ptDomainList), QVS_FIELD(C, ptDomain)},
    {QVS_FIELD(W, ptToNapIdList), QVS_FIELD(C, ptToNapId)},
};
constexpr ChildRow kChildren[] = {
    {QVS_FIELD(Node, ptPort), QVS_FIELD(C, ptPort), port::kCopy},
};
// kept[context-misfit-ignored]: a child that is not accepted is not even traced here.
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .children = kChildren,
    .childList = QVS_FIELD(W, ptCharacterList),
};
} // namespace pxPhysical

namespace pxLogical {
using C = qvsCtxPxLogical;
using W = qvsWapPxLogical;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszProxyId), QVS_FIELD(C, pszProxyId)},
    {QVS_FIELD(W, pszProxyPw), QVS_FIELD(C, pszProxyPw)},
    {QVS_FIELD(W, pszPpgAuthType), QVS_FIELD(C, pszPpgAuthType)},
    {QVS_FIELD(W, pszProxyProviderId), QVS_FIELD(C, pszProxyProviderId)},
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszTrust), QVS_FIELD(C, pszTrust)},
    {QVS_FIELD(W, pszMaster), QVS_FIELD(C, pszMaster)},
    {QVS_FIELD(W, pszStartPage), QVS_FIELD(C, pszStartPage)},
    {QVS_FIELD(W, pszReserved1), QVS_FIELD(C, pszReserved1)},
    {QVS_FIELD(W, pszReserved2), QVS_FIELD(C, pszReserved2)},
    {QVS_FIELD(W, pszReserved3), QVS_FIELD(C, pszReserved3)},
    // kept[context-pxlogical-twelfth]: pszReserved4 is never copied.
    {QVS_FIELD(W, pszReserved5), QVS_FIELD(C, pszReserved5)},
    {QVS_FIELD(W, ptDomainList), QVS_FIELD(C, ptDomain)},
};
constexpr ChildRow kChildren[] = {
    {QVS_FIELD(Node, ptPxAuthInfo), QVS_FIELD(C, ptPxAuthInfo), pxAuthInfo::kCopy},
    {QVS_FIELD(Node, ptPxPhysical), QVS_FIELD(C, ptPxPhysical), pxPhysical::kCopy},
    {QVS_FIELD(Node, ptPort), QVS_FIELD(C, ptPort), port::kCopy},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .children = kChildren,
    .childList = QVS_FIELD(W, ptCharacterList),
    .refusalTraced = true,
};
} // namespace pxLogical

namespace napAuthInfo {
using C = qvsCtxNapAuthInfo;
using W = qvsWapNapAuthInfo;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszAuthType), QVS_FIELD(C, pszAuthType)},
    {QVS_FIELD(W, pszAuthName), QVS_FIELD(C, pszAuthName)},
    {QVS_FIELD(W, pszAuthSecret), QVS_FIELD(C, pszAuthSecret)},
    {QVS_FIELD(W, pszReserved), QVS_FIELD(C, pszReserved)},
    {QVS_FIELD(W, ptAuthEntityList), QVS_FIELD(C, ptAuthEntity)},
};

void traceEntity(const void *copy)
{
    const qvsCtxStrNode *entity = static_cast<const C *>(copy)->ptAuthEntity;
    // hardened: an entity without memory for its text is left out of the trace.
    if (entity && entity->pAuthEntity) {
        trace("NAP:ptCtx->ptAuthEntity->pAuthEntity[%s]", entity->pAuthEntity);
    }
}

constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .onCopied = traceEntity,
};
} // namespace napAuthInfo

namespace validity {
using C = qvsCtxValidity;
using W = qvsWapValidity;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszCountry), QVS_FIELD(C, pszCountry)},
    {QVS_FIELD(W, pszNetwork), QVS_FIELD(C, pszNetwork)},
    {QVS_FIELD(W, pszSid), QVS_FIELD(C, pszSid)},
    {QVS_FIELD(W, pszSoc), QVS_FIELD(C, pszSoc)},
    {QVS_FIELD(W, pszValidUntil), QVS_FIELD(C, pszValidUntil)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace validity

namespace napDef {
using C = qvsCtxNapDef;
using W = qvsWapNapDef;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszNapId), QVS_FIELD(C, pszNapId)},
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszInternet), QVS_FIELD(C, pszInternet)},
    {QVS_FIELD(W, pszNapAddress), QVS_FIELD(C, pszNapAddress)},
    {QVS_FIELD(W, pszNapAddrType), QVS_FIELD(C, pszNapAddrType)},
    {QVS_FIELD(W, pszInit), QVS_FIELD(C, pszInit), CopyRow::kKeptText},
    {QVS_FIELD(W, pszCallType), QVS_FIELD(C, pszCallType)},
    {QVS_FIELD(W, pszLocalAddr), QVS_FIELD(C, pszLocalAddr)},
    {QVS_FIELD(W, pszLocalAddrType), QVS_FIELD(C, pszLocalAddrType)},
    {QVS_FIELD(W, pszLinkSpeed), QVS_FIELD(C, pszLinkSpeed)},
    {QVS_FIELD(W, pszDnLinkSpeed), QVS_FIELD(C, pszDnLinkSpeed)},
    {QVS_FIELD(W, pszLinger), QVS_FIELD(C, pszLinger)},
    {QVS_FIELD(W, pszDeliveryErrSdu), QVS_FIELD(C, pszDeliveryErrSdu)},
    {QVS_FIELD(W, pszDeliveryOrder), QVS_FIELD(C, pszDeliveryOrder)},
    {QVS_FIELD(W, pszTrafficClass), QVS_FIELD(C, pszTrafficClass)},
    {QVS_FIELD(W, pszMaxSduSize), QVS_FIELD(C, pszMaxSduSize)},
    {QVS_FIELD(W, pszMaxBitrateUplink), QVS_FIELD(C, pszMaxBitrateUplink)},
    {QVS_FIELD(W, pszMaxBitrateDnlink), QVS_FIELD(C, pszMaxBitrateDnlink)},
    {QVS_FIELD(W, pszReserved1), QVS_FIELD(C, pszReserved1)},
    {QVS_FIELD(W, pszReserved2), QVS_FIELD(C, pszReserved2)},
    {QVS_FIELD(W, pszReserved3), QVS_FIELD(C, pszReserved3)},
    {QVS_FIELD(W, pszReserved4), QVS_FIELD(C, pszReserved4)},
    {QVS_FIELD(W, pszReserved5), QVS_FIELD(C, pszReserved5)},
    {QVS_FIELD(W, pszReserved6), QVS_FIELD(C, pszReserved6)},
    {QVS_FIELD(W, pszMaxNumRetry), QVS_FIELD(C, pszMaxNumRetry)},
    {QVS_FIELD(W, pszFirstRetryTimeout), QVS_FIELD(C, pszFirstRetryTimeout)},
    {QVS_FIELD(W, pszReregThreshold), QVS_FIELD(C, pszReregThreshold)},
    {QVS_FIELD(W, pszTBit), QVS_FIELD(C, pszTBit)},
    {QVS_FIELD(W, ptDnsAddrList), QVS_FIELD(C, ptDnsAddr)},
    {QVS_FIELD(W, ptBearerList), QVS_FIELD(C, ptBearer)},
};
constexpr ChildRow kChildren[] = {
    {QVS_FIELD(Node, ptNapAuthInfo), QVS_FIELD(C, ptNapAuthInfo), napAuthInfo::kCopy},
    {QVS_FIELD(Node, ptValidity), QVS_FIELD(C, ptValidity), validity::kCopy},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .children = kChildren,
    .childList = QVS_FIELD(W, ptCharacterList),
    .refusalTraced = true,
};
} // namespace napDef

namespace roaming {
using C = qvsCtxRoaming;
using W = qvsWapRoaming;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszSyncAllowed), QVS_FIELD(C, pszSyncAllowed), CopyRow::kKeptText},
    {QVS_FIELD(W, pszSyncDefault), QVS_FIELD(C, pszSyncDefault), CopyRow::kKeptText},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace roaming

namespace appAddr {
using C = qvsCtxAppAddr;
using W = qvsWapAppAddr;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszAddr), QVS_FIELD(C, pszAddr)},
    {QVS_FIELD(W, pszAddrType), QVS_FIELD(C, pszAddrType)},
};
constexpr ChildRow kChildren[] = {
    {QVS_FIELD(Node, ptPort), QVS_FIELD(C, ptPort), port::kCopy},
};
// kept[context-misfit-ignored]: a child that is not accepted is not even traced here.
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .children = kChildren,
    .childList = QVS_FIELD(W, ptCharacterList),
};
} // namespace appAddr

namespace appAuth {
using C = qvsCtxAppAuth;
using W = qvsWapAppAuth;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszAAuthLevel), QVS_FIELD(C, pszAAuthLevel)},
    {QVS_FIELD(W, pszAAuthType), QVS_FIELD(C, pszAAuthType)},
    {QVS_FIELD(W, pszAAuthName), QVS_FIELD(C, pszAAuthName)},
    {QVS_FIELD(W, pszAAuthSecret), QVS_FIELD(C, pszAAuthSecret)},
    {QVS_FIELD(W, pszAAuthData), QVS_FIELD(C, pszAAuthData)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace appAuth

namespace resource {
using C = qvsCtxResource;
using W = qvsWapResource;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszUri), QVS_FIELD(C, pszUri)},
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszAAccept), QVS_FIELD(C, pszAAccept)},
    {QVS_FIELD(W, pszAAuthType), QVS_FIELD(C, pszAAuthType)},
    {QVS_FIELD(W, pszAAuthName), QVS_FIELD(C, pszAAuthName)},
    {QVS_FIELD(W, pszAAuthSecret), QVS_FIELD(C, pszAAuthSecret)},
    {QVS_FIELD(W, pszAAuthData), QVS_FIELD(C, pszAAuthData)},
    {QVS_FIELD(W, pszStartPage), QVS_FIELD(C, pszStartPage)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace resource

namespace application {
using C = qvsCtxApplication;
using W = qvsWapApplication;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszAppId), QVS_FIELD(C, pszAppId)},
    {QVS_FIELD(W, pszProviderId), QVS_FIELD(C, pszProviderId)},
    {QVS_FIELD(W, pszFrom), QVS_FIELD(C, pszFrom), CopyRow::kKeptText},
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszAAccept), QVS_FIELD(C, pszAAccept)},
    {QVS_FIELD(W, pszAProtocol), QVS_FIELD(C, pszAProtocol)},
    {QVS_FIELD(W, pszInternet), QVS_FIELD(C, pszInternet)},
    {QVS_FIELD(W, pszXcapAuidDcs), QVS_FIELD(C, pszXcapAuidDcs), CopyRow::kKeptText},
    {QVS_FIELD(W, pszXcapAuidPms), QVS_FIELD(C, pszXcapAuidPms), CopyRow::kKeptText},
    {QVS_FIELD(W, pszXcapAuidCdms), QVS_FIELD(C, pszXcapAuidCdms), CopyRow::kKeptText},
    {QVS_FIELD(W, pszXcapImeiHeader), QVS_FIELD(C, pszXcapImeiHeader), CopyRow::kKeptText},
    {QVS_FIELD(W, pszXcapTidHeader), QVS_FIELD(C, pszXcapTidHeader), CopyRow::kKeptText},
    // kept[context-from-twice]: FROM is copied once more, and the first copy stays allocated.
    {QVS_FIELD(W, pszFrom), QVS_FIELD(C, pszFrom), CopyRow::kKeptText},
    {QVS_FIELD(W, ptToProxyList), QVS_FIELD(C, ptToProxy)},
    {QVS_FIELD(W, ptToNapIdList), QVS_FIELD(C, ptToNapId)},
    {QVS_FIELD(W, ptAddrList), QVS_FIELD(C, ptToAddr)},
};
constexpr ChildRow kChildren[] = {
    {QVS_FIELD(Node, ptRoaming), QVS_FIELD(C, ptRoaming), roaming::kCopy},
    {QVS_FIELD(Node, ptAppAddr), QVS_FIELD(C, ptAppAddr), appAddr::kCopy},
    {QVS_FIELD(Node, ptAppAuth), QVS_FIELD(C, ptAppAuth), appAuth::kCopy},
    {QVS_FIELD(Node, ptResource), QVS_FIELD(C, ptResource), resource::kCopy},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .children = kChildren,
    .childList = QVS_FIELD(W, ptCharacterList),
    .refusalTraced = true,
};
} // namespace application

namespace bootstrap {
using C = qvsCtxBootstrap;
using W = qvsWapBootstrap;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszCountry), QVS_FIELD(C, pszCountry)},
    {QVS_FIELD(W, pszProvUrl), QVS_FIELD(C, pszProvUrl)},
    {QVS_FIELD(W, pszContextAllow), QVS_FIELD(C, pszContextAllow)},
    {QVS_FIELD(W, ptProxyIdList), QVS_FIELD(C, ptProxyId)},
    {QVS_FIELD(W, ptNetworkList), QVS_FIELD(C, ptNetwork)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace bootstrap

namespace clientIdent {
using C = qvsCtxClientIdent;
using W = qvsWapClientIdentity;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszClientId), QVS_FIELD(C, pszClientId)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
    .single = true,
};
} // namespace clientIdent

namespace vendorConfig {
using C = qvsCtxVendorConfig;
using W = qvsWapVendorConfig;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszName), QVS_FIELD(C, pszName)},
    {QVS_FIELD(W, pszParamName), QVS_FIELD(C, pszParamName), CopyRow::kKeptText},
    {QVS_FIELD(W, pszParamValue), QVS_FIELD(C, pszParamValue), CopyRow::kKeptText},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace vendorConfig

namespace access {
using C = qvsCtxAccess;
using W = qvsWapAccess;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, ptRuleList), QVS_FIELD(C, ptRule)},
    {QVS_FIELD(W, ptAppIdList), QVS_FIELD(C, ptAppId)},
    {QVS_FIELD(W, ptPortNbrList), QVS_FIELD(C, ptPortNbr)},
    {QVS_FIELD(W, ptDomainList), QVS_FIELD(C, ptDomain)},
    {QVS_FIELD(W, ptToNapIdList), QVS_FIELD(C, ptToNapId)},
    {QVS_FIELD(W, ptToProxyList), QVS_FIELD(C, ptToProxy)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace access

namespace wifi {
using C = qvsCtxWifi;
using W = qvsWapWifi;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszNetSsid), QVS_FIELD(C, pszNetSsid)},
    {QVS_FIELD(W, pszSecMode), QVS_FIELD(C, pszSecMode)},
    {QVS_FIELD(W, pszEapMethod), QVS_FIELD(C, pszEapMethod)},
    {QVS_FIELD(W, pszEapType), QVS_FIELD(C, pszEapType)},
    {QVS_FIELD(W, pszUserName), QVS_FIELD(C, pszUserName)},
    {QVS_FIELD(W, pszAnonUserName), QVS_FIELD(C, pszAnonUserName)},
    {QVS_FIELD(W, pszPassword), QVS_FIELD(C, pszPassword)},
    {QVS_FIELD(W, pszCaCert), QVS_FIELD(C, pszCaCert)},
    {QVS_FIELD(W, pszUserCert), QVS_FIELD(C, pszUserCert)},
    {QVS_FIELD(W, pszPhase1), QVS_FIELD(C, pszPhase1)},
    {QVS_FIELD(W, pszAuthAlgorithm), QVS_FIELD(C, pszAuthAlgorithm)},
    {QVS_FIELD(W, pszPriority), QVS_FIELD(C, pszPriority)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace wifi

namespace voWifi {
using C = qvsCtxVoWifi;
using W = qvsWapVoWifi;
constexpr CopyRow kRows[] = {
    {QVS_FIELD(W, pszEpdgFqdn), QVS_FIELD(C, pszEpdgFqdn)},
};
constexpr CopyKind kCopy = {
    .fields = kFieldsOf<C>,
    .rows = kRows,
};
} // namespace voWifi

constexpr ChildRow kAtTheTop[] = {
    {QVS_FIELD(Node, ptPxLogical), QVS_FIELD(qvsClientProvCtx, ptPxLogical), pxLogical::kCopy},
    {QVS_FIELD(Node, ptNapDef), QVS_FIELD(qvsClientProvCtx, ptNapDef), napDef::kCopy},
    {QVS_FIELD(Node, ptBootstrap), QVS_FIELD(qvsClientProvCtx, ptBootstrap), bootstrap::kCopy},
    // kept[context-second-clientidentity]: with a second one the kinds below are lost.
    {QVS_FIELD(Node, ptClientIdentity), QVS_FIELD(qvsClientProvCtx, ptClientIdent),
     clientIdent::kCopy},
    {QVS_FIELD(Node, ptVendorConfig), QVS_FIELD(qvsClientProvCtx, ptVendorConfig),
     vendorConfig::kCopy},
    {QVS_FIELD(Node, ptWifi), QVS_FIELD(qvsClientProvCtx, ptWifi), wifi::kCopy},
    {QVS_FIELD(Node, ptVoWifi), QVS_FIELD(qvsClientProvCtx, ptVoWifi), voWifi::kCopy},
    {QVS_FIELD(Node, ptApplication), QVS_FIELD(qvsClientProvCtx, ptApplication),
     application::kCopy},
    {QVS_FIELD(Node, ptAccess), QVS_FIELD(qvsClientProvCtx, ptAccess), access::kCopy},
    // kept[context-top-level-dropped]: the kinds that are not named here are left out silently.
};

} // namespace

const Rows<ChildRow> qvs::kRootRows = kAtTheTop;

qvsCtxPxLogical *qvsClientProvCtxVerifyContextPxLogical(qvsWapPxLogical *record)
{
    return static_cast<qvsCtxPxLogical *>(copyRecord(record, pxLogical::kCopy));
}

qvsCtxPxAuthInfo *qvsClientProvCtxVerifyContextPxAuthInfo(qvsWapPxAuthInfo *record)
{
    return static_cast<qvsCtxPxAuthInfo *>(copyRecord(record, pxAuthInfo::kCopy));
}

qvsCtxPxPhysical *qvsClientProvCtxVerifyContextPxPhysical(qvsWapPxPhysical *record)
{
    return static_cast<qvsCtxPxPhysical *>(copyRecord(record, pxPhysical::kCopy));
}

qvsCtxPort *qvsClientProvCtxVerifyContextPort(qvsWapPort *record)
{
    return static_cast<qvsCtxPort *>(copyRecord(record, port::kCopy));
}

qvsCtxNapDef *qvsClientProvCtxVerifyContextNapdef(qvsWapNapDef *record)
{
    return static_cast<qvsCtxNapDef *>(copyRecord(record, napDef::kCopy));
}

qvsCtxNapAuthInfo *qvsClientProvCtxVerifyContextNapAuthInfo(qvsWapNapAuthInfo *record)
{
    return static_cast<qvsCtxNapAuthInfo *>(copyRecord(record, napAuthInfo::kCopy));
}

qvsCtxValidity *qvsClientProvCtxVerifyContextValidity(qvsWapValidity *record)
{
    return static_cast<qvsCtxValidity *>(copyRecord(record, validity::kCopy));
}

qvsCtxApplication *qvsClientProvCtxVerifyContextApplication(qvsWapApplication *record)
{
    return static_cast<qvsCtxApplication *>(copyRecord(record, application::kCopy));
}

qvsCtxAppAddr *qvsClientProvCtxVerifyContextAppAddr(qvsWapAppAddr *record)
{
    return static_cast<qvsCtxAppAddr *>(copyRecord(record, appAddr::kCopy));
}

qvsCtxAppAuth *qvsClientProvCtxVerifyContextAppAuth(qvsWapAppAuth *record)
{
    return static_cast<qvsCtxAppAuth *>(copyRecord(record, appAuth::kCopy));
}

qvsCtxResource *qvsClientProvCtxVerifyContextResource(qvsWapResource *record)
{
    return static_cast<qvsCtxResource *>(copyRecord(record, resource::kCopy));
}

qvsCtxRoaming *qvsClientProvCtxVerifyContextRoaming(qvsWapRoaming *record)
{
    return static_cast<qvsCtxRoaming *>(copyRecord(record, roaming::kCopy));
}

qvsCtxBootstrap *qvsClientProvCtxVerifyContextBootstrap(qvsWapBootstrap *record)
{
    return static_cast<qvsCtxBootstrap *>(copyRecord(record, bootstrap::kCopy));
}

qvsCtxClientIdent *qvsClientProvCtxVerifyContextClientIdent(qvsWapClientIdentity *record)
{
    return static_cast<qvsCtxClientIdent *>(copyRecord(record, clientIdent::kCopy));
}

qvsCtxVendorConfig *qvsClientProvCtxVerifyContextVenderConfig(qvsWapVendorConfig *record)
{
    return static_cast<qvsCtxVendorConfig *>(copyRecord(record, vendorConfig::kCopy));
}

qvsCtxAccess *qvsClientProvCtxVerifyContextAccess(qvsWapAccess *record)
{
    return static_cast<qvsCtxAccess *>(copyRecord(record, access::kCopy));
}

qvsCtxWifi *qvsClientProvCtxVerifyContextWifi(qvsWapWifi *record)
{
    return static_cast<qvsCtxWifi *>(copyRecord(record, wifi::kCopy));
}

qvsCtxVoWifi *qvsClientProvCtxVerifyContextVoWifi(qvsWapVoWifi *record)
{
    return static_cast<qvsCtxVoWifi *>(copyRecord(record, voWifi::kCopy));
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToAddrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToProxyList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextPortNbrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextAppIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextRuleList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextNetworkList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextProxyIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextAuthEntityList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextBearerList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextDnsAddrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToNapIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextServiceList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextDomainList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsResult qvsClientProvCtxVerifyCharacterPxLogical(qvsList *children, qvsCtxPxLogical *parent)
{
    return copyChildren(children, parent, pxLogical::kCopy);
}

qvsResult qvsClientProvCtxVerifyCharacterPxPhysical(qvsList *children, qvsCtxPxPhysical *parent)
{
    return copyChildren(children, parent, pxPhysical::kCopy);
}

qvsResult qvsClientProvCtxVerifyCharacterNapDef(qvsList *children, qvsCtxNapDef *parent)
{
    return copyChildren(children, parent, napDef::kCopy);
}

qvsResult qvsClientProvCtxVerifyCharacterApplication(qvsList *children, qvsCtxApplication *parent)
{
    return copyChildren(children, parent, application::kCopy);
}

qvsResult qvsClientProvCtxVerifyCharacterAppAddr(qvsList *children, qvsCtxAppAddr *parent)
{
    return copyChildren(children, parent, appAddr::kCopy);
}
