// The library as a host finds it: loaded from its file, reached through its exported names.
#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"
#include "qvspushhandler.h"
#include "qvstrace.h"

#include <gtest/gtest.h>

#include <dlfcn.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

// Some blocks stay allocated by design; the unit tests count them.
extern "C" const char *__asan_default_options()
{
    return "detect_leaks=0";
}

namespace {

class Library : public testing::Test {
protected:
    // Everything that the library uses must be there at once.
    void SetUp() override
    {
        library = dlopen(OMACP_LIBRARY, RTLD_NOW | RTLD_LOCAL);
        ASSERT_NE(library, nullptr) << dlerror();
    }

    void TearDown() override { EXPECT_EQ(dlclose(library), 0); }

    void *find(const char *name) const { return dlsym(library, name); }

    void *library = nullptr;
};

// The exported function of this name, with the type that its header gives it.
#define EXPORTED(name) reinterpret_cast<decltype(&(name))>(find(#name))

std::vector<uint8_t> contentOf(const std::filesystem::path &path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

TEST_F(Library, ExportsEveryListedName)
{
    std::ifstream names(OMACP_EXPORTS);
    std::size_t count = 0;
    for (std::string name; std::getline(names, name); ++count) {
        EXPECT_NE(find(name.c_str()), nullptr) << name;
    }
    EXPECT_EQ(count, 244U);
}

std::vector<std::string> traced;

TEST_F(Library, HandsItsTracesToASinkUntilThatIsTakenAway)
{
    const auto setSink = EXPORTED(qvcTraceSetSink);
    const auto decode = EXPORTED(qvsClinetProvWbxmlDecoderMain);
    const uint8_t body[] = {3, 11, 0x6A, 0, 0x04};
    traced.clear();
    EXPECT_EQ(decode(body, sizeof body), nullptr);
    EXPECT_TRUE(traced.empty());
    setSink([](const char *text, uint32_t length) { traced.emplace_back(text, length); });
    EXPECT_EQ(decode(body, sizeof body), nullptr);
    setSink(nullptr);
    EXPECT_EQ(decode(body, sizeof body), nullptr);
    const std::vector<std::string> once = {
        "Unknown Element[4]\n",
        "WBXML Decode Error[1005]\n",
        "[Syncml] ERROR : DM = fffff005\n",
        "ERROR : qvsClinetProvWbxmlDecoderMain qvsClientProvWbxmlDecoder[0x1005]\n\n",
        "[Syncml] ERROR : 2\n",
    };
    EXPECT_EQ(traced, once);
}

TEST_F(Library, KeepsTheNativeMethodsToItself)
{
    EXPECT_EQ(find("qvomacp_parser"), nullptr);
    EXPECT_EQ(find("qvomacp_GetPxLogicalCount"), nullptr);
}

TEST_F(Library, HasNoContextAtFirst)
{
    auto *context = static_cast<qvsClientProvCtx **>(find("ptCtx"));
    ASSERT_NE(context, nullptr);
    EXPECT_EQ(*context, nullptr);
}

TEST_F(Library, DecodesEverySample)
{
    auto *parseHeader = EXPORTED(smlpushHdlrParsingWSPHeader);
    auto *decode = EXPORTED(qvsClinetProvWbxmlDecoderMain);
    auto *releaseContext = EXPORTED(qvsClientProvCtxDelectContext);
    auto *release = EXPORTED(qvsMemFree_debug);
    std::size_t count = 0;
    for (const auto &entry : std::filesystem::directory_iterator(OMACP_SAMPLES_DIR)) {
        if (entry.path().extension() != ".push") {
            continue;
        }
        SCOPED_TRACE(entry.path());
        ++count;
        const std::vector<uint8_t> message = contentOf(entry.path());
        smlpushHdlrInfo *header =
            parseHeader(message.data(), static_cast<uint32_t>(message.size()));
        ASSERT_NE(header, nullptr);
        EXPECT_EQ(header->nContentType, 54U);
        qvsClientProvCtx *context = decode(header->pBody, header->nBodyLen);
        ASSERT_NE(context, nullptr);
        releaseContext(context);
        release(header->pBody);
        release(header);
    }
    EXPECT_GE(count, 8U);
}

} // namespace
