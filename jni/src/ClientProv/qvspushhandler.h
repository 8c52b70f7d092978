// The header of a pushed message: a connectionless WSP Push PDU, of which the content type and the
// two security parameters of OMA Client Provisioning are read. Valid C and C++.
#ifndef QVSPUSHHANDLER_H
#define QVSPUSHHANDLER_H

#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

#define SMLPUSH_MAC_SIZE 44

// A parsed header and its own copy of the body.
typedef struct smlpushHdlrInfo {
    uint32_t nContentType; // code of the media type as assigned by WSP: 53, 54, 66, 68 or 78
    uint32_t nHeaderLen;   // bytes from offset 3 to the body
    uint32_t nBodyLen;
    uint32_t nMacLen;             // characters of the MAC; 0 without one
    uint32_t nSec;                // security method as sent, with its high bit; 0 without one
    char szMac[SMLPUSH_MAC_SIZE]; // NUL-terminated
    uint8_t *pBody;               // nBodyLen bytes and a zero byte
} smlpushHdlrInfo;

// smlpushHdlrParsingWSPHeader parses `length` bytes of a pushed message into a new record. Null for
// a message that is null, not a push, cut short, or of an unknown content type, and without memory.
// The caller owns the record and its body, two blocks; the message may go after the call.
QVS_API smlpushHdlrInfo *smlpushHdlrParsingWSPHeader(const uint8_t *message, uint32_t length);

QVS_END_DECLS

#ifdef __cplusplus
namespace [[gnu::visibility("hidden")]] qvs {

// Releases the record and its body; null is ignored.
void releasePushHeader(smlpushHdlrInfo *info);

} // namespace qvs
#endif

#endif
