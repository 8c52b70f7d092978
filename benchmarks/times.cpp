// times FOLDER [OPTION...]: the times of the library, of the floor and of libwbxml2 for each of the
// eight documents in FOLDER, all in one run. The options are those of Google Benchmark; a benchmark
// is called WHAT/DOCUMENT.
#include "floor.h"
#include "peer.h"
#include "support/fakevm.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsCtxCopy.h"
#include "qvspushhandler.h"
#include "qvstrace.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <memory>
#include <string>
#include <vector>

namespace {

struct Document {
    std::vector<uint8_t> message;
    std::vector<uint8_t> body;
    bench::Floor floor;
};

[[noreturn]] void fail(const std::string &what)
{
    fprintf(stderr, "times: %s\n", what.c_str());
    exit(1);
}

std::vector<uint8_t> read(const std::string &path)
{
    std::ifstream file(path, std::ios::binary);
    std::vector<uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
    if (bytes.empty()) {
        fail(path + " cannot be read");
    }
    return bytes;
}

uint32_t sizeOf(const std::vector<uint8_t> &bytes)
{
    return static_cast<uint32_t>(bytes.size());
}

// ---- The library

smlpushHdlrInfo *header(const Document &document)
{
    smlpushHdlrInfo *info =
        smlpushHdlrParsingWSPHeader(document.message.data(), sizeOf(document.message));
    if (!info) {
        fail("a push header is refused");
    }
    return info;
}

void release(smlpushHdlrInfo *info)
{
    free(info->pBody);
    free(info);
}

qvsClientProvCtx *decode(const uint8_t *body, uint32_t length)
{
    qvsClientProvCtx *context = qvsClinetProvWbxmlDecoderMain(body, length);
    if (!context) {
        fail("a body is refused");
    }
    return context;
}

qvsWapDoc *tree(const Document &document)
{
    qvsWbxmlDecoder *decoder = nullptr;
    qvsWapDoc *root = nullptr;
    if (qvsClientProvWbxmlInitDecoder(&decoder, document.body.data(), sizeOf(document.body)) ||
        qvsClientProvWbxmlDecoder(decoder, &root)) {
        fail("a body is refused");
    }
    qvsClientProvWbxmlDeleteDecoder(decoder);
    return root;
}

// Everything that is done with a message: header, decode, context, and letting go of it all.
void wholeMessage(const Document &document)
{
    smlpushHdlrInfo *info = header(document);
    qvsClientProvCtxDelectContext(decode(info->pBody, info->nBodyLen));
    release(info);
}

void message(benchmark::State &state, Document &document)
{
    for (auto _ : state) {
        wholeMessage(document);
    }
}

// The same with a sink that takes every trace message, and does nothing with it.
void traced(benchmark::State &state, Document &document)
{
    qvcTraceSetSink([](const char *text, uint32_t) { benchmark::DoNotOptimize(text); });
    for (auto _ : state) {
        wholeMessage(document);
    }
    qvcTraceSetSink(nullptr);
}

// From the body to a context, and its release: what the floor replays.
void body(benchmark::State &state, Document &document)
{
    for (auto _ : state) {
        qvsClientProvCtxDelectContext(decode(document.body.data(), sizeOf(document.body)));
    }
}

void headerAlone(benchmark::State &state, Document &document)
{
    for (auto _ : state) {
        release(header(document));
    }
}

// ---- Its phases, between readings of the clock

using Clock = std::chrono::steady_clock;

double nanoseconds(Clock::duration duration)
{
    return std::chrono::duration<double, std::nano>(duration).count();
}

// What a reading of the clock takes, which is in every phase.
double clockCost()
{
    double least = 1e9;
    for (int i = 0; i < 1000; i++) {
        const auto start = Clock::now();
        least = std::min(least, nanoseconds(Clock::now() - start));
    }
    return least;
}

// Counters in nanoseconds, each the least that was seen: the whole body to a context; the context's
// part of that, and the release of the tree, which is in it too; the release of the context.
void phases(benchmark::State &state, Document &document)
{
    static const double kClock = clockCost();
    double all = 1e12, building = 1e12, freeing = 1e12, releasing = 1e12;
    const auto least = [](double &time, Clock::time_point start, Clock::time_point end) {
        time = std::min(time, nanoseconds(end - start) - kClock);
    };
    for (auto _ : state) {
        const auto start = Clock::now();
        qvsClientProvCtx *context = decode(document.body.data(), sizeOf(document.body));
        const auto made = Clock::now();
        qvsClientProvCtxDelectContext(context);
        const auto released = Clock::now();
        least(all, start, made);
        least(releasing, made, released);

        qvsWapDoc *root = tree(document);
        const auto decoded = Clock::now();
        context = qvs::takeContext(root);
        const auto built = Clock::now();
        (void)qvsClientProvWbxmlDeleteWapDoc(root);
        const auto freed = Clock::now();
        qvsClientProvCtxDelectContext(context);
        least(building, decoded, built);
        least(freeing, built, freed);
    }
    state.counters["all"] = all;
    state.counters["context"] = building;
    state.counters["free"] = freeing;
    state.counters["release"] = releasing;
}

// ---- Its natives

// Every query once, with the index 1, of a message that was parsed before.
void queries(benchmark::State &state, Document &document)
{
    static fakevm::Vm *const vm = [] {
        auto *made = new fakevm::Vm({.quiet = true});
        made->load();
        return made;
    }();
    if (vm->parse(document.message).number == 0) {
        fail("a message is refused");
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(vm->query(1, 1));
    }
    vm->call("qvomacp_parser_del");
}

// The natives looked up and registered, as when the library is loaded.
void registration(benchmark::State &state, Document &)
{
    for (auto _ : state) {
        fakevm::Vm vm({.quiet = true});
        benchmark::DoNotOptimize(vm.load());
    }
}

// ---- The floor and the peer

void floorAlone(benchmark::State &state, Document &document)
{
    for (auto _ : state) {
        document.floor.replay();
    }
}

void peerTree(benchmark::State &state, Document &document)
{
    for (auto _ : state) {
        WBXMLTree *root = nullptr;
        if (wbxml_tree_from_wbxml(document.body.data(), sizeOf(document.body), WBXML_LANG_PROV10,
                                  WBXML_CHARSET_UNKNOWN, &root) != WBXML_OK) {
            fail("libwbxml2 does not make a tree");
        }
        wbxml_tree_destroy(root);
    }
}

void peerEvents(benchmark::State &state, Document &document)
{
    WBXMLContentHandler handler = {
        [](void *, int, const void *) {},
        [](void *) {},
        [](void *elements, void *, void **, WB_BOOL) { ++*static_cast<long *>(elements); },
        [](void *, void *, WB_BOOL) {},
        [](void *, WB_UTINY *, WB_ULONG, WB_ULONG) {},
        [](void *, const WB_UTINY *, WB_UTINY *) {},
    };
    long elements = 0;
    for (auto _ : state) {
        WBXMLParser *parser = wbxml_parser_create();
        wbxml_parser_set_user_data(parser, &elements);
        wbxml_parser_set_content_handler(parser, &handler);
        if (wbxml_parser_parse(parser, document.body.data(), sizeOf(document.body)) != WBXML_OK) {
            fail("libwbxml2 does not parse");
        }
        wbxml_parser_destroy(parser);
    }
    state.counters["elements"] =
        static_cast<double>(elements) / static_cast<double>(state.iterations());
}

using Run = void (*)(benchmark::State &, Document &);
constexpr struct {
    const char *name;
    Run run;
} kRuns[] = {
    {"message", message},   {"body", body},
    {"floor", floorAlone},  {"tree", peerTree},
    {"events", peerEvents}, {"header", headerAlone},
    {"phases", phases},     {"traced", traced},
    {"queries", queries},   {"registration", registration},
};

constexpr const char *kDocuments[] = {"160", "300", "547", "2k", "8k", "29k", "200k", "1m"};

} // namespace

int main(int argc, char **argv)
{
    benchmark::Initialize(&argc, argv);
    if (argc != 2) {
        fputs("usage: times FOLDER [OPTION...]\n", stderr);
        return 2;
    }
    const std::string folder = std::string(argv[1]) + "/";
    std::vector<std::unique_ptr<Document>> documents;
    for (const std::string name : kDocuments) {
        documents.push_back(std::make_unique<Document>(
            Document{read(folder + name + ".push"), read(folder + name + ".wbxml"),
                     bench::Floor(folder + name + ".blocks")}));
        for (const auto &[what, run] : kRuns) {
            if (run == registration && documents.size() > 1) {
                continue; // it is the same for every document
            }
            benchmark::RegisterBenchmark((what + ("/" + name)).c_str(),
                                         [run = run, document = documents.back().get()](
                                             benchmark::State &state) { run(state, *document); });
        }
    }
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
