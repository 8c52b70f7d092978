// Result codes of the library, and the marks that an exported declaration carries.
// Valid C and C++.
#ifndef QVSRESULT_H
#define QVSRESULT_H

#include <stdint.h>

#ifdef __cplusplus
#define QVS_BEGIN_DECLS extern "C" {
#define QVS_END_DECLS }
#define QVS_NODISCARD [[nodiscard]]
#else
#define QVS_BEGIN_DECLS
#define QVS_END_DECLS
#define QVS_NODISCARD
#endif

// Everything else is hidden.
#define QVS_API __attribute__((visibility("default")))

// 0 for success. Two families of functions use other senses and say so: the releases of the
// document tree (1 released, 0 nothing to release) and the byte readers (1 read, 0 not).
typedef uint32_t qvsResult;

enum {
    QVS_OK = 0,
    // A document-level allocation failed, or a child that its parent does not accept.
    QVS_ERROR_FAILED = 1,
    QVS_ERROR_BAD_ARGUMENT = 2,
    // Element, attribute, value token or code page that is unknown or out of place.
    QVS_ERROR_WBXML_UNKNOWN_ELEMENT = 4101,
    // The data ended, or a string could not be read.
    QVS_ERROR_WBXML_NO_DATA = 4103,
    QVS_ERROR_WBXML_NO_BUFFER = 4106,
    QVS_ERROR_WBXML_DOCUMENT_TYPE = 4107,
    QVS_ERROR_LIST_ARGUMENT = 4108,
    QVS_ERROR_LIST_NO_MEMORY = 4109,
    QVS_ERROR_LIST_NOT_FOUND = 4110,
    // An allocation of the byte buffer or of the comma join failed, or the text decoded from one
    // message passed its limit.
    QVS_ERROR_NO_MEMORY = 4111,
    QVS_ERROR_BUFFER_OUTSIDE = 4112,
    QVS_ERROR_BUFFER_NONE = 4113,
    QVS_ERROR_BUFFER_RANGE = 4114
};

#endif
