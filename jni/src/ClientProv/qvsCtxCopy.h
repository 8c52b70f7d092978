// How the records of a document tree become those of the context: tables, and the one piece of code
// that runs them.
#ifndef QVSCTXCOPY_H
#define QVSCTXCOPY_H

#include "qvsFields.h"
#include "qvsLeft.h"
#include "qvslist.h"
#include "qvsresult.h"

#include <stddef.h>
#include <stdint.h>

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

    uint8_t field; // of the tree record
    uint8_t to;
    Type type;
};

// The texts and the lists of texts of a tree record, in the order in which they are copied. Each
// goes to the field in its place.
template <class From>
consteval auto copyInOrder()
{
    constexpr FieldSet<From> kStay = kLeft<From>;
    Table<From, CopyRow, kRowsOf<From>> table = {};
    for (uint8_t field = 0; field < kRowsOf<From>; ++field) {
        const CopyRow::Type text = kStay.has[field] ? CopyRow::kKeptText : CopyRow::kText;
        const bool isText = kFields<From>.rows[field].holds == Holds::kText;
        table.rows[field] = {field, field, isText ? text : CopyRow::kList};
    }
    return table;
}

template <class From>
inline constexpr auto kCopyRows = copyInOrder<From>();

// Whether texts are copied to texts, and lists to chains of texts.
template <class From, class To>
consteval bool areAlike()
{
    bool alike = true;
    for (const CopyRow &row : kCopyRows<From>.rows) {
        alike = alike && kFields<From>.rows[row.field].holds == kFields<To>.rows[row.to].holds;
    }
    return alike;
}

struct CopyKind;

// A kind of record that may hang below another: the slot of a tree node that carries it, the chain
// of the parent that it goes to, and how it is copied.
struct ChildRow {
    uint8_t slot;
    uint8_t chain;
    bool stays; // with its texts, when the tree is released
    const CopyKind *kind;
};

// One kind of record: its fields in the order in which they are copied, then its children.
struct CopyKind {
    uint8_t fields;    // of the context record, each a pointer
    uint8_t childList; // of the tree record
    bool single;       // one of it, not a chain
    Rows<CopyRow> rows;
    Rows<ChildRow> children;
    bool refusalTraced;                 // when a child is not accepted
    void (*onCopied)(const void *copy); // behind the rows
};

// Rows of children that one parent has, at most.
constexpr size_t kMostChildRows = 9;

// What is done when a record of the context has its texts.
template <class To>
struct OnCopied {
    void (*run)(const void *copy);
};

// The copy of a kind of tree record, which is a kind of context record.
template <class From, class To>
struct CopyOf {
    consteval CopyOf(Rows<ChildRow> children, bool refusalTraced, OnCopied<To> onCopied)
        : kind{kFieldsOf<To>,
               kChildListOf<From>,
               kLinkOf<To> == kNoField,
               rowsFor<From>(kCopyRows<From>),
               children,
               refusalTraced,
               onCopied.run}
    {
        static_assert(areAlike<From, To>());
    }
    consteval CopyOf() : CopyOf(Rows<ChildRow>(), false, {}) {}
    consteval CopyOf(OnCopied<To> onCopied) : CopyOf(Rows<ChildRow>(), false, onCopied) {}
    template <size_t N>
    consteval CopyOf(const Table<To, ChildRow, N> &children, bool refusalTraced)
        : CopyOf(rowsFor<To>(children), refusalTraced, {})
    {
        static_assert(N <= kMostChildRows);
    }

    CopyKind kind;
};

// A row of the children of Parent.
template <class Parent>
struct Child {
    using Of = Parent;
    using Row = ChildRow;

    template <class From, class To>
    consteval Child(From *qvsWapCharacter::*from, To *Parent::*to, const CopyOf<From, To> &copy)
        : row{numberOf(from), numberOf(to), kLeft<qvsWapCharacter>.has[numberOf(from)], &copy.kind}
    {
    }

    ChildRow row;
};

// Every kind at the top of a document, in the order in which a node's records are taken.
extern const Rows<ChildRow> kRootRows;

// A copy of a tree record with its lists and accepted children, which the caller owns; null for a
// null record or without memory.
void *copyRecord(void *record, const CopyKind &kind, Texts texts = Texts::kCopied);
template <class From, class To>
To *copyRecord(From *record, const CopyOf<From, To> &copy)
{
    return static_cast<To *>(copyRecord(record, copy.kind));
}

// Copies the children of a list to the chains of a parent. QVS_ERROR_FAILED at the first one that
// it does not accept, QVS_ERROR_LIST_ARGUMENT without a list. Without a parent
// QVS_ERROR_BAD_ARGUMENT at the first one that it would accept.
qvsResult copyChildren(qvsList *children, void *parent, const CopyKind &kind,
                       Texts texts = Texts::kCopied);
template <class From, class To>
qvsResult copyChildren(qvsList *children, To *parent, const CopyOf<From, To> &copy)
{
    return copyChildren(children, parent, copy.kind);
}

// The texts of a list as a chain, up to the first one without memory; null when there are none.
qvsCtxStrNode *copyTexts(qvsList *list, Texts texts = Texts::kCopied);

// qvsClientProvCtxMakeContext of a document that is released next, with its texts taken over.
qvsClientProvCtx *takeContext(qvsWapDoc *document);

} // namespace qvs

#endif
