#include "documents.h"

#include "fuzz/generate.h"
#include "support/message.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace sweep {

namespace {

// Adds the files of a folder that end in `extension`, in the order of their names; `frame` makes
// messages of what they hold.
template <class Frame>
void addFiles(const std::string &folder, std::string_view extension, Frame frame,
              std::vector<Document> *all)
{
    std::vector<std::filesystem::path> paths;
    for (const auto &entry : std::filesystem::directory_iterator(folder)) {
        if (entry.path().extension() == extension) {
            paths.push_back(entry.path());
        }
    }
    std::sort(paths.begin(), paths.end());
    for (const auto &path : paths) {
        std::ifstream file(path, std::ios::binary);
        all->push_back({path, frame(Bytes(std::istreambuf_iterator<char>(file), {}))});
    }
}

Bytes pushed(const Bytes &body)
{
    return message::push(body);
}

Bytes asItIs(Bytes message)
{
    return message;
}

} // namespace

std::vector<Document> files()
{
    std::vector<Document> all;
    addFiles(OMACP_SAMPLES_DIR, ".push", asItIs, &all);
    addFiles(OMACP_SEEDS_DIR "/body", "", pushed, &all);
    addFiles(OMACP_SEEDS_DIR "/push_header", "", asItIs, &all);
    addFiles(OMACP_SEEDS_DIR "/session", "", asItIs, &all);
    return all;
}

std::vector<Document> generated(uint64_t seed)
{
    constexpr size_t kGenerated = 100;
    std::vector<Document> all;
    fuzz::Random random(seed);
    fuzz::Generator generator(&random);
    for (size_t i = 0; i < kGenerated; ++i) {
        all.push_back({"generated " + std::to_string(i), pushed(generator.document())});
    }
    return all;
}

} // namespace sweep
