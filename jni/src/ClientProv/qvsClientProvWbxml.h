// The state of one decode, and the document tree that it fills: a root with a list of
// characteristics, each holding one typed record, five of which hold further characteristics.
// Parameter names are those of the OMA Client Provisioning content. Valid C and C++.
#ifndef QVSCLIENTPROVWBXML_H
#define QVSCLIENTPROVWBXML_H

#include "qvslist.h"
#include "qvsresult.h"
#include "smlbuffer.h"

#include <stdint.h>

QVS_BEGIN_DECLS

// The state of one decode. Owns its copy of the body and of the string table.
typedef struct qvsWbxmlDecoder {
    uint32_t nHasContent; // 1 when the last element token read had bit 0x40
    uint32_t nHasAttr;    // 1 when it had bit 0x80
    uint32_t nStrSize;    // bytes of the string table; 0xFFFFFFFF when it could not be read
    uint8_t nCodePage;    // 0 or 1
    char *pStringTable;   // private copy, NUL-terminated behind its last byte
    smlBuffer *ptBuffer;  // head is the read position, storage the start, size the data length
} qvsWbxmlDecoder;

// All fields of the tree are pointers, null when absent. A record owns its texts and lists; the
// items of a list are texts, those of ptCharacterList are qvsWapCharacter nodes, both in document
// order.

typedef struct qvsWapPxLogical {
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
    qvsList *ptDomainList;
    qvsList *ptCharacterList;
} qvsWapPxLogical;

typedef struct qvsWapPxAuthInfo {
    char *pszPxAuthType;
    char *pszPxAuthId;
    char *pszPxAuthPw;
} qvsWapPxAuthInfo;

typedef struct qvsWapPort {
    char *pszPortNbr;
    qvsList *ptServiceList;
} qvsWapPort;

typedef struct qvsWapPxPhysical {
    char *pszPhysicalProxyId;
    char *pszPxAddr;
    char *pszPxAddrType;
    char *pszPxAddrFqdn;
    char *pszWspVersion;
    char *pszPushEnabled;
    char *pszPullEnabled;
    qvsList *ptToNapIdList;
    qvsList *ptDomainList;
    qvsList *ptCharacterList;
} qvsWapPxPhysical;

typedef struct qvsWapNapDef {
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
    char *pszInit; // null, or constant text: never released
    qvsList *ptDnsAddrList;
    qvsList *ptBearerList;
    qvsList *ptCharacterList;
} qvsWapNapDef;

typedef struct qvsWapNapAuthInfo {
    char *pszAuthType;
    char *pszAuthName;
    char *pszAuthSecret;
    char *pszReserved;
    qvsList *ptAuthEntityList;
} qvsWapNapAuthInfo;

typedef struct qvsWapValidity {
    char *pszCountry;
    char *pszNetwork;
    char *pszSid;
    char *pszSoc;
    char *pszValidUntil;
} qvsWapValidity;

typedef struct qvsWapAppAddr {
    char *pszAddr;
    char *pszAddrType;
    qvsList *ptCharacterList;
} qvsWapAppAddr;

typedef struct qvsWapResource {
    char *pszUri;
    char *pszName;
    char *pszAAccept;
    char *pszAAuthType;
    char *pszAAuthName;
    char *pszAAuthSecret;
    char *pszAAuthData;
    char *pszStartPage;
} qvsWapResource;

typedef struct qvsWapAppAuth {
    char *pszAAuthLevel;
    char *pszAAuthType;
    char *pszAAuthName;
    char *pszAAuthSecret;
    char *pszAAuthData;
} qvsWapAppAuth;

typedef struct qvsWapApplication {
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
    qvsList *ptToProxyList;
    qvsList *ptToNapIdList;
    qvsList *ptAddrList;
    qvsList *ptCharacterList;
} qvsWapApplication;

typedef struct qvsWapBootstrap {
    char *pszName;
    char *pszCountry;
    char *pszProvUrl;
    char *pszContextAllow;
    qvsList *ptProxyIdList;
    qvsList *ptNetworkList;
} qvsWapBootstrap;

typedef struct qvsWapVendorConfig {
    char *pszName;
    char *pszParamName;
    char *pszParamValue;
} qvsWapVendorConfig;

typedef struct qvsWapClientIdentity {
    char *pszClientId;
} qvsWapClientIdentity;

typedef struct qvsWapAccess {
    qvsList *ptRuleList;
    qvsList *ptAppIdList;
    qvsList *ptPortNbrList;
    qvsList *ptDomainList;
    qvsList *ptToNapIdList;
    qvsList *ptToProxyList;
} qvsWapAccess;

typedef struct qvsWapRoaming {
    char *pszSyncAllowed;
    char *pszSyncDefault;
} qvsWapRoaming;

typedef struct qvsWapWifi {
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
} qvsWapWifi;

typedef struct qvsWapVoWifi {
    char *pszEpdgFqdn;
} qvsWapVoWifi;

// One characteristic element: a slot for each kind, of which normally one is set.
typedef struct qvsWapCharacter {
    qvsWapPxLogical *ptPxLogical;
    qvsWapPxAuthInfo *ptPxAuthInfo;
    qvsWapPort *ptPort;
    qvsWapPxPhysical *ptPxPhysical;
    qvsWapNapDef *ptNapDef;
    qvsWapNapAuthInfo *ptNapAuthInfo;
    qvsWapValidity *ptValidity;
    qvsWapAppAddr *ptAppAddr;
    qvsWapResource *ptResource;
    qvsWapAppAuth *ptAppAuth;
    qvsWapApplication *ptApplication;
    qvsWapBootstrap *ptBootstrap;
    qvsWapVendorConfig *ptVendorConfig;
    qvsWapClientIdentity *ptClientIdentity;
    qvsWapAccess *ptAccess;
    qvsWapRoaming *ptRoaming;
    qvsWapWifi *ptWifi;
    qvsWapVoWifi *ptVoWifi;
} qvsWapCharacter;

typedef struct qvsWapDoc {
    qvsList *ptCharacterList;
} qvsWapDoc;

// qvsClientProvWbxmlInitDecoder makes a decoder over its own copy of `length` bytes at `data`.
// Null data, or no memory for the record: *decoder null and QVS_ERROR_BAD_ARGUMENT. A decoder whose
// buffer could not be filled is handed out all the same; the decode then refuses it.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlInitDecoder(qvsWbxmlDecoder **decoder,
                                                              const uint8_t *data, uint32_t length);

// qvsClientProvWbxmlDeleteDecoder releases the decoder with its buffer and string table. Null:
// QVS_ERROR_BAD_ARGUMENT.
QVS_API qvsResult qvsClientProvWbxmlDeleteDecoder(qvsWbxmlDecoder *decoder);

// The releases answer 1 when they released something and 0 for null; they accept partly filled
// records. Each lets go of a record with its texts and lists, and of everything nested in it,
// innermost first, in constant stack.
QVS_API qvsResult qvsClientProvWbxmlDeleteWapDoc(qvsWapDoc *document);
QVS_API qvsResult qvsClientProvWbxmlDeleteCharacter(qvsWapCharacter *node);
QVS_API qvsResult qvsClientProvWbxmlDeletePxlogical(qvsWapPxLogical *record);
QVS_API qvsResult qvsClientProvWbxmlDeletePxAuthInfo(qvsWapPxAuthInfo *record);
QVS_API qvsResult qvsClientProvWbxmlDeletePort(qvsWapPort *record);
QVS_API qvsResult qvsClientProvWbxmlDeletePxphysical(qvsWapPxPhysical *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteNapDef(qvsWapNapDef *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteNapAuthInfo(qvsWapNapAuthInfo *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteValidity(qvsWapValidity *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteAppAddr(qvsWapAppAddr *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteResource(qvsWapResource *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteAppAuth(qvsWapAppAuth *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteApplication(qvsWapApplication *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteBootstrap(qvsWapBootstrap *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteVendorConfig(qvsWapVendorConfig *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteClientIdentity(qvsWapClientIdentity *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteAccess(qvsWapAccess *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteWifi(qvsWapWifi *record);
QVS_API qvsResult qvsClientProvWbxmlDeleteVoWifi(qvsWapVoWifi *record);

QVS_END_DECLS

#ifdef __cplusplus
struct qvsArena;

namespace [[gnu::visibility("hidden")]] qvs {

// Releases a node, a list of nodes, and a document, with all that is nested in them; null is
// ignored. Nodes and lists are pieces of the arena, records and texts blocks: records may stay
// allocated by design, and a context takes texts over.
void releaseNode(qvsArena *arena, qvsWapCharacter *node);
void releaseNodes(qvsArena *arena, qvsList *list);
void releaseDocument(qvsArena *arena, qvsWapDoc *document);

} // namespace qvs
#endif

#endif
