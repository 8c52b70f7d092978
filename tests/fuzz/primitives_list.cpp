// A list beside a vector of its items.
#include "check.h"
#include "script.h"

#include "qvslist.h"
#include "qvsmemory.h"

namespace fuzz {

namespace {

class ListModel {
public:
    ListModel() { check(qvsListCreate(&list, nullptr) == QVS_OK, "a list is made"); }

    void checkItems()
    {
        check(qvsListGetCount(list) == items.size(), "as many items as were added",
              qvsListGetCount(list));
        void *item = nullptr;
        for (size_t i = 0; i < items.size(); ++i) {
            check(qvsListGetItemIndex(list, &item, static_cast<uint32_t>(i)) == QVS_OK &&
                      item == items[i],
                  "every item in its place", i);
        }
        check(qvsListGetItemIndex(list, &item, static_cast<uint32_t>(items.size())) ==
                      QVS_ERROR_LIST_NOT_FOUND &&
                  !item,
              "no item behind the last");
        check(qvsListGetItemFirst(list, &item) == QVS_OK &&
                  item == (items.empty() ? nullptr : items[0]),
              "the first item is the first");
    }

    // ---- Operations

    void addLast(void *item)
    {
        check(qvsListAddNodeLast(list, item) == QVS_OK, "an item is added at the end");
        items.push_back(item);
    }

    void addFirst(void *item)
    {
        check(qvsListAddNodeFirst(list, item) == QVS_OK, "an item is added at the start");
        items.insert(items.begin(), item);
        cursor += cursor != kNone;
    }

    void remove(size_t index)
    {
        void *item = index < items.size() ? items[index] : this;
        const qvsResult result = qvsListDeleteNodeFindItem(list, item, nullptr);
        check(result == (index < items.size() ? QVS_OK : QVS_ERROR_LIST_NOT_FOUND),
              "an item is found when it is there");
        erase(index);
    }

    void removeFirst()
    {
        check(qvsListDeleteNodeFirst(list, nullptr) == QVS_OK, "the first item goes");
        const bool stray = cursor == 0;
        erase(0);
        if (stray) { // the cursor is left on what is gone
            rewind();
        }
    }

    void rewind()
    {
        check(qvsListSetCurNodeFirst(list) == QVS_OK, "the cursor goes to the start");
        cursor = items.empty() ? kNone : 0;
    }

    void next()
    {
        void *item = this;
        check(qvsListGetItemNext(list, &item) == QVS_OK && item == atCursor(),
              "the cursor gives its item");
        if (cursor != kNone) {
            cursor = cursor + 1 < items.size() ? cursor + 1 : kNone;
        }
    }

    void takeFirst()
    {
        void *item = this;
        check(qvsListGetItemFirstAndDeleteNode(list, &item) == QVS_OK &&
                  item == (items.empty() ? nullptr : items[0]),
              "the first item is handed over");
        qvsMemFree_debug(item);
        erase(0);
    }

    void takeNext()
    {
        void *item = this;
        check(qvsListGetItemNextAndDeleteNode(list, &item) == QVS_OK && item == atCursor(),
              "the item at the cursor is handed over");
        if (cursor != kNone) {
            qvsMemFree_debug(item);
            erase(cursor);
        }
    }

    void clear(qvsListFree freeItem)
    {
        if (freeItem == QVS_LIST_KEEP_ITEMS) {
            for (void *item : items) {
                qvsMemFree_debug(item);
            }
        }
        check(qvsListDeleteNodeAll(list, freeItem) == QVS_OK, "all items go");
        items.clear();
        cursor = kNone;
    }

    // Ends the list: the nodes before the index leave it without being released.
    void takeIndex(size_t index)
    {
        std::vector<qvsListNode *> before;
        qvsListNode *node = list->ptFirst;
        for (size_t i = 0; i < index && i < items.size(); ++i, node = node->ptNext) {
            before.push_back(node);
        }
        void *item = nullptr;
        const bool there = index < items.size();
        const qvsResult result =
            qvsListGetItemIndexAndDeleteNode(list, &item, static_cast<uint32_t>(index));
        check(result == (there ? QVS_OK : QVS_ERROR_LIST_NOT_FOUND) &&
                  item == (there ? items[index] : nullptr),
              "the item at an index is handed over");
        if (there) {
            check(qvsListGetCount(list) == items.size() - 1, "one less is counted");
            qvsMemFree_debug(item);
            for (qvsListNode *lost : before) {
                qvsMemFree_debug(lost->pItem);
                qvsMemFree_debug(lost);
            }
        }
        end(nullptr);
    }

    void end(qvsListFree freeItem)
    {
        check(qvsListDeleteNodeAllAndList(list, freeItem) == QVS_OK, "the list goes");
    }

private:
    static constexpr size_t kNone = SIZE_MAX;

    void *atCursor() const { return cursor == kNone ? nullptr : items[cursor]; }

    void erase(size_t index)
    {
        if (index >= items.size()) {
            return;
        }
        items.erase(items.begin() + static_cast<std::ptrdiff_t>(index));
        if (cursor != kNone && cursor > index) {
            --cursor;
        } else if (cursor == items.size()) {
            cursor = kNone;
        }
    }

    qvsList *list = nullptr;
    std::vector<void *> items;
    size_t cursor = kNone;
};

void *newItem()
{
    return qvsMemAlloc_debug(1, "fuzz", __LINE__);
}

void freeItem(void *item)
{
    check(item != nullptr, "a release gets an item");
    qvsMemFree_debug(item);
}

} // namespace

void runList(Script *script)
{
    ListModel model;
    while (!script->isOver()) {
        const uint8_t op = script->byte();
        const size_t index = op / 16;
        switch (op % 12) {
        case 0:
        case 1:
        case 2:
            model.addLast(newItem());
            break;
        case 3:
        case 4:
            model.addFirst(newItem());
            break;
        case 5:
            model.remove(index);
            break;
        case 6:
            model.removeFirst();
            break;
        case 7:
            model.rewind();
            break;
        case 8:
            model.next();
            break;
        case 9:
            model.takeFirst();
            break;
        case 10:
            model.takeNext();
            break;
        default:
            if (index < 12) {
                return model.takeIndex(index);
            }
            model.clear(index % 2 ? freeItem : QVS_LIST_KEEP_ITEMS);
            break;
        }
        model.checkItems();
    }
    model.end(freeItem);
}

} // namespace fuzz
