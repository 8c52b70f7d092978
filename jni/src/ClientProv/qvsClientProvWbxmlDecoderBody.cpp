// The document: which characteristic a TYPE names, who reads its parameters, what may nest in it,
// and the walk through elements of any depth in constant stack.
// Elements and types are those of the OMA Client Provisioning content.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvsClientProvWbxmlDecoder";

using Node = qvsWapCharacter;

// ---- The kinds of characteristic

enum Pages : uint8_t { kPage0, kPage1, kBothPages };

// One kind of characteristic: the TYPE that names it, who reads its parameters, what may nest in
// it.
struct Kind {
    uint8_t token;
    Pages pages;
    const char *name; // of a TYPE given as text
    qvsResult (*create)(Node *node);
    qvsResult (*readParm)(qvsWbxmlDecoder *decoder, Node *node);
    qvsList **(*children)(Node *node); // null where nothing may nest; answers null without a record
    const char *refusal;               // traced when something does
    const char *created;               // traced before the record is made
};

template <class Record>
qvsResult createIn(Record **slot)
{
    auto *record = newRecord<Record>(kModule);
    if (!record) {
        return QVS_ERROR_FAILED;
    }
    if (*slot) {
        // kept[slot-replaced]: the record that was there stays allocated.
        trace("qvsClientProvWbxmlDecoderCharacterAttribute : ERROR!!!");
    }
    *slot = record;
    return QVS_OK;
}

template <auto Slot>
qvsResult create(Node *node)
{
    return createIn(&(node->*Slot));
}

template <auto Slot, auto Decode>
qvsResult readParm(qvsWbxmlDecoder *decoder, Node *node)
{
    return Decode(decoder, node->*Slot);
}

template <auto Slot, auto List>
qvsList **children(Node *node)
{
    return node->*Slot ? &(node->*Slot->*List) : nullptr;
}

// kept[refusal-wording]: the refusals name other types than their parents.
constexpr Kind kKinds[] = {
    {attr::kType, kBothPages, "ROAMING", create<&Node::ptRoaming>,
     readParm<&Node::ptRoaming, qvsClientProvWbxmlDecoderParamRoaming>, nullptr, nullptr,
     "------------------NEW-------------------!!"},
    {attr::kType, kBothPages, "WI-FI", create<&Node::ptWifi>,
     readParm<&Node::ptWifi, qvsClientProvWbxmlDecoderParamWifi>, nullptr, nullptr,
     "------------WIFI------------------!!"},
    {attr::kType, kBothPages, "Vodafone VoWiFi", create<&Node::ptVoWifi>,
     readParm<&Node::ptVoWifi, qvsClientProvWbxmlDecoderParamVoWifi>, nullptr, nullptr,
     "------------WIFI------------------!!"},
    {attr::kTypePxLogical, kBothPages, nullptr, create<&Node::ptPxLogical>,
     readParm<&Node::ptPxLogical, qvsClientProvWbxmlDecoderParamPxlogical>,
     children<&Node::ptPxLogical, &qvsWapPxLogical::ptCharacterList>, nullptr, nullptr},
    {attr::kTypePxPhysical, kBothPages, nullptr, create<&Node::ptPxPhysical>,
     readParm<&Node::ptPxPhysical, qvsClientProvWbxmlDecoderParamPxPhysical>,
     children<&Node::ptPxPhysical, &qvsWapPxPhysical::ptCharacterList>, nullptr, nullptr},
    {attr::kTypePort, kBothPages, nullptr, create<&Node::ptPort>,
     readParm<&Node::ptPort, qvsClientProvWbxmlDecoderParamPort>, nullptr,
     "BOOTSTRAP is Not Support Chiled PORT.", nullptr},
    {attr::kTypeValidity, kBothPages, nullptr, create<&Node::ptValidity>,
     readParm<&Node::ptValidity, qvsClientProvWbxmlDecoderParamValidity>, nullptr,
     "BOOTSTRAP is Not Support Chiled PORT.", nullptr},
    {attr::kTypeNapDef, kPage0, nullptr, create<&Node::ptNapDef>,
     readParm<&Node::ptNapDef, qvsClientProvWbxmlDecoderParamNapDef>,
     children<&Node::ptNapDef, &qvsWapNapDef::ptCharacterList>, nullptr, nullptr},
    {attr::kTypeApplication, kPage1, nullptr, create<&Node::ptApplication>,
     readParm<&Node::ptApplication, qvsClientProvWbxmlDecoderParamApplication>,
     children<&Node::ptApplication, &qvsWapApplication::ptCharacterList>, nullptr, nullptr},
    {attr::kTypeBootstrap, kPage0, nullptr, create<&Node::ptBootstrap>,
     readParm<&Node::ptBootstrap, qvsClientProvWbxmlDecoderParamBootstrap>, nullptr,
     "BOOTSTRAP is Not Support Chiled CHARACTER.", nullptr},
    {attr::kTypeAppAddr, kPage1, nullptr, create<&Node::ptAppAddr>,
     readParm<&Node::ptAppAddr, qvsClientProvWbxmlDecoderParamAppAddr>,
     children<&Node::ptAppAddr, &qvsWapAppAddr::ptCharacterList>, nullptr, nullptr},
    {attr::kTypeVendorConfig, kPage0, nullptr, create<&Node::ptVendorConfig>,
     readParm<&Node::ptVendorConfig, qvsClientProvWbxmlDecoderParamVendorConfig>, nullptr,
     "VENDORCONFIG is Not Support Chiled CHARACTER.", nullptr},
    {attr::kTypeAppAuth, kPage1, nullptr, create<&Node::ptAppAuth>,
     readParm<&Node::ptAppAuth, qvsClientProvWbxmlDecoderParamAppAuth>, nullptr,
     "APPAUTH is Not Support Chiled CHARACTER.", nullptr},
    {attr::kTypeClientIdentity, kBothPages, nullptr, create<&Node::ptClientIdentity>,
     readParm<&Node::ptClientIdentity, qvsClientProvWbxmlDecoderParamClientIdentity>, nullptr,
     "BOOTSTRAP is Not Support Chiled CLIENTIDENTITY.", nullptr},
    {attr::kTypePxAuthInfo, kPage0, nullptr, create<&Node::ptPxAuthInfo>,
     readParm<&Node::ptPxAuthInfo, qvsClientProvWbxmlDecoderParamPxAuthInfo>, nullptr,
     "RESOURCE is Not Support Chiled CHARACTER.", nullptr},
    {attr::kTypeResource, kPage1, nullptr, create<&Node::ptResource>,
     readParm<&Node::ptResource, qvsClientProvWbxmlDecoderParamResource>, nullptr,
     "RESOURCE is Not Support Chiled CHARACTER.", nullptr},
    {attr::kTypeNapAuthInfo, kBothPages, nullptr, create<&Node::ptNapAuthInfo>,
     readParm<&Node::ptNapAuthInfo, qvsClientProvWbxmlDecoderParamNapAuthInfo>, nullptr,
     "BOOTSTRAP is Not Support Chiled PORT.", nullptr},
    {attr::kTypeAccess, kBothPages, nullptr, create<&Node::ptAccess>,
     readParm<&Node::ptAccess, qvsClientProvWbxmlDecoderParamAccess>, nullptr,
     "BOOTSTRAP is Not Support Chiled ACCESS.", nullptr},
};

// The kind of a TYPE token on a code page, and of a TYPE given as `name`; null for none.
const Kind *findKind(uint8_t token, uint8_t page, const char *name)
{
    const Pages own = page == 0 ? kPage0 : kPage1;
    for (const Kind &kind : kKinds) {
        if (kind.token == token && (kind.pages == own || kind.pages == kBothPages) &&
            (!kind.name || (name && qvsStrcmp(name, kind.name) == 0))) {
            return &kind;
        }
    }
    return nullptr;
}

// ---- Attributes of a characteristic

qvsResult refuseAttribute(uint8_t token)
{
    trace("Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT");
    trace("qvsClientProvWbxmlDecoderCharacterAttribute[%x]", token);
    return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
}

// A TYPE given as text. Other names than the three known ones make no record.
qvsResult readNamedType(qvsWbxmlDecoder *decoder, Node *node, ScopedText *name)
{
    uint8_t token = 0;
    if (qvsResult result = qvsClientProvWbxmlDecoderReadAttr(decoder, &token)) {
        return result;
    }
    Text read;
    const qvsResult result = content(decoder, &read);
    qvsMemFree_debug(name->take());
    name->text = read.take();
    if (const Kind *kind = findKind(attr::kType, decoder->nCodePage, name->text)) {
        trace("%s", kind->created);
        if (qvsResult failure = kind->create(node)) {
            return failure;
        }
    }
    return result;
}

// A TYPE that is a token of its own.
qvsResult readType(qvsWbxmlDecoder *decoder, Node *node, uint8_t token)
{
    const Kind *kind = findKind(token, decoder->nCodePage, nullptr);
    if (!kind) {
        return refuseAttribute(token);
    }
    if (qvsResult result = kind->create(node)) {
        return result;
    }
    return qvsClientProvWbxmlDecoderReadAttr(decoder, &token);
}

// ---- Open elements

// A characteristic whose END has not been read. The tree knows the node alone, which begins the
// block.
struct Open {
    Node node;
    Open *parent;
    const Kind *kind; // null: nothing but strings and page switches is accepted
    uint8_t attrId;
    qvsJoinedText joined;
};

void releaseNode(void *node)
{
    (void)qvsClientProvWbxmlDeleteCharacter(static_cast<Node *>(node));
}

// Reads the start of a characteristic. One with content becomes the innermost open one.
qvsResult enter(qvsWbxmlDecoder *decoder, Open **innermost)
{
    if (qvsResult result = qvsClientProvWbxmlDecoderCheckElement(decoder, tag::kCharacteristic)) {
        return result;
    }
    if (!decoder->nHasContent) {
        return QVS_OK;
    }
    const bool hasAttributes = decoder->nHasAttr;
    auto *open = newRecord<Open>(kModule);
    if (!open) {
        return QVS_ERROR_FAILED;
    }
    if (hasAttributes) {
        ScopedText name;
        uint8_t page = 0;
        if (qvsResult result = qvsClientProvWbxmlDecoderCharacterAttribute(
                decoder, &open->node, &open->attrId, &page, &name.text)) {
            // hardened: what a characteristic that fails has read is released with it.
            releaseNode(&open->node);
            return result;
        }
        open->kind = findKind(open->attrId, page, name.text);
    }
    open->parent = *innermost;
    *innermost = open;
    return QVS_OK;
}

qvsResult readParmElement(qvsWbxmlDecoder *decoder, Open *open)
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
    decoder->ptJoined = &open->joined;
    const qvsResult result = open->kind->readParm(decoder, &open->node);
    decoder->ptJoined = nullptr;
    return result;
}

// Whether a characteristic may nest in an open one.
qvsResult acceptChild(Open *open)
{
    if (!open->kind || !open->kind->children) {
        if (open->kind && open->kind->refusal) {
            trace("%s", open->kind->refusal);
        }
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
    return open->kind->children(&open->node) ? QVS_OK : QVS_ERROR_BAD_ARGUMENT;
}

// A SWITCH_PAGE between elements.
// kept[element-switch]: it is read without effect on the code page.
void dropPageSwitch(qvsWbxmlDecoder *decoder)
{
    uint8_t byte = 0;
    (void)takeByte(decoder, &byte);
    (void)takeByte(decoder, &byte);
}

// Reads on in an open characteristic up to a child that it accepts, or past its END.
qvsResult readContent(qvsWbxmlDecoder *decoder, Open *open, bool *child)
{
    for (;;) {
        uint8_t tag = 0;
        if (qvsResult result = qvsClientProvWbxmlDecoderCurElement(decoder, &tag)) {
            return result;
        }
        trace("qvsClientProvWbxmlDecoderCharacter :: nId[0x%02x], nAttrId[0x%02x]", tag,
              open->attrId);
        qvsResult result = QVS_OK;
        switch (tag) {
        case wbxml::kEnd:
            *child = false;
            return qvsClientProvWbxmlDecoderReadElement(decoder, &tag);
        case wbxml::kStrI:
            result = dropInlineString(decoder);
            break;
        case wbxml::kSwitchPage:
            dropPageSwitch(decoder);
            break;
        case tag::kCharacteristic:
            *child = true;
            return acceptChild(open);
        case tag::kParm:
            result = readParmElement(decoder, open);
            break;
        default:
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
// null node) adds nothing to a list. The list takes the node over, also when it fails.
qvsResult addSibling(qvsList **list, Node *node)
{
    if (!*list) {
        if (qvsListCreate(list, node) == QVS_OK) {
            return QVS_OK;
        }
        trace("[Error] [qvsClientProvWbxmlDecoderCharacterList] ptTmpList NULL");
    } else if (!node || qvsListAddNodeLast(*list, node) == QVS_OK) {
        return QVS_OK;
    }
    releaseNode(node);
    return QVS_ERROR_FAILED;
}

// Whether a run goes on behind a sibling: up to an END, across one inline string.
qvsResult hasNextSibling(qvsWbxmlDecoder *decoder, bool *next)
{
    uint8_t tag = 0;
    if (qvsResult result = qvsClientProvWbxmlDecoderCurElement(decoder, &tag)) {
        return result;
    }
    if (tag == wbxml::kStrI) {
        if (qvsResult result = dropInlineString(decoder)) {
            return result;
        }
        if (qvsResult result = qvsClientProvWbxmlDecoderCurElement(decoder, &tag)) {
            return result;
        }
    }
    *next = tag != wbxml::kEnd;
    return QVS_OK;
}

// Reads the characteristic at the read position with all that is nested in it. Open elements are
// linked to their parents, so that depth costs no stack; on failure `*innermost` still leads to
// those that are open.
qvsResult readSubtree(qvsWbxmlDecoder *decoder, Open **innermost, Node **root)
{
    for (bool atStart = true;;) {
        Node *complete = nullptr;
        if (atStart) {
            Open *const outer = *innermost;
            if (qvsResult result = enter(decoder, innermost)) {
                return result;
            }
            if (*innermost != outer) {
                atStart = false;
                continue;
            }
        } else {
            if (qvsResult result = readContent(decoder, *innermost, &atStart)) {
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
        qvsList **siblings = (*innermost)->kind->children(&(*innermost)->node);
        if (qvsResult result = addSibling(siblings, complete)) {
            return result;
        }
        if (qvsResult result = hasNextSibling(decoder, &atStart)) {
            return result;
        }
    }
}

// ---- The document

qvsResult readDocument(qvsWbxmlDecoder *decoder, uint8_t tag, qvsWapDoc *document)
{
    switch (tag) {
    case tag::kWapProvisioningDoc:
        return qvsClientProvWbxmlDecoderWapDocVersion(decoder, document);
    case tag::kCharacteristic:
        return qvsClientProvWbxmlDecoderCharacterList(decoder, &document->ptCharacterList);
    case wbxml::kSwitchPage:
        // kept[body-switch]: the document ends here, empty.
        dropPageSwitch(decoder);
        return QVS_OK;
    case tag::kParm:
        return QVS_OK; // kept[body-parm]: the document is empty, and nothing is read.
    default:
        trace("Unknown Element[%x]", tag);
        return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    }
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderWbxmlBody(qvsWbxmlDecoder *decoder, qvsWapDoc **document)
{
    if (!decoder || !decoder->ptBuffer) {
        return QVS_ERROR_WBXML_NO_BUFFER;
    }
    auto *built = newRecord<qvsWapDoc>(kModule);
    if (!built) {
        trace("[Error] [qvsClientProvWbxmlDecoderWbxmlBody] ptTmpWapDoc NULL");
        return QVS_ERROR_FAILED;
    }
    uint8_t tag = 0;
    qvsResult result = qvsClientProvWbxmlDecoderCurElement(decoder, &tag);
    if (result == QVS_OK && tag == wbxml::kEnd) {
        // kept[body-end]: success without a document.
        (void)qvsClientProvWbxmlDeleteWapDoc(built);
        return qvsClientProvWbxmlDecoderReadElement(decoder, &tag);
    }
    if (result == QVS_OK) {
        result = readDocument(decoder, tag, built);
        if (result != QVS_OK) {
            trace("WBXML Decode Error[%x]", result);
        }
    }
    if (result != QVS_OK) {
        (void)qvsClientProvWbxmlDeleteWapDoc(built);
        return result;
    }
    *document = built;
    return QVS_OK;
}

qvsResult qvsClientProvWbxmlDecoderWapDocVersion(qvsWbxmlDecoder *decoder, qvsWapDoc *document)
{
    if (qvsResult result =
            qvsClientProvWbxmlDecoderCheckElement(decoder, tag::kWapProvisioningDoc)) {
        return result;
    }
    if (!decoder->nHasContent) {
        return QVS_OK;
    }
    if (!document) {
        return QVS_ERROR_BAD_ARGUMENT;
    }
    if (decoder->nHasAttr) {
        if (qvsResult result = qvsClientProvWbxmlDecoderAttributeWapDocVersion(decoder)) {
            return result;
        }
    }
    for (;;) {
        uint8_t tag = 0;
        if (qvsResult result = qvsClientProvWbxmlDecoderCurElement(decoder, &tag)) {
            return result;
        }
        qvsResult result = QVS_OK;
        switch (tag) {
        case wbxml::kEnd:
            return qvsClientProvWbxmlDecoderReadElement(decoder, &tag);
        case wbxml::kStrI:
            result = dropInlineString(decoder);
            break;
        case wbxml::kSwitchPage:
            dropPageSwitch(decoder);
            break;
        case tag::kCharacteristic:
            result = qvsClientProvWbxmlDecoderCharacterList(decoder, &document->ptCharacterList);
            break;
        default:
            // hardened: a parm outside a characteristic is refused too; nobody would read it.
            trace("Tag Code [%d] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n", tag);
            return QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
        }
        if (result != QVS_OK) {
            return result;
        }
    }
}

qvsResult qvsClientProvWbxmlDecoderCharacterList(qvsWbxmlDecoder *decoder, qvsList **list)
{
    qvsList *run = *list;
    qvsResult result = QVS_OK;
    for (bool next = true; next && result == QVS_OK;) {
        Node *node = nullptr;
        result = qvsClientProvWbxmlDecoderCharacter(decoder, &node);
        if (result == QVS_OK) {
            result = addSibling(&run, node);
        }
        if (result == QVS_OK) {
            result = hasNextSibling(decoder, &next);
        }
    }
    if (result == QVS_OK) {
        *list = run;
    } else if (!*list && run) {
        (void)qvsListDeleteNodeAllAndList(run, releaseNode);
    }
    return result;
}

qvsResult qvsClientProvWbxmlDecoderCharacter(qvsWbxmlDecoder *decoder, qvsWapCharacter **node)
{
    Open *innermost = nullptr;
    const qvsResult result = readSubtree(decoder, &innermost, node);
    while (innermost) {
        Open *parent = innermost->parent;
        releaseNode(&innermost->node);
        innermost = parent;
    }
    return result;
}

qvsResult qvsClientProvWbxmlDecoderCharacterAttribute(qvsWbxmlDecoder *decoder,
                                                      qvsWapCharacter *node, uint8_t *attrId,
                                                      uint8_t *codePage, char **name)
{
    ScopedText type;
    for (;;) {
        uint8_t token = 0;
        qvsResult result = qvsClientProvWbxmlDecoderCurAttr(decoder, &token);
        if (result != QVS_OK) {
            return result;
        }
        if (token == wbxml::kEnd) {
            result = qvsClientProvWbxmlDecoderReadAttr(decoder, &token);
            *codePage = decoder->nCodePage;
            *name = type.take();
            return result;
        }
        // kept[attr-last-token]: whatever comes last is the TYPE, so that a page switch behind it
        // leaves none.
        *attrId = token;
        if (token == wbxml::kSwitchPage) {
            result = qvsClientProvWbxmlDecoderCheckCodePage(decoder);
        } else if (token == attr::kType) {
            result = readNamedType(decoder, node, &type);
        } else {
            result = readType(decoder, node, token);
        }
        if (result != QVS_OK) {
            return result;
        }
    }
}
