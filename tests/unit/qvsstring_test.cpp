// Byte strings, numbers, kinds of bytes, 16-bit strings and dumps.
#include "qvsstring.h"

#include <gtest/gtest.h>

#include <array>
#include <climits>
#include <cstring>
#include <string>
#include <utility>
#include <vector>

namespace {

// A text in a block of `size` bytes, the rest of which is "#", so that what is written shows.
std::vector<char> blockOf(const char *text, std::size_t size)
{
    std::vector<char> block(size, '#');
    std::strcpy(block.data(), text);
    return block;
}

std::string bytesOf(const std::vector<char> &block)
{
    return {block.begin(), block.end()};
}

using Units = std::vector<uint16_t>;

// `text` as units with a terminator, and `spare` units of 0xEEEE behind it.
Units unitsOf(const std::string &text, std::size_t spare = 0)
{
    Units units;
    for (const char c : text) {
        units.push_back(static_cast<unsigned char>(c));
    }
    units.push_back(0);
    units.insert(units.end(), spare, 0xEEEE);
    return units;
}

std::string numberOf(long v, uint32_t base)
{
    std::array<char, 67> text;
    text.fill('#');
    EXPECT_EQ(qvsStrLtoa(v, text.data(), base), text.data());
    EXPECT_EQ(text.back(), '#');
    std::array<char, 67> other;
    EXPECT_EQ(qvsStrItoa(v, other.data(), base), other.data());
    EXPECT_STREQ(other.data(), text.data());
    return text.data();
}

std::string dumpOf(const std::string &bytes)
{
    // Exactly as much as a dump may take, so that a sanitizer sees anything beyond.
    const std::size_t size = 4 * bytes.size() + 5 * (bytes.size() / 16) + 1;
    std::vector<char> out(size, '#');
    qvsStrBinaryDump(out.data(), reinterpret_cast<const uint8_t *>(bytes.data()),
                     static_cast<uint32_t>(bytes.size()));
    return out.data();
}

} // namespace

TEST(Strings, LengthCountsBytes)
{
    EXPECT_EQ(qvsStrlen(nullptr), 0U);
    EXPECT_EQ(qvsStrlen(""), 0U);
    EXPECT_EQ(qvsStrlen("abc"), 3U);
    EXPECT_EQ(qvsStrlen("\xFF\x80"), 2U);
}

TEST(Strings, CpyCopiesThroughTheTerminator)
{
    std::vector<char> block = blockOf("", 6);
    EXPECT_EQ(qvsStrcpy(block.data(), "abc"), block.data());
    EXPECT_EQ(bytesOf(block), std::string("abc\0##", 6));
}

TEST(Strings, CatAppendsThroughTheTerminator)
{
    std::vector<char> block = blockOf("ab", 7);
    EXPECT_EQ(qvsStrcat(block.data(), "cd"), block.data());
    EXPECT_EQ(bytesOf(block), std::string("abcd\0##", 7));
}

TEST(Strings, NcpyPadsUpToItsCount)
{
    std::vector<char> block = blockOf("", 6);
    EXPECT_EQ(qvsStrncpy(block.data(), "ab", 4), block.data());
    EXPECT_EQ(bytesOf(block), std::string("ab\0\0##", 6));
}

TEST(Strings, NcpyOfALongTextWritesNoTerminator)
{
    std::vector<char> block = blockOf("", 6);
    EXPECT_EQ(qvsStrncpy(block.data(), "abcdef", 3), block.data());
    EXPECT_EQ(bytesOf(block), "abc###");
    qvsStrncpy(block.data(), "xyz", 0);
    EXPECT_EQ(bytesOf(block), "abc###");
}

TEST(Strings, NcatAppendsThroughATerminatorWithinItsCount)
{
    std::vector<char> block = blockOf("ab", 8);
    EXPECT_EQ(qvsStrncat(block.data(), "cd", 3), block.data());
    EXPECT_EQ(bytesOf(block), std::string("abcd\0###", 8));
    block = blockOf("ab", 8);
    qvsStrncat(block.data(), "cd", 100);
    EXPECT_EQ(bytesOf(block), std::string("abcd\0###", 8));
    block = blockOf("ab", 8);
    qvsStrncat(block.data(), "", 1);
    EXPECT_EQ(bytesOf(block), std::string("ab\0#####", 8));
}

TEST(Strings, CmpGivesTheSign)
{
    EXPECT_EQ(qvsStrcmp("", ""), 0);
    EXPECT_EQ(qvsStrcmp("abc", "abc"), 0);
    EXPECT_EQ(qvsStrcmp("abc", "abz"), -1);
    EXPECT_EQ(qvsStrcmp("abz", "abc"), 1);
    EXPECT_EQ(qvsStrcmp("ab", "abc"), -1);
    EXPECT_EQ(qvsStrcmp("abc", "ab"), 1);
    EXPECT_EQ(qvsStrcmp("A", "a"), -1);
    EXPECT_EQ(qvsStrcmp("\xFF", "a"), 1) << "bytes are unsigned";
    EXPECT_EQ(qvsStrcmp("a", "\x80"), -1);
}

TEST(Strings, NcmpGivesTheDifferenceWithinItsCount)
{
    EXPECT_EQ(qvsStrncmp("abc", "abz", 2), 0);
    EXPECT_EQ(qvsStrncmp("abc", "abz", 3), 'c' - 'z');
    EXPECT_EQ(qvsStrncmp("abz", "abc", 100), 'z' - 'c');
    EXPECT_EQ(qvsStrncmp("abc", "abc", 100), 0);
    EXPECT_EQ(qvsStrncmp("ab", "abc", 3), -'c');
    EXPECT_EQ(qvsStrncmp("abc", "ab", 3), 'c');
    EXPECT_EQ(qvsStrncmp("A", "a", 1), 'A' - 'a');
    EXPECT_EQ(qvsStrncmp("\xFF", "\x01", 1), 0xFE);
    EXPECT_EQ(qvsStrncmp("a", "b", 0), 0);
    EXPECT_EQ(qvsStrncmp("a\0b", "a\0c", 3), 0) << "nothing behind the terminator counts";
}

TEST(Strings, IcmpTakesCapitalsForSmallLetters)
{
    EXPECT_EQ(qvsStricmp("", ""), 0);
    EXPECT_EQ(qvsStricmp("AZaz09", "azAZ09"), 0);
    EXPECT_EQ(qvsStricmp("abc", "ABZ"), 'c' - 'z');
    EXPECT_EQ(qvsStricmp("ABZ", "abc"), 'z' - 'c');
    EXPECT_EQ(qvsStricmp("ab", "ABC"), -'c');
    EXPECT_EQ(qvsStricmp("@", "`"), '@' - '`') << "the byte before A is no letter";
    EXPECT_EQ(qvsStricmp("[", "{"), '[' - '{') << "nor the one behind Z";
    EXPECT_EQ(qvsStricmp("\xC4", "\xE4"), 0xC4 - 0xE4) << "only A to Z are folded";
    EXPECT_EQ(qvsStricmp("\xFF", "a"), 0xFF - 'a');
}

TEST(Strings, NicmpStopsAtItsCount)
{
    EXPECT_EQ(qvsStrnicmp("sec\x01", "SEC", 3), 0);
    EXPECT_EQ(qvsStrnicmp("sec\x01", "SEC", 4), 1);
    EXPECT_EQ(qvsStrnicmp("SEB", "sec", 3), 'b' - 'c');
    EXPECT_EQ(qvsStrnicmp("se", "SEC", 3), -'c');
    EXPECT_EQ(qvsStrnicmp("a", "b", 0), 0);
}

TEST(Strings, ChrFindsTheFirstByte)
{
    const char text[] = "abca\xE9";
    EXPECT_EQ(qvsStrchr(text, 'a'), text);
    EXPECT_EQ(qvsStrchr(text, 'c'), text + 2);
    EXPECT_EQ(qvsStrchr(text, 'x'), nullptr);
    EXPECT_EQ(qvsStrchr(text, 0), text + 5);
    EXPECT_EQ(qvsStrchr(text, 0xE9), text + 4);
    EXPECT_EQ(qvsStrchr(text, static_cast<signed char>(0xE9)), text + 4);
}

TEST(Strings, RchrFindsTheLastByte)
{
    const char text[] = "abca\xE9";
    EXPECT_EQ(qvsStrrchr(text, 'a'), text + 3);
    EXPECT_EQ(qvsStrrchr(text, 'b'), text + 1);
    EXPECT_EQ(qvsStrrchr(text, 'x'), nullptr);
    EXPECT_EQ(qvsStrrchr(text, 0), text + 5);
    EXPECT_EQ(qvsStrrchr(text, 0xE9), text + 4);
    EXPECT_EQ(qvsStrrchr(text, static_cast<signed char>(0xE9)), text + 4);
    EXPECT_EQ(qvsStrrchr("", 0), nullptr);
    EXPECT_EQ(qvsStrrchr("", 'a'), nullptr);
    EXPECT_EQ(qvsStrrchr(nullptr, 'a'), nullptr);
}

TEST(Strings, StrFindsTheFirstOccurrence)
{
    const char text[] = "ababac";
    EXPECT_EQ(qvsStrstr(text, "ab"), text);
    EXPECT_EQ(qvsStrstr(text, "abac"), text + 2);
    EXPECT_EQ(qvsStrstr(text, "AB"), nullptr);
    EXPECT_EQ(qvsStrstr(text, "ababacd"), nullptr);
    EXPECT_EQ(qvsStrstr("", "a"), nullptr);
    EXPECT_EQ(qvsStrstr(nullptr, "a"), nullptr);
    EXPECT_EQ(qvsStrstr(text, nullptr), nullptr);
}

TEST(Strings, IstrFindsTheFirstOccurrenceInAnyCase)
{
    const char text[] = "aBabAc";
    EXPECT_EQ(qvsStristr(text, "AB"), text);
    EXPECT_EQ(qvsStristr(text, "ABaC"), text + 2);
    EXPECT_EQ(qvsStristr(text, "c"), text + 5);
    EXPECT_EQ(qvsStristr(text, "x"), nullptr);
    EXPECT_EQ(qvsStristr(text, "acd"), nullptr);
    EXPECT_EQ(qvsStristr(text, ""), text);
    EXPECT_EQ(qvsStristr("", "a"), nullptr);
    EXPECT_EQ(qvsStristr(nullptr, "a"), nullptr);
    EXPECT_EQ(qvsStristr(nullptr, ""), nullptr);
    EXPECT_EQ(qvsStristr(text, nullptr), nullptr);
}

TEST(Strings, SplitCopiesUpToTheDelimiter)
{
    const char text[] = "ab,c";
    std::vector<char> out = blockOf("", 6);
    EXPECT_EQ(qvsStrsplit(text, ',', out.data()), text + 3);
    EXPECT_EQ(bytesOf(out), std::string("ab\0###", 6));
    EXPECT_EQ(qvsStrsplit(text + 3, ',', out.data()), text + 4) << "the terminator of the text";
    EXPECT_EQ(bytesOf(out), std::string("c\0\0###", 6));
    EXPECT_EQ(qvsStrsplit(text + 2, ',', out.data()), text + 3);
    EXPECT_STREQ(out.data(), "") << "nothing before the delimiter";
}

TEST(Strings, SplitTakesADelimiterOfAnySign)
{
    const char text[] = "a\xE9z";
    char out[4] = "";
    EXPECT_EQ(qvsStrsplit(text, 0xE9, out), text + 2);
    EXPECT_EQ(qvsStrsplit(text, static_cast<signed char>(0xE9), out), text + 2);
    EXPECT_STREQ(out, "a");
}

TEST(Strings, SplitOfNothingIsNull)
{
    std::vector<char> out = blockOf("x", 3);
    EXPECT_EQ(qvsStrsplit(nullptr, ',', out.data()), nullptr);
    EXPECT_EQ(qvsStrsplit("", ',', out.data()), nullptr);
    EXPECT_STREQ(out.data(), "x");
}

// The first of the tests of qvsStrtok, as long as the tests run in the order of the file.
TEST(Strings, TokGivesNullBeforeTheFirstText)
{
    EXPECT_EQ(qvsStrtok(nullptr, ","), nullptr);
}

TEST(Strings, TokGivesTokenAfterToken)
{
    char text[] = ",;ab,;cd;";
    EXPECT_EQ(qvsStrtok(text, ",;"), text + 2);
    EXPECT_STREQ(text + 2, "ab");
    EXPECT_EQ(text[5], ';') << "only the first delimiter behind a token is overwritten";
    EXPECT_EQ(qvsStrtok(nullptr, ",;"), text + 6);
    EXPECT_STREQ(text + 6, "cd");
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(qvsStrtok(nullptr, ",;"), nullptr);
    }
}

TEST(Strings, TokTakesOtherDelimitersInEveryCall)
{
    char text[] = "a,b;c\xE9"
                  "d";
    EXPECT_STREQ(qvsStrtok(text, ","), "a");
    EXPECT_STREQ(qvsStrtok(nullptr, ";"), "b");
    EXPECT_STREQ(qvsStrtok(nullptr, "\xE9"), "c");
    EXPECT_STREQ(qvsStrtok(nullptr, ""), "d");
    EXPECT_EQ(qvsStrtok(nullptr, ""), nullptr);
}

TEST(Strings, TokGivesNullWithoutAToken)
{
    char empty[] = "";
    EXPECT_EQ(qvsStrtok(empty, ","), nullptr);
    char delimiters[] = ",,,";
    EXPECT_EQ(qvsStrtok(delimiters, ","), nullptr);
    EXPECT_STREQ(delimiters, ",,,");
    EXPECT_EQ(qvsStrtok(nullptr, ","), nullptr);
}

TEST(Strings, TokKnowsEveryByteAsADelimiter)
{
    for (int byte = 1; byte < 256; ++byte) {
        const char delimiter[] = {static_cast<char>(byte), '\0'};
        const char other = byte == 'x' ? 'y' : 'x';
        char text[] = {other, static_cast<char>(byte), other, '\0'};
        EXPECT_EQ(qvsStrtok(text, delimiter), text) << byte;
        EXPECT_EQ(qvsStrtok(nullptr, delimiter), text + 2) << byte;
        EXPECT_EQ(qvsStrtok(nullptr, delimiter), nullptr) << byte;
    }
}

TEST(Strings, WhiteSpaceSkipSkipsBlanksAndTabs)
{
    const char text[] = " \t \n a";
    EXPECT_EQ(qvsStrWhiteSpaceSkip(text), text + 3);
    EXPECT_EQ(qvsStrWhiteSpaceSkip(text + 5), text + 5);
    EXPECT_EQ(qvsStrWhiteSpaceSkip(text + 6), text + 6);
}

TEST(Numbers, AtolReadsADecimalNumber)
{
    for (const auto &[text, value] :
         std::vector<std::pair<const char *, long>>{{"0", 0},
                                                    {"42", 42},
                                                    {"-42", -42},
                                                    {"+42", 42},
                                                    {" -12x", -12},
                                                    {"x12", 0},
                                                    {"1x2", 1},
                                                    {"12-3", 12},
                                                    {"", 0},
                                                    {"-", 0},
                                                    {"\t\n\x01\x1F 7", 7},
                                                    {"- + - 7", 7},
                                                    {"!7", 0},
                                                    {"\x80"
                                                     "7",
                                                     0},
                                                    {"/7", 0},
                                                    {":7", 0},
                                                    {"007", 7},
                                                    {"2147483647", 2147483647},
                                                    {"-2147483648", -2147483647L - 1}}) {
        EXPECT_EQ(qvsStrAtol(text), value) << text;
        EXPECT_EQ(qvsStrAtoi(text), value) << text;
    }
}

TEST(Numbers, LtoaWritesDigitsToABase)
{
    EXPECT_EQ(numberOf(0, 10), "0");
    EXPECT_EQ(numberOf(7, 10), "7");
    EXPECT_EQ(numberOf(10, 10), "10");
    EXPECT_EQ(numberOf(2147483647, 10), "2147483647");
    EXPECT_EQ(numberOf(-1, 10), "-1");
    EXPECT_EQ(numberOf(INT32_MIN, 10), "-2147483648");
    EXPECT_EQ(numberOf(INT32_MIN, 2), "-1" + std::string(31, '0'));
    EXPECT_EQ(numberOf(LONG_MAX, 10), std::to_string(LONG_MAX));
    EXPECT_EQ(numberOf(LONG_MIN, 10), std::to_string(LONG_MIN));
    EXPECT_EQ(numberOf(LONG_MIN, 2), "-1" + std::string(8 * sizeof(long) - 1, '0'));
    EXPECT_EQ(numberOf(9, 16), "9");
    EXPECT_EQ(numberOf(10, 16), "a");
    EXPECT_EQ(numberOf(255, 16), "ff");
    EXPECT_EQ(numberOf(-255, 16), "-ff");
    EXPECT_EQ(numberOf(35, 36), "z");
    EXPECT_EQ(numberOf(5, 2), "101");
}

TEST(Numbers, LtoaMasksDigitsBehindZToSevenBits)
{
    EXPECT_EQ(numberOf(36, 100), "{");
    EXPECT_EQ(numberOf(40, 100), "\x7F");
    EXPECT_EQ(numberOf(42, 100), "\x01");
    EXPECT_EQ(numberOf(150, 100), "1\x09");
}

TEST(Numbers, LtoaToABaseBelow2WritesNoDigits)
{
    EXPECT_EQ(numberOf(5, 0), "");
    EXPECT_EQ(numberOf(5, 1), "");
    EXPECT_EQ(numberOf(-5, 1), "-");
}

TEST(Numbers, DoNtoSWritesDigitsAndMovesOn)
{
    std::vector<char> text(12, '#');
    std::vector<char> longest(20, '#');
    char *p = longest.data();
    qvsStrDoNtoS(ULONG_MAX, &p, 10);
    EXPECT_EQ(std::string(longest.data(), p), std::to_string(ULONG_MAX));
    p = text.data();
    qvsStrDoNtoS(4294967295U, &p, 10);
    EXPECT_EQ(p, text.data() + 10);
    EXPECT_EQ(bytesOf(text), "4294967295##");
    qvsStrDoNtoS(0, &p, 16);
    EXPECT_EQ(p, text.data() + 11);
    EXPECT_EQ(bytesOf(text), "42949672950#");
    for (const uint32_t base : {0U, 1U}) {
        qvsStrDoNtoS(123, &p, base);
        EXPECT_EQ(p, text.data() + 11);
    }
    p = text.data();
    qvsStrDoNtoS(4294967295U, &p, 4294967295U);
    EXPECT_EQ(p, text.data() + 2);
    EXPECT_EQ(bytesOf(text).substr(0, 2), "10");
}

TEST(Numbers, ToHexCharGivesCapitals)
{
    std::string digits;
    for (int n = -1; n <= 16; ++n) {
        digits += qvsStrToHexChar(n);
    }
    EXPECT_EQ(digits, "?0123456789ABCDEF?");
    EXPECT_EQ(qvsStrToHexChar(0x101), '?');
    EXPECT_EQ(qvsStrToHexChar(INT_MIN), '?');
}

TEST(Numbers, CharToHexTakesBothCases)
{
    const std::string small = "0123456789abcdef";
    const std::string capital = "0123456789ABCDEF";
    for (uint32_t byte = 0; byte < 256; ++byte) {
        const char c = static_cast<char>(byte);
        uint32_t expected = 0;
        for (const std::string &digits : {small, capital}) {
            if (digits.find(c) != std::string::npos) {
                expected = static_cast<uint32_t>(digits.find(c));
            }
        }
        EXPECT_EQ(qvsCharToHex(static_cast<uint8_t>(byte)), expected) << byte;
    }
}

TEST(Numbers, KindsOfBytes)
{
    for (uint32_t byte = 0; byte < 256; ++byte) {
        const auto c = static_cast<uint8_t>(byte);
        const bool space = byte == 32 || (byte >= 9 && byte <= 13);
        EXPECT_EQ(qvsStrIsSpace(c), space ? 1U : 0U) << byte;
        EXPECT_EQ(qvsStrIsAscii(c), byte >= 0x20 && byte <= 0x7E ? 1U : 0U) << byte;
        EXPECT_EQ(qvsStrIsCntrl(c), byte < 0x20 || byte == 0x7F ? 1U : 0U) << byte;
    }
}

TEST(WideStrings, LengthCountsUnits)
{
    EXPECT_EQ(qvsStrlenW(nullptr), 0U);
    EXPECT_EQ(qvsStrlenW(unitsOf("").data()), 0U);
    EXPECT_EQ(qvsStrlenW(unitsOf("abc").data()), 3U);
    EXPECT_EQ(qvsStrlenUcs(unitsOf("").data()), 0U);
    EXPECT_EQ(qvsStrlenUcs(unitsOf("abc").data()), 3U);
    EXPECT_EQ(qvsStrlenW(Units{0x0100, 0x0001, 0}.data()), 2U) << "a zero byte ends nothing";
}

TEST(WideStrings, CpyCopiesThroughTheTerminator)
{
    Units units(5, 0xEEEE);
    EXPECT_EQ(qvsStrcpyW(units.data(), unitsOf("abc").data()), units.data());
    EXPECT_EQ(units, unitsOf("abc", 1));
}

TEST(WideStrings, CatAppendsThroughTheTerminator)
{
    Units units = unitsOf("ab", 3);
    EXPECT_EQ(qvsStrcatW(units.data(), unitsOf("cd").data()), units.data());
    EXPECT_EQ(units, unitsOf("abcd", 1));
}

TEST(WideStrings, NcpyStopsAtItsCountOrTheTerminatorWithoutPadding)
{
    Units units(5, 0xEEEE);
    EXPECT_EQ(qvsStrncpyW(units.data(), unitsOf("abc").data(), 2), units.data());
    EXPECT_EQ(units, (Units{'a', 'b', 0xEEEE, 0xEEEE, 0xEEEE}));
    qvsStrncpyW(units.data(), unitsOf("x").data(), 5);
    EXPECT_EQ(units, (Units{'x', 0, 0xEEEE, 0xEEEE, 0xEEEE}));
    qvsStrncpyW(units.data(), unitsOf("y").data(), 0);
    EXPECT_EQ(units[0], 'x');
}

TEST(WideStrings, ChrFindsTheFirstUnit)
{
    const Units units = {'a', 0x1234, 'a', 0};
    EXPECT_EQ(qvsStrchrW(units.data(), 'a'), units.data());
    EXPECT_EQ(qvsStrchrW(units.data(), 0x1234), units.data() + 1);
    EXPECT_EQ(qvsStrchrW(units.data(), 0x34), nullptr);
    EXPECT_EQ(qvsStrchrW(units.data(), 0), units.data() + 3);
}

TEST(WideStrings, CmpGivesTheSign)
{
    const auto compare = [](Units left, Units right) {
        return qvsStrcmpW(left.data(), right.data());
    };
    EXPECT_EQ(compare({0}, {0}), 0);
    EXPECT_EQ(compare({'a', 'b', 0}, {'a', 'b', 0}), 0);
    EXPECT_EQ(compare({'a', 0}, {'a', 'b', 0}), -1);
    EXPECT_EQ(compare({'a', 'z', 0}, {'a', 'b', 0}), 1);
    EXPECT_EQ(compare({0x7FFF, 0}, {0}), 1);
    EXPECT_EQ(compare({0x9000, 0}, {0x8FFF, 0}), 1);
}

TEST(WideStrings, AreWidenedFromBytes)
{
    Units units(5, 0xEEEE);
    const std::vector<char> bytes = {'a', static_cast<char>(0xFF), '\0', 'b'};
    EXPECT_EQ(qvsStrAsciiToUcs2(units.data(), bytes.data(), 4), 1U);
    EXPECT_EQ(units, (Units{'a', 0xFF, 0, 'b', 0}));
    EXPECT_EQ(qvsStrAsciiToUcs2(units.data(), "x", 0), 1U);
    EXPECT_EQ(units[0], 0);
}

TEST(WideStrings, AreNarrowedToTheirLowBytes)
{
    std::vector<char> bytes(5, '#');
    const Units units = {0x0161, 0x12FF, 0x0100, 'b'};
    EXPECT_EQ(qvsStrUcsToAscii(bytes.data(), units.data(), 4), 1U);
    EXPECT_EQ(bytesOf(bytes), std::string("a\xFF\0b\0", 5));
    EXPECT_EQ(qvsStrUcsToAscii(bytes.data(), units.data(), 0), 1U);
    EXPECT_EQ(bytes[0], '\0');
}

TEST(Dump, OfNothingIsEmpty)
{
    EXPECT_EQ(dumpOf(""), "");
    char out[] = "#";
    qvsStrBinaryDump(out, nullptr, 3);
    EXPECT_STREQ(out, "");
}

TEST(Dump, ShowsPrintableBytesBesideTheDigits)
{
    EXPECT_EQ(dumpOf("A"), "41 A");
    EXPECT_EQ(dumpOf(std::string("\x00\x1F\x20\x7E\x7F\xFF", 6)), "00 1F 20 7E 7F FF .. ~..");
}

TEST(Dump, EndsALineBehind16BytesUnlessTheyAreTheLast)
{
    const std::string digits = "61 61 61 61 61 61 61 61 61 61 61 61 61 61 61 61 ";
    const std::string column(16, 'a');
    EXPECT_EQ(dumpOf(std::string(15, 'a')), digits.substr(3) + column.substr(1));
    EXPECT_EQ(dumpOf(column), digits + column);
    EXPECT_EQ(dumpOf(column + "b"), digits + "   " + column + "\r\n62 b");
    EXPECT_EQ(dumpOf(column + column + "b"),
              digits + "   " + column + "\r\n" + digits + "   " + column + "\r\n62 b");
}

TEST(Dump, LineTakesItsGap)
{
    char out[20];
    const uint8_t bytes[] = {0x41, 0x01};
    EXPECT_EQ(qvs::dumpLine(out, bytes, 2, "--"), out + 10);
    EXPECT_STREQ(out, "41 01 --A.");
    EXPECT_EQ(qvs::dumpLine(out, bytes, 0, ""), out);
    EXPECT_STREQ(out, "");
}

TEST(Kept, strncat_zero)
{
    std::vector<char> block = blockOf("ab", 8);
    EXPECT_EQ(qvsStrncat(block.data(), "cde", 0), block.data());
    EXPECT_EQ(bytesOf(block), std::string("abcde\0##", 8));
}

TEST(Kept, strncat_unterminated)
{
    std::vector<char> block = blockOf("ab", 8);
    qvsStrncat(block.data(), "cdef", 2);
    EXPECT_EQ(bytesOf(block), "abcd####");
    block = blockOf("ab", 8);
    qvsStrncat(block.data(), "cd", 2);
    EXPECT_EQ(bytesOf(block), "abcd####") << "the terminator is the third byte";
}

TEST(Kept, strrchr_first)
{
    const char text[] = "abca";
    EXPECT_EQ(qvsStrrchr("abc", 'a'), nullptr);
    EXPECT_EQ(qvsStrrchr(text, 'a'), text + 3);
}

TEST(Kept, strstr_empty_needle)
{
    const char text[] = "abc";
    EXPECT_EQ(qvsStrstr(text, ""), nullptr);
    EXPECT_EQ(qvsStrstr("", ""), nullptr);
    EXPECT_EQ(qvsStristr(text, ""), text);
}

TEST(Kept, atol_signs)
{
    EXPECT_EQ(qvsStrAtol("--5"), 5);
    EXPECT_EQ(qvsStrAtol("---5"), -5);
    EXPECT_EQ(qvsStrAtol("- -5"), 5);
    EXPECT_EQ(qvsStrAtol("-+5"), -5);
    EXPECT_EQ(qvsStrAtoi("--5"), 5);
}

TEST(Kept, atol_overflow)
{
    EXPECT_EQ(qvsStrAtoi("4294967297"), 1);
    EXPECT_EQ(qvsStrAtoi("2147483648"), INT_MIN);
    if (sizeof(long) == 4) {
        EXPECT_EQ(qvsStrAtol("4294967297"), 1);
        EXPECT_EQ(qvsStrAtol("-4294967297"), -1);
    } else {
        EXPECT_EQ(qvsStrAtol("18446744073709551617"), 1);
        EXPECT_EQ(qvsStrAtol("-18446744073709551617"), -1);
    }
}

TEST(Kept, strcmpw_wraps)
{
    const Units zero = {0};
    const Units high = {0x9000, 0};
    EXPECT_EQ(qvsStrcmpW(high.data(), zero.data()), -1);
    EXPECT_EQ(qvsStrcmpW(zero.data(), high.data()), 1);
    const Units middle = {0x8000, 0};
    EXPECT_EQ(qvsStrcmpW(middle.data(), zero.data()), -1);
    EXPECT_EQ(qvsStrcmpW(zero.data(), middle.data()), -1);
}

TEST(Kept, dump_last_column)
{
    EXPECT_EQ(dumpOf("0123456789ABCDEF!"),
              "30 31 32 33 34 35 36 37 38 39 41 42 43 44 45 46    0123456789ABCDEF\r\n21 !");
}
