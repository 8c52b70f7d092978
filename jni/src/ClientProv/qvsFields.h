// The fields of plain records by number. Every field of a record of the tree and of the context is
// one pointer wide, so that one loop serves all kinds of record and the rest is tables of fields.
#ifndef QVSFIELDS_H
#define QVSFIELDS_H

#include "qvslist.h"
#include "qvsmemory.h"

#include <stddef.h>
#include <stdint.h>
#include <string.h>

namespace [[gnu::visibility("hidden")]] qvs {

// The number of a field, counted from 0, by the type of what it holds.
struct TextField {
    uint8_t number;
};
struct ListField {
    uint8_t number;
    uint8_t place; // 0 for the last field of the record
};
struct RecordField {
    uint8_t number;
};

constexpr uint8_t kNoField = 0xFF;

// The lists of a record are its last fields. Their places are counted from the end; a list further
// from it does not compile.
constexpr uint8_t kMostLists = 6;
constexpr uint8_t kListPlaces[kMostLists] = {0, 1, 2, 3, 4, 5};

template <class Record>
constexpr uint8_t kFieldsOf = sizeof(Record) / sizeof(void *);

// The number of ptNext, the last field of the records that form chains; kNoField for others.
template <class Record>
inline constexpr uint8_t kLinkOf = kNoField;
template <class Record>
requires(sizeof(Record::ptNext) > 0) inline constexpr uint8_t kLinkOf<Record> = kFieldsOf<Record> -
                                                                                1;

// The number of ptCharacterList, the last field of the records in which characteristics nest;
// kNoField for others.
template <class Record>
inline constexpr uint8_t kChildListOf = kNoField;
template <class Record>
requires(sizeof(Record::ptCharacterList) >
         0) inline constexpr uint8_t kChildListOf<Record> = kFieldsOf<Record> - 1;

// `offset` is where the member lies; the member itself is here for its type.
template <class Record>
consteval TextField fieldAt(char *Record::*, size_t offset)
{
    return {static_cast<uint8_t>(offset / sizeof(void *))};
}

template <class Record>
consteval ListField fieldAt(qvsList *Record::*, size_t offset)
{
    const auto number = static_cast<uint8_t>(offset / sizeof(void *));
    return {number, kListPlaces[kFieldsOf<Record> - 1 - number]};
}

template <class Record, class Pointee>
consteval RecordField fieldAt(Pointee *Record::*, size_t offset)
{
    return {static_cast<uint8_t>(offset / sizeof(void *))};
}

#define QVS_FIELD(Record, name) qvs::fieldAt(&Record::name, offsetof(Record, name))

inline char **textAt(void *record, uint8_t number)
{
    return static_cast<char **>(record) + number;
}

inline qvsList **listAt(void *record, uint8_t number)
{
    return static_cast<qvsList **>(record) + number;
}

// A pointer of any type, read and written as the bytes that it is.
inline void *pointerAt(const void *record, uint8_t number)
{
    void *pointer = nullptr;
    memcpy(&pointer, static_cast<const char *>(record) + number * sizeof pointer, sizeof pointer);
    return pointer;
}

inline void setPointer(void *record, uint8_t number, const void *pointer)
{
    memcpy(static_cast<char *>(record) + number * sizeof pointer, &pointer, sizeof pointer);
}

// A table of rows that differ in number.
template <class Row>
struct Rows {
    consteval Rows() = default;
    template <size_t N>
    consteval Rows(const Row (&rows)[N]) : first(rows), count(N)
    {
    }

    const Row *begin() const { return first; }
    const Row *end() const { return first + count; }

    const Row *first = nullptr;
    uint8_t count = 0;
};

// Fields that a release leaves alone on purpose. Counted, so that no field is merely forgotten.
template <size_t N>
struct Left {
};

template <class Record, class... Fields>
consteval Left<sizeof...(Fields)> leave(Fields Record::*...)
{
    return {};
}

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
