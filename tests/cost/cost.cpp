// cost [--heap] SIZE...: one whole session for every family of messages and each size in bytes,
// each in a process of its own, so that none finds a heap that another one has left. A family that
// is about the limit of text is not made smaller than it has to be for that. A line per session:
//   pid family size length peak-heap heap-left microseconds
// The heap is counted in bytes with --heap only. Under a tool that counts instructions, those of
// the function `session` are the cost.
#include "families.h"
#include "heap.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "support/quietvm.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

bool countHeap;

using Clock = std::chrono::steady_clock;

// The result of decoding the body of a message.
qvsResult resultOf(const cost::Bytes &message)
{
    constexpr size_t kHeaders = 3;
    const size_t header = kHeaders + message[kHeaders - 1];
    qvsWbxmlDecoder *decoder = nullptr;
    qvsWapDoc *document = nullptr;
    qvsResult result = qvsClientProvWbxmlInitDecoder(
        &decoder, message.data() + header, static_cast<uint32_t>(message.size() - header));
    if (result == QVS_OK) {
        result = qvsClientProvWbxmlDecoder(decoder, &document);
    }
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
    return result;
}

} // namespace

// A parse, every query (of the first of everything, of the last ones, and behind the end), and the
// delete. Answers whether a context was made.
extern "C" __attribute__((noinline)) bool session(quietvm::Vm *vm, const quietvm::Message *message)
{
    const bool parsed = vm->parse(*message);
    vm->query(1, 1);
    vm->query(1, INT_MAX);
    vm->query(INT_MAX, 1);
    vm->remove();
    return parsed;
}

namespace {

void measure(const cost::Family &family, size_t size)
{
    quietvm::Vm vm;
    const cost::Bytes bytes = cost::messageOf(family, size);
    const quietvm::Message message{bytes.data(), bytes.size()};
    if (countHeap) {
        cost::startHeap();
    }
    const Clock::time_point start = Clock::now();
    const bool parsed = session(&vm, &message);
    const long time = static_cast<long>(
        std::chrono::duration_cast<std::chrono::microseconds>(Clock::now() - start).count());
    printf("%d %s %zu %zu %zu %zu %ld\n", static_cast<int>(getpid()), family.name.c_str(), size,
           bytes.size(), cost::peakHeap(), cost::heapInUse(), time);
    const qvsResult result = resultOf(bytes);
    if (result != family.result || parsed != (result == QVS_OK)) {
        fprintf(stderr, "%s of %zu bytes: a context was%s made, the result of the decode is %u\n",
                family.name.c_str(), size, parsed ? "" : " not", static_cast<unsigned>(result));
        exit(1);
    }
}

bool measureApart(const cost::Family &family, size_t size)
{
    fflush(stdout);
    const pid_t child = fork();
    if (child == 0) {
        measure(family, size);
        exit(0);
    }
    int status = 1;
    return child > 0 && waitpid(child, &status, 0) == child && status == 0;
}

// The size for a family when `asked` bytes are asked for.
size_t sizeFor(const cost::Family &family, size_t asked)
{
    constexpr size_t kLeastForLimit = 65536;
    return family.aboutLimit ? std::max(asked, kLeastForLimit) : asked;
}

} // namespace

int main(int argc, char **argv)
{
    countHeap = argc > 1 && strcmp(argv[1], "--heap") == 0;
    const int firstSize = countHeap ? 2 : 1;
    bool succeeded = argc > firstSize;
    for (const cost::Family &family : cost::families()) {
        for (int i = firstSize; i < argc; ++i) {
            const size_t size = sizeFor(family, strtoul(argv[i], nullptr, 10));
            if (!measureApart(family, size)) {
                fprintf(stderr, "%s of %zu bytes failed\n", family.name.c_str(), size);
                succeeded = false;
            }
        }
    }
    return succeeded ? 0 : 1;
}
