// Records of the document tree and of the context by the numbers of their fields, which are all one
// pointer wide, and the order in which their blocks are released.
#ifndef RECORDS_H
#define RECORDS_H

#include "blocks.h"

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"
#include "qvslist.h"
#include "qvsmemory.h"
#include "qvsstring.h"

#include <gtest/gtest.h>

#include <pthread.h>

#include <cstring>
#include <functional>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace records {

using Numbers = std::vector<size_t>; // of fields, from 1
using Strings = std::vector<std::string>;

// range: the numbers from `first` to `last`.
inline Numbers range(size_t first, size_t last)
{
    Numbers out;
    for (size_t number = first; number <= last; ++number) {
        out.push_back(number);
    }
    return out;
}

inline Numbers join(const std::vector<Numbers> &parts)
{
    Numbers out;
    for (const Numbers &part : parts) {
        out.insert(out.end(), part.begin(), part.end());
    }
    return out;
}

// The field with a number, counted from 1, of any record.
inline void *get(const void *record, size_t field)
{
    void *value = nullptr;
    memcpy(&value, static_cast<const char *>(record) + (field - 1) * sizeof value, sizeof value);
    return value;
}

inline void set(void *record, size_t field, const void *value)
{
    memcpy(static_cast<char *>(record) + (field - 1) * sizeof value, &value, sizeof value);
}

// ---- Blocks of the library's heap, which a release of the library or qvsMemFree_debug lets go

inline char *text(const std::string &value)
{
    return qvsStrdup_debug(value.c_str(), "test", __LINE__);
}

// A record of so many fields, all null.
inline void *blank(size_t fields)
{
    return qvsMemAllocSetZero_debug(static_cast<uint32_t>(fields * sizeof(void *)), "test",
                                    __LINE__);
}

template <class Record>
Record *blank()
{
    return static_cast<Record *>(blank(sizeof(Record) / sizeof(void *)));
}

inline qvsList *emptyList()
{
    qvsList *list = nullptr;
    EXPECT_EQ(qvsListCreate(&list, nullptr), QVS_OK);
    return list;
}

inline void add(qvsList **list, void *item)
{
    if (!*list) {
        *list = emptyList();
    }
    EXPECT_EQ(qvsListAddNodeLast(*list, item), QVS_OK);
}

// For long lists: to add at the end is a walk each time.
inline void addFirst(qvsList **list, void *item)
{
    if (!*list) {
        *list = emptyList();
    }
    EXPECT_EQ(qvsListAddNodeFirst(*list, item), QVS_OK);
}

// The texts in their order.
inline qvsList *list(const Strings &texts)
{
    qvsList *made = emptyList();
    for (auto value = texts.rbegin(); value != texts.rend(); ++value) {
        addFirst(&made, text(*value));
    }
    return made;
}

// A characteristic with a record in the slot of that number.
inline qvsWapCharacter *node(size_t slot, void *record)
{
    qvsWapCharacter *made = blank<qvsWapCharacter>();
    set(made, slot, record);
    return made;
}

// Releases blocks that the library leaves.
inline void release(const std::vector<void *> &left)
{
    for (void *block : left) {
        qvsMemFree_debug(block);
    }
}

// Lets everything go that was allocated while it lives.
class Sweep {
public:
    Sweep() : before(blocks::all()) {}
    Sweep(const Sweep &) = delete;
    Sweep &operator=(const Sweep &) = delete;
    ~Sweep()
    {
        for (void *block : blocks::all()) {
            if (before.count(block) == 0) {
                qvsMemFree_debug(block);
            }
        }
    }

private:
    std::set<void *> before;
};

// ---- What is released, in its order

// Notes the blocks that are released while it lives.
class Releases {
public:
    Releases()
    {
        blocks::onRelease = [this](const void *block) { order.push_back(block); };
    }
    Releases(const Releases &) = delete;
    Releases &operator=(const Releases &) = delete;
    ~Releases() { blocks::onRelease = nullptr; }

    std::vector<const void *> order;
};

// Blocks under names, so that a wrong order can be read.
class Names {
public:
    template <class Block>
    Block *operator()(const std::string &name, Block *block)
    {
        names[block] = name;
        return block;
    }

    // The blocks of a list of texts, in their order of release: texts, nodes, then the list.
    Strings addList(const std::string &name, const qvsList *list)
    {
        Strings order;
        for (qvsListNode *node = list->ptFirst; node; node = node->ptNext) {
            const std::string item = name + "/" + std::to_string(order.size() / 2 + 1);
            (*this)(item, node->pItem);
            (*this)(item + " node", node);
            order.insert(order.end(), {item, item + " node"});
        }
        (*this)(name, list);
        order.push_back(name);
        return order;
    }

    Strings of(const std::vector<const void *> &blocks) const
    {
        Strings out;
        for (const void *block : blocks) {
            const auto known = names.find(block);
            out.push_back(known == names.end() ? "?" : known->second);
        }
        return out;
    }

private:
    std::map<const void *, std::string> names;
};

// ---- A thread with little stack

#ifdef __aarch64__
// The least that the C library takes there.
inline constexpr size_t kSmallStack = 128 * 1024;
#else
inline constexpr size_t kSmallStack = 64 * 1024;
#endif

inline void onSmallStack(const std::function<void()> &work)
{
    pthread_attr_t attributes;
    ASSERT_EQ(pthread_attr_init(&attributes), 0);
    ASSERT_EQ(pthread_attr_setstacksize(&attributes, kSmallStack), 0);
    pthread_t thread;
    ASSERT_EQ(pthread_create(
                  &thread, &attributes,
                  [](void *argument) -> void * {
                      (*static_cast<const std::function<void()> *>(argument))();
                      return nullptr;
                  },
                  const_cast<std::function<void()> *>(&work)),
              0);
    EXPECT_EQ(pthread_join(thread, nullptr), 0);
    EXPECT_EQ(pthread_attr_destroy(&attributes), 0);
}

} // namespace records

#endif
