// What the library remembers of a decode, and the layers of a decode that share it. It is a
// parameter: the record of a decoder is a host's to make, and holds the six fields that hosts know.
// Private, C++ only.
#ifndef QVSDECODING_H
#define QVSDECODING_H

#include "qvsClientProvWbxml.h"
#include "qvsFields.h"

#include <stddef.h>
#include <stdint.h>

struct qvsArena;

namespace [[gnu::visibility("hidden")]] qvs {

// A text that grows by joins, with what a join would otherwise have to find out again.
struct JoinedText {
    const char *text;  // the field's text while length and capacity are true of it
    uint32_t length;   // bytes before the terminator
    uint32_t capacity; // bytes of the block
};

// What is remembered of a record that the body reads.
struct OpenRecord {
    JoinedText joined;             // of an APPAUTH
    qvsListNode *last[kMostLists]; // tails of its lists, by their places
};

// The state of one decode. As it is here it serves a single step that a host calls: its texts are
// not limited, it walks to the tail of a list, and all it makes is a block.
struct DecodeState {
    size_t textLeft = SIZE_MAX; // bytes of text that may still be read or appended
    bool textLimit = false;     // the texts of the message passed their limit
    OpenRecord *open = nullptr; // the record being read; whoever reads parms gives one
    qvsArena *arena = nullptr;  // of nodes and lists
};

// The state of a whole decode, of which a decoder's data gives the limit.
DecodeState wholeDecode(const qvsWbxmlDecoder *decoder, qvsArena *arena = nullptr);

// Counts text that is read or appended. False once there is too much of it.
inline bool countText(DecodeState *state, uint64_t count)
{
    if (count > state->textLeft) [[unlikely]] {
        state->textLimit = true;
        state->textLeft = 0;
        return false;
    }
    state->textLeft -= static_cast<size_t>(count);
    return true;
}

// Behind the exported functions of the same name.
qvsResult decode(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapDoc **document);
qvsResult decodeBody(qvsWbxmlDecoder *decoder, DecodeState *state, qvsWapDoc **document);
qvsResult decodeCharacters(qvsWbxmlDecoder *decoder, DecodeState *state, qvsList **list);

} // namespace qvs

#endif
