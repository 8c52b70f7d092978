/* The checked functions that a build with _FORTIFY_SOURCE asks of glibc, with the same checks: a library
 * that brings them loads with another C library too. They are seen by that library alone. */
#undef _FORTIFY_SOURCE
#include <stdarg.h>
#include <stddef.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>

#define HIDDEN __attribute__((visibility("hidden")))

HIDDEN void *__memcpy_chk(void *to, const void *from, size_t length, size_t room);
HIDDEN void *__memmove_chk(void *to, const void *from, size_t length, size_t room);
HIDDEN void *__memset_chk(void *to, int byte, size_t length, size_t room);
HIDDEN int __printf_chk(int flag, const char *format, ...);
HIDDEN int __snprintf_chk(char *to, size_t length, int flag, size_t room, const char *format, ...);
HIDDEN int __vsnprintf_chk(char *to, size_t length, int flag, size_t room, const char *format,
                           va_list arguments);

static void must_fit(size_t length, size_t room)
{
    if (length > room) {
        abort();
    }
}

void *__memcpy_chk(void *to, const void *from, size_t length, size_t room)
{
    must_fit(length, room);
    return memcpy(to, from, length);
}

void *__memmove_chk(void *to, const void *from, size_t length, size_t room)
{
    must_fit(length, room);
    return memmove(to, from, length);
}

void *__memset_chk(void *to, int byte, size_t length, size_t room)
{
    must_fit(length, room);
    return memset(to, byte, length);
}

int __printf_chk(int flag, const char *format, ...)
{
    va_list arguments;
    int printed;

    (void)flag;
    va_start(arguments, format);
    printed = vprintf(format, arguments);
    va_end(arguments);
    return printed;
}

int __vsnprintf_chk(char *to, size_t length, int flag, size_t room, const char *format,
                    va_list arguments)
{
    (void)flag;
    must_fit(length, room);
    return vsnprintf(to, length, format, arguments);
}

int __snprintf_chk(char *to, size_t length, int flag, size_t room, const char *format, ...)
{
    va_list arguments;
    int printed;

    va_start(arguments, format);
    printed = __vsnprintf_chk(to, length, flag, room, format, arguments);
    va_end(arguments);
    return printed;
}
