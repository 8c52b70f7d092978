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

// All of them. The same seed generates the same.
std::vector<Document> documents(uint64_t seed);

} // namespace sweep
