// Trace messages, formed only while there is a sink to take them.
#include "qvstrace.h"

#include "qvsmemory.h"
#include "qvsstring.h"

#include <stdarg.h>
#include <stdio.h>

qvcTraceSink qvs::traceSink = nullptr;

char _szBuffer[QVC_TRACE_DUMP_SIZE];

namespace {

constexpr char kModule[] = "jni/src/ClientProv/qvstrace";
constexpr char kPrefix[] = "[Syncml] ";

char lineBuffer[20480];

// The result codes that qvcTraceError knows, and what it takes off the second kind.
constexpr qvsResult kFirstDmCode = 4096;
constexpr qvsResult kEndOfDmCodes = 12288;
constexpr qvsResult kDmBase = 8192;

// As much data as a dump of it fits into _szBuffer: a full line takes 69 bytes, each further byte
// 4, the NUL 1.
constexpr uint32_t kDumpLine = 4 * qvs::kDumpColumns + 5;
constexpr uint32_t kDumpLines = (QVC_TRACE_DUMP_SIZE - 1) / kDumpLine;
constexpr uint32_t kDumpBytes =
    kDumpLines * qvs::kDumpColumns + (QVC_TRACE_DUMP_SIZE - 1 - kDumpLines * kDumpLine) / 4;
static_assert(4 * kDumpBytes + 5 * (kDumpBytes / qvs::kDumpColumns) + 1 <= QVC_TRACE_DUMP_SIZE);

// What a formatting function says it would have written into `size` bytes, cut to what it did.
uint32_t written(int length, uint32_t size)
{
    // hardened: a text that cannot be formatted is empty.
    if (length < 0) {
        return 0;
    }
    // hardened: a text that does not fit is cut off.
    return static_cast<uint32_t>(length) < size ? static_cast<uint32_t>(length) : size - 1;
}

// Zeros for one message.
struct Block {
    explicit Block(uint32_t bytes, int from = __builtin_LINE())
        : text(static_cast<char *>(qvsMemAllocSetZero_debug(bytes, kModule, from))), size(bytes)
    {
    }
    Block(const Block &) = delete;
    Block &operator=(const Block &) = delete;
    ~Block() { qvsMemFree_debug(text); }

    char *text;
    uint32_t size;
};

// Forms one message in its block and hands it over; nothing without the block.
__attribute__((format(printf, 2, 3))) void send(const Block &block, const char *fmt, ...)
{
    if (!block.text) {
        return;
    }
    va_list args;
    va_start(args, fmt);
    const int length = vsnprintf(block.text, block.size, fmt, args);
    va_end(args);
    qvs::traceSink(block.text, written(length, block.size));
}

} // namespace

void qvcTraceSetSink(qvcTraceSink sink)
{
    qvs::traceSink = sink;
}

void qvcTrace(const char *fmt, ...)
{
    // hardened: nothing is traced for a null format.
    if (!qvs::traceSink || !fmt) {
        return;
    }
    // One byte is kept for the line end.
    constexpr uint32_t kRoom = sizeof(lineBuffer) - 1;
    va_list args;
    va_start(args, fmt);
    const uint32_t length = written(vsnprintf(lineBuffer, kRoom, fmt, args), kRoom);
    va_end(args);
    lineBuffer[length] = '\n';
    lineBuffer[length + 1] = '\0';
    qvs::traceSink(lineBuffer, length + 1);
}

void qvs::traceText(const char *text)
{
    qvcTrace("%s", text);
}

void qvcTraceError(qvsResult code)
{
    if (!qvs::traceSink || code == QVS_OK || code >= kEndOfDmCodes) {
        return;
    }
    char text[80];
    int length = 0;
    if (code < kFirstDmCode) {
        length = snprintf(text, sizeof(text), "%sERROR : %x\n", kPrefix, code);
    } else {
        // kept[trace-error-wraps]: a code below 8192 is shown as what is left modulo 2^32.
        length = snprintf(text, sizeof(text), "%sERROR : DM = %x\n", kPrefix, code - kDmBase);
    }
    qvs::traceSink(text, written(length, sizeof(text)));
}

void qvcTraceFunction(const char *name)
{
    // hardened: nothing is traced for a null name.
    if (!qvs::traceSink || !name) {
        return;
    }
    send(Block(qvsStrlen(name) + 31), "%s%s()\n", kPrefix, name);
}

void qvcTraceString(const char *fmt, const char *str)
{
    // hardened: nothing is traced for a null format.
    if (!qvs::traceSink || !fmt) {
        return;
    }
    // hardened: a null text is an empty one.
    const char *shown = str ? str : "";
    const uint32_t size = qvsStrlen(shown) + 101;
    const Block text(size);
    const Block message(size);
    if (text.text) {
        // As much as the message holds beside the prefix and the line end.
        (void)snprintf(text.text, size - sizeof(kPrefix), fmt, shown);
        send(message, "%s%s\n", kPrefix, text.text);
    }
}

void qvcTraceExcption(const char *message, const char *file, int line)
{
    if (!qvs::traceSink) {
        return;
    }
    // hardened: a null text is an empty one.
    const char *what = message ? message : "";
    const char *where = file ? file : "";
    // kept[trace-exception-joined]: nothing stands between the path and the line.
    send(Block(qvsStrlen(what) + qvsStrlen(where) + 41), "%s%s %s%d\n", kPrefix, what, where, line);
}

void qvcTraceDump22(const uint8_t *data, uint32_t len)
{
    // hardened: data whose dump does not fit is cut off.
    qvsStrBinaryDump(_szBuffer, data, len < kDumpBytes ? len : kDumpBytes);
}

void qvcTraceDump(const char *label, const uint8_t *data, uint32_t len)
{
    if (!qvs::traceSink || !data) {
        return;
    }
    if (label) {
        qvcTrace("%s length:%d", label, static_cast<int>(len));
    }
    for (uint32_t i = 0; i < len; i += qvs::kDumpColumns) {
        const uint32_t left = len - i;
        char text[100];
        qvs::dumpLine(text, data + i, left < qvs::kDumpColumns ? left : qvs::kDumpColumns, "   ");
        qvcTrace("%s", text);
        if (left <= qvs::kDumpColumns) {
            return;
        }
    }
}
