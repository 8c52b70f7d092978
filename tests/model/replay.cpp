// Replays messages through a library and writes every answer of every native.
//
//   replay LIBRARY [--front] [--full] [--unbuffered] < messages
//
// The library is loaded as a virtual machine would load it: JNI_OnLoad gets a virtual machine that
// is made here and registers its natives with it. Each message is parsed, asked for everything and
// deleted. Its bytes lie before a page that cannot be touched (behind one with --front), are read
// only while the library holds them and cannot be touched at all after it has handed them back.
//
// A message is, little-endian and without gaps: u32 size of the array, i64 length argument, i32
// mode, u8 keep (no delete afterwards), u8 number of selections, an i32 for each, the array.
//
// The registered methods are written first, one a line, closed by an empty line. Then each message
// gives one line: CRC-32 of its answers, their size, the decoder's result code and the blocks that
// were left. With --full its answers are written first, one a line with its name. A call of the
// virtual machine that breaks its rules ends the program.
#include "fence.h"
#include "support/fakevm.h"
#include "support/heap.h"
#include "walks.h"

#include <dlfcn.h>
#include <signal.h>
#include <stdint.h>
#include <stdio.h>
#include <unistd.h>

#include <array>
#include <span>
#include <string>
#include <vector>

namespace {

using fakevm::Answer;
using fakevm::Native;

// Under the address sanitizer, which brings an allocator of its own, no block is counted.
#ifdef __SANITIZE_ADDRESS__
constexpr bool kBlocksAreCounted = false;
#else
constexpr bool kBlocksAreCounted = true;
#endif

[[noreturn]] void die(const std::string &why)
{
    fflush(stdout);
    fprintf(stderr, "replay: %s\n", why.c_str());
    _exit(2);
}

Fence fence;
fakevm::Vm vm({.inNative = &blocks::counting, .lender = &fence});

// --- Answers -------------------------------------------------------------------------------------

std::string answers;
bool full = false;

template <class Bytes>
void writeBytes(char mark, const Bytes &bytes)
{
    answers += mark;
    answers += std::to_string(bytes.size());
    answers += ':';
    answers.append(bytes.begin(), bytes.end());
    answers += ';';
}

void writeText(const fakevm::Text &text)
{
    if (text) {
        writeBytes('"', *text);
    } else {
        answers += "~;";
    }
}

void writeObject(const Answer &answer)
{
    if (answer.bytes) {
        writeBytes('#', *answer.bytes);
    } else if (answer.array) {
        answers += '[';
        for (const fakevm::Text &element : *answer.array) {
            writeText(element);
        }
        answers += "];";
    } else {
        writeText(answer.text);
    }
}

void writeNumber(jint value)
{
    answers += std::to_string(value);
    answers += ';';
}

void printAnswer(size_t from, const std::string &label)
{
    printf("%s = ", label.c_str());
    for (size_t i = from; i < answers.size(); ++i) {
        const auto byte = static_cast<unsigned char>(answers[i]);
        if (byte < 0x20 || byte > 0x7E || byte == '\\') {
            printf("\\x%02x", byte);
        } else {
            putchar(byte);
        }
    }
    putchar('\n');
}

// --- Natives -------------------------------------------------------------------------------------

// A query and the counts that say how far each of its indexes runs.
struct Query {
    const Native *native;
    std::vector<const Query *> counts;
};

const std::string kPrefix = "qvomacp_";

std::string labelOf(const Native &native, std::span<const jint> indexes, const char *note)
{
    std::string label(native.name);
    for (const jint &index : indexes) {
        label += (&index == indexes.data() ? "(" : ", ") + std::to_string(index);
    }
    return label + (indexes.empty() ? "()" : ")") + note;
}

void ask(const Query &query, std::span<const jint> indexes, const char *note)
{
    const size_t from = answers.size();
    const Answer answer = vm.call(*query.native, indexes);
    if (query.native->signature.back() == 'I') {
        writeNumber(answer.number);
    } else {
        writeObject(answer);
    }
    if (full) {
        printAnswer(from, labelOf(*query.native, indexes, note));
    }
}

void askEach(const Query &query, jint *indexes, size_t level, const char *note)
{
    if (level == query.counts.size()) {
        ask(query, {indexes, level}, note);
        return;
    }
    const jint count = vm.call(*query.counts[level]->native, {indexes, level}).number;
    for (jint i = -1; i <= count + 1; ++i) {
        indexes[level] = i;
        askEach(query, indexes, level + 1, note);
    }
}

struct Natives {
    std::vector<Query> header;
    std::vector<Query> queries;

    const Query *find(const std::string &name) const
    {
        for (const Query &query : queries) {
            if (query.native->name == kPrefix + name) {
                return &query;
            }
        }
        die("no native " + name);
    }

    Natives()
    {
        for (const Native &native : vm.natives()) {
            if (native.isQuery()) {
                const bool session = native.javaClass == "com/qvomacp/eng/parser/XCPCtxParser";
                (session ? header : queries).push_back({&native, {}});
            }
        }
        for (const Walk &walk : kWalks) {
            auto *query = const_cast<Query *>(find(walk.name));
            for (const char *count : walk.counts) {
                query->counts.push_back(find(count));
            }
        }
    }

    void askEverything(const char *note) const
    {
        jint indexes[4] = {};
        for (const Query &query : header) {
            ask(query, {}, note);
        }
        for (const Query &query : queries) {
            askEach(query, indexes, 0, note);
        }
    }

    void askAccessPoints(const char *note) const
    {
        jint indexes[4] = {};
        for (const Query &query : queries) {
            if (query.native->javaClass == "com/qvomacp/eng/parser/XCPCtxNapDef") {
                askEach(query, indexes, 0, note);
            }
        }
    }
};

// --- The decoder by itself -----------------------------------------------------------------------

struct PushHeader {
    uint32_t numbers[5];
    char mac[44];
    uint8_t *body;
};

struct Decoder {
    PushHeader *(*parseHeader)(const uint8_t *, uint32_t) = nullptr;
    uint32_t (*create)(void **, const uint8_t *, uint32_t) = nullptr;
    uint32_t (*decode)(void *, void **) = nullptr;
    uint32_t (*remove)(void *) = nullptr;
    uint32_t (*removeDocument)(void *) = nullptr;
    void (*release)(void *) = nullptr;

    template <class Function>
    static void load(void *library, const char *name, Function *function)
    {
        *function = reinterpret_cast<Function>(dlsym(library, name));
        if (!*function) {
            die(std::string("the library exports no ") + name);
        }
    }

    explicit Decoder(void *library)
    {
        load(library, "smlpushHdlrParsingWSPHeader", &parseHeader);
        load(library, "qvsClientProvWbxmlInitDecoder", &create);
        load(library, "qvsClientProvWbxmlDecoder", &decode);
        load(library, "qvsClientProvWbxmlDeleteDecoder", &remove);
        load(library, "qvsClientProvWbxmlDeleteWapDoc", &removeDocument);
        load(library, "qvsMemFree_debug", &release);
    }

    // The result code that the body is decoded with, "-" for a message whose header is rejected.
    std::string code(uint32_t length) const
    {
        if (length > fence.size()) {
            return "-";
        }
        PushHeader *header = parseHeader(fence.lend(), length);
        fence.takeBack();
        if (!header) {
            return "-";
        }
        void *decoder = nullptr;
        void *document = nullptr;
        uint32_t result = create(&decoder, header->body, header->numbers[2]);
        if (result == 0) {
            result = decode(decoder, &document);
        }
        remove(decoder);
        removeDocument(document);
        release(header->body);
        release(header);
        return std::to_string(result);
    }
};

// --- Messages ------------------------------------------------------------------------------------

struct Message {
    int64_t length = 0;
    int32_t mode = 0;
    bool keep = false;
    std::vector<int32_t> selections;
    fakevm::Bytes bytes;
};

template <class Value>
bool read(Value *value, size_t count = 1)
{
    return fread(value, sizeof *value, count, stdin) == count;
}

bool read(Message *message)
{
    uint32_t size = 0;
    uint8_t keep = 0;
    uint8_t selections = 0;
    if (!read(&size)) {
        return false;
    }
    if (!read(&message->length) || !read(&message->mode) || !read(&keep) || !read(&selections)) {
        die("a message is cut");
    }
    message->keep = keep != 0;
    message->selections.resize(selections);
    message->bytes.resize(size);
    if (!read(message->selections.data(), selections) || !read(message->bytes.data(), size)) {
        die("a message is cut");
    }
    return true;
}

uint32_t crc32Of(const std::string &bytes)
{
    static const auto kTable = [] {
        std::array<uint32_t, 256> table{};
        for (uint32_t i = 0; i < table.size(); ++i) {
            uint32_t value = i;
            for (int bit = 0; bit < 8; ++bit) {
                value = value >> 1 ^ (value & 1 ? 0xEDB88320U : 0);
            }
            table[i] = value;
        }
        return table;
    }();
    uint32_t crc = ~0U;
    for (const char c : bytes) {
        crc = crc >> 8 ^ kTable[(crc ^ static_cast<uint8_t>(c)) & 0xFF];
    }
    return ~crc;
}

void replay(const Natives &natives, const Decoder &decoder, const Message &message)
{
    answers.clear();
    const size_t liveBefore = blocks::live();
    if (!fence.place(message.bytes)) {
        die("no memory for a message");
    }
    writeNumber(vm.parse(&message.bytes, message.length, message.mode).number);
    if (full) {
        printAnswer(0, "qvomacp_parser");
    }
    natives.askEverything("");
    for (const jint index : message.selections) {
        vm.call("qvomacp_SetPxNapDefIndex", {index});
        const std::string note = " after index " + std::to_string(index) + " was set";
        natives.askAccessPoints(note.c_str());
    }
    if (!message.keep) {
        vm.call("qvomacp_parser_del");
        natives.askEverything(" after delete");
    }
    const std::string blocks =
        kBlocksAreCounted ? std::to_string(static_cast<long>(blocks::live() - liveBefore)) : "-";
    const std::string code = decoder.code(static_cast<uint32_t>(message.length));
    printf("%08x %zu %s %s\n", crc32Of(answers), answers.size(), code.c_str(), blocks.c_str());
}

// --- A message that does not end -----------------------------------------------------------------

volatile sig_atomic_t current = 0; // number of the message being replayed

void checkProgress(int)
{
    static sig_atomic_t last = -1;
    if (current == last) {
        static const char kText[] = "replay: a message takes longer than a minute\n";
        (void)!write(STDERR_FILENO, kText, sizeof kText - 1);
        _exit(3);
    }
    last = current;
    alarm(60);
}

} // namespace

int main(int argc, char **argv)
{
    if (argc < 2) {
        die("usage: replay LIBRARY [--front] [--full] [--unbuffered] < messages");
    }
    bool unbuffered = false;
    for (int i = 2; i < argc; ++i) {
        const std::string option = argv[i];
        full = full || option == "--full";
        fence.front = fence.front || option == "--front";
        unbuffered = unbuffered || option == "--unbuffered";
    }
    void *library = dlopen(argv[1], RTLD_NOW | RTLD_LOCAL);
    if (!library) {
        die(dlerror());
    }
    const auto load =
        reinterpret_cast<jint(JNICALL *)(JavaVM *, void *)>(dlsym(library, "JNI_OnLoad"));
    if (!load || vm.load(load).number != JNI_VERSION_1_4) {
        die("the library cannot be loaded");
    }
    for (const Native &native : vm.natives()) {
        printf("%s %s %s\n", native.javaClass.c_str(), native.name.data(), native.signature.data());
    }
    putchar('\n');
    fflush(stdout);
    const Natives natives;
    const Decoder decoder(library);
    signal(SIGALRM, checkProgress);
    alarm(60);
    Message message;
    while (read(&message)) {
        replay(natives, decoder, message);
        if (unbuffered) {
            fflush(stdout);
        }
        current = current + 1;
    }
    return 0;
}
