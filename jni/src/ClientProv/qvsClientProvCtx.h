// The provisioning context: the typed copy of a decoded document that the Java side reads.
// Records of one kind form a chain through their last field, ptNext, in document order; every
// record owns its texts, its text lists and its chains. A field that the document did not carry is
// null. Valid C and C++.
#ifndef QVSCLIENTPROVCTX_H
#define QVSCLIENTPROVCTX_H

#include "qvsClientProvWbxml.h"
#include "qvslist.h"
#include "qvsresult.h"

QVS_BEGIN_DECLS

// One text of a list.
typedef struct qvsCtxStrNode {
    union {
        char *pszValue;
        char *pAuthEntity; // its name in the AUTH-ENTITY list
    };
    struct qvsCtxStrNode *ptNext;
} qvsCtxStrNode;

typedef struct qvsCtxPxAuthInfo {
    char *pszPxAuthType;
    char *pszPxAuthId;
    char *pszPxAuthPw;
    struct qvsCtxPxAuthInfo *ptNext;
} qvsCtxPxAuthInfo;

typedef struct qvsCtxPort {
    char *pszPortNbr;
    qvsCtxStrNode *ptService;
    struct qvsCtxPort *ptNext;
} qvsCtxPort;

typedef struct qvsCtxPxPhysical {
    char *pszPhysicalProxyId;
    char *pszPxAddr;
    char *pszPxAddrType;
    char *pszPxAddrFqdn;
    char *pszWspVersion;
    char *pszPushEnabled;
    char *pszPullEnabled;
    qvsCtxStrNode *ptDomain;
    qvsCtxStrNode *ptToNapId;
    qvsCtxPort *ptPort;
    struct qvsCtxPxPhysical *ptNext;
} qvsCtxPxPhysical;

typedef struct qvsCtxPxLogical {
    char *pszProxyId;
    char *pszProxyPw;
    char *pszPpgAuthType;
    char *pszProxyProviderId;
    char *pszName;
    char *pszTrust;
    char *pszMaster;
    char *pszStartPage;
    char *pszReserved1;
    char *pszReserved2;
    char *pszReserved3;
    char *pszReserved4;
    char *pszReserved5;
    qvsCtxStrNode *ptDomain;
    qvsCtxPxAuthInfo *ptPxAuthInfo;
    qvsCtxPort *ptPort;
    qvsCtxPxPhysical *ptPxPhysical;
    struct qvsCtxPxLogical *ptNext;
} qvsCtxPxLogical;

typedef struct qvsCtxNapAuthInfo {
    char *pszAuthType;
    char *pszAuthName;
    char *pszAuthSecret;
    char *pszReserved;
    qvsCtxStrNode *ptAuthEntity;
    struct qvsCtxNapAuthInfo *ptNext;
} qvsCtxNapAuthInfo;

typedef struct qvsCtxValidity {
    char *pszCountry;
    char *pszNetwork;
    char *pszSid;
    char *pszSoc;
    char *pszValidUntil;
    struct qvsCtxValidity *ptNext;
} qvsCtxValidity;

typedef struct qvsCtxNapDef {
    char *pszNapId;
    char *pszName;
    char *pszInternet;
    char *pszNapAddress;
    char *pszNapAddrType;
    char *pszCallType;
    char *pszLocalAddr;
    char *pszLocalAddrType;
    char *pszLinkSpeed;
    char *pszDnLinkSpeed;
    char *pszLinger;
    char *pszDeliveryErrSdu;
    char *pszDeliveryOrder;
    char *pszTrafficClass;
    char *pszMaxSduSize;
    char *pszMaxBitrateUplink;
    char *pszMaxBitrateDnlink;
    char *pszReserved1;
    char *pszReserved2;
    char *pszReserved3;
    char *pszReserved4;
    char *pszReserved5;
    char *pszReserved6;
    char *pszMaxNumRetry;
    char *pszFirstRetryTimeout;
    char *pszReregThreshold;
    char *pszTBit;
    char *pszInit;
    qvsCtxStrNode *ptDnsAddr;
    qvsCtxStrNode *ptBearer;
    qvsCtxNapAuthInfo *ptNapAuthInfo;
    qvsCtxValidity *ptValidity;
    struct qvsCtxNapDef *ptNext;
} qvsCtxNapDef;

typedef struct qvsCtxAppAddr {
    char *pszAddr;
    char *pszAddrType;
    qvsCtxPort *ptPort;
    struct qvsCtxAppAddr *ptNext;
} qvsCtxAppAddr;

typedef struct qvsCtxAppAuth {
    char *pszAAuthLevel;
    char *pszAAuthType;
    char *pszAAuthName;
    char *pszAAuthSecret;
    char *pszAAuthData;
    struct qvsCtxAppAuth *ptNext;
} qvsCtxAppAuth;

typedef struct qvsCtxResource {
    char *pszUri;
    char *pszName;
    char *pszAAccept;
    char *pszAAuthType;
    char *pszAAuthName;
    char *pszAAuthSecret;
    char *pszAAuthData;
    char *pszStartPage;
    struct qvsCtxResource *ptNext;
} qvsCtxResource;

typedef struct qvsCtxRoaming {
    char *pszSyncAllowed;
    char *pszSyncDefault;
    struct qvsCtxRoaming *ptNext;
} qvsCtxRoaming;

typedef struct qvsCtxApplication {
    char *pszAppId;
    char *pszProviderId;
    char *pszFrom;
    char *pszName;
    char *pszAAccept;
    char *pszAProtocol;
    char *pszInternet;
    char *pszXcapAuidDcs;
    char *pszXcapAuidPms;
    char *pszXcapAuidCdms;
    char *pszXcapImeiHeader;
    char *pszXcapTidHeader;
    qvsCtxStrNode *ptToProxy;
    qvsCtxStrNode *ptToNapId;
    qvsCtxStrNode *ptToAddr;
    qvsCtxAppAddr *ptAppAddr;
    qvsCtxAppAuth *ptAppAuth;
    qvsCtxResource *ptResource;
    qvsCtxRoaming *ptRoaming;
    struct qvsCtxApplication *ptNext;
} qvsCtxApplication;

typedef struct qvsCtxBootstrap {
    char *pszName;
    char *pszCountry;
    char *pszProvUrl;
    char *pszContextAllow;
    qvsCtxStrNode *ptProxyId;
    qvsCtxStrNode *ptNetwork;
    struct qvsCtxBootstrap *ptNext;
} qvsCtxBootstrap;

typedef struct qvsCtxClientIdent {
    char *pszClientId;
} qvsCtxClientIdent;

typedef struct qvsCtxVendorConfig {
    char *pszName;
    char *pszParamName;
    char *pszParamValue;
    struct qvsCtxVendorConfig *ptNext;
} qvsCtxVendorConfig;

typedef struct qvsCtxAccess {
    qvsCtxStrNode *ptRule;
    qvsCtxStrNode *ptAppId;
    qvsCtxStrNode *ptPortNbr;
    qvsCtxStrNode *ptDomain;
    qvsCtxStrNode *ptToNapId;
    qvsCtxStrNode *ptToProxy;
    struct qvsCtxAccess *ptNext;
} qvsCtxAccess;

typedef struct qvsCtxWifi {
    char *pszNetSsid;
    char *pszSecMode;
    char *pszEapMethod;
    char *pszEapType;
    char *pszUserName;
    char *pszAnonUserName;
    char *pszPassword;
    char *pszCaCert;
    char *pszUserCert;
    char *pszPhase1;
    char *pszAuthAlgorithm;
    char *pszPriority;
    struct qvsCtxWifi *ptNext;
} qvsCtxWifi;

typedef struct qvsCtxVoWifi {
    char *pszEpdgFqdn;
    struct qvsCtxVoWifi *ptNext;
} qvsCtxVoWifi;

typedef struct qvsClientProvCtx {
    qvsCtxPxLogical *ptPxLogical;
    qvsCtxNapDef *ptNapDef;
    qvsCtxBootstrap *ptBootstrap;
    qvsCtxClientIdent *ptClientIdent; // one, never a chain
    qvsCtxVendorConfig *ptVendorConfig;
    qvsCtxApplication *ptApplication;
    qvsCtxAccess *ptAccess;
    qvsCtxWifi *ptWifi;
    qvsCtxVoWifi *ptVoWifi;
} qvsClientProvCtx;

// qvsClientProvCtxMakeContext copies a document tree into a new context, which the caller owns.
// Null for a null document or one without a list of characteristics.
QVS_API qvsClientProvCtx *qvsClientProvCtxMakeContext(qvsWapDoc *document);

// qvsClientProvCtxVerifyContext builds the context from the document's characteristics and stores
// it in *root, which the caller owns. QVS_ERROR_BAD_ARGUMENT for a null list; *root is only written
// on success.
QVS_NODISCARD QVS_API qvsResult qvsClientProvCtxVerifyContext(qvsList *list,
                                                              qvsClientProvCtx **root);

// The record builders copy one record of the tree, with its lists and accepted children, into a
// new context record that the caller owns; null for a null record or without memory.
QVS_API qvsCtxPxLogical *qvsClientProvCtxVerifyContextPxLogical(qvsWapPxLogical *record);
QVS_API qvsCtxPxAuthInfo *qvsClientProvCtxVerifyContextPxAuthInfo(qvsWapPxAuthInfo *record);
QVS_API qvsCtxPxPhysical *qvsClientProvCtxVerifyContextPxPhysical(qvsWapPxPhysical *record);
QVS_API qvsCtxPort *qvsClientProvCtxVerifyContextPort(qvsWapPort *record);
QVS_API qvsCtxNapDef *qvsClientProvCtxVerifyContextNapdef(qvsWapNapDef *record);
QVS_API qvsCtxNapAuthInfo *qvsClientProvCtxVerifyContextNapAuthInfo(qvsWapNapAuthInfo *record);
QVS_API qvsCtxValidity *qvsClientProvCtxVerifyContextValidity(qvsWapValidity *record);
QVS_API qvsCtxApplication *qvsClientProvCtxVerifyContextApplication(qvsWapApplication *record);
QVS_API qvsCtxAppAddr *qvsClientProvCtxVerifyContextAppAddr(qvsWapAppAddr *record);
QVS_API qvsCtxAppAuth *qvsClientProvCtxVerifyContextAppAuth(qvsWapAppAuth *record);
QVS_API qvsCtxResource *qvsClientProvCtxVerifyContextResource(qvsWapResource *record);
QVS_API qvsCtxRoaming *qvsClientProvCtxVerifyContextRoaming(qvsWapRoaming *record);
QVS_API qvsCtxBootstrap *qvsClientProvCtxVerifyContextBootstrap(qvsWapBootstrap *record);
QVS_API qvsCtxClientIdent *qvsClientProvCtxVerifyContextClientIdent(qvsWapClientIdentity *record);
QVS_API qvsCtxVendorConfig *qvsClientProvCtxVerifyContextVenderConfig(qvsWapVendorConfig *record);
QVS_API qvsCtxAccess *qvsClientProvCtxVerifyContextAccess(qvsWapAccess *record);
QVS_API qvsCtxWifi *qvsClientProvCtxVerifyContextWifi(qvsWapWifi *record);
QVS_API qvsCtxVoWifi *qvsClientProvCtxVerifyContextVoWifi(qvsWapVoWifi *record);

// The child walkers attach the accepted children of a list to the parent's chains.
// QVS_ERROR_FAILED at the first child that the parent does not accept, which ends the walk;
// QVS_ERROR_LIST_ARGUMENT for a null list.
QVS_API qvsResult qvsClientProvCtxVerifyCharacterPxLogical(qvsList *children,
                                                           qvsCtxPxLogical *parent);
QVS_API qvsResult qvsClientProvCtxVerifyCharacterPxPhysical(qvsList *children,
                                                            qvsCtxPxPhysical *parent);
QVS_API qvsResult qvsClientProvCtxVerifyCharacterNapDef(qvsList *children, qvsCtxNapDef *parent);
QVS_API qvsResult qvsClientProvCtxVerifyCharacterApplication(qvsList *children,
                                                             qvsCtxApplication *parent);
QVS_API qvsResult qvsClientProvCtxVerifyCharacterAppAddr(qvsList *children, qvsCtxAppAddr *parent);

// The list builders copy a list of texts into a chain that the caller owns; null for a null or
// empty list.
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextToAddrList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextToProxyList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextPortNbrList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextAppIdList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextRuleList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextNetworkList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextProxyIdList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextAuthEntityList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextBearerList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextDnsAddrList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextToNapIdList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextServiceList(qvsList *texts);
QVS_API qvsCtxStrNode *qvsClientProvCtxVerifyContextDomainList(qvsList *texts);

// qvsClientProvCtxDelectContext releases a context with everything that its releases below reach.
// Like them it answers nothing; null is only traced.
QVS_API void qvsClientProvCtxDelectContext(qvsClientProvCtx *root);

// The releases take the first record of a chain and let the whole chain go, in constant stack.
QVS_API void qvsClientProvCtxDelectContextRuleList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextAppIdList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextPortNbrList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextDomainList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextToNapIdList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextToProxyList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextToAddrList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextServiceList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextNetworkList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextProxyIdList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextDnsAddrList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextBearerList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextAuthEntityList(qvsCtxStrNode *node);
QVS_API void qvsClientProvCtxDelectContextPort(qvsCtxPort *record);
QVS_API void qvsClientProvCtxDelectContextNapAuthInfo(qvsCtxNapAuthInfo *record);
QVS_API void qvsClientProvCtxDelectContextValidity(qvsCtxValidity *record);
QVS_API void qvsClientProvCtxDelectContextAppAddr(qvsCtxAppAddr *record);
QVS_API void qvsClientProvCtxDelectContextAppAuth(qvsCtxAppAuth *record);
QVS_API void qvsClientProvCtxDelectContextResource(qvsCtxResource *record);
QVS_API void qvsClientProvCtxDelectContextPxAuthInfo(qvsCtxPxAuthInfo *record);
QVS_API void qvsClientProvCtxDelectContextPxPhysical(qvsCtxPxPhysical *record);
QVS_API void qvsClientProvCtxDelectContextAccess(qvsCtxAccess *record);
QVS_API void qvsClientProvCtxDelectContextApplication(qvsCtxApplication *record);
QVS_API void qvsClientProvCtxDelectContextBootstrap(qvsCtxBootstrap *record);
QVS_API void qvsClientProvCtxDelectContextClientIdent(qvsCtxClientIdent *record);
QVS_API void qvsClientProvCtxDelectContextNapDef(qvsCtxNapDef *record);
QVS_API void qvsClientProvCtxDelectContextPxLogical(qvsCtxPxLogical *record);
QVS_API void qvsClientProvCtxDelectContextVenderConfig(qvsCtxVendorConfig *record);
QVS_API void qvsClientProvCtxDelectContextWifi(qvsCtxWifi *record);
QVS_API void qvsClientProvCtxDelectContextVoWifi(qvsCtxVoWifi *record);

QVS_END_DECLS

#endif
