#include "documents.h"

#include "support/message.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string_view>
#include <utility>

namespace sweep {

namespace {

using namespace std::string_view_literals;
using message::Body;
using message::join;
using message::opaque;
using message::tableString;
using message::token;
using message::Value;

constexpr std::string_view kTable = "first\0second\0\0"sv;
constexpr uint32_t kSecond = 6;
constexpr uint8_t kComma = 0x90;

Document document(const std::string &name, const Body &body)
{
    return {name, message::push(message::document(body, {.table = kTable}))};
}

// ---- Kinds of characteristic

// A kind, the parameters that it knows, and what it stands in.
struct Kind {
    const char *name;
    std::vector<Bytes> outer; // the attributes of the elements around it
    Bytes type;               // and those that make it
    std::string_view texts;
    std::string_view lists;
    std::vector<const char *> named = {};
};

constexpr uint8_t kElement =
    message::kCharacteristicTag | message::kHasAttributes | message::kHasContent;

Bytes opened(const Bytes &type)
{
    return join({{kElement}, type, {message::kEnd}});
}

Bytes named(const char *type)
{
    return join({{message::kTypeText}, Value(type).bytes});
}

std::vector<Kind> kinds()
{
    const Bytes logical = {0x51};
    const Bytes physical = {0x52};
    const Bytes napDef = {0x55};
    const Bytes application = {message::kSwitchPage, 1, 0x55};
    const Bytes appAddr = {0x56};
    return {
        {"pxlogical", {}, logical, "\x07\x15\x16\x1C\x2A\x2B\x3E\x3F", "\x17"},
        {"pxauthinfo", {logical}, {0x59}, "\x19\x1A\x1B", ""},
        {"port", {logical}, {0x53}, "\x23", "\x24"},
        {"pxphysical", {logical}, physical, "\x1F\x20\x21\x2E\x2F\x3D\x47", "\x17\x22"},
        {"physical-port", {logical, physical}, {0x53}, "\x23", "\x24"},
        {"napdef",
         {},
         napDef,
         "\x07\x08\x09\x0A\x0F\x11\x14\x25\x26\x27\x28\x31\x32\x33\x34\x35\x36\x49\x4A\x4B\x4C",
         "\x10\x48",
         {"X"}},
        {"napauthinfo", {napDef}, {0x5A}, "\x0C\x0D\x0E", "\x4E"},
        {"validity", {napDef}, {0x54}, "\x0B\x12\x13\x2C\x2D", ""},
        {"bootstrap", {}, {0x56}, "\x07\x12\x18\x29", "\x13\x15"},
        {"clientidentity", {}, {0x58}, "\x30", ""},
        {"vendorconfig", {}, {0x57}, "\x07", "", {"X"}},
        {"application",
         {},
         application,
         "\x07\x14\x2E\x36\x37\x38",
         "\x22\x34\x39",
         {"XCAP_AUID_DCS", "XCAP_AUID_PMS", "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER", "XCAP_TID_HEADER",
          "FROM", "X"}},
        {"appaddr", {application}, appAddr, "\x34\x35", ""},
        {"appaddr-port", {application, appAddr}, {0x53}, "\x23", "\x24"},
        {"appauth", {application}, {0x57}, "\x2F\x30\x31\x32\x33", ""},
        {"resource", {application}, {0x59}, "\x07\x1C\x2E\x2F\x31\x32\x33\x3A", ""},
        {"roaming", {application}, named("ROAMING"), "", "", {"SYNC-ALLOWED", "SYNC-DEFAULT"}},
        {"access", {}, {0x5B}, "", "\x17\x22\x23\x36\x39\x3B"},
        {"wifi",
         {},
         named("WI-FI"),
         "",
         "",
         {"NETSSID", "SECMODE", "EAPMETHOD", "EAPTYPE", "USERNAME", "ANONUSERNAME", "PASSWORD",
          "CACERT", "USERCERT", "PHASE1", "AUTHALGORITHM", "PRIORITY"}},
        {"vowifi", {}, named("Vodafone VoWiFi"), "", "", {"ePDG FQDN"}},
    };
}

// The content of one element: every parameter, those that are lists with two values.
Body parmsOf(const Kind &kind)
{
    Body body;
    for (const char text : kind.texts) {
        body.parm(static_cast<message::Attribute>(text), "text");
    }
    for (const char list : kind.lists) {
        body.parm(static_cast<message::Attribute>(list), "one");
        body.parm(static_cast<message::Attribute>(list), token(0x85));
    }
    for (const char *name : kind.named) {
        body.parm(Value(name), "named");
    }
    return body;
}

// Two elements of the kind inside what they stand in.
Document withKind(const Kind &kind)
{
    Body body;
    for (const Bytes &type : kind.outer) {
        body.bytes(opened(type));
    }
    for (int element = 0; element < 2; ++element) {
        body.bytes(opened(kind.type)).bytes(parmsOf(kind).data()).bytes({message::kEnd});
    }
    body.bytes(Bytes(kind.outer.size(), message::kEnd));
    return document(kind.name, body);
}

// ---- Encodings of a value

struct Encoding {
    const char *name;
    Value value;
};

std::vector<Encoding> encodings()
{
    return {
        {"inline", "text"},
        {"inline-empty", ""},
        {"inline-long", std::string(300, 'l')},
        {"table", tableString(kSecond)},
        {"opaque", opaque({'o', 'p'})},
        {"opaque-zero", opaque({'o', 0, 'p'})},
        {"opaque-empty", opaque({})},
        {"token-address", token(0x86)},
        {"token-auth", token(0x9A)},
        {"token-scheme", token(0x92)},
        {"token-call", token(0x94)},
        {"token-unknown", token(0xAB)},
        {"skipped", token(0x40) + token(0x41) + Value("in") + token(message::kEnd)},
        {"skipped-table", token(0x40) + tableString(0)},
        {"skipped-opaque", token(0x40) + opaque({'x'})},
        {"run-texts", Value("a") + Value("b") + tableString(0) + Value("c")},
        {"run-direct", Value("a") + token(0x85) + token(0x8B)},
        {"run-comma", Value("a") + token(0x9A) + token(0x9F) + Value("b")},
        {"run-hidden", Value("a") + token(0x95) + token(0x90) + Value("b")},
        {"run-refused", Value("a") + token(0xAB)},
        {"table-refused", tableString(200)},
        {"opaque-refused", Value(Bytes{message::kOpaque, 100, 'o'})},
    };
}

// The value wherever one may stand: a document for each place where it may be refused.
void addEncoding(const Encoding &encoding, std::vector<Document> *all)
{
    const auto add = [&](const std::string &place, auto fill) {
        Body body;
        fill(&body);
        all->push_back(document("value-" + place + '-' + encoding.name, body));
    };
    const Value &value = encoding.value;
    add("text", [&](Body *body) {
        body->characteristic(message::kPxLogical, [&] { body->parm(message::kName, value); });
    });
    add("list", [&](Body *body) {
        body->characteristic(message::kPxLogical, [&] {
            body->parm(message::kDomain, value).parm(message::kDomain, "behind");
        });
    });
    add("physical-domain", [&](Body *body) {
        body->characteristic(message::kPxLogical, [&] {
            body->characteristic(message::kPxPhysical,
                                 [&] { body->parm(message::kDomain, value); });
        });
    });
    add("named", [&](Body *body) {
        body->characteristic(Value("WI-FI"), [&] { body->parm(Value("NETSSID"), value); });
    });
    add("dropped", [&](Body *body) {
        body->characteristic(message::kApplication, [&] { body->parm(Value("X"), value); });
    });
    add("name", [&](Body *body) {
        body->characteristic(message::kVendorConfig, [&] { body->parm(value, "value"); });
    });
    add("comma", [&](Body *body) {
        body->characteristic(message::kApplication, [&] {
            body->characteristic(message::kAppAuth, [&] {
                body->parm(message::kAAuthType, token(0x91));
                body->parm([&] { body->bytes({kComma}).value(value); });
            });
        });
    });
    add("type", [&](Body *body) { body->characteristic(value, [] {}); });
}

// ---- Everything else

// The content of one APPAUTH.
Body appAuth(const Bytes &content)
{
    Body body;
    body.characteristic(message::kApplication, [&] {
        body.characteristic(message::kAppAuth, [&] { body.bytes(content); });
    });
    return body;
}

std::vector<Document> parmDocuments()
{
    const auto logical = [](const std::string &name, const Bytes &content) {
        Body body;
        body.characteristic(message::kPxLogical, [&] { body.bytes(content); });
        return document(name, body);
    };
    const Bytes switched = {message::kSwitchPage, 1, message::kSwitchPage, 0};
    Body one;
    one.parm(message::kName, "n");
    Body noValue;
    noValue.parm(message::kName).parm(message::kDomain).parm(message::kDomain, "d");
    Body repeated;
    repeated.parm(message::kName, "first").parm(message::kName, "second").parm(message::kName);
    Body pairs;
    pairs.parm([&] {
        for (const char *piece : {"a", "b", "c"}) {
            pairs.bytes({message::kDomain, message::kValue})
                .value(opaque({static_cast<uint8_t>(*piece)}));
        }
        pairs.bytes({message::kDomain});
    });
    Body several;
    several.parm([&] {
        several.bytes({message::kName, message::kValue}).value(token(0x85));
        several.bytes({message::kProxyId, message::kValue}).value(token(0xAB));
        several.bytes({message::kTrust});
    });
    Body pages;
    pages.parm([&] {
        pages.bytes(switched).bytes({message::kName}).bytes(switched);
        pages.bytes({message::kValue}).bytes({message::kSwitchPage, 0}).value("n");
    });
    std::vector<Document> all = {
        logical("parm", one.data()),
        logical("parm-without-value", noValue.data()),
        logical("parm-repeated", repeated.data()),
        logical("parm-pairs", pairs.data()),
        logical("parm-several", several.data()),
        logical("parm-pages", pages.data()),
        logical("parm-unknown", {message::kParm, 0x46, message::kEnd}),
        logical("parm-cut", {message::kParm, message::kDomain, message::kValue, message::kStrI}),
    };
    Body type;
    type.parm(message::kAAuthType, token(0x91));
    const Bytes comma = {message::kParm, kComma, 0x92, kComma,       message::kSwitchPage, 1,
                         0x93,           kComma, 0xAB, message::kEnd};
    const Bytes text = join({{message::kParm, kComma}, Value("t").bytes, {message::kEnd}});
    all.push_back(document("comma", appAuth(join({type.data(), comma, text, comma}))));
    all.push_back(document("comma-first", appAuth(join({text, comma}))));
    Body startPage;
    startPage.characteristic(message::kApplication, [&] {
        startPage.characteristic(message::kResource, [&] { startPage.parm(message::kStartPage); });
    });
    all.push_back(document("startpage", startPage));
    Body init;
    init.characteristic(message::kNapDef, [&] {
        init.parm(Value("INIT")).parm(Value("X"), "dropped").parm(message::kBearer, token(0xAB));
        init.parm(message::kBearer, "text");
    });
    all.push_back(document("init", init));
    Body addressType;
    addressType.characteristic(message::kNapDef, [&] {
        addressType.parm(message::kNapAddrType, opaque({0x89})).parm(message::kNapId, "n");
    });
    all.push_back(document("addrtype", addressType));
    return all;
}

std::vector<Document> elementDocuments()
{
    std::vector<Document> all;
    const auto add = [&](const char *name, auto fill) {
        Body body;
        fill(&body);
        all.push_back(document(name, body));
    };
    const auto nothing = [] {};
    add("nothing", [](Body *) {});
    add("elements-empty", [&](Body *body) {
        body->characteristic(message::kPxLogical, nothing);
        body->bytes({message::kCharacteristicTag, message::kEnd});
        body->bytes({message::kCharacteristicTag | message::kHasContent, message::kEnd});
        body->characteristic(message::kNapDef, nothing);
    });
    add("elements-texts", [&](Body *body) {
        body->inlineString("outside").page(1).page(0);
        body->characteristic(message::kPxLogical, [&] {
            body->inlineString("inside").page(1).page(0);
            body->characteristic(message::kPort, nothing).inlineString("between");
            body->characteristic(message::kPort, nothing).inlineString("last");
        });
    });
    add("elements-nested", [&](Body *body) {
        constexpr int kDepth = 5;
        for (int depth = 0; depth < kDepth; ++depth) {
            body->bytes(opened({0x51}));
            body->characteristic(message::kPort, [&] { body->parm(message::kPortNbr, "1"); });
        }
        body->bytes(Bytes(kDepth, message::kEnd));
    });
    add("elements-misfit", [&](Body *body) {
        body->characteristic(message::kPort, nothing);
        body->characteristic(message::kPxLogical, [&] {
            body->characteristic(message::kNapDef, nothing);
            body->characteristic(message::kPort, nothing);
        });
    });
    // Records of several kinds in one element, two of one kind; a TYPE that names nothing.
    add("elements-types", [&](Body *body) {
        body->bytes(opened({0x51, 0x55, 0x51, message::kSwitchPage, 0, 0x52}));
        body->parm(message::kPxAddr, "a").bytes({message::kEnd});
        body->bytes(opened(named("WI-FI"))).bytes({message::kEnd});
        body->bytes(opened(named("X"))).bytes({message::kEnd});
    });
    add("elements-clientidentities", [&](Body *body) {
        for (const char *id : {"c1", "c2"}) {
            body->characteristic(message::kClientIdentity,
                                 [&] { body->parm(message::kClientId, id); });
        }
        body->characteristic(message::kAccess, nothing);
    });
    // What is refused behind something good, at several depths.
    add("refused-nesting", [&](Body *body) {
        body->characteristic(message::kBootstrap, [&] {
            body->parm(message::kName, "b");
            body->characteristic(message::kPort, nothing);
        });
    });
    add("refused-deep", [&](Body *body) {
        body->bytes(opened({0x51})).parm(message::kName, "p").bytes(opened({0x52}));
        body->parm(message::kDomain, "d").characteristic(message::kPort, nothing);
        body->bytes(opened({0x53})).parm(message::kService, "s").bytes({0x3F});
    });
    add("refused-type", [&](Body *body) {
        body->characteristic(message::kNapDef, [&] { body->parm(message::kNapId, "n"); });
        body->bytes({kElement, 0x51, 0x4F});
    });
    return all;
}

std::vector<Document> pushDocuments()
{
    Body body;
    body.characteristic(message::kPxLogical, [&] { body.parm(message::kName, "n"); });
    const Bytes plain = message::document(body);
    const Bytes security = join({message::sec(0x80), message::mac("0123456789ABCDEF")});
    const Bytes text = message::cString("application/vnd.wap.connectivity-wbxml");
    std::vector<Document> all = {
        {"push-secured", message::push(plain, {.security = security})},
        {"push-text", message::push(plain, {.contentType = text, .security = security})},
        {"push-unquoted", message::push(plain, {.lengthQuote = false})},
        {"push-empty", message::push({})},
        {"push-unknown", message::push(plain, {.contentType = {0x81}})},
        {"push-other-pdu", message::push(plain, {.pduType = 0x07})},
        {"push-mac-refused",
         message::push(plain, {.security = message::mac(std::string(60, 'm'))})},
    };
    // Documents that are not a wap-provisioningdoc with a public identifier of one byte.
    const std::string type = "-//WAPFORUM//DTD PROV 1.0//EN";
    const auto add = [&](const char *name, const Bytes &bytes) {
        all.push_back({name, message::push(bytes)});
    };
    add("document-type-text",
        message::document(body, {.publicId = 0, .table = std::string_view(type)}));
    add("document-type-unknown", message::document(body, {.publicId = 5, .table = kTable}));
    add("document-bare", join({{0x03, 0x0B, 0x6A, 0}, body.data(), {message::kEnd}}));
    add("document-switch", {0x03, 0x0B, 0x6A, 0, message::kSwitchPage, 1});
    add("document-parm", {0x03, 0x0B, 0x6A, 0, message::kParmTag});
    add("document-end", {0x03, 0x0B, 0x6A, 0, message::kEnd});
    add("document-cut-table", {0x03, 0x0B, 0x6A, 9, 'a'});
    add("document-version-text", join({{0x03, 0x0B, 0x6A, 0, 0xC5, message::kVersion},
                                       Value("1.0").bytes,
                                       {message::kEnd},
                                       body.data(),
                                       {message::kEnd}}));
    return all;
}

// ---- Files

Bytes contentOf(const std::filesystem::path &path)
{
    std::ifstream file(path, std::ios::binary);
    return Bytes(std::istreambuf_iterator<char>(file), {});
}

std::vector<Document> filesIn(const std::string &folder, std::string_view extension)
{
    std::vector<Document> all;
    if (std::filesystem::is_directory(folder)) {
        for (const auto &entry : std::filesystem::directory_iterator(folder)) {
            if (entry.path().extension() == extension) {
                all.push_back({entry.path().string(), contentOf(entry.path())});
            }
        }
    }
    std::sort(all.begin(), all.end(),
              [](const Document &a, const Document &b) { return a.name < b.name; });
    return all;
}

} // namespace

std::vector<Document> smallDocuments()
{
    std::vector<Document> all;
    for (const Kind &kind : kinds()) {
        all.push_back(withKind(kind));
    }
    for (const Encoding &encoding : encodings()) {
        addEncoding(encoding, &all);
    }
    for (const auto &more : {parmDocuments(), elementDocuments(), pushDocuments()}) {
        all.insert(all.end(), more.begin(), more.end());
    }
    return all;
}

std::vector<Document> samples()
{
    return filesIn(OMACP_SAMPLES_DIR, ".push");
}

std::vector<Document> seeds()
{
    std::vector<Document> all = filesIn(OMACP_SEEDS_DIR "/body", "");
    for (Document &body : all) {
        body.message = message::push(body.message);
    }
    for (const char *folder : {"/push_header", "/session"}) {
        for (Document &seed : filesIn(std::string(OMACP_SEEDS_DIR) + folder, "")) {
            all.push_back(std::move(seed));
        }
    }
    return all;
}

} // namespace sweep
