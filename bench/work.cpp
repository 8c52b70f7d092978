#include "work.h"

#include <dlfcn.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>

namespace bench {

namespace {

[[noreturn]] void fail(const char *what, const std::string &which)
{
    fprintf(stderr, "bench: %s: %s\n", what, which.c_str());
    exit(1);
}

struct RecordSize {
    const char *name;
    size_t size;
};

// The records of the context have a spare byte.
#define RECORD(name)                                                                               \
    {                                                                                              \
#name, sizeof(name)                                                                        \
    }
#define CONTEXT(name)                                                                              \
    {                                                                                              \
#name "+1", sizeof(name) + 1                                                               \
    }

constexpr RecordSize kRecords[] = {
    RECORD(smlpushHdlrInfo),
    RECORD(qvsWbxmlDecoder),
    RECORD(smlBuffer),
    RECORD(qvsList),
    RECORD(qvsListNode),
    RECORD(qvsWapDoc),
    RECORD(qvsWapCharacter),
    RECORD(qvsWapPxLogical),
    RECORD(qvsWapPxAuthInfo),
    RECORD(qvsWapPort),
    RECORD(qvsWapPxPhysical),
    RECORD(qvsWapNapDef),
    RECORD(qvsWapNapAuthInfo),
    RECORD(qvsWapValidity),
    RECORD(qvsWapAppAddr),
    RECORD(qvsWapResource),
    RECORD(qvsWapAppAuth),
    RECORD(qvsWapApplication),
    RECORD(qvsWapBootstrap),
    RECORD(qvsWapVendorConfig),
    RECORD(qvsWapClientIdentity),
    RECORD(qvsWapAccess),
    RECORD(qvsWapRoaming),
    RECORD(qvsWapWifi),
    RECORD(qvsWapVoWifi),
    CONTEXT(qvsCtxStrNode),
    CONTEXT(qvsCtxPxAuthInfo),
    CONTEXT(qvsCtxPort),
    CONTEXT(qvsCtxPxPhysical),
    CONTEXT(qvsCtxPxLogical),
    CONTEXT(qvsCtxNapAuthInfo),
    CONTEXT(qvsCtxValidity),
    CONTEXT(qvsCtxNapDef),
    CONTEXT(qvsCtxAppAddr),
    CONTEXT(qvsCtxAppAuth),
    CONTEXT(qvsCtxResource),
    CONTEXT(qvsCtxRoaming),
    CONTEXT(qvsCtxApplication),
    CONTEXT(qvsCtxBootstrap),
    CONTEXT(qvsCtxClientIdent),
    CONTEXT(qvsCtxVendorConfig),
    CONTEXT(qvsCtxAccess),
    CONTEXT(qvsCtxWifi),
    CONTEXT(qvsCtxVoWifi),
    CONTEXT(qvsClientProvCtx),
};

#undef RECORD
#undef CONTEXT

size_t sizeOf(const std::string &record)
{
    for (const RecordSize &known : kRecords) {
        if (record == known.name) {
            return known.size;
        }
    }
    fail("no such record", record);
}

// Above this size calloc is cheaper than malloc and memset, since it need not clear what the system
// hands out cleared; below it, it is dearer, since it passes over the blocks that a thread keeps.
constexpr size_t kClearedByCalloc = 65536;

template <class Function>
void find(void *library, const char *name, Function *function)
{
    *function = reinterpret_cast<Function>(dlsym(library, name));
    if (!*function) {
        fail("not in the library", name);
    }
}

} // namespace

std::vector<uint8_t> readFile(const std::string &path)
{
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        fail("cannot read", path);
    }
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

Library::Library(const char *path)
{
    handle = dlopen(path, RTLD_NOW);
    if (!handle) {
        fail("cannot load", dlerror());
    }
    find(handle, "smlpushHdlrParsingWSPHeader", &parseHeader);
    find(handle, "qvsClinetProvWbxmlDecoderMain", &parseBody);
    find(handle, "qvsClientProvCtxDelectContext", &releaseContext);
    find(handle, "qvsClientProvWbxmlInitDecoder", &initDecoder);
    find(handle, "qvsClientProvWbxmlDecoder", &decode);
    find(handle, "qvsClientProvWbxmlDeleteDecoder", &deleteDecoder);
    find(handle, "qvsClientProvCtxMakeContext", &makeContext);
    find(handle, "qvsClientProvWbxmlDeleteWapDoc", &deleteDocument);
    find(handle, "qvsMemFree_debug", &freeBlock);
}

bool Library::parseAndRelease(const std::vector<uint8_t> &message) const
{
    smlpushHdlrInfo *header = parseHeader(message.data(), static_cast<uint32_t>(message.size()));
    if (!header) {
        return false;
    }
    qvsClientProvCtx *context = parseBody(header->pBody, header->nBodyLen);
    if (context) {
        releaseContext(context);
    }
    freeBlock(header->pBody);
    freeBlock(header);
    return context != nullptr;
}

Floor::Floor(const std::string &path)
{
    std::ifstream file(path);
    if (!file) {
        fail("cannot read", path);
    }
    std::string what;
    uint32_t slot = 0;
    size_t longest = 0;
    while (file >> what >> slot) {
        Operation operation = {kFree, slot, 0};
        if (what == "copy") {
            operation.kind = kCopy;
            file >> operation.size;
            longest = operation.size > longest ? operation.size : longest;
        } else if (what == "zero") {
            std::string record;
            file >> record;
            operation.kind = kZero;
            operation.size = sizeOf(record);
        } else if (what != "free") {
            fail("no such operation", what);
        }
        if (slot >= slots_.size()) {
            slots_.resize(slot + 1);
        }
        operations_.push_back(operation);
    }
    source_.resize(longest);
}

void Floor::replay()
{
    void **slots = slots_.data();
    const char *source = source_.data();
    for (const Operation &operation : operations_) {
        switch (operation.kind) {
        case kCopy:
            slots[operation.slot] = malloc(operation.size);
            memcpy(slots[operation.slot], source, operation.size);
            break;
        case kZero:
            if (operation.size >= kClearedByCalloc) {
                slots[operation.slot] = calloc(1, operation.size);
            } else {
                void *block = malloc(operation.size);
                asm volatile("" : "+r"(block)); // or the compiler makes a calloc of the two
                slots[operation.slot] = memset(block, 0, operation.size);
            }
            break;
        case kFree:
            free(slots[operation.slot]);
            break;
        }
    }
}

} // namespace bench
