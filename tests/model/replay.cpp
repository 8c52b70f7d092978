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
// gives one line: CRC-32 of its answers, their size, the decoder's result code, the blocks that
// were left and what was wrong with the calls. With --full its answers are written first, one a
// line with its name.
#include "counting.h"
#include "fake_vm.h"
#include "walks.h"

#include <dlfcn.h>
#include <jni.h>
#include <signal.h>
#include <stdint.h>
#include <stdio.h>
#include <unistd.h>

#include <array>
#include <string>
#include <vector>

namespace {

// --- Answers -------------------------------------------------------------------------------------

std::string answers;
bool full = false;

void writeText(const Object *object)
{
    if (!object) {
        answers += "~;";
        return;
    }
    answers += (object->kind == Kind::kBytes ? '#' : '"');
    answers += std::to_string(object->text.size());
    answers += ':';
    answers += object->text;
    answers += ';';
}

void writeObject(const Object *object)
{
    if (!object || object->kind != Kind::kTexts) {
        writeText(object);
        return;
    }
    answers += '[';
    for (const Object *element : object->elements) {
        writeText(element);
    }
    answers += "];";
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
    const Method *method;
    char result; // last letter group of its signature: I, L or [
    std::vector<const Query *> counts;
};

const std::string kPrefix = "qvomacp_";

template <class Result>
Result call(const Method &method, const jint *i, size_t arguments)
{
    const Counting counted;
    void *f = method.function;
    JNIEnv *e = &env;
    const jobject self = nullptr;
    switch (arguments) {
    case 0:
        return reinterpret_cast<Result(JNICALL *)(JNIEnv *, jobject)>(f)(e, self);
    case 1:
        return reinterpret_cast<Result(JNICALL *)(JNIEnv *, jobject, jint)>(f)(e, self, i[0]);
    case 2:
        return reinterpret_cast<Result(JNICALL *)(JNIEnv *, jobject, jint, jint)>(f)(e, self, i[0],
                                                                                     i[1]);
    case 3:
        return reinterpret_cast<Result(JNICALL *)(JNIEnv *, jobject, jint, jint, jint)>(f)(
            e, self, i[0], i[1], i[2]);
    default:
        return reinterpret_cast<Result(JNICALL *)(JNIEnv *, jobject, jint, jint, jint, jint)>(f)(
            e, self, i[0], i[1], i[2], i[3]);
    }
}

std::string labelOf(const Method &method, const jint *indexes, size_t count, const char *note)
{
    std::string label = method.name + "(";
    for (size_t i = 0; i < count; ++i) {
        label += (i ? ", " : "") + std::to_string(indexes[i]);
    }
    return label + ")" + note;
}

void ask(const Query &query, const jint *indexes, const char *note)
{
    const size_t from = answers.size();
    const size_t count = query.counts.size();
    if (query.result == 'I') {
        writeNumber(call<jint>(*query.method, indexes, count));
    } else {
        writeObject(objectOf(call<jobject>(*query.method, indexes, count)));
    }
    heap.used = 0;
    if (full) {
        printAnswer(from, labelOf(*query.method, indexes, count, note));
    }
}

void askEach(const Query &query, jint *indexes, size_t level, const char *note)
{
    if (level == query.counts.size()) {
        ask(query, indexes, note);
        return;
    }
    const jint count = call<jint>(*query.counts[level]->method, indexes, level);
    for (jint i = -1; i <= count + 1; ++i) {
        indexes[level] = i;
        askEach(query, indexes, level + 1, note);
    }
}

struct Natives {
    const Method *parse = nullptr;
    const Method *remove = nullptr;
    const Method *select = nullptr;
    std::vector<Query> header;
    std::vector<Query> queries;
    std::vector<const Query *> accessPoints;

    const Query *find(const std::string &name) const
    {
        for (const Query &query : queries) {
            if (query.method->name == kPrefix + name) {
                return &query;
            }
        }
        die("no native " + name);
    }

    void collect()
    {
        for (size_t i = 0; i < methods.size(); ++i) {
            const Method &method = methods[i];
            const bool session = methods[i].owner == "com/qvomacp/eng/parser/XCPCtxParser";
            if (method.name == "qvomacp_parser") {
                parse = &method;
            } else if (method.name == "qvomacp_parser_del") {
                remove = &method;
            } else if (method.name == "qvomacp_SetPxNapDefIndex") {
                select = &method;
            } else {
                const char result = method.signature[method.signature.find(')') + 1];
                (session ? header : queries).push_back({&method, result, {}});
            }
        }
        if (!parse || !remove || !select) {
            die("the session's methods were not registered");
        }
        for (const Walk &walk : kWalks) {
            auto *query = const_cast<Query *>(find(walk.name));
            for (const char *count : walk.counts) {
                query->counts.push_back(find(count));
            }
        }
        size_t place = 0;
        for (size_t i = 0; i < methods.size(); ++i) {
            if (place < queries.size() && queries[place].method == &methods[i]) {
                if (methods[i].owner == "com/qvomacp/eng/parser/XCPCtxNapDef") {
                    accessPoints.push_back(&queries[place]);
                }
                ++place;
            }
        }
    }

    void askEverything(const char *note) const
    {
        jint indexes[4] = {};
        for (const Query &query : header) {
            ask(query, indexes, note);
        }
        for (const Query &query : queries) {
            askEach(query, indexes, 0, note);
        }
    }

    void askAccessPoints(const char *note) const
    {
        jint indexes[4] = {};
        for (const Query *query : accessPoints) {
            askEach(*query, indexes, 0, note);
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
        if (length > fence.used) {
            return "-";
        }
        fence.open();
        PushHeader *header = parseHeader(fence.bytes, length);
        fence.close();
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
    std::string bytes;
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

void parse(const Natives &natives, const Message &message)
{
    using Parse = jboolean(JNICALL *)(JNIEnv *, jobject, jbyteArray, jlong, jint);
    jboolean parsed = JNI_FALSE;
    {
        const Counting counted;
        parsed = reinterpret_cast<Parse>(natives.parse->function)(
            &env, nullptr, handleOf<jbyteArray>(&messageArray), message.length, message.mode);
    }
    if (fence.handedOut != 0) {
        fault("the message was not handed back");
    }
    writeNumber(parsed);
    if (full) {
        printAnswer(0, natives.parse->name);
    }
}

void replay(const Natives &natives, const Decoder &decoder, const Message &message)
{
    answers.clear();
    faults.clear();
    const size_t liveBefore = blocks::live();
    fence.place(message.bytes);
    parse(natives, message);
    natives.askEverything("");
    for (const int32_t index : message.selections) {
        const jint argument = index;
        call<void>(*natives.select, &argument, 1);
        const std::string note = " after index " + std::to_string(index) + " was set";
        natives.askAccessPoints(note.c_str());
    }
    if (!message.keep) {
        call<void>(*natives.remove, nullptr, 0);
        natives.askEverything(" after delete");
    }
    const std::string blocks =
        kBlocksAreCounted ? std::to_string(static_cast<long>(blocks::live() - liveBefore)) : "-";
    const std::string code = decoder.code(static_cast<uint32_t>(message.length));
    printf("%08x %zu %s %s %s\n", crc32Of(answers), answers.size(), code.c_str(), blocks.c_str(),
           faults.c_str());
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
    if (!load || load(&machine, nullptr) != JNI_VERSION_1_4) {
        die("the library cannot be loaded");
    }
    for (size_t i = 0; i < methods.size(); ++i) {
        printf("%s %s %s\n", methods[i].owner.c_str(), methods[i].name.c_str(),
               methods[i].signature.c_str());
    }
    putchar('\n');
    fflush(stdout);
    Natives natives;
    natives.collect();
    const Decoder decoder(library);
    messageArray.kind = Kind::kBytes;
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
