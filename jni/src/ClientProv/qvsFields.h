// The fields of plain records. Every field of a record of the tree and of the context is one
// pointer wide, so that one loop serves all kinds of record: its rows are numbers of fields. They
// are made here, of the record itself or of its members, so that a row of another record does not
// compile.
#ifndef QVSFIELDS_H
#define QVSFIELDS_H

#include "qvslist.h"
#include "qvsmemory.h"

#include <stddef.h>
#include <stdint.h>
#include <string.h>

struct qvsCtxStrNode;

namespace [[gnu::visibility("hidden")]] qvs {

// What is made while compiling does not compile where this is given false: what it calls then can
// only be called when it runs.
void demandNotMet();
consteval void demand(bool condition)
{
    if (!condition) {
        demandNotMet();
    }
}

template <class Record>
constexpr uint8_t kFieldsOf = sizeof(Record) / sizeof(void *);

constexpr uint8_t kNoField = 0xFF;

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

// The fields that a table has rows for: all but the two above.
template <class Record>
constexpr uint8_t kRowsOf = kFieldsOf<Record> -
                            (kLinkOf<Record> == kNoField && kChildListOf<Record> == kNoField ? 0
                                                                                             : 1);

// ---- What a record says itself: the numbers of its fields, counted from 0, and their types

// Initialises the n-th field of a record with a pointer that tells n, and its row by n and its
// type.
template <class Row>
struct Mark {
    template <class Pointee>
    constexpr operator Pointee *() const;

    uint8_t number;
    Row *row; // null for none
};

template <class Pointee>
inline constexpr Pointee kMarks[64] = {};

template <class Row>
template <class Pointee>
constexpr Mark<Row>::operator Pointee *() const
{
    if (row) {
        *row = Row(number, static_cast<Pointee *>(nullptr));
    }
    return const_cast<Pointee *>(kMarks<Pointee> + number);
}

// A record with a mark in each field. `rows` is one for each field, or null.
template <class Record, class Row, class... Marks>
consteval Record marked(Row *rows, Marks... marks)
{
    constexpr uint8_t kNumber = sizeof...(marks);
    if constexpr (kNumber < kFieldsOf<Record>) {
        Row *row = rows ? rows + kNumber : nullptr;
        return marked<Record>(rows, marks..., Mark<Row>{kNumber, row});
    } else {
// The union in qvsCtxStrNode is one field, without braces of its own.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wmissing-braces"
        return Record{marks...};
#pragma GCC diagnostic pop
    }
}

struct NoRow {
    constexpr NoRow(uint8_t /*number*/, const void * /*type*/) {}
};

template <class Record>
inline constexpr Record kMarked = marked<Record, NoRow>(nullptr);

template <class Record, class Pointee>
constexpr uint8_t numberOf(Pointee *Record::*field)
{
    return static_cast<uint8_t>(kMarked<Record>.*field - kMarks<Pointee>);
}

constexpr uint8_t kMostLists = 6;

// A list of texts of a record. The lists are its last fields; their places are counted from the
// end, where the one of what nests is.
template <class Record>
struct ListOf {
    consteval ListOf(qvsList *Record::*list)
        : field(numberOf(list)), place(static_cast<uint8_t>(kFieldsOf<Record> - 1 - field))
    {
        demand(place < kMostLists && field != kChildListOf<Record>);
    }

    uint8_t field;
    uint8_t place;
};

// ---- Tables

// Rows about fields of one Record. What is made of a table has the rows in another order, one less,
// or one twice.
template <class Record, class Row, size_t N>
struct Table {
    // The row of a field; a field without one does not compile.
    template <class Pointee>
    constexpr size_t rowOf(Pointee *Record::*field) const
    {
        size_t row = 0;
        while (rows[row].field != numberOf(field)) {
            ++row;
        }
        return row;
    }

    template <class Pointee>
    constexpr Table<Record, Row, N - 1> without(Pointee *Record::*field) const
    {
        Table<Record, Row, N - 1> made;
        const size_t left = rowOf(field);
        for (size_t row = 0; row < N - 1; ++row) {
            made.rows[row] = rows[row < left ? row : row + 1];
        }
        return made;
    }

    template <class Pointee>
    constexpr Table<Record, Row, N + 1> with(const Row &added, Pointee *Record::*behind) const
    {
        Table<Record, Row, N + 1> made;
        const size_t place = rowOf(behind) + 1;
        for (size_t row = 0; row < N; ++row) {
            made.rows[row < place ? row : row + 1] = rows[row];
        }
        made.rows[place] = added;
        return made;
    }

    template <class Moved, class Pointee>
    constexpr Table moved(Moved *Record::*field, Pointee *Record::*behind) const
    {
        return without(field).with(rows[rowOf(field)], behind);
    }

    // Both rows stay where they are, each about the other field.
    template <class Pointee>
    constexpr Table crossed(Pointee *Record::*one, Pointee *Record::*other) const
    {
        Table made = *this;
        made.rows[rowOf(one)].field = numberOf(other);
        made.rows[rowOf(other)].field = numberOf(one);
        return made;
    }

    template <class Again, class Pointee>
    constexpr Table<Record, Row, N + 1> again(Again *Record::*field, Pointee *Record::*behind) const
    {
        return with(rows[rowOf(field)], behind);
    }

    Row rows[N];
};

template <class Row, size_t N>
consteval size_t countOf(const Row (&)[N])
{
    return N;
}

// The same when it runs: a table of rows that differ in number.
template <class Row>
struct Rows {
    constexpr Rows() = default;
    template <size_t N>
    constexpr Rows(const Row (&rows)[N]) : first(rows), count(N)
    {
    }

    const Row *begin() const { return first; }
    const Row *end() const { return first + count; }

    const Row *first = nullptr;
    uint8_t count = 0;
};

// The rows of a table about this record; one about another does not compile.
template <class Record, class Row, size_t N>
constexpr Rows<Row> rowsFor(const Table<Record, Row, N> &table)
{
    return table.rows;
}

// Fields of a record.
template <class Record>
struct FieldSet {
    bool has[kFieldsOf<Record>] = {};
    uint8_t count = 0;
};

template <class Record, class... Pointees>
consteval FieldSet<Record> setOf(Pointees *Record::*...fields)
{
    FieldSet<Record> set;
    ((set.has[numberOf(fields)] = true), ...);
    set.count = sizeof...(fields);
    return set;
}

// The rows of a table about these fields.
template <class Row, class Record, class... Pointees>
consteval Table<Record, Row, sizeof...(Pointees)> rowsOf(Pointees *Record::*...fields)
{
    return {{Row(numberOf(fields), static_cast<Pointees *>(nullptr))...}};
}

// A table of rows that are typed by their record.
template <class Typed, size_t N>
consteval Table<typename Typed::Of, typename Typed::Row, N> tableOf(const Typed (&typed)[N])
{
    Table<typename Typed::Of, typename Typed::Row, N> table;
    for (size_t row = 0; row < N; ++row) {
        table.rows[row] = typed[row].row;
    }
    return table;
}

// ---- What fields hold

enum class Holds : uint8_t { kText, kTexts, kRecord };

// A field and what it points at.
struct FieldRow {
    constexpr FieldRow() = default;
    constexpr FieldRow(uint8_t number, char *) : field(number), holds(Holds::kText) {}
    constexpr FieldRow(uint8_t number, qvsList *) : field(number), holds(Holds::kTexts) {}
    constexpr FieldRow(uint8_t number, qvsCtxStrNode *) : field(number), holds(Holds::kTexts) {}
    constexpr FieldRow(uint8_t number, void *) : field(number), holds(Holds::kRecord) {}

    uint8_t field = 0;
    Holds holds = Holds::kText;
};

template <class Record>
consteval Table<Record, FieldRow, kFieldsOf<Record>> fieldsOf()
{
    Table<Record, FieldRow, kFieldsOf<Record>> table;
    (void)marked<Record>(table.rows);
    return table;
}

// All fields of a record.
template <class Record>
inline constexpr auto kFields = fieldsOf<Record>();

// How many of them are texts: they are its first ones.
template <class Record>
consteval uint8_t textsOf()
{
    uint8_t texts = 0;
    while (texts < kFieldsOf<Record> && kFields<Record>.rows[texts].holds == Holds::kText) {
        ++texts;
    }
    return texts;
}

// ---- Fields by number

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

} // namespace qvs

#endif
