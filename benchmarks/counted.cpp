// counted LIBRARY header|parse|floor FILE COUNT: for a tool that counts instructions. Parses the
// header of the message FILE, or decodes its body into a context and releases it, COUNT times with
// a library; or replays the floor's steps in FILE so often. Nothing else is done between.
#include "floor.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvspushhandler.h"

#include <dlfcn.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <vector>

namespace {

template <class Function>
Function *function(void *library, const char *name)
{
    void *symbol = library ? dlsym(library, name) : nullptr;
    if (!symbol) {
        fprintf(stderr, "counted: %s\n", dlerror());
        exit(1);
    }
    return reinterpret_cast<Function *>(symbol);
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 5) {
        fputs("usage: counted LIBRARY header|parse|message|floor FILE COUNT\n", stderr);
        return 2;
    }
    const char *what = argv[2], *name = argv[3];
    const long count = atol(argv[4]);
    if (strcmp(what, "floor") == 0) {
        bench::Floor floor(name);
        for (long i = 0; i < count; i++) {
            floor.replay();
        }
        return 0;
    }

    std::ifstream file(name, std::ios::binary);
    const std::vector<char> bytes(std::istreambuf_iterator<char>(file), {});
    const auto *message = reinterpret_cast<const uint8_t *>(bytes.data());
    const auto length = static_cast<uint32_t>(bytes.size());

    void *library = dlopen(argv[1], RTLD_NOW);
    auto *header =
        function<decltype(smlpushHdlrParsingWSPHeader)>(library, "smlpushHdlrParsingWSPHeader");
    auto *decode =
        function<decltype(qvsClinetProvWbxmlDecoderMain)>(library, "qvsClinetProvWbxmlDecoderMain");
    auto *release =
        function<decltype(qvsClientProvCtxDelectContext)>(library, "qvsClientProvCtxDelectContext");

    const bool each = strcmp(what, "parse") != 0;
    const bool body = strcmp(what, "header") != 0;
    smlpushHdlrInfo *info = each ? nullptr : header(message, length);
    for (long i = 0; i < count; i++) {
        if (each) {
            info = header(message, length);
        }
        qvsClientProvCtx *context = info && body ? decode(info->pBody, info->nBodyLen) : nullptr;
        if (!info || (body && !context)) {
            fprintf(stderr, "counted: %s is refused\n", name);
            return 1;
        }
        if (context) {
            release(context);
        }
        if (each) {
            free(info->pBody);
            free(info);
        }
    }
    return 0;
}
