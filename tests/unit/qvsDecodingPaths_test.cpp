// The paths of a decode: of a session or of a host, with a sink and without, with blocks tracked or
// not. Whichever is taken, contexts, results and read positions are the same.
#include "fuzz/context.h"
#include "fuzz/generate.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"
#include "qvspushhandler.h"
#include "qvstrace.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace {

using Bytes = std::vector<uint8_t>;

constexpr int kGenerated = 4000;

// Lets whoever it is made for listen to the traces, track the blocks, or both.
class Watched {
public:
    Watched(bool traced, bool tracked) : tracks(tracked)
    {
        if (traced) {
            qvcTraceSetSink([](const char *, uint32_t) {});
        }
        if (tracks) {
            testing::internal::CaptureStdout();
            qvsMemStartMemCheck();
        }
    }
    Watched(const Watched &) = delete;
    Watched &operator=(const Watched &) = delete;
    ~Watched()
    {
        qvcTraceSetSink(nullptr);
        if (tracks) {
            qvsMemEndMemCheck();
            (void)testing::internal::GetCapturedStdout();
        }
    }

private:
    bool tracks;
};

std::string shown(qvsClientProvCtx *context)
{
    if (!context) {
        return "none";
    }
    std::string text = fuzz::viewOf(context).text;
    qvsClientProvCtxDelectContext(context);
    return text;
}

// The context of a session.
std::string ofSession(const Bytes &body)
{
    return shown(qvsClinetProvWbxmlDecoderMain(body.data(), static_cast<uint32_t>(body.size())));
}

// The context of a host's own steps, with result and read position in front.
std::string ofHost(const Bytes &body)
{
    qvsWbxmlDecoder *decoder = nullptr;
    qvsWapDoc *document = nullptr;
    (void)qvsClientProvWbxmlInitDecoder(&decoder, body.data(), static_cast<uint32_t>(body.size()));
    const qvsResult result = qvsClientProvWbxmlDecoder(decoder, &document);
    const std::string state = std::to_string(result) + " at " +
                              std::to_string(qvsClientProvWbxmlDecoderDecodingSize(decoder)) +
                              " on " + std::to_string(decoder->nCodePage) + ": ";
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    const std::string context =
        result == QVS_OK ? shown(qvsClientProvCtxMakeContext(document)) : "none";
    (void)qvsClientProvWbxmlDeleteWapDoc(document);
    return state + context;
}

// One value of a parameter, with result and read position.
std::string ofSteps(const Bytes &bytes)
{
    qvsWbxmlDecoder *decoder = nullptr;
    (void)qvsClientProvWbxmlInitDecoder(&decoder, bytes.data(),
                                        static_cast<uint32_t>(bytes.size()));
    char *text = nullptr;
    const qvsResult result = qvsClientProvWbxmlDecoderParamString(decoder, &text, 0x07);
    const std::string shown = std::to_string(result) + " at " +
                              std::to_string(qvsClientProvWbxmlDecoderDecodingSize(decoder)) +
                              ": " + (text ? text : "(null)");
    qvsMemFree_debug(text);
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    return shown;
}

// One parm element, with result and read position.
std::string ofElement(const Bytes &bytes)
{
    qvsWbxmlDecoder *decoder = nullptr;
    (void)qvsClientProvWbxmlInitDecoder(&decoder, bytes.data(),
                                        static_cast<uint32_t>(bytes.size()));
    qvsWapApplication record = {};
    const qvsResult result = qvsClientProvWbxmlDecoderParamApplication(decoder, &record);
    std::string shown = std::to_string(result) + " at " +
                        std::to_string(qvsClientProvWbxmlDecoderDecodingSize(decoder)) + " on " +
                        std::to_string(decoder->nCodePage);
    for (char *text : {record.pszName, record.pszFrom, record.pszXcapTidHeader}) {
        shown += std::string(", ") + (text ? text : "(null)");
        qvsMemFree_debug(text);
    }
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
    return shown;
}

template <class Run>
void expectSameOnAllPaths(const Bytes &bytes, Run run)
{
    const std::string plain = run(bytes);
    for (const bool traced : {false, true}) {
        for (const bool tracked : {false, true}) {
            const Watched watched(traced, tracked);
            ASSERT_EQ(run(bytes), plain) << traced << tracked << testing::PrintToString(bytes);
        }
    }
}

void expectSameContexts(const Bytes &body)
{
    expectSameOnAllPaths(body, ofSession);
    expectSameOnAllPaths(body, ofHost);
    const std::string host = ofHost(body);
    ASSERT_EQ(ofSession(body), host.substr(host.find(": ") + 2)) << testing::PrintToString(body);
}

} // namespace

TEST(Paths, GiveTheSameForEverySample)
{
    int samples = 0;
    for (const auto &entry : std::filesystem::directory_iterator(OMACP_SAMPLES_DIR)) {
        if (entry.path().extension() != ".push") {
            continue;
        }
        std::ifstream file(entry.path(), std::ios::binary);
        const std::vector<char> message(std::istreambuf_iterator<char>(file), {});
        smlpushHdlrInfo *info =
            smlpushHdlrParsingWSPHeader(reinterpret_cast<const uint8_t *>(message.data()),
                                        static_cast<uint32_t>(message.size()));
        ASSERT_NE(info, nullptr);
        const Bytes body(info->pBody, info->pBody + info->nBodyLen);
        qvsMemFree_debug(info->pBody);
        qvsMemFree_debug(info);
        SCOPED_TRACE(entry.path());
        ASSERT_NE(ofSession(body), "none");
        expectSameContexts(body);
        ++samples;
    }
    EXPECT_GE(samples, 11);
}

TEST(Paths, GiveTheSameForMessagesMadeAtRandom)
{
    fuzz::Random random(13);
    fuzz::Generator generator(&random);
    int taken = 0;
    for (int i = 0; i < kGenerated; ++i) {
        const auto document = generator.document();
        const Bytes body(document.begin(), document.end());
        expectSameContexts(body);
        taken += ofSession(body) != "none" ? 1 : 0;
    }
    EXPECT_GT(taken, kGenerated / 15);
}

TEST(Paths, GiveTheSameForValuesMadeAtRandom)
{
    fuzz::Random random(14);
    fuzz::Generator generator(&random);
    for (int i = 0; i < kGenerated; ++i) {
        Bytes bytes = {0x07, 0x06};
        for (size_t pieces = random.below(12); pieces > 0; --pieces) {
            const auto value = generator.value();
            bytes.insert(bytes.end(), value.begin(), value.end());
        }
        bytes.push_back(random.oneIn(4) ? 0x06 : 0x01);
        expectSameOnAllPaths(bytes, ofSteps);
    }
}

TEST(Paths, GiveTheSameForParametersMadeAtRandom)
{
    const Bytes names[] = {{0x07},
                           {0x05, 0x03, 'F', 'R', 'O', 'M', 0},
                           {0x05, 0x03, 'F', 0, 0x03, 'R', 'O', 'M', 0},
                           {0x05, 0x03, 'O', 't', 'h', 'e', 'r', 0},
                           {0x05, 0x03, 0},
                           {0x05, 0x85},
                           {0x05}};
    const Bytes switches[] = {{}, {0x00, 0x01}, {0x00, 0x41}, {0x00, 0x02}, {0x00}};
    fuzz::Random random(15);
    fuzz::Generator generator(&random);
    const auto add = [](Bytes *bytes, const auto &part) {
        bytes->insert(bytes->end(), part.begin(), part.end());
    };
    for (int i = 0; i < kGenerated; ++i) {
        Bytes bytes = {0x87};
        // A second one fills another field: what a field held before would stay allocated.
        size_t name = random.below(7);
        for (size_t pairs = 1 + random.below(2); pairs > 0; --pairs, name = name == 0 ? 1 : 0) {
            add(&bytes, switches[random.oneIn(2) ? random.below(5) : 0]);
            add(&bytes, names[name]);
            add(&bytes, switches[random.oneIn(2) ? random.below(5) : 0]);
            bytes.push_back(random.oneIn(8) ? 0x08 : 0x06);
            for (size_t pieces = random.below(4); pieces > 0; --pieces) {
                add(&bytes, generator.value());
            }
        }
        bytes.push_back(random.oneIn(4) ? 0x81 : 0x01);
        bytes.resize(bytes.size() - random.below(random.oneIn(3) ? bytes.size() : 1));
        expectSameOnAllPaths(bytes, ofElement);
    }
}
