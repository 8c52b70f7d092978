// Creation of the decoder, and the releases of the document tree: one table per kind of record, and
// one loop for all that is nested in a record.
#include "qvsClientProvWbxml.h"
#include "qvsArena.h"
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

// A field that a record owns: a text, or a list of texts.
struct ReleaseRow {
    consteval ReleaseRow(TextField f) : field(f.number), list(false) {}
    consteval ReleaseRow(ListField f) : field(f.number), list(true) {}

    uint8_t field;
    bool list;
};

// One kind of record: what it owns, in the order in which that is released, and where its children
// are.
struct ReleaseKind {
    Rows<ReleaseRow> rows = {};
    uint8_t childList = kNoField; // none for a kind in which nothing nests
};

template <class Record, size_t N, size_t L = 0>
consteval ReleaseKind releaseOf(const ReleaseRow (&rows)[N], Left<L> = {})
{
    static_assert(N + L + (kChildListOf<Record> == kNoField ? 0 : 1) == kFieldsOf<Record>,
                  "a field is neither released nor left on purpose");
    return {rows, kChildListOf<Record>};
}

namespace pxLogical {
using R = qvsWapPxLogical;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszProxyId)},     {QVS_FIELD(R, pszProxyPw)},
    {QVS_FIELD(R, pszPpgAuthType)}, {QVS_FIELD(R, pszProxyProviderId)},
    {QVS_FIELD(R, pszName)},        {QVS_FIELD(R, pszTrust)},
    {QVS_FIELD(R, pszMaster)},      {QVS_FIELD(R, pszStartPage)},
    {QVS_FIELD(R, pszReserved1)},   {QVS_FIELD(R, pszReserved2)},
    {QVS_FIELD(R, pszReserved3)},   {QVS_FIELD(R, pszReserved4)},
    {QVS_FIELD(R, pszReserved5)},   {QVS_FIELD(R, ptDomainList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxLogical

namespace pxAuthInfo {
using R = qvsWapPxAuthInfo;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPxAuthType)},
    {QVS_FIELD(R, pszPxAuthId)},
    {QVS_FIELD(R, pszPxAuthPw)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxAuthInfo

namespace port {
using R = qvsWapPort;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPortNbr)},
    {QVS_FIELD(R, ptServiceList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace port

namespace pxPhysical {
using R = qvsWapPxPhysical;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPhysicalProxyId)}, {QVS_FIELD(R, pszPxAddr)},
    {QVS_FIELD(R, pszPxAddrType)},      {QVS_FIELD(R, pszPxAddrFqdn)},
    {QVS_FIELD(R, pszWspVersion)},      {QVS_FIELD(R, pszPushEnabled)},
    {QVS_FIELD(R, pszPullEnabled)},     {QVS_FIELD(R, ptToNapIdList)},
    {QVS_FIELD(R, ptDomainList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxPhysical

namespace napDef {
using R = qvsWapNapDef;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszNapId)},
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszInternet)},
    {QVS_FIELD(R, pszNapAddress)},
    {QVS_FIELD(R, pszNapAddrType)},
    {QVS_FIELD(R, pszCallType)},
    {QVS_FIELD(R, pszLocalAddr)},
    {QVS_FIELD(R, pszLocalAddrType)},
    {QVS_FIELD(R, pszLinkSpeed)},
    {QVS_FIELD(R, pszDnLinkSpeed)},
    {QVS_FIELD(R, pszLinger)},
    {QVS_FIELD(R, pszDeliveryErrSdu)},
    {QVS_FIELD(R, pszDeliveryOrder)},
    {QVS_FIELD(R, pszTrafficClass)},
    {QVS_FIELD(R, pszMaxSduSize)},
    {QVS_FIELD(R, pszMaxBitrateUplink)},
    {QVS_FIELD(R, pszMaxBitrateDnlink)},
    {QVS_FIELD(R, pszReserved1)},
    {QVS_FIELD(R, pszReserved2)},
    {QVS_FIELD(R, pszReserved3)},
    {QVS_FIELD(R, pszReserved4)},
    {QVS_FIELD(R, pszReserved5)},
    {QVS_FIELD(R, pszReserved6)},
    {QVS_FIELD(R, pszMaxNumRetry)},
    {QVS_FIELD(R, pszFirstRetryTimeout)},
    {QVS_FIELD(R, pszReregThreshold)},
    {QVS_FIELD(R, pszTBit)},
    {QVS_FIELD(R, ptDnsAddrList)},
    {QVS_FIELD(R, ptBearerList)},
};
// kept[tree-init-left]: INIT is constant text, which no release touches.
constexpr ReleaseKind kRelease = releaseOf<R>(kRows, leave(&R::pszInit));
} // namespace napDef

namespace napAuthInfo {
using R = qvsWapNapAuthInfo;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAuthType)}, {QVS_FIELD(R, pszAuthName)},      {QVS_FIELD(R, pszAuthSecret)},
    {QVS_FIELD(R, pszReserved)}, {QVS_FIELD(R, ptAuthEntityList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace napAuthInfo

namespace validity {
using R = qvsWapValidity;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszCountry)}, {QVS_FIELD(R, pszNetwork)},    {QVS_FIELD(R, pszSid)},
    {QVS_FIELD(R, pszSoc)},     {QVS_FIELD(R, pszValidUntil)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace validity

namespace appAddr {
using R = qvsWapAppAddr;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAddrType)},
    {QVS_FIELD(R, pszAddr)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace appAddr

namespace resource {
using R = qvsWapResource;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszUri)},       {QVS_FIELD(R, pszName)},      {QVS_FIELD(R, pszAAccept)},
    {QVS_FIELD(R, pszAAuthType)}, {QVS_FIELD(R, pszAAuthName)}, {QVS_FIELD(R, pszAAuthSecret)},
    {QVS_FIELD(R, pszAAuthData)}, {QVS_FIELD(R, pszStartPage)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace resource

namespace appAuth {
using R = qvsWapAppAuth;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAAuthLevel)},  {QVS_FIELD(R, pszAAuthType)}, {QVS_FIELD(R, pszAAuthName)},
    {QVS_FIELD(R, pszAAuthSecret)}, {QVS_FIELD(R, pszAAuthData)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace appAuth

namespace application {
using R = qvsWapApplication;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAppId)},      {QVS_FIELD(R, pszProviderId)}, {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszAAccept)},    {QVS_FIELD(R, pszAProtocol)},  {QVS_FIELD(R, pszInternet)},
    {QVS_FIELD(R, ptToProxyList)}, {QVS_FIELD(R, ptToNapIdList)}, {QVS_FIELD(R, ptAddrList)},
};
// kept[tree-application-left]: these six stay allocated when the tree is gone.
constexpr ReleaseKind kRelease =
    releaseOf<R>(kRows, leave(&R::pszFrom, &R::pszXcapAuidDcs, &R::pszXcapAuidPms,
                              &R::pszXcapAuidCdms, &R::pszXcapImeiHeader, &R::pszXcapTidHeader));
} // namespace application

namespace bootstrap {
using R = qvsWapBootstrap;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszName)},         {QVS_FIELD(R, pszCountry)},    {QVS_FIELD(R, pszProvUrl)},
    {QVS_FIELD(R, pszContextAllow)}, {QVS_FIELD(R, ptProxyIdList)}, {QVS_FIELD(R, ptNetworkList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace bootstrap

namespace vendorConfig {
using R = qvsWapVendorConfig;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszName)},
};
// kept[tree-vendorconfig-left]: name and value of the parameter stay allocated.
constexpr ReleaseKind kRelease = releaseOf<R>(kRows, leave(&R::pszParamName, &R::pszParamValue));
} // namespace vendorConfig

namespace clientIdentity {
using R = qvsWapClientIdentity;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszClientId)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace clientIdentity

namespace access {
using R = qvsWapAccess;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, ptRuleList)},   {QVS_FIELD(R, ptAppIdList)},   {QVS_FIELD(R, ptPortNbrList)},
    {QVS_FIELD(R, ptDomainList)}, {QVS_FIELD(R, ptToNapIdList)}, {QVS_FIELD(R, ptToProxyList)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace access

namespace wifi {
using R = qvsWapWifi;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszNetSsid)},  {QVS_FIELD(R, pszSecMode)},       {QVS_FIELD(R, pszEapMethod)},
    {QVS_FIELD(R, pszEapType)},  {QVS_FIELD(R, pszUserName)},      {QVS_FIELD(R, pszAnonUserName)},
    {QVS_FIELD(R, pszPassword)}, {QVS_FIELD(R, pszCaCert)},        {QVS_FIELD(R, pszUserCert)},
    {QVS_FIELD(R, pszPhase1)},   {QVS_FIELD(R, pszAuthAlgorithm)}, {QVS_FIELD(R, pszPriority)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace wifi

namespace voWifi {
using R = qvsWapVoWifi;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszEpdgFqdn)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace voWifi

// A slot of a node and the kind of record in it.
struct SlotRow {
    consteval SlotRow(RecordField s, const ReleaseKind &k) : kind(k), slot(s.number), left(false) {}
    consteval SlotRow(RecordField s) : kind(), slot(s.number), left(true) {}

    ReleaseKind kind;
    uint8_t slot;
    bool left; // stays allocated
};

// The slots of a node in their order, which is also that of the release.
constexpr SlotRow kSlots[] = {
    {QVS_FIELD(qvsWapCharacter, ptPxLogical), pxLogical::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptPxAuthInfo), pxAuthInfo::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptPort), port::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptPxPhysical), pxPhysical::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptNapDef), napDef::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptNapAuthInfo), napAuthInfo::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptValidity), validity::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptAppAddr), appAddr::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptResource), resource::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptAppAuth), appAuth::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptApplication), application::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptBootstrap), bootstrap::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptVendorConfig), vendorConfig::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptClientIdentity), clientIdentity::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptAccess), access::kRelease},
    // kept[tree-roaming-left]: the ROAMING record and its texts stay allocated.
    {QVS_FIELD(qvsWapCharacter, ptRoaming)},
    {QVS_FIELD(qvsWapCharacter, ptWifi), wifi::kRelease},
    {QVS_FIELD(qvsWapCharacter, ptVoWifi), voWifi::kRelease},
};

consteval bool everySlotHasItsRow()
{
    uint8_t slot = 0;
    for (const SlotRow &row : kSlots) {
        if (row.slot != slot++) {
            return false;
        }
    }
    return slot == kFieldsOf<qvsWapCharacter>;
}
static_assert(everySlotHasItsRow());

// Releases the fields of a record and clears them. Harmless when it was done before.
void releaseFields(qvsArena *arena, void *record, const ReleaseKind &kind)
{
    for (const ReleaseRow &row : kind.rows) {
        void *owned = pointerAt(record, row.field);
        if (!owned) {
            continue;
        }
        setPointer(record, row.field, nullptr);
        if (row.list) {
            releaseTexts(arena, static_cast<qvsList *>(owned));
        } else {
            freeBlock(owned);
        }
    }
}

// The children of a record; null when there are none.
qvsList *childrenOf(void *record, const ReleaseKind &kind)
{
    qvsList *children = kind.childList == kNoField ? nullptr : *listAt(record, kind.childList);
    return children && children->ptFirst ? children : nullptr;
}

// Releases a record whose fields and children are gone.
void closeRecord(const qvsArena *arena, void *record, const ReleaseKind &kind)
{
    if (kind.childList != kNoField) {
        if (qvsList *children = *listAt(record, kind.childList); children && !arena) {
            freeBlock(children); // empty by now
        }
    }
    freeBlock(record);
}

// Added to the pointer in a slot while the record's fields are gone and its children still go:
// blocks begin at even addresses.
constexpr uintptr_t kEmptied = 1;

bool isEmptied(const void *record)
{
    return reinterpret_cast<uintptr_t>(record) & kEmptied;
}

// Releases the records of a node in the order of its slots. Stops at a record with children, which
// have to go first, and answers their list; does the rest when called again. Null when nothing is
// left but the node itself.
qvsList *releaseSlots(qvsArena *arena, qvsWapCharacter *node)
{
    for (uint8_t slot = 0; slot < kFieldsOf<qvsWapCharacter>; ++slot) {
        void *record = pointerAt(node, slot);
        if (!record || kSlots[slot].left) {
            continue;
        }
        const ReleaseKind &kind = kSlots[slot].kind;
        if (isEmptied(record)) {
            record = static_cast<char *>(record) - kEmptied;
        } else {
            releaseFields(arena, record, kind);
            if (qvsList *children = childrenOf(record, kind)) {
                setPointer(node, slot, static_cast<char *>(record) + kEmptied);
                return children;
            }
        }
        closeRecord(arena, record, kind);
        setPointer(node, slot, nullptr);
    }
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
void releaseChildren(qvsArena *arena, qvsList *list)
{
    if (!list || !list->ptFirst) {
        return;
    }
    qvsListNode *pending = takeNodes(list, nullptr);
    while (pending) {
        qvsWapCharacter *node = static_cast<qvsWapCharacter *>(pending->pItem);
        qvsList *children = node ? releaseSlots(arena, node) : nullptr;
        if (children) {
            pending = takeNodes(children, pending);
            continue;
        }
        qvsListNode *done = pending;
        pending = done->ptNext;
        if (!arena) {
            freeBlock(node);
            freeBlock(done);
        }
    }
}

// Releases the records of a node with everything nested in them.
[[gnu::noinline]] void emptyNode(qvsArena *arena, qvsWapCharacter *node)
{
    while (qvsList *children = releaseSlots(arena, node)) {
        releaseChildren(arena, children);
    }
}

// Releases a record, of the kind that is kept in `slot`, with everything nested in it.
[[gnu::noinline]] qvsResult releaseRecord(void *record, RecordField slot)
{
    if (!record) {
        return kNothing;
    }
    qvsWapCharacter node = {};
    setPointer(&node, slot.number, record);
    emptyNode(nullptr, &node);
    return kReleased;
}

} // namespace

[[gnu::noinline]] void qvs::releaseNode(qvsArena *arena, qvsWapCharacter *node)
{
    if (!node) {
        return;
    }
    emptyNode(arena, node);
    if (!arena) {
        freeBlock(node);
    }
}

[[gnu::noinline]] void qvs::releaseNodes(qvsArena *arena, qvsList *list)
{
    releaseChildren(arena, list);
    if (!arena) {
        freeBlock(list);
    }
}

[[gnu::noinline]] void qvs::releaseDocument(qvsArena *arena, qvsWapDoc *document)
{
    if (!document) {
        return;
    }
    releaseNodes(arena, document->ptCharacterList);
    if (!arena) {
        freeBlock(document);
    }
}

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
    auto *made = newRecord<qvsWbxmlDecoder>(kModule);
    if (!made) {
        trace("[Error] [qvsClientProvWbxmlInitDecoder] ptTmp NULL");
        return QVS_ERROR_BAD_ARGUMENT;
    }
    // kept[decoder-buffer-unchecked]: a decoder without a buffer, or with an empty one, is handed
    // out as a good one.
    (void)makeBuffer(&made->ptBuffer, data, length);
    *decoder = made;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDeleteDecoder(qvsWbxmlDecoder *decoder)
{
    if (!decoder) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    freeBlock(decoder->pStringTable);
    (void)smlBufferDelete(decoder->ptBuffer); // refuses only a buffer that is not there
    freeBlock(decoder);
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDeleteWapDoc(qvsWapDoc *document)
{
    releaseDocument(nullptr, document);
    return document ? kReleased : kNothing;
}

qvsResult qvsClientProvWbxmlDeleteCharacter(qvsWapCharacter *node)
{
    releaseNode(nullptr, node);
    return node ? kReleased : kNothing;
}

qvsResult qvsClientProvWbxmlDeletePxlogical(qvsWapPxLogical *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptPxLogical));
}

qvsResult qvsClientProvWbxmlDeletePxAuthInfo(qvsWapPxAuthInfo *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptPxAuthInfo));
}

qvsResult qvsClientProvWbxmlDeletePort(qvsWapPort *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptPort));
}

qvsResult qvsClientProvWbxmlDeletePxphysical(qvsWapPxPhysical *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptPxPhysical));
}

qvsResult qvsClientProvWbxmlDeleteNapDef(qvsWapNapDef *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptNapDef));
}

qvsResult qvsClientProvWbxmlDeleteNapAuthInfo(qvsWapNapAuthInfo *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptNapAuthInfo));
}

qvsResult qvsClientProvWbxmlDeleteValidity(qvsWapValidity *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptValidity));
}

qvsResult qvsClientProvWbxmlDeleteAppAddr(qvsWapAppAddr *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptAppAddr));
}

qvsResult qvsClientProvWbxmlDeleteResource(qvsWapResource *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptResource));
}

qvsResult qvsClientProvWbxmlDeleteAppAuth(qvsWapAppAuth *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptAppAuth));
}

qvsResult qvsClientProvWbxmlDeleteApplication(qvsWapApplication *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptApplication));
}

qvsResult qvsClientProvWbxmlDeleteBootstrap(qvsWapBootstrap *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptBootstrap));
}

qvsResult qvsClientProvWbxmlDeleteVendorConfig(qvsWapVendorConfig *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptVendorConfig));
}

qvsResult qvsClientProvWbxmlDeleteClientIdentity(qvsWapClientIdentity *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptClientIdentity));
}

qvsResult qvsClientProvWbxmlDeleteAccess(qvsWapAccess *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptAccess));
}

qvsResult qvsClientProvWbxmlDeleteWifi(qvsWapWifi *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptWifi));
}

qvsResult qvsClientProvWbxmlDeleteVoWifi(qvsWapVoWifi *record)
{
    return releaseRecord(record, QVS_FIELD(qvsWapCharacter, ptVoWifi));
}
