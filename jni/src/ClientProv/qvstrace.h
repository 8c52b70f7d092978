// Trace messages: formed completely for a sink, and not at all while there is none. Valid C and
// C++.
#ifndef QVSTRACE_H
#define QVSTRACE_H

#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

#define QVC_TRACE_DUMP_SIZE 32000

// Takes each message, NUL-terminated, with its length in bytes; the text is gone after the call. It
// is called on the thread that traces and must not trace itself.
typedef void (*qvcTraceSink)(const char *text, uint32_t length);

// qvcTraceSetSink has every message handed to `sink` from now on; null, as at the start, ends that,
// and messages are not even formed. One sink for the process, to be set while nothing is parsed.
QVS_API void qvcTraceSetSink(qvcTraceSink sink);

// What qvcTraceDump22 wrote last.
extern QVS_API char _szBuffer[QVC_TRACE_DUMP_SIZE];

// qvcTrace traces the formatted text and a line end, together at most 20479 bytes of it.
QVS_API void qvcTrace(const char *fmt, ...) __attribute__((format(printf, 1, 2)));

// qvcTraceError traces a result code; nothing for 0 and from 12288 on.
QVS_API void qvcTraceError(qvsResult code);

// qvcTraceFunction traces that the function `name` was entered.
QVS_API void qvcTraceFunction(const char *name);

// qvcTraceString traces `str` in the printf-style format `fmt`, which takes one text and may add
// up to 90 bytes to it.
QVS_API void qvcTraceString(const char *fmt, const char *str);

// qvcTraceExcption traces a message with the source path and line that it comes from.
QVS_API void qvcTraceExcption(const char *message, const char *file, int line);

// qvcTraceDump22 fills _szBuffer with a dump of `len` bytes, as qvsStrBinaryDump does; data that
// does not fit is cut off.
QVS_API void qvcTraceDump22(const uint8_t *data, uint32_t len);

// qvcTraceDump traces the label with the length, unless the label is null, and then `len` bytes as
// hexadecimal digits and printable characters, 16 to a line. Nothing for null data.
QVS_API void qvcTraceDump(const char *label, const uint8_t *data, uint32_t len);

QVS_END_DECLS

#ifdef __cplusplus
namespace [[gnu::visibility("hidden")]] qvs {

// What qvcTraceSetSink was given. While it is null nobody can see a message, and this one test is
// all that tracing costs.
extern qvcTraceSink traceSink;

// Traces a text as it stands.
void traceText(const char *text);

// The trace functions as the library calls them.
template <class... Args>
inline void trace(const char *format, Args... args)
{
    if (traceSink) [[unlikely]] {
        if constexpr (sizeof...(args) == 0) {
            traceText(format);
        } else {
            qvcTrace(format, args...);
        }
    }
}

inline void traceError(qvsResult code)
{
    if (traceSink) [[unlikely]] {
        qvcTraceError(code);
    }
}

inline void traceException(const char *message, const char *file, int line)
{
    if (traceSink) [[unlikely]] {
        qvcTraceExcption(message, file, line);
    }
}

} // namespace qvs
#endif

#endif
