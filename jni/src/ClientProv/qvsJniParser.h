// The part of the parse session that a host can see. Valid C and C++.
#ifndef QVSJNIPARSER_H
#define QVSJNIPARSER_H

#include "qvsClientProvCtx.h"
#include "qvsresult.h"

QVS_BEGIN_DECLS

// ptCtx is the context of the last full parse, which the queries read: null before the first one,
// after one whose body could not be decoded, and after the delete method. Owned by the session.
extern QVS_API qvsClientProvCtx *ptCtx;

QVS_END_DECLS

#endif
