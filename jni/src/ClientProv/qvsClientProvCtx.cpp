// The provisioning context from outside: made from a document tree, and released chain by chain.
#include "qvsClientProvCtx.h"
#include "qvsFields.h"
#include "qvsmemory.h"
#include "qvstrace.h"

#include <stddef.h>

using namespace qvs;

namespace {

template <class Record>
using TextField = char *Record::*;

// A field that heads a chain, and the release of that chain.
template <class Record, class Node>
struct Chain {
    using Release = void (*)(Node *first);

    constexpr Chain(Node *Record::*f, Release r) : field(f), release(r) {}

    void releaseFrom(Record *record) const
    {
        if (record->*field) {
            release(record->*field);
        }
    }

    Node *Record::*field;
    Release release;
};

// Strips every record of a chain from the first to the last, then releases the records from the
// last to the first. The links, turned round on the way there, lead the way back.
template <class Record, class Strip>
void releaseRecords(Record *first, Strip strip)
{
    if (!first) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return;
    }
    Record *stripped = nullptr;
    for (Record *record = first; record;) {
        strip(record);
        Record *next = record->ptNext;
        record->ptNext = stripped;
        stripped = record;
        record = next;
    }
    while (stripped) {
        Record *record = stripped;
        stripped = record->ptNext;
        qvsMemFree_debug(record);
    }
}

// Of each record the chains from left to right; ptNext comes after them.
template <class Record, class... Nodes>
void releaseChain(Record *first, Chain<Record, Nodes>... chains)
{
    static_assert(sizeof...(chains) + 1 == kFieldsOf<Record>,
                  "a field is neither released nor left on purpose");
    releaseRecords(first, [chains...](Record *record) { (chains.releaseFrom(record), ...); });
}

// Of each record the texts in the order of their rows, then the chains from left to right.
template <class Record, size_t N, size_t L, class... Nodes>
void releaseChain(Record *first, const TextField<Record> (&texts)[N], Left<L>,
                  Chain<Record, Nodes>... chains)
{
    static_assert(N + L + sizeof...(chains) + 1 == kFieldsOf<Record>,
                  "a field is neither released nor left on purpose");
    releaseRecords(first, [&texts, chains...](Record *record) {
        for (TextField<Record> text : texts) {
            releaseText(&(record->*text));
        }
        (chains.releaseFrom(record), ...);
    });
}

// A list of texts, whatever it lists.
void releaseTexts(qvsCtxStrNode *first)
{
    releaseRecords(first, [](qvsCtxStrNode *node) { releaseText(&node->pszValue); });
}

// The root: its chains from left to right, then itself.
template <size_t L, class... Nodes>
void releaseRoot(qvsClientProvCtx *root, Left<L>, Chain<qvsClientProvCtx, Nodes>... chains)
{
    static_assert(L + sizeof...(chains) == kFieldsOf<qvsClientProvCtx>,
                  "a field is neither released nor left on purpose");
    if (!root) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return;
    }
    (chains.releaseFrom(root), ...);
    qvsMemFree_debug(root);
}

} // namespace

qvsClientProvCtx *qvsClientProvCtxMakeContext(qvsWapDoc *document)
{
    if (!document) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return nullptr;
    }
    qvsClientProvCtx *root = nullptr;
    const qvsResult result = qvsClientProvCtxVerifyContext(document->ptCharacterList, &root);
    traceError(result);
    return root;
}

void qvsClientProvCtxDelectContext(qvsClientProvCtx *root)
{
    using R = qvsClientProvCtx;
    // kept[context-wifi-left]: the WIFI records stay allocated when the context is gone.
    // kept[context-napdef-skipped]: NAPDEF records before the one that ptNapDef was moved to stay
    // allocated too.
    releaseRoot(root, leave(&R::ptWifi), Chain{&R::ptAccess, qvsClientProvCtxDelectContextAccess},
                Chain{&R::ptApplication, qvsClientProvCtxDelectContextApplication},
                Chain{&R::ptBootstrap, qvsClientProvCtxDelectContextBootstrap},
                Chain{&R::ptClientIdent, qvsClientProvCtxDelectContextClientIdent},
                Chain{&R::ptNapDef, qvsClientProvCtxDelectContextNapDef},
                Chain{&R::ptPxLogical, qvsClientProvCtxDelectContextPxLogical},
                Chain{&R::ptVendorConfig, qvsClientProvCtxDelectContextVenderConfig},
                Chain{&R::ptVoWifi, qvsClientProvCtxDelectContextVoWifi});
}

void qvsClientProvCtxDelectContextRuleList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextAppIdList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextPortNbrList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextDomainList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextToNapIdList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextToProxyList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextToAddrList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextServiceList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextNetworkList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextProxyIdList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextDnsAddrList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextBearerList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextAuthEntityList(qvsCtxStrNode *node)
{
    releaseTexts(node);
}

void qvsClientProvCtxDelectContextPort(qvsCtxPort *record)
{
    using R = qvsCtxPort;
    static constexpr TextField<R> kTexts[] = {&R::pszPortNbr};
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptService, qvsClientProvCtxDelectContextServiceList});
}

void qvsClientProvCtxDelectContextNapAuthInfo(qvsCtxNapAuthInfo *record)
{
    using R = qvsCtxNapAuthInfo;
    static constexpr TextField<R> kTexts[] = {
        &R::pszAuthType,
        &R::pszAuthName,
        &R::pszAuthSecret,
        &R::pszReserved,
    };
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptAuthEntity, qvsClientProvCtxDelectContextAuthEntityList});
}

void qvsClientProvCtxDelectContextValidity(qvsCtxValidity *record)
{
    using R = qvsCtxValidity;
    static constexpr TextField<R> kTexts[] = {
        &R::pszCountry, &R::pszNetwork, &R::pszSid, &R::pszSoc, &R::pszValidUntil,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextAppAddr(qvsCtxAppAddr *record)
{
    using R = qvsCtxAppAddr;
    static constexpr TextField<R> kTexts[] = {&R::pszAddr, &R::pszAddrType};
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptPort, qvsClientProvCtxDelectContextPort});
}

void qvsClientProvCtxDelectContextAppAuth(qvsCtxAppAuth *record)
{
    using R = qvsCtxAppAuth;
    static constexpr TextField<R> kTexts[] = {
        &R::pszAAuthData, &R::pszAAuthLevel, &R::pszAAuthName, &R::pszAAuthSecret, &R::pszAAuthType,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextResource(qvsCtxResource *record)
{
    using R = qvsCtxResource;
    static constexpr TextField<R> kTexts[] = {
        &R::pszAAccept,   &R::pszAAuthData, &R::pszAAuthName, &R::pszAAuthSecret,
        &R::pszAAuthType, &R::pszName,      &R::pszStartPage, &R::pszUri,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextPxAuthInfo(qvsCtxPxAuthInfo *record)
{
    using R = qvsCtxPxAuthInfo;
    static constexpr TextField<R> kTexts[] = {
        &R::pszPxAuthType,
        &R::pszPxAuthId,
        &R::pszPxAuthPw,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextPxPhysical(qvsCtxPxPhysical *record)
{
    using R = qvsCtxPxPhysical;
    static constexpr TextField<R> kTexts[] = {
        &R::pszPhysicalProxyId, &R::pszPxAddr,      &R::pszPxAddrType,  &R::pszPxAddrFqdn,
        &R::pszWspVersion,      &R::pszPushEnabled, &R::pszPullEnabled,
    };
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptToNapId, qvsClientProvCtxDelectContextToNapIdList},
                 Chain{&R::ptDomain, qvsClientProvCtxDelectContextDomainList},
                 Chain{&R::ptPort, qvsClientProvCtxDelectContextPort});
}

void qvsClientProvCtxDelectContextAccess(qvsCtxAccess *record)
{
    using R = qvsCtxAccess;
    releaseChain(record, Chain{&R::ptAppId, qvsClientProvCtxDelectContextAppIdList},
                 Chain{&R::ptDomain, qvsClientProvCtxDelectContextDomainList},
                 Chain{&R::ptPortNbr, qvsClientProvCtxDelectContextPortNbrList},
                 Chain{&R::ptRule, qvsClientProvCtxDelectContextRuleList},
                 Chain{&R::ptToNapId, qvsClientProvCtxDelectContextToNapIdList},
                 Chain{&R::ptToProxy, qvsClientProvCtxDelectContextToProxyList});
}

void qvsClientProvCtxDelectContextApplication(qvsCtxApplication *record)
{
    using R = qvsCtxApplication;
    static constexpr TextField<R> kTexts[] = {
        &R::pszAAccept,    &R::pszAppId, &R::pszAProtocol, &R::pszName,
        &R::pszProviderId, &R::pszFrom,  &R::pszInternet,
    };
    // kept[context-application-left]: the XCAP texts and the ROAMING records stay allocated.
    releaseChain(record, kTexts,
                 leave(&R::pszXcapAuidDcs, &R::pszXcapAuidPms, &R::pszXcapAuidCdms,
                       &R::pszXcapImeiHeader, &R::pszXcapTidHeader, &R::ptRoaming),
                 Chain{&R::ptToAddr, qvsClientProvCtxDelectContextToAddrList},
                 Chain{&R::ptToNapId, qvsClientProvCtxDelectContextToNapIdList},
                 Chain{&R::ptToProxy, qvsClientProvCtxDelectContextToProxyList},
                 Chain{&R::ptAppAddr, qvsClientProvCtxDelectContextAppAddr},
                 Chain{&R::ptAppAuth, qvsClientProvCtxDelectContextAppAuth},
                 Chain{&R::ptResource, qvsClientProvCtxDelectContextResource});
}

void qvsClientProvCtxDelectContextBootstrap(qvsCtxBootstrap *record)
{
    using R = qvsCtxBootstrap;
    static constexpr TextField<R> kTexts[] = {
        &R::pszContextAllow,
        &R::pszCountry,
        &R::pszName,
        &R::pszProvUrl,
    };
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptNetwork, qvsClientProvCtxDelectContextNetworkList},
                 Chain{&R::ptProxyId, qvsClientProvCtxDelectContextProxyIdList});
}

void qvsClientProvCtxDelectContextClientIdent(qvsCtxClientIdent *record)
{
    if (!record) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return;
    }
    releaseText(&record->pszClientId);
    qvsMemFree_debug(record);
}

void qvsClientProvCtxDelectContextNapDef(qvsCtxNapDef *record)
{
    using R = qvsCtxNapDef;
    static constexpr TextField<R> kTexts[] = {
        &R::pszNapId,
        &R::pszName,
        &R::pszInternet,
        &R::pszNapAddress,
        &R::pszNapAddrType,
        &R::pszCallType,
        &R::pszLocalAddr,
        &R::pszLocalAddrType,
        &R::pszLinkSpeed,
        &R::pszDnLinkSpeed,
        &R::pszLinger,
        &R::pszDeliveryErrSdu,
        &R::pszDeliveryOrder,
        &R::pszTrafficClass,
        &R::pszMaxSduSize,
        &R::pszMaxBitrateUplink,
        &R::pszMaxBitrateDnlink,
        &R::pszReserved1,
        &R::pszReserved2,
        &R::pszReserved3,
        &R::pszReserved4,
        &R::pszReserved5,
        &R::pszReserved6,
        &R::pszMaxNumRetry,
        &R::pszFirstRetryTimeout,
        &R::pszReregThreshold,
        &R::pszTBit,
    };
    // kept[context-init-left]: the copy of INIT stays allocated.
    releaseChain(record, kTexts, leave(&R::pszInit),
                 Chain{&R::ptDnsAddr, qvsClientProvCtxDelectContextDnsAddrList},
                 Chain{&R::ptBearer, qvsClientProvCtxDelectContextBearerList},
                 Chain{&R::ptNapAuthInfo, qvsClientProvCtxDelectContextNapAuthInfo},
                 Chain{&R::ptValidity, qvsClientProvCtxDelectContextValidity});
}

void qvsClientProvCtxDelectContextPxLogical(qvsCtxPxLogical *record)
{
    using R = qvsCtxPxLogical;
    static constexpr TextField<R> kTexts[] = {
        &R::pszProxyId,   &R::pszProxyPw,   &R::pszPpgAuthType, &R::pszProxyProviderId,
        &R::pszName,      &R::pszTrust,     &R::pszMaster,      &R::pszStartPage,
        &R::pszReserved1, &R::pszReserved2, &R::pszReserved3,   &R::pszReserved4,
        &R::pszReserved5,
    };
    releaseChain(record, kTexts, kNothingLeft,
                 Chain{&R::ptDomain, qvsClientProvCtxDelectContextDomainList},
                 Chain{&R::ptPort, qvsClientProvCtxDelectContextPort},
                 Chain{&R::ptPxAuthInfo, qvsClientProvCtxDelectContextPxAuthInfo},
                 Chain{&R::ptPxPhysical, qvsClientProvCtxDelectContextPxPhysical});
}

void qvsClientProvCtxDelectContextVenderConfig(qvsCtxVendorConfig *record)
{
    using R = qvsCtxVendorConfig;
    static constexpr TextField<R> kTexts[] = {
        &R::pszName,
        &R::pszParamName,
        &R::pszParamValue,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextWifi(qvsCtxWifi *record)
{
    using R = qvsCtxWifi;
    static constexpr TextField<R> kTexts[] = {
        &R::pszNetSsid,  &R::pszSecMode,      &R::pszEapMethod,     &R::pszEapType,
        &R::pszUserName, &R::pszAnonUserName, &R::pszPassword,      &R::pszCaCert,
        &R::pszUserCert, &R::pszPhase1,       &R::pszAuthAlgorithm, &R::pszPriority,
    };
    releaseChain(record, kTexts, kNothingLeft);
}

void qvsClientProvCtxDelectContextVoWifi(qvsCtxVoWifi *record)
{
    using R = qvsCtxVoWifi;
    static constexpr TextField<R> kTexts[] = {&R::pszEpdgFqdn};
    releaseChain(record, kTexts, kNothingLeft);
}
