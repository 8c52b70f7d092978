// A byte buffer that grows, and whose head moves: data is appended at the tail, inserted at or
// consumed from the head, and cut out of the middle. Valid C and C++.
#ifndef SMLBUFFER_H
#define SMLBUFFER_H

#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

// storage <= head <= tail <= end and size = tail - head, always, but for two states that have their
// numbers all the same and that every operation is safe in: a buffer from which more was pulled
// than it held, and a duplicate.
typedef struct smlBuffer {
    uint8_t *pHead;     // first byte of the data
    uint8_t *pStorage;  // the block; an own one has a zero byte more than the capacity
    uint8_t *pTail;     // behind the last byte of the data
    uint8_t *pEnd;      // storage + capacity
    uint32_t nSize;     // bytes of data
    uint32_t nCapacity; // bytes of storage
    uint32_t bOutside;  // 1 when the storage belongs to the caller: neither grown nor released
} smlBuffer;

// Every result is QVS_ERROR_BUFFER_NONE for a null buffer.

// smlBufferCreate makes an empty buffer, which the caller owns, with room for `capacity` bytes.
// QVS_ERROR_NO_MEMORY with *buffer null without memory.
QVS_NODISCARD QVS_API qvsResult smlBufferCreate(smlBuffer **buffer, uint32_t capacity);

// smlBufferCreateOutsideBuf makes an empty buffer over `capacity` bytes of the caller's, which are
// cleared and have to outlive it. Fails as smlBufferCreate does; QVS_ERROR_BUFFER_NONE for null
// storage.
QVS_NODISCARD QVS_API qvsResult smlBufferCreateOutsideBuf(smlBuffer **buffer, uint8_t *storage,
                                                          uint32_t capacity);

// smlBufferInit empties the buffer and clears its storage.
QVS_NODISCARD QVS_API qvsResult smlBufferInit(smlBuffer *buffer);

// smlBufferDelete releases the record, and the storage unless it is the caller's.
QVS_NODISCARD QVS_API qvsResult smlBufferDelete(smlBuffer *buffer);

// smlBufferDuplicate makes a buffer, which the caller owns, with a copy of the storage of `source`,
// its size, and its positions mirrored at the start of the storage. QVS_ERROR_NO_MEMORY with *out
// null without memory.
QVS_NODISCARD QVS_API qvsResult smlBufferDuplicate(smlBuffer **out, const smlBuffer *source);

// smlBufferRealloc adds `wanted` bytes of room, at least 512, and moves the data to the start of
// the storage. QVS_ERROR_BUFFER_OUTSIDE for the caller's storage, QVS_ERROR_NO_MEMORY without
// memory; nothing has changed then.
QVS_NODISCARD QVS_API qvsResult smlBufferRealloc(smlBuffer *buffer, uint32_t wanted);

// smlBufferAppendTail appends `count` bytes and grows the buffer when less than one byte would be
// left behind them. No bytes and null change nothing. Fails as smlBufferRealloc does.
QVS_NODISCARD QVS_API qvsResult smlBufferAppendTail(smlBuffer *buffer, const uint8_t *bytes,
                                                    uint32_t count);

// smlBufferAppendStr appends a text without its NUL.
QVS_NODISCARD QVS_API qvsResult smlBufferAppendStr(smlBuffer *buffer, const char *text);

// smlBufferInsertHead inserts `count` bytes in front of the data: into the room before it if that
// is enough, else the data moves up, and the buffer grows when it has to. No bytes and null change
// nothing. Fails as smlBufferRealloc does.
QVS_NODISCARD QVS_API qvsResult smlBufferInsertHead(smlBuffer *buffer, const uint8_t *bytes,
                                                    uint32_t count);

// smlBufferGetData moves `count` bytes from the head of the data to `destination`.
// QVS_ERROR_BUFFER_RANGE, with nothing changed, when there are fewer or none at all;
// QVS_ERROR_BUFFER_NONE for a null destination.
QVS_NODISCARD QVS_API qvsResult smlBufferGetData(smlBuffer *buffer, uint8_t *destination,
                                                 uint32_t count);

// smlBufferPull consumes `count` bytes. Nothing keeps it from consuming more than there are.
QVS_NODISCARD QVS_API qvsResult smlBufferPull(smlBuffer *buffer, uint32_t count);

// smlBufferShifthead moves the data to the start of the storage and clears what is behind it.
QVS_NODISCARD QVS_API qvsResult smlBufferShifthead(smlBuffer *buffer);

// smlBufferCut removes `count` bytes at `offset` from the head, or all up to the end of the data.
// QVS_ERROR_BUFFER_RANGE when there is no data or the offset is behind it.
QVS_NODISCARD QVS_API qvsResult smlBufferCut(smlBuffer *buffer, uint32_t offset, uint32_t count);

// smlBufferGetDataBuffer gives the data at `offset` from the head, valid until the buffer changes;
// null when the offset is behind the data.
QVS_API uint8_t *smlBufferGetDataBuffer(const smlBuffer *buffer, uint32_t offset);

// smlBufferGetDataSize gives the bytes of data, smlBufferGetRemainSize the room behind them; 0 for
// a null buffer.
QVS_API uint32_t smlBufferGetDataSize(const smlBuffer *buffer);
QVS_API uint32_t smlBufferGetRemainSize(const smlBuffer *buffer);

QVS_END_DECLS

#ifdef __cplusplus
namespace [[gnu::visibility("hidden")]] qvs {

// Makes a buffer, which the caller owns, that holds `length` bytes of `data` as if they had been
// appended to an empty one of that capacity, with one block instead of two. QVS_ERROR_NO_MEMORY
// with *buffer null without memory.
QVS_NODISCARD qvsResult makeBuffer(smlBuffer **buffer, const uint8_t *data, uint32_t length);

} // namespace qvs
#endif

#endif
