// What the library remembers of a decode. A host may make the record of a decoder itself, with
// nothing behind it; behind one that the library made stands the state of its decode. Private,
// C++ only.
#ifndef QVSDECODING_H
#define QVSDECODING_H

#include "qvsClientProvWbxml.h"

#include <stdint.h>

struct qvsArena;

namespace [[gnu::visibility("hidden")]] qvs {

// A text that grows by joins, with what a join would otherwise have to find out again.
struct JoinedText {
    const char *text;  // the field's text while length and capacity are true of it
    uint32_t length;   // bytes before the terminator
    uint32_t capacity; // bytes of the block
};

struct DecodeState {
    uint64_t textRead = 0;        // bytes of all texts read or appended so far
    uint32_t tableBlock = 0;      // bytes of the block at pStringTable that were read for it
    bool textLimit = false;       // the texts of the message passed their limit
    JoinedText *joined = nullptr; // of the APPAUTH being read by the body; null outside it
    qvsListNode **last = nullptr; // of the lists of the record being read by the body; null outside
    qvsArena *arena = nullptr;    // of nodes and lists; null: each is a block of its own
};

// The record that the library makes of a decoder.
struct Decoding {
    qvsWbxmlDecoder decoder;
    DecodeState state;
};

// The mark of a decoder that state stands behind. It is made of the address, so that a copy of the
// record is not taken for one, and never 0.
inline uint16_t markOf(const qvsWbxmlDecoder *decoder)
{
    return static_cast<uint16_t>(reinterpret_cast<uintptr_t>(decoder) >> 4U | 1U);
}

// The state behind a decoder; null for a null one and for one that a host made, whose single steps
// do without: their texts are not limited, and each adds to a list with a walk.
DecodeState *stateOf(const qvsWbxmlDecoder *decoder);

// Where nodes and lists come from.
inline qvsArena *arenaOf(const DecodeState *state)
{
    return state ? state->arena : nullptr;
}

// Whether the texts of the message passed their limit.
bool textLimitPassed(const qvsWbxmlDecoder *decoder);

// Takes the mark from a decoder whose memory goes.
void unmark(qvsWbxmlDecoder *decoder);

} // namespace qvs

#endif
