// The tree of a session: nobody else sees it, and it goes as a whole, so that its nodes and lists
// are pieces of a few blocks. Only records and texts are blocks of their own: records may stay
// allocated by design, and the context takes the texts over. In every other tree each node and list
// is a block too. Private, C++ only.
#ifndef QVSTREE_H
#define QVSTREE_H

#include "qvsClientProvWbxml.h"

#include <stdint.h>

// Room for pieces that are released together. Where a function takes one, null stands for pieces
// that are blocks of their own.
struct qvsArena {
    char *next; // the free room
    char *end;
    void *blocks = nullptr; // the last block, which begins with the address of the one before it
};

namespace [[gnu::visibility("hidden")]] qvs {

// The largest piece that an arena gives, in bytes.
constexpr uint32_t kLargestPiece = 512;

// A cleared piece of `size` bytes: a multiple of the size of a pointer, kLargestPiece at most. One
// that is a block of its own is tracked under the module and the line that asked for it. Null
// without memory.
void *newPiece(qvsArena *arena, uint32_t size, const char *module, int line = __builtin_LINE());

// Releases all blocks of an arena, and so its pieces.
void releaseArena(qvsArena *arena);

// Adds `item` behind the last one of `*list`, which is made when there is none. A null item adds
// nothing to a list. `*last` is the list's last node, which whoever builds it remembers; null when
// it is not known. QVS_ERROR_LIST_NO_MEMORY, with a list that was not there still null.
QVS_NODISCARD qvsResult addItem(qvsArena *arena, qvsList **list, void *item, qvsListNode **last);

// Releases a list of texts.
void releaseTexts(qvsArena *arena, qvsList *list);

// Releases a node, a list of nodes, and a document, with all that is nested in them; null is
// ignored.
void releaseNode(qvsArena *arena, qvsWapCharacter *node);
void releaseNodes(qvsArena *arena, qvsList *list);
void releaseDocument(qvsArena *arena, qvsWapDoc *document);

} // namespace qvs

#endif
