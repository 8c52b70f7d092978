// The byte buffer. Positions are reckoned as 32-bit offsets from the start of the storage, which
// wrap as its numbers do, so that those of a record that is out of step can be told from the good
// ones before anything is read or written there.
#include "smlbuffer.h"

#include "qvsmemory.h"
#include "qvsstring.h"

#include <string.h>

namespace {

constexpr char kModule[] = "jni/src/ClientProv/smlbuffer";

constexpr uint32_t kLeastGrowth = 512;
constexpr uint32_t kAppendSpare = 256;

// `to` - `from`, wrapped to 32 bits; also for pointers that do not lie in one block.
uint32_t distance(const uint8_t *from, const uint8_t *to)
{
    return static_cast<uint32_t>(reinterpret_cast<uintptr_t>(to) -
                                 reinterpret_cast<uintptr_t>(from));
}

// The position `back` bytes before `start`, which may lie before the block.
uint8_t *mirrored(const uint8_t *start, uint32_t back)
{
    return reinterpret_cast<uint8_t *>(reinterpret_cast<uintptr_t>(start) - back);
}

uint32_t headOffset(const smlBuffer *buffer)
{
    return distance(buffer->pStorage, buffer->pHead);
}

// Whether all the data lies in the storage.
bool holdsItsData(const smlBuffer *buffer)
{
    const uint32_t offset = headOffset(buffer);
    return offset <= buffer->nCapacity && buffer->nSize <= buffer->nCapacity - offset;
}

// What a buffer grows by when `wanted` bytes are.
uint32_t grownBy(uint32_t wanted)
{
    return wanted > kLeastGrowth ? wanted : kLeastGrowth;
}

void place(smlBuffer *buffer, uint32_t offset, uint32_t size)
{
    buffer->pHead = buffer->pStorage + offset;
    buffer->pTail = buffer->pHead + size;
    buffer->nSize = size;
}

// Puts a record in step that is not, before data is moved in it.
void settle(smlBuffer *buffer)
{
    if (holdsItsData(buffer)) {
        // hardened: the tail of a duplicate stands behind its data.
        buffer->pTail = buffer->pHead + buffer->nSize;
        return;
    }
    // hardened: data that would lie outside the storage counts as none.
    const uint32_t offset = headOffset(buffer);
    place(buffer, offset <= buffer->nCapacity ? offset : 0, 0);
}

// Zeroed storage with its spare byte; null without memory.
uint8_t *newStorage(uint32_t capacity, int line = __builtin_LINE())
{
    // hardened: a block whose bytes cannot be counted in 32 bits cannot be had.
    if (capacity == UINT32_MAX) {
        return nullptr;
    }
    return static_cast<uint8_t *>(qvsMemAllocSetZero_debug(capacity + 1, kModule, line));
}

// memcpy and memmove, without their trouble with null and 0 bytes.
void move(uint8_t *to, const uint8_t *from, uint32_t count)
{
    if (count > 0) {
        memmove(to, from, count);
    }
}

} // namespace

qvsResult qvs::makeBuffer(smlBuffer **buffer, const uint8_t *data, uint32_t length)
{
    // As an empty buffer of this length would have grown for the data.
    if (length > UINT32_MAX / 2 - kAppendSpare) {
        *buffer = nullptr;
        return QVS_ERROR_NO_MEMORY;
    }
    const uint32_t growth = grownBy(length + kAppendSpare);
    if (qvsResult result = smlBufferCreate(buffer, length ? length + growth : 0)) {
        return result;
    }
    move((*buffer)->pStorage, data, length);
    place(*buffer, 0, length);
    return QVS_OK;
}

qvsResult smlBufferCreate(smlBuffer **buffer, uint32_t capacity)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    *buffer = nullptr;
    smlBuffer *made = qvs::newRecord<smlBuffer>(kModule);
    if (!made) {
        return QVS_ERROR_NO_MEMORY;
    }
    made->pStorage = newStorage(capacity);
    if (!made->pStorage) {
        qvsMemFree_debug(made);
        return QVS_ERROR_NO_MEMORY;
    }
    made->pEnd = made->pStorage + capacity;
    made->nCapacity = capacity;
    place(made, 0, 0);
    *buffer = made;
    return QVS_OK;
}

qvsResult smlBufferCreateOutsideBuf(smlBuffer **buffer, uint8_t *storage, uint32_t capacity)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    *buffer = nullptr;
    // hardened: a buffer is not made over nothing.
    if (!storage) {
        return QVS_ERROR_BUFFER_NONE;
    }
    smlBuffer *made = qvs::newRecord<smlBuffer>(kModule);
    if (!made) {
        return QVS_ERROR_NO_MEMORY;
    }
    made->pStorage = storage;
    made->nCapacity = capacity;
    made->bOutside = 1;
    *buffer = made;
    return smlBufferInit(made);
}

qvsResult smlBufferInit(smlBuffer *buffer)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    memset(buffer->pStorage, 0, buffer->nCapacity);
    buffer->pEnd = buffer->pStorage + buffer->nCapacity;
    place(buffer, 0, 0);
    return QVS_OK;
}

qvsResult smlBufferDelete(smlBuffer *buffer)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    if (!buffer->bOutside) {
        qvsMemFree_debug(buffer->pStorage);
    }
    qvsMemFree_debug(buffer);
    return QVS_OK;
}

qvsResult smlBufferDuplicate(smlBuffer **out, const smlBuffer *source)
{
    if (!out || !source) {
        return QVS_ERROR_BUFFER_NONE;
    }
    // hardened: without memory there is no duplicate.
    if (qvsResult result = smlBufferCreate(out, source->nCapacity)) {
        return result;
    }
    smlBuffer *made = *out;
    move(made->pStorage, source->pStorage, source->nCapacity);
    // kept[duplicate-mirrored]: head and tail go as far before the storage as those of the source
    // stand behind its start.
    made->pHead = mirrored(made->pStorage, distance(source->pStorage, source->pHead));
    made->pTail = mirrored(made->pStorage, distance(source->pStorage, source->pTail));
    made->nSize = source->nSize;
    return QVS_OK;
}

qvsResult smlBufferRealloc(smlBuffer *buffer, uint32_t wanted)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    if (buffer->bOutside) {
        return QVS_ERROR_BUFFER_OUTSIDE;
    }
    const uint32_t growth = grownBy(wanted);
    // hardened: a capacity beyond 32 bits cannot be had.
    if (growth > UINT32_MAX - buffer->nCapacity) {
        return QVS_ERROR_NO_MEMORY;
    }
    const uint32_t capacity = buffer->nCapacity + growth;
    uint8_t *storage = newStorage(capacity);
    if (!storage) {
        return QVS_ERROR_NO_MEMORY;
    }
    settle(buffer);
    move(storage, buffer->pHead, buffer->nSize);
    qvsMemFree_debug(buffer->pStorage);
    buffer->pStorage = storage;
    buffer->pEnd = storage + capacity;
    buffer->nCapacity = capacity;
    place(buffer, 0, buffer->nSize);
    return QVS_OK;
}

qvsResult smlBufferAppendTail(smlBuffer *buffer, const uint8_t *bytes, uint32_t count)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    if (count == 0 || !bytes) {
        return QVS_OK;
    }
    settle(buffer);
    // kept[append-exact-fit]: bytes that fit exactly grow the buffer all the same.
    if (count >= distance(buffer->pTail, buffer->pEnd)) {
        // hardened: growth beyond 32 bits cannot be had.
        if (count > UINT32_MAX - kAppendSpare) {
            return buffer->bOutside ? QVS_ERROR_BUFFER_OUTSIDE : QVS_ERROR_NO_MEMORY;
        }
        if (qvsResult result = smlBufferRealloc(buffer, count + kAppendSpare)) {
            return result;
        }
    }
    memcpy(buffer->pTail, bytes, count);
    place(buffer, headOffset(buffer), buffer->nSize + count);
    return QVS_OK;
}

qvsResult smlBufferAppendStr(smlBuffer *buffer, const char *text)
{
    return smlBufferAppendTail(buffer, reinterpret_cast<const uint8_t *>(text), qvsStrlen(text));
}

qvsResult smlBufferInsertHead(smlBuffer *buffer, const uint8_t *bytes, uint32_t count)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    // hardened: null changes nothing.
    if (!bytes) {
        return QVS_OK;
    }
    settle(buffer);
    const uint32_t offset = headOffset(buffer);
    if (count <= offset) {
        place(buffer, offset - count, buffer->nSize + count);
    } else {
        if (count > distance(buffer->pTail, buffer->pEnd)) {
            if (qvsResult result = smlBufferRealloc(buffer, count)) {
                return result;
            }
        }
        move(buffer->pHead + count, buffer->pHead, buffer->nSize);
        place(buffer, headOffset(buffer), buffer->nSize + count);
    }
    move(buffer->pHead, bytes, count);
    return QVS_OK;
}

qvsResult smlBufferGetData(smlBuffer *buffer, uint8_t *destination, uint32_t count)
{
    // hardened: no destination is no buffer.
    if (!buffer || !destination) {
        return QVS_ERROR_BUFFER_NONE;
    }
    if (!buffer->pHead || buffer->nSize == 0 || buffer->nSize < count) {
        return QVS_ERROR_BUFFER_RANGE;
    }
    // hardened: data outside the storage is not there.
    if (!holdsItsData(buffer)) {
        return QVS_ERROR_BUFFER_RANGE;
    }
    memcpy(destination, buffer->pHead, count);
    buffer->pHead += count;
    buffer->nSize -= count;
    return QVS_OK;
}

qvsResult smlBufferPull(smlBuffer *buffer, uint32_t count)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    const uint32_t offset = headOffset(buffer) + count;
    if (offset > buffer->nCapacity) {
        // hardened: a head that would leave the storage has consumed all the data.
        settle(buffer);
        place(buffer, headOffset(buffer) + buffer->nSize, 0);
        return QVS_OK;
    }
    // kept[pull-unchecked]: the size is not looked at, and runs over below 0.
    buffer->pHead = buffer->pStorage + offset;
    buffer->nSize -= count;
    return QVS_OK;
}

qvsResult smlBufferShifthead(smlBuffer *buffer)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    if (buffer->pHead == buffer->pStorage) {
        return QVS_OK;
    }
    settle(buffer);
    move(buffer->pStorage, buffer->pHead, buffer->nSize);
    place(buffer, 0, buffer->nSize);
    memset(buffer->pTail, 0, distance(buffer->pTail, buffer->pEnd));
    return QVS_OK;
}

qvsResult smlBufferCut(smlBuffer *buffer, uint32_t offset, uint32_t count)
{
    if (!buffer) {
        return QVS_ERROR_BUFFER_NONE;
    }
    settle(buffer);
    if (buffer->nSize == 0 || buffer->nSize < offset) {
        return QVS_ERROR_BUFFER_RANGE;
    }
    const uint32_t left = buffer->nSize - offset;
    const uint32_t cut = count < left ? count : left;
    if (cut < left) {
        uint8_t *at = buffer->pHead + offset;
        move(at, at + cut, left - cut);
    } else {
        // kept[cut-clears-head]: a cut up to the end clears as many bytes at the head instead.
        memset(buffer->pHead, 0, cut);
    }
    place(buffer, headOffset(buffer), buffer->nSize - cut);
    return QVS_OK;
}

uint8_t *smlBufferGetDataBuffer(const smlBuffer *buffer, uint32_t offset)
{
    // hardened: there is no data without a buffer.
    if (!buffer || buffer->nSize < offset) {
        return nullptr;
    }
    const uint32_t position = headOffset(buffer) + offset;
    // hardened: nor outside the storage.
    return position <= buffer->nCapacity ? buffer->pStorage + position : nullptr;
}

uint32_t smlBufferGetDataSize(const smlBuffer *buffer)
{
    return buffer ? buffer->nSize : 0;
}

uint32_t smlBufferGetRemainSize(const smlBuffer *buffer)
{
    return buffer ? distance(buffer->pTail, buffer->pEnd) : 0;
}
