// What is measured: a message, the library's calls on it, and the heap work that its records need.
#pragma once

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvspushhandler.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace bench {

// A file made by bench/documents.py; ends the program when it cannot be read.
std::vector<uint8_t> readFile(const std::string &path);

// The functions of a library, found in it by name, so that any build of it can be measured.
struct Library {
    explicit Library(const char *path);

    // 0 for a message that is accepted: parses it with its header, and releases everything.
    bool parseAndRelease(const std::vector<uint8_t> &message) const;

    decltype(&smlpushHdlrParsingWSPHeader) parseHeader;
    decltype(&qvsClinetProvWbxmlDecoderMain) parseBody;
    decltype(&qvsClientProvCtxDelectContext) releaseContext;
    decltype(&qvsClientProvWbxmlInitDecoder) initDecoder;
    decltype(&qvsClientProvWbxmlDecoder) decode;
    decltype(&qvsClientProvWbxmlDeleteDecoder) deleteDecoder;
    decltype(&qvsClientProvCtxMakeContext) makeContext;
    decltype(&qvsClientProvWbxmlDeleteWapDoc) deleteDocument;
    void (*freeBlock)(void *block); // qvsMemFree_debug
    void *handle;                   // for what not every build has
};

// The heap work of a message, read from NAME.floor.
class Floor {
public:
    explicit Floor(const std::string &path);

    // Does it once with malloc, calloc, memcpy and free.
    void replay();

private:
    enum Kind : uint32_t { kCopy, kZero, kFree };
    struct Operation {
        Kind kind;
        uint32_t slot;
        size_t size;
    };

    std::vector<Operation> operations_;
    std::vector<void *> slots_;
    std::vector<char> source_; // what copies are made of
};

} // namespace bench
