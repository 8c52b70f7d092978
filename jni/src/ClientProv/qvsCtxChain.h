// Chains of the provisioning context while they are built.
#ifndef QVSCTXCHAIN_H
#define QVSCTXCHAIN_H

#include "qvslist.h"
#include "qvsmemory.h"
#include "qvsresult.h"

#include <stdint.h>

namespace [[gnu::visibility("hidden")]] qvs {

constexpr char kCtxModule[] = "jni/src/ClientProv/qvsClientProvCtx";

// A zero-filled record of the context, null without memory.
template <class Record>
Record *newCtxRecord(int line = __builtin_LINE())
{
    constexpr uint32_t kSpare = 1; // kept[context-spare-byte]: one byte more than the record.
    return newRecord<Record>(kCtxModule, kSpare, line);
}

// The end of a chain that is appended to; remembered, so that building costs one step per record.
template <class Node>
struct ChainEnd {
    // Goes on behind what the chain already holds.
    explicit ChainEnd(Node **head) : link(head)
    {
        while (*link) {
            link = &(*link)->ptNext;
        }
    }

    // kept[context-null-linked]: a builder that answered null has added nothing, and the chain goes
    // on behind it.
    void append(Node *node)
    {
        if (node) {
            *link = node;
            link = &node->ptNext;
        }
    }

    Node **link; // the null pointer that the next record is put into
};

// Puts the cursor on the first item of a list and reads it; null for an empty list.
inline qvsResult firstItem(qvsList *list, void **item)
{
    (void)qvsListSetCurNodeFirst(list); // refuses what the read refuses
    return qvsListGetItemNext(list, item);
}

} // namespace qvs

#endif
