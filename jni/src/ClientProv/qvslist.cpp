// The list: every walk is a loop.
#include "qvslist.h"

#include "qvsArena.h"
#include "qvsmemory.h"

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvslist";

// A piece whose fields are written next.
void *newUncleared(qvsArena *arena, uint32_t size, int line = __builtin_LINE())
{
    return arena ? qvs::takeRoom(arena, size) : qvsMemAllocSetZero_debug(size, kModule, line);
}

qvsListNode *newNode(qvsArena *arena, void *item)
{
    auto *node = static_cast<qvsListNode *>(newUncleared(arena, sizeof(qvsListNode)));
    if (node) {
        *node = {item, nullptr};
    }
    return node;
}

void releaseItem(void *item, qvsListFree freeItem)
{
    if (!item || freeItem == QVS_LIST_KEEP_ITEMS) {
        return;
    }
    if (freeItem) {
        freeItem(item);
    } else {
        qvs::freeBlock(item);
    }
}

// The last node; null when the list is empty.
qvsListNode *lastNode(const qvsList *list)
{
    qvsListNode *node = list->ptFirst;
    while (node && node->ptNext) {
        node = node->ptNext;
    }
    return node;
}

// Takes `node` out of the chain. `before` is its predecessor; without one, its successor becomes
// the first node.
void unlink(qvsList *list, qvsListNode *before, const qvsListNode *node)
{
    if (before) {
        before->ptNext = node->ptNext;
    } else {
        list->ptFirst = node->ptNext;
    }
}

// Moves a cursor that stands on a node on, before the node leaves the list.
void leave(qvsList *list, const qvsListNode *node)
{
    if (list->ptCursor == node) {
        list->ptCursor = node->ptNext;
    }
}

// Releases a node that was taken out.
void releaseNode(qvsList *list, qvsListNode *node)
{
    qvsMemFree_debug(node);
    --list->nCount;
}

// The node at `index`; null when the list has none.
qvsListNode *nodeAt(const qvsList *list, uint32_t index)
{
    if (index >= list->nCount) {
        return nullptr;
    }
    // hardened: a chain that is shorter than the count has no node behind its end.
    qvsListNode *node = list->ptFirst;
    for (; node && index > 0; --index) {
        node = node->ptNext;
    }
    return node;
}

// Adds `item` behind the node `*last`, which its own becomes; null when the last one is not known.
qvsResult addLast(qvsArena *arena, qvsList *list, void *item, qvsListNode **last)
{
    qvsListNode *node = newNode(arena, item);
    if (!node) {
        return QVS_ERROR_LIST_NO_MEMORY;
    }
    if (!*last) {
        *last = lastNode(list);
    }
    if (*last) {
        (*last)->ptNext = node;
        ++list->nCount;
    } else {
        list->ptFirst = node;
        list->nCount = 1;
    }
    *last = node;
    return QVS_OK;
}

// A list and its first node, as one piece of an arena.
struct ListOfOne {
    qvsList list;
    qvsListNode node;
};

qvsResult create(qvsArena *arena, qvsList **list, void *item, qvsListNode **last)
{
    *last = nullptr;
    if (arena && item) {
        void *room = qvs::takeRoom(arena, sizeof(ListOfOne));
        if (!room) {
            return QVS_ERROR_LIST_NO_MEMORY;
        }
        auto *made = static_cast<ListOfOne *>(room);
        *made = {{1, &made->node, nullptr}, {item, nullptr}};
        *list = &made->list;
        *last = &made->node;
        return QVS_OK;
    }
    auto *made = static_cast<qvsList *>(newUncleared(arena, sizeof(qvsList)));
    if (!made) {
        return QVS_ERROR_LIST_NO_MEMORY;
    }
    *made = {};
    if (item) {
        if (qvsResult result = addLast(nullptr, made, item, last)) {
            qvsMemFree_debug(made);
            return result;
        }
    }
    *list = made;
    return QVS_OK;
}

} // namespace

qvsResult qvs::addItem(qvsArena *arena, qvsList **list, void *item, qvsListNode **last)
{
    if (!*list) {
        return create(arena, list, item, last);
    }
    if (!item) {
        return QVS_OK;
    }
    return addLast(arena, *list, item, last);
}

void qvs::releaseTexts(qvsArena *arena, qvsList *list)
{
    if (!arena) {
        (void)qvsListDeleteNodeAllAndList(list, nullptr); // refuses only a list that is not there
        return;
    }
    for (qvsListNode *node = list->ptFirst; node; node = node->ptNext) {
        freeBlock(node->pItem);
    }
}

qvsResult qvsListCreate(qvsList **list, void *item)
{
    *list = nullptr;
    qvsListNode *last = nullptr;
    return qvs::addItem(nullptr, list, item, &last);
}

qvsResult qvsListAddNodeLast(qvsList *list, void *item)
{
    if (!list || !item) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *last = nullptr;
    return qvs::addItem(nullptr, &list, item, &last);
}

qvsResult qvsListAddNodeFirst(qvsList *list, void *item)
{
    if (!list || !item) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *node = newNode(nullptr, item);
    if (!node) {
        return QVS_ERROR_LIST_NO_MEMORY;
    }
    if (list->ptFirst) {
        node->ptNext = list->ptFirst;
        ++list->nCount;
    } else {
        list->nCount = 1;
    }
    list->ptFirst = node;
    return QVS_OK;
}

qvsResult qvsListDeleteNodeFindItem(qvsList *list, void *item, qvsListFree freeItem)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *before = nullptr;
    qvsListNode *node = list->ptFirst;
    while (node && node->pItem != item) {
        before = node;
        node = node->ptNext;
    }
    if (!node) {
        return QVS_ERROR_LIST_NOT_FOUND;
    }
    // The callback finds a list without the item, and a cursor that is not on it.
    leave(list, node);
    unlink(list, before, node);
    releaseItem(node->pItem, freeItem);
    releaseNode(list, node);
    return QVS_OK;
}

qvsResult qvsListDeleteNodeFirst(qvsList *list, qvsListFree freeItem)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *node = list->ptFirst;
    if (!node) {
        return QVS_OK;
    }
    unlink(list, nullptr, node);
    releaseItem(node->pItem, freeItem);
    // kept[list-first-cursor]: a cursor on the node stays where it is.
    releaseNode(list, node);
    return QVS_OK;
}

qvsResult qvsListDeleteNodeAll(qvsList *list, qvsListFree freeItem)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *node = list->ptFirst;
    while (node) {
        qvsListNode *next = node->ptNext;
        releaseItem(node->pItem, freeItem);
        qvs::freeBlock(node);
        node = next;
    }
    *list = {};
    return QVS_OK;
}

qvsResult qvsListDeleteNodeAllAndList(qvsList *list, qvsListFree freeItem)
{
    const qvsResult result = qvsListDeleteNodeAll(list, freeItem);
    qvs::freeBlock(list);
    return result;
}

qvsResult qvsListSetCurNodeFirst(qvsList *list)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    list->ptCursor = list->ptFirst;
    return QVS_OK;
}

qvsResult qvsListGetItemNext(qvsList *list, void **item)
{
    *item = nullptr;
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    if (const qvsListNode *node = list->ptCursor) {
        *item = node->pItem;
        list->ptCursor = node->ptNext;
    }
    return QVS_OK;
}

qvsResult qvsListGetItemFirst(qvsList *list, void **item)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    *item = list->ptFirst ? list->ptFirst->pItem : nullptr;
    return QVS_OK;
}

qvsResult qvsListGetItemFirstAndDeleteNode(qvsList *list, void **item)
{
    *item = nullptr;
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    if (qvsListNode *node = list->ptFirst) {
        *item = node->pItem;
        leave(list, node);
        unlink(list, nullptr, node);
        releaseNode(list, node);
    }
    return QVS_OK;
}

qvsResult qvsListGetItemNextAndDeleteNode(qvsList *list, void **item)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    *item = nullptr;
    qvsListNode *node = list->ptCursor;
    if (!list->ptFirst || !node) {
        return QVS_OK;
    }
    qvsListNode *before = nullptr;
    if (node != list->ptFirst) {
        // kept[list-stray-cursor]: a cursor's node that is not in the list takes the list along:
        // its successor becomes the first node.
        before = list->ptFirst;
        while (before && before->ptNext != node) {
            before = before->ptNext;
        }
    }
    *item = node->pItem;
    leave(list, node);
    unlink(list, before, node);
    releaseNode(list, node);
    return QVS_OK;
}

qvsResult qvsListGetItemIndex(qvsList *list, void **item, uint32_t index)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    const qvsListNode *node = nodeAt(list, index);
    *item = node ? node->pItem : nullptr;
    if (!node) {
        return QVS_ERROR_LIST_NOT_FOUND;
    }
    return QVS_OK;
}

qvsResult qvsListGetItemIndexAndDeleteNode(qvsList *list, void **item, uint32_t index)
{
    if (!list) {
        return QVS_ERROR_LIST_ARGUMENT;
    }
    qvsListNode *node = nodeAt(list, index);
    *item = node ? node->pItem : nullptr;
    if (!node) {
        return QVS_ERROR_LIST_NOT_FOUND;
    }
    // kept[list-index-delete]: the nodes before this one leave the list and stay allocated.
    // hardened: a cursor on the node moves to the next one.
    leave(list, node);
    unlink(list, nullptr, node);
    releaseNode(list, node);
    return QVS_OK;
}

uint32_t qvsListGetCount(const qvsList *list)
{
    return list->nCount;
}
