// The string functions, beside those of the C library or a few lines that say what they do.
#include "check.h"
#include "script.h"

#include "qvsstring.h"

#include <cctype>
#include <cstdio>
#include <cstdlib>

namespace fuzz {

namespace {

using Wide = std::basic_string<uint16_t>;

int signOf(long number)
{
    return number < 0 ? -1 : number > 0;
}

int lowered(char c)
{
    return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : static_cast<unsigned char>(c);
}

// The difference of the first differing bytes among `n`.
int difference(const char *a, const char *b, size_t n, bool fold)
{
    for (size_t i = 0; i < n; ++i) {
        const int left = fold ? lowered(a[i]) : static_cast<unsigned char>(a[i]);
        const int right = fold ? lowered(b[i]) : static_cast<unsigned char>(b[i]);
        if (left != right || left == 0) {
            return left - right;
        }
    }
    return 0;
}

void comparisons(const char *a, const char *b, uint32_t n)
{
    check(qvsStrcmp(a, b) == signOf(strcmp(a, b)), "qvsStrcmp");
    check(qvsStrncmp(a, b, n) == difference(a, b, n, false), "qvsStrncmp");
    check(qvsStricmp(a, b) == difference(a, b, SIZE_MAX, true), "qvsStricmp");
    check(qvsStrnicmp(a, b, n) == difference(a, b, n, true), "qvsStrnicmp");
}

void searches(const char *a, const char *b, int c)
{
    const std::string text = a;
    check(qvsStrlen(a) == text.size(), "qvsStrlen");
    check(qvsStrchr(a, c) == strchr(a, c), "qvsStrchr");
    const size_t last = (text + '\0').rfind(static_cast<char>(c));
    const bool found = last != text.npos && last > 0;
    check(qvsStrrchr(a, c) == (found && !text.empty() ? a + last : nullptr), "qvsStrrchr");
    check(qvsStrstr(a, b) == (*b ? strstr(a, b) : nullptr), "qvsStrstr");
    const char *at = a;
    const size_t length = strlen(b);
    while (*at && difference(at, b, length, true) != 0) {
        ++at;
    }
    check(qvsStristr(a, b) == (*at || !*b ? (*b ? at : a) : nullptr), "qvsStristr");
    check(qvsStrWhiteSpaceSkip(a) == a + strspn(a, " \t"), "qvsStrWhiteSpaceSkip");
}

void copies(const std::string &a, const std::string &b, uint32_t n)
{
    Exact<char> copy(a.size() + 1);
    check(qvsStrcpy(copy, Exact<char>(a)) == copy && a == copy.operator char *(), "qvsStrcpy");
    Exact<char> both(a.size() + b.size() + 1);
    qvsStrcpy(both, a.c_str());
    check(qvsStrcat(both, Exact<char>(b)) == both && a + b == both.operator char *(), "qvsStrcat");
    Exact<char> padded(n);
    Exact<char> expected(n);
    qvsStrncpy(padded, a.c_str(), n);
    strncpy(expected, a.c_str(), n);
    check(memcmp(padded, expected, n) == 0, "qvsStrncpy");
    // Without a terminator among the first n there is none behind them.
    const size_t appended = n == 0 ? b.size() + 1 : std::min<size_t>(n, b.size() + 1);
    Exact<char> added(a.size() + std::max<size_t>(appended, 1));
    qvsStrcpy(added, a.c_str());
    qvsStrncat(added, Exact<char>(b), n);
    check(memcmp(added, (a + b).c_str(), a.size() + appended) == 0, "qvsStrncat");
    const size_t end = std::min(a.find(static_cast<char>(n)), a.size());
    Exact<char> piece(end + 1);
    const char *behind = qvsStrsplit(a.c_str(), static_cast<int>(n & 0xFF), piece);
    check(a.empty() ? !behind
                    : behind == a.c_str() + std::min(end + 1, a.size()) &&
                          a.substr(0, end) == piece.operator char *(),
          "qvsStrsplit");
}

void tokens(const std::string &text, const std::string &delimiters)
{
    Exact<char> ours(text);
    Exact<char> theirs(text);
    char *state = nullptr;
    char *expected = strtok_r(theirs, delimiters.c_str(), &state);
    char *token = qvsStrtok(ours, delimiters.c_str());
    while (expected && token) {
        check(strcmp(token, expected) == 0, "qvsStrtok", token, ' ', expected);
        expected = strtok_r(nullptr, delimiters.c_str(), &state);
        token = qvsStrtok(nullptr, delimiters.c_str());
    }
    check(!expected && !token, "qvsStrtok finds as many");
    // It forgets the text, which is gone after this.
    static char nothing[1] = {};
    check(!qvsStrtok(nothing, ""), "there is no token in an empty text");
}

void numbers(const std::string &text, uint32_t word)
{
    unsigned long value = 0;
    bool negative = false;
    size_t i = 0;
    while (i < text.size() && (text[i] == '+' || text[i] == '-' || lowered(text[i]) <= ' ')) {
        negative ^= text[i++] == '-';
    }
    for (; i < text.size() && isdigit(static_cast<unsigned char>(text[i])); ++i) {
        value = value * 10 + static_cast<unsigned long>(text[i] - '0');
    }
    const long expected = static_cast<long>(negative ? -value : value);
    check(qvsStrAtol(Exact<char>(text)) == expected, "qvsStrAtol");
    check(qvsStrAtoi(Exact<char>(text)) == static_cast<int>(expected), "qvsStrAtoi");

    const long number = static_cast<int32_t>(word);
    for (int base : {2, 8, 10, 16, 36}) {
        char buffer[66];
        check(qvsStrLtoa(number, buffer, static_cast<uint32_t>(base)) == buffer &&
                  strtoll(buffer, nullptr, base) == number,
              "qvsStrLtoa");
        check(qvsStrAtol(qvsStrItoa(number, buffer, 10)) == number, "qvsStrItoa");
    }
}

void kinds(uint8_t byte)
{
    check(qvsStrIsSpace(byte) == (isspace(byte) ? 1U : 0U), "qvsStrIsSpace");
    check(qvsStrIsAscii(byte) == (isprint(byte) ? 1U : 0U), "qvsStrIsAscii");
    check(qvsStrIsCntrl(byte) == (iscntrl(byte) ? 1U : 0U), "qvsStrIsCntrl");
    const char digit[] = {static_cast<char>(byte), 0};
    const uint32_t value = isxdigit(byte) ? static_cast<uint32_t>(strtoul(digit, nullptr, 16)) : 0;
    check(qvsCharToHex(byte) == value, "qvsCharToHex");
    const int number = byte - 8;
    const char expected = number >= 0 && number < 16 ? "0123456789ABCDEF"[number] : '?';
    check(qvsStrToHexChar(number) == expected, "qvsStrToHexChar");
}

void dump(const std::vector<uint8_t> &bytes)
{
    std::string expected;
    std::string column;
    for (size_t i = 0; i < bytes.size(); ++i) {
        char digits[4];
        snprintf(digits, sizeof digits, "%02X ", bytes[i]);
        expected += digits;
        column += isprint(bytes[i]) ? static_cast<char>(bytes[i]) : '.';
        if (column.size() == 16 && i + 1 < bytes.size()) {
            expected += "   " + column + "\r\n";
            column.clear();
        }
    }
    Exact<char> out(4 * bytes.size() + 5 * (bytes.size() / 16) + 1);
    qvsStrBinaryDump(out, Exact<uint8_t>(bytes), static_cast<uint32_t>(bytes.size()));
    check(expected + column == out.operator char *(), "qvsStrBinaryDump");
}

} // namespace

void runStrings(Script *script)
{
    const uint32_t word = script->word();
    const uint8_t small = static_cast<uint8_t>(word);
    const std::string a = script->text();
    const std::string b = script->text();
    const Exact<char> first(a);
    const Exact<char> second(b);
    comparisons(first, second, small);
    searches(first, second, small);
    copies(a, b, small);
    tokens(a, b);
    numbers(b, word);
    kinds(small);
    dump(script->rest());
}

void runWideStrings(Script *script)
{
    const auto wide = [script] {
        Wide text;
        for (size_t i = script->byte(); i > 0 && !script->isOver(); --i) {
            const auto unit = static_cast<uint16_t>(script->byte() * 256 + script->byte());
            text += unit ? unit : uint16_t{1};
        }
        return text;
    };
    const uint16_t unit = static_cast<uint16_t>(script->word());
    const uint32_t n = unit % 64U;
    const Wide a = wide();
    const Wide b = wide();
    const Exact<uint16_t> first(a);
    const Exact<uint16_t> second(b);
    check(qvsStrlenW(first) == a.size() && qvsStrlenUcs(first) == a.size(), "qvsStrlenW");

    Exact<uint16_t> copy(a.size() + 1);
    check(qvsStrcpyW(copy, first) == copy && a == copy.operator uint16_t *(), "qvsStrcpyW");
    Exact<uint16_t> both(a.size() + b.size() + 1);
    qvsStrcpyW(both, first);
    check(qvsStrcatW(both, second) == both && a + b == both.operator uint16_t *(), "qvsStrcatW");
    const size_t count = std::min<size_t>(n, a.size() + 1);
    Exact<uint16_t> part(count);
    check(qvsStrncpyW(part, first, n) == part &&
              std::equal(part.operator uint16_t *(), part + count, first.operator uint16_t *()),
          "qvsStrncpyW");

    const size_t found = (a + uint16_t{0}).find(unit);
    check(qvsStrchrW(first, unit) == (found == Wide::npos ? nullptr : first + found), "qvsStrchrW");
    size_t i = 0;
    while (first[i] == second[i] && first[i]) {
        ++i;
    }
    check(qvsStrcmpW(first, second) == signOf(static_cast<int16_t>(first[i] - second[i])),
          "qvsStrcmpW");

    const Exact<char> narrow(a.size() + 1);
    const Exact<uint16_t> widened(a.size() + 1);
    check(qvsStrUcsToAscii(narrow, first, static_cast<uint32_t>(a.size())) == 1 &&
              qvsStrAsciiToUcs2(widened, narrow, static_cast<uint32_t>(a.size())) == 1,
          "both conversions succeed");
    for (size_t j = 0; j <= a.size(); ++j) {
        check(widened[j] == first[j] % 256, "low bytes are kept, and widened");
    }
}

} // namespace fuzz
