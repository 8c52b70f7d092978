// The push header parser. It knows exactly the layouts below: any other header is skipped unread.
#include "qvspushhandler.h"

#include "qvsmemory.h"
#include "qvsstring.h"

#include <string.h>

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvspushhandler";

constexpr uint8_t kPush = 0x06;
constexpr uint8_t kLengthQuote = 0x1F; // the length of the content type value follows in one byte

// Offsets in a message.
constexpr uint32_t kPduType = 1;
constexpr uint32_t kHeadersLen = 2;
constexpr uint32_t kHeaders = 3;
constexpr uint32_t kQuotedContentType = 5; // behind Length-quote and length

struct ContentType {
    uint8_t code;
    const char *name;
};

constexpr ContentType kContentTypes[] = {
    {54, "application/vnd.wap.connectivity-wbxml"}, {53, "application/vnd.wap.connectivity-xml"},
    {68, "application/vnd.syncml.notification"},    {78, "application/vnd.syncml.ds.notification"},
    {66, "application/vnd.syncml.dm+wbxml"},
};

// A parameter of the content type: a well-known token, or its name as a text.
struct Parameter {
    uint8_t token;
    const char *name; // three letters
};

constexpr Parameter kSec = {0x91, "SEC"};
constexpr Parameter kMac = {0x92, "MAC"};

constexpr uint32_t kNameLength = 3;

// What has not been read yet of a message. Nothing behind its last byte is ever looked at.
struct Rest {
    const uint8_t *at;
    uint32_t length;

    Rest behind(uint32_t count) const { return {at + count, length - count}; }
};

// The media type whose name, with its NUL, stands next; null when that is none of them.
const ContentType *contentTypeNamed(const Rest &rest)
{
    for (const ContentType &type : kContentTypes) {
        const uint32_t size = qvsStrlen(type.name) + 1;
        // hardened: a name that does not end within the message is none.
        if (size <= rest.length && qvsMemCmp(rest.at, type.name, size) == 0) {
            return &type;
        }
    }
    return nullptr;
}

const ContentType *contentTypeOf(uint8_t code)
{
    for (const ContentType &type : kContentTypes) {
        if (type.code == code) {
            return &type;
        }
    }
    return nullptr;
}

// Reads the content type into *code and goes behind it: a name, or else a short code.
bool readContentType(Rest *rest, uint32_t *code)
{
    // hardened: a message that ends here has no content type.
    if (rest->length == 0) {
        return false;
    }
    const ContentType *type = contentTypeNamed(*rest);
    uint32_t taken = 1;
    if (type) {
        taken = qvsStrlen(type->name) + 1;
    } else {
        // kept[push-short-form]: a short code needs no high bit, and a text that is no name may
        // begin with one.
        type = contentTypeOf(*rest->at & 0x7F);
    }
    if (!type) {
        return false;
    }
    *code = type->code;
    *rest = rest->behind(taken);
    return true;
}

// Goes to the value of the parameter, if that is what comes next.
bool findValue(Rest *rest, const Parameter &parameter)
{
    constexpr uint32_t kBehindName = kNameLength + 1; // the NUL of the name is not looked at
    const char *name = reinterpret_cast<const char *>(rest->at);
    uint32_t taken = 0;
    // hardened: a parameter whose value would start behind the message is absent.
    if (rest->length > 1 && *rest->at == parameter.token) {
        taken = 1;
    } else if (rest->length > kBehindName && qvsStrnicmp(name, parameter.name, kNameLength) == 0) {
        taken = kBehindName;
    }
    *rest = rest->behind(taken);
    return taken != 0;
}

// Reads the security parameters.
// kept[push-order]: SEC is looked for once, MAC once behind it; any other order and any header
// between them hides what follows.
bool readSecurity(Rest rest, smlpushHdlrInfo *info)
{
    if (findValue(&rest, kSec)) {
        info->nSec = *rest.at;
        rest = rest.behind(1);
    }
    if (findValue(&rest, kMac)) {
        // hardened: a MAC that does not end within the message, or does not fit, is refused.
        const uint32_t bytes = rest.length < SMLPUSH_MAC_SIZE ? rest.length : SMLPUSH_MAC_SIZE;
        const void *end = memchr(rest.at, '\0', bytes);
        if (!end) {
            return false;
        }
        info->nMacLen = static_cast<uint32_t>(static_cast<const uint8_t *>(end) - rest.at);
        memcpy(info->szMac, rest.at, info->nMacLen);
    }
    return true;
}

// Copies the body, with a zero byte behind it.
bool copyBody(const Rest &body, smlpushHdlrInfo *info)
{
    info->pBody = static_cast<uint8_t *>(qvsMemAlloc_debug(body.length + 1, kModule, __LINE__));
    // hardened: without memory for the body there is no record.
    if (!info->pBody) {
        return false;
    }
    // A call: code compiled for size has a loop of its own for memcpy.
    qvsMemCpy(info->pBody, body.at, body.length);
    info->pBody[body.length] = 0;
    info->nBodyLen = body.length;
    return true;
}

} // namespace

smlpushHdlrInfo *smlpushHdlrParsingWSPHeader(const uint8_t *message, uint32_t length)
{
    // hardened: a message without a first header byte is refused, and so is one that is shorter
    // than its headers.
    if (!message || length <= kHeaders || message[kPduType] != kPush ||
        length - kHeaders < message[kHeadersLen]) {
        return nullptr;
    }
    smlpushHdlrInfo *info = qvs::newRecord<smlpushHdlrInfo>(kModule);
    if (!info) {
        return nullptr;
    }
    // kept[push-headers-length]: the length of the headers is one byte, and alone finds the body.
    info->nHeaderLen = message[kHeadersLen];
    const Rest all = {message, length};
    Rest rest = all.behind(kHeaders);
    if (*rest.at == kLengthQuote) {
        // kept[push-quoted-length]: the length behind Length-quote is skipped unread.
        const uint32_t quoted = kQuotedContentType - kHeaders;
        rest = rest.behind(quoted < rest.length ? quoted : rest.length);
    }
    if (!readContentType(&rest, &info->nContentType) || !readSecurity(rest, info) ||
        !copyBody(all.behind(kHeaders + info->nHeaderLen), info)) {
        qvs::releasePushHeader(info);
        return nullptr;
    }
    return info;
}

void qvs::releasePushHeader(smlpushHdlrInfo *info)
{
    if (info) {
        qvsMemFree_debug(info->pBody);
        qvsMemFree_debug(info);
    }
}
