// The kinds of characteristic, for the tests of the document: each with its TYPE, its slot in a
// node, a parameter of its own, and what is traced of a characteristic inside it.
#ifndef KINDS_H
#define KINDS_H

#include "parms.h"

#include <string>
#include <vector>

namespace kinds {

using message::Bytes;
using message::join;
using records::Strings;

enum Pages { kItsPage, kBothPages };
enum Place { kText, kList };
enum Nesting { kHolds, kHoldsNone };

struct Kind {
    const char *name;
    Bytes type;    // its attributes, from page 0
    Pages pages;   // whether a page switch in front of them makes a difference
    size_t slot;   // from 1
    size_t fields; // of its record
    Bytes parm;    // a parm with the value "v"
    size_t field;  // that the value goes to, from 1
    Place place;
    Nesting nesting;     // whether characteristics may nest in it
    const char *refusal; // what is traced when one must not; null for nothing
};

template <class Record>
Kind kind(const char *name, Bytes type, Pages pages, size_t slot, Bytes parm, size_t field,
          Place place, Nesting nesting, const char *refusal)
{
    return {name, type,  pages, slot,    sizeof(Record) / sizeof(void *),
            parm, field, place, nesting, refusal};
}

// A TYPE or a NAME given as text.
inline Bytes byText(uint8_t token, const std::string &name)
{
    return join({{token}, message::Value(name).bytes});
}

inline const std::vector<Kind> &all()
{
    using parms::named;
    using parms::parm;
    static const std::vector<Kind> table = {
        kind<qvsWapPxLogical>("PXLOGICAL", Bytes{0x51}, kBothPages, 1, parm(0x2A, "v"), 6, kText,
                              kHolds, nullptr),
        kind<qvsWapPxAuthInfo>("PXAUTHINFO", Bytes{0x59}, kItsPage, 2, parm(0x19, "v"), 1, kText,
                               kHoldsNone, "RESOURCE is Not Support Chiled CHARACTER."),
        kind<qvsWapPort>("PORT", Bytes{0x53}, kBothPages, 3, parm(0x23, "v"), 1, kText, kHoldsNone,
                         "BOOTSTRAP is Not Support Chiled PORT."),
        kind<qvsWapPxPhysical>("PXPHYSICAL", Bytes{0x52}, kBothPages, 4, parm(0x3D, "v"), 4, kText,
                               kHolds, nullptr),
        kind<qvsWapNapDef>("NAPDEF", Bytes{0x55}, kItsPage, 5, parm(0x11, "v"), 1, kText, kHolds,
                           nullptr),
        kind<qvsWapNapAuthInfo>("NAPAUTHINFO", Bytes{0x5A}, kBothPages, 6, parm(0x0C, "v"), 1,
                                kText, kHoldsNone, "BOOTSTRAP is Not Support Chiled PORT."),
        kind<qvsWapValidity>("VALIDITY", Bytes{0x54}, kBothPages, 7, parm(0x2C, "v"), 3, kText,
                             kHoldsNone, "BOOTSTRAP is Not Support Chiled PORT."),
        kind<qvsWapAppAddr>("APPADDR", Bytes{0x00, 0x01, 0x56}, kItsPage, 8, parm(0x35, "v"), 2,
                            kText, kHolds, nullptr),
        kind<qvsWapResource>("RESOURCE", Bytes{0x00, 0x01, 0x59}, kItsPage, 9, parm(0x3A, "v"), 1,
                             kText, kHoldsNone, "RESOURCE is Not Support Chiled CHARACTER."),
        kind<qvsWapAppAuth>("APPAUTH", Bytes{0x00, 0x01, 0x57}, kItsPage, 10, parm(0x30, "v"), 1,
                            kText, kHoldsNone, "APPAUTH is Not Support Chiled CHARACTER."),
        kind<qvsWapApplication>("APPLICATION", Bytes{0x00, 0x01, 0x55}, kItsPage, 11,
                                parm(0x36, "v"), 1, kText, kHolds, nullptr),
        kind<qvsWapBootstrap>("BOOTSTRAP", Bytes{0x56}, kItsPage, 12, parm(0x18, "v"), 3, kText,
                              kHoldsNone, "BOOTSTRAP is Not Support Chiled CHARACTER."),
        kind<qvsWapVendorConfig>("VENDORCONFIG", Bytes{0x57}, kItsPage, 13, parm(0x07, "v"), 1,
                                 kText, kHoldsNone,
                                 "VENDORCONFIG is Not Support Chiled CHARACTER."),
        kind<qvsWapClientIdentity>("CLIENTIDENTITY", Bytes{0x58}, kBothPages, 14, parm(0x30, "v"),
                                   1, kText, kHoldsNone,
                                   "BOOTSTRAP is Not Support Chiled CLIENTIDENTITY."),
        kind<qvsWapAccess>("ACCESS", Bytes{0x5B}, kBothPages, 15, parm(0x3B, "v"), 1, kList,
                           kHoldsNone, "BOOTSTRAP is Not Support Chiled ACCESS."),
        kind<qvsWapRoaming>("ROAMING", byText(0x50, "ROAMING"), kBothPages, 16,
                            named("SYNC-DEFAULT", "v"), 2, kText, kHoldsNone, nullptr),
        kind<qvsWapWifi>("WI-FI", byText(0x50, "WI-FI"), kBothPages, 17, named("SECMODE", "v"), 2,
                         kText, kHoldsNone, nullptr),
        kind<qvsWapVoWifi>("Vodafone VoWiFi", byText(0x50, "Vodafone VoWiFi"), kBothPages, 18,
                           named("ePDG FQDN", "v"), 1, kText, kHoldsNone, nullptr),
    };
    return table;
}

inline const Kind &of(const std::string &name)
{
    for (const Kind &kind : all()) {
        if (kind.name == name) {
            return kind;
        }
    }
    ADD_FAILURE() << name;
    return all().front();
}

// A characteristic with content.
inline Bytes characteristic(const Bytes &attributes, const Bytes &content = {})
{
    return join({{0xC6}, attributes, {0x01}, content, {0x01}});
}

// The trace of one turn over the content of a characteristic.
inline Strings turn(unsigned tag, unsigned attrId)
{
    return parms::lines(
        {"qvsClientProvWbxmlDecoderCharacter :: " + parms::format("nId[0x%02x], ", tag) +
         parms::format("nAttrId[0x%02x]", attrId)});
}

// What stays allocated when a tree is released, or becomes unreachable with it, is released by the
// test: ROAMING, the named parameters of APPLICATION and of VENDORCONFIG.
inline void releaseKept(const qvsList *nodes);

inline void releaseKept(qvsWapCharacter *node)
{
    if (!node) {
        return;
    }
    if (qvsWapRoaming *record = node->ptRoaming) {
        records::release({record->pszSyncAllowed, record->pszSyncDefault, record});
    }
    if (qvsWapVendorConfig *record = node->ptVendorConfig) {
        records::release({record->pszParamName, record->pszParamValue});
    }
    if (qvsWapApplication *record = node->ptApplication) {
        records::release({record->pszFrom, record->pszXcapAuidDcs, record->pszXcapAuidPms,
                          record->pszXcapAuidCdms, record->pszXcapImeiHeader,
                          record->pszXcapTidHeader});
        releaseKept(record->ptCharacterList);
    }
    if (node->ptPxLogical) {
        releaseKept(node->ptPxLogical->ptCharacterList);
    }
    if (node->ptPxPhysical) {
        releaseKept(node->ptPxPhysical->ptCharacterList);
    }
    if (node->ptNapDef) {
        releaseKept(node->ptNapDef->ptCharacterList);
    }
    if (node->ptAppAddr) {
        releaseKept(node->ptAppAddr->ptCharacterList);
    }
}

inline void releaseKept(const qvsList *nodes)
{
    for (const qvsListNode *node = nodes ? nodes->ptFirst : nullptr; node; node = node->ptNext) {
        releaseKept(static_cast<qvsWapCharacter *>(node->pItem));
    }
}

inline qvsWapCharacter *nodeAt(const qvsList *list, size_t index)
{
    const qvsListNode *node = list ? list->ptFirst : nullptr;
    for (; node && index; --index) {
        node = node->ptNext;
    }
    return node ? static_cast<qvsWapCharacter *>(node->pItem) : nullptr;
}

// ---- What is decoded, each released at the end of the scope

// One characteristic.
struct Character {
    explicit Character(const Bytes &bytes, uint8_t page = 0) : decoder(bytes), size(bytes.size())
    {
        decoder->nCodePage = page;
        result = qvsClientProvWbxmlDecoderCharacter(decoder, &node);
    }
    Character(const Character &) = delete;
    Character &operator=(const Character &) = delete;
    ~Character()
    {
        releaseKept(node);
        (void)qvsClientProvWbxmlDeleteCharacter(node);
    }
    size_t left() const { return size - decoder.position(); }

    decoding::Decoder decoder;
    size_t size;
    qvsWapCharacter *node = nullptr;
    qvsResult result = 0;
};

// A run of siblings.
struct Siblings {
    explicit Siblings(const Bytes &bytes) : decoder(bytes), size(bytes.size()) {}
    Siblings(const Siblings &) = delete;
    Siblings &operator=(const Siblings &) = delete;
    ~Siblings()
    {
        releaseKept(list);
        (void)qvsListDeleteNodeAllAndList(list, [](void *node) {
            (void)qvsClientProvWbxmlDeleteCharacter(static_cast<qvsWapCharacter *>(node));
        });
    }
    qvsResult read() { return qvsClientProvWbxmlDecoderCharacterList(decoder, &list); }
    size_t left() const { return size - decoder.position(); }

    decoding::Decoder decoder;
    size_t size;
    qvsList *list = nullptr;
};

// A whole body.
struct Document {
    explicit Document(const Bytes &bytes) : decoder(bytes), size(bytes.size())
    {
        result = qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document);
    }
    Document(const Document &) = delete;
    Document &operator=(const Document &) = delete;
    ~Document()
    {
        if (document) {
            releaseKept(document->ptCharacterList);
        }
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
    }
    const qvsList *nodes() const { return document ? document->ptCharacterList : nullptr; }
    size_t left() const { return size - decoder.position(); }

    decoding::Decoder decoder;
    size_t size;
    qvsWapDoc *document = nullptr;
    qvsResult result = 0;
};

} // namespace kinds

#endif
