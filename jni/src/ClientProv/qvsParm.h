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

// What a parameter holds: a text, a list of texts, or what the reader of its table makes of it.
enum class ParmType : uint8_t { kText, kList, kOther };

struct OtherField {};
constexpr OtherField kByReader;

// One parameter of a characteristic: the NAME token that announces it and the field it fills.
struct Parm {
    consteval Parm(uint8_t t, TextField f) : token(t), type(ParmType::kText), field(f.number) {}
    consteval Parm(uint8_t t, ListField f)
        : token(t), type(ParmType::kList), field(f.number), place(f.place)
    {
    }
    consteval Parm(uint8_t t, OtherField) : token(t), type(ParmType::kOther), field(kNoField) {}

    uint8_t token;
    ParmType type;
    uint8_t field;
    uint8_t place = 0; // of a list
};

// The parameters of one kind of characteristic. But for the rows, the reader and the way past a
// page switch all of it is wording.
struct ParmTable {
    const char *name; // of its decoder, in the trace of a refused token
    Rows<Parm> rows;
    // Of kByReader.
    qvsResult (*reader)(qvsWbxmlDecoder *decoder, DecodeState *state, void *record) = nullptr;
    bool freshTokenAfterSwitch = false;      // read it again instead of peeking at it masked
    const char *entered = nullptr;           // name of its decoder, traced before anything is read
    void (*onParm)(uint8_t token) = nullptr; // before a parameter of the table is read
    void (*onToken)(uint8_t token) = nullptr;
    void (*onRefused)(uint8_t token) = nullptr; // in place of the usual two lines
    void (*onEnd)(uint8_t token, qvsResult result) = nullptr;
};

extern const ParmTable kPxLogicalParms;
extern const ParmTable kPxAuthInfoParms;
extern const ParmTable kPortParms;
extern const ParmTable kPxPhysicalParms;
extern const ParmTable kNapDefParms;
extern const ParmTable kNapAuthInfoParms;
extern const ParmTable kValidityParms;
extern const ParmTable kApplicationParms;
extern const ParmTable kAppAddrParms;
extern const ParmTable kAppAuthParms;
extern const ParmTable kResourceParms;
extern const ParmTable kBootstrapParms;
extern const ParmTable kClientIdentityParms;
extern const ParmTable kVendorConfigParms;
extern const ParmTable kAccessParms;
extern const ParmTable kRoamingParms;
extern const ParmTable kWifiParms;
extern const ParmTable kVoWifiParms;

// Reads one parm element into `record`. Stops at the END of its attributes, which it consumes,
// or at the first token that is refused or cannot be read. Without a state it is a step alone.
qvsResult readParms(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                    const ParmTable &table);
qvsResult readParms(qvsWbxmlDecoder *decoder, void *record, const ParmTable &table);

// Reads the parameter that the NAME attribute `token` announces into `*text`.
qvsResult readText(qvsWbxmlDecoder *decoder, DecodeState *state, char **text, uint8_t token);

// Reads one parameter onto a list of `record`. On failure the list is as it was, but for the items
// that it has got.
qvsResult readList(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, ListField list);

// ---- Parameters whose name is given as text

// A name, and the text that its value goes to.
struct NamedParm {
    char name[18];
    TextField field;
};

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

// The field of `record` that the name selects; null for a name that is not listed.
char **findNamed(void *record, const Rows<NamedParm> &names, const Text &name);

} // namespace qvs

#endif
