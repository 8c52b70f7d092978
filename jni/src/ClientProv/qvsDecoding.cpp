// The mark of a decoder that state stands behind.
#include "qvsDecoding.h"

using namespace qvs;

DecodeState *qvs::stateOf(const qvsWbxmlDecoder *decoder)
{
    if (!decoder || decoder->nMark != markOf(decoder)) {
        return nullptr;
    }
    auto *record = const_cast<qvsWbxmlDecoder *>(decoder);
    return &reinterpret_cast<Decoding *>(record)->state;
}

bool qvs::textLimitPassed(const qvsWbxmlDecoder *decoder)
{
    const DecodeState *state = stateOf(decoder);
    return state && state->textLimit;
}

// Apart from its callers, which let go of the record next: there a compiler would leave it out.
void qvs::unmark(qvsWbxmlDecoder *decoder)
{
    decoder->nMark = 0;
}
