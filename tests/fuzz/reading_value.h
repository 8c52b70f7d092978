// The bytes, numbers, texts, tokens and values of a body, for the reading of it.
#pragma once

#include "vocabulary.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace fuzz {

// Results of a decode.
constexpr uint32_t kOk = 0;
constexpr uint32_t kFailed = 1;
constexpr uint32_t kBadArgument = 2;
constexpr uint32_t kUnknown = 0x1005;
constexpr uint32_t kNoData = 0x1007;
constexpr uint32_t kWrongType = 0x100B;
constexpr uint32_t kTooMuchText = 0x100F;

// Text beyond both is too much for a message.
constexpr uint64_t kTextAlways = 8 << 20;
constexpr uint64_t kTextPerByte = 100;

constexpr uint32_t kUnreadTable = 0xFFFFFFFF;

inline bool isString(uint8_t token)
{
    return (token & 0x7F) == kStrI;
}

// The meaning of a value token; null for one that stands for no text.
inline const ValueToken *valueToken(uint8_t token)
{
    static const auto known = [] {
        std::array<const ValueToken *, 256> tokens = {};
        for (const ValueToken &value : kValueTokens) {
            tokens[value.token] = &value;
        }
        return tokens;
    }();
    return known[token];
}

// A text that is read.
struct Text {
    bool isEmpty() const { return !own || own->empty(); }

    std::optional<std::string> own;
    const std::string *before = nullptr; // the text that the first append continues
};

class ValueReader {
protected:
    ValueReader(const uint8_t *bytes, std::size_t count) : data(bytes), size(count) {}

    // ---- Bytes

    std::size_t left() const { return position < size ? size - position : 0; }

    bool peek(uint8_t *byte) const
    {
        if (left() == 0) {
            return false;
        }
        *byte = data[position];
        return true;
    }

    bool peekTag(uint8_t *tag) const
    {
        if (!peek(tag)) {
            return false;
        }
        *tag &= kTagBits;
        return true;
    }

    bool take(uint8_t *byte)
    {
        if (!peek(byte)) {
            return false;
        }
        ++position;
        return true;
    }

    void drop(int bytes)
    {
        uint8_t byte = 0;
        while (bytes-- > 0 && take(&byte)) {
        }
    }

    bool number(uint32_t *value)
    {
        uint32_t sum = 0;
        for (int i = 0; i < 5; ++i) {
            uint8_t byte = 0;
            if (!take(&byte)) {
                return false;
            }
            sum = (sum << 7) | (byte & 0x7FU);
            if (byte < 0x80) {
                *value = sum;
                return true;
            }
        }
        return false;
    }

    // ---- The header

    void readTable()
    {
        uint32_t length = 0;
        tableSize = kUnreadTable;
        if (!number(&length) || length > 0xFFFFFFFD) {
            return;
        }
        const std::size_t present = std::min<std::size_t>(length, left());
        table.emplace(reinterpret_cast<const char *>(data) + (present ? position : 0), present);
        table->append(2, '\0');
        position += present;
        if (present == length) {
            tableSize = length;
        }
    }

    uint32_t header(uint32_t *publicId)
    {
        uint8_t version = 0;
        uint32_t ignored = 0;
        if (!take(&version)) {
            return kNoData;
        }
        if (!number(publicId) || (*publicId == 0 && !number(&ignored)) || !number(&ignored)) {
            return kUnknown;
        }
        readTable();
        return kOk;
    }

    // ---- Text

    // False once there is too much.
    bool count(std::size_t bytes)
    {
        textRead += bytes;
        tooMuch = tooMuch || (textRead > kTextAlways && textRead > kTextPerByte * size);
        return !tooMuch;
    }

    // Bytes are counted whether they are seen or not: a text ends at its first NUL.
    bool append(Text *text, std::string_view more, std::size_t counted)
    {
        if (!count(counted) || (!text->own && text->before && !count(text->before->size()))) {
            return false;
        }
        if (!text->own) {
            text->own = text->before ? *text->before : "";
        }
        text->own->append(more.substr(0, more.find('\0')));
        return true;
    }

    bool append(Text *text, std::string_view more) { return append(text, more, more.size()); }

    bool inlineString(Text *text)
    {
        const char *start = left() ? reinterpret_cast<const char *>(data) + position : "";
        const std::size_t length = left() ? strnlen(start, left()) : 0;
        if (!append(text, {start, length})) {
            return false;
        }
        position += length + 1;
        return true;
    }

    bool tableString(Text *text)
    {
        uint32_t index = 0;
        if (!number(&index) || !table || tableSize == kUnreadTable ||
            index >= (tableSize ? tableSize : table->size())) {
            return false;
        }
        return append(text, table->c_str() + index);
    }

    bool opaque(Text *text)
    {
        uint32_t length = 0;
        if (!number(&length) || length > left()) {
            return false;
        }
        const char *start = length ? reinterpret_cast<const char *>(data) + position : "";
        if (!append(text, {start, length})) {
            return false;
        }
        position += length;
        return true;
    }

    void join(Text *text, const ValueToken &value)
    {
        const bool first = !text->own && !text->before;
        if (first || value.join == Join::kBehind) {
            (void)append(text, value.text);
        } else if (value.join == Join::kComma) {
            (void)append(text, "," + std::string(value.text));
        } else {
            (void)append(text, "", value.text.size() + 1);
        }
    }

    // Strings and value tokens up to an END or a VALUE.
    bool stringRun(Text *text)
    {
        for (;;) {
            uint8_t token = 0;
            if (!peek(&token)) {
                return false;
            }
            if (token == kEnd || token == kValue) {
                return true;
            }
            ++position;
            const ValueToken *value = valueToken(token);
            if (value) {
                join(text, *value);
            } else if (!(token == kStrI && inlineString(text)) &&
                       !(token == kStrT && tableString(text))) {
                return false;
            }
        }
    }

    uint32_t anyValue(Text *text)
    {
        uint8_t token = 0;
        if (!take(&token)) {
            return kNoData;
        }
        if (isString(token)) {
            --position;
            return stringRun(text) ? kOk : kNoData;
        }
        if (token == kOpaque) {
            return opaque(text) ? kOk : kNoData;
        }
        if (const ValueToken *value = valueToken(token)) {
            join(text, *value);
        } else if (token >= 0x80) {
            text->own = std::string(1, static_cast<char>(token));
        } else {
            --position;
            return skip();
        }
        return kOk;
    }

    uint32_t content(Text *text)
    {
        const uint32_t result = anyValue(text);
        return tooMuch ? kTooMuchText : result;
    }

    uint32_t dropString()
    {
        Text dropped;
        return inlineString(&dropped) ? kOk : kTooMuchText;
    }

    // What a value token that stands for nothing makes the reader do.
    uint32_t skip()
    {
        for (int64_t depth = 0;;) {
            uint8_t token = 0;
            if (!take(&token)) {
                return kNoData;
            }
            if (token == kSwitchPage) {
                drop(1);
            } else if (token == kEnd) {
                if (--depth == 0) {
                    --position;
                    return kOk;
                }
            } else if (isString(token) || token == kOpaque) {
                --position;
                Text scratch;
                if (uint32_t result = content(&scratch)) {
                    return result;
                }
            } else {
                ++depth;
            }
        }
    }

    // ---- Tokens

    // An element of the given tag; an empty one takes an END that follows with it.
    uint32_t element(uint8_t tag, uint8_t *token)
    {
        if (!take(token)) {
            return kNoData;
        }
        if ((*token & kTagBits) != tag) {
            return kUnknown;
        }
        uint8_t next = 0;
        if (!(*token & kContentBit) && peekTag(&next) && next == kEnd) {
            drop(1);
        }
        return kOk;
    }

    uint32_t attribute(uint8_t expected)
    {
        uint8_t token = 0;
        if (!take(&token)) {
            return kNoData;
        }
        return token == expected ? kOk : kUnknown;
    }

    uint32_t version()
    {
        uint8_t token = 0;
        if (!take(&token)) {
            return kNoData;
        }
        return token == kVersionText || token == kVersion10 ? kOk : kUnknown;
    }

    // Up to and with what ends the attributes of the document.
    uint32_t skipAttributes()
    {
        uint8_t token = 0;
        while (take(&token)) {
            if (token == kEnd || token == kLiteral || token == kExtI0) {
                return kOk;
            }
        }
        return kNoData;
    }

    uint32_t versionAttributes()
    {
        if (uint32_t result = version()) {
            return result;
        }
        uint8_t next = 0;
        if (!peekTag(&next)) {
            return kNoData;
        }
        if (next != kEnd && next != kStrI) {
            return kUnknown;
        }
        (void)skipAttributes();
        return kOk;
    }

    uint32_t switchPage()
    {
        uint8_t number = 0;
        if (!take(&number) || !take(&number) || (number & kTagBits) > 1) {
            return kUnknown;
        }
        page = number & kTagBits;
        return kOk;
    }

    // ---- Parameters

    // VALUE and what follows it.
    uint32_t value(Text *text)
    {
        if (uint32_t result = attribute(kValue)) {
            return result;
        }
        uint8_t next = 0;
        if (!peek(&next)) {
            return kNoData;
        }
        if (next == kSwitchPage) {
            (void)switchPage();
            if (!peekTag(&next)) {
                return kNoData;
            }
        }
        return next == kEnd ? kOk : content(text);
    }

    // NAME, and its value if there is one.
    uint32_t pair(uint8_t token, Text *text)
    {
        if (uint32_t result = attribute(token)) {
            return result;
        }
        uint8_t next = 0;
        if (!peek(&next)) {
            return kNoData;
        }
        switch (next) {
        case kEnd:
            return kOk;
        case kSwitchPage:
            (void)switchPage();
            return value(text);
        case kValue:
            return value(text);
        default:
            return kUnknown;
        }
    }

    // Values of a list up to the END behind them, which are put into `items` if that is given.
    uint32_t listOfTexts(std::vector<std::string> *items)
    {
        std::optional<std::string> last;
        for (;;) {
            uint8_t token = 0;
            if (!peek(&token)) {
                return kNoData;
            }
            if (token == kEnd) {
                return kOk;
            }
            Text text;
            text.before = last ? &*last : nullptr;
            if (uint32_t result = pair(token, &text)) {
                return result;
            }
            if (text.own && items) {
                items->push_back(*text.own);
            }
            if (text.own) {
                last = std::move(text.own);
            }
        }
    }

    // One more value for a text, behind a token that stands for a comma.
    uint32_t comma(Text *text)
    {
        uint8_t token = 0;
        if (!take(&token) || !peek(&token)) {
            return kNoData;
        }
        const bool switched = token == kSwitchPage;
        if (switched) {
            (void)switchPage();
            if (!peek(&token)) {
                return kNoData;
            }
        }
        if (!switched && isString(token)) {
            return append(text, ",") ? content(text) : kTooMuchText;
        }
        if (const ValueToken *known = valueToken(token)) {
            join(text, *known);
        }
        drop(1);
        return tooMuch ? kTooMuchText : kOk;
    }

    const uint8_t *data;
    std::size_t size;
    std::size_t position = 0;
    uint8_t page = 0;
    std::optional<std::string> table;
    uint32_t tableSize = 0;
    uint64_t textRead = 0;
    bool tooMuch = false;
};

} // namespace fuzz
