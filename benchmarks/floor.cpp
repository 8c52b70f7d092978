#include "floor.h"

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <unordered_map>

namespace bench {

namespace {

// Up to here clearing a block costs less than that calloc passes by the cache of the thread.
constexpr uint32_t kMostCleared = 1032;

#define TYPE(name)                                                                                 \
    {                                                                                              \
#name, sizeof(name)                                                                        \
    }
const std::unordered_map<std::string, uint32_t> kSizes = {
    TYPE(qvsWbxmlDecoder),
    TYPE(smlBuffer),
    TYPE(qvsList),
    TYPE(qvsListNode),
    TYPE(qvsWapDoc),
    TYPE(qvsWapCharacter),
    TYPE(qvsWapPxLogical),
    TYPE(qvsWapPxAuthInfo),
    TYPE(qvsWapPort),
    TYPE(qvsWapPxPhysical),
    TYPE(qvsWapNapDef),
    TYPE(qvsWapNapAuthInfo),
    TYPE(qvsWapValidity),
    TYPE(qvsWapAppAddr),
    TYPE(qvsWapResource),
    TYPE(qvsWapAppAuth),
    TYPE(qvsWapApplication),
    TYPE(qvsWapBootstrap),
    TYPE(qvsWapVendorConfig),
    TYPE(qvsWapClientIdentity),
    TYPE(qvsWapAccess),
    TYPE(qvsWapRoaming),
    TYPE(qvsWapWifi),
    TYPE(qvsWapVoWifi),
    TYPE(qvsClientProvCtx),
    TYPE(qvsCtxStrNode),
    TYPE(qvsCtxPxLogical),
    TYPE(qvsCtxPxAuthInfo),
    TYPE(qvsCtxPort),
    TYPE(qvsCtxPxPhysical),
    TYPE(qvsCtxNapDef),
    TYPE(qvsCtxNapAuthInfo),
    TYPE(qvsCtxValidity),
    TYPE(qvsCtxAppAddr),
    TYPE(qvsCtxResource),
    TYPE(qvsCtxAppAuth),
    TYPE(qvsCtxApplication),
    TYPE(qvsCtxBootstrap),
    TYPE(qvsCtxVendorConfig),
    TYPE(qvsCtxClientIdent),
    TYPE(qvsCtxAccess),
    TYPE(qvsCtxRoaming),
    TYPE(qvsCtxWifi),
    TYPE(qvsCtxVoWifi),
};
#undef TYPE

[[noreturn]] void fail(const std::string &what)
{
    fprintf(stderr, "floor: %s\n", what.c_str());
    exit(1);
}

char *cleared(uint32_t size)
{
    if (size > kMostCleared) {
        return static_cast<char *>(calloc(1, size));
    }
    void *block = malloc(size);
    memset(block, 0, size);
    return static_cast<char *>(block);
}

} // namespace

Floor::Floor(const std::string &path)
{
    std::ifstream file(path);
    std::string what, argument;
    while (file >> what >> argument) {
        add(what, argument);
    }
    if (m_steps.empty()) {
        fail(path + " holds no steps");
    }
    uint32_t most = 0;
    for (const Step &step : m_steps) {
        most = std::max(most, step.copied);
    }
    m_document.assign(most, 'x');
}

void Floor::add(const std::string &what, const std::string &argument)
{
    if (what == "record" || what == "context") {
        const auto found = kSizes.find(argument);
        if (found == kSizes.end()) {
            fail("there is no record " + argument);
        }
        const uint32_t spare = what == "context" ? 1 : 0;
        m_steps.push_back({Kind::Record, found->second + spare, 0, 0});
        m_lengths.push_back(0);
    } else {
        const auto number = static_cast<uint32_t>(std::stoul(argument));
        if (what == "free" && number < m_lengths.size()) {
            m_steps.push_back({Kind::Free, 0, 0, number});
            return;
        }
        if (what == "table") {
            m_steps.push_back({Kind::Table, number + 2, number, 0});
            m_lengths.push_back(0);
        } else if (what == "text") {
            m_steps.push_back({Kind::Text, number + 1, number + 1, 0});
            m_lengths.push_back(number + 1);
        } else if (what == "copy" && number < m_lengths.size()) {
            m_steps.push_back({Kind::Copy, m_lengths[number] + 4, m_lengths[number], number});
            m_lengths.push_back(0);
        } else {
            fail("there is no step " + what + " " + argument);
        }
    }
    m_blocks.push_back(nullptr);
}

void Floor::replay()
{
    char **made = m_blocks.data();
    const char *document = m_document.data();
    for (const Step &step : m_steps) {
        switch (step.kind) {
        case Kind::Record:
            *made++ = cleared(step.size);
            break;
        case Kind::Table:
            *made = cleared(step.size);
            memcpy(*made++, document, step.copied);
            break;
        case Kind::Text:
            *made = static_cast<char *>(malloc(step.size));
            memcpy(*made++, document, step.copied);
            break;
        case Kind::Copy:
            *made = static_cast<char *>(malloc(step.size));
            memcpy(*made, m_blocks[step.block], step.copied);
            memset(*made++ + step.copied, 0, 4);
            break;
        case Kind::Free:
            free(m_blocks[step.block]);
            break;
        }
    }
}

} // namespace bench
