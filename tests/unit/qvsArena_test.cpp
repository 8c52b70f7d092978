// Pieces: blocks of their own, or parts of an arena that is released as a whole.
#include "blocks.h"
#include "memcheck.h"
#include "qvsArena.h"
#include "qvslist.h"
#include "qvsmemory.h"

#include <algorithm>
#include <cstring>
#include <set>
#include <string>
#include <vector>

namespace {

constexpr char kModule[] = "test";
constexpr uint32_t kSize = 24;

class Arena : public blocks::BlockTest {
protected:
    Arena()
    {
        std::memset(room, 0xEE, sizeof room);
        arena.next = room;
        arena.end = room + sizeof room;
    }

    ~Arena() override { qvs::releaseArena(&arena); }

    char *piece(uint32_t size = kSize)
    {
        return static_cast<char *>(qvs::newPiece(&arena, size, kModule));
    }

    [[nodiscard]] bool inRoom(const char *piece) const
    {
        return piece >= room && piece + kSize <= room + sizeof room;
    }

    alignas(void *) char room[2 * kSize];
    qvsArena arena = {};
};

class Piece : public blocks::BlockTest {};

bool isClear(const char *piece, uint32_t size)
{
    return std::all_of(piece, piece + size, [](char byte) { return byte == 0; });
}

TEST_F(Arena, GivesItsRoomAwayBeforeItAsksForABlock)
{
    const std::size_t before = blocks::live();
    EXPECT_EQ(piece(), room);
    EXPECT_EQ(piece(), room + kSize);
    EXPECT_EQ(blocks::live(), before);
    EXPECT_FALSE(inRoom(piece()));
    EXPECT_EQ(blocks::live(), before + 1);
}

TEST_F(Arena, GivesPiecesThatAreClearAndApart)
{
    std::vector<char *> pieces;
    for (int i = 0; i < 500; ++i) {
        char *made = piece();
        ASSERT_NE(made, nullptr);
        ASSERT_TRUE(isClear(made, kSize)) << i;
        ASSERT_EQ(reinterpret_cast<std::uintptr_t>(made) % alignof(void *), 0U);
        std::memset(made, i, kSize);
        pieces.push_back(made);
    }
    for (int i = 0; i < 500; ++i) {
        EXPECT_EQ(std::count(pieces[i], pieces[i] + kSize, static_cast<char>(i)), kSize) << i;
    }
}

TEST_F(Arena, TakesABlockForManyPieces)
{
    const std::size_t before = blocks::live();
    for (int i = 0; i < 400; ++i) {
        piece();
    }
    EXPECT_LT(blocks::live() - before, 400U * kSize / 900 + 2);
    qvs::releaseArena(&arena);
    EXPECT_EQ(blocks::live(), before);
}

TEST_F(Arena, AsksForItsBlocksUnderItsSource)
{
    piece();
    piece();
    const auto files = memcheck::filesOf([&] { piece(); });
    EXPECT_EQ(files, std::vector<std::string>{"jni/src/ClientProv/qvsArena"});
}

TEST_F(Arena, AsksForBlocksThatTheCLibraryTakesForSmall)
{
    piece();
    piece();
    blocks::startCounting();
    piece();
    EXPECT_EQ(blocks::allocations(), 1U);
    EXPECT_EQ(blocks::allocated(), 960U);
}

TEST_F(Arena, AnswersNullWithoutMemoryAndGoesOnWithIt)
{
    piece();
    piece();
    blocks::failAt = 0;
    EXPECT_EQ(piece(), nullptr);
    const char *next = piece();
    ASSERT_NE(next, nullptr);
    EXPECT_EQ(piece(), next + kSize);
}

TEST_F(Arena, IsEmptyWhenItIsReleasedAgain)
{
    piece();
    piece();
    piece();
    qvs::releaseArena(&arena);
    EXPECT_EQ(arena.blocks, nullptr);
    qvs::releaseArena(&arena);
}

TEST_F(Arena, HoldsListsWhoseItemsAreBlocks)
{
    qvsList *list = nullptr;
    qvsListNode *last = nullptr;
    for (const char *text : {"a", "b", "c"}) {
        char *copy = qvsStrdup_debug(text, kModule, 1);
        ASSERT_EQ(qvs::addItem(&arena, &list, copy, &last), QVS_OK);
    }
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->nCount, 3U);
    EXPECT_STREQ(static_cast<char *>(list->ptFirst->ptNext->ptNext->pItem), "c");
    qvs::releaseTexts(&arena, list);
}

TEST_F(Arena, AppendsBehindTheNodeThatIsRememberedOrBehindTheLastOne)
{
    char items[] = "abcd";
    qvsList *list = nullptr;
    qvsListNode *last = nullptr;
    const auto add = [&](size_t i) {
        ASSERT_EQ(qvs::addItem(&arena, &list, items + i, &last), QVS_OK);
        EXPECT_EQ(last->pItem, items + i);
        EXPECT_EQ(last->ptNext, nullptr);
    };
    add(0);
    add(1);
    last = nullptr; // a list that somebody else has begun
    add(2);
    EXPECT_EQ(list->ptFirst->ptNext->ptNext, last);
    // Without a walk: what is remembered is not looked for.
    qvsListNode *const first = list->ptFirst;
    list->ptFirst = nullptr;
    add(3);
    EXPECT_EQ(first->ptNext->ptNext->ptNext, last);
}

TEST_F(Arena, ForgetsTheLastNodeOfAListThatIsGone)
{
    char item = 0;
    qvsListNode stale = {};
    qvsList *list = nullptr;
    qvsListNode *last = &stale;
    ASSERT_EQ(qvs::addItem(&arena, &list, &item, &last), QVS_OK);
    EXPECT_EQ(list->ptFirst, last);
    EXPECT_EQ(stale.ptNext, nullptr);
}

TEST_F(Arena, MakesAnEmptyListOfNoItemAndAddsNoneToIt)
{
    qvsList *list = nullptr;
    qvsListNode *last = nullptr;
    ASSERT_EQ(qvs::addItem(&arena, &list, nullptr, &last), QVS_OK);
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(qvs::addItem(&arena, &list, nullptr, &last), QVS_OK);
    EXPECT_EQ(list->ptFirst, nullptr);
}

TEST_F(Arena, LeavesAListAsItWasWithoutMemory)
{
    char item = 0;
    qvsList *list = nullptr;
    qvsListNode *last = nullptr;
    piece();
    piece();
    blocks::failAt = 0;
    EXPECT_EQ(qvs::addItem(&arena, &list, &item, &last), QVS_ERROR_LIST_NO_MEMORY);
    EXPECT_EQ(list, nullptr);

    ASSERT_EQ(qvs::addItem(&arena, &list, &item, &last), QVS_OK);
    while (arena.next + sizeof(qvsListNode) <= arena.end) {
        piece(sizeof(qvsListNode));
    }
    blocks::failAt = 0;
    EXPECT_EQ(qvs::addItem(&arena, &list, &item, &last), QVS_ERROR_LIST_NO_MEMORY);
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->nCount, 1U);
    EXPECT_EQ(list->ptFirst->ptNext, nullptr);
}

TEST_F(Arena, MakesNoListWithoutMemoryForItsFirstNode)
{
    char item = 0;
    qvsList *list = nullptr;
    qvsListNode *last = nullptr;
    arena.end = room + sizeof(qvsList);
    blocks::failAt = 0;
    EXPECT_EQ(qvs::addItem(&arena, &list, &item, &last), QVS_ERROR_LIST_NO_MEMORY);
    EXPECT_EQ(list, nullptr);
}

TEST_F(Piece, IsABlockOfItsOwnWithoutAnArena)
{
    void *made = qvs::newPiece(nullptr, kSize, kModule);
    ASSERT_NE(made, nullptr);
    EXPECT_TRUE(isClear(static_cast<char *>(made), kSize));
    EXPECT_EQ(blocks::all().count(made), 1U);
    qvsMemFree_debug(made);
}

} // namespace
