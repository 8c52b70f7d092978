// The PARM decoder of a characteristic as a test describes it by a type; the suites that hold what
// every such decoder does; bytes of parms, and records by their fields.
#ifndef PARMS_H
#define PARMS_H

#include "blocks.h"
#include "decoding.h"
#include "message.h"
#include "records.h"
#include "traces.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace parms {

using message::Bytes;
using message::join;
using records::Strings;

// ---- Bytes

// A value: VALUE and an inline string.
inline Bytes value(std::string_view content)
{
    return join({{0x06}, message::Value(std::string(content)).bytes});
}

// A value as opaque data, which anything may follow.
inline Bytes opaque(std::string_view content)
{
    return join({{0x06}, message::opaque(Bytes(content.begin(), content.end())).bytes});
}

// A parm as it is sent: attributes, no content.
inline Bytes parm(const Bytes &attributes)
{
    return join({{0x87}, attributes, {0x01}});
}

inline Bytes parm(uint8_t name, std::string_view content)
{
    return parm(join({{name}, value(content)}));
}

// A parm whose name is an inline string.
inline Bytes named(std::string_view name)
{
    return parm(join({{0x05}, message::Value(std::string(name)).bytes}));
}

inline Bytes named(std::string_view name, std::string_view content)
{
    return parm(join({{0x05}, message::Value(std::string(name)).bytes, value(content)}));
}

inline Bytes prefix(const Bytes &bytes, size_t count)
{
    return Bytes(bytes.begin(), bytes.begin() + static_cast<long>(count));
}

// ---- Traces

// A text in printf's format with one number.
inline std::string format(const char *pattern, unsigned number)
{
    char out[200];
    (void)snprintf(out, sizeof out, pattern, number);
    return out;
}

inline Strings lines(Strings texts)
{
    for (std::string &text : texts) {
        text += '\n';
    }
    return texts;
}

inline Strings operator+(Strings first, const Strings &second)
{
    first.insert(first.end(), second.begin(), second.end());
    return first;
}

// What the decoder called `name` traces of a token that it refuses.
inline Strings refusal(const std::string &name, uint8_t token)
{
    return lines({"Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT",
                  name + format("[%x]", static_cast<unsigned>(token))});
}

// ---- Records

// The fields that are not null of so many, by their numbers from 1.
inline records::Numbers fieldsSet(const void *record, size_t fields)
{
    records::Numbers out;
    for (const size_t field : records::range(1, fields)) {
        if (records::get(record, field)) {
            out.push_back(field);
        }
    }
    return out;
}

template <class Record>
records::Numbers fieldsSet(const Record *record)
{
    return fieldsSet(record, sizeof(Record) / sizeof(void *));
}

template <class Record, class Field>
size_t numberOf(const Record *record, Field Record::*field)
{
    const char *start = reinterpret_cast<const char *>(record);
    const char *place = reinterpret_cast<const char *>(&(record->*field));
    return static_cast<size_t>(place - start) / sizeof(void *) + 1;
}

inline std::string shown(const char *text)
{
    return text ? text : "(null)";
}

inline std::string shown(const Strings &items)
{
    std::string out;
    for (const std::string &item : items) {
        out += (out.empty() ? "" : ", ") + item;
    }
    return "[" + out + "]";
}

inline std::string shown(const qvsList *list)
{
    if (!list) {
        return "(null)";
    }
    Strings items;
    for (const qvsListNode *node = list->ptFirst; node; node = node->ptNext) {
        items.emplace_back(static_cast<const char *>(node->pItem));
    }
    EXPECT_EQ(list->nCount, items.size());
    return shown(items);
}

// A parameter whose name is a token, and the field that it fills.
template <class R>
struct Row {
    Row(uint8_t t, const char *n, char *R::*f) : token(t), name(n), text(f) {}
    Row(uint8_t t, const char *n, qvsList *R::*f) : token(t), name(n), list(f) {}

    uint8_t token;
    const char *name;
    char *R::*text = nullptr;
    qvsList *R::*list = nullptr;
};

// A parameter whose name is a text, and the field that it fills.
template <class R>
struct NamedRow {
    const char *name;
    char *R::*text;
};

// What most decoders have in common; one that differs hides it by a member of its own.
template <class R, qvsResult (*Decode)(qvsWbxmlDecoder *, R *), qvsResult (*Release)(R *) = nullptr>
struct Usual {
    using Record = R;

    static qvsResult decode(qvsWbxmlDecoder *decoder, R *record) { return Decode(decoder, record); }
    static void release(R *record) { EXPECT_EQ(Release(record), 1U); }

    // Whether a token behind a page switch is read as it stands.
    static constexpr bool kFresh = false;

    // Tokens that mean something, but name no parameter by themselves.
    static bool hasOtherMeaning(uint8_t) { return false; }

    // Whether the parm goes on when this parameter cannot be read.
    static bool goesOn(uint8_t) { return false; }

    // What the field holds when the parm had no value.
    static const char *withoutValue(uint8_t) { return nullptr; }
};

// A record as the body makes it, zero-filled; released by the library at the end of the scope.
template <class D>
class Held {
public:
    Held() = default;
    Held(const Held &) = delete;
    Held &operator=(const Held &) = delete;
    ~Held() { D::release(record); }

    operator typename D::Record *() const { return record; }
    typename D::Record *operator->() const { return record; }
    typename D::Record *get() const { return record; }

private:
    typename D::Record *record = records::blank<typename D::Record>();
};

// A decoder over some parms, and the record that they go to.
template <class D>
struct Reading {
    explicit Reading(const Bytes &bytes) : decoder(bytes), size(bytes.size()) {}

    qvsResult read() { return D::decode(decoder, record); }
    size_t left() const { return size - decoder.position(); }

    decoding::Decoder decoder;
    size_t size;
    Held<D> record;
};

// The traces of one parm, whose reading ends with `result`.
template <class D>
Strings tracesOf(const Bytes &bytes, qvsResult result = 0)
{
    Reading<D> run(bytes);
    Traces traces;
    EXPECT_EQ(run.read(), result);
    return traces.texts;
}

// ---- Decoders without the types of their records

// A parameter whose name is a token: its field by its number, and whether that is a list.
struct AnyRow {
    // How it is shown when these values came in, one after the other.
    std::string of(const Strings &values) const { return list ? shown(values) : values.back(); }

    uint8_t token;
    const char *name;
    size_t field;
    bool list;
};

// A parameter whose name is a text.
struct AnyName {
    const char *name;
    size_t field;
};

// A decoder as the suites see it, which are compiled once for all of them.
struct AnyParm {
    const char *characteristic;
    size_t fields;
    qvsResult (*decode)(qvsWbxmlDecoder *decoder, void *record);
    void (*release)(void *record);
    bool fresh;
    bool (*hasOtherMeaning)(uint8_t token);
    bool (*goesOn)(uint8_t token);
    const char *(*withoutValue)(uint8_t token);
    Strings (*refused)(uint8_t token);
    std::vector<AnyRow> rows;

    // Of one that reads names: what its traces begin with, whether it reads the value of any name,
    // and the names that it knows.
    const char *label = nullptr;
    bool readsAnyValue = false;
    qvsResult (*readName)(qvsWbxmlDecoder *decoder, uint8_t tag) = nullptr;
    std::vector<AnyName> names = {};
};

inline void PrintTo(const AnyParm &parm, std::ostream *out)
{
    *out << parm.characteristic;
}

template <class D>
AnyParm anyParm()
{
    using R = typename D::Record;
    const R record{};
    AnyParm parm = {
        .characteristic = D::kCharacteristic,
        .fields = sizeof(R) / sizeof(void *),
        .decode = [](auto *decoder, void *to) { return D::decode(decoder, static_cast<R *>(to)); },
        .release = [](void *made) { D::release(static_cast<R *>(made)); },
        .fresh = D::kFresh,
        .hasOtherMeaning = D::hasOtherMeaning,
        .goesOn = D::goesOn,
        .withoutValue = D::withoutValue,
        .refused = D::refused,
        .rows = {},
    };
    for (const Row<R> &row : D::rows()) {
        const size_t field = row.text ? numberOf(&record, row.text) : numberOf(&record, row.list);
        parm.rows.push_back({row.token, row.name, field, row.list != nullptr});
    }
    if constexpr (requires { D::kLabel; }) {
        parm.label = D::kLabel;
        parm.readsAnyValue = D::kReadsAnyValue;
        parm.readName = [](qvsWbxmlDecoder *decoder, uint8_t tag) {
            R *made = nullptr;
            return D::readName(decoder, &made, tag);
        };
    }
    if constexpr (requires { D::names(); }) {
        for (const NamedRow<R> &row : D::names()) {
            parm.names.push_back({row.name, numberOf(&record, row.text)});
        }
    }
    return parm;
}

// A decoder over some parms, and the record that they go to.
class AnyReading {
public:
    AnyReading(const AnyParm &of, const Bytes &bytes)
        : decoder(bytes), record(records::blank(of.fields)), parm(of), size(bytes.size())
    {
    }
    AnyReading(const AnyReading &) = delete;
    AnyReading &operator=(const AnyReading &) = delete;
    ~AnyReading() { parm.release(record); }

    qvsResult read() { return parm.decode(decoder, record); }
    size_t left() const { return size - decoder.position(); }

    records::Numbers fieldsSet() const { return parms::fieldsSet(record, parm.fields); }
    char *text(size_t field) const { return static_cast<char *>(records::get(record, field)); }
    std::string shown(const AnyRow &row) const
    {
        return row.list ? parms::shown(static_cast<qvsList *>(records::get(record, row.field)))
                        : parms::shown(text(row.field));
    }

    decoding::Decoder decoder;
    void *record;

private:
    const AnyParm &parm;
    size_t size;
};

// Runs over `bytes` with each allocation of the decoder failing in turn. A run in which one failed
// must not be a success.
inline void failEachAllocation(const AnyParm &parm, const Bytes &bytes)
{
    const auto attempt = [&] {
        const long failAt = std::exchange(blocks::failAt, -1);
        AnyReading run(parm, bytes);
        blocks::failAt = failAt;
        const qvsResult result = run.read();
        if (blocks::failAt < 0) {
            EXPECT_TRUE(result == 1 || result == 4103) << result;
        } else {
            EXPECT_EQ(result, 0U);
        }
    };
    EXPECT_GT(blocks::failEach(attempt), 0);
    EXPECT_GT(blocks::failEachFrom(attempt), 0);
}

// ---- The suites

class ParmSuite : public blocks::BlockTest, public testing::WithParamInterface<AnyParm> {};

// The loop around the parameters.
class ParmLoop : public ParmSuite {};

// Parameters whose name is a token; of these, the texts; and the lists.
class TokenParm : public ParmSuite {};
class TextParm : public ParmSuite {};
class ListParm : public ParmSuite {};

// A reader of parameters that are named by text, whatever it does with the name; one that knows
// some.
class NameReader : public ParmSuite {};
class NamedParm : public ParmSuite {};

// Some decoders, for a suite.
template <class... D>
auto decoders()
{
    return testing::ValuesIn(std::vector<AnyParm>{anyParm<D>()...});
}

inline std::string nameOf(const testing::TestParamInfo<AnyParm> &info)
{
    return info.param.characteristic;
}

// The names of the types in the names of the tests.
struct TypeNames {
    template <class D>
    static std::string GetName(int)
    {
        return D::kCharacteristic;
    }
};

} // namespace parms

#endif
