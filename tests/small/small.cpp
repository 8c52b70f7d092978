// Small inputs without a gap: every prefix and every change of a single byte of every sample, and
// every body of up to three bytes behind the opening of the body, of the document and of each kind
// of characteristic. Each is parsed, asked and deleted, and held to the format by a reading of it.
//
//   small --samples FOLDER [--part I/N] [--seed S]
//
// runs the I-th of N parts of them; the seed says which inputs make a part.
#include "check.h"
#include "context.h"
#include "queries.h"
#include "reading.h"
#include "support/fakevm.h"
#include "support/heap.h"
#include "target.h"
#include "vocabulary.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsJniParser.h"

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <unistd.h>
#include <vector>

extern "C" [[gnu::weak]] void __sanitizer_set_death_callback(void (*callback)());

// Blocks come and go by the million: their stacks are not kept, and little of what was released.
extern "C" const char *__asan_default_options()
{
    return "detect_leaks=0:malloc_context_size=0:quarantine_size_mb=1:thread_local_quarantine_size_"
           "kb=64";
}

namespace {

using namespace fuzz;
using Bytes = std::vector<uint8_t>;

// ---- The input that is run, named when the program ends early

const uint8_t *current = nullptr;
size_t currentSize = 0;

void nameInput()
{
    std::string line = "the input is";
    for (size_t i = 0; i < currentSize; ++i) {
        char digits[4];
        snprintf(digits, sizeof digits, " %02X", current[i]);
        line += digits;
    }
    line += '\n';
    (void)!write(STDERR_FILENO, line.data(), line.size());
}

// ---- What is run

struct Options {
    std::string samples;
    uint64_t part = 1;
    uint64_t parts = 1;
    uint64_t seed = 0;
};

// Which inputs are run, and what became of them. Inputs that differ in their last byte or in their
// length alone are chosen together.
class Run {
public:
    explicit Run(const Options &chosen) : options(chosen) { (void)vm.load(); }

    bool takesNext()
    {
        uint64_t mixed = options.seed * 0x9E3779B97F4A7C15ULL + ++group;
        mixed = (mixed ^ (mixed >> 30)) * 0xBF58476D1CE4E5B9ULL;
        mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EBULL;
        return (mixed ^ (mixed >> 31)) % options.parts == options.part - 1;
    }

    // A whole message, through the virtual machine.
    void message(const uint8_t *data, size_t size)
    {
        begin(data, size);
        const HeaderReading header = readHeader(data, size);
        BodyReading body;
        if (header.accepted) {
            const size_t start = 3 + size_t{header.headerLength};
            body = readBody(data + start, size - start);
        }
        const bool parsed = vm.parse(fakevm::Bytes(data, data + size)).number != 0;
        check(parsed == body.context, "the message is accepted as the format says");
        end(body.kept);
    }

    // A body, through the decoder's main function.
    void body(const uint8_t *data, size_t size)
    {
        begin(data, size);
        const BodyReading expected = readBody(data, size);
        ptCtx = qvsClinetProvWbxmlDecoderMain(data, static_cast<uint32_t>(size));
        check((ptCtx != nullptr) == expected.context, "the body is accepted as the format says");
        end(expected.kept);
    }

    void print() const { printf("%zu inputs, %zu of them accepted\n", inputs, accepted); }

private:
    void begin(const uint8_t *data, size_t size)
    {
        current = data;
        currentSize = size;
        ++inputs;
    }

    // Asks and deletes what was parsed.
    void end(size_t kept)
    {
        if (ptCtx) {
            ++accepted;
            askEach(&vm);
            kept += viewOf(ptCtx).kept;
            (void)vm.call("qvomacp_parser_del");
        }
        check(blocks::live() == kept, "no block is left but the kept ones", blocks::live(),
              " blocks instead of ", kept);
        blocks::releaseAll();
    }

    const Options options;
    fakevm::Vm vm;
    uint64_t group = 0;
    size_t inputs = 0;
    size_t accepted = 0;
};

// ---- Inputs

Bytes read(const std::filesystem::path &file)
{
    std::ifstream stream(file, std::ios::binary);
    const std::string all((std::istreambuf_iterator<char>(stream)), {});
    return {all.begin(), all.end()};
}

void prefixes(Run *run, const Bytes &sample)
{
    for (size_t size = 0; size <= sample.size(); ++size) {
        if (run->takesNext()) {
            const Input prefix(sample.data(), size);
            run->message(prefix.data(), size);
        }
    }
}

void changes(Run *run, const Bytes &sample)
{
    Bytes changed = sample;
    for (size_t i = 0; i < sample.size(); ++i) {
        if (run->takesNext()) {
            for (unsigned value = 0; value < 256; ++value) {
                changed[i] = static_cast<uint8_t>(value);
                run->message(changed.data(), changed.size());
            }
            changed[i] = sample[i];
        }
    }
}

// Everything of up to three bytes behind an opening. The inputs of one length share a block of just
// that size.
void endings(Run *run, const Bytes &opening)
{
    const size_t size = opening.size();
    for (size_t more = 0; more <= 3; ++more) {
        Bytes bytes = opening;
        bytes.resize(size + more);
        bytes.shrink_to_fit();
        const unsigned firsts = more > 1 ? 256 : 1;
        const unsigned seconds = more > 2 ? 256 : 1;
        for (unsigned i = 0; i < firsts * seconds; ++i) {
            if (!run->takesNext()) {
                continue;
            }
            for (unsigned last = 0; last < (more > 0 ? 256U : 1U); ++last) {
                const uint8_t ending[] = {static_cast<uint8_t>(i / seconds),
                                          static_cast<uint8_t>(i % seconds)};
                std::copy_n(ending, more > 1 ? more - 1 : 0, bytes.data() + size);
                if (more > 0) {
                    bytes.back() = static_cast<uint8_t>(last);
                }
                run->body(bytes.data(), bytes.size());
            }
        }
    }
}

std::vector<Bytes> openings()
{
    const Bytes body = {0x03, 0x0B, 0x6A, 0x00};
    Bytes document = body;
    document.insert(document.end(), {kDocument | kContentBit | kAttributesBit, kVersion10, kEnd});
    std::vector<Bytes> all = {body, document};
    for (const Kind &kind : kKinds) {
        Bytes characteristic = document;
        characteristic.push_back(kCharacteristic | kContentBit | kAttributesBit);
        characteristic.insert(characteristic.end(),
                              {kSwitchPage, static_cast<uint8_t>(kind.pages[0] ? 0 : 1)});
        characteristic.push_back(kind.token);
        if (kind.token == kTypeText) {
            characteristic.push_back(kStrI);
            characteristic.insert(characteristic.end(), kind.name.begin(), kind.name.end());
            characteristic.push_back(0);
        }
        characteristic.push_back(kEnd);
        all.push_back(characteristic);
    }
    return all;
}

bool readOptions(int argc, char **argv, Options *options)
{
    for (int i = 1; i < argc; i += 2) {
        const std::string_view name = argv[i];
        if (i + 1 == argc) {
            return false;
        }
        const std::string value = argv[i + 1];
        if (name == "--samples") {
            options->samples = value;
        } else if (name == "--seed") {
            options->seed = strtoull(value.c_str(), nullptr, 10);
        } else if (name == "--part") {
            char *end = nullptr;
            options->part = strtoull(value.c_str(), &end, 10);
            options->parts = *end == '/' ? strtoull(end + 1, nullptr, 10) : 0;
        } else {
            return false;
        }
    }
    return !options->samples.empty() && options->part >= 1 && options->part <= options->parts;
}

} // namespace

int main(int argc, char **argv)
{
    Options options;
    if (!readOptions(argc, argv, &options)) {
        fprintf(stderr, "small --samples FOLDER [--part I/N] [--seed S]\n");
        return 2;
    }
    if (__sanitizer_set_death_callback) {
        __sanitizer_set_death_callback(nameInput);
    }
    signal(SIGABRT, [](int) { nameInput(); });
    Run run(options);
    std::vector<std::filesystem::path> samples;
    for (const auto &entry : std::filesystem::directory_iterator(options.samples)) {
        if (entry.path().extension() == ".push") {
            samples.push_back(entry.path());
        }
    }
    check(!samples.empty(), "there are samples", options.samples);
    std::sort(samples.begin(), samples.end());
    for (const std::filesystem::path &sample : samples) {
        const Bytes bytes = read(sample);
        prefixes(&run, bytes);
        changes(&run, bytes);
    }
    run.print();
    for (const Bytes &opening : openings()) {
        endings(&run, opening);
    }
    run.print();
    return 0;
}
