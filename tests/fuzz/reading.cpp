// The body of a message: what its parameters, characteristics and document come to.
#include "reading.h"

#include "reading_value.h"

#include <bitset>
#include <vector>

namespace fuzz {

namespace {

bool has(std::string_view tokens, uint8_t token)
{
    return tokens.find(static_cast<char>(token)) != tokens.npos;
}

const Kind *findKind(uint8_t token, uint8_t page, const Text &name)
{
    for (const Kind &kind : kKinds) {
        if (kind.token == token && kind.pages[page] &&
            (token != kTypeText || name.own == kind.name)) {
            return &kind;
        }
    }
    return nullptr;
}

// A characteristic whose END has not been read.
struct Open {
    const Kind *kind = nullptr;   // of its last TYPE
    std::bitset<kKindCount> made; // the records that its TYPEs made
    std::bitset<256> texts;       // the single values that are there, by NAME token,
    std::bitset<12> listed;       // and by listed name
};

class BodyReader : ValueReader {
public:
    BodyReader(const uint8_t *bytes, std::size_t count) : ValueReader(bytes, count)
    {
        open.clear();
    }

    BodyReading read()
    {
        BodyReading reading;
        reading.result = size == 0 ? kBadArgument : document();
        reading.context = reading.result == kOk && list;
        reading.kept = kept;
        return reading;
    }

private:
    // ---- Parameters

    uint32_t single(Open *in, uint8_t token)
    {
        Text text;
        if (uint32_t result = pair(token, &text)) {
            return result;
        }
        // The text that was there stays allocated.
        kept += in->texts[token];
        in->texts[token] = text.own.has_value();
        if (in->kind == &kKinds[kResource] && token == kStartPage) {
            in->texts[token] = true;
        }
        return kOk;
    }

    uint32_t named(Open *in)
    {
        const Kind &kind = *in->kind;
        Text name;
        if (uint32_t result = attribute(kNameText)) {
            return result;
        }
        if (uint32_t result = content(&name)) {
            return result;
        }
        if (kind.names != Names::kStored && name.isEmpty()) {
            return kFailed;
        }
        uint8_t next = 0;
        if (!peek(&next)) {
            return kNoData;
        }
        const auto listed = std::find(kind.listed.begin(), kind.listed.end(), name.own);
        const bool stored = kind.names == Names::kStored ||
                            (kind.names != Names::kDropped && listed != kind.listed.end());
        const bool refused = kind.names == Names::kOthersRefused && !stored;
        if (next == kValue && !refused) {
            Text text;
            if (uint32_t result = value(&text)) {
                return result;
            }
            if (&kind == &kKinds[kWifi] || &kind == &kKinds[kVoWifi]) {
                const auto field = static_cast<std::size_t>(listed - kind.listed.begin());
                kept += in->listed[field];
                in->listed[field] = text.own.has_value();
            } else if (stored) {
                // No release of the tree lets go of it.
                kept += text.own.has_value();
            }
        }
        if (kind.names == Names::kStored) {
            kept += name.own.has_value();
        }
        return kOk;
    }

    uint32_t authType(Open *in)
    {
        Text text;
        if (in->texts[kAAuthType]) {
            text.own.emplace(); // what it says does not matter
        }
        const uint32_t result = comma(&text);
        in->texts[kAAuthType] = text.own.has_value();
        return result;
    }

    uint32_t parameter(Open *in, uint8_t token)
    {
        const Kind &kind = *in->kind;
        if (token == kNameText && kind.names != Names::kRefused) {
            return named(in);
        }
        if (has(kind.texts, token)) {
            return single(in, token);
        }
        if (has(kind.lists, token)) {
            const uint32_t result = listOfTexts(nullptr);
            const bool mayFail = &kind == &kKinds[kPxPhysical] && token == kDomain;
            return mayFail && result != kTooMuchText ? kOk : result;
        }
        if (token == kComma && &kind == &kKinds[kAppAuth]) {
            return authType(in);
        }
        return kUnknown;
    }

    uint32_t parm(Open *in)
    {
        if (!in->kind) {
            return kUnknown;
        }
        const bool afresh = in->kind == &kKinds[kAppAuth] || in->kind == &kKinds[kResource];
        uint8_t token = 0;
        if (uint32_t result = element(kParm, &token)) {
            return result;
        }
        for (;;) {
            bool there = peek(&token);
            while (there && token == kSwitchPage) {
                (void)switchPage();
                there = afresh ? peek(&token) : peekTag(&token);
            }
            if (!there) {
                return kNoData;
            }
            if (token == kEnd) {
                drop(1);
                return kOk;
            }
            if (uint32_t result = parameter(in, token)) {
                return result;
            }
        }
    }

    // ---- Characteristics

    void make(Open *in, const Kind *kind)
    {
        const auto index = static_cast<std::size_t>(kind - kKinds);
        // A record that is replaced stays allocated, and a ROAMING always does.
        kept += index == kRoaming || in->made[index];
        in->made[index] = true;
    }

    uint32_t attributes(Open *in)
    {
        Text name;
        uint8_t last = 0;
        for (;;) {
            uint8_t token = 0;
            if (!peek(&token)) {
                return kNoData;
            }
            if (token == kEnd) {
                drop(1);
                in->kind = findKind(last, page, name);
                return kOk;
            }
            last = token;
            uint32_t result = kOk;
            if (token == kSwitchPage) {
                result = switchPage();
            } else if (token == kTypeText) {
                drop(1);
                name = {};
                result = content(&name);
                if (const Kind *kind = findKind(token, page, name)) {
                    make(in, kind);
                }
            } else if (const Kind *kind = findKind(token, page, name)) {
                drop(1);
                make(in, kind);
            } else {
                result = kUnknown;
            }
            if (result != kOk) {
                return result;
            }
        }
    }

    // The start of a characteristic; one with content is opened.
    uint32_t enter(bool *opened)
    {
        uint8_t token = 0;
        if (uint32_t result = element(kCharacteristic, &token)) {
            return result;
        }
        *opened = token & kContentBit;
        if (!*opened) {
            return kOk;
        }
        open.emplace_back();
        return token & kAttributesBit ? attributes(&open.back()) : kOk;
    }

    // What stands in the innermost characteristic, up to a child that it takes or past its END.
    uint32_t inside(bool *child)
    {
        Open *in = &open.back();
        for (;;) {
            uint8_t tag = 0;
            if (!peekTag(&tag)) {
                return kNoData;
            }
            uint32_t result = kOk;
            switch (tag) {
            case kEnd:
                drop(1);
                *child = false;
                return kOk;
            case kCharacteristic:
                *child = true;
                return in->kind && in->kind->mayHaveChildren ? kOk : kUnknown;
            case kStrI:
                result = dropString();
                break;
            case kSwitchPage:
                drop(2);
                break;
            case kParm:
                result = parm(in);
                break;
            default:
                return kUnknown;
            }
            if (result != kOk) {
                return result;
            }
        }
    }

    uint32_t behindSibling(bool *another)
    {
        uint8_t tag = 0;
        if (!peekTag(&tag)) {
            return kNoData;
        }
        if (tag == kStrI) {
            if (uint32_t result = dropString()) {
                return result;
            }
            if (!peekTag(&tag)) {
                return kNoData;
            }
        }
        *another = tag != kEnd;
        return kOk;
    }

    // A run of characteristics with all that is nested in them, up to the END behind it.
    uint32_t run()
    {
        for (bool atStart = true;;) {
            bool complete = false;
            uint32_t result = kOk;
            if (atStart) {
                bool opened = false;
                result = enter(&opened);
                atStart = false;
                complete = !opened;
            } else {
                result = inside(&atStart);
                complete = !atStart;
                if (result == kOk && complete) {
                    open.pop_back();
                }
            }
            if (result == kOk && complete) {
                result = behindSibling(&atStart);
                if (result == kOk && !atStart && open.empty()) {
                    list = true;
                    return kOk;
                }
            }
            if (result != kOk) {
                return result;
            }
        }
    }

    // ---- The document

    uint32_t rootElement()
    {
        uint8_t token = 0;
        if (uint32_t result = element(kDocument, &token)) {
            return result;
        }
        if (!(token & kContentBit)) {
            return kOk;
        }
        if (token & kAttributesBit) {
            if (uint32_t result = versionAttributes()) {
                return result;
            }
        }
        for (;;) {
            uint8_t tag = 0;
            if (!peekTag(&tag)) {
                return kNoData;
            }
            uint32_t result = kOk;
            switch (tag) {
            case kEnd:
                return kOk;
            case kStrI:
                result = dropString();
                break;
            case kSwitchPage:
                drop(2);
                break;
            case kCharacteristic:
                result = run();
                break;
            default:
                return kUnknown;
            }
            if (result != kOk) {
                return result;
            }
        }
    }

    uint32_t document()
    {
        // A header that ends early is judged by what was read of it.
        uint32_t publicId = 0;
        (void)header(&publicId);
        const bool named = publicId == 0 && table && table->c_str() == kDocumentType;
        if (publicId != kProvisioning && !named) {
            return kWrongType;
        }
        uint8_t tag = 0;
        if (!peekTag(&tag)) {
            return kNoData;
        }
        switch (tag) {
        case kDocument:
            return rootElement();
        case kCharacteristic:
            return run();
        case kEnd:
        case kSwitchPage:
        case kParm:
            return kOk;
        default:
            return kUnknown;
        }
    }

    bool list = false; // the document has got one
    std::size_t kept = 0;

    static inline std::vector<Open> open; // innermost last
};

} // namespace

BodyReading readBody(const uint8_t *data, std::size_t size)
{
    return BodyReader(data, size).read();
}

} // namespace fuzz
