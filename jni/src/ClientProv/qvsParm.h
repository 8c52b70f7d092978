// The parameters of a characteristic as rows of tables, and the one loop that reads a parm element.
#ifndef QVSPARM_H
#define QVSPARM_H

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsFields.h"
#include "qvsText.h"
#include "qvsTokens.h"
#include "qvstrace.h"

#include <stddef.h>
#include <stdint.h>

namespace [[gnu::visibility("hidden")]] qvs {

// What a parameter holds: a text, a list of texts, the text that its name given as text selects, or
// what the reader of its table makes of it.
enum class ParmType : uint8_t { kText, kList, kNamed, kOther };

// One parameter of a characteristic: the NAME token that announces it and the field it fills.
struct ParmRow {
    uint8_t token;
    ParmType type;
    uint8_t field;
    uint8_t place; // of a list
};

constexpr ParmType kByName = ParmType::kNamed;
constexpr ParmType kByReader = ParmType::kOther;

template <class Record>
struct Parm {
    using Of = Record;
    using Row = ParmRow;

    consteval Parm(uint8_t t, char *Record::*text) : row{t, ParmType::kText, numberOf(text), 0} {}
    consteval Parm(uint8_t t, ListOf<Record> l) : row{t, ParmType::kList, l.field, l.place} {}
    consteval Parm(uint8_t t, ParmType by) : row{t, by, kNoField, 0} {}

    ParmRow row;
};

// A name given as text, and the text that its value goes to.
struct NamedRow {
    uint8_t length; // of the name
    char name[17];
    uint8_t field;
};

template <class Record>
struct NamedParm {
    using Of = Record;
    using Row = NamedRow;

    template <size_t N>
    consteval NamedParm(const char (&text)[N], char *Record::*to) : row{N - 1, {}, numberOf(to)}
    {
        for (size_t i = 0; i < N - 1; ++i) {
            row.name[i] = text[i];
        }
    }

    NamedRow row;
};

// Where the search for a name begins.
constexpr size_t homeOf(const char *name, uint32_t length)
{
    return static_cast<uint8_t>(*name) + 2 * length;
}

// Names as they are looked up: a name is in its home, in a table of a power of two of rows, or
// behind it, with no empty row between.
template <class Record, size_t N>
consteval auto namesOf(const NamedParm<Record> (&names)[N])
{
    constexpr size_t kRows = 2U << (31 - __builtin_clz(N));
    Table<Record, NamedRow, kRows> table = {};
    for (const NamedParm<Record> &name : names) {
        size_t at = homeOf(name.row.name, name.row.length);
        while (table.rows[at % kRows].length != 0) {
            ++at;
        }
        table.rows[at % kRows] = name.row;
    }
    return table;
}

// The named parameters of one kind of characteristic.
struct NamedParms {
    Rows<NamedRow> names;
    const char *label;
    bool dropsUnknown; // the value of a name that is not listed; the loop refuses it otherwise
};

template <class Record>
struct NamedOf {
    template <size_t N>
    consteval NamedOf(const Table<Record, NamedRow, N> &names, const char *label,
                      bool dropsUnknown = false)
        : parms{rowsFor<Record>(names), label, dropsUnknown}
    {
    }

    NamedParms parms;
};

// The field of `record` that a name selects; null for a name that is not listed.
inline char **findNamed(void *record, const Rows<NamedRow> &names, const char *name,
                        uint32_t length)
{
    for (size_t at = homeOf(name, length);; ++at) {
        const NamedRow &known = names.first[at & (names.count - 1U)];
        if (known.length == length && memcmp(known.name, name, length) == 0) {
            return textAt(record, known.field);
        }
        if (known.length == 0) {
            return nullptr;
        }
    }
}

// What sets the decoder of one kind of characteristic apart. But for the way past a page switch all
// of it is wording.
struct ParmStyle {
    const char *name;                        // of its decoder, in the trace of a refused token
    bool freshTokenAfterSwitch = false;      // read it again instead of peeking at it masked
    const char *entered = nullptr;           // name of its decoder, traced before anything is read
    void (*onParm)(uint8_t token) = nullptr; // before a parameter of the table is read
    void (*onToken)(uint8_t token) = nullptr;
    void (*onRefused)(uint8_t token) = nullptr; // in place of the usual two lines
    void (*onEnd)(uint8_t token, qvsResult result) = nullptr;
};

// The parameters of one kind of characteristic.
struct ParmTable {
    ParmStyle style;
    Rows<ParmRow> rows;
    const NamedParms *named; // of kByName
    // Of kByReader.
    qvsResult (*reader)(qvsWbxmlDecoder *decoder, DecodeState *state, void *record);
};

template <class Record>
struct ParmReader {
    qvsResult (*read)(qvsWbxmlDecoder *decoder, DecodeState *state, void *record) = nullptr;
};

template <class Record, qvsResult (*read)(qvsWbxmlDecoder *, DecodeState *, Record *)>
constexpr ParmReader<Record> kReadBy = {
    [](qvsWbxmlDecoder *decoder, DecodeState *state, void *record) {
        return read(decoder, state, static_cast<Record *>(record));
    }};

template <class Record>
struct ParmsOf {
    template <size_t N>
    consteval ParmsOf(const ParmStyle &style, const Table<Record, ParmRow, N> &rows,
                      ParmReader<Record> reader = {})
        : table{style, rowsFor<Record>(rows), nullptr, reader.read}
    {
        demand(has(rows, kByReader) == (reader.read != nullptr) && !has(rows, kByName));
    }
    template <size_t N>
    consteval ParmsOf(const ParmStyle &style, const Table<Record, ParmRow, N> &rows,
                      const NamedOf<Record> &named)
        : table{style, rowsFor<Record>(rows), &named.parms, nullptr}
    {
        demand(has(rows, kByName) && !has(rows, kByReader));
    }

    // Whether rows are read by what the table has to be given for them.
    template <size_t N>
    static consteval bool has(const Table<Record, ParmRow, N> &rows, ParmType by)
    {
        bool found = false;
        for (const ParmRow &row : rows.rows) {
            found |= row.type == by;
        }
        return found;
    }

    ParmTable table;
};

extern const ParmsOf<qvsWapPxLogical> kPxLogicalParms;
extern const ParmsOf<qvsWapPxAuthInfo> kPxAuthInfoParms;
extern const ParmsOf<qvsWapPort> kPortParms;
extern const ParmsOf<qvsWapPxPhysical> kPxPhysicalParms;
extern const ParmsOf<qvsWapNapDef> kNapDefParms;
extern const ParmsOf<qvsWapNapAuthInfo> kNapAuthInfoParms;
extern const ParmsOf<qvsWapValidity> kValidityParms;
extern const ParmsOf<qvsWapApplication> kApplicationParms;
extern const ParmsOf<qvsWapAppAddr> kAppAddrParms;
extern const ParmsOf<qvsWapAppAuth> kAppAuthParms;
extern const ParmsOf<qvsWapResource> kResourceParms;
extern const ParmsOf<qvsWapBootstrap> kBootstrapParms;
extern const ParmsOf<qvsWapClientIdentity> kClientIdentityParms;
extern const ParmsOf<qvsWapVendorConfig> kVendorConfigParms;
extern const ParmsOf<qvsWapAccess> kAccessParms;
extern const ParmsOf<qvsWapRoaming> kRoamingParms;
extern const ParmsOf<qvsWapWifi> kWifiParms;
extern const ParmsOf<qvsWapVoWifi> kVoWifiParms;

// Reads one parm element into `record`. Stops at the END of its attributes, which it consumes, or
// at the first token that is refused or cannot be read.
qvsResult readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table);
template <class Record>
qvsResult readParms(qvsWbxmlDecoder *decoder, Record *record, const ParmsOf<Record> &parms)
{
    return readParms(decoder, record, parms.table);
}

// The same where a byte of it was seen; with `all` parm elements that follow it are read too, and
// inline strings between them, while nobody takes traces.
qvsResult readParms(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                    const ParmTable &table, bool all = true);

// Reads the parameter that the NAME attribute `token` announces into `*text`.
qvsResult readText(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token);

// Reads one parameter onto a list of `record`. On failure the list is as it was, but for the items
// that it has got.
qvsResult readList(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t field,
                   uint8_t place);
template <class Record>
qvsResult readList(qvsWbxmlDecoder *decoder, DecodeState *state, Record *record,
                   ListOf<Record> list)
{
    return readList(decoder, state, record, list.field, list.place);
}

// ---- Parameters whose name is given as text

// The name of one parameter, compared where it lies, and the token behind it.
struct ParmName {
    Text text;
    uint8_t next = 0;
};

// Reads the NAME attribute `tag` and the text behind it, and peeks at the next token. `label` is
// what the traces are written under. QVS_ERROR_FAILED for a name that is not there; an empty one
// is one for `isKept` alone, whose name is a block.
qvsResult readParmName(qvsWbxmlDecoder *decoder, DecodeState *state, uint8_t tag, const char *label,
                       bool isKept, ParmName *name);

// Reads the VALUE of a name that is not listed and drops it, or leaves it.
qvsResult leaveUnknown(qvsWbxmlDecoder *decoder, DecodeState *state, const NamedParms &parms);

// Reads one named parameter of `record`, in any encoding.
qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t tag,
                    const NamedParms &parms);
template <class Record>
qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, Record *record, uint8_t tag,
                    const NamedOf<Record> &named)
{
    return readNamed(decoder, state, record, tag, named.parms);
}

} // namespace qvs

#endif
