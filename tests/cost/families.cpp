#include "families.h"

#include "support/message.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace cost {

namespace {

using message::Attribute;
using message::Body;
using message::cString;
using message::join;
using message::mbUint32;
using message::Type;
using namespace std::string_literals;

const Bytes kElementEnd = {message::kEnd};
const Bytes kUnknownElement = {0x3F};
constexpr uint8_t kComma = 0x90;
constexpr size_t kLongText = 200;

// ---- Pieces of a document

Bytes operator+(const Bytes &left, const Bytes &right)
{
    return join({left, right});
}

constexpr uint8_t kCharacteristic =
    message::kCharacteristicTag | message::kHasAttributes | message::kHasContent;

// The start of a characteristic on the page in force, which is page 0 at first.
Bytes start(Type type)
{
    return {kCharacteristic, static_cast<uint8_t>(type), message::kEnd};
}

// The same behind a switch to page 1.
Bytes startOnPage1(Type type)
{
    return {kCharacteristic, message::kSwitchPage, 1, static_cast<uint8_t>(type), message::kEnd};
}

// The same with the TYPE as text.
Bytes start(std::string_view type)
{
    return Bytes{kCharacteristic, message::kTypeText, message::kStrI} + cString(type) + kElementEnd;
}

Bytes pair(Attribute name, const Bytes &value)
{
    return Bytes{name, message::kValue} + value;
}

Bytes parm(Attribute name, const Bytes &value)
{
    return Bytes{message::kParm} + pair(name, value) + kElementEnd;
}

// A parm whose NAME is text.
Bytes parm(std::string_view name, const Bytes &value)
{
    return Bytes{message::kParm, message::kNameText, message::kStrI} + cString(name) +
           Bytes{message::kValue} + value + kElementEnd;
}

Bytes text(std::string_view value)
{
    return Bytes{message::kStrI} + cString(value);
}

Bytes opaque(std::string_view value)
{
    return Bytes{message::kOpaque} + mbUint32(static_cast<uint32_t>(value.size())) +
           Bytes(value.begin(), value.end());
}

Bytes reference(uint32_t index)
{
    return Bytes{message::kStrT} + mbUint32(index);
}

const Bytes kShort = text("a");
const Bytes kToken = {0x85};        // stands for a text
const Bytes kByteToken = {0xCA};    // is a text of one byte
const Bytes kSkippedToken = {0x0A}; // is skipped with what follows it

// ---- Kinds of family

// Characteristics of one kind, one behind the other, each with a parm; inside another one or not.
Family chain(const std::string &name, const Bytes &outer, const Bytes &begin, const Bytes &inner)
{
    return {.name = "chain-" + name,
            .open = outer,
            .unit = begin + inner + kElementEnd,
            .close = outer.empty() ? Bytes{} : kElementEnd,
            .blocks = 2};
}

// One characteristic full of parms.
Family full(const std::string &name, const Bytes &begin, const Bytes &unit)
{
    return {.name = name, .open = begin, .unit = unit, .close = kElementEnd};
}

// The same with parms that make the list of a record.
Family list(const std::string &name, const Bytes &begin, const Bytes &unit)
{
    Family family = full(name, begin, unit);
    family.blocks = 2;
    return family;
}

// One parm with a value made of many pieces.
Family joined(const std::string &name, Type type, Attribute parmName, const Bytes &first,
              const Bytes &piece)
{
    return {.name = "join-" + name,
            .open = start(type) + Bytes{message::kParm} + pair(parmName, first),
            .unit = piece,
            .close = kElementEnd + kElementEnd};
}

// The same family with a byte at its end that is refused, so that all that was read is released
// unfinished.
Family refused(Family family)
{
    family.name += "-refused";
    family.close = kUnknownElement + family.close;
    family.result = QVS_ERROR_WBXML_UNKNOWN_ELEMENT;
    family.blocks = 0;
    return family;
}

// ---- All families

const Bytes kLogical = start(message::kPxLogical);
const Bytes kPhysical = start(message::kPxPhysical);
const Bytes kApplication = startOnPage1(message::kApplication);
const Bytes kAuth = kApplication + start(message::kAppAuth);

void addElements(std::vector<Family> *all)
{
    all->push_back({.name = "smallest", .open = kLogical + kElementEnd});
    const Family siblings{
        .name = "siblings", .unit = start(message::kPxLogical) + kElementEnd, .blocks = 1};
    const Family nesting{.name = "nesting", .unit = kLogical, .end = kElementEnd};
    all->push_back(siblings);
    all->push_back(refused(siblings));
    all->push_back({.name = "siblings-widest", // the largest records
                    .unit = start(message::kNapDef) + kElementEnd,
                    .blocks = 1});
    all->push_back({.name = "siblings-nameless",
                    .unit = {message::kCharacteristicTag | message::kHasContent, message::kEnd}});
    all->push_back({.name = "siblings-empty",
                    .open = kLogical + kElementEnd,
                    .unit = {message::kCharacteristicTag},
                    .close = kElementEnd}); // the last one takes an END for its own
    all->push_back({.name = "siblings-text", .unit = kLogical + kElementEnd + kShort});
    all->push_back({.name = "content-switched",
                    .open = kLogical,
                    .unit = {message::kSwitchPage, 1},
                    .close = kElementEnd});
    all->push_back(
        {.name = "content-text", .open = kLogical, .unit = kShort, .close = kElementEnd});
    all->push_back(nesting);
    all->push_back(refused(nesting));
    all->push_back({.name = "nesting-unfinished",
                    .unit = kLogical,
                    .middle = kUnknownElement,
                    .result = QVS_ERROR_WBXML_UNKNOWN_ELEMENT});
    all->push_back({.name = "nesting-filled",
                    .unit = kPhysical + parm(message::kPxAddr, kShort),
                    .end = kElementEnd});
    all->push_back({.name = "nesting-pairs", // two children on every level
                    .unit = kLogical + start(message::kPort) + kElementEnd,
                    .end = kElementEnd});
    all->push_back({.name = "children",
                    .open = kLogical,
                    .unit = start(message::kPort) + kElementEnd,
                    .close = kElementEnd,
                    .blocks = 1});
    // The worst case of memory: each TYPE makes a record.
    all->push_back({.name = "types",
                    .open = {kCharacteristic},
                    .unit = {static_cast<uint8_t>(message::kNapDef)},
                    .close = kElementEnd + kElementEnd});
    all->push_back({.name = "types-text",
                    .open = {kCharacteristic},
                    .unit = Bytes{message::kTypeText} + opaque("WI-FI"),
                    .close = kElementEnd + kElementEnd});
    all->push_back(
        {.name = "types-switched",
         .open = {kCharacteristic},
         .unit = {message::kSwitchPage, 0},
         .close = Bytes{static_cast<uint8_t>(message::kNapDef)} + kElementEnd + kElementEnd});
}

void addParms(std::vector<Family> *all)
{
    const Family lists = list("lists", kLogical, parm(message::kDomain, kToken));
    all->push_back(lists);
    all->push_back(refused(lists));
    all->push_back(list("lists-byte", kLogical, parm(message::kDomain, kByteToken)));
    all->push_back(list("lists-text", kLogical, parm(message::kDomain, kShort)));
    all->push_back(
        full("lists-empty", kLogical, Bytes{message::kParm, message::kDomain, message::kEnd}));
    all->push_back({.name = "lists-one-parm",
                    .open = kLogical + Bytes{message::kParm},
                    .unit = pair(message::kDomain, kByteToken),
                    .close = kElementEnd + kElementEnd});
    all->push_back(list("lists-by-turns", start(message::kAccess),
                        parm(message::kRule, kByteToken) + parm(message::kToNapId, kByteToken) +
                            parm(message::kToProxy, kByteToken)));
    all->push_back(list("lists-services", kLogical + start(message::kPort),
                        parm(message::kService, kByteToken)));
    all->back().close = kElementEnd + kElementEnd;
    all->push_back({.name = "lists-services-nested",
                    .open = kLogical + kPhysical + start(message::kPort),
                    .unit = parm(message::kService, text("wta")),
                    .close = kElementEnd + kElementEnd + kElementEnd,
                    .blocks = 2});
    const Family strings = full("strings", kLogical, parm(message::kName, kShort));
    all->push_back(strings);
    all->push_back(refused(strings));
    all->push_back({.name = "strings-one-parm",
                    .open = kLogical + Bytes{message::kParm},
                    .unit = pair(message::kName, kToken),
                    .close = kElementEnd + kElementEnd});
    all->push_back(full("strings-named", start("WI-FI"), parm("NETSSID", kShort)));
    all->push_back(full("strings-from", kApplication, parm("FROM", kShort)));
    all->push_back(full("strings-dropped", kApplication, parm("X", kShort)));
    all->push_back(full("strings-vendor", start(message::kVendorConfig), parm("X", kShort)));
    all->push_back(full("strings-startpage", kApplication + start(message::kResource),
                        Bytes{message::kParm, message::kStartPage, message::kEnd}));
    all->back().close = kElementEnd + kElementEnd;
    all->push_back(full("parms-empty", kLogical, {message::kParm, message::kEnd, message::kEnd}));
    all->push_back({.name = "parms-switched",
                    .open = kLogical + Bytes{message::kParm},
                    .unit = {message::kSwitchPage, 1},
                    .close = kElementEnd + kElementEnd});
}

void addTexts(std::vector<Family> *all)
{
    all->push_back(
        {.name = "long-text",
         .open = kLogical + Bytes{message::kParm, message::kName, message::kValue, message::kStrI},
         .unit = Bytes{'a'},
         .close = Bytes{0} + kElementEnd + kElementEnd});
    all->push_back(
        full("long-texts", kLogical, parm(message::kDomain, text(std::string(kLongText, 'a')))));
    all->push_back(full("long-opaques", kLogical,
                        parm(message::kDomain, opaque(std::string(kLongText, 'a')))));
    all->push_back(
        {.name = "long-name",
         .open = kApplication + Bytes{message::kParm, message::kNameText, message::kStrI},
         .unit = Bytes{'a'},
         .close = Bytes{0} + kElementEnd + kElementEnd});
    all->push_back({.name = "long-type",
                    .open = {kCharacteristic, message::kTypeText, message::kStrI},
                    .unit = Bytes{'a'},
                    .close = Bytes{0} + kElementEnd + kElementEnd});
    all->push_back({.name = "long-dropped",
                    .open = kLogical + kElementEnd + Bytes{message::kStrI},
                    .unit = Bytes{'a'},
                    .close = {0}});
    all->push_back(
        {.name = "long-table", .open = kLogical + kElementEnd, .unit = {}, .tableText = 90});
    // References to short entries; their texts stay below the limit.
    Family references = full("references", kLogical, parm(message::kDomain, reference(0)));
    references.table = std::string(16, 't') + '\0';
    all->push_back(references);
    Family run = joined("references", message::kPxLogical, message::kName, kShort, reference(0));
    run.table = std::string(16, 't') + '\0';
    all->push_back(run);
    references.name = "references-empty";
    references.table.assign(1, '\0');
    all->push_back(references);
    run.name = "join-references-empty";
    run.table.assign(1, '\0');
    all->push_back(run);
    Family skipped =
        full("references-skipped", kLogical, parm(message::kDomain, kSkippedToken + reference(0)));
    skipped.table = std::string(16, 't') + '\0';
    all->push_back(skipped);
}

void addJoins(std::vector<Family> *all)
{
    all->push_back(joined("texts", message::kPxLogical, message::kName, kShort, kShort));
    all->push_back(joined("texts-empty", message::kPxLogical, message::kName, kShort, text("")));
    all->push_back(joined("tokens", message::kPxLogical, message::kName, kShort, {0x8B}));
    all->push_back(joined("commas", message::kPxLogical, message::kName, kShort, {0x9D}));
    all->push_back(joined("hidden", message::kPxLogical, message::kName, kShort, {0x95}));
    all->push_back(joined("mixed", message::kPxLogical, message::kName, kShort,
                          text("ab") + Bytes{0x85, 0x95, 0x9A}));
    // The comma token joins values of AAUTHTYPE: in one parm, in many, behind page switches, and
    // with the text made anew in between.
    const auto commas = [&](const std::string &name, const Bytes &unit) {
        Family family = full("aauthtype-" + name, kAuth + parm(message::kAAuthType, {0x91}), unit);
        family.close = kElementEnd + kElementEnd;
        all->push_back(family);
    };
    const auto inOneParm = [&](const std::string &name, const Bytes &unit) {
        all->push_back({.name = "aauthtype-one-parm-" + name,
                        .open = kAuth + Bytes{message::kParm} + pair(message::kAAuthType, {0x91}),
                        .unit = unit,
                        .close = kElementEnd + kElementEnd + kElementEnd});
    };
    const Bytes switched = {message::kSwitchPage, 1};
    inOneParm("tokens", {kComma, 0x92});
    inOneParm("switched", switched + Bytes{kComma} + switched + Bytes{0x92});
    inOneParm("unknown", {kComma, 0xCA});
    commas("tokens", {message::kParm, kComma, 0x92, message::kEnd});
    commas("texts", Bytes{message::kParm, kComma} + kShort + kElementEnd);
    commas("switched", Bytes{message::kParm} + switched + Bytes{kComma} + switched +
                           Bytes{0x92, message::kEnd} + switched);
    commas("renewed",
           parm(message::kAAuthType, {0x93}) + Bytes{message::kParm, kComma, 0x92, message::kEnd});
    // Many values of other parms between the joins.
    commas("between",
           parm(message::kAAuthName, kShort) + Bytes{message::kParm, kComma, 0x92, message::kEnd});
}

// A value that is no text is skipped up to the END of its last level, which is that of the parm.
void addSkips(std::vector<Family> *all)
{
    const auto add = [&](const std::string &name, const Bytes &unit, const Bytes &end,
                         const Bytes &levels = {}) {
        all->push_back({.name = "skip-" + name,
                        .open = kLogical + Bytes{message::kParm} +
                                pair(message::kName, kSkippedToken) + levels,
                        .unit = unit,
                        .end = end,
                        .close = Bytes(levels.size(), message::kEnd) + kElementEnd + kElementEnd});
    };
    add("deep", kSkippedToken, kElementEnd);
    add("levels", kSkippedToken + kElementEnd, {}, kSkippedToken);
    add("texts", kShort + kElementEnd + kSkippedToken, {}, kSkippedToken);
    add("opaques", opaque("abcdef"), {});
    add("switches", {message::kSwitchPage, 1}, {});
    all->push_back(full("skip-many", kLogical, parm(message::kName, kSkippedToken)));
}

void addChains(std::vector<Family> *all)
{
    const Bytes napDef = start(message::kNapDef);
    const Bytes appAddr = kApplication + start(message::kAppAddr);
    all->push_back(chain("pxlogical", {}, kLogical, parm(message::kProxyId, kShort)));
    all->push_back(chain("pxauthinfo", kLogical, start(message::kPxAuthInfo),
                         parm(message::kPxAuthId, kShort)));
    all->push_back(chain("pxphysical", kLogical, kPhysical, parm(message::kPxAddr, kShort)));
    all->push_back(chain("port", kLogical, start(message::kPort), parm(message::kPortNbr, kShort)));
    all->push_back(chain("physical-port", kLogical + kPhysical, start(message::kPort),
                         parm(message::kPortNbr, kShort)));
    all->back().close = kElementEnd + kElementEnd;
    all->push_back(chain("napdef", {}, napDef, parm(message::kNapId, kShort)));
    all->push_back(chain("napauthinfo", napDef, start(message::kNapAuthInfo),
                         parm(message::kAuthName, kShort)));
    all->push_back(
        chain("validity", napDef, start(message::kValidity), parm(message::kCountry, kShort)));
    all->push_back(
        chain("bootstrap", {}, start(message::kBootstrap), parm(message::kName, kShort)));
    all->push_back(chain("clientidentity", {}, start(message::kClientIdentity),
                         parm(message::kClientId, kShort)));
    all->back().blocks = 0; // only the first one reaches the context
    all->push_back(
        chain("vendorconfig", {}, start(message::kVendorConfig), parm(message::kName, kShort)));
    all->push_back(
        chain("application", {}, start(message::kApplication), parm(message::kAppId, kShort)));
    all->back().open = kApplication + kElementEnd;
    all->push_back(
        chain("appaddr", kApplication, start(message::kAppAddr), parm(message::kAddr, kShort)));
    all->push_back(
        chain("appaddr-port", appAddr, start(message::kPort), parm(message::kPortNbr, kShort)));
    all->back().close = kElementEnd + kElementEnd;
    all->push_back(chain("appauth", kApplication, start(message::kAppAuth),
                         parm(message::kAAuthName, kShort)));
    all->push_back(
        chain("resource", kApplication, start(message::kResource), parm(message::kUri, kShort)));
    all->push_back(chain("roaming", kApplication, start("ROAMING"), parm("SYNC-ALLOWED", kShort)));
    all->push_back(chain("access", {}, start(message::kAccess), parm(message::kDomain, kShort)));
    all->push_back(chain("wifi", {}, start("WI-FI"), parm("NETSSID", kShort)));
    all->push_back(chain("vowifi", {}, start("Vodafone VoWiFi"), parm("ePDG FQDN", kShort)));
    const struct {
        const char *name;
        Bytes begin;
        Attribute list;
    } lists[] = {
        {"dnsaddr", napDef, message::kDnsAddr},
        {"bearer", napDef, message::kBearer},
        {"authentity", napDef + start(message::kNapAuthInfo), message::kAuthEntity},
        {"network", start(message::kBootstrap), message::kNetwork},
        {"proxyid", start(message::kBootstrap), message::kProxyId},
        {"to-napid", kApplication, message::kToNapId},
        {"to-proxy", kApplication, message::kToProxy},
        {"addr", kApplication, message::kAddr},
        {"rule", start(message::kAccess), message::kRule},
        {"appid", start(message::kAccess), message::kAppId},
        {"portnbr", start(message::kAccess), message::kPortNbr},
    };
    for (const auto &record : lists) {
        all->push_back(list("list-"s + record.name, record.begin, parm(record.list, kByteToken)));
        if (record.list == message::kAuthEntity) {
            all->back().close = kElementEnd + kElementEnd;
        }
    }
}

void addLimits(std::vector<Family> *all)
{
    // A quarter of the message is one text, and the rest refers to it.
    Family references = full("limit-references", kLogical, parm(message::kDomain, reference(0)));
    references.tableText = 25;
    Family run = joined("references", message::kPxLogical, message::kName, kShort, reference(0));
    run.name = "limit-join-references";
    run.tableText = 25;
    Family skipped =
        full("limit-skipped", kLogical, parm(message::kDomain, kSkippedToken + reference(0)));
    skipped.tableText = 25;
    // Every pair continues the text of the one before it.
    const Family opaques{.name = "limit-pairs-opaque",
                         .open = kLogical + Bytes{message::kParm},
                         .unit = pair(message::kDomain, opaque("a")),
                         .close = kElementEnd + kElementEnd};
    Family tokens = opaques;
    tokens.name = "limit-pairs-token";
    tokens.unit = pair(message::kDomain, kToken);
    for (Family limited : {references, run, skipped, opaques, tokens}) {
        limited.aboutLimit = true;
        limited.result = QVS_ERROR_NO_MEMORY;
        all->push_back(limited);
    }
    // Not far below it, 90 bytes of text to one of message: in the tree, and copied to the context.
    constexpr size_t kPairs = 900;
    Family below = opaques;
    below.name = "limit-below-pairs";
    below.aboutLimit = true;
    below.open = kLogical;
    below.unit = {message::kParm};
    for (size_t i = 0; i < kPairs; ++i) {
        below.unit = below.unit + opaques.unit;
    }
    below.unit = below.unit + kElementEnd;
    below.close = kElementEnd;
    all->push_back(below);
    below = full("limit-below-references", kLogical, parm(message::kDomain, reference(0)));
    below.aboutLimit = true;
    below.table = std::string(90 * below.unit.size(), 't') + '\0';
    all->push_back(below);
    // What stays allocated by design: records whose place another one of the same element takes,
    // and texts that both the tree and the context leave.
    constexpr size_t kRecords = 300;
    const std::string names[] = {"XCAP_AUID_DCS",    "XCAP_AUID_PMS",   "XCAP_AUID_CDMS",
                                 "XCAP_IMEI_HEADER", "XCAP_TID_HEADER", "FROM"};
    below.name = "limit-below-left";
    below.open.clear();
    below.unit = {kCharacteristic, message::kSwitchPage, 0};
    below.unit.resize(3 + kRecords, static_cast<uint8_t>(message::kNapDef));
    below.unit = below.unit + Bytes{message::kSwitchPage, 1,
                                    static_cast<uint8_t>(message::kApplication), message::kEnd};
    below.table.clear();
    for (const std::string &name : names) {
        below.table += name + '\0';
    }
    const Bytes value = reference(static_cast<uint32_t>(below.table.size()));
    uint32_t at = 0;
    for (const std::string &name : names) {
        below.unit = below.unit + Bytes{message::kParm, message::kNameText} + reference(at) +
                     Bytes{message::kValue} + value + kElementEnd;
        at += static_cast<uint32_t>(name.size()) + 1;
    }
    below.unit = below.unit + kElementEnd;
    below.close.clear();
    below.table += std::string(90 * below.unit.size() / std::size(names), 't') + '\0';
    all->push_back(below);
}

std::vector<Family> allFamilies()
{
    std::vector<Family> all;
    addElements(&all);
    addParms(&all);
    addTexts(&all);
    addJoins(&all);
    addSkips(&all);
    addChains(&all);
    addLimits(&all);
    return all;
}

void append(Bytes *bytes, const Bytes &more, size_t times = 1)
{
    for (; times > 0; --times) {
        bytes->insert(bytes->end(), more.begin(), more.end());
    }
}

} // namespace

const std::vector<Family> &families()
{
    static const std::vector<Family> all = allFamilies();
    return all;
}

const Family &family(const std::string &name)
{
    for (const Family &known : families()) {
        if (known.name == name) {
            return known;
        }
    }
    fprintf(stderr, "no family is named %s\n", name.c_str());
    abort();
}

namespace {

std::string tableOf(const Family &family, size_t size)
{
    std::string table = family.table;
    if (family.tableText > 0) {
        table.append(size / 100 * family.tableText, 't').push_back('\0');
    }
    return table;
}

} // namespace

size_t unitsOf(const Family &family, size_t size)
{
    constexpr size_t kFrame = 64; // more than the push header and the ends of the document
    const size_t taken = kFrame + tableOf(family, size).size() + family.open.size() +
                         family.middle.size() + family.close.size();
    const size_t each = family.unit.size() + family.end.size();
    return each > 0 && size > taken ? (size - taken) / each : 0;
}

Bytes messageOf(const Family &family, size_t size)
{
    const size_t units = unitsOf(family, size);
    Bytes content;
    content.reserve(size);
    append(&content, family.open);
    append(&content, family.unit, units);
    append(&content, family.middle);
    append(&content, family.end, units);
    append(&content, family.close);
    Body body;
    body.bytes(content);
    return message::push(message::document(body, {.table = tableOf(family, size)}));
}

} // namespace cost
