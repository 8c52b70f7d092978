// The context built from the document tree: copies of records, of the lists in them and of the
// children that they accept, by the tables of the kinds of record.
#include "qvsClientProvCtx.h"
#include "qvsCtxCopy.h"
#include "qvsstring.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvsClientProvCtx";

// One context record of `fields` pointers, all null; null without memory.
void *newFields(uint32_t fields)
{
    constexpr uint32_t kFieldSize = sizeof(void *);
    constexpr uint32_t kSpare = 1; // kept[context-spare-byte]: one byte more than the record.
    return qvsMemAllocSetZero_debug(fields * kFieldSize + kSpare, kModule, __LINE__);
}

template <class Record>
Record *newCtxRecord()
{
    return static_cast<Record *>(newFields(kFieldsOf<Record>));
}

char *copyOf(const char *text)
{
    return qvsStrdup_debug(text, kModule, __LINE__);
}

// The item under the cursor of a list, which moves on; null behind the last one.
void *nextItem(qvsList *list)
{
    const qvsListNode *node = list->ptCursor;
    if (!node) {
        return nullptr;
    }
    list->ptCursor = node->ptNext;
    return node->pItem;
}

void *firstItem(qvsList *list)
{
    list->ptCursor = list->ptFirst;
    return nextItem(list);
}

// The chains of one parent. What was appended last to each is remembered, so that building costs
// one step per record.
struct Chains {
    // kept[context-null-linked]: a builder that answered null has added nothing, and the chain goes
    // on behind it.
    void append(const ChildRow &row, size_t number, void *added)
    {
        if (!added) {
            return;
        }
        void *holder = last[number] ? last[number] : lastOf(row);
        setPointer(holder, holder == parent ? row.chain : linkOf(row), added);
        last[number] = added;
    }

    // The record that a parent may have one of.
    [[nodiscard]] bool isTaken(const ChildRow &row) const
    {
        return row.kind->single && pointerAt(parent, row.chain);
    }

    static uint8_t linkOf(const ChildRow &row)
    {
        return static_cast<uint8_t>(row.kind->fields - 1);
    }

    // The end of what the parent's chain holds before anything is appended: a record of it, or the
    // parent.
    [[nodiscard]] void *lastOf(const ChildRow &row) const
    {
        void *holder = parent;
        uint8_t field = row.chain;
        while (void *next = pointerAt(holder, field)) {
            holder = next;
            field = linkOf(row);
        }
        return holder;
    }

    void *parent;
    void *last[kMostChildRows] = {}; // null: nothing was appended
};

// The kinds of record nest a few levels deep, whatever a message holds.
// NOLINTBEGIN(misc-no-recursion)

// Copies the record of a tree node that `row` is about.
void copySlot(const qvsWapCharacter &node, const ChildRow &row, size_t number, Chains *chains,
              Texts texts)
{
    void *record = pointerAt(&node, row.slot);
    chains->append(row, number, copyRecord(record, *row.kind, row.stays ? Texts::kCopied : texts));
}

// Copies every record of a node at the top of the document.
void copyNode(const qvsWapCharacter &node, Chains *chains, Texts texts)
{
    size_t number = 0;
    for (const ChildRow &row : kRootRows) {
        if (pointerAt(&node, row.slot)) {
            if (chains->isTaken(row)) {
                trace("[WARNING] Already Have ClientIdent Context");
                return;
            }
            copySlot(node, row, number, chains, texts);
        }
        ++number;
    }
}

// Copies the first record of a child that the parent accepts.
qvsResult copyChild(const qvsWapCharacter &node, const Rows<ChildRow> &rows, Chains *chains,
                    Texts texts)
{
    size_t number = 0;
    for (const ChildRow &row : rows) {
        if (pointerAt(&node, row.slot)) {
            // hardened: nothing can be attached to a parent that is not there.
            if (!chains->parent) {
                return QVS_ERROR_BAD_ARGUMENT;
            }
            copySlot(node, row, number, chains, texts);
            return QVS_OK;
        }
        ++number;
    }
    // kept[context-misfit-ends-walk]: the children behind one that does not fit are lost.
    trace("[WARNING] Not Support Context");
    return QVS_ERROR_FAILED;
}

qvsResult walkChildren(qvsList *children, void *parent, const Rows<ChildRow> &rows, Texts texts)
{
    Chains chains = {parent};
    for (void *item = firstItem(children); item; item = nextItem(children)) {
        const auto &node = *static_cast<const qvsWapCharacter *>(item);
        if (qvsResult result = copyChild(node, rows, &chains, texts)) {
            return result;
        }
    }
    return QVS_OK;
}

// The context of the characteristics in a list, which the caller owns.
qvsResult makeRoot(qvsList *list, qvsClientProvCtx **root, Texts texts)
{
    // hardened: without a place to put it no context is made.
    if (!list || !root) {
        const qvsResult result = QVS_ERROR_BAD_ARGUMENT;
        traceError(result);
        return result;
    }
    void *item = firstItem(list);
    auto *made = newCtxRecord<qvsClientProvCtx>();
    if (!made) {
        traceError(QVS_ERROR_FAILED);
        return QVS_ERROR_FAILED;
    }
    Chains chains = {made};
    for (; item; item = nextItem(list)) {
        copyNode(*static_cast<const qvsWapCharacter *>(item), &chains, texts);
    }
    *root = made;
    return QVS_OK;
}

[[gnu::noinline]] qvsClientProvCtx *makeContext(qvsWapDoc *document, Texts texts)
{
    if (!document) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return nullptr;
    }
    qvsClientProvCtx *root = nullptr;
    traceError(makeRoot(document->ptCharacterList, &root, texts));
    return root;
}

} // namespace

qvsCtxStrNode *qvs::copyTexts(qvsList *list, Texts texts)
{
    if (!list) {
        traceError(QVS_ERROR_LIST_ARGUMENT);
        return nullptr;
    }
    qvsCtxStrNode *head = nullptr;
    qvsCtxStrNode *last = nullptr;
    list->ptCursor = list->ptFirst;
    while (qvsListNode *from = list->ptCursor) {
        list->ptCursor = from->ptNext;
        auto *text = static_cast<char *>(from->pItem);
        auto *node = text ? newCtxRecord<qvsCtxStrNode>() : nullptr;
        if (!node) {
            break;
        }
        if (last) {
            last->ptNext = node;
        } else {
            head = node;
        }
        last = node;
        if (texts == Texts::kTaken) {
            from->pItem = nullptr;
            node->pszValue = text;
        } else {
            node->pszValue = copyOf(text);
        }
    }
    return head;
}

qvsResult qvs::copyChildren(qvsList *children, void *parent, const CopyKind &kind, Texts texts)
{
    const qvsResult result = children ? walkChildren(children, parent, kind.children, texts)
                                      : qvsResult{QVS_ERROR_LIST_ARGUMENT};
    traceError(result);
    return result;
}

void *qvs::copyRecord(void *record, const CopyKind &kind, Texts texts)
{
    if (!record) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return nullptr;
    }
    void *copy = newFields(kind.fields);
    if (!copy) {
        return nullptr;
    }
    for (const CopyRow &row : kind.rows) {
        void *field = pointerAt(record, row.field);
        if (!field) {
            if (row.type == CopyRow::kList) {
                traceError(QVS_ERROR_LIST_ARGUMENT);
            }
        } else if (row.type == CopyRow::kList) {
            setPointer(copy, row.to, copyTexts(static_cast<qvsList *>(field), texts));
        } else {
            auto *text = static_cast<char *>(field);
            if (texts == Texts::kTaken && row.type == CopyRow::kText) {
                setPointer(record, row.field, nullptr);
                setPointer(copy, row.to, text);
            } else {
                setPointer(copy, row.to, copyOf(text));
            }
        }
    }
    if (kind.onCopied) {
        kind.onCopied(copy);
    }
    if (kind.childList != kNoField) {
        const qvsResult result = copyChildren(*listAt(record, kind.childList), copy, kind, texts);
        if (kind.refusalTraced) {
            traceError(result);
        }
    }
    return copy;
}

// NOLINTEND(misc-no-recursion)

qvsClientProvCtx *qvs::takeContext(qvsWapDoc *document)
{
    return makeContext(document, Texts::kTaken);
}

qvsClientProvCtx *qvsClientProvCtxMakeContext(qvsWapDoc *document)
{
    return makeContext(document, Texts::kCopied);
}

qvsResult qvsClientProvCtxVerifyContext(qvsList *list, qvsClientProvCtx **root)
{
    return makeRoot(list, root, Texts::kCopied);
}
