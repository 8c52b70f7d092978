// A singly linked list of untyped items with a count and a cursor. Valid C and C++.
#ifndef QVSLIST_H
#define QVSLIST_H

#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

typedef struct qvsListNode {
    void *pItem; // never null when it came in through the functions below
    struct qvsListNode *ptNext;
} qvsListNode;

// A list owns its nodes. Its items belong to whoever empties it: see qvsListFree.
typedef struct qvsList {
    uint32_t nCount;
    qvsListNode *ptFirst;  // null when empty
    qvsListNode *ptCursor; // what qvsListGetItemNext gives next; null when there is no more
} qvsList;

// What a deleting function does with an item: null releases it with qvsMemFree_debug,
// QVS_LIST_KEEP_ITEMS leaves it alone, anything else is called with it. An item that is null is
// left out.
typedef void (*qvsListFree)(void *item);

#define QVS_LIST_KEEP_ITEMS ((qvsListFree)(intptr_t)-1)

// Every result is QVS_ERROR_LIST_ARGUMENT for a null list.

// qvsListCreate makes a list, which the caller owns, with `item` in it unless that is null. The
// cursor is null. QVS_ERROR_LIST_NO_MEMORY with *list null without memory.
QVS_NODISCARD QVS_API qvsResult qvsListCreate(qvsList **list, void *item);

// qvsListAddNodeLast and qvsListAddNodeFirst add `item` behind the last node, to which the first
// walks, or before the first one; the cursor stays. QVS_ERROR_LIST_ARGUMENT for a null item,
// QVS_ERROR_LIST_NO_MEMORY without memory; the item is then still the caller's.
QVS_NODISCARD QVS_API qvsResult qvsListAddNodeLast(qvsList *list, void *item);
QVS_NODISCARD QVS_API qvsResult qvsListAddNodeFirst(qvsList *list, void *item);

// qvsListDeleteNodeFindItem deletes the first node that holds exactly `item`; a cursor on it moves
// to the next node. QVS_ERROR_LIST_NOT_FOUND when there is none.
QVS_NODISCARD QVS_API qvsResult qvsListDeleteNodeFindItem(qvsList *list, void *item,
                                                          qvsListFree freeItem);

// qvsListDeleteNodeFirst deletes the first node, if there is one; the cursor stays, even on it.
QVS_NODISCARD QVS_API qvsResult qvsListDeleteNodeFirst(qvsList *list, qvsListFree freeItem);

// qvsListDeleteNodeAll deletes all nodes, first to last; qvsListDeleteNodeAllAndList the list too.
QVS_NODISCARD QVS_API qvsResult qvsListDeleteNodeAll(qvsList *list, qvsListFree freeItem);
QVS_NODISCARD QVS_API qvsResult qvsListDeleteNodeAllAndList(qvsList *list, qvsListFree freeItem);

// qvsListSetCurNodeFirst puts the cursor on the first node.
QVS_NODISCARD QVS_API qvsResult qvsListSetCurNodeFirst(qvsList *list);

// qvsListGetItemNext gives the item under the cursor in *item and moves the cursor on; null behind
// the last one and for a null list.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemNext(qvsList *list, void **item);

// qvsListGetItemFirst gives the first item in *item, null for an empty list; the cursor stays.
// *item is untouched for a null list.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemFirst(qvsList *list, void **item);

// qvsListGetItemFirstAndDeleteNode hands the first item over to the caller in *item, null for an
// empty or null list, and deletes its node; a cursor on it moves to the next node.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemFirstAndDeleteNode(qvsList *list, void **item);

// qvsListGetItemNextAndDeleteNode hands the item under the cursor over to the caller in *item,
// null when there is none, deletes its node and moves the cursor on. *item is untouched for a null
// list.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemNextAndDeleteNode(qvsList *list, void **item);

// qvsListGetItemIndex gives the item at `index`, counted from 0, in *item; null with
// QVS_ERROR_LIST_NOT_FOUND when the list has no such node. *item is untouched for a null list.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemIndex(qvsList *list, void **item, uint32_t index);

// qvsListGetItemIndexAndDeleteNode is qvsListGetItemIndex, but hands the item over to the caller
// and deletes its node; the nodes before it leave the list without being released.
QVS_NODISCARD QVS_API qvsResult qvsListGetItemIndexAndDeleteNode(qvsList *list, void **item,
                                                                 uint32_t index);

// qvsListGetCount gives the number of nodes. The list must not be null.
QVS_API uint32_t qvsListGetCount(const qvsList *list);

QVS_END_DECLS

#ifdef __cplusplus
struct qvsArena;

namespace [[gnu::visibility("hidden")]] qvs {

// Adds `item` behind the last one of `*list`, which is made when there is none; node and list are
// pieces of the arena. A null item adds nothing to a list. `*last` is the tail of the list, which
// whoever builds it remembers; null when it is not known. QVS_ERROR_LIST_NO_MEMORY, with a list
// that was not there still null.
QVS_NODISCARD qvsResult addItem(qvsArena *arena, qvsList **list, void *item, qvsListNode **last);

// Releases a list of texts.
void releaseTexts(qvsArena *arena, qvsList *list);

} // namespace qvs
#endif

#endif
