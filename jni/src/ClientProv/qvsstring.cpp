// Byte strings over the C library's, with their own rules where they differ; 16-bit strings; dump.
#include "qvsstring.h"

#include <stddef.h>
#include <string.h>

namespace {

constexpr unsigned char byteOf(char c)
{
    return static_cast<unsigned char>(c);
}

constexpr unsigned char same(unsigned char byte)
{
    return byte;
}

constexpr unsigned char lower(unsigned char byte)
{
    return byte >= 'A' && byte <= 'Z' ? static_cast<unsigned char>(byte + 'a' - 'A') : byte;
}

// The difference of the first differing bytes within `n`, each taken through `fold`.
template <auto fold>
int difference(const char *a, const char *b, size_t n)
{
    for (size_t i = 0; i < n; ++i) {
        const unsigned char left = fold(byteOf(a[i]));
        const unsigned char right = fold(byteOf(b[i]));
        if (left != right || left == 0) {
            return left - right;
        }
    }
    return 0;
}

constexpr int sign(int value)
{
    return (value > 0) - (value < 0);
}

// Delimiters of qvsStrtok, one bit per byte.
struct ByteSet {
    explicit ByteSet(const char *bytes)
    {
        for (; *bytes; ++bytes) {
            bits[byteOf(*bytes) / 8] |= static_cast<uint8_t>(1U << byteOf(*bytes) % 8);
        }
    }

    bool has(char c) const { return (bits[byteOf(c) / 8] >> byteOf(c) % 8 & 1U) != 0; }

    uint8_t bits[32] = {};
};

char *nextToken; // where qvsStrtok goes on; null before the first text

} // namespace

uint32_t qvsStrlen(const char *s)
{
    return s ? static_cast<uint32_t>(strlen(s)) : 0;
}

char *qvsStrcpy(char *dst, const char *src)
{
    return strcpy(dst, src);
}

char *qvsStrcat(char *dst, const char *src)
{
    return strcat(dst, src);
}

char *qvsStrncpy(char *dst, const char *src, uint32_t n)
{
    return strncpy(dst, src, n);
}

char *qvsStrncat(char *dst, const char *src, uint32_t n)
{
    char *end = dst + strlen(dst);
    // kept[strncat-zero]: the count is looked at behind the first byte, so that 0 appends all.
    // kept[strncat-unterminated]: no terminator is written when the count ends the copy.
    while ((*end++ = *src++) != '\0' && --n != 0) {
    }
    return dst;
}

int qvsStrcmp(const char *a, const char *b)
{
    return sign(strcmp(a, b));
}

int qvsStrncmp(const char *a, const char *b, uint32_t n)
{
    return difference<same>(a, b, n);
}

int qvsStricmp(const char *a, const char *b)
{
    return difference<lower>(a, b, SIZE_MAX);
}

int qvsStrnicmp(const char *a, const char *b, uint32_t n)
{
    return difference<lower>(a, b, n);
}

char *qvsStrchr(const char *s, int c)
{
    return const_cast<char *>(strchr(s, c));
}

char *qvsStrrchr(const char *s, int c)
{
    if (!s) {
        return nullptr;
    }
    // kept[strrchr-first]: the first position is never looked at.
    for (size_t i = strlen(s); i > 0; --i) {
        if (byteOf(s[i]) == static_cast<unsigned char>(c)) {
            return const_cast<char *>(s + i);
        }
    }
    return nullptr;
}

char *qvsStrstr(const char *haystack, const char *needle)
{
    // hardened: a null needle is not found.
    // kept[strstr-empty-needle]: nor is an empty one.
    if (!haystack || !needle || *needle == '\0') {
        return nullptr;
    }
    return const_cast<char *>(strstr(haystack, needle));
}

char *qvsStristr(const char *haystack, const char *needle)
{
    // hardened: null is not found, nor anything in null.
    if (!haystack || !needle) {
        return nullptr;
    }
    const size_t length = strlen(needle);
    if (length == 0) {
        return const_cast<char *>(haystack);
    }
    for (; *haystack; ++haystack) {
        if (difference<lower>(haystack, needle, length) == 0) {
            return const_cast<char *>(haystack);
        }
    }
    return nullptr;
}

char *qvsStrsplit(const char *src, int delim, char *out)
{
    if (!src || *src == '\0') {
        return nullptr;
    }
    while (*src && byteOf(*src) != static_cast<unsigned char>(delim)) {
        *out++ = *src++;
    }
    *out = '\0';
    return const_cast<char *>(*src ? src + 1 : src);
}

char *qvsStrtok(char *str, const char *delims)
{
    const ByteSet set(delims);
    char *token = str ? str : nextToken;
    // hardened: no token before the first text.
    if (!token) {
        return nullptr;
    }
    while (*token && set.has(*token)) {
        ++token;
    }
    char *end = token;
    while (*end && !set.has(*end)) {
        ++end;
    }
    nextToken = end;
    if (*end) {
        *end = '\0';
        nextToken = end + 1;
    }
    return end != token ? token : nullptr;
}

char *qvsStrWhiteSpaceSkip(const char *s)
{
    while (*s == ' ' || *s == '\t') {
        ++s;
    }
    return const_cast<char *>(s);
}

long qvsStrAtol(const char *s)
{
    bool negative = false;
    for (; *s == '+' || *s == '-' || byteOf(*s) <= ' '; ++s) {
        if (*s == '\0') {
            return 0;
        }
        // kept[atol-signs]: each minus sign turns the sign round.
        negative = negative != (*s == '-');
    }
    // kept[atol-overflow]: the digits run over, modulo the type.
    unsigned long value = 0;
    for (; *s >= '0' && *s <= '9'; ++s) {
        value = value * 10 + static_cast<unsigned long>(*s - '0');
    }
    return static_cast<long>(negative ? 0 - value : value);
}

int qvsStrAtoi(const char *s)
{
    return static_cast<int>(qvsStrAtol(s));
}

char *qvsStrLtoa(long v, char *buf, uint32_t base)
{
    char *p = buf;
    auto magnitude = static_cast<unsigned long>(v);
    if (v < 0) {
        *p++ = '-';
        magnitude = 0 - magnitude;
    }
    qvsStrDoNtoS(magnitude, &p, base);
    *p = '\0';
    return buf;
}

char *qvsStrItoa(long v, char *buf, uint32_t base)
{
    return qvsStrLtoa(v, buf, base);
}

void qvsStrDoNtoS(unsigned long v, char **p, uint32_t base)
{
    // hardened: there are no digits to a base below 2.
    if (base < 2) {
        return;
    }
    unsigned long scale = 1;
    while (v / scale >= base) {
        scale *= base;
    }
    for (; scale != 0; scale /= base) {
        const unsigned long digit = v / scale % base;
        const unsigned long character = digit > 9 ? 'a' + (digit - 10) : '0' + digit;
        *(*p)++ = static_cast<char>(character & 0x7F);
    }
}

char qvsStrToHexChar(int n)
{
    return n >= 0 && n <= 15 ? "0123456789ABCDEF"[n] : '?';
}

uint32_t qvsCharToHex(uint8_t c)
{
    if (c >= '0' && c <= '9') {
        return c - uint32_t{'0'};
    }
    if (c >= 'A' && c <= 'F') {
        return c - uint32_t{'A'} + 10;
    }
    if (c >= 'a' && c <= 'f') {
        return c - uint32_t{'a'} + 10;
    }
    return 0;
}

uint32_t qvsStrIsSpace(uint8_t c)
{
    return c == ' ' || (c >= 9 && c <= 13);
}

uint32_t qvsStrIsAscii(uint8_t c)
{
    return c >= 0x20 && c <= 0x7E;
}

uint32_t qvsStrIsCntrl(uint8_t c)
{
    return c < 0x20 || c == 0x7F;
}

uint32_t qvsStrlenW(const uint16_t *s)
{
    return s ? qvsStrlenUcs(s) : 0;
}

uint32_t qvsStrlenUcs(const uint16_t *s)
{
    uint32_t length = 0;
    while (s[length]) {
        ++length;
    }
    return length;
}

uint16_t *qvsStrcpyW(uint16_t *dst, const uint16_t *src)
{
    memcpy(dst, src, (size_t{qvsStrlenUcs(src)} + 1) * sizeof(uint16_t));
    return dst;
}

uint16_t *qvsStrcatW(uint16_t *dst, const uint16_t *src)
{
    qvsStrcpyW(dst + qvsStrlenUcs(dst), src);
    return dst;
}

uint16_t *qvsStrncpyW(uint16_t *dst, const uint16_t *src, uint32_t n)
{
    for (uint32_t i = 0; i < n; ++i) {
        dst[i] = src[i];
        if (src[i] == 0) {
            break;
        }
    }
    return dst;
}

uint16_t *qvsStrchrW(const uint16_t *s, uint16_t c)
{
    for (; *s != c; ++s) {
        if (*s == 0) {
            return nullptr;
        }
    }
    return const_cast<uint16_t *>(s);
}

int qvsStrcmpW(const uint16_t *a, const uint16_t *b)
{
    while (*a == *b && *a != 0) {
        ++a;
        ++b;
    }
    // kept[strcmpw-wraps]: units that lie 0x8000 or more apart compare the other way round.
    return sign(static_cast<int16_t>(*a - *b));
}

uint32_t qvsStrAsciiToUcs2(uint16_t *dst, const char *src, uint32_t n)
{
    for (uint32_t i = 0; i < n; ++i) {
        dst[i] = byteOf(src[i]);
    }
    dst[n] = 0;
    return 1;
}

uint32_t qvsStrUcsToAscii(char *dst, const uint16_t *src, uint32_t n)
{
    for (uint32_t i = 0; i < n; ++i) {
        dst[i] = static_cast<char>(src[i] & 0xFF);
    }
    dst[n] = '\0';
    return 1;
}

char *qvs::dumpLine(char *out, const uint8_t *data, uint32_t count, const char *gap)
{
    for (uint32_t i = 0; i < count; ++i) {
        *out++ = qvsStrToHexChar(data[i] >> 4);
        *out++ = qvsStrToHexChar(data[i] & 0xF);
        *out++ = ' ';
    }
    while (*gap) {
        *out++ = *gap++;
    }
    for (uint32_t i = 0; i < count; ++i) {
        *out++ = qvsStrIsAscii(data[i]) ? static_cast<char>(data[i]) : '.';
    }
    *out = '\0';
    return out;
}

void qvsStrBinaryDump(char *out, const uint8_t *data, uint32_t len)
{
    // hardened: null is dumped as no bytes.
    uint32_t left = data ? len : 0;
    for (; left > qvs::kDumpColumns; left -= qvs::kDumpColumns) {
        out = qvs::dumpLine(out, data, qvs::kDumpColumns, "   ");
        *out++ = '\r';
        *out++ = '\n';
        data += qvs::kDumpColumns;
    }
    // kept[dump-last-column]: the last column stands directly behind the digits.
    qvs::dumpLine(out, data, left, "");
}
