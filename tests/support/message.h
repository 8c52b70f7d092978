// Builds pushed provisioning messages for the tests: one call per element of the document.
// Nothing here comes from the library, so a test compares two independent readings of the format.
#pragma once

#include "message_tokens.h"

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

namespace message {

using Bytes = std::vector<uint8_t>;
using Fill = std::function<void()>; // writes what stands inside an element

// join: the parts, one behind the other.
inline Bytes join(std::initializer_list<Bytes> parts)
{
    Bytes out;
    for (const Bytes &part : parts) {
        out.insert(out.end(), part.begin(), part.end());
    }
    return out;
}

// cString: a text and its terminator.
inline Bytes cString(std::string_view text)
{
    return join({Bytes(text.begin(), text.end()), {0}});
}

// mbUint32: a number in groups of seven bits, the highest first, each but the last marked 0x80.
inline Bytes mbUint32(uint32_t number)
{
    Bytes out{static_cast<uint8_t>(number & 0x7F)};
    while (number >>= 7) {
        out.insert(out.begin(), static_cast<uint8_t>(0x80 | (number & 0x7F)));
    }
    return out;
}

// A value as it stands behind VALUE: a plain text is an inline string.
struct Value {
    Value(const char *text) : bytes(join({{kStrI}, cString(text)})) {}
    Value(const std::string &text) : bytes(join({{kStrI}, cString(text)})) {}
    explicit Value(Bytes as) : bytes(std::move(as)) {}

    // Puts another part behind this one: one value may mix strings and tokens.
    Value operator+(const Value &next) const { return Value(join({bytes, next.bytes})); }

    Bytes bytes;
};

// token: a value token, such as 0xAB for GSM-GPRS.
inline Value token(uint8_t value)
{
    return Value(Bytes{value});
}

// tableString: the text that starts `index` bytes into the string table.
inline Value tableString(uint32_t index)
{
    return Value(join({{kStrT}, mbUint32(index)}));
}

// opaque: length and data.
inline Value opaque(const Bytes &data)
{
    return Value(join({{kOpaque}, mbUint32(static_cast<uint32_t>(data.size())), data}));
}

// A run of elements. Calls add at the end and return the body, so that they can be chained:
//   Body body;
//   body.characteristic(kPxLogical, [&] { body.parm(kProxyId, "p1"); });
class Body {
public:
    // A characteristic with content; the page that its TYPE needs is switched to before the TYPE.
    Body &characteristic(Type type, const Fill &children)
    {
        return element(
            kCharacteristicTag,
            [&] {
                if ((type & kAnyPage) == 0 && type >> 8 != page_) {
                    page(static_cast<uint8_t>(type >> 8));
                }
                bytes({static_cast<uint8_t>(type)});
            },
            children);
    }

    // A characteristic whose TYPE is given as text, or as any other value.
    Body &characteristic(const Value &type, const Fill &children)
    {
        return element(
            kCharacteristicTag, [&] { bytes({kTypeText}).value(type); }, children);
    }

    // A parm whose NAME is a token, without and with a VALUE. Its token is taken on either page, so
    // none is switched to; for a switch inside the parm, write the attributes yourself.
    Body &parm(Attribute name) { return bytes({kParm, name, kEnd}); }
    Body &parm(Attribute name, const Value &content)
    {
        return bytes({kParm, name, kValue}).value(content).bytes({kEnd});
    }

    // A parm whose NAME is given as text, or as any other value.
    Body &parm(const Value &name) { return bytes({kParm, kNameText}).value(name).bytes({kEnd}); }
    Body &parm(const Value &name, const Value &content)
    {
        return bytes({kParm, kNameText}).value(name).bytes({kValue}).value(content).bytes({kEnd});
    }

    // A parm with any attributes: parm([&] { body.page(1).bytes({kAppId, kValue}).value("w2"); }).
    Body &parm(const Fill &attributes)
    {
        bytes({kParm});
        attributes();
        return bytes({kEnd});
    }

    // An element with attributes and content, both closed.
    Body &element(uint8_t tag, const Fill &attributes, const Fill &children)
    {
        bytes({static_cast<uint8_t>(tag | kHasAttributes | kHasContent)});
        attributes();
        bytes({kEnd});
        children();
        return bytes({kEnd});
    }

    // A switch to a code page, and the two bytes of it as they stand.
    Body &page(uint8_t number)
    {
        page_ = number;
        return bytes({kSwitchPage, number});
    }

    Body &value(const Value &content) { return bytes(content.bytes); }
    Body &inlineString(const std::string &text) { return value(Value(text)); }

    Body &bytes(const Bytes &more)
    {
        data_.insert(data_.end(), more.begin(), more.end());
        return *this;
    }

    const Bytes &data() const { return data_; }

private:
    Bytes data_;
    int page_ = 0;
};

// What stands in front of the document element.
struct Header {
    uint8_t version = 0x03;   // WBXML 1.3
    uint32_t publicId = 0x0B; // 0: the identifier stands in the string table, at publicIdIndex
    uint32_t publicIdIndex = 0;
    uint32_t charset = 0x6A; // UTF-8
    std::string_view table;  // the string table, terminators included
};

// document: a WBXML body, the header and a wap-provisioningdoc of version 1.0 around `content`.
inline Bytes document(const Body &content, const Header &header = {})
{
    Body root;
    root.element(
        kDocumentTag, [&] { root.bytes({kVersion1_0}); }, [&] { root.bytes(content.data()); });
    return join({
        {header.version},
        mbUint32(header.publicId),
        header.publicId == 0 ? mbUint32(header.publicIdIndex) : Bytes{},
        mbUint32(header.charset),
        mbUint32(static_cast<uint32_t>(header.table.size())),
        Bytes(header.table.begin(), header.table.end()),
        root.data(),
    });
}

// The header of a WSP push.
struct PushOptions {
    uint8_t tid = 0x01;
    uint8_t pduType = 0x06;     // Push
    bool lengthQuote = true;    // 0x1F and the length, in front of the content type
    Bytes contentType = {0xB6}; // or a text with its terminator
    Bytes security = {};        // SEC and MAC, see sec() and mac()
    Bytes moreHeaders = {};     // headers behind the content type
};

// sec: the security method as a parameter of the content type, 0x80 NETWPIN to 0x83 USERPINMAC.
inline Bytes sec(uint8_t method)
{
    return {0x91, method};
}

// mac: the message authentication code, as text with its terminator.
inline Bytes mac(std::string_view text)
{
    return join({{0x92}, cString(text)});
}

// push: a pushed message, the WSP header in front of `body`.
inline Bytes push(const Bytes &body, const PushOptions &options = {})
{
    const Bytes type = join({options.contentType, options.security});
    Bytes quote;
    if (options.lengthQuote) {
        quote = {0x1F, static_cast<uint8_t>(type.size())};
    }
    const Bytes headers = join({quote, type, options.moreHeaders});
    const uint8_t length = static_cast<uint8_t>(headers.size());
    return join({{options.tid, options.pduType, length}, headers, body});
}

} // namespace message
