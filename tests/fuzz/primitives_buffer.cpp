// A byte buffer beside a vector of its data; blocks and traces.
#include "check.h"
#include "script.h"

#include "qvsmemory.h"
#include "qvstrace.h"
#include "smlbuffer.h"

namespace fuzz {

namespace {

using Bytes = std::vector<uint8_t>;

class BufferModel {
public:
    explicit BufferModel(size_t capacity, bool ownStorage)
        : storage(ownStorage ? 0 : capacity), isOwn(ownStorage)
    {
        const auto room = static_cast<uint32_t>(capacity);
        const qvsResult result = isOwn ? smlBufferCreate(&buffer, room)
                                       : smlBufferCreateOutsideBuf(&buffer, storage, room);
        check(result == QVS_OK, "a buffer is made");
    }

    void checkData() const
    {
        const uint8_t *head = smlBufferGetDataBuffer(buffer, 0);
        check(smlBufferGetDataSize(buffer) == data.size() &&
                  std::equal(data.begin(), data.end(), head),
              "the buffer holds its data");
        check(!smlBufferGetDataBuffer(buffer, static_cast<uint32_t>(data.size()) + 1),
              "there is nothing behind the data");
        check(buffer->pStorage <= buffer->pHead && buffer->pHead <= buffer->pTail &&
                  buffer->pTail <= buffer->pEnd,
              "head and tail stand inside the storage");
        check(smlBufferGetRemainSize(buffer) == static_cast<size_t>(buffer->pEnd - buffer->pTail),
              "so does the room");
        check(!isOwn || *buffer->pEnd == 0, "a zero byte ends an own storage");
    }

    void append(const Bytes &more)
    {
        if (grew(smlBufferAppendTail(buffer, more.data(), size(more)))) {
            data.insert(data.end(), more.begin(), more.end());
        }
    }

    void append(const std::string &text)
    {
        if (grew(smlBufferAppendStr(buffer, text.c_str()))) {
            data.insert(data.end(), text.begin(), text.end());
        }
    }

    void insert(const Bytes &more)
    {
        if (grew(smlBufferInsertHead(buffer, more.data(), size(more)))) {
            data.insert(data.begin(), more.begin(), more.end());
        }
    }

    void grow(uint32_t wanted)
    {
        const uint32_t capacity = buffer->nCapacity;
        if (grew(smlBufferRealloc(buffer, wanted))) {
            check(buffer->nCapacity == capacity + std::max(wanted, 512U), "a buffer grows by 512");
        }
    }

    void take(size_t count)
    {
        const Exact<uint8_t> taken(count);
        const bool there = !data.empty() && count <= data.size();
        const qvsResult result = smlBufferGetData(buffer, taken, static_cast<uint32_t>(count));
        check(result == (there ? QVS_OK : QVS_ERROR_BUFFER_RANGE),
              "data is taken if there is some");
        if (there) {
            check(std::equal(taken + 0, taken + count, data.begin()), "what is taken is the head");
            consume(count);
        }
    }

    void pull(size_t count)
    {
        const size_t pulled = std::min(count, data.size());
        check(smlBufferPull(buffer, static_cast<uint32_t>(pulled)) == QVS_OK, "data is dropped");
        consume(pulled);
    }

    void shift()
    {
        check(smlBufferShifthead(buffer) == QVS_OK && buffer->pHead == buffer->pStorage,
              "the data moves to the start");
    }

    void cut(size_t offset, size_t count)
    {
        const bool there = !data.empty() && offset <= data.size();
        const qvsResult result =
            smlBufferCut(buffer, static_cast<uint32_t>(offset), static_cast<uint32_t>(count));
        check(result == (there ? QVS_OK : QVS_ERROR_BUFFER_RANGE), "a cut begins inside the data");
        if (!there) {
            return;
        }
        count = std::min(count, data.size() - offset);
        const auto start = data.begin() + static_cast<std::ptrdiff_t>(offset);
        const bool toEnd = offset + count == data.size();
        data.erase(start, start + static_cast<std::ptrdiff_t>(count));
        if (toEnd) { // as many bytes are cleared at the head instead
            std::fill_n(data.begin(), std::min(count, data.size()), uint8_t{0});
        }
    }

    void duplicate()
    {
        smlBuffer *copy = nullptr;
        check(smlBufferDuplicate(&copy, buffer) == QVS_OK, "a duplicate is made");
        check(smlBufferGetDataSize(copy) == data.size(), "of the same size");
        check(smlBufferDelete(copy) == QVS_OK, "and goes");
    }

    void clear()
    {
        check(smlBufferInit(buffer) == QVS_OK, "a buffer is emptied");
        data.clear();
    }

    ~BufferModel() { (void)smlBufferDelete(buffer); }
    BufferModel(const BufferModel &) = delete;
    BufferModel &operator=(const BufferModel &) = delete;

private:
    static uint32_t size(const Bytes &bytes) { return static_cast<uint32_t>(bytes.size()); }

    bool grew(qvsResult result) const
    {
        check(result == QVS_OK || (!isOwn && result == QVS_ERROR_BUFFER_OUTSIDE),
              "only the storage of a caller does not grow", result);
        return result == QVS_OK;
    }

    void consume(size_t count)
    {
        data.erase(data.begin(), data.begin() + static_cast<std::ptrdiff_t>(count));
    }

    Exact<uint8_t> storage;
    bool isOwn;
    smlBuffer *buffer = nullptr;
    Bytes data;
};

void step(Script *script, BufferModel *model)
{
    switch (script->below(10)) {
    case 0:
        return model->append(script->bytes());
    case 1:
        return model->append(script->text());
    case 2:
    case 3:
        return model->insert(script->bytes());
    case 4:
        return model->take(script->byte());
    case 5:
        return model->pull(script->byte());
    case 6:
        return model->shift();
    case 7: {
        const size_t offset = script->byte();
        return model->cut(offset, script->byte());
    }
    case 8:
        return script->below(4) ? model->grow(script->byte() * 8U) : model->clear();
    default:
        return model->duplicate();
    }
}

void checkTrace(const char *text, uint32_t length)
{
    check(strlen(text) == length && length < 20480, "a trace is as long as it says");
}

void traces(const std::string &text, const Bytes &bytes, uint32_t code)
{
    qvcTraceSetSink(checkTrace);
    qvcTrace("%s length:%d", text.c_str(), static_cast<int>(bytes.size()));
    qvcTraceError(code);
    qvcTraceFunction(text.c_str());
    qvcTraceString("[%s]", text.c_str());
    qvcTraceExcption(text.c_str(), text.c_str(), static_cast<int>(code));
    const Exact<uint8_t> data(bytes);
    qvcTraceDump(code % 2 ? text.c_str() : nullptr, data, static_cast<uint32_t>(bytes.size()));
    qvcTraceDump22(data, static_cast<uint32_t>(bytes.size()));
    check(strlen(_szBuffer) ==
              4 * bytes.size() + (bytes.empty() ? 0 : 5 * ((bytes.size() - 1) / 16)),
          "a dump has a place for every byte");
    qvcTraceSetSink(nullptr);
}

} // namespace

void runBuffer(Script *script)
{
    const size_t capacity = script->byte();
    BufferModel model(capacity, script->below(4) != 0);
    while (!script->isOver()) {
        step(script, &model);
        model.checkData();
    }
}

void runMemory(Script *script)
{
    const uint32_t code = script->word();
    const std::string text = script->text();
    const Bytes bytes = script->bytes();
    const auto size = static_cast<uint32_t>(bytes.size());
    const bool tracked = code & 1;
    if (tracked) {
        qvsMemStartMemCheck();
    }
    char *copy = qvsStrdup_debug(Exact<char>(text), "fuzz", __LINE__);
    check(memcmp(copy, (text + std::string(4, '\0')).c_str(), text.size() + 5) == 0,
          "the copy of a text ends in zero bytes");
    const Exact<uint8_t> block(bytes);
    void *same = qvsMemDup_debug(block, size, "fuzz", __LINE__);
    check(qvsMemCmp(same, block, size) == 0, "the copy of a block is the same");
    const uint32_t part = size ? code % (size + 1) : 0;
    void *shrunk = qvsMemReAlloc_debug(same, part, "fuzz", __LINE__);
    check((shrunk != nullptr) == (part != 0) && (!shrunk || qvsMemCmp(shrunk, block, part) == 0),
          "a block shrinks to its start");
    qvsMemFree_debug(shrunk ? shrunk : same);
    uint16_t *units = qvsMemAllocW_debug(size + 1, "fuzz", __LINE__);
    qvsMemSetW(units, static_cast<uint16_t>(code), size + 1);
    check(std::count(units, units + size + 1, static_cast<uint16_t>(code)) ==
              static_cast<std::ptrdiff_t>(size) + 1,
          "every unit is set");
    qvsMemFree_debug(units);
    qvsMemFree_debug(copy);
    if (tracked) {
        qvsMemEndMemCheck();
    }
    traces(text, bytes, code >> 1);
}

} // namespace fuzz
