// Byte strings, 16-bit strings and their conversions. Byte strings are NUL-terminated, and their
// bytes are unsigned wherever they are compared or classified. Valid C and C++.
#ifndef QVSSTRING_H
#define QVSSTRING_H

#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

// ---- Byte strings. The pointers that are handed back point into the first argument.

// qvsStrlen counts the bytes before the NUL; 0 for null.
QVS_API uint32_t qvsStrlen(const char *s);

// qvsStrcpy, qvsStrcat and qvsStrncpy are those of the C library; they return `dst`. qvsStrncpy
// pads with NUL up to `n` bytes and writes no terminator when `src` has `n` or more.
QVS_API char *qvsStrcpy(char *dst, const char *src);
QVS_API char *qvsStrcat(char *dst, const char *src);
QVS_API char *qvsStrncpy(char *dst, const char *src, uint32_t n);

// qvsStrncat appends at most `n` bytes of `src`, its NUL among them if that is within `n`; with an
// `n` of 0 all of it. Returns `dst`.
QVS_API char *qvsStrncat(char *dst, const char *src, uint32_t n);

// qvsStrcmp gives -1, 0 or 1 by the first differing bytes.
QVS_API int qvsStrcmp(const char *a, const char *b);

// The comparisons of at most `n` bytes, and those that take A to Z for a to z, give the difference
// of the first differing bytes; 0 when `n` is 0.
QVS_API int qvsStrncmp(const char *a, const char *b, uint32_t n);
QVS_API int qvsStricmp(const char *a, const char *b);
QVS_API int qvsStrnicmp(const char *a, const char *b, uint32_t n);

// qvsStrchr finds the first byte `c`, which may be the NUL; null when there is none.
QVS_API char *qvsStrchr(const char *s, int c);

// qvsStrrchr finds the last byte `c` behind the first position, which may be the NUL. Null when
// there is none, and for a null or empty text.
QVS_API char *qvsStrrchr(const char *s, int c);

// qvsStrstr finds the first `needle`; null when there is none, it is empty, or either is null.
QVS_API char *qvsStrstr(const char *haystack, const char *needle);

// qvsStristr is qvsStrstr with A to Z taken for a to z, except that an empty needle is found at
// the first position.
QVS_API char *qvsStristr(const char *haystack, const char *needle);

// qvsStrsplit copies the bytes before the first byte `delim`, or all of them, into `out`, with a
// terminator. Returns the position behind the delimiter, or that of the NUL when there is none;
// null, with `out` untouched, for a null or empty text.
QVS_API char *qvsStrsplit(const char *src, int delim, char *out);

// qvsStrtok gives the next token, as the C library's strtok does: `str` null goes on in the text
// of the last call. Null when no token is left, and before the first text.
QVS_API char *qvsStrtok(char *str, const char *delims);

// qvsStrWhiteSpaceSkip gives the first position that holds neither a blank nor a tab.
QVS_API char *qvsStrWhiteSpaceSkip(const char *s);

// ---- Numbers

// qvsStrAtol and qvsStrAtoi read a decimal number. In front of it "+" and all bytes up to the
// blank are skipped, and every "-" turns the sign round; 0 when anything else stands there.
QVS_API long qvsStrAtol(const char *s);
QVS_API int qvsStrAtoi(const char *s);

// qvsStrLtoa and qvsStrItoa write `v` to the base `base`, with a terminator, and return `buf`,
// which must hold up to 66 bytes where a long has 64 bits.
QVS_API char *qvsStrLtoa(long v, char *buf, uint32_t base);
QVS_API char *qvsStrItoa(long v, char *buf, uint32_t base);

// qvsStrDoNtoS writes the digits of `v` at *p, without a terminator, and leaves *p behind the last
// one. No digits for a base below 2.
QVS_API void qvsStrDoNtoS(unsigned long v, char **p, uint32_t base);

// qvsStrToHexChar gives the digit 0 to 9 or A to F, "?" for any other number.
QVS_API char qvsStrToHexChar(int n);

// qvsCharToHex gives the value 0 to 15 of a hexadecimal digit in either case, 0 for other bytes.
QVS_API uint32_t qvsCharToHex(uint8_t c);

// ---- Kinds of bytes: 1 or 0

QVS_API uint32_t qvsStrIsSpace(uint8_t c); // the blank and 9 to 13
QVS_API uint32_t qvsStrIsAscii(uint8_t c); // 0x20 to 0x7E
QVS_API uint32_t qvsStrIsCntrl(uint8_t c); // below 0x20, and 0x7F

// ---- 16-bit strings, terminated by a unit of 0

// qvsStrlenW counts the units before the terminator; 0 for null. qvsStrlenUcs takes no null.
QVS_API uint32_t qvsStrlenW(const uint16_t *s);
QVS_API uint32_t qvsStrlenUcs(const uint16_t *s);

// qvsStrcpyW, qvsStrcatW and qvsStrncpyW return `dst`. qvsStrncpyW copies until `n` units or
// through the terminator, without padding.
QVS_API uint16_t *qvsStrcpyW(uint16_t *dst, const uint16_t *src);
QVS_API uint16_t *qvsStrcatW(uint16_t *dst, const uint16_t *src);
QVS_API uint16_t *qvsStrncpyW(uint16_t *dst, const uint16_t *src, uint32_t n);

// qvsStrchrW finds the first unit `c`, which may be the terminator; null when there is none.
QVS_API uint16_t *qvsStrchrW(const uint16_t *s, uint16_t c);

// qvsStrcmpW gives -1, 0 or 1 by the sign of the 16-bit difference of the first differing units.
QVS_API int qvsStrcmpW(const uint16_t *a, const uint16_t *b);

// qvsStrAsciiToUcs2 widens `n` bytes, qvsStrUcsToAscii keeps the low byte of `n` units; both write
// a terminator at index `n` of `dst` and return 1.
QVS_API uint32_t qvsStrAsciiToUcs2(uint16_t *dst, const char *src, uint32_t n);
QVS_API uint32_t qvsStrUcsToAscii(char *dst, const uint16_t *src, uint32_t n);

// ---- Dump

// qvsStrBinaryDump writes `len` bytes as hexadecimal digits, 16 to a line, with their printable
// characters in a column beside them. `out` must hold 4 * len + 5 * (len / 16) + 1 bytes; it is
// left empty for no bytes.
QVS_API void qvsStrBinaryDump(char *out, const uint8_t *data, uint32_t len);

QVS_END_DECLS

#ifdef __cplusplus
namespace [[gnu::visibility("hidden")]] qvs {

// Bytes in a full line of a dump.
constexpr uint32_t kDumpColumns = 16;

// One line of a dump: the hexadecimal digits of `count` bytes, the gap, their printable
// characters. Returns the position of the NUL behind it.
char *dumpLine(char *out, const uint8_t *data, uint32_t count, const char *gap);

} // namespace qvs
#endif

#endif
