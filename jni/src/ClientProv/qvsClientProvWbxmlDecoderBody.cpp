// The characteristics: which one a TYPE names, who reads its parameters, what may nest in it, and
// the walk through elements of any depth in constant stack.
// Elements and types are those of the OMA Client Provisioning content.
#include "qvsArena.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsParm.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

using Node = qvsWapCharacter;

// ---- The kinds of characteristic

enum Pages : uint8_t { kPage0, kPage1, kBothPages };

// One kind of characteristic: the TYPE that names it, the record it makes and where a node keeps
// it, its parameters, and what may nest in it.
struct Kind {
    uint8_t token;
    Pages pages;
    uint8_t slot;      // of a node
    uint8_t fields;    // of the record
    uint8_t childList; // of the record; kNoField where nothing may nest
    const ParmTable *parms;
    const char *name;    // of a TYPE given as text
    const char *refusal; // traced when something nests where nothing may
    const char *created; // traced before the record is made
};

struct Wording {
    const char *name = nullptr;
    const char *refusal = nullptr;
    const char *created = nullptr;
};

template <class Record>
consteval Kind kindOf(uint8_t token, Pages pages, Record *Node::*slot, const ParmsOf<Record> &parms,
                      Wording wording = {})
{
    return {token,        pages,        numberOf(slot),  kFieldsOf<Record>, kChildListOf<Record>,
            &parms.table, wording.name, wording.refusal, wording.created};
}

// kept[refusal-wording]: the refusals name other types than their parents.
constexpr Kind kKinds[] = {
    kindOf(attr::kType, kBothPages, &Node::ptRoaming, kRoamingParms,
           {.name = "ROAMING", .created = "------------------NEW-------------------!!"}),
    kindOf(attr::kType, kBothPages, &Node::ptWifi, kWifiParms,
           {.name = "WI-FI", .created = "------------WIFI------------------!!"}),
    kindOf(attr::kType, kBothPages, &Node::ptVoWifi, kVoWifiParms,
           {.name = "Vodafone VoWiFi", .created = "------------WIFI------------------!!"}),
    kindOf(attr::kTypePxLogical, kBothPages, &Node::ptPxLogical, kPxLogicalParms),
    kindOf(attr::kTypePxPhysical, kBothPages, &Node::ptPxPhysical, kPxPhysicalParms),
    kindOf(attr::kTypePort, kBothPages, &Node::ptPort, kPortParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled PORT."}),
    kindOf(attr::kTypeValidity, kBothPages, &Node::ptValidity, kValidityParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled PORT."}),
    kindOf(attr::kTypeNapDef, kPage0, &Node::ptNapDef, kNapDefParms),
    kindOf(attr::kTypeApplication, kPage1, &Node::ptApplication, kApplicationParms),
    kindOf(attr::kTypeBootstrap, kPage0, &Node::ptBootstrap, kBootstrapParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled CHARACTER."}),
    kindOf(attr::kTypeAppAddr, kPage1, &Node::ptAppAddr, kAppAddrParms),
    kindOf(attr::kTypeVendorConfig, kPage0, &Node::ptVendorConfig, kVendorConfigParms,
           {.refusal = "VENDORCONFIG is Not Support Chiled CHARACTER."}),
    kindOf(attr::kTypeAppAuth, kPage1, &Node::ptAppAuth, kAppAuthParms,
           {.refusal = "APPAUTH is Not Support Chiled CHARACTER."}),
    kindOf(attr::kTypeClientIdentity, kBothPages, &Node::ptClientIdentity, kClientIdentityParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled CLIENTIDENTITY."}),
    kindOf(attr::kTypePxAuthInfo, kPage0, &Node::ptPxAuthInfo, kPxAuthInfoParms,
           {.refusal = "RESOURCE is Not Support Chiled CHARACTER."}),
    kindOf(attr::kTypeResource, kPage1, &Node::ptResource, kResourceParms,
           {.refusal = "RESOURCE is Not Support Chiled CHARACTER."}),
    kindOf(attr::kTypeNapAuthInfo, kBothPages, &Node::ptNapAuthInfo, kNapAuthInfoParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled PORT."}),
    kindOf(attr::kTypeAccess, kBothPages, &Node::ptAccess, kAccessParms,
           {.refusal = "BOOTSTRAP is Not Support Chiled ACCESS."}),
};

// The rows of kKinds by TYPE token and code page, counted from 1; 0 for none.
struct KindRows {
    uint8_t of[2][attr::kTypeAccess - attr::kType + 1];
};

consteval KindRows rowsByToken()
{
    KindRows rows = {};
    uint8_t row = 0;
    for (const Kind &kind : kKinds) {
        ++row;
        for (uint8_t page = 0; page < 2; ++page) {
            if (kind.pages == kBothPages || kind.pages == page) {
                uint8_t &known = rows.of[page][kind.token - attr::kType];
                demand(!known || kind.name); // two kinds with one TYPE do not compile
                known = row;
            }
        }
    }
    return rows;
}

constexpr KindRows kRows = rowsByToken();

// The kind that a TYPE given as `name` has; null for none.
const Kind *findNamedKind(const char *name)
{
    for (const Kind &kind : kKinds) {
        if (kind.name && name && *name == *kind.name && qvsStrcmp(name, kind.name) == 0) {
            return &kind;
        }
    }
    return nullptr;
}

// The kind of a TYPE token on a code page; null for none.
const Kind *findKind(uint8_t token, uint8_t page)
{
    const auto at = static_cast<uint8_t>(token - attr::kType);
    const uint8_t row = at < sizeof kRows.of[0] ? kRows.of[page == 0 ? 0 : 1][at] : 0;
    return row ? &kKinds[row - 1] : nullptr;
}

// Makes the record of a kind in its slot.
qvsResult create(Node *node, const Kind &kind)
{
    constexpr uint32_t kFieldSize = sizeof(void *);
    void *record = qvsMemAllocSetZero_debug(kind.fields * kFieldSize, kDecoderModule, __LINE__);
    if (!record) {
        return QVS_ERROR_FAILED;
    }
    if (pointerAt(node, kind.slot)) {
        // kept[slot-replaced]: the record that was there stays allocated.
        trace("qvsClientProvWbxmlDecoderCharacterAttribute : ERROR!!!");
    }
    setPointer(node, kind.slot, record);
    return QVS_OK;
}

// The list of what nests in the record of a kind; null without the record.
qvsList **childrenOf(Node *node, const Kind &kind)
{
    void *record = pointerAt(node, kind.slot);
    return record ? listAt(record, kind.childList) : nullptr;
}

// ---- Attributes of a characteristic

[[gnu::noinline, gnu::cold]] qvsResult refuseAttribute(uint8_t token)
{
    trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
    trace("qvsClientProvWbxmlDecoderCharacterAttribute[%x]", token);
    return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

// A TYPE given as text. Other names than the three known ones make no record. The text goes to
// `*name`, if there is such a place, in the place of one that is there.
[[gnu::noinline]] qvsResult readNamedType(qvsWbxmlDecoder *decoder, DecodeState *state, Node *node,
                                          const Kind **kind, char **name)
{
    ++decoder->ptBuffer->pHead; // behind the attribute start
    Text read;
    const qvsResult result = name ? content(decoder, state, &read) : lookAt(decoder, state, &read);
    *kind = findNamedKind(read.str());
    if (name) {
        qvsMemFree_debug(*name);
        *name = read.take();
    }
    if (*kind) {
        trace("%s", (*kind)->created);
        if (qvsResult failure = create(node, **kind)) {
            return failure;
        }
    }
    return result;
}

// A TYPE that is a token of its own.
qvsResult readType(qvsWbxmlDecoder *decoder, Node *node, uint8_t token, const Kind **kind)
{
    *kind = findKind(token, decoder->nCodePage);
    if (!*kind) {
        return refuseAttribute(token);
    }
    if (qvsResult result = create(node, **kind)) {
        return result;
    }
    ++decoder->ptBuffer->pHead;
    return QVS_OK;
}

// Reads the attributes of a characteristic, whose last one is its kind, and the END behind them.
qvsResult readAttributes(qvsWbxmlDecoder *decoder, DecodeState *state, Node *node, uint8_t *attrId,
                         const Kind **kind, char **name)
{
    uint8_t token = 0;
    while (peekByte(decoder, &token)) {
        if (token == wbxml::kEnd) {
            ++decoder->ptBuffer->pHead;
            return QVS_OK;
        }
        // kept[attr-last-token]: whatever comes last is the TYPE, so that a page switch behind it
        // leaves none.
        *attrId = token;
        qvsResult result = QVS_OK;
        if (token == wbxml::kSwitchPage) {
            *kind = nullptr;
            result = switchPage(decoder);
        } else if (token == attr::kType) {
            result = readNamedType(decoder, state, node, kind, name);
        } else {
            result = readType(decoder, node, token, kind);
        }
        if (result != QVS_OK) {
            return result;
        }
    }
    return QVS_ERROR_WBXML_NO_DATA;
}

// ---- Open elements

// A characteristic whose END has not been read. The tree knows the node alone, which begins the
// block.
struct Open {
    Node node;
    Open *parent;
    const Kind *kind; // null: nothing but strings and page switches is accepted
    uint8_t attrId;
    OpenRecord record;
};
static_assert(sizeof(Open) <= kLargestPiece);

// The place of the list of what nests in a record: ptCharacterList is the last field.
constexpr uint8_t kChildPlace = 0;

// Reads the start of a characteristic. One with content becomes the innermost open one.
qvsResult enter(qvsWbxmlDecoder *decoder, DecodeState *state, Open **innermost)
{
    if (qvsResult result = checkElement(decoder, tag::kCharacteristic)) {
        return result;
    }
    if (!decoder->nHasContent) {
        return QVS_OK;
    }
    const bool hasAttributes = decoder->nHasAttr;
    constexpr uint32_t kSpare = sizeof(Open) - sizeof(Node);
    auto *open = static_cast<Open *>(newPiece(state->arena, sizeof(Open), kDecoderModule, kSpare));
    if (!open) {
        return QVS_ERROR_FAILED;
    }
    if (hasAttributes) {
        if (qvsResult result =
                readAttributes(decoder, state, &open->node, &open->attrId, &open->kind, nullptr)) {
            // hardened: what a characteristic that fails has read is released with it.
            releaseNode(state->arena, &open->node);
            return result;
        }
    }
    open->parent = *innermost;
    *innermost = open;
    return QVS_OK;
}

qvsResult readParmElement(qvsWbxmlDecoder *decoder, DecodeState *state, Open *open)
{
    if (open->attrId == attr::kType) {
        trace("................NEW.................");
    }
    if (!open->kind) {
        if (open->attrId == attr::kType) {
            trace("Tag Code = CHARACTER ATTR TYPE HAVE NOT...CP SPEC.....");
        }
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    state->open = &open->record;
    return readParms(decoder, state, pointerAt(&open->node, open->kind->slot), *open->kind->parms);
}

// Whether a characteristic may nest in an open one.
qvsResult acceptChild(Open *open)
{
    if (!open->kind || open->kind->childList == kNoField) {
        if (open->kind && open->kind->refusal) {
            trace("%s", open->kind->refusal);
        }
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    return childrenOf(&open->node, *open->kind) ? QVS_OK : QVS_ERROR_BAD_ARGUMENT;
}

// Reads on in an open characteristic up to a child that it accepts, or past its END.
qvsResult readContent(qvsWbxmlDecoder *decoder, DecodeState *state, Open *open, bool *child)
{
    for (;;) {
        uint8_t tag = 0;
        if (!peekTag(decoder, &tag)) {
            return QVS_ERROR_WBXML_NO_DATA;
        }
        trace("qvsClientProvWbxmlDecoderCharacter :: nId[0x%02x], nAttrId[0x%02x]", tag,
              open->attrId);
        qvsResult result = QVS_OK;
        if (tag == tag::kParm) {
            result = readParmElement(decoder, state, open);
        } else if (tag == wbxml::kEnd) {
            *child = false;
            (void)takeSeenTag(decoder);
            return QVS_OK;
        } else if (tag == tag::kCharacteristic) {
            *child = true;
            return acceptChild(open);
        } else if (tag == wbxml::kStrI) {
            result = dropInlineString(decoder, state);
        } else if (tag == wbxml::kSwitchPage) {
            dropPageSwitch(decoder);
        } else {
            trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
            trace("qvsClientProvWbxmlDecoderCharacter[%x]", tag);
            return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
        }
        if (result != QVS_OK) {
            return result;
        }
    }
}

// ---- Runs of siblings

// Appends a node to a run, whose list is made when there is none. An element without content (a
// null node) adds nothing to a list. The list takes the node over, also when it fails. `*last` is
// the list's last node.
qvsResult addSibling(qvsArena *arena, qvsList **list, Node *node, qvsListNode **last)
{
    if (addItem(arena, list, node, last) == QVS_OK) {
        return QVS_OK;
    }
    if (!*list) {
        trace("[Error] [qvsClientProvWbxmlDecoderCharacterList] ptTmpList NULL");
    }
    releaseNode(arena, node);
    return QVS_ERROR_FAILED;
}

// Whether a run goes on behind a sibling: up to an END, across one inline string.
qvsResult hasNextSibling(qvsWbxmlDecoder *decoder, DecodeState *state, bool *next)
{
    uint8_t tag = 0;
    if (!peekTag(decoder, &tag)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    if (tag == wbxml::kStrI) {
        if (qvsResult result = dropInlineString(decoder, state)) {
            return result;
        }
        if (!peekTag(decoder, &tag)) {
            return QVS_ERROR_WBXML_NO_DATA;
        }
    }
    *next = tag != wbxml::kEnd;
    return QVS_OK;
}

// Reads the characteristic at the read position with all that is nested in it. Open elements are
// linked to their parents, so that depth costs no stack; on failure `*innermost` still leads to
// those that are open.
[[gnu::noinline]] qvsResult readSubtree(qvsWbxmlDecoder *decoder, DecodeState *state,
                                        Open **innermost, Node **root)
{
    for (bool atStart = true;;) {
        Node *complete = nullptr;
        if (atStart) {
            Open *const outer = *innermost;
            if (qvsResult result = enter(decoder, state, innermost)) {
                return result;
            }
            if (*innermost != outer) {
                atStart = false;
                continue;
            }
        } else {
            if (qvsResult result = readContent(decoder, state, *innermost, &atStart)) {
                return result;
            }
            if (atStart) {
                continue;
            }
            complete = &(*innermost)->node;
            *innermost = (*innermost)->parent;
        }
        if (!*innermost) {
            *root = complete;
            return QVS_OK;
        }
        Open *const parent = *innermost;
        qvsList **siblings = childrenOf(&parent->node, *parent->kind);
        if (qvsResult result =
                addSibling(state->arena, siblings, complete, parent->record.last + kChildPlace)) {
            return result;
        }
        if (qvsResult result = hasNextSibling(decoder, state, &atStart)) {
            return result;
        }
    }
}

// Reads a characteristic into a new node; null for an element without content.
qvsResult readCharacter(qvsWbxmlDecoder *decoder, DecodeState *state, Node **node)
{
    Open *innermost = nullptr;
    const qvsResult result = readSubtree(decoder, state, &innermost, node);
    while (innermost) {
        Open *parent = innermost->parent;
        releaseNode(state->arena, &innermost->node);
        innermost = parent;
    }
    return result;
}

} // namespace

qvsResult qvs::decodeCharacters(qvsWbxmlDecoder *decoder, DecodeState *state, qvsList **list)
{
    qvsList *run = *list;
    qvsListNode *last = nullptr;
    qvsResult result = QVS_OK;
    for (bool next = true; next && result == QVS_OK;) {
        Node *node = nullptr;
        result = readCharacter(decoder, state, &node);
        if (result == QVS_OK) {
            result = addSibling(state->arena, &run, node, &last);
        }
        if (result == QVS_OK) {
            result = hasNextSibling(decoder, state, &next);
        }
    }
    if (result == QVS_OK) {
        *list = run;
    } else if (!*list && run) {
        releaseNodes(state->arena, run);
    }
    return result;
}

qvsResult qvsClientProvWbxmlDecoderCharacterList(qvsWbxmlDecoder *decoder, qvsList **list)
{
    DecodeState state = wholeDecode(decoder);
    return decodeCharacters(decoder, &state, list);
}

qvsResult qvsClientProvWbxmlDecoderCharacter(qvsWbxmlDecoder *decoder, qvsWapCharacter **node)
{
    DecodeState state = wholeDecode(decoder);
    return readCharacter(decoder, &state, node);
}

qvsResult qvsClientProvWbxmlDecoderCharacterAttribute(qvsWbxmlDecoder *decoder,
                                                      qvsWapCharacter *node, uint8_t *attrId,
                                                      uint8_t *codePage, char **name)
{
    DecodeState alone;
    const Kind *kind = nullptr;
    *name = nullptr;
    if (qvsResult result = readAttributes(decoder, &alone, node, attrId, &kind, name)) {
        return result;
    }
    *codePage = decoder->nCodePage;
    return QVS_OK;
}
