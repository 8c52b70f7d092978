// Holds verdicts to the library: reads messages from standard input, each with what somebody else
// says that the library makes of it, and asks the library itself.
//
// A message is, little-endian and without gaps: u8 kind, u32 size of the bytes, u8 taken, i32
// result code, u32 bytes read, the bytes. The kind is B for a body, H for a push whose header is
// meant: its code is 0, and the bytes read are those in front of the body. Exit status 1: something
// differs.
#include "qvsClientProvWbxmlDecoder.h"
#include "qvspushhandler.h"

#include <stdint.h>
#include <stdio.h>
#include <string.h>
#include <sys/wait.h>
#include <unistd.h>

#include <vector>

namespace {

constexpr char kBody = 'B';
constexpr char kHeader = 'H';
constexpr size_t kHeadSize = 14;
constexpr size_t kBatchBytes = 8U << 20U;
constexpr int kShown = 5;
constexpr uint32_t kShownBytes = 400;

struct Verdict {
    bool taken;
    int32_t code;
    uint32_t read;

    bool operator==(const Verdict &) const = default;
};

struct Message {
    char kind;
    Verdict claimed;
    const uint8_t *bytes;
    uint32_t size;
};

Verdict judgeBody(const Message &message)
{
    qvsWbxmlDecoder *decoder = nullptr;
    qvsWapDoc *document = nullptr;
    qvsResult result = qvsClientProvWbxmlInitDecoder(&decoder, message.bytes, message.size);
    if (result == QVS_OK) {
        result = qvsClientProvWbxmlDecoder(decoder, &document);
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
    }
    const uint32_t end = qvsClientProvWbxmlDecoderDecodingSize(decoder);
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    // Behind a text without a terminator the decoder stands one byte behind the body.
    const uint32_t read = end < message.size ? end : message.size;
    qvsClientProvCtx *context = qvsClinetProvWbxmlDecoderMain(message.bytes, message.size);
    if (context) {
        qvsClientProvCtxDelectContext(context);
    }
    return {context != nullptr, static_cast<int32_t>(result), read};
}

Verdict judgeHeader(const Message &message)
{
    const smlpushHdlrInfo *info = smlpushHdlrParsingWSPHeader(message.bytes, message.size);
    return {info != nullptr, 0, info ? message.size - info->nBodyLen : 0};
}

Verdict judge(const Message &message)
{
    return message.kind == kBody ? judgeBody(message) : judgeHeader(message);
}

void show(const char *who, const Verdict &verdict)
{
    printf("%s: %s, code %d, %u bytes read\n", who, verdict.taken ? "taken" : "refused",
           verdict.code, verdict.read);
}

void showDifference(const Message &message, const Verdict &own)
{
    printf("--- %s of %u bytes ", message.kind == kBody ? "body" : "push", message.size);
    for (uint32_t i = 0; i < message.size && i < kShownBytes; ++i) {
        printf("%02x", message.bytes[i]);
    }
    printf("\n");
    show("claimed", message.claimed);
    show("library", own);
}

uint32_t number(const uint8_t *bytes)
{
    uint32_t value = 0;
    memcpy(&value, bytes, sizeof value);
    return value;
}

// The message that begins at `bytes`.
Message messageAt(const uint8_t *bytes)
{
    const Verdict claimed = {bytes[5] != 0, static_cast<int32_t>(number(bytes + 6)),
                             number(bytes + 10)};
    return {static_cast<char>(bytes[0]), claimed, bytes + kHeadSize, number(bytes + 1)};
}

// How many messages of the batch the library sees otherwise.
int differences(const std::vector<uint8_t> &batch)
{
    int found = 0;
    for (size_t at = 0; at < batch.size();) {
        const Message message = messageAt(&batch[at]);
        const Verdict own = judge(message);
        if (own != message.claimed && ++found <= kShown) {
            showDifference(message, own);
        }
        at += kHeadSize + message.size;
    }
    return found;
}

// Reads whole messages, up to some MiB of them. False when one is cut off.
bool readBatch(std::vector<uint8_t> *batch, uint64_t counts[2])
{
    batch->clear();
    uint8_t head[kHeadSize];
    while (batch->size() < kBatchBytes) {
        const size_t read = fread(head, 1, kHeadSize, stdin);
        if (read == 0) {
            return true;
        }
        if (read != kHeadSize || (head[0] != kBody && head[0] != kHeader)) {
            return false;
        }
        const size_t size = number(head + 1);
        const size_t start = batch->size();
        batch->insert(batch->end(), head, head + kHeadSize);
        batch->resize(start + kHeadSize + size);
        if (size != 0 && fread(&(*batch)[start + kHeadSize], 1, size, stdin) != size) {
            return false;
        }
        ++counts[head[0] == kBody ? 0 : 1];
    }
    return true;
}

// In a process of its own: some blocks stay allocated by design, and a crash is told from the rest.
bool agrees(const std::vector<uint8_t> &batch)
{
    (void)fflush(stdout);
    const pid_t child = fork();
    if (child == 0) {
        const int found = differences(batch);
        if (found != 0) {
            printf("%d differences\n", found);
        }
        (void)fflush(stdout);
        _exit(found != 0 ? 1 : 0);
    }
    int status = 0;
    if (child < 0 || waitpid(child, &status, 0) != child) {
        perror("replay");
        return false;
    }
    if (WIFSIGNALED(status)) {
        printf("the library ends with signal %d\n", WTERMSIG(status));
    }
    return status == 0;
}

} // namespace

int main()
{
    std::vector<uint8_t> batch;
    uint64_t counts[2] = {};
    bool agreed = true;
    bool whole = true;
    do {
        whole = readBatch(&batch, counts);
        agreed = agrees(batch) && agreed;
    } while (whole && !batch.empty());
    if (!whole) {
        printf("the input is cut off\n");
    }
    printf("%zu bits, %llu bodies, %llu headers: %s\n", sizeof(void *) * 8,
           static_cast<unsigned long long>(counts[0]), static_cast<unsigned long long>(counts[1]),
           agreed && whole ? "no difference" : "DIFFERENCES");
    return agreed && whole && counts[0] + counts[1] != 0 ? 0 : 1;
}
