// The records of the context: each a copy of one record of the document tree, with its texts, its
// lists and the children that it accepts.
#include "qvsClientProvCtx.h"
#include "qvsCtxChain.h"
#include "qvslist.h"
#include "qvsstring.h"
#include "qvstrace.h"

#include <stddef.h>

using namespace qvs;

namespace {

// A text of a record of the tree, and the field that its copy goes to.
template <class Ctx, class Wap>
struct CopyText {
    char *Wap::*from;
    char *Ctx::*to;
};

// A list of a record of the tree, the chain that is made of it, and by whom.
template <class Ctx, class Wap>
struct CopyList {
    qvsList *Wap::*from;
    qvsCtxStrNode *Ctx::*to;
    qvsCtxStrNode *(*build)(qvsList *texts);
};

char *copyOf(const char *text)
{
    return qvsStrdup_debug(text, kCtxModule, __LINE__);
}

template <class Ctx, class Wap, size_t N>
void copyFields(Ctx *copy, const Wap *record, const CopyText<Ctx, Wap> (&texts)[N])
{
    for (const CopyText<Ctx, Wap> &text : texts) {
        if (record->*text.from) {
            copy->*text.to = copyOf(record->*text.from);
        }
    }
}

template <class Ctx, class Wap, size_t N>
void copyFields(Ctx *copy, const Wap *record, const CopyList<Ctx, Wap> (&lists)[N])
{
    for (const CopyList<Ctx, Wap> &list : lists) {
        copy->*list.to = list.build(record->*list.from);
    }
}

// A new record with the fields of the tables, in their order. Null for a null record or without
// memory.
template <class Ctx, class Wap, class... Tables>
Ctx *copyRecord(const Wap *record, const Tables &...tables)
{
    if (!record) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return nullptr;
    }
    Ctx *copy = newCtxRecord<Ctx>();
    if (copy) {
        (copyFields(copy, record, tables), ...);
    }
    return copy;
}

// The texts of a list as a chain, up to the first one without memory; null when there are none.
qvsCtxStrNode *copyTexts(qvsList *texts)
{
    qvsCtxStrNode *head = nullptr;
    ChainEnd chain(&head);
    void *text = nullptr;
    qvsResult result = firstItem(texts, &text);
    while (result == QVS_OK && text) {
        qvsCtxStrNode *node = newCtxRecord<qvsCtxStrNode>();
        if (!node) {
            break;
        }
        chain.append(node);
        node->pszValue = copyOf(static_cast<const char *>(text));
        result = qvsListGetItemNext(texts, &text);
    }
    traceError(result);
    return head;
}

} // namespace

qvsCtxPxLogical *qvsClientProvCtxVerifyContextPxLogical(qvsWapPxLogical *record)
{
    using C = qvsCtxPxLogical;
    using W = qvsWapPxLogical;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszProxyId, &C::pszProxyId},
        {&W::pszProxyPw, &C::pszProxyPw},
        {&W::pszPpgAuthType, &C::pszPpgAuthType},
        {&W::pszProxyProviderId, &C::pszProxyProviderId},
        {&W::pszName, &C::pszName},
        {&W::pszTrust, &C::pszTrust},
        {&W::pszMaster, &C::pszMaster},
        {&W::pszStartPage, &C::pszStartPage},
        {&W::pszReserved1, &C::pszReserved1},
        {&W::pszReserved2, &C::pszReserved2},
        {&W::pszReserved3, &C::pszReserved3},
        // kept[context-pxlogical-twelfth]: pszReserved4 is never copied.
        {&W::pszReserved5, &C::pszReserved5},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptDomainList, &C::ptDomain, qvsClientProvCtxVerifyContextDomainList},
    };
    C *copy = copyRecord<C>(record, kTexts, kLists);
    if (copy) {
        traceError(qvsClientProvCtxVerifyCharacterPxLogical(record->ptCharacterList, copy));
    }
    return copy;
}

qvsCtxPxAuthInfo *qvsClientProvCtxVerifyContextPxAuthInfo(qvsWapPxAuthInfo *record)
{
    using C = qvsCtxPxAuthInfo;
    using W = qvsWapPxAuthInfo;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszPxAuthType, &C::pszPxAuthType},
        {&W::pszPxAuthId, &C::pszPxAuthId},
        {&W::pszPxAuthPw, &C::pszPxAuthPw},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxPxPhysical *qvsClientProvCtxVerifyContextPxPhysical(qvsWapPxPhysical *record)
{
    using C = qvsCtxPxPhysical;
    using W = qvsWapPxPhysical;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszPhysicalProxyId, &C::pszPhysicalProxyId}, {&W::pszPxAddr, &C::pszPxAddr},
        {&W::pszPxAddrType, &C::pszPxAddrType},           {&W::pszPxAddrFqdn, &C::pszPxAddrFqdn},
        {&W::pszWspVersion, &C::pszWspVersion},           {&W::pszPushEnabled, &C::pszPushEnabled},
        {&W::pszPullEnabled, &C::pszPullEnabled},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptDomainList, &C::ptDomain, qvsClientProvCtxVerifyContextDomainList},
        {&W::ptToNapIdList, &C::ptToNapId, qvsClientProvCtxVerifyContextToNapIdList},
    };
    C *copy = copyRecord<C>(record, kTexts, kLists);
    if (copy) {
        // kept[context-misfit-ignored]: not even traced here.
        (void)qvsClientProvCtxVerifyCharacterPxPhysical(record->ptCharacterList, copy);
    }
    return copy;
}

qvsCtxPort *qvsClientProvCtxVerifyContextPort(qvsWapPort *record)
{
    using C = qvsCtxPort;
    using W = qvsWapPort;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszPortNbr, &C::pszPortNbr},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptServiceList, &C::ptService, qvsClientProvCtxVerifyContextServiceList},
    };
    return copyRecord<C>(record, kTexts, kLists);
}

qvsCtxNapDef *qvsClientProvCtxVerifyContextNapdef(qvsWapNapDef *record)
{
    using C = qvsCtxNapDef;
    using W = qvsWapNapDef;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszNapId, &C::pszNapId},
        {&W::pszName, &C::pszName},
        {&W::pszInternet, &C::pszInternet},
        {&W::pszNapAddress, &C::pszNapAddress},
        {&W::pszNapAddrType, &C::pszNapAddrType},
        {&W::pszInit, &C::pszInit},
        {&W::pszCallType, &C::pszCallType},
        {&W::pszLocalAddr, &C::pszLocalAddr},
        {&W::pszLocalAddrType, &C::pszLocalAddrType},
        {&W::pszLinkSpeed, &C::pszLinkSpeed},
        {&W::pszDnLinkSpeed, &C::pszDnLinkSpeed},
        {&W::pszLinger, &C::pszLinger},
        {&W::pszDeliveryErrSdu, &C::pszDeliveryErrSdu},
        {&W::pszDeliveryOrder, &C::pszDeliveryOrder},
        {&W::pszTrafficClass, &C::pszTrafficClass},
        {&W::pszMaxSduSize, &C::pszMaxSduSize},
        {&W::pszMaxBitrateUplink, &C::pszMaxBitrateUplink},
        {&W::pszMaxBitrateDnlink, &C::pszMaxBitrateDnlink},
        {&W::pszReserved1, &C::pszReserved1},
        {&W::pszReserved2, &C::pszReserved2},
        {&W::pszReserved3, &C::pszReserved3},
        {&W::pszReserved4, &C::pszReserved4},
        {&W::pszReserved5, &C::pszReserved5},
        {&W::pszReserved6, &C::pszReserved6},
        {&W::pszMaxNumRetry, &C::pszMaxNumRetry},
        {&W::pszFirstRetryTimeout, &C::pszFirstRetryTimeout},
        {&W::pszReregThreshold, &C::pszReregThreshold},
        {&W::pszTBit, &C::pszTBit},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptDnsAddrList, &C::ptDnsAddr, qvsClientProvCtxVerifyContextDnsAddrList},
        {&W::ptBearerList, &C::ptBearer, qvsClientProvCtxVerifyContextBearerList},
    };
    C *copy = copyRecord<C>(record, kTexts, kLists);
    if (copy) {
        traceError(qvsClientProvCtxVerifyCharacterNapDef(record->ptCharacterList, copy));
    }
    return copy;
}

qvsCtxNapAuthInfo *qvsClientProvCtxVerifyContextNapAuthInfo(qvsWapNapAuthInfo *record)
{
    using C = qvsCtxNapAuthInfo;
    using W = qvsWapNapAuthInfo;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszAuthType, &C::pszAuthType},
        {&W::pszAuthName, &C::pszAuthName},
        {&W::pszAuthSecret, &C::pszAuthSecret},
        {&W::pszReserved, &C::pszReserved},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptAuthEntityList, &C::ptAuthEntity, qvsClientProvCtxVerifyContextAuthEntityList},
    };
    C *copy = copyRecord<C>(record, kTexts, kLists);
    // hardened: an entity without memory for its text is left out of the trace.
    if (copy && copy->ptAuthEntity && copy->ptAuthEntity->pAuthEntity) {
        trace("NAP:ptCtx->ptAuthEntity->pAuthEntity[%s]", copy->ptAuthEntity->pAuthEntity);
    }
    return copy;
}

qvsCtxValidity *qvsClientProvCtxVerifyContextValidity(qvsWapValidity *record)
{
    using C = qvsCtxValidity;
    using W = qvsWapValidity;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszCountry, &C::pszCountry},
        {&W::pszNetwork, &C::pszNetwork},
        {&W::pszSid, &C::pszSid},
        {&W::pszSoc, &C::pszSoc},
        {&W::pszValidUntil, &C::pszValidUntil},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxApplication *qvsClientProvCtxVerifyContextApplication(qvsWapApplication *record)
{
    using C = qvsCtxApplication;
    using W = qvsWapApplication;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszAppId, &C::pszAppId},
        {&W::pszProviderId, &C::pszProviderId},
        {&W::pszFrom, &C::pszFrom},
        {&W::pszName, &C::pszName},
        {&W::pszAAccept, &C::pszAAccept},
        {&W::pszAProtocol, &C::pszAProtocol},
        {&W::pszInternet, &C::pszInternet},
        {&W::pszXcapAuidDcs, &C::pszXcapAuidDcs},
        {&W::pszXcapAuidPms, &C::pszXcapAuidPms},
        {&W::pszXcapAuidCdms, &C::pszXcapAuidCdms},
        {&W::pszXcapImeiHeader, &C::pszXcapImeiHeader},
        {&W::pszXcapTidHeader, &C::pszXcapTidHeader},
        // kept[context-from-twice]: FROM is copied once more, and the first copy stays allocated.
        {&W::pszFrom, &C::pszFrom},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptToProxyList, &C::ptToProxy, qvsClientProvCtxVerifyContextToProxyList},
        {&W::ptToNapIdList, &C::ptToNapId, qvsClientProvCtxVerifyContextToNapIdList},
        {&W::ptAddrList, &C::ptToAddr, qvsClientProvCtxVerifyContextToAddrList},
    };
    C *copy = copyRecord<C>(record, kTexts, kLists);
    if (copy) {
        traceError(qvsClientProvCtxVerifyCharacterApplication(record->ptCharacterList, copy));
    }
    return copy;
}

qvsCtxAppAddr *qvsClientProvCtxVerifyContextAppAddr(qvsWapAppAddr *record)
{
    using C = qvsCtxAppAddr;
    using W = qvsWapAppAddr;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszAddr, &C::pszAddr},
        {&W::pszAddrType, &C::pszAddrType},
    };
    C *copy = copyRecord<C>(record, kTexts);
    if (copy) {
        // kept[context-misfit-ignored]: not even traced here.
        (void)qvsClientProvCtxVerifyCharacterAppAddr(record->ptCharacterList, copy);
    }
    return copy;
}

qvsCtxAppAuth *qvsClientProvCtxVerifyContextAppAuth(qvsWapAppAuth *record)
{
    using C = qvsCtxAppAuth;
    using W = qvsWapAppAuth;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszAAuthLevel, &C::pszAAuthLevel}, {&W::pszAAuthType, &C::pszAAuthType},
        {&W::pszAAuthName, &C::pszAAuthName},   {&W::pszAAuthSecret, &C::pszAAuthSecret},
        {&W::pszAAuthData, &C::pszAAuthData},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxResource *qvsClientProvCtxVerifyContextResource(qvsWapResource *record)
{
    using C = qvsCtxResource;
    using W = qvsWapResource;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszUri, &C::pszUri},
        {&W::pszName, &C::pszName},
        {&W::pszAAccept, &C::pszAAccept},
        {&W::pszAAuthType, &C::pszAAuthType},
        {&W::pszAAuthName, &C::pszAAuthName},
        {&W::pszAAuthSecret, &C::pszAAuthSecret},
        {&W::pszAAuthData, &C::pszAAuthData},
        {&W::pszStartPage, &C::pszStartPage},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxRoaming *qvsClientProvCtxVerifyContextRoaming(qvsWapRoaming *record)
{
    using C = qvsCtxRoaming;
    using W = qvsWapRoaming;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszSyncAllowed, &C::pszSyncAllowed},
        {&W::pszSyncDefault, &C::pszSyncDefault},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxBootstrap *qvsClientProvCtxVerifyContextBootstrap(qvsWapBootstrap *record)
{
    using C = qvsCtxBootstrap;
    using W = qvsWapBootstrap;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszName, &C::pszName},
        {&W::pszCountry, &C::pszCountry},
        {&W::pszProvUrl, &C::pszProvUrl},
        {&W::pszContextAllow, &C::pszContextAllow},
    };
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptProxyIdList, &C::ptProxyId, qvsClientProvCtxVerifyContextProxyIdList},
        {&W::ptNetworkList, &C::ptNetwork, qvsClientProvCtxVerifyContextNetworkList},
    };
    return copyRecord<C>(record, kTexts, kLists);
}

qvsCtxClientIdent *qvsClientProvCtxVerifyContextClientIdent(qvsWapClientIdentity *record)
{
    using C = qvsCtxClientIdent;
    using W = qvsWapClientIdentity;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszClientId, &C::pszClientId},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxVendorConfig *qvsClientProvCtxVerifyContextVenderConfig(qvsWapVendorConfig *record)
{
    using C = qvsCtxVendorConfig;
    using W = qvsWapVendorConfig;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszName, &C::pszName},
        {&W::pszParamName, &C::pszParamName},
        {&W::pszParamValue, &C::pszParamValue},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxAccess *qvsClientProvCtxVerifyContextAccess(qvsWapAccess *record)
{
    using C = qvsCtxAccess;
    using W = qvsWapAccess;
    static constexpr CopyList<C, W> kLists[] = {
        {&W::ptRuleList, &C::ptRule, qvsClientProvCtxVerifyContextRuleList},
        {&W::ptAppIdList, &C::ptAppId, qvsClientProvCtxVerifyContextAppIdList},
        {&W::ptPortNbrList, &C::ptPortNbr, qvsClientProvCtxVerifyContextPortNbrList},
        {&W::ptDomainList, &C::ptDomain, qvsClientProvCtxVerifyContextDomainList},
        {&W::ptToNapIdList, &C::ptToNapId, qvsClientProvCtxVerifyContextToNapIdList},
        {&W::ptToProxyList, &C::ptToProxy, qvsClientProvCtxVerifyContextToProxyList},
    };
    return copyRecord<C>(record, kLists);
}

qvsCtxWifi *qvsClientProvCtxVerifyContextWifi(qvsWapWifi *record)
{
    using C = qvsCtxWifi;
    using W = qvsWapWifi;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszNetSsid, &C::pszNetSsid},
        {&W::pszSecMode, &C::pszSecMode},
        {&W::pszEapMethod, &C::pszEapMethod},
        {&W::pszEapType, &C::pszEapType},
        {&W::pszUserName, &C::pszUserName},
        {&W::pszAnonUserName, &C::pszAnonUserName},
        {&W::pszPassword, &C::pszPassword},
        {&W::pszCaCert, &C::pszCaCert},
        {&W::pszUserCert, &C::pszUserCert},
        {&W::pszPhase1, &C::pszPhase1},
        {&W::pszAuthAlgorithm, &C::pszAuthAlgorithm},
        {&W::pszPriority, &C::pszPriority},
    };
    return copyRecord<C>(record, kTexts);
}

qvsCtxVoWifi *qvsClientProvCtxVerifyContextVoWifi(qvsWapVoWifi *record)
{
    using C = qvsCtxVoWifi;
    using W = qvsWapVoWifi;
    static constexpr CopyText<C, W> kTexts[] = {
        {&W::pszEpdgFqdn, &C::pszEpdgFqdn},
    };
    return copyRecord<C>(record, kTexts);
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
