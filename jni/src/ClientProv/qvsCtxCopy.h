// How the records of a document tree become those of the context: tables, and the one piece of code
// that runs them.
#ifndef QVSCTXCOPY_H
#define QVSCTXCOPY_H

#include "qvsFields.h"
#include "qvslist.h"
#include "qvsresult.h"

#include <stddef.h>
#include <stdint.h>

struct qvsClientProvCtx;
struct qvsCtxStrNode;
struct qvsWapDoc;

namespace [[gnu::visibility("hidden")]] qvs {

// What happens to the texts of the tree: a context is a copy of them, or takes them over when the
// tree is released next. That changes nothing but the work.
enum class Texts : uint8_t { kCopied, kTaken };

// A text of a tree record and the text it is copied to, or a list and the chain made of it.
struct CopyRow {
    enum Type : uint8_t {
        kText,
        kKeptText, // the tree keeps it, for it stays allocated when the tree is released
        kList,
    };

    consteval CopyRow(TextField f, TextField t, Type is = kText)
        : from(f.number), to(t.number), type(is)
    {
    }
    consteval CopyRow(ListField f, RecordField t) : from(f.number), to(t.number), type(kList) {}

    uint8_t from;
    uint8_t to;
    Type type;
};

struct CopyKind;

// A kind of record that may hang below another: the slot of a tree node that carries it, the chain
// of the parent that it goes to, and how it is copied.
struct ChildRow {
    consteval ChildRow(RecordField s, RecordField c, const CopyKind &k)
        : slot(s.number), chain(c.number), kind(&k)
    {
    }

    uint8_t slot;
    uint8_t chain;
    const CopyKind *kind;
};

// One kind of record: its fields in the order in which they are copied, then its children.
struct CopyKind {
    uint8_t fields; // of the context record, each a pointer
    Rows<CopyRow> rows;
    Rows<ChildRow> children = {};
    ListField childList = {kNoField, 0};          // of the tree record
    bool refusalTraced = false;                   // when a child is not accepted
    bool single = false;                          // one of it, not a chain
    void (*onCopied)(const void *copy) = nullptr; // behind the rows
};

// Every kind at the top of a document, in the order in which a node's records are taken.
extern const Rows<ChildRow> kRootRows;

// Rows of children that one parent has, at most.
constexpr size_t kMostChildRows = 9;

// A copy of a tree record with its lists and accepted children, which the caller owns; null for a
// null record or without memory.
void *copyRecord(void *record, const CopyKind &kind, Texts texts = Texts::kCopied);

// Copies the children of a list to the chains of a parent. QVS_ERROR_FAILED at the first one that
// it does not accept, QVS_ERROR_BAD_ARGUMENT without a parent, QVS_ERROR_LIST_ARGUMENT without a
// list.
qvsResult copyChildren(qvsList *children, void *parent, const CopyKind &kind,
                       Texts texts = Texts::kCopied);

// The texts of a list as a chain, up to the first one without memory; null when there are none.
qvsCtxStrNode *copyTexts(qvsList *list, Texts texts = Texts::kCopied);

// qvsClientProvCtxMakeContext of a document that is released next, with its texts taken over.
qvsClientProvCtx *takeContext(qvsWapDoc *document);

} // namespace qvs

#endif
