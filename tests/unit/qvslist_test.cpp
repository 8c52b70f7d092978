// The list: every function, with a list that is null, empty, and of several items.
#include "qvslist.h"

#include "blocks.h"
#include "qvsmemory.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>
#include <initializer_list>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

namespace {

#if __SIZEOF_POINTER__ == 4
static_assert(offsetof(qvsList, nCount) == 0);
static_assert(offsetof(qvsList, ptFirst) == 4);
static_assert(offsetof(qvsList, ptCursor) == 8);
static_assert(offsetof(qvsListNode, pItem) == 0);
static_assert(offsetof(qvsListNode, ptNext) == 4);
static_assert(sizeof(qvsList) == 12);
static_assert(sizeof(qvsListNode) == 8);
#endif
// Hosts make lists of their own: there is nothing behind the three fields.
static_assert(sizeof(qvsList) == 3 * sizeof(void *));

constexpr char kFile[] = "jni/src/ClientProv/caller";

class List : public blocks::BlockTest {};

// Items that need no release: the letters of one text.
char letters[] = "abcdefgh";
char *const a = letters;
char *const b = letters + 1;
char *const c = letters + 2;
char *const d = letters + 3;
char stranger = '?';

std::string released; // the letters that noteItem was called with

void noteItem(void *item)
{
    released += *static_cast<char *>(item);
}

qvsList *listOf(std::initializer_list<char *> items)
{
    qvsList *list = nullptr;
    EXPECT_EQ(qvsListCreate(&list, nullptr), QVS_OK);
    for (char *item : items) {
        EXPECT_EQ(qvsListAddNodeLast(list, item), QVS_OK);
    }
    released.clear();
    return list;
}

void drop(qvsList *list)
{
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, QVS_LIST_KEEP_ITEMS), QVS_OK);
}

// The letters in the chain.
std::string chain(const qvsList *list)
{
    std::string text;
    for (const qvsListNode *node = list->ptFirst; node; node = node->ptNext) {
        text += *static_cast<char *>(node->pItem);
    }
    return text;
}

// The letter under the cursor, "-" behind the end.
std::string cursor(const qvsList *list)
{
    return list->ptCursor ? std::string(1, *static_cast<char *>(list->ptCursor->pItem)) : "-";
}

void advance(qvsList *list, int steps)
{
    EXPECT_EQ(qvsListSetCurNodeFirst(list), QVS_OK);
    for (; steps > 0; --steps) {
        void *item = nullptr;
        EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
    }
}

// Whether a further item still comes last, whatever was done to the list before.
void expectAppends(qvsList *list)
{
    const std::string before = chain(list);
    const uint32_t count = list->nCount;
    EXPECT_EQ(qvsListAddNodeLast(list, letters + 7), QVS_OK);
    EXPECT_EQ(chain(list), before + "h");
    EXPECT_EQ(list->nCount, before.empty() ? 1 : count + 1);
}

} // namespace

TEST_F(List, IsCreatedEmptyWithoutAnItem)
{
    blocks::startCounting();
    qvsList *list = nullptr;
    ASSERT_EQ(qvsListCreate(&list, nullptr), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 1U);
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_EQ(list->ptFirst, nullptr);
    EXPECT_EQ(list->ptCursor, nullptr);
    drop(list);
}

TEST_F(List, IsCreatedWithAnItem)
{
    blocks::startCounting();
    qvsList *list = nullptr;
    ASSERT_EQ(qvsListCreate(&list, a), QVS_OK);
    EXPECT_EQ(blocks::allocations(), 2U);
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(list->ptFirst->pItem, a);
    EXPECT_EQ(list->ptFirst->ptNext, nullptr);
    EXPECT_EQ(list->ptCursor, nullptr);
    drop(list);
}

TEST_F(List, IsNotCreatedWithoutMemory)
{
    const long runs = blocks::failEach([] {
        qvsList untouched = {};
        qvsList *list = &untouched;
        if (qvsListCreate(&list, a) == QVS_OK) {
            drop(list);
        } else {
            EXPECT_EQ(list, nullptr);
        }
    });
    EXPECT_EQ(runs, 2);
    blocks::failAt = 0;
    qvsList *list = nullptr;
    EXPECT_EQ(qvsListCreate(&list, nullptr), 4109U);
    blocks::failAt = 1;
    EXPECT_EQ(qvsListCreate(&list, a), 4109U);
}

TEST_F(List, IsMadeUnderItsOwnPath)
{
    qvsList *list = nullptr;
    testing::internal::CaptureStdout();
    qvsMemStartMemCheck();
    EXPECT_EQ(qvsListCreate(&list, a), QVS_OK);
    qvsMemEndMemCheck();
    const std::string report = testing::internal::GetCapturedStdout();
    const std::string path = "Filename:jni/src/ClientProv/qvslist Line:";
    const std::size_t first = report.find(path);
    ASSERT_NE(first, std::string::npos);
    EXPECT_NE(report.find(path, first + 1), std::string::npos);
    drop(list);
}

TEST_F(List, AddsLast)
{
    qvsList *list = listOf({a, b});
    EXPECT_EQ(qvsListAddNodeLast(list, c), QVS_OK);
    EXPECT_EQ(chain(list), "abc");
    EXPECT_EQ(list->nCount, 3U);
    EXPECT_EQ(list->ptCursor, nullptr);
    drop(list);
}

TEST_F(List, AddsFirst)
{
    qvsList *list = listOf({});
    EXPECT_EQ(qvsListAddNodeFirst(list, b), QVS_OK);
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(qvsListAddNodeFirst(list, a), QVS_OK);
    EXPECT_EQ(list->nCount, 2U);
    EXPECT_EQ(chain(list), "ab");
    EXPECT_EQ(list->ptCursor, nullptr);
    expectAppends(list);
    drop(list);
}

TEST_F(List, AddingLeavesTheCursor)
{
    qvsList *list = listOf({a, b});
    advance(list, 1);
    EXPECT_EQ(qvsListAddNodeLast(list, c), QVS_OK);
    EXPECT_EQ(qvsListAddNodeFirst(list, d), QVS_OK);
    EXPECT_EQ(cursor(list), "b");
    drop(list);
}

TEST_F(List, AddingRefusesNull)
{
    qvsList *list = listOf({a});
    EXPECT_EQ(qvsListAddNodeLast(nullptr, a), 4108U);
    EXPECT_EQ(qvsListAddNodeLast(list, nullptr), 4108U);
    EXPECT_EQ(qvsListAddNodeFirst(nullptr, a), 4108U);
    EXPECT_EQ(qvsListAddNodeFirst(list, nullptr), 4108U);
    EXPECT_EQ(chain(list), "a");
    EXPECT_EQ(list->nCount, 1U);
    drop(list);
}

TEST_F(List, AddingWithoutMemoryChangesNothing)
{
    qvsList *list = listOf({a});
    blocks::failAt = 0;
    EXPECT_EQ(qvsListAddNodeLast(list, b), 4109U);
    blocks::failAt = 0;
    EXPECT_EQ(qvsListAddNodeFirst(list, b), 4109U);
    blocks::reset();
    EXPECT_EQ(chain(list), "a");
    EXPECT_EQ(list->nCount, 1U);
    expectAppends(list);
    drop(list);
}

TEST_F(List, AddingToAnEmptyListSetsTheCount)
{
    qvsList *list = listOf({});
    list->nCount = 7;
    EXPECT_EQ(qvsListAddNodeLast(list, a), QVS_OK);
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(qvsListDeleteNodeFirst(list, QVS_LIST_KEEP_ITEMS), QVS_OK);
    list->nCount = 7;
    EXPECT_EQ(qvsListAddNodeFirst(list, a), QVS_OK);
    EXPECT_EQ(list->nCount, 1U);
    drop(list);
}

TEST_F(List, AppendsToAChainMadeByHand)
{
    qvsListNode *nodes[3] = {};
    for (qvsListNode *&node : nodes) {
        node = static_cast<qvsListNode *>(qvsMemAlloc_debug(sizeof *node, kFile, __LINE__));
    }
    *nodes[0] = {a, nodes[1]};
    *nodes[1] = {b, nullptr};
    auto *list = static_cast<qvsList *>(qvsMemAlloc_debug(sizeof(qvsList), kFile, __LINE__));
    *list = {2, nodes[0], nullptr};
    expectAppends(list);

    // The host puts another node in place of those behind the first.
    qvsMemFree_debug(nodes[1]->ptNext);
    qvsMemFree_debug(nodes[1]);
    *nodes[2] = {c, nullptr};
    nodes[0]->ptNext = nodes[2];
    list->nCount = 2;
    expectAppends(list);
    EXPECT_EQ(chain(list), "ach");
    drop(list);
}

TEST_F(List, IsReleasedWithinItsOwnBlock)
{
    blocks::Fence fence;
    auto *list = static_cast<qvsList *>(qvsMemAlloc_debug(sizeof(qvsList), kFile, __LINE__));
    *list = {0, nullptr, nullptr};
    expectAppends(list);
    drop(list);
}

TEST_F(List, TakesAListEmptiedByHandForEmpty)
{
    qvsList *list = listOf({a});
    qvsListNode *node = list->ptFirst;
    list->ptFirst = nullptr;
    expectAppends(list);
    qvsMemFree_debug(node);
    drop(list);
}

TEST_F(List, DeletesTheNodeOfAnItem)
{
    for (const auto &[item, rest] :
         std::initializer_list<std::pair<char *, const char *>>{{a, "bc"}, {b, "ac"}, {c, "ab"}}) {
        qvsList *list = listOf({a, b, c});
        EXPECT_EQ(qvsListDeleteNodeFindItem(list, item, noteItem), QVS_OK);
        EXPECT_EQ(released, std::string(1, *item));
        EXPECT_EQ(chain(list), rest);
        EXPECT_EQ(list->nCount, 2U);
        expectAppends(list);
        drop(list);
    }
}

TEST_F(List, HandsOnNoItemThatIsBeingDeleted)
{
    // The callback reads on: the cursor has left the node, which counts until it is gone.
    static qvsList *list;
    static void *next;
    static uint32_t count;
    list = listOf({a, b, c});
    EXPECT_EQ(qvsListSetCurNodeFirst(list), QVS_OK);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, a,
                                        [](void *) {
                                            EXPECT_EQ(qvsListGetItemNext(list, &next), QVS_OK);
                                            count = qvsListGetCount(list);
                                        }),
              QVS_OK);
    EXPECT_EQ(next, b);
    EXPECT_EQ(count, 3U);
    EXPECT_EQ(list->nCount, 2U);
    EXPECT_EQ(qvsListGetItemNext(list, &next), QVS_OK);
    EXPECT_EQ(next, c);
    drop(list);
}

TEST_F(List, DeletesTheFirstOfSeveralNodesWithAnItem)
{
    qvsList *list = listOf({a, b, a});
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, a, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(chain(list), "ba");
    drop(list);
}

TEST_F(List, DeletesTheOnlyNode)
{
    qvsList *list = listOf({a});
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, a, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(list->ptFirst, nullptr);
    EXPECT_EQ(list->nCount, 0U);
    expectAppends(list);
    drop(list);
}

TEST_F(List, DeletingAnItemMovesACursorOnItsNode)
{
    qvsList *list = listOf({a, b, c});
    advance(list, 1);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, b, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(cursor(list), "c");
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, a, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(cursor(list), "c") << "a cursor elsewhere stays";
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, c, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(cursor(list), "-");
    drop(list);
}

TEST_F(List, DoesNotDeleteAnItemThatItDoesNotHold)
{
    qvsList *list = listOf({a, b});
    char equal = 'a';
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, &equal, noteItem), 4110U);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, nullptr, noteItem), 4110U);
    EXPECT_EQ(chain(list), "ab");
    EXPECT_EQ(list->nCount, 2U);
    EXPECT_EQ(released, "");
    drop(list);

    qvsList *empty = listOf({});
    EXPECT_EQ(qvsListDeleteNodeFindItem(empty, a, noteItem), 4110U);
    drop(empty);
    EXPECT_EQ(qvsListDeleteNodeFindItem(nullptr, a, noteItem), 4108U);
}

TEST_F(List, DeletesTheFirstNode)
{
    qvsList *list = listOf({a, b});
    EXPECT_EQ(qvsListDeleteNodeFirst(list, noteItem), QVS_OK);
    EXPECT_EQ(chain(list), "b");
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(qvsListDeleteNodeFirst(list, noteItem), QVS_OK);
    EXPECT_EQ(list->ptFirst, nullptr);
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_EQ(qvsListDeleteNodeFirst(list, noteItem), QVS_OK);
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_EQ(released, "ab");
    expectAppends(list);
    drop(list);
    EXPECT_EQ(qvsListDeleteNodeFirst(nullptr, noteItem), 4108U);
}

TEST_F(List, DeletesAllNodes)
{
    qvsList *list = listOf({a, b, c});
    advance(list, 1);
    EXPECT_EQ(qvsListDeleteNodeAll(list, noteItem), QVS_OK);
    EXPECT_EQ(released, "abc");
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_EQ(list->ptFirst, nullptr);
    EXPECT_EQ(list->ptCursor, nullptr);
    expectAppends(list);
    drop(list);
    EXPECT_EQ(qvsListDeleteNodeAll(nullptr, noteItem), 4108U);
}

TEST_F(List, DeletesAllNodesAndItself)
{
    qvsList *list = listOf({a, b});
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, noteItem), QVS_OK);
    EXPECT_EQ(released, "ab");
    EXPECT_EQ(qvsListDeleteNodeAllAndList(nullptr, noteItem), 4108U);
}

TEST_F(List, ReleasesItemsAsBlocksWithoutACallback)
{
    const auto text = [] { return qvsStrdup_debug("text", kFile, 1); };
    char *items[] = {text(), text(), text(), text()};
    qvsList *list = listOf({items[0], items[1], items[2], items[3]});
    const std::size_t before = blocks::live();
    EXPECT_EQ(qvsListDeleteNodeFirst(list, nullptr), QVS_OK);
    EXPECT_EQ(blocks::live(), before - 2);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, items[2], nullptr), QVS_OK);
    EXPECT_EQ(blocks::live(), before - 4);
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, nullptr), QVS_OK);
    EXPECT_EQ(blocks::live(), before - 9);
}

TEST_F(List, KeepsItemsThatStayTheCallers)
{
    char *item = qvsStrdup_debug("text", kFile, 1);
    qvsList *list = listOf({item, item, item});
    EXPECT_EQ(qvsListDeleteNodeFirst(list, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, item, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(qvsListDeleteNodeAll(list, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_STREQ(item, "text");
    qvsMemFree_debug(item);
    drop(list);
}

TEST_F(List, TheCallbackThatKeepsItemsIsAllOnes)
{
    const qvsListFree keep = QVS_LIST_KEEP_ITEMS;
    unsigned char bytes[sizeof(keep)];
    std::memcpy(bytes, &keep, sizeof(keep));
    for (const unsigned char byte : bytes) {
        EXPECT_EQ(byte, 0xFF);
    }
}

TEST_F(List, NeverCallsBackWithANullItem)
{
    qvsList *list = listOf({a, b, c});
    list->ptFirst->pItem = nullptr;
    list->ptFirst->ptNext->ptNext->pItem = nullptr;
    EXPECT_EQ(qvsListDeleteNodeFirst(list, noteItem), QVS_OK);
    EXPECT_EQ(qvsListDeleteNodeFindItem(list, nullptr, noteItem), QVS_OK);
    EXPECT_EQ(released, "");
    EXPECT_EQ(qvsListDeleteNodeAllAndList(list, noteItem), QVS_OK);
    EXPECT_EQ(released, "b");
}

TEST_F(List, IsWalkedWithTheCursor)
{
    qvsList *list = listOf({a, b});
    void *item = &stranger;
    EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
    EXPECT_EQ(item, nullptr) << "the cursor was never set";
    EXPECT_EQ(qvsListSetCurNodeFirst(list), QVS_OK);
    for (void *expected : {static_cast<void *>(a), static_cast<void *>(b)}) {
        EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
        EXPECT_EQ(item, expected);
    }
    for (int i = 0; i < 2; ++i) {
        item = &stranger;
        EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
        EXPECT_EQ(item, nullptr);
    }
    EXPECT_EQ(chain(list), "ab");
    drop(list);
}

TEST_F(List, IsWalkedInNoStepsWhenEmpty)
{
    qvsList *list = listOf({});
    void *item = &stranger;
    EXPECT_EQ(qvsListSetCurNodeFirst(list), QVS_OK);
    EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    drop(list);
}

TEST_F(List, AddingBehindTheWalkDoesNotReviveTheCursor)
{
    qvsList *list = listOf({a});
    advance(list, 1);
    EXPECT_EQ(qvsListAddNodeLast(list, b), QVS_OK);
    void *item = &stranger;
    EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(qvsListSetCurNodeFirst(list), QVS_OK);
    EXPECT_EQ(qvsListGetItemNext(list, &item), QVS_OK);
    EXPECT_EQ(item, a);
    drop(list);
}

TEST_F(List, CursorFunctionsRefuseNull)
{
    void *item = &stranger;
    EXPECT_EQ(qvsListSetCurNodeFirst(nullptr), 4108U);
    EXPECT_EQ(qvsListGetItemNext(nullptr, &item), 4108U);
    EXPECT_EQ(item, nullptr);
}

TEST_F(List, GivesTheFirstItem)
{
    qvsList *list = listOf({a, b});
    advance(list, 1);
    void *item = nullptr;
    EXPECT_EQ(qvsListGetItemFirst(list, &item), QVS_OK);
    EXPECT_EQ(item, a);
    EXPECT_EQ(cursor(list), "b");
    drop(list);

    qvsList *empty = listOf({});
    EXPECT_EQ(qvsListGetItemFirst(empty, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    drop(empty);

    item = &stranger;
    EXPECT_EQ(qvsListGetItemFirst(nullptr, &item), 4108U);
    EXPECT_EQ(item, &stranger);
}

TEST_F(List, HandsTheFirstItemOver)
{
    qvsList *list = listOf({a, b, c});
    advance(list, 0);
    void *item = nullptr;
    EXPECT_EQ(qvsListGetItemFirstAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, a);
    EXPECT_EQ(chain(list), "bc");
    EXPECT_EQ(list->nCount, 2U);
    EXPECT_EQ(cursor(list), "b") << "the cursor was on the first node";
    advance(list, 1);
    EXPECT_EQ(qvsListGetItemFirstAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, b);
    EXPECT_EQ(cursor(list), "c") << "the cursor was elsewhere";
    EXPECT_EQ(qvsListGetItemFirstAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, c);
    EXPECT_EQ(cursor(list), "-");
    EXPECT_EQ(list->nCount, 0U);
    EXPECT_EQ(qvsListGetItemFirstAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(list->nCount, 0U);
    expectAppends(list);
    drop(list);

    item = &stranger;
    EXPECT_EQ(qvsListGetItemFirstAndDeleteNode(nullptr, &item), 4108U);
    EXPECT_EQ(item, nullptr);
}

TEST_F(List, HandsTheItemUnderTheCursorOver)
{
    for (const auto &[steps, item, rest, next] :
         std::initializer_list<std::tuple<int, char *, const char *, const char *>>{
             {0, a, "bcd", "b"}, {1, b, "acd", "c"}, {2, c, "abd", "d"}, {3, d, "abc", "-"}}) {
        qvsList *list = listOf({a, b, c, d});
        advance(list, steps);
        void *given = nullptr;
        EXPECT_EQ(qvsListGetItemNextAndDeleteNode(list, &given), QVS_OK);
        EXPECT_EQ(given, item);
        EXPECT_EQ(chain(list), rest);
        EXPECT_EQ(cursor(list), next);
        EXPECT_EQ(list->nCount, 3U);
        expectAppends(list);
        drop(list);
    }
}

TEST_F(List, HandsNothingOverWithoutACursor)
{
    void *item = &stranger;
    qvsList *list = listOf({a});
    EXPECT_EQ(qvsListGetItemNextAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(chain(list), "a");
    EXPECT_EQ(list->nCount, 1U);
    drop(list);

    qvsListNode node = {a, nullptr};
    qvsList *empty = listOf({});
    empty->ptCursor = &node;
    item = &stranger;
    EXPECT_EQ(qvsListGetItemNextAndDeleteNode(empty, &item), QVS_OK);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(empty->ptCursor, &node);
    drop(empty);

    item = &stranger;
    EXPECT_EQ(qvsListGetItemNextAndDeleteNode(nullptr, &item), 4108U);
    EXPECT_EQ(item, &stranger);
}

TEST_F(List, GivesTheItemAtAnIndex)
{
    qvsList *list = listOf({a, b, c});
    advance(list, 1);
    void *item = nullptr;
    for (uint32_t i = 0; i < 3; ++i) {
        EXPECT_EQ(qvsListGetItemIndex(list, &item, i), QVS_OK);
        EXPECT_EQ(item, letters + i);
    }
    EXPECT_EQ(cursor(list), "b");
    for (const uint32_t index : {3U, 0xFFFFFFFFU}) {
        item = &stranger;
        EXPECT_EQ(qvsListGetItemIndex(list, &item, index), 4110U);
        EXPECT_EQ(item, nullptr);
    }
    drop(list);

    item = &stranger;
    EXPECT_EQ(qvsListGetItemIndex(nullptr, &item, 0), 4108U);
    EXPECT_EQ(item, &stranger);
}

TEST_F(List, NodesBeyondTheCountHaveNoIndex)
{
    qvsList *list = listOf({a, b});
    list->nCount = 1;
    void *item = &stranger;
    EXPECT_EQ(qvsListGetItemIndex(list, &item, 1), 4110U);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(qvsListGetItemIndex(list, &item, 0), QVS_OK);
    EXPECT_EQ(item, a);
    drop(list);
}

TEST_F(List, HandsTheItemAtIndex0Over)
{
    qvsList *list = listOf({a, b});
    advance(list, 0);
    void *item = nullptr;
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 0), QVS_OK);
    EXPECT_EQ(item, a);
    EXPECT_EQ(chain(list), "b");
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(cursor(list), "b") << "the cursor was on the node";
    expectAppends(list);
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 0), QVS_OK);
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 0), QVS_OK);
    EXPECT_EQ(list->ptFirst, nullptr);
    expectAppends(list);
    drop(list);
}

TEST_F(List, DoesNotHandOverWhatItDoesNotHave)
{
    qvsList *list = listOf({a});
    void *item = &stranger;
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 1), 4110U);
    EXPECT_EQ(item, nullptr);
    EXPECT_EQ(chain(list), "a");
    EXPECT_EQ(list->nCount, 1U);
    drop(list);
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(nullptr, &item, 0), 4108U);
}

TEST_F(List, AnIndexBehindAChainShorterThanTheCountIsNotFound)
{
    qvsList *list = listOf({a, b});
    list->nCount = 5;
    for (uint32_t i = 2; i < 5; ++i) {
        void *item = &stranger;
        EXPECT_EQ(qvsListGetItemIndex(list, &item, i), 4110U);
        EXPECT_EQ(item, nullptr);
        item = &stranger;
        EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, i), 4110U);
        EXPECT_EQ(item, nullptr);
    }
    EXPECT_EQ(chain(list), "ab");
    drop(list);
}

TEST_F(List, CountsItsNodes)
{
    qvsList *list = listOf({});
    EXPECT_EQ(qvsListGetCount(list), 0U);
    EXPECT_EQ(qvsListAddNodeLast(list, a), QVS_OK);
    EXPECT_EQ(qvsListAddNodeFirst(list, b), QVS_OK);
    EXPECT_EQ(qvsListGetCount(list), 2U);
    drop(list);
}

TEST(Kept, list_first_cursor)
{
    const blocks::BlockCheck check;
    qvsList *list = listOf({a, b});
    advance(list, 0);
    const auto before = reinterpret_cast<uintptr_t>(list->ptCursor);
    EXPECT_EQ(qvsListDeleteNodeFirst(list, QVS_LIST_KEEP_ITEMS), QVS_OK);
    EXPECT_EQ(reinterpret_cast<uintptr_t>(list->ptCursor), before);
    drop(list);
}

TEST(Kept, list_stray_cursor)
{
    const blocks::BlockCheck check;
    qvsList *list = listOf({a, b});
    qvsList *other = listOf({c, d});
    const std::vector<qvsListNode *> lost = {list->ptFirst, list->ptFirst->ptNext};
    list->ptCursor = other->ptFirst;
    void *item = nullptr;
    EXPECT_EQ(qvsListGetItemNextAndDeleteNode(list, &item), QVS_OK);
    EXPECT_EQ(item, c);
    EXPECT_EQ(chain(list), "d");
    EXPECT_EQ(cursor(list), "d");
    EXPECT_EQ(list->nCount, 1U);
    expectAppends(list);
    for (qvsListNode *node : lost) {
        qvsMemFree_debug(node);
    }
    drop(list);
    qvsMemFree_debug(other);
}

TEST(Kept, list_index_delete)
{
    const blocks::BlockCheck check;
    qvsList *list = listOf({a, b, c, d});
    const std::vector<qvsListNode *> lost = {list->ptFirst, list->ptFirst->ptNext};
    advance(list, 0);
    void *item = nullptr;
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 2), QVS_OK);
    EXPECT_EQ(item, c);
    EXPECT_EQ(chain(list), "d");
    EXPECT_EQ(list->nCount, 3U);
    EXPECT_EQ(cursor(list), "a") << "a cursor elsewhere stays";
    list->ptCursor = nullptr;
    for (qvsListNode *node : lost) {
        qvsMemFree_debug(node); // they were left allocated
    }
    expectAppends(list);
    qvsListNode *before = list->ptFirst;
    EXPECT_EQ(qvsListGetItemIndexAndDeleteNode(list, &item, 1), QVS_OK);
    EXPECT_EQ(item, letters + 7);
    EXPECT_EQ(list->ptFirst, nullptr);
    qvsMemFree_debug(before);
    expectAppends(list);
    drop(list);
}
