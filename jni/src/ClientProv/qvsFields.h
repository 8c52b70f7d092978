// The fields of plain records as rows of tables, so that what a release lets go and what it leaves
// can be added up while compiling.
#ifndef QVSFIELDS_H
#define QVSFIELDS_H

#include "qvsmemory.h"

#include <stddef.h>

namespace [[gnu::visibility("hidden")]] qvs {

// Fields that a release leaves alone on purpose. Counted, so that no field is merely forgotten.
template <size_t N>
struct Left {
};

constexpr Left<0> kNothingLeft;

template <class Record, class... Fields>
constexpr Left<sizeof...(Fields)> leave(Fields Record::*...)
{
    return {};
}

// Every field of a record is one pointer wide.
template <class Record>
constexpr size_t kFieldsOf = sizeof(Record) / sizeof(void *);

// Releases the text in a field, if there is one, and clears the field.
inline void releaseText(char **field)
{
    if (*field) {
        qvsMemFree_debug(*field);
        *field = nullptr;
    }
}

} // namespace qvs

#endif
