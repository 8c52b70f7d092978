// Messages for whole sessions: small ones that together hold every kind of element and every
// encoding of a value, the samples, and the seeds of the fuzz targets.
#pragma once

#include <cstdint>
#include <ostream>
#include <string>
#include <vector>

namespace sweep {

using Bytes = std::vector<uint8_t>;

struct Document {
    std::string name;
    Bytes message; // as it is pushed
};

inline void PrintTo(const Document &document, std::ostream *out)
{
    *out << document.name;
}

// The small messages.
std::vector<Document> smallDocuments();

// The files of the folder of samples.
std::vector<Document> samples();

// The seeds of the targets that read a body, a push header or a message; none when there are none.
std::vector<Document> seeds();

} // namespace sweep
