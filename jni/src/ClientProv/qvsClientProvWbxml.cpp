// Creation of the decoder, and the releases of the document tree: one per kind of record, and one
// loop for all that is nested in a record.
#include "qvsClientProvWbxml.h"
#include "qvsFields.h"
#include "qvslist.h"
#include "qvsmemory.h"
#include "qvstrace.h"
#include "smlbuffer.h"

using namespace qvs;

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvsClientProvWbxml";

// The two answers of a release.
constexpr qvsResult kNothing = 0;
constexpr qvsResult kReleased = 1;

// One field that a record owns: a text, or a list of texts.
template <class Record>
struct Owned {
    constexpr Owned(char *Record::*f) : text(f) {}
    constexpr Owned(qvsList *Record::*f) : list(f) {}

    char *Record::*text = nullptr;
    qvsList *Record::*list = nullptr;
};

void releaseList(qvsList **field)
{
    if (*field) {
        (void)qvsListDeleteNodeAllAndList(*field, nullptr); // refuses only a list that is not there
        *field = nullptr;
    }
}

// Releases the fields in the order of their rows, and clears them.
template <class Record, size_t N>
void releaseFields(Record *record, const Owned<Record> (&fields)[N])
{
    for (const Owned<Record> &field : fields) {
        if (field.text) {
            releaseText(&(record->*field.text));
        } else {
            releaseList(&(record->*field.list));
        }
    }
}

// Releases a record in which nothing is nested.
template <class Record, size_t N, size_t L = 0>
qvsResult releaseLeaf(Record *record, const Owned<Record> (&fields)[N], Left<L> = {})
{
    static_assert(N + L == kFieldsOf<Record>, "a field is neither released nor left on purpose");
    if (!record) {
        return kNothing;
    }
    releaseFields(record, fields);
    qvsMemFree_debug(record);
    return kReleased;
}

// The first half of the release of a record with children: everything that comes before them.
// Harmless when it was done before.
template <class Record, size_t N, size_t L = 0>
void openParent(Record *record, const Owned<Record> (&fields)[N], Left<L> = {})
{
    constexpr size_t kChildList = 1;
    static_assert(N + L + kChildList == kFieldsOf<Record>,
                  "a field is neither released nor left on purpose");
    releaseFields(record, fields);
}

// The second half, once the children are gone.
template <class Record>
void closeParent(Record *record)
{
    releaseList(&record->ptCharacterList);
    qvsMemFree_debug(record);
}

void openPxLogical(qvsWapPxLogical *record)
{
    using R = qvsWapPxLogical;
    static constexpr Owned<R> kFields[] = {
        &R::pszProxyId,   &R::pszProxyPw,   &R::pszPpgAuthType, &R::pszProxyProviderId,
        &R::pszName,      &R::pszTrust,     &R::pszMaster,      &R::pszStartPage,
        &R::pszReserved1, &R::pszReserved2, &R::pszReserved3,   &R::pszReserved4,
        &R::pszReserved5, &R::ptDomainList,
    };
    openParent(record, kFields);
}

void openPxPhysical(qvsWapPxPhysical *record)
{
    using R = qvsWapPxPhysical;
    static constexpr Owned<R> kFields[] = {
        &R::pszPhysicalProxyId, &R::pszPxAddr,     &R::pszPxAddrType,
        &R::pszPxAddrFqdn,      &R::pszWspVersion, &R::pszPushEnabled,
        &R::pszPullEnabled,     &R::ptToNapIdList, &R::ptDomainList,
    };
    openParent(record, kFields);
}

void openNapDef(qvsWapNapDef *record)
{
    using R = qvsWapNapDef;
    static constexpr Owned<R> kFields[] = {
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
        &R::ptDnsAddrList,
        &R::ptBearerList,
    };
    // kept[tree-init-left]: INIT is constant text, which no release touches.
    openParent(record, kFields, leave(&R::pszInit));
}

void openAppAddr(qvsWapAppAddr *record)
{
    using R = qvsWapAppAddr;
    static constexpr Owned<R> kFields[] = {&R::pszAddrType, &R::pszAddr};
    openParent(record, kFields);
}

void openApplication(qvsWapApplication *record)
{
    using R = qvsWapApplication;
    static constexpr Owned<R> kFields[] = {
        &R::pszAppId,    &R::pszProviderId, &R::pszName,       &R::pszAAccept, &R::pszAProtocol,
        &R::pszInternet, &R::ptToProxyList, &R::ptToNapIdList, &R::ptAddrList,
    };
    // kept[tree-application-left]: these six stay allocated when the tree is gone.
    openParent(record, kFields,
               leave(&R::pszFrom, &R::pszXcapAuidDcs, &R::pszXcapAuidPms, &R::pszXcapAuidCdms,
                     &R::pszXcapImeiHeader, &R::pszXcapTidHeader));
}

template <class Record>
void releaseLeafSlot(Record **slot, qvsResult (*release)(Record *record))
{
    if (*slot) {
        (void)release(*slot); // never null here
        *slot = nullptr;
    }
}

// Releases the record in the slot unless it has children. They have to go first: answers their
// list, and does the rest when called again.
template <class Record>
qvsList *releaseParentSlot(Record **slot, void (*open)(Record *record))
{
    if (!*slot) {
        return nullptr;
    }
    open(*slot);
    qvsList *children = (*slot)->ptCharacterList;
    if (children && children->ptFirst) {
        return children;
    }
    closeParent(*slot);
    *slot = nullptr;
    return nullptr;
}

// Releases the records of a node in the order of its slots. Stops at a record with children, which
// have to go first, and answers their list; null when nothing is left but the node itself.
qvsList *releaseSlots(qvsWapCharacter *node)
{
    if (qvsList *children = releaseParentSlot(&node->ptPxLogical, openPxLogical)) {
        return children;
    }
    releaseLeafSlot(&node->ptPxAuthInfo, qvsClientProvWbxmlDeletePxAuthInfo);
    releaseLeafSlot(&node->ptPort, qvsClientProvWbxmlDeletePort);
    if (qvsList *children = releaseParentSlot(&node->ptPxPhysical, openPxPhysical)) {
        return children;
    }
    if (qvsList *children = releaseParentSlot(&node->ptNapDef, openNapDef)) {
        return children;
    }
    releaseLeafSlot(&node->ptNapAuthInfo, qvsClientProvWbxmlDeleteNapAuthInfo);
    releaseLeafSlot(&node->ptValidity, qvsClientProvWbxmlDeleteValidity);
    if (qvsList *children = releaseParentSlot(&node->ptAppAddr, openAppAddr)) {
        return children;
    }
    releaseLeafSlot(&node->ptResource, qvsClientProvWbxmlDeleteResource);
    releaseLeafSlot(&node->ptAppAuth, qvsClientProvWbxmlDeleteAppAuth);
    if (qvsList *children = releaseParentSlot(&node->ptApplication, openApplication)) {
        return children;
    }
    releaseLeafSlot(&node->ptBootstrap, qvsClientProvWbxmlDeleteBootstrap);
    releaseLeafSlot(&node->ptVendorConfig, qvsClientProvWbxmlDeleteVendorConfig);
    releaseLeafSlot(&node->ptClientIdentity, qvsClientProvWbxmlDeleteClientIdentity);
    releaseLeafSlot(&node->ptAccess, qvsClientProvWbxmlDeleteAccess);
    // kept[tree-roaming-left]: the ROAMING record and its texts stay allocated.
    releaseLeafSlot(&node->ptWifi, qvsClientProvWbxmlDeleteWifi);
    releaseLeafSlot(&node->ptVoWifi, qvsClientProvWbxmlDeleteVoWifi);
    return nullptr;
}

// Takes the nodes out of a list and puts them in front of a chain of nodes.
qvsListNode *takeNodes(qvsList *list, qvsListNode *chain)
{
    qvsListNode *first = list->ptFirst;
    qvsListNode *last = first;
    while (last->ptNext) {
        last = last->ptNext;
    }
    last->ptNext = chain;
    *list = qvsList{};
    return first;
}

// Releases the characteristics of a list, which is left empty. Children are put in front of the
// nodes that wait for them, so the nodes themselves remember how deep the release is.
void releaseNodes(qvsList *list)
{
    if (!list || !list->ptFirst) {
        return;
    }
    qvsListNode *pending = takeNodes(list, nullptr);
    while (pending) {
        qvsWapCharacter *node = static_cast<qvsWapCharacter *>(pending->pItem);
        qvsList *children = node ? releaseSlots(node) : nullptr;
        if (children) {
            pending = takeNodes(children, pending);
            continue;
        }
        qvsListNode *done = pending;
        pending = done->ptNext;
        qvsMemFree_debug(node);
        qvsMemFree_debug(done);
    }
}

template <class Record>
qvsResult releaseParent(Record *record, void (*open)(Record *record))
{
    if (!record) {
        return kNothing;
    }
    open(record);
    releaseNodes(record->ptCharacterList);
    closeParent(record);
    return kReleased;
}

} // namespace

qvsResult qvsClientProvWbxmlInitDecoder(qvsWbxmlDecoder **decoder, const uint8_t *data,
                                        uint32_t length)
{
    // hardened: without a place to put it no decoder is made.
    if (!decoder) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    *decoder = nullptr;
    if (!data) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    qvsWbxmlDecoder *made = static_cast<qvsWbxmlDecoder *>(
        qvsMemAllocSetZero_debug(sizeof(qvsWbxmlDecoder), kModule, __LINE__));
    if (!made) {
        trace("[Error] [qvsClientProvWbxmlInitDecoder] ptTmp NULL");
        return QVS_ERROR_BAD_ARGUMENT;
    }
    // kept[decoder-buffer-unchecked]: a decoder without a buffer, or with an empty one, is handed
    // out as a good one.
    (void)smlBufferCreate(&made->ptBuffer, length);
    (void)smlBufferAppendTail(made->ptBuffer, data, length);
    *decoder = made;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDeleteDecoder(qvsWbxmlDecoder *decoder)
{
    if (!decoder) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    qvsMemFree_debug(decoder->pStringTable);
    (void)smlBufferDelete(decoder->ptBuffer); // refuses only a buffer that is not there
    qvsMemFree_debug(decoder);
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDeleteWapDoc(qvsWapDoc *document)
{
    if (!document) {
        return kNothing;
    }
    releaseNodes(document->ptCharacterList);
    closeParent(document);
    return kReleased;
}

qvsResult qvsClientProvWbxmlDeleteCharacter(qvsWapCharacter *node)
{
    if (!node) {
        return kNothing;
    }
    while (qvsList *children = releaseSlots(node)) {
        releaseNodes(children);
    }
    qvsMemFree_debug(node);
    return kReleased;
}

qvsResult qvsClientProvWbxmlDeletePxlogical(qvsWapPxLogical *record)
{
    return releaseParent(record, openPxLogical);
}

qvsResult qvsClientProvWbxmlDeletePxAuthInfo(qvsWapPxAuthInfo *record)
{
    using R = qvsWapPxAuthInfo;
    static constexpr Owned<R> kFields[] = {&R::pszPxAuthType, &R::pszPxAuthId, &R::pszPxAuthPw};
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeletePort(qvsWapPort *record)
{
    using R = qvsWapPort;
    static constexpr Owned<R> kFields[] = {&R::pszPortNbr, &R::ptServiceList};
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeletePxphysical(qvsWapPxPhysical *record)
{
    return releaseParent(record, openPxPhysical);
}

qvsResult qvsClientProvWbxmlDeleteNapDef(qvsWapNapDef *record)
{
    return releaseParent(record, openNapDef);
}

qvsResult qvsClientProvWbxmlDeleteNapAuthInfo(qvsWapNapAuthInfo *record)
{
    using R = qvsWapNapAuthInfo;
    static constexpr Owned<R> kFields[] = {
        &R::pszAuthType, &R::pszAuthName, &R::pszAuthSecret, &R::pszReserved, &R::ptAuthEntityList,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteValidity(qvsWapValidity *record)
{
    using R = qvsWapValidity;
    static constexpr Owned<R> kFields[] = {
        &R::pszCountry, &R::pszNetwork, &R::pszSid, &R::pszSoc, &R::pszValidUntil,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteAppAddr(qvsWapAppAddr *record)
{
    return releaseParent(record, openAppAddr);
}

qvsResult qvsClientProvWbxmlDeleteResource(qvsWapResource *record)
{
    using R = qvsWapResource;
    static constexpr Owned<R> kFields[] = {
        &R::pszUri,       &R::pszName,        &R::pszAAccept,   &R::pszAAuthType,
        &R::pszAAuthName, &R::pszAAuthSecret, &R::pszAAuthData, &R::pszStartPage,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteAppAuth(qvsWapAppAuth *record)
{
    using R = qvsWapAppAuth;
    static constexpr Owned<R> kFields[] = {
        &R::pszAAuthLevel, &R::pszAAuthType, &R::pszAAuthName, &R::pszAAuthSecret, &R::pszAAuthData,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteApplication(qvsWapApplication *record)
{
    return releaseParent(record, openApplication);
}

qvsResult qvsClientProvWbxmlDeleteBootstrap(qvsWapBootstrap *record)
{
    using R = qvsWapBootstrap;
    static constexpr Owned<R> kFields[] = {
        &R::pszName,         &R::pszCountry,    &R::pszProvUrl,
        &R::pszContextAllow, &R::ptProxyIdList, &R::ptNetworkList,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteVendorConfig(qvsWapVendorConfig *record)
{
    using R = qvsWapVendorConfig;
    static constexpr Owned<R> kFields[] = {&R::pszName};
    // kept[tree-vendorconfig-left]: name and value of the parameter stay allocated.
    return releaseLeaf(record, kFields, leave(&R::pszParamName, &R::pszParamValue));
}

qvsResult qvsClientProvWbxmlDeleteClientIdentity(qvsWapClientIdentity *record)
{
    static constexpr Owned<qvsWapClientIdentity> kFields[] = {&qvsWapClientIdentity::pszClientId};
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteAccess(qvsWapAccess *record)
{
    using R = qvsWapAccess;
    static constexpr Owned<R> kFields[] = {
        &R::ptRuleList,   &R::ptAppIdList,   &R::ptPortNbrList,
        &R::ptDomainList, &R::ptToNapIdList, &R::ptToProxyList,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteWifi(qvsWapWifi *record)
{
    using R = qvsWapWifi;
    static constexpr Owned<R> kFields[] = {
        &R::pszNetSsid,  &R::pszSecMode,      &R::pszEapMethod,     &R::pszEapType,
        &R::pszUserName, &R::pszAnonUserName, &R::pszPassword,      &R::pszCaCert,
        &R::pszUserCert, &R::pszPhase1,       &R::pszAuthAlgorithm, &R::pszPriority,
    };
    return releaseLeaf(record, kFields);
}

qvsResult qvsClientProvWbxmlDeleteVoWifi(qvsWapVoWifi *record)
{
    static constexpr Owned<qvsWapVoWifi> kFields[] = {&qvsWapVoWifi::pszEpdgFqdn};
    return releaseLeaf(record, kFields);
}
