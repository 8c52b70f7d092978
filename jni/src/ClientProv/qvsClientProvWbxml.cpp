// Creation of the decoder, and the releases of the document tree: each record is its own table, and
// one loop takes all that is nested in it.
#include "qvsClientProvWbxml.h"
#include "qvsArena.h"
#include "qvsFields.h"
#include "qvsLeft.h"
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

using Node = qvsWapCharacter;

// What a record owns, in the order in which that is released.
template <class Record>
constexpr auto kRelease = inOrder<FieldRow, Record>();

template <>
constexpr auto kRelease<qvsWapAppAddr> =
    inOrder<FieldRow, qvsWapAppAddr>().moved(&qvsWapAppAddr::pszAddr, &qvsWapAppAddr::pszAddrType);

// One kind of record: what it owns, where its children are, and the slot of a node that it is in.
struct RecordRelease {
    constexpr RecordRelease() = default;
    template <class Record>
    constexpr RecordRelease(uint8_t number, Record *)
        : rows(allOf<Record>(kRelease<Record>)), childList(kChildListOf<Record>), slot(number)
    {
    }

    Rows<FieldRow> rows;
    uint8_t childList = kNoField; // none for a kind in which nothing nests
    uint8_t slot = kNoField;
};

// A node's slots are released in their order. One that is left has a kind without a slot.
struct SlotReleases {
    RecordRelease of[kFieldsOf<Node>];
};

consteval SlotReleases releasesBySlot()
{
    SlotReleases releases;
    for (const RecordRelease &kind : inOrder<RecordRelease, Node>().rows) {
        releases.of[kind.slot] = kind;
    }
    return releases;
}

constexpr SlotReleases kReleases = releasesBySlot();

// Releases the fields of a record and clears them. Harmless when it was done before.
void releaseFields(qvsArena *arena, void *record, const RecordRelease &kind)
{
    for (const FieldRow &row : kind.rows) {
        void *owned = pointerAt(record, row.field);
        if (!owned) {
            continue;
        }
        setPointer(record, row.field, nullptr);
        if (row.holds == Holds::kTexts) {
            releaseTexts(arena, static_cast<qvsList *>(owned));
        } else {
            freeBlock(owned);
        }
    }
}

// The children of a record; null when there are none.
qvsList *childrenOf(void *record, const RecordRelease &kind)
{
    qvsList *children = kind.childList == kNoField ? nullptr : *listAt(record, kind.childList);
    return children && children->ptFirst ? children : nullptr;
}

// Releases a record whose fields and children are gone.
void closeRecord(const qvsArena *arena, void *record, const RecordRelease &kind)
{
    if (kind.childList != kNoField) {
        if (qvsList *children = *listAt(record, kind.childList); children && !arena) {
            freeBlock(children); // empty by now
        }
    }
    freeBlock(record);
}

// Releases the record in a slot, unless it has children: then it answers their list.
[[gnu::noinline]] qvsList *releaseSlot(qvsArena *arena, Node *node, uint8_t slot)
{
    const RecordRelease &kind = kReleases.of[slot];
    if (kind.slot == kNoField) {
        return nullptr;
    }
    void *record = pointerAt(node, slot);
    releaseFields(arena, record, kind);
    if (qvsList *children = childrenOf(record, kind)) {
        return children;
    }
    closeRecord(arena, record, kind);
    setPointer(node, slot, nullptr);
    return nullptr;
}

// Releases the records of a node in the order of its slots. Stops at a record with children, which
// have to go first, and answers their list; does the rest when called again. Null when nothing is
// left but the node itself.
qvsList *releaseSlots(qvsArena *arena, Node *node)
{
    for (uint8_t slot = 0; slot < kFieldsOf<Node>; ++slot) {
        if (pointerAt(node, slot)) {
            if (qvsList *children = releaseSlot(arena, node, slot)) {
                return children;
            }
        }
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
        auto *node = static_cast<Node *>(pending->pItem);
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
[[gnu::noinline]] void emptyNode(qvsArena *arena, Node *node)
{
    while (qvsList *children = releaseSlots(arena, node)) {
        releaseChildren(arena, children);
    }
}

// Releases the record in a slot of a node with everything nested in it.
[[gnu::noinline]] qvsResult releaseAlone(uint8_t slot, void *record)
{
    if (!record) {
        return kNothing;
    }
    Node node = {};
    setPointer(&node, slot, record);
    emptyNode(nullptr, &node);
    return kReleased;
}

template <class Record>
struct SlotOf {
    consteval SlotOf(Record *Node::*slot) : number(numberOf(slot)) {}

    uint8_t number;
};

// Releases a record with everything nested in it.
template <class Record>
qvsResult releaseRecord(Record *record, SlotOf<Record> slot)
{
    return releaseAlone(slot.number, record);
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
    return releaseRecord(record, {&Node::ptPxLogical});
}

qvsResult qvsClientProvWbxmlDeletePxAuthInfo(qvsWapPxAuthInfo *record)
{
    return releaseRecord(record, {&Node::ptPxAuthInfo});
}

qvsResult qvsClientProvWbxmlDeletePort(qvsWapPort *record)
{
    return releaseRecord(record, {&Node::ptPort});
}

qvsResult qvsClientProvWbxmlDeletePxphysical(qvsWapPxPhysical *record)
{
    return releaseRecord(record, {&Node::ptPxPhysical});
}

qvsResult qvsClientProvWbxmlDeleteNapDef(qvsWapNapDef *record)
{
    return releaseRecord(record, {&Node::ptNapDef});
}

qvsResult qvsClientProvWbxmlDeleteNapAuthInfo(qvsWapNapAuthInfo *record)
{
    return releaseRecord(record, {&Node::ptNapAuthInfo});
}

qvsResult qvsClientProvWbxmlDeleteValidity(qvsWapValidity *record)
{
    return releaseRecord(record, {&Node::ptValidity});
}

qvsResult qvsClientProvWbxmlDeleteAppAddr(qvsWapAppAddr *record)
{
    return releaseRecord(record, {&Node::ptAppAddr});
}

qvsResult qvsClientProvWbxmlDeleteResource(qvsWapResource *record)
{
    return releaseRecord(record, {&Node::ptResource});
}

qvsResult qvsClientProvWbxmlDeleteAppAuth(qvsWapAppAuth *record)
{
    return releaseRecord(record, {&Node::ptAppAuth});
}

qvsResult qvsClientProvWbxmlDeleteApplication(qvsWapApplication *record)
{
    return releaseRecord(record, {&Node::ptApplication});
}

qvsResult qvsClientProvWbxmlDeleteBootstrap(qvsWapBootstrap *record)
{
    return releaseRecord(record, {&Node::ptBootstrap});
}

qvsResult qvsClientProvWbxmlDeleteVendorConfig(qvsWapVendorConfig *record)
{
    return releaseRecord(record, {&Node::ptVendorConfig});
}

qvsResult qvsClientProvWbxmlDeleteClientIdentity(qvsWapClientIdentity *record)
{
    return releaseRecord(record, {&Node::ptClientIdentity});
}

qvsResult qvsClientProvWbxmlDeleteAccess(qvsWapAccess *record)
{
    return releaseRecord(record, {&Node::ptAccess});
}

qvsResult qvsClientProvWbxmlDeleteWifi(qvsWapWifi *record)
{
    return releaseRecord(record, {&Node::ptWifi});
}

qvsResult qvsClientProvWbxmlDeleteVoWifi(qvsWapVoWifi *record)
{
    return releaseRecord(record, {&Node::ptVoWifi});
}
