// Messages for whole sessions: the samples, the seeds of the fuzz targets, and generated ones.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace sweep {

using Bytes = std::vector<uint8_t>;

struct Document {
    std::string name;
    Bytes message; // as it is pushed
};

// The samples and the seeds.
std::vector<Document> files();

// Generated ones. The same seed generates the same.
std::vector<Document> generated(uint64_t seed);

} // namespace sweep
