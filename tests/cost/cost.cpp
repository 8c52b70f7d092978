// cost [--heap] SIZE...: one whole session for every family of messages and each size in bytes,
// each in a process of its own, so that none finds a heap that another one has left. A family that
// is about the limit of text is not made smaller than it has to be for that. A line per session:
//   pid family size length peak-heap heap-left microseconds
// The heap is counted in bytes with --heap only, and what becomes of the message is held to what
// its family says. Under a tool that counts instructions, those of the function `session` are the
// cost.
#include "families.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "support/fakevm.h"
#include "support/heap.h"

#include <sys/resource.h>
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

struct Outcome {
    bool parsed;
    size_t blocks; // of the header record and the context
};

// A parse, every query (of the first of everything, and with either index behind the end), the
// choice of an access point, and the delete.
extern "C" __attribute__((noinline)) void session(fakevm::Vm *vm, const cost::Bytes *message,
                                                  Outcome *outcome)
{
    outcome->parsed = vm->parse(*message).number != 0;
    outcome->blocks = blocks::live();
    vm->query(1, 1);
    vm->query(1, INT_MAX);
    vm->query(INT_MAX, 1);
    vm->call("qvomacp_SetPxNapDefIndex", {1});
    vm->call("qvomacp_parser_del");
}

namespace {

// Whether a message of the family, of so many bytes, became what it has to become.
bool isAsExpected(const cost::Family &family, size_t size, const cost::Bytes &message,
                  const Outcome &outcome)
{
    const qvsResult result = resultOf(message);
    if (result != family.result || outcome.parsed != (result == QVS_OK)) {
        fprintf(stderr, "a context was%s made, the result of the decode is %u\n",
                outcome.parsed ? "" : " not", static_cast<unsigned>(result));
        return false;
    }
    const size_t least = cost::unitsOf(family, size) * family.blocks;
    if (outcome.blocks < least) {
        fprintf(stderr, "a context of %zu blocks instead of %zu\n", outcome.blocks, least);
        return false;
    }
    return true;
}

bool measure(const cost::Family &family, size_t size)
{
    fakevm::Vm vm({.quiet = true});
    if (vm.load().number != JNI_VERSION_1_4) {
        return false;
    }
    const cost::Bytes bytes = cost::messageOf(family, size);
    Outcome outcome{};
    blocks::counting = countHeap;
    const Clock::time_point start = Clock::now();
    session(&vm, &bytes, &outcome);
    const long time = static_cast<long>(
        std::chrono::duration_cast<std::chrono::microseconds>(Clock::now() - start).count());
    printf("%d %s %zu %zu %zu %zu %ld\n", static_cast<int>(getpid()), family.name.c_str(), size,
           bytes.size(), blocks::peakBytesTaken(), blocks::liveBytesTaken(), time);
    return !countHeap || isAsExpected(family, size, bytes, outcome);
}

bool measureApart(const cost::Family &family, size_t size)
{
    fflush(stdout);
    const pid_t child = fork();
    if (child == 0) {
        // One that takes longer is no session of a message; a tool that counts is given more.
        const rlim_t seconds = countHeap ? 20 : 200;
        const rlimit limit{.rlim_cur = seconds, .rlim_max = seconds};
        setrlimit(RLIMIT_CPU, &limit);
        exit(measure(family, size) ? 0 : 1);
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
    for (const cost::Family &family : cost::families()) {
        // A family without anything to repeat has one size.
        const int sizes = family.unit.empty() && family.tableText == 0 ? firstSize + 1 : argc;
        for (int i = firstSize; i < sizes; ++i) {
            const size_t size = sizeFor(family, strtoul(argv[i], nullptr, 10));
            if (!measureApart(family, size)) {
                fprintf(stderr, "%s of %zu bytes failed, or took too long\n", family.name.c_str(),
                        size);
                return 1;
            }
        }
    }
    return argc > firstSize ? 0 : 1;
}
