// The random choices that make a document.
#include "generate.h"

#include <string>

namespace fuzz {

namespace {

constexpr std::string_view kWords[] = {
    "",
    "a",
    "internet",
    "10.0.0.1",
    "w2",
    "143",
    "IPV4",
    "IPV6",
    "APN",
    "PAP",
    "CHAP",
    "MD5",
    "WTLS-SS",
    "APPSRV",
    "CLIENT",
    "client",
    "INIT",
    "FROM",
    "SEC",
    "MAC",
    "ROAMING",
    "WI-FI",
    "Vodafone VoWiFi",
    "ePDG FQDN",
    "\x85",
    "\x86x",
    "\x8D",
    "\xAB",
    "\xC3\xA4",
    "\xC3",
    "\xED\xA0",
    "\x01",
    "\x06\x03",
    ",",
    "http://proxy.example.com:8080/path?with=everything&that=a&value=may&hold",
};

constexpr std::string_view kContentTypes[] = {
    "\xB6"sv,
    "\xB5"sv,
    "\xC4"sv,
    "\xCE"sv,
    "\xC2"sv,
    "\x36"sv,
    "application/vnd.wap.connectivity-wbxml\0"sv,
    "application/vnd.wap.connectivity-xml\0"sv,
    "application/vnd.syncml.notification\0"sv,
    "application/vnd.syncml.ds.notification\0"sv,
    "application/vnd.syncml.dm+wbxml\0"sv,
    "Application/vnd.wap.connectivity-wbxml\0"sv,
    "application/vnd.wap.connectivity-wbxml"sv,
    "\x1F"sv,
    ""sv,
};

constexpr std::string_view kSecurityNames[] = {"\x91"sv, "SEC\0"sv, "sec\0"sv, "SE"sv, ""sv};
constexpr std::string_view kMacNames[] = {"\x92"sv, "MAC\0"sv, "mac\0"sv, "MA"sv, ""sv};

} // namespace

void append(Bytes *bytes, std::string_view text)
{
    bytes->insert(bytes->end(), text.begin(), text.end());
}

void append(Bytes *bytes, const Bytes &more)
{
    bytes->insert(bytes->end(), more.begin(), more.end());
}

std::string_view Generator::word()
{
    return random->pick(kWords);
}

// A tag with attributes and content, in a few cases without one of them.
uint8_t Generator::tag(uint8_t tag)
{
    const uint8_t content = tag == kParm ? 0 : kContentBit;
    const uint8_t flags = random->oneIn(40) ? static_cast<uint8_t>(random->byte() & 0xC0)
                                            : static_cast<uint8_t>(kAttributesBit | content);
    return tag | flags;
}

Bytes Generator::number(size_t about)
{
    switch (random->below(8)) {
    case 0:
        return {0x8F, 0xFF, 0xFF, 0xFF, 0x7F};
    case 1:
        return {0x8F, 0xFF, 0xFF, 0xFF, random->byte()};
    case 2:
        return {0x80, 0x80, 0x80, 0x80, 0x80, 0x01};
    case 3:
        return {0x80, 0x80, static_cast<uint8_t>(about & 0x7F)};
    case 4:
        return {random->byte()};
    default:
        break;
    }
    const size_t near = about + random->below(3) - (about ? 1 : 0);
    Bytes bytes = {static_cast<uint8_t>(near & 0x7F)};
    for (size_t rest = near >> 7; rest; rest >>= 7) {
        bytes.insert(bytes.begin(), static_cast<uint8_t>(0x80 | (rest & 0x7F)));
    }
    return bytes;
}

Bytes Generator::string()
{
    Bytes bytes;
    switch (random->below(8)) {
    case 0:
        bytes = {kStrT, static_cast<uint8_t>(random->below(40))};
        break;
    case 1:
        bytes = {kStrT};
        append(&bytes, number(30));
        break;
    default:
        bytes = {kStrI};
        append(&bytes, word());
        bytes.push_back(0);
        break;
    }
    return bytes;
}

Bytes Generator::value()
{
    Bytes bytes;
    switch (random->below(10)) {
    case 0: {
        const std::string_view text = word();
        bytes = {kOpaque, static_cast<uint8_t>(text.size())};
        append(&bytes, text);
        break;
    }
    case 1:
        bytes = {kOpaque};
        append(&bytes, number(random->below(8)));
        break;
    case 2:
        bytes = {random->byte()};
        break;
    case 3:
    case 4:
        for (size_t i = random->below(4); i > 0; --i) {
            bytes.push_back(random->pick(kValueTokens).token);
        }
        break;
    default:
        for (size_t i = 1 + random->below(2); i > 0; --i) {
            append(&bytes, string());
            if (random->oneIn(6)) {
                bytes.push_back(random->pick(kValueTokens).token);
            }
        }
        break;
    }
    return bytes;
}

Bytes Generator::page()
{
    constexpr uint8_t kPages[] = {0, 0, 0, 1, 1, 1, 2, 0x41, 0x80};
    return {kSwitchPage, random->pick(kPages)};
}

uint8_t Generator::token()
{
    switch (random->below(5)) {
    case 0:
        return static_cast<uint8_t>(kTypeText + random->below(kLastType - kTypeText + 2));
    case 1:
        return random->pick(kValueTokens).token;
    case 2: {
        constexpr uint8_t kGlobal[] = {kSwitchPage, kEnd,   kStrI,     kStrT,  kOpaque, kLiteral,
                                       kExtI0,      kValue, kNameText, kComma, 0x41,    0x81};
        return random->pick(kGlobal);
    }
    case 3: {
        const Kind &kind = random->pick(kKinds);
        const std::string_view tokens = kind.texts.empty() ? kind.lists : kind.texts;
        return tokens.empty() ? uint8_t{kNameText} : static_cast<uint8_t>(random->pick(tokens));
    }
    default:
        return random->byte();
    }
}

// NAME or TYPE as text: an inline string, in a few cases in pieces.
Bytes Generator::name(std::string_view text)
{
    Bytes bytes = {kStrI};
    if (!text.empty() && random->oneIn(12)) {
        const size_t half = random->below(text.size());
        append(&bytes, text.substr(0, half));
        bytes.insert(bytes.end(), {0, kStrI});
        text.remove_prefix(half);
    }
    append(&bytes, text);
    bytes.push_back(0);
    return bytes;
}

Bytes Generator::parm(const Kind &kind)
{
    Bytes bytes = {tag(kParm)};
    for (size_t pairs = random->oneIn(10) ? 2 : 1; pairs > 0; --pairs) {
        if (random->oneIn(16)) {
            append(&bytes, page());
        }
        const size_t names = kind.names == Names::kRefused ? 0 : 4;
        const size_t tokens = kind.texts.size() + kind.lists.size();
        const size_t chosen = random->below(tokens + names + 1);
        if (chosen < kind.texts.size()) {
            bytes.push_back(static_cast<uint8_t>(kind.texts[chosen]));
        } else if (chosen < tokens) {
            bytes.push_back(static_cast<uint8_t>(kind.lists[chosen - kind.texts.size()]));
        } else if (chosen < tokens + names || (names && random->oneIn(2))) {
            bytes.push_back(kNameText);
            const std::string_view listed = random->pick(kind.listed);
            append(&bytes, random->oneIn(8) ? value() : name(listed.empty() ? word() : listed));
        } else {
            bytes.push_back(token());
        }
        if (random->oneIn(16)) {
            append(&bytes, page());
        }
        if (!random->oneIn(10)) {
            bytes.push_back(kValue);
            if (random->oneIn(16)) {
                append(&bytes, page());
            }
            append(&bytes, value());
        }
        while (&kind == &kKinds[kAppAuth] && random->oneIn(3)) {
            bytes.push_back(kComma);
            append(&bytes, random->oneIn(4) ? Bytes{token()} : string());
        }
    }
    if (!random->oneIn(40)) {
        bytes.push_back(kEnd);
    }
    return bytes;
}

Bytes Generator::characteristic(int depth)
{
    return characteristic(random->pick(kKinds), depth);
}

Bytes Generator::characteristic(const Kind &kind, int depth)
{
    Bytes bytes = {tag(kCharacteristic)};
    do {
        if (!(kind.pages[0] && kind.pages[1]) || random->oneIn(12)) {
            append(&bytes, Bytes{kSwitchPage, static_cast<uint8_t>(kind.pages[0] ? 0 : 1)});
        }
        bytes.push_back(kind.token);
        if (kind.token == kTypeText) {
            append(&bytes, name(kind.name));
        }
    } while (random->oneIn(12));
    if (random->oneIn(40)) {
        append(&bytes, page());
    }
    bytes.push_back(kEnd);
    for (size_t i = random->below(6); i > 0; --i) {
        if (depth > 0 && !kind.children.empty() && random->oneIn(3)) {
            const auto child = static_cast<uint8_t>(random->pick(kind.children));
            append(&bytes, characteristic(kKinds[child], depth - 1));
        } else if (depth > 0 && random->oneIn(20)) {
            append(&bytes, characteristic(depth - 1));
        } else if (random->oneIn(20)) {
            append(&bytes, random->oneIn(2) ? page() : string());
        } else {
            append(&bytes, parm(kind));
        }
    }
    if (!random->oneIn(40)) {
        bytes.push_back(kEnd);
    }
    return bytes;
}

Bytes Generator::document()
{
    const bool named = random->oneIn(6);
    Bytes table;
    if (named) {
        append(&table, kDocumentType);
        table.push_back(0);
    }
    for (size_t i = random->below(4); i > 0; --i) {
        append(&table, word());
        table.push_back(0);
    }
    Bytes bytes = {0x03};
    append(&bytes, named ? Bytes{0, 0} : Bytes{0x0B});
    bytes.push_back(0x6A);
    if (random->oneIn(20) || table.size() > 0x7F) {
        append(&bytes, number(table.size()));
    } else {
        bytes.push_back(static_cast<uint8_t>(table.size()));
    }
    append(&bytes, table);
    const bool rooted = !random->oneIn(12);
    if (rooted) {
        append(&bytes, Bytes{tag(kDocument), kVersion10, kEnd});
    }
    for (size_t i = 1 + random->below(4); i > 0; --i) {
        append(&bytes, characteristic(3));
    }
    bytes.push_back(kEnd);
    return bytes;
}

Bytes Generator::pushHeader()
{
    Bytes headers;
    if (random->oneIn(2)) {
        headers = {0x1F, random->byte()};
    }
    append(&headers, random->pick(kContentTypes));
    if (random->oneIn(20)) {
        append(&headers, std::string(50 + random->below(30), 'x'));
        headers.push_back(0);
    }
    append(&headers, random->pick(kSecurityNames));
    headers.push_back(static_cast<uint8_t>(0x80 + random->below(5)));
    append(&headers, random->pick(kMacNames));
    append(&headers, std::string(random->oneIn(2) ? 40 : random->below(50), 'A'));
    headers.push_back(0);
    if (random->oneIn(8)) {
        headers.resize(random->below(headers.size() + 1));
    }
    const auto length = static_cast<uint8_t>(headers.size());
    Bytes bytes = {random->byte(), static_cast<uint8_t>(random->oneIn(30) ? random->byte() : 6),
                   random->oneIn(12) ? random->byte() : length};
    append(&bytes, headers);
    return bytes;
}

} // namespace fuzz
